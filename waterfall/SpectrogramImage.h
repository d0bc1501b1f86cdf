#pragma once
// The spectrogram as an image: a line of pixels a sweep, in a ring, so that a sweep costs one line.

#include <vector>

#include "waterfall/ColourMap.h"
#include "waterfall/SweepHistory.h"

namespace zel {

/// What the lines of the image show.
struct SpectrogramFrame {
    int width = 0;  ///< pixels
    double firstX = 0;
    double lastX = 0;
    double low = 0;  ///< level of the darkest and the lightest colour
    double high = 0;
    int colourMap = 4;  ///< style

    bool operator==(const SpectrogramFrame&) const = default;
};

class SpectrogramImage {
  public:
    explicit SpectrogramImage(const SweepHistory& history) : history_(history) {}

    /// Takes in what came since the last call; a new frame draws all rows again, at once.
    void update(const SpectrogramFrame& frame);
    /// The line of a row, 0 is the newest; 0 where the row has no sample.
    const Pixel* line(int back) const;
    int rows() const { return rows_; }
    const SpectrogramFrame& frame() const { return frame_; }

    /// One line. Where several samples share a pixel the highest shows.
    static void draw(const HistoryRow& row, const SpectrogramFrame& frame, Pixel* line);

  private:
    Pixel* place(unsigned long number);

    const SweepHistory& history_;
    SpectrogramFrame frame_;
    std::vector<Pixel> pixels_;
    unsigned long drawn_ = 0;  ///< rows of the history that are in the image
    int rows_ = 0;
};

}  // namespace zel
