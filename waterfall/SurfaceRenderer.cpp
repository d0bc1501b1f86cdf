#include "waterfall/SurfaceRenderer.h"

#include <algorithm>
#include <array>
#include <atomic>
#include <cmath>
#include <cstddef>
#include <functional>
#include <optional>
#include <thread>
#include <utility>
#include <vector>

#include "waterfall/Camera.h"
#include "waterfall/ColourMap.h"
#include "waterfall/ColumnCanvas.h"
#include "waterfall/RowSurface.h"

namespace zel {
namespace {

/// A row's front stands, its top lies; steeper or flatter than this they are lines.
constexpr double kEdgeOn = 1e-4;
constexpr double kOverlap = 0.02;
constexpr int kStripesPerThread = 4;
constexpr long kMostPixels = 128L * 1024 * 1024;

using Colours = std::array<Pixel, ColourMap::kColours>;

Colours shaded(const Colours& colours, double shade) {
    Colours darker{};
    for (std::size_t i = 0; i < colours.size(); ++i) {
        darker[i] = 0xFF000000U;
        for (int shift = 0; shift < 24; shift += 8)
            darker[i] |= static_cast<Pixel>((colours[i] >> shift & 0xFFU) * shade) << shift;
    }
    return darker;
}

/// Runs `work` for 0 to before `count`, on so many threads.
void share(int count, int threads, const std::function<void(int)>& work) {
    std::atomic<int> next{0};
    const auto take = [&] {
        for (int i = next++; i < count; i = next++) work(i);
    };
    std::vector<std::thread> helpers;
    for (int i = 1; i < threads; ++i) helpers.emplace_back(take);
    take();
    for (std::thread& helper : helpers) helper.join();
}

/// A row with its corners on the screen.
struct Projected {
    const RowSurface* row = nullptr;
    double frontY = 0;  ///< in the box: the plane that faces the eye
    double backY = 0;
    bool showsFront = false;
    std::vector<ScreenVertex> top;    ///< of the front
    std::vector<ScreenVertex> floor;  ///< of the front
    std::vector<ScreenVertex> back;   ///< of the top at the other plane
    std::vector<ScreenVertex> under;  ///< of the floor there, where the eye is below
};

class Scene {
  public:
    Scene(const Camera& camera, const std::vector<RowSurface>& rows, int threads)
        : camera_(camera), below_(eyeIsBelow(camera)) {
        rows_.resize(rows.size());
        for (std::size_t i = 0; i < rows.size(); ++i) prepare(rows[i], rows_[i]);
        std::stable_sort(rows_.begin(), rows_.end(), [this](const auto& a, const auto& b) {
            return away(*a.row) < away(*b.row);
        });
        share(static_cast<int>(rows_.size()), threads,
              [this](int i) { project(rows_[static_cast<std::size_t>(i)]); });
    }

    bool grounded() const {
        // The eye stands above the floor and outside of all rows.
        if (below_ || std::fabs(camera_.direction().z) < kEdgeOn) return false;
        return std::none_of(rows_.begin(), rows_.end(), [this](const Projected& row) {
            return !row.showsFront && std::fabs(camera_.direction().y) > kEdgeOn;
        });
    }

    /// Draws onto the canvas; `drawn` hears of each polygon, its row and the point it begins at.
    template <class Heard>
    void draw(ColumnCanvas& canvas, double middle, const Colours& tops, const Colours& fronts,
              const Heard& drawn) const {
        const bool inwardsIsDown = (canvas.first() + canvas.last()) / 2.0 > middle;
        for (const Projected& row : rows_) {
            const int last = static_cast<int>(row.row->points.size()) - 1;
            if (below_) {
                for (int i = 0; i < last; ++i) {
                    quad(canvas, row, i, {Part::Floor, Part::Under}, tops);
                    drawn(row, i);
                }
            }
            if (row.showsFront) {
                for (int k = 0; k < last; ++k) {
                    const int i = inwardsIsDown ? last - 1 - k : k;
                    quad(canvas, row, i, {Part::Top, Part::Floor}, fronts);
                    drawn(row, i);
                }
            }
            const int split = firstBehindEye(row);
            wall(canvas, row, split > last ? last : 0, fronts);
            drawn(row, split > last ? last : 0);
            for (int i = split; i < last; ++i) top(canvas, row, i, tops, drawn);
            for (int i = std::min(split, last) - 1; i >= 0; --i) top(canvas, row, i, tops, drawn);
        }
    }

