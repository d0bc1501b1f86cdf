#include "waterfall/AxisBox.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>
#include <string>
#include <utility>
#include <vector>

#include "platform/Graph3D.h"
#include "support/Text.h"
#include "waterfall/AxisTicks.h"
#include "waterfall/Camera.h"
#include "waterfall/RowSurface.h"
#include "waterfall/WaterfallPicture.h"

namespace zel {
namespace {

constexpr int kTicks = 6;
constexpr double kTickLength = 0.25;
constexpr double kMarkerArm = 7;      // pixels
constexpr double kShortestAxis = 40;  // pixels; a shorter one is seen end on
constexpr double kSides[] = {Camera::kWidth, Camera::kDepth, Camera::kHeight};
constexpr int kDepthAxis = 2;

double& part(BoxPoint& point, int axis) {
    return axis == 0 ? point.x : axis == 1 ? point.y : point.z;
}
double part(const BoxPoint& point, int axis) {
    return axis == 0 ? point.x : axis == 1 ? point.y : point.z;
}

/// A place on an axis of the box, and what is written there.
struct Mark {
    double place;
    std::string text;
};
using Marks = std::array<std::vector<Mark>, 3>;

void addTicks(double first, double last, const std::string& format, double side,
              std::vector<Mark>& marks) {
    const double step = tickStep(first, last, kTicks);
    for (const double tick : axisTicks(first, last, kTicks))
        marks.push_back({(tick - first) / (last - first) * side, axisNumber(tick, format, step)});
}

std::vector<Mark> rowMarks(const Graph3D& graph, const RowLimits& limits) {
    std::vector<Mark> marks;
    const double range = limits.lastDepth - limits.firstDepth;
    const ValuePairs& labels = graph.valuePairs(kDepthAxis);
    // From the newest: where rows of an earlier view bear the same numbers its label counts.
    int lastRow = 0;
    for (auto plot = graph.plots().rbegin(); plot != graph.plots().rend(); ++plot) {
        if (plot->row == 0 || plot->depth.empty() || plot->row == lastRow) continue;
        lastRow = plot->row;
        const std::string& name = labels.item(plot->row).Name;
        const double place =
            range == 0 ? Camera::kDepth / 2
                       : (plot->depth.front() - limits.firstDepth) / range * Camera::kDepth;
        if (!trimmed(name).empty() && place >= -0.2 && place <= Camera::kDepth + 0.2)
            marks.push_back({place, trimmed(name)});
    }
    return marks;
}

struct TextPlace {
    ScreenPoint at;
    const std::string* text;
};

/// Texts lie flat: side by side they need their width.
bool apart(const TextPlace& a, const TextPlace& b, double fontHeight) {
    const auto letters = static_cast<double>(b.text->size()) + 2;
    return std::fabs(a.at.x - b.at.x) >= 0.62 * fontHeight * letters ||
           std::fabs(a.at.y - b.at.y) >= fontHeight * 1.15;
}

/// Each n-th of the places that has room after the one before it.
std::vector<std::size_t> eachNth(const std::vector<TextPlace>& places, std::size_t n,
                                 double fontHeight) {
    std::vector<std::size_t> kept;
    for (std::size_t i = 0; i < places.size(); i += n)
        if (kept.empty() || apart(places[kept.back()], places[i], fontHeight)) kept.push_back(i);
    return kept;
}

/// The places that get their texts: at even steps, unless that would leave out more than half of
/// those that have room.
std::vector<std::size_t> textsWithRoom(const std::vector<TextPlace>& places, double fontHeight) {
    std::vector<std::size_t> most = eachNth(places, 1, fontHeight);
    for (std::size_t n = 1; places.size() / n * 2 >= most.size() && n <= places.size(); ++n) {
        std::vector<std::size_t> even = eachNth(places, n, fontHeight);
        if (even.size() == (places.size() + n - 1) / n) return even;
    }
    return most;
}

class Box {
  public:
    Box(const Graph3D& graph, const Camera& camera, double fontHeight, WaterfallPicture& picture)
        : graph_(graph), camera_(camera), fontHeight_(fontHeight), picture_(picture) {
        const RowLimits& limits = picture.limits;
        addTicks(limits.firstX, limits.lastX, graph.axis(1).Format, kSides[0], marks_[0]);
        marks_[1] = rowMarks(graph, limits);
        addTicks(limits.low, limits.high, graph.axis(3).Format, kSides[2], marks_[2]);
        for (int axis = 0; axis < 3; ++axis) far_[axis] = farSide(axis);
    }

