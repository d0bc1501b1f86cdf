#pragma once
// A stripe of the picture, column by column, onto which polygons are drawn from near to far.

#include <array>
#include <cstddef>
#include <vector>

#include "waterfall/ColourMap.h"

namespace zel {

/// A corner on the screen; `near` is one by its distance, `colour` its place in the colour map (0
/// to 1) times that.
struct ScreenVertex {
    float x = 0;
    float y = 0;
    float near = 1;
    float colour = 0;
};

class ColumnCanvas {
  public:
    /// The columns from `first` to before `last`. With `grounded` no later polygon shows below one
    /// that stands on the floor.
    ColumnCanvas(int first, int last, int height, bool grounded);

    /// A convex polygon, which is seen where nothing was drawn before. `floorEdge` is the index of
    /// the corner at which the edge on the floor begins, -1 for none.
    void fill(const ScreenVertex* corners, int count, int floorEdge,
              const std::array<Pixel, ColourMap::kColours>& colours);

    /// Remembers whether a polygon comes to be seen at that place.
    void watch(int x, int y);
    /// True from the first polygon on that is seen there.
    bool met() const { return met_; }

    int first() const { return first_; }
    int last() const { return last_; }
    const Pixel* column(int x) const {
        return &pixels_[static_cast<std::size_t>(x - first_) * static_cast<std::size_t>(height_)];
    }

  private:
    struct Crossing {
        float y;
        float colour;
        int edge;
    };
    void span(int x, const Crossing& top, const Crossing& bottom, int floorEdge,
              const std::array<Pixel, ColourMap::kColours>& colours);

    int first_;
    int last_;
    int height_;
    bool grounded_;
    std::vector<Pixel> pixels_;
    std::vector<int> covered_;  ///< from here down nothing drawn later is seen
    int watchX_ = -1;
    int watchY_ = -1;
    bool met_ = false;
};

}  // namespace zel