  private:
    enum class Part { Top, Floor, Back, Under };

    static bool eyeIsBelow(const Camera& camera) {
        return camera.perspective() ? camera.eye().z < 0 : camera.direction().z < 0;
    }

    double away(const RowSurface& row) const {
        const double middle = (row.nearY + row.farY) / 2;
        if (camera_.perspective()) return std::fabs(middle - camera_.eye().y);
        return camera_.direction().y > 0 ? -middle : middle;
    }

    void prepare(const RowSurface& row, Projected& made) const {
        made.row = &row;
        const double eye = camera_.eye().y;
        const double direction = camera_.direction().y;
        const bool fromHigh =
            camera_.perspective() ? eye > (row.nearY + row.farY) / 2 : direction > 0;
        made.frontY = fromHigh ? row.farY : row.nearY;
        // A trace under the next row, so that no crack shows where tops differ by next to nothing.
        const double under = (row.farY - row.nearY) * kOverlap;
        made.backY = fromHigh ? row.nearY - under : row.farY + under;
        made.showsFront = camera_.perspective() ? (eye < row.nearY || eye > row.farY)
                                                : std::fabs(direction) > kEdgeOn;
        const bool edgeOn =
            camera_.perspective() ? std::fabs(eye - made.frontY) < 10 * under : !made.showsFront;
        if (edgeOn) made.frontY += fromHigh ? under : -under;
    }

    void project(Projected& made) const {
        const auto line = [&](double y, bool raised, std::vector<ScreenVertex>& corners) {
            corners.reserve(made.row->points.size());
            const SeenPoint start = camera_.seen({0, y, 0});
            const SeenPoint stepX = camera_.step({1, 0, 0});
            const SeenPoint stepZ = camera_.step({0, 0, 1});
            for (const RowSurface::Point& point : made.row->points) {
                const double z = raised ? point.z : 0;
                SeenPoint seen{start.right + stepX.right * point.x + stepZ.right * z,
                               start.up + stepX.up * point.x + stepZ.up * z,
                               start.distance + stepX.distance * point.x + stepZ.distance * z};
                corners.push_back(vertex(seen, raised ? point.part : 0));
            }
        };
        line(made.frontY, true, made.top);
        line(made.frontY, false, made.floor);
        line(made.backY, true, made.back);
        if (below_) line(made.backY, false, made.under);
    }

    /// Nearer than the near plane it has `near` 0.
    ScreenVertex vertex(const SeenPoint& seen, double part) const {
        if (!(seen.distance >= Camera::kNearest)) return {0, 0, 0, 0};
        const ScreenPoint screen = camera_.onScreen(seen);
        const double near = 1 / seen.distance;
        return {static_cast<float>(screen.x), static_cast<float>(screen.y),
                static_cast<float>(near), static_cast<float>(part * near)};
    }

    static const std::vector<ScreenVertex>& line(const Projected& row, Part part) {
        switch (part) {
            case Part::Top:
                return row.top;
            case Part::Floor:
                return row.floor;
            case Part::Back:
                return row.back;
            case Part::Under:
                break;
        }
        return row.under;
    }

    BoxPoint boxPoint(const Projected& row, Part part, int i, double& colour) const {
        const RowSurface::Point& point = row.row->points[static_cast<std::size_t>(i)];
        const bool raised = part == Part::Top || part == Part::Back;
        colour = raised ? point.part : 0;
        return {point.x, part == Part::Top || part == Part::Floor ? row.frontY : row.backY,
                raised ? point.z : 0};
    }

