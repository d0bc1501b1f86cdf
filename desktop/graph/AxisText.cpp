#include "desktop/graph/AxisText.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <string>

namespace zel {
namespace {

constexpr int kMostDecimals = 9;

struct Prefix {
    double factor;
    const char* text;
};
constexpr Prefix kPrefixes[] = {{1e9, "G"}, {1e6, "M"},  {1e3, "k"},
                                {1, ""},    {1e-3, "m"}, {1e-6, "µ"}};

std::string fixed(double value, int decimals) {
    std::array<char, 64> buffer{};
    const auto end = std::to_chars(buffer.data(), buffer.data() + buffer.size(), value,
                                   std::chars_format::fixed, decimals);
    std::string text(buffer.data(), end.ptr);
    // A zero has no sign.
    if (text.find_first_not_of("-0.") == std::string::npos && text.front() == '-') text.erase(0, 1);
    return text;
}

const Prefix& prefixOf(double size) {
    for (const Prefix& prefix : kPrefixes)
        if (size >= prefix.factor) return prefix;
    return kPrefixes[std::size(kPrefixes) - 1];
}

}  // namespace

std::string axisText(double value, double resolution, const std::string& unit) {
    if (!std::isfinite(value) || std::fabs(value) > 1e15) return {};
    const double size = std::max(std::fabs(value), std::fabs(resolution));
    static constexpr Prefix kNone{1, ""};
    const bool scaled = unit == "Hz" || unit == "s" || unit == "m";
    // What is below the resolution is zero, without the prefix of the resolution.
    if (2 * std::fabs(value) < std::fabs(resolution)) return "0 " + unit;
    const Prefix& prefix = scaled && size > 0 ? prefixOf(size) : kNone;
    int decimals = 0;
    const double step = std::fabs(resolution) / prefix.factor;
    if (step > 0 && step < 1)
        decimals = std::min(kMostDecimals, static_cast<int>(std::ceil(-std::log10(step) - 1e-9)));
    return fixed(value / prefix.factor, decimals) + " " + prefix.text + unit;
}

std::string levelText(double level, const std::string& unit, int decimals) {
    if (!std::isfinite(level) || std::fabs(level) > 1e15) return {};
    return fixed(level, decimals) + (unit.empty() ? "" : " " + unit);
}

}  // namespace zel
