#pragma once
// Puts the picture of the rows on a paint device: the one look for the screen and for files.

#include <QPainter>

#include "desktop/graph/GraphColors.h"
#include "waterfall/ColourMap.h"
#include "waterfall/WaterfallPicture.h"

namespace zel {

/// The picture was drawn for `picture.rows`' size; it fills `area`.
void paintWaterfall(QPainter& painter, const QRectF& area, const WaterfallPicture& picture,
                    const GraphColors& colors);
/// The colours from the lowest at the foot to the highest at the top, with both limits beside.
void paintColourBar(QPainter& painter, const QRectF& area, const ColourMap& map,
                    const QString& highest, const QString& lowest, const GraphColors& colors);
/// Texts of the three-dimensional graph.
QFont waterfallFont();

}  // namespace zel