    struct Sides {
        Part first;
        Part second;
    };

    void quad(ColumnCanvas& canvas, const Projected& row, int i, Sides sides,
              const Colours& colours) const {
        const auto k = static_cast<std::size_t>(i);
        const std::vector<ScreenVertex>& a = line(row, sides.first);
        const std::vector<ScreenVertex>& b = line(row, sides.second);
        const ScreenVertex corners[] = {a[k], a[k + 1], b[k + 1], b[k]};
        const int floorEdge = sides.second == Part::Floor ? 2 : -1;
        if (corners[0].near > 0 && corners[1].near > 0 && corners[2].near > 0 &&
            corners[3].near > 0)
            return canvas.fill(corners, 4, floorEdge, colours);
        const std::pair<Part, int> places[] = {
            {sides.first, i}, {sides.first, i + 1}, {sides.second, i + 1}, {sides.second, i}};
        clipped(canvas, row, places, colours);
    }

    /// The end of a row across its depth.
    void wall(ColumnCanvas& canvas, const Projected& row, int i, const Colours& colours) const {
        const std::pair<Part, int> places[] = {
            {Part::Top, i}, {Part::Back, i}, {Part::Under, i}, {Part::Floor, i}};
        clipped(canvas, row, places, colours);
    }

    /// Through the near plane, in case.
    void clipped(ColumnCanvas& canvas, const Projected& row,
                 const std::pair<Part, int> (&places)[4], const Colours& colours) const {
        struct Corner {
            SeenPoint seen;
            double colour;
        };
        std::array<Corner, 4> whole{};
        for (std::size_t i = 0; i < whole.size(); ++i)
            whole.at(i).seen =
                camera_.seen(boxPoint(row, places[i].first, places[i].second, whole.at(i).colour));
        std::array<ScreenVertex, 8> kept{};
        int count = 0;
        for (std::size_t i = 0; i < whole.size(); ++i) {
            const Corner& a = whole.at(i);
            const Corner& b = whole.at((i + 1) % whole.size());
            const bool aIn = a.seen.distance >= Camera::kNearest;
            const bool bIn = b.seen.distance >= Camera::kNearest;
            if (aIn) kept.at(static_cast<std::size_t>(count++)) = vertex(a.seen, a.colour);
            if (aIn == bIn) continue;
            const double part =
                (Camera::kNearest - a.seen.distance) / (b.seen.distance - a.seen.distance);
            const SeenPoint cut{a.seen.right + (b.seen.right - a.seen.right) * part,
                                a.seen.up + (b.seen.up - a.seen.up) * part, Camera::kNearest};
            kept.at(static_cast<std::size_t>(count++)) =
                vertex(cut, a.colour + (b.colour - a.colour) * part);
        }
        if (count >= 3) canvas.fill(kept.data(), count, -1, colours);
    }

    /// The first point that the eye has before it going along frequency; the size of the row when
    /// the eye is beyond its end.
    int firstBehindEye(const Projected& row) const {
        const auto& points = row.row->points;
        if (!camera_.perspective())
            return camera_.direction().x > 0 ? static_cast<int>(points.size()) : 0;
        const auto found =
            std::lower_bound(points.begin(), points.end(), camera_.eye().x,
                             [](const RowSurface::Point& point, double x) { return point.x < x; });
        return static_cast<int>(found - points.begin());
    }

    template <class Heard>
    void top(ColumnCanvas& canvas, const Projected& row, int i, const Colours& tops,
             const Heard& drawn) const {
        quad(canvas, row, i, {Part::Top, Part::Back}, tops);
        drawn(row, i);
    }

