#include "waterfall/RowSurface.h"

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <utility>
#include <vector>

#include "platform/Graph3D.h"
#include "waterfall/Camera.h"
#include "waterfall/ColourMap.h"

namespace zel {
namespace {

/// Scripts count rows from 1: one place beyond either end is still shown.
constexpr double kBeyond = 1.0;
constexpr std::size_t kMostPoints = 100000;

using Point = RowSurface::Point;

bool usable(double first, double last) {
    return std::isfinite(first) && std::isfinite(last) && std::isfinite(last - first) &&
           last != first;
}

/// Where the segment from a to b crosses the plane x.
Point between(const Point& a, const Point& b, float x) {
    const float part = (x - a.x) / (b.x - a.x);
    return {x, a.z + (b.z - a.z) * part, a.part + (b.part - a.part) * part,
            part < 0.5F ? a.sample : b.sample};
}

/// The piece of the polyline inside of the box.
std::vector<Point> cut(const std::vector<Point>& points) {
    constexpr float kWidth = Camera::kWidth;
    std::vector<Point> inside;
    for (std::size_t i = 0; i < points.size(); ++i) {
        if (i > 0) {
            const Point& a = points[i - 1];
            const Point& b = points[i];
            for (const float edge : {0.0F, kWidth})
                if (a.x < edge && b.x > edge) inside.push_back(between(a, b, edge));
        }
        if (points[i].x >= 0 && points[i].x <= kWidth) inside.push_back(points[i]);
    }
    return inside;
}

class Maker {
  public:
    explicit Maker(const RowLimits& limits) : limits_(limits), scale_(limits.low, limits.high) {}

    void add(const GraphCurve3D& plot, int number, std::vector<RowSurface>& surfaces) const {
        if (plot.depth.empty() || !std::isfinite(plot.depth.front())) return;
        RowSurface row;
        if (!place(plot.depth.front(), row)) return;
        row.plot = number;
        const std::size_t count = std::min(
            {plot.level.size(), plot.x.empty() ? plot.level.size() : plot.x.size(), kMostPoints});
        std::vector<Point> piece;
        for (std::size_t i = 0; i < count; ++i) {
            const double x = boxX(plot, i, count);
            if (std::isnan(plot.level[i]) || !std::isfinite(x)) {
                finish(row, piece, surfaces);
                continue;
            }
            const double part = scale_.part(plot.level[i]);
            piece.push_back({static_cast<float>(x), static_cast<float>(part * Camera::kHeight),
                             static_cast<float>(part), static_cast<int>(i)});
        }
        finish(row, piece, surfaces);
    }

  private:
    bool place(double depth, RowSurface& row) const {
        if (!usable(limits_.firstDepth, limits_.lastDepth)) {
            row.nearY = 0;
            row.farY = Camera::kDepth;
            return true;
        }
        const double low = std::min(limits_.firstDepth, limits_.lastDepth);
        const double high = std::max(limits_.firstDepth, limits_.lastDepth);
        if (depth < low - kBeyond || depth > high + kBeyond) return false;
        // Neighbours have the plane between them in common, to the last bit.
        const double step = Camera::kDepth / (limits_.lastDepth - limits_.firstDepth);
        const double before = (depth - limits_.firstDepth - 0.5) * step;
        const double behind = (depth - limits_.firstDepth + 0.5) * step;
        row.nearY = std::min(before, behind);
        row.farY = std::max(before, behind);
        return true;
    }

    double boxX(const GraphCurve3D& plot, std::size_t i, std::size_t count) const {
        if (plot.x.empty() || !usable(limits_.firstX, limits_.lastX))
            return count > 1
                       ? Camera::kWidth * static_cast<double>(i) / static_cast<double>(count - 1)
                       : Camera::kWidth / 2;
        return std::clamp(
            Camera::kWidth * (plot.x[i] - limits_.firstX) / (limits_.lastX - limits_.firstX), -1e6,
            1e6);
    }

    static void finish(const RowSurface& row, std::vector<Point>& piece,
                       std::vector<RowSurface>& surfaces) {
        const auto byX = [](const Point& a, const Point& b) { return a.x < b.x; };
        if (!std::is_sorted(piece.begin(), piece.end(), byX))
            std::stable_sort(piece.begin(), piece.end(), byX);
        if (piece.size() == 1) {
            // A lone sample is as wide as a sample of a full row.
            constexpr auto kHalf = static_cast<float>(Camera::kWidth / 600);
            Point right = piece.front();
            piece.front().x -= kHalf;
            right.x += kHalf;
            piece.push_back(right);
        }
        RowSurface made = row;
        made.points = cut(piece);
        piece.clear();
        if (made.points.size() > 1) surfaces.push_back(std::move(made));
    }

    const RowLimits& limits_;
    LevelScale scale_;
};

}  // namespace

std::vector<RowSurface> rowSurfaces(const Graph3D& graph, const RowLimits& limits) {
    std::vector<RowSurface> surfaces;
    const Maker maker(limits);
    int number = 0;
    for (const GraphCurve3D& plot : graph.plots()) maker.add(plot, number++, surfaces);
    return surfaces;
}

}  // namespace zel
