#pragma once
// Traces made by formula, for the tests of the analysis.

#include <cmath>
#include <cstddef>
#include <functional>

#include "analysis/SpectrumTrace.h"

namespace zel {

/// `count` samples from `start` on, `step` Hz apart, with the level that `level` gives for x.
inline SpectrumTrace madeTrace(std::size_t count, double start, double step,
                               const std::function<double(double x)>& level) {
    SpectrumTrace trace;
    for (std::size_t i = 0; i < count; ++i) {
        trace.x.push_back(start + static_cast<double>(i) * step);
        trace.level.push_back(level(trace.x.back()));
    }
    trace.xUnit = "Hz";
    trace.unit = "dBm";
    return trace;
}

/// A filter of Gaussian shape: `peak` at `center`, 3 dB down half a `rbw` away.
inline double gaussian(double x, double center, double rbw, double peak) {
    const double offset = (x - center) / (rbw / 2);
    return peak - 10 * std::log10(2.0) * offset * offset;
}

/// Levels at x = 0, 1, 2 ...
inline SpectrumTrace levels(std::vector<double> values) {
    SpectrumTrace trace = madeTrace(values.size(), 0, 1, [](double) { return 0; });
    trace.level = std::move(values);
    return trace;
}

}  // namespace zel