    const Camera& camera_;
    bool below_;
    std::vector<Projected> rows_;
};

/// Out of columns into rows, the mean of a square of `over` x `over` a pixel.
void transpose(const ColumnCanvas& canvas, int over, SurfaceImage& image) {
    const int square = over * over;
    for (int x = canvas.first(); x < canvas.last(); x += over) {
        for (int y = 0; y < image.height; ++y) {
            unsigned sums[4] = {0, 0, 0, 0};
            for (int i = 0; i < over; ++i) {
                const Pixel* column = canvas.column(x + i) + static_cast<std::ptrdiff_t>(y) * over;
                for (int k = 0; k < over; ++k)
                    for (int part = 0; part < 4; ++part)
                        sums[part] += column[k] >> (8 * part) & 0xFFU;
            }
            Pixel pixel = 0;
            for (int part = 0; part < 4; ++part)
                pixel |=
                    (sums[part] + static_cast<unsigned>(square) / 2) / static_cast<unsigned>(square)
                    << (8 * part);
            image.pixels[static_cast<std::size_t>(y) * static_cast<std::size_t>(image.width) +
                         static_cast<std::size_t>(x / over)] = pixel;
        }
    }
}

void transposePlain(const ColumnCanvas& canvas, SurfaceImage& image) {
    constexpr int kBlock = 16;
    for (int top = 0; top < image.height; top += kBlock) {
        const int bottom = std::min(top + kBlock, image.height);
        for (int left = canvas.first(); left < canvas.last(); left += kBlock) {
            const int right = std::min(left + kBlock, canvas.last());
            for (int y = top; y < bottom; ++y) {
                Pixel* row = &image.pixels[static_cast<std::size_t>(y) *
                                           static_cast<std::size_t>(image.width)];
                for (int x = left; x < right; ++x) row[x] = canvas.column(x)[y];
            }
        }
    }
}

}  // namespace

SurfaceImage SurfaceRenderer::draw(const std::vector<RowSurface>& rows, int width, int height,
                                   int threads, int oversampling) const {
    SurfaceImage image;
    image.width = std::clamp(width, 1, kLargestSide);
    image.height = std::clamp(height, 1, kLargestSide);
    while (static_cast<long>(image.width) * image.height > kMostPixels) image.height /= 2;
    image.pixels.assign(
        static_cast<std::size_t>(image.width) * static_cast<std::size_t>(image.height), 0);
    const int over = std::clamp(oversampling, 1, 4);
    threads = std::clamp(threads, 1, kMostThreads);
    const Scene scene(camera_, rows, threads);
    const Colours fronts = shaded(map_.table(), shade_);
    const bool grounded = scene.grounded();
    const int stripes = std::min(image.width, threads * kStripesPerThread);
    share(stripes, threads, [&](int i) {
        const int first = image.width * i / stripes;
        const int last = image.width * (i + 1) / stripes;
        ColumnCanvas canvas(first * over, last * over, image.height * over, grounded);
        scene.draw(canvas, image.width * over / 2.0, map_.table(), fronts,
                   [](const Projected&, int) {});
        if (over == 1) {
            transposePlain(canvas, image);
        } else {
            transpose(canvas, over, image);
        }
    });
    return image;
}

std::optional<SurfaceHit> SurfaceRenderer::hit(const std::vector<RowSurface>& rows, int x, int y,
                                               int height) const {
    if (x < 0 || y < 0 || x >= kLargestSide || y >= std::min(height, kLargestSide))
        return std::nullopt;
    const Scene scene(camera_, rows, 1);
    ColumnCanvas canvas(x, x + 1, std::clamp(height, 1, kLargestSide), scene.grounded());
    canvas.watch(x, y);
    std::optional<SurfaceHit> found;
    scene.draw(canvas, x, map_.table(), map_.table(), [&](const Projected& row, int i) {
        if (found || !canvas.met()) return;
        found = {row.row->plot, row.row->points[static_cast<std::size_t>(i)].sample};
    });
    return found;
}

}  // namespace zel
