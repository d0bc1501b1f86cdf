#include "analysis/ChannelPower.h"

#include <cstddef>
#include <optional>
#include <vector>

#include "analysis/SpectrumTrace.h"

namespace zel {
namespace {

/// Where the rising row `c` passes the target, linear between its entries.
double passes(const std::vector<double>& x, const std::vector<double>& c, double target) {
    if (target <= c.front()) return x.front();
    for (std::size_t i = 1; i < c.size(); ++i) {
        if (c[i] < target) continue;
        const double rise = c[i] - c[i - 1];
        const double part = rise > 0 ? (target - c[i - 1]) / rise : 0;
        return x[i - 1] + part * (x[i] - x[i - 1]);
    }
    return x.back();
}

}  // namespace

std::optional<double> channelPower(const SpectrumTrace& trace, double start, double stop) {
    double sum = 0;
    for (std::size_t i = 0; i < trace.level.size(); ++i)
        if (trace.x[i] >= start && trace.x[i] <= stop) sum += powerOfLevel(trace.level[i]);
    if (sum <= 0) return std::nullopt;
    const double perFilter = trace.rbw > 0 && trace.step() > 0 ? trace.step() / trace.rbw : 1;
    return levelOfPower(perFilter * sum);
}

std::optional<OccupiedBandwidth> occupiedBandwidth(const SpectrumTrace& trace, double percent) {
    if (trace.level.empty()) return std::nullopt;
    std::vector<double> c;
    c.reserve(trace.level.size());
    double sum = 0;
    for (const double level : trace.level) {
        const double power = powerOfLevel(level);
        c.push_back(sum + power / 2);
        sum += power;
    }
    if (sum <= 0) return std::nullopt;
    return OccupiedBandwidth{passes(trace.x, c, sum * (100 - percent) / 200),
                             passes(trace.x, c, sum * (100 + percent) / 200)};
}

}  // namespace zel
