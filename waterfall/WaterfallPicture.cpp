#include "waterfall/WaterfallPicture.h"

#include <algorithm>
#include <cmath>
#include <optional>

#include "platform/Graph3D.h"
#include "waterfall/AxisBox.h"
#include "waterfall/Camera.h"
#include "waterfall/ColourMap.h"
#include "waterfall/RowSurface.h"
#include "waterfall/SurfaceRenderer.h"

namespace zel {
namespace {

constexpr double kShade = 0.78;

/// The lowest and the highest level of all rows; false without any.
bool levelsOfRows(const Graph3D& graph, double& low, double& high) {
    bool any = false;
    for (const GraphCurve3D& plot : graph.plots()) {
        for (const double level : plot.level) {
            if (!std::isfinite(level)) continue;
            low = any ? std::min(low, level) : level;
            high = any ? std::max(high, level) : level;
            any = true;
        }
    }
    return any;
}

int dotsOf(int pixels, double dots) {
    const double wanted = std::isfinite(dots) && dots > 0 ? pixels * dots : pixels;
    return static_cast<int>(std::clamp<double>(wanted, 1, SurfaceRenderer::kLargestSide));
}

}  // namespace

RowLimits pictureLimits(const Graph3D& graph, const PictureStyle& style) {
    RowLimits limits{graph.axis(1).Minimum, graph.axis(1).Maximum, graph.axis(2).Minimum,
                     graph.axis(2).Maximum, graph.axis(3).Minimum, graph.axis(3).Maximum};
    if (style.depthRows > 0) {
        const GraphCurve3D* newest = graph.lastRow();
        const double last = newest != nullptr ? newest->depth.front() : limits.firstDepth;
        if (std::isfinite(last)) {
            limits.firstDepth = std::max(limits.firstDepth, last - (style.depthRows - 1));
            limits.lastDepth = limits.firstDepth + std::max(style.depthRows - 1, 1);
        }
    }
    if (style.levels == LevelSource::Rows) {
        levelsOfRows(graph, limits.low, limits.high);
    } else if (style.levels == LevelSource::ByHand && style.low != style.high) {
        limits.low = std::min(style.low, style.high);
        limits.high = std::max(style.low, style.high);
    }
    return limits;
}

const ColourMap& pictureMap(const Graph3D& graph, const PictureStyle& style) {
    if (style.colourMap > 0) return ColourMap::ofStyle(style.colourMap);
    for (const GraphCurve3D& plot : graph.plots())
        if (plot.colorMapStyle > 0) return ColourMap::ofStyle(plot.colorMapStyle);
    return ColourMap::ofStyle(0);
}

WaterfallPicture drawWaterfall(const Graph3D& graph, const PictureStyle& style, int width,
                               int height, double fontHeight) {
    WaterfallPicture picture;
    width = std::clamp(width, 1, SurfaceRenderer::kLargestSide);
    height = std::clamp(height, 1, SurfaceRenderer::kLargestSide);
    const bool perspective = graph.Projection == Projection3D::Perspective;
    picture.limits = pictureLimits(graph, style);
    picture.map = &pictureMap(graph, style);
    const GraphView3D view = style.view.value_or(graph.view());
    const int over = std::clamp(style.oversampling, 1, 4);
    const int columns = dotsOf(width, style.dots);
    const int lines = dotsOf(height, style.dots);
    const Camera fine(view, perspective, columns * over, lines * over);
    picture.rows =
        SurfaceRenderer(fine, *picture.map, kShade)
            .draw(rowSurfaces(graph, picture.limits), columns, lines, style.threads, over);
    const Camera camera(view, perspective, width, height);
    addAxisBox(graph, camera, fontHeight, picture);
    addMarkers(graph, camera, picture);
    return picture;
}

std::optional<SurfaceHit> pointAt(const Graph3D& graph, const PictureStyle& style, int width,
                                  int height, ScreenPoint pixel) {
    if (!(pixel.x >= 0 && pixel.y >= 0 && pixel.x < width && pixel.y < height)) return std::nullopt;
    const Camera camera(style.view.value_or(graph.view()),
                        graph.Projection == Projection3D::Perspective, width, height);
    return SurfaceRenderer(camera, pictureMap(graph, style))
        .hit(rowSurfaces(graph, pictureLimits(graph, style)), static_cast<int>(pixel.x),
             static_cast<int>(pixel.y), height);
}

}  // namespace zel
