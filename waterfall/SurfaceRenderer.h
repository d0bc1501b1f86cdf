#pragma once
// Draws rows as solids into an image, from the nearest to the farthest.

#include <cstddef>
#include <optional>
#include <vector>

#include "waterfall/Camera.h"
#include "waterfall/ColourMap.h"
#include "waterfall/RowSurface.h"

namespace zel {

/// Pixels row by row from the top, with alpha, the colours multiplied by it. 0 where nothing is.
struct SurfaceImage {
    int width = 0;
    int height = 0;
    std::vector<Pixel> pixels;
    Pixel at(int x, int y) const {
        return pixels[static_cast<std::size_t>(y) * static_cast<std::size_t>(width) +
                      static_cast<std::size_t>(x)];
    }
};

struct SurfaceHit {
    int plot = 0;  ///< 0-based
    int sample = 0;
};

/// Rows lie in slabs that are parallel to one another, so that drawing them from the eye outwards,
/// and each from the eye outwards along frequency, shows of each pixel what is drawn first. A
/// column of the picture that is covered up to some height needs no more work below it.
class SurfaceRenderer {
  public:
    static constexpr int kMostThreads = 2;
    static constexpr int kLargestSide = 16384;

    /// Colours are exact on the tops of the rows; their fronts are `shade` times as bright.
    SurfaceRenderer(const Camera& camera, const ColourMap& map, double shade = 0.78)
        : camera_(camera), map_(map), shade_(shade) {}

    /// `oversampling` draws so many times as large in both directions and takes the mean; the
    /// camera is one for the size times that. No side is less than 1.
    SurfaceImage draw(const std::vector<RowSurface>& rows, int width, int height, int threads,
                      int oversampling = 1) const;
    /// What lies under a pixel.
    std::optional<SurfaceHit> hit(const std::vector<RowSurface>& rows, int x, int y,
                                  int height) const;

  private:
    const Camera& camera_;
    const ColourMap& map_;
    double shade_;
};

}  // namespace zel
