#include "waterfall/ColumnCanvas.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>
#include <limits>

#include "waterfall/ColourMap.h"

namespace zel {
namespace {

/// The first pixel whose middle is not before `edge`, kept within 0 to `most`.
int pixelFrom(float edge, int most) {
    const float place = edge - 0.5F;
    if (!(place > 0)) return 0;
    if (place >= static_cast<float>(most)) return most;
    const int whole = static_cast<int>(place);
    return whole + (static_cast<float>(whole) < place ? 1 : 0);
}

}  // namespace

ColumnCanvas::ColumnCanvas(int first, int last, int height, bool grounded)
    : first_(first),
      last_(last),
      height_(height),
      grounded_(grounded),
      pixels_(static_cast<std::size_t>(last - first) * static_cast<std::size_t>(height)),
      covered_(static_cast<std::size_t>(last - first), height) {}

void ColumnCanvas::watch(int x, int y) {
    watchX_ = x;
    watchY_ = y;
    met_ = false;
}

void ColumnCanvas::fill(const ScreenVertex* corners, int count, int floorEdge,
                        const std::array<Pixel, ColourMap::kColours>& colours) {
    float left = corners[0].x;
    float right = corners[0].x;
    float highest = corners[0].y;
    for (int i = 1; i < count; ++i) {
        left = std::min(left, corners[i].x);
        right = std::max(right, corners[i].x);
        highest = std::min(highest, corners[i].y);
    }
    const int from = std::max(first_, pixelFrom(left, last_));
    const int to = std::min(last_, pixelFrom(right, last_));
    for (int x = from; x < to; ++x) {
        if (highest >= static_cast<float>(covered_[static_cast<std::size_t>(x - first_)])) continue;
        const float middle = static_cast<float>(x) + 0.5F;
        Crossing top{std::numeric_limits<float>::max(), 0, -1};
        Crossing bottom{std::numeric_limits<float>::lowest(), 0, -1};
        for (int i = 0; i < count; ++i) {
            // An edge that two polygons share is cut at the same place for both.
            const ScreenVertex* a = &corners[i];
            const ScreenVertex* b = &corners[i + 1 == count ? 0 : i + 1];
            if (a->x > b->x) std::swap(a, b);
            if (!(a->x <= middle && middle < b->x)) continue;
            const float part = (middle - a->x) / (b->x - a->x);
            const float y = a->y + part * (b->y - a->y);
            const float near = a->near + part * (b->near - a->near);
            const float colour = (a->colour + part * (b->colour - a->colour)) / near;
            if (y < top.y) top = {y, colour, i};
            if (y > bottom.y || (y == bottom.y && i == floorEdge)) bottom = {y, colour, i};
        }
        if (top.edge >= 0) span(x, top, bottom, floorEdge, colours);
    }
}

void ColumnCanvas::span(int x, const Crossing& top, const Crossing& bottom, int floorEdge,
                        const std::array<Pixel, ColourMap::kColours>& colours) {
    int& covered = covered_[static_cast<std::size_t>(x - first_)];
    const int from = pixelFrom(top.y, height_);
    const int whole = pixelFrom(bottom.y, height_);
    const int to = std::min(whole, covered);
    Pixel* const column =
        &pixels_[static_cast<std::size_t>(x - first_) * static_cast<std::size_t>(height_)];
    if (x == watchX_ && watchY_ >= from && watchY_ < to && column[watchY_] == 0) met_ = true;
    constexpr float kLast = ColourMap::kColours - 1;
    const float height = bottom.y - top.y;
    const float slope = height > 0 ? (bottom.colour - top.colour) / height * kLast : 0;
    float colour = top.colour * kLast + (static_cast<float>(from) + 0.5F - top.y) * slope + 0.5F;
    for (int y = from; y < to; ++y, colour += slope) {
        if (column[y] != 0) continue;
        column[y] = colours[static_cast<std::size_t>(std::clamp(colour, 0.0F, kLast))];
    }
    if (!grounded_) return;
    if (bottom.edge == floorEdge || whole >= covered) covered = std::min(covered, from);
}

}  // namespace zel
