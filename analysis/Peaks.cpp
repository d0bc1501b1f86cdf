#include "analysis/Peaks.h"

#include <algorithm>
#include <cstddef>
#include <optional>
#include <vector>

#include "analysis/SpectrumTrace.h"

namespace zel {
namespace {

/// The trace falls by the excursion, or ends, before it rises above the peak. `direction` is 1 or
/// -1; the walk begins beside the sample `from`.
bool falls(const std::vector<double>& level, std::size_t from, int direction, double excursion) {
    const double top = level[from];
    const auto count = static_cast<std::ptrdiff_t>(level.size());
    for (auto i = static_cast<std::ptrdiff_t>(from) + direction; i >= 0 && i < count;
         i += direction) {
        const double value = level[static_cast<std::size_t>(i)];
        if (value > top) return false;
        if (value <= top - excursion) return true;
    }
    return true;
}

Peak refined(const SpectrumTrace& trace, std::size_t index) {
    Peak peak{trace.x[index], trace.level[index], index};
    if (index == 0 || index + 1 == trace.level.size()) return peak;
    const double a = trace.level[index - 1];
    const double b = trace.level[index];
    const double c = trace.level[index + 1];
    const double curve = a - 2 * b + c;
    if (curve == 0) return peak;
    const double d = (a - c) / (2 * curve);
    peak.x += d * trace.step();
    peak.level = b - (a - c) * d / 4;
    return peak;
}

/// The edge on one side, or nothing when the border comes first.
std::optional<double> edge(const SpectrumTrace& trace, const Peak& peak, double target,
                           int direction) {
    const auto count = static_cast<std::ptrdiff_t>(trace.level.size());
    for (auto i = static_cast<std::ptrdiff_t>(peak.index) + direction; i >= 0 && i < count;
         i += direction) {
        const auto outer = static_cast<std::size_t>(i);
        const auto inner = static_cast<std::size_t>(i - direction);
        const double below = trace.level[outer];
        if (below > target) continue;
        const double above = trace.level[inner];
        if (above <= target) return std::nullopt;  // nothing encloses a level that close to the top
        const double part = (above - target) / (above - below);
        return trace.x[inner] + part * (trace.x[outer] - trace.x[inner]);
    }
    return std::nullopt;
}

}  // namespace

std::vector<Peak> findPeaks(const SpectrumTrace& trace, const PeakSearch& search) {
    const std::vector<double>& level = trace.level;
    std::vector<Peak> peaks;
    for (std::size_t first = 0; first < level.size();) {
        std::size_t last = first;
        while (last + 1 < level.size() && level[last + 1] == level[first]) ++last;
        const double top = level[first];
        const bool stands = (first == 0 || level[first - 1] < top) &&
                            (last + 1 == level.size() || level[last + 1] < top);
        if (stands && top >= search.threshold && falls(level, first, -1, search.excursion) &&
            falls(level, last, 1, search.excursion))
            peaks.push_back(refined(trace, (first + last) / 2));
        first = last + 1;
    }
    std::sort(peaks.begin(), peaks.end(), [](const Peak& one, const Peak& other) {
        return one.level != other.level ? one.level > other.level : one.x < other.x;
    });
    return peaks;
}

PeakWidth widthAtLevel(const SpectrumTrace& trace, const Peak& peak, double down) {
    const double target = peak.level - down;
    return {edge(trace, peak, target, -1), edge(trace, peak, target, 1)};
}

}  // namespace zel
