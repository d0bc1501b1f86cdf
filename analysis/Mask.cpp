#include "analysis/Mask.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <cstddef>
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>
#include <system_error>
#include <vector>

#include "analysis/SpectrumTrace.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr std::size_t kColumns = 3;
constexpr std::array<const char*, kColumns> kColumnNames = {"x", "upper", "lower"};

[[noreturn]] void complain(std::size_t line, const std::string& what) {
    throw std::runtime_error("line " + std::to_string(line) + ": " + what);
}

double number(std::string_view field, std::size_t line, const char* column) {
    const std::string text = trimmed(field);
    const std::string_view digits =
        startsWith(text, "+") ? std::string_view(text).substr(1) : std::string_view(text);
    double value = 0;
    const auto [end, error] = std::from_chars(digits.data(), digits.data() + digits.size(), value);
    if (error != std::errc() || end != digits.data() + digits.size() || !std::isfinite(value))
        complain(line, "\"" + text + "\" in the column " + column + " is no number");
    return value;
}

void add(LimitLine& limit, double x, std::string_view field, std::size_t line, const char* column) {
    if (trimmed(field).empty()) return;
    limit.x.push_back(x);
    limit.level.push_back(number(field, line, column));
}

/// The limit at x, or nothing outside of it. `stricter` picks one of two levels.
template <class Stricter>
std::optional<double> limitAt(const LimitLine& limit, double x, Stricter stricter) {
    const auto first = std::lower_bound(limit.x.begin(), limit.x.end(), x);
    if (first == limit.x.end()) return std::nullopt;
    auto i = static_cast<std::size_t>(first - limit.x.begin());
    if (limit.x[i] == x) {
        double level = limit.level[i];
        for (++i; i < limit.x.size() && limit.x[i] == x; ++i)
            level = stricter(level, limit.level[i]);
        return level;
    }
    if (i == 0) return std::nullopt;
    const double part = (x - limit.x[i - 1]) / (limit.x[i] - limit.x[i - 1]);
    return limit.level[i - 1] + part * (limit.level[i] - limit.level[i - 1]);
}

double lowerOf(double one, double other) { return std::min(one, other); }
double higherOf(double one, double other) { return std::max(one, other); }

}  // namespace

Mask readMask(const std::string& text) {
    Mask mask;
    const std::string bytes = replaceAll(replaceAll(text, kCrLf, "\n"), "\r", "\n");
    const std::vector<std::string> lines = split(bytes, '\n');
    bool header = false;
    std::size_t columns = 0;
    double lastX = 0;
    bool first = true;
    for (std::size_t i = 0; i < lines.size(); ++i) {
        std::string_view content = lines[i];
        constexpr std::string_view kByteOrderMark = "\xEF\xBB\xBF";
        if (i == 0 && startsWith(content, kByteOrderMark))
            content.remove_prefix(kByteOrderMark.size());
        if (trimmed(content).empty()) continue;
        const std::vector<std::string> fields = split(content, ';');
        if (!header) {
            for (std::size_t column = 0; column < kColumns; ++column)
                if (column >= fields.size() ||
                    lowerCase(trimmed(fields[column])) != kColumnNames[column])
                    complain(i + 1, "the header x;upper;lower is missing");
            header = true;
            columns = fields.size();
            continue;
        }
        // Two rows in one line are no row.
        for (std::size_t column = columns; column < fields.size(); ++column)
            if (!trimmed(fields[column]).empty())
                complain(i + 1, "the row has more fields than the header");
        const double x = number(fields[0], i + 1, kColumnNames[0]);
        if (!first && x < lastX) complain(i + 1, "x is below that of the row before");
        first = false;
        lastX = x;
        if (fields.size() > 1) add(mask.upper, x, fields[1], i + 1, kColumnNames[1]);
        if (fields.size() > 2) add(mask.lower, x, fields[2], i + 1, kColumnNames[2]);
    }
    if (!header) complain(1, "the header x;upper;lower is missing");
    return mask;
}

MaskVerdict checkMask(const SpectrumTrace& trace, const Mask& mask) {
    MaskVerdict verdict;
    const auto take = [&verdict](double margin, double x) {
        if (verdict.margin && *verdict.margin <= margin) return;
        verdict.margin = margin;
        verdict.x = x;
    };
    for (std::size_t i = 0; i < trace.level.size(); ++i) {
        const double x = trace.x[i];
        if (const auto upper = limitAt(mask.upper, x, lowerOf)) take(*upper - trace.level[i], x);
        if (const auto lower = limitAt(mask.lower, x, higherOf)) take(trace.level[i] - *lower, x);
    }
    verdict.pass = !verdict.margin || *verdict.margin >= 0;
    return verdict;
}

}  // namespace zel