    void draw() {
        for (int axis = 0; axis < 3; ++axis) wall(axis);
        for (int axis = 0; axis < 3; ++axis) labels(axis);
    }

  private:
    /// The side of the box that shows its inside to the eye, along an axis.
    double farSide(int axis) const {
        const double towards = camera_.perspective() ? part(camera_.eye(), axis) - kSides[axis] / 2
                                                     : part(camera_.direction(), axis);
        return towards > 0 ? 0 : kSides[axis];
    }

    bool line(const BoxPoint& from, const BoxPoint& to, PictureLine::Kind kind,
              std::vector<PictureLine>& lines) const {
        SeenPoint a = camera_.seen(from);
        SeenPoint b = camera_.seen(to);
        const bool aIn = a.distance >= Camera::kNearest;
        const bool bIn = b.distance >= Camera::kNearest;
        if (!aIn && !bIn) return false;
        if (aIn != bIn) {
            const double at = (Camera::kNearest - a.distance) / (b.distance - a.distance);
            (aIn ? b : a) = {a.right + (b.right - a.right) * at, a.up + (b.up - a.up) * at,
                             Camera::kNearest};
        }
        lines.push_back({camera_.onScreen(a), camera_.onScreen(b), kind});
        return true;
    }

    /// The far wall across an axis, with the grid of the two others.
    void wall(int across) {
        const bool level = graph_.LevelGrid;
        for (int axis = 0; axis < 3; ++axis) {
            if (axis == across) continue;
            const int other = 3 - axis - across;
            std::vector<double> places{0, kSides[axis]};
            if (axis != 2 || level)
                for (const Mark& mark : marks_.at(static_cast<std::size_t>(axis)))
                    places.push_back(mark.place);
            for (std::size_t i = 0; i < places.size(); ++i) {
                BoxPoint from;
                part(from, across) = far_[across];
                part(from, axis) = places[i];
                BoxPoint to = from;
                part(to, other) = kSides[other];
                line(from, to, i < 2 ? PictureLine::Kind::Frame : PictureLine::Kind::Grid,
                     picture_.behind);
            }
        }
    }

    /// Of the four edges along an axis the one at the outline of the box: the lowest on the
    /// screen, for the level axis the leftmost.
    bool edge(int axis, BoxPoint& start) const {
        const int a = axis == 0 ? 1 : 0;
        const int b = axis == 2 ? 1 : 2;
        bool found = false;
        double best = 0;
        for (const double placeA : {0.0, kSides[a]}) {
            for (const double placeB : {0.0, kSides[b]}) {
                // At the outline one of its two walls is a far one and the other is not.
                if ((placeA == far_[a]) == (placeB == far_[b])) continue;
                BoxPoint from;
                part(from, a) = placeA;
                part(from, b) = placeB;
                BoxPoint to = from;
                part(to, axis) = kSides[axis];
                if (!camera_.inFront(from) || !camera_.inFront(to)) continue;
                const ScreenPoint p = camera_.project(from);
                const ScreenPoint q = camera_.project(to);
                // From straight above two edges lie equally low: then the left one.
                constexpr double kALittle = 1e-3;
                const double left = -(p.x + q.x);
                const double rank = axis == 2 ? left : p.y + q.y + kALittle * left;
                if (found && rank <= best) continue;
                if (std::hypot(p.x - q.x, p.y - q.y) < kShortestAxis) continue;
                found = true;
                best = rank;
                start = from;
            }
        }
        return found;
    }

