#include "analysis/Hold.h"

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <vector>

#include "analysis/SpectrumTrace.h"

namespace zel {
namespace {

/// The part of a trace that all traces share.
SpectrumTrace axesOf(const SpectrumTrace& trace) {
    SpectrumTrace axes = trace;
    axes.level.clear();
    axes.time.clear();
    return axes;
}

bool fits(const SpectrumTrace& axes, const SpectrumTrace& trace) {
    return trace.level.size() == trace.x.size() && sameAxes(axes, trace);
}

}  // namespace

bool sameAxes(const SpectrumTrace& one, const SpectrumTrace& other) {
    return one.xUnit == other.xUnit && one.unit == other.unit && one.x == other.x;
}

bool closeAxes(const SpectrumTrace& one, const SpectrumTrace& other) {
    if (one.xUnit != other.xUnit || one.unit != other.unit || one.x.size() != other.x.size())
        return false;
    if (one.x.empty()) return true;
    constexpr double kShare = 0.01;  // of a step
    const double close = kShare * std::max(std::fabs(one.step()), std::fabs(other.step()));
    return std::fabs(one.x.front() - other.x.front()) <= close &&
           std::fabs(one.x.back() - other.x.back()) <= close;
}

bool Hold::add(const SpectrumTrace& trace) {
    if (count_ == 0) {
        first_ = axesOf(trace);
        const bool isSum = kind_ == HoldKind::Average || kind_ == HoldKind::PowerAverage;
        sum_ = isSum ? std::vector<double>(trace.level.size(), 0) : trace.level;
        carry_.assign(isSum ? trace.level.size() : 0, 0);
    }
    if (!fits(first_, trace)) return false;
    ++count_;
    for (std::size_t i = 0; i < trace.level.size(); ++i) {
        const double level = trace.level[i];
        if (kind_ == HoldKind::Max) {
            sum_[i] = std::max(sum_[i], level);
        } else if (kind_ == HoldKind::Min) {
            sum_[i] = std::min(sum_[i], level);
        } else {
            const double value = kind_ == HoldKind::Average ? level : powerOfLevel(level);
            const double corrected = value - carry_[i];
            const double sum = sum_[i] + corrected;
            carry_[i] = (sum - sum_[i]) - corrected;
            sum_[i] = sum;
        }
    }
    return true;
}

void Hold::clear() { *this = Hold(kind_); }

SpectrumTrace Hold::result() const {
    SpectrumTrace held = first_;
    held.level = sum_;
    const auto count = static_cast<double>(count_);
    if (kind_ == HoldKind::Average)
        for (double& level : held.level) level /= count;
    if (kind_ == HoldKind::PowerAverage)
        for (double& level : held.level) level = levelOfPower(level / count);
    return held;
}

bool Occupancy::add(const SpectrumTrace& trace) {
    if (count_ == 0) {
        first_ = axesOf(trace);
        reached_.assign(trace.level.size(), 0);
    }
    if (!fits(first_, trace)) return false;
    ++count_;
    for (std::size_t i = 0; i < trace.level.size(); ++i)
        if (trace.level[i] >= level_) ++reached_[i];
    return true;
}

std::vector<double> Occupancy::share() const {
    std::vector<double> share;
    for (const std::uint64_t reached : reached_)
        share.push_back(static_cast<double>(reached) / static_cast<double>(count_));
    return share;
}

}  // namespace zel
