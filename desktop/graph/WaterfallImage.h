#pragma once
// Pictures of the waterfall in files.

#include <QImage>
#include <QSize>
#include <QString>

#include "forms/WaterfallForm.h"
#include "waterfall/WaterfallPicture.h"

namespace zel {

/// The graph with its colour bar, as its window shows it. png, svg or pdf by the ending; pdf has
/// light colours. False with a text in `error`; an older file is then as it was.
bool saveWaterfallImage(const WaterfallForm& form, const PictureStyle& style, const QString& path,
                        QString* error, QSize size = {1000, 620}, bool dark = true);
/// The same as an image, twice `size` in dots.
QImage waterfallImage(const WaterfallForm& form, const PictureStyle& style, QSize size, bool dark);
/// What stands at the ends of the colour bar: the form's labels, or the limits that are in force
/// instead.
QString colourBarText(const WaterfallForm& form, const PictureStyle& style, bool highest);

}  // namespace zel