    void labels(int axis) {
        if (axis == 2 && !graph_.LevelTicks) return;
        BoxPoint start;
        if (!edge(axis, start)) return;
        BoxPoint end = start;
        part(end, axis) = kSides[axis];
        line(start, end, PictureLine::Kind::Frame, picture_.before);
        // Ticks go away from the middle of the box.
        const ScreenPoint middle =
            camera_.project({kSides[0] / 2, kSides[1] / 2, axis == 2 ? kSides[2] / 2 : 0});
        const ScreenPoint p = camera_.project(start);
        const ScreenPoint q = camera_.project(end);
        const double length = std::hypot(q.x - p.x, q.y - p.y);
        ScreenPoint out{-(q.y - p.y) / length, (q.x - p.x) / length};
        if (out.x * ((p.x + q.x) / 2 - middle.x) + out.y * ((p.y + q.y) / 2 - middle.y) < 0)
            out = {-out.x, -out.y};
        const double tick = std::clamp(kTickLength * camera_.scale(), 4.0, 8.0);
        const bool hidden = axis == 2 && graph_.axis(3).LabelColor == graph_.BackColor;
        std::vector<TextPlace> places;
        for (const Mark& mark : marks_.at(static_cast<std::size_t>(axis))) {
            BoxPoint place = start;
            part(place, axis) = mark.place;
            if (!camera_.inFront(place)) continue;
            const ScreenPoint at = camera_.project(place);
            picture_.before.push_back(
                {at, {at.x + out.x * tick, at.y + out.y * tick}, PictureLine::Kind::Tick});
            places.push_back({at, &mark.text});
        }
        if (hidden) return;
        const double gap = tick + 0.25 * fontHeight_;
        for (const std::size_t i : textsWithRoom(places, fontHeight_)) {
            PictureText text;
            const ScreenPoint& at = places[i].at;
            text.at = {at.x + out.x * gap, at.y + out.y * gap};
            text.right = out.x > 0.35 ? 1 : out.x < -0.35 ? -1 : 0;
            text.down = out.y > 0.35 ? 1 : out.y < -0.35 ? -1 : 0;
            text.text = *places[i].text;
            picture_.texts.push_back(std::move(text));
        }
    }

    const Graph3D& graph_;
    const Camera& camera_;
    double fontHeight_;
    WaterfallPicture& picture_;
    Marks marks_;
    double far_[3] = {};
};

}  // namespace

void addAxisBox(const Graph3D& graph, const Camera& camera, double fontHeight,
                WaterfallPicture& picture) {
    Box(graph, camera, fontHeight, picture).draw();
}

void addMarkers(const Graph3D& graph, const Camera& camera, WaterfallPicture& picture) {
    const RowLimits& limits = picture.limits;
    const auto place = [](double value, double first, double last, double side) {
        const double range = last - first;
        return range == 0 || !std::isfinite(range) ? side / 2 : (value - first) / range * side;
    };
    for (const GraphCursor3D& cursor : graph.cursors()) {
        if (!cursor.placed) continue;
        const BoxPoint point{place(cursor.X, limits.firstX, limits.lastX, Camera::kWidth),
                             place(cursor.Y, limits.firstDepth, limits.lastDepth, Camera::kDepth),
                             std::clamp(place(cursor.Z, limits.low, limits.high, Camera::kHeight),
                                        0.0, Camera::kHeight)};
        const bool inside = point.x >= 0 && point.x <= Camera::kWidth && point.y >= -0.5 &&
                            point.y <= Camera::kDepth + 0.5;
        if (!inside || !camera.inFront(point)) continue;
        const ScreenPoint at = camera.project(point);
        picture.before.push_back(
            {{at.x - kMarkerArm, at.y}, {at.x + kMarkerArm, at.y}, PictureLine::Kind::Marker});
        picture.before.push_back(
            {{at.x, at.y - kMarkerArm}, {at.x, at.y + kMarkerArm}, PictureLine::Kind::Marker});
        const double step = (limits.lastX - limits.firstX) / 1000;
        PictureText text;
        text.at = {at.x + kMarkerArm, at.y - kMarkerArm};
        text.right = 1;
        text.down = -1;
        text.marker = true;
        text.text = axisNumber(cursor.X, graph.axis(1).Format, std::fabs(step)) + "  " +
                    axisNumber(cursor.Z, levelFormat(graph), 0.1);
        if (cursor.NameVisible) text.text += "  " + trimmed(cursor.Name);
        picture.texts.push_back(std::move(text));
    }
}

}  // namespace zel
