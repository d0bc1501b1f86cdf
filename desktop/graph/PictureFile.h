#pragma once
// A painted picture in a file: png, svg or pdf by its ending.

#include <QByteArray>
#include <QPainter>
#include <QSize>
#include <QString>
#include <functional>

namespace zel {

/// How a kind of file is painted on.
struct PictureKind {
    bool paper = false;  ///< has light colours always
    double dots = 1;     ///< of the file in a pixel of the picture
};

/// `paint` draws a picture of `size` pixels. False with a text in `error` when the kind is unknown
/// or the file cannot be written; an older file of that name is then as it was. Needs a
/// QApplication, and says so where there is none.
bool savePicture(const QString& path, QSize size, QString* error,
                 const std::function<void(QPainter&, const PictureKind&)>& paint);

/// Puts a finished picture into its file, in one step. A text says what went wrong, else it is
/// empty; an older file is then as it was.
QString writePicture(const QString& path, const QByteArray& bytes);

}  // namespace zel
