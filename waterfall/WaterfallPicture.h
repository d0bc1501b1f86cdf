#pragma once
// The whole picture of the graph, ready to be put on any paint device: box, rows, axes, texts.

#include <optional>
#include <string>
#include <vector>

#include "platform/Graph3D.h"
#include "waterfall/Camera.h"
#include "waterfall/ColourMap.h"
#include "waterfall/RowSurface.h"
#include "waterfall/SurfaceRenderer.h"

namespace zel {

enum class LevelSource { Axis, Rows, ByHand };

/// How the graph is to be shown, beyond what it says itself.
struct PictureStyle {
    int colourMap = 0;  ///< 1-based; 0 takes the map style of the rows
    int depthRows = 0;  ///< the newest so many; 0 takes the range of the axis
    LevelSource levels = LevelSource::Axis;
    double low = 0;  ///< by hand
    double high = 0;
    int threads = 2;
    int oversampling = 1;
    double dots = 1;  ///< pixels of the rows' image in a pixel of lines and texts, each way
    std::optional<GraphView3D> view;  ///< in place of the graph's own

    bool operator==(const PictureStyle&) const = default;
};

struct PictureLine {
    enum class Kind { Grid, Frame, Tick, Marker };
    ScreenPoint from;
    ScreenPoint to;
    Kind kind = Kind::Grid;
};

struct PictureText {
    ScreenPoint at;
    /// Where the text lies from its point: -1 to its left or above, 0 centred, 1 to its right or
    /// below.
    int right = 0;
    int down = 0;
    std::string text;
    bool marker = false;
};

struct WaterfallPicture {
    std::vector<PictureLine> behind;  ///< the rows hide them
    SurfaceImage rows;
    std::vector<PictureLine> before;
    std::vector<PictureText> texts;
    std::vector<ScreenPoint> markers;
    RowLimits limits;
    const ColourMap* map = nullptr;
};

RowLimits pictureLimits(const Graph3D& graph, const PictureStyle& style);
/// The map of the rows' own style, or the chosen one.
const ColourMap& pictureMap(const Graph3D& graph, const PictureStyle& style);
/// `width` and `height` in pixels, `fontHeight` keeps texts apart. The image of the rows has
/// `dots` times as many pixels each way.
WaterfallPicture drawWaterfall(const Graph3D& graph, const PictureStyle& style, int width,
                               int height, double fontHeight);
/// Plot and sample under a pixel of the same picture.
std::optional<SurfaceHit> pointAt(const Graph3D& graph, const PictureStyle& style, int width,
                                  int height, ScreenPoint pixel);

}  // namespace zel
