#include "waterfall/Camera.h"

#include <algorithm>
#include <cmath>
#include <numbers>

#include "platform/Graph3D.h"

namespace zel {
namespace {

constexpr double kLeastDistance = 0.1;
constexpr double kMostDistance = 1e6;
constexpr double kFarthestCentre = 1e6;
constexpr double kFar = 1e9;
/// Of the eye from the centre, in units of the box, at distance 1.
constexpr double kEyeAtOne = 10;
// Share of the picture's height that a unit of the box takes at distance 1: so chosen that the box
// fills the picture at 2.8 with perspective, and from above at 1.0 without.
constexpr double kPerspectiveScale = 0.150;
constexpr double kOrthographicScale = 0.082;
/// Width of the picture in heights that the box needs.
constexpr double kWidthForHeight = 1.3;

double finite(double value, double otherwise, double most) {
    return std::isfinite(value) ? std::clamp(value, -most, most) : otherwise;
}

double radians(double degrees, double otherwise) {
    if (!std::isfinite(degrees)) degrees = otherwise;
    return std::remainder(degrees, 360.0) * std::numbers::pi / 180;
}

double dot(const BoxPoint& a, const BoxPoint& b) { return a.x * b.x + a.y * b.y + a.z * b.z; }

}  // namespace

Camera::Camera(const GraphView3D& view, bool perspective, double width, double height)
    : perspective_(perspective), middleX_(width / 2), middleY_(height / 2) {
    const GraphView3D design;
    const double latitude = radians(view.Latitude, design.Latitude);
    const double longitude = radians(view.Longitude, design.Longitude);
    const double sine = std::sin(latitude);
    // From straight above, frequency goes to the right and depth upwards; a growing latitude leads
    // the eye down to the side of the oldest row, a growing longitude around to the right.
    towardsEye_ = {sine * std::sin(longitude), -sine * std::cos(longitude), std::cos(latitude)};
    right_ = {std::cos(longitude), std::sin(longitude), 0};
    up_ = {towardsEye_.y * right_.z - towardsEye_.z * right_.y,
           towardsEye_.z * right_.x - towardsEye_.x * right_.z,
           towardsEye_.x * right_.y - towardsEye_.y * right_.x};
    centre_ = {finite(view.TransX, design.TransX, kFarthestCentre),
               finite(view.TransY, design.TransY, kFarthestCentre),
               finite(view.TransZ, design.TransZ, kFarthestCentre)};
    const double distance =
        std::max(finite(view.Distance, design.Distance, kMostDistance), kLeastDistance);
    const double size = std::min(height, width / kWidthForHeight);
    scale_ = size * (perspective ? kPerspectiveScale : kOrthographicScale) / distance;
    eyeDistance_ = kEyeAtOne * distance;
    const double away = perspective ? eyeDistance_ : kFar;
    eye_ = {centre_.x + towardsEye_.x * away, centre_.y + towardsEye_.y * away,
            centre_.z + towardsEye_.z * away};
}

SeenPoint Camera::step(const BoxPoint& way) const {
    return {dot(way, right_), dot(way, up_), perspective_ ? -dot(way, towardsEye_) : 0};
}

SeenPoint Camera::seen(const BoxPoint& point) const {
    SeenPoint seen = step({point.x - centre_.x, point.y - centre_.y, point.z - centre_.z});
    seen.distance = perspective_ ? eyeDistance_ + seen.distance : 1;
    return seen;
}

ScreenPoint Camera::onScreen(const SeenPoint& point) const {
    const double scale = perspective_ ? scale_ * eyeDistance_ / point.distance : scale_;
    return {middleX_ + point.right * scale, middleY_ - point.up * scale};
}

}  // namespace zel
