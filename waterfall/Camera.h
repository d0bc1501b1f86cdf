#pragma once
// From the graph's box to the pixels of a picture.

#include "platform/Graph3D.h"

namespace zel {

/// A point of the box: frequency 0 to 12, depth 0 to 10, level 0 to 10.
struct BoxPoint {
    double x = 0;
    double y = 0;
    double z = 0;
};

/// A point as the eye has it: right and up in units of the box, and its distance along the line of
/// sight. Without perspective the distance is 1 for all.
struct SeenPoint {
    double right = 0;
    double up = 0;
    double distance = 1;
};

struct ScreenPoint {
    double x = 0;
    double y = 0;  ///< downwards
};

/// Angles repeat at 360 degrees. What is no number counts as the design's value; a distance below
/// 0.1 as 0.1.
class Camera {
  public:
    static constexpr double kWidth = 12;
    static constexpr double kDepth = 10;
    static constexpr double kHeight = 10;
    /// What is nearer than this is not seen.
    static constexpr double kNearest = 0.05;

    Camera(const GraphView3D& view, bool perspective, double width, double height);

    bool perspective() const { return perspective_; }
    /// Towards the eye.
    const BoxPoint& direction() const { return towardsEye_; }
    /// Where the eye is; without perspective far away in its direction.
    const BoxPoint& eye() const { return eye_; }

    SeenPoint seen(const BoxPoint& point) const;
    /// Of a point that is not nearer than `kNearest`.
    ScreenPoint onScreen(const SeenPoint& point) const;
    ScreenPoint project(const BoxPoint& point) const { return onScreen(seen(point)); }
    bool inFront(const BoxPoint& point) const { return seen(point).distance >= kNearest; }
    /// Pixels in a unit of the box at the picture's centre.
    double scale() const { return scale_; }

    // How a seen point changes with the box: right and up and distance for a step along an axis.
    SeenPoint step(const BoxPoint& way) const;

  private:
    bool perspective_;
    BoxPoint right_;
    BoxPoint up_;
    BoxPoint towardsEye_;
    BoxPoint centre_;
    BoxPoint eye_;
    double eyeDistance_ = 1;
    double scale_ = 1;
    double middleX_;
    double middleY_;
};

}  // namespace zel
