#include "waterfall/SpectrogramImage.h"

#include <algorithm>
#include <cmath>
#include <cstddef>

#include "waterfall/ColourMap.h"
#include "waterfall/SweepHistory.h"

namespace zel {
namespace {

constexpr int kWidest = 16384;

}  // namespace

void SpectrogramImage::draw(const HistoryRow& row, const SpectrogramFrame& frame, Pixel* line) {
    std::fill(line, line + frame.width, 0);
    const double perPixel = (frame.lastX - frame.firstX) / frame.width;
    const auto count = static_cast<double>(row.size());
    if (!std::isfinite(perPixel) || perPixel <= 0 || !std::isfinite(row.increment) ||
        row.increment <= 0 || count == 0)
        return;
    const LevelScale scale(frame.low, frame.high);
    const ColourMap& map = ColourMap::ofStyle(frame.colourMap);
    // A sample reaches half of the way to its neighbours.
    const double start = (frame.firstX - row.firstX) / row.increment + 0.5;
    const double step = perPixel / row.increment;
    for (int x = 0; x < frame.width; ++x) {
        const double from = start + step * x;
        const double to = from + step;
        if (to <= 0 || from >= count) continue;
        auto first = static_cast<std::size_t>(std::max(from, 0.0));
        auto end = std::max(static_cast<std::size_t>(std::clamp(to, 0.0, count)), first + 1);
        if (row.pairs) {
            // Of a pair the higher one shows: the lower one would comb the picture.
            first -= first % 2;
            end = std::min(end + end % 2, row.size());
        }
        double level = row.level(first);
        for (std::size_t i = first + 1; i < end; ++i) level = std::max(level, row.level(i));
        line[x] = map.colour(scale.index(level));
    }
}

Pixel* SpectrogramImage::place(unsigned long number) {
    return &pixels_[static_cast<std::size_t>(number % SweepHistory::kRows) *
                    static_cast<std::size_t>(frame_.width)];
}

void SpectrogramImage::update(const SpectrogramFrame& frame) {
    SpectrogramFrame wanted = frame;
    wanted.width = std::clamp(frame.width, 1, kWidest);
    const unsigned long added = history_.added();
    const int count = history_.count();
    if (!(wanted == frame_) || pixels_.empty()) {
        frame_ = wanted;
        pixels_.assign(
            static_cast<std::size_t>(SweepHistory::kRows) * static_cast<std::size_t>(frame_.width),
            0);
        drawn_ = added - static_cast<unsigned long>(count);
    }
    const unsigned long oldest = added - static_cast<unsigned long>(count);
    for (unsigned long number = std::max(drawn_, oldest); number < added; ++number)
        draw(history_.row(static_cast<int>(added - 1 - number)), frame_, place(number));
    drawn_ = added;
    rows_ = count;
}

const Pixel* SpectrogramImage::line(int back) const {
    return &pixels_[static_cast<std::size_t>((drawn_ - 1 - static_cast<unsigned long>(back)) %
                                             SweepHistory::kRows) *
                    static_cast<std::size_t>(frame_.width)];
}

}  // namespace zel
