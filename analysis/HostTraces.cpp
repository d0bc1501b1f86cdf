#include "analysis/HostTraces.h"

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <optional>
#include <string>

#include "analysis/Hold.h"
#include "analysis/SpectrumTrace.h"

namespace zel {
namespace {

/// What differs between the axes of two traces: "frequency", "span", "unit"; empty for equal ones.
std::string difference(const SpectrumTrace& before, const SpectrumTrace& now) {
    if (before.unit != now.unit) return "unit";
    if (before.xUnit != now.xUnit || before.x.size() != now.x.size()) return "span";
    if (before.x == now.x) return {};
    const double width = before.x.back() - before.x.front();
    const double widthNow = now.x.back() - now.x.front();
    constexpr double kSame = 1e-9;
    const bool sameSpan = std::fabs(widthNow - width) <= kSame * std::fabs(now.x.back());
    return sameSpan ? "frequency" : now.xUnit == "s" ? "sweep time" : "span";
}

}  // namespace

void HostTraces::take(const SpectrumTrace& sweep) {
    if (current_)
        if (const std::string what = difference(*current_, sweep); !what.empty()) endBecause(what);
    current_ = sweep;
    for (std::size_t i = 0; i < kHolds; ++i)
        if (on_.at(i)) holds_.at(i).add(sweep);
}

void HostTraces::endBecause(const std::string& what) {
    const bool any = std::any_of(holds_.begin(), holds_.end(),
                                 [](const Hold& hold) { return hold.count() > 0; });
    for (Hold& hold : holds_) hold.clear();
    current_.reset();
    if (any) ended_ = "Held traces ended: " + what + " changed";
}

void HostTraces::switchOn(HoldKind kind, bool on) {
    if (isOn(kind) == on) return;
    on_.at(index(kind)) = on;
    clear(kind);
    if (on && current_) hold(kind).add(*current_);
}

SpectrumTrace HostTraces::held(HoldKind kind) const {
    const Hold& hold = holds_.at(index(kind));
    return hold.count() == 0 ? SpectrumTrace() : hold.result();
}

std::optional<SpectrumTrace> HostTraces::normalised(const SpectrumTrace& sweep,
                                                    std::size_t place) const {
    const auto& reference = memories_.at(place);
    if (!reference || !closeAxes(*reference, sweep)) return std::nullopt;
    SpectrumTrace less = sweep;
    less.unit = "dB";
    for (std::size_t i = 0; i < less.level.size(); ++i) less.level[i] -= reference->level[i];
    return less;
}

}  // namespace zel
