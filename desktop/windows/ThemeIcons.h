#pragma once
// The icons of the window: drawings in the ink of the theme.

#include <QColor>
#include <QIcon>
#include <QString>

namespace zel {

/// An icon of the picture set ("open"), sharp at each scale. It takes the ink of the theme in use
/// at each drawing; with `ink` it keeps that colour.
QIcon themeIcon(const QString& name, const QColor& ink = {});
/// The program's own.
QIcon applicationIcon();

}  // namespace zel
