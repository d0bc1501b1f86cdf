#include "ZELSim/Settings.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>

namespace zelsim {
namespace {

// Index is the code; 0 stands for auto. Code 10 lies out of order on the instrument.
constexpr std::array<double, 11> kRbwHz{0,    100,   300,   1e3, 3e3,  10e3,
                                        30e3, 100e3, 300e3, 1e6, 200e3};
constexpr std::size_t kLastCoupledRbw = 9;
constexpr std::array<double, 13> kVbwHz{0,    10,   30,    100,   300, 1e3, 3e3,
                                        10e3, 30e3, 100e3, 300e3, 1e6, 3e6};
constexpr std::array<int, 4> kBauds{19200, 38400, 57600, 115200};

constexpr double kShortestSweep = 0.02;  // s, with a span
constexpr double kSpanToRbw = 100.0;
constexpr double kSweepFactor = 2.5;

double roundUpToThreeDigits(double value) {
    const double scale = std::pow(10.0, std::floor(std::log10(value)) - 2);
    return std::ceil(value / scale - 1e-9) * scale;
}

}  // namespace

double Settings::rbwHz() const {
    const auto code = static_cast<std::size_t>(rbw);
    if (code != 0 && code < kRbwHz.size()) {
        return kRbwHz[code];
    }
    if (measurement() == Mode::TdmaPower && tdmaStandard == 1) {
        return kRbwHz[10];
    }
    if (span == 0) {
        return kRbwHz[kLastCoupledRbw];
    }
    double coupled = kRbwHz[1];
    for (std::size_t i = 1; i <= kLastCoupledRbw; ++i) {
        if (kRbwHz[i] <= span / kSpanToRbw * 1.0001) {
            coupled = kRbwHz[i];
        }
    }
    return coupled;
}

double Settings::vbwHz() const {
    const auto code = static_cast<std::size_t>(vbw);
    if (code != 0 && code < kVbwHz.size()) {
        return kVbwHz[code];
    }
    const double wanted = rbwHz();
    const auto* at = std::lower_bound(kVbwHz.begin() + 1, kVbwHz.end(), wanted);
    return at == kVbwHz.end() ? kVbwHz.back() : *at;
}

double Settings::sweepSeconds() const {
    if (sweepTime > 0) {
        return span == 0 ? sweepTime : std::max(sweepTime, kShortestSweep);
    }
    if (measurement() == Mode::TdmaPower) {
        return std::max(tdmaTime, 1e-3);
    }
    const double resolution = rbwHz();
    const double needed = kSweepFactor * span / (resolution * std::min(resolution, vbwHz()));
    return needed <= kShortestSweep ? kShortestSweep : roundUpToThreeDigits(needed);
}

double Settings::xFirst() const {
    return isDistance() || isZeroSpan() ? 0.0 : centre + frequencyOffset - span / 2;
}

double Settings::xStep() const {
    const double width = isDistance() ? cableLength : (isZeroSpan() ? sweepSeconds() : span);
    return width / static_cast<double>(kPoints - 1);
}

double Settings::displayHeight() const {
    constexpr std::array<double, 4> perDivision{10, 5, 2, 1};
    const auto code = static_cast<std::size_t>(range);
    return 10.0 * (code < perDivision.size() ? perDivision[code] : 10.0);
}

int baudOfCode(int code) {
    const auto index = static_cast<std::size_t>(code);
    return code >= 0 && index < kBauds.size() ? kBauds[index] : 0;
}

}  // namespace zelsim
