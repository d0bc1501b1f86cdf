#pragma once
// A trace as the analysis sees it: levels in dB over an even axis.

#include <cmath>
#include <string>
#include <vector>

namespace zel {

/// `x` rises by `step` and has as many entries as `level`. Pairs of the auto peak detector count
/// with the highest level of each point (trace/PointPairs.h). A trace of one sample has the step 0.
struct SpectrumTrace {
    std::vector<double> x;      ///< in `xUnit`
    std::vector<double> level;  ///< in `unit`, never infinite and always a number
    std::string xUnit;          ///< "Hz", "s" at zero span, "m" in distance to fault
    std::string unit;           ///< "dBm", "dBuV" ...
    double rbw = 0;             ///< resolution bandwidth, Hz; 0 when unknown
    std::string time;           ///< "2026-11-21T14:05:09"; empty when unknown

    double step() const {
        return x.size() < 2 ? 0 : (x.back() - x.front()) / static_cast<double>(x.size() - 1);
    }
};

/// Power of a level, relative to 0 dB.
inline double powerOfLevel(double level) { return std::pow(10, level / 10); }
/// Level of a power, in dB; the power is above 0.
inline double levelOfPower(double power) { return 10 * std::log10(power); }

}  // namespace zel
