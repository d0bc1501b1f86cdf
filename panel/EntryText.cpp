#include "panel/EntryText.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "panel/SoftPositions.h"
#include "support/NumberText.h"
#include "support/Text.h"

namespace zel {
namespace {

/// A unit as it may be typed, and as the parser reads it after the number.
struct UnitRow {
    EntryUnit kind;
    std::string_view typed;
    std::string_view written;  ///< empty: the bare number in the base unit
    double factor;
    bool anyCase = false;
};
using U = EntryUnit;
constexpr UnitRow kUnits[] = {
    {U::Hertz, "hz", "", 1, true},
    {U::Hertz, "k", "kHz", 1e3, true},
    {U::Hertz, "khz", "kHz", 1e3, true},
    {U::Hertz, "M", "MHz", 1e6},
    {U::Hertz, "MHz", "MHz", 1e6},
    {U::Hertz, "MHZ", "MHz", 1e6},
    {U::Hertz, "Mhz", "MHz", 1e6},
    {U::Hertz, "mhz", "MHz", 1e6},  // all small letters: nobody means a thousandth of a hertz
    {U::Hertz, "g", "GHz", 1e9, true},
    {U::Hertz, "ghz", "GHz", 1e9, true},
    {U::Seconds, "s", "", 1, true},
    {U::Seconds, "sec", "", 1, true},
    {U::Seconds, "m", "ms", 1e-3},
    {U::Seconds, "ms", "ms", 1e-3},
    {U::Seconds, "u", "us", 1e-6, true},
    {U::Seconds, "us", "us", 1e-6, true},
    {U::Seconds, "µ", "us", 1e-6},
    {U::Seconds, "µs", "us", 1e-6},
    {U::Seconds, "μs", "us", 1e-6},  // the Greek letter
    {U::Seconds, "n", "ns", 1e-9},
    {U::Seconds, "ns", "ns", 1e-9},
    {U::WholeSeconds, "s", "", 1, true},
    {U::WholeSeconds, "sec", "", 1, true},
    {U::Level, "dbm", "", 1, true},
    {U::Decibels, "db", "", 1, true},
    {U::Percent, "%", "", 1},
    {U::Metres, "m", "", 1, true},
    {U::Metres, "cm", "", 0.01, true},
    {U::Metres, "mm", "", 0.001},
    {U::Metres, "km", "", 1000, true},
};

struct KindName {
    EntryUnit kind;
    const char* name;
    const char* example;
};
constexpr KindName kNames[] = {
    {U::Hertz, "a frequency", "2.4 GHz"},  {U::Seconds, "a time", "20 ms"},
    {U::WholeSeconds, "a time", "5 s"},    {U::Level, "a level", "-30 dBm"},
    {U::Decibels, "a difference", "3 dB"}, {U::Metres, "a length", "12.5 m"},
    {U::Percent, "a height", "50 %"},      {U::Enter, "a number", "12.5"},
};

const KindName& nameOf(EntryUnit kind) {
    for (const KindName& row : kNames)
        if (row.kind == kind) return row;
    return kNames[std::size(kNames) - 1];
}

EntryReading refused(std::string problem) { return {false, {}, std::move(problem), 0}; }

bool isDigit(char c) { return c >= '0' && c <= '9'; }

std::string small(std::string_view text) {
    std::string result(text);
    for (char& c : result)
        if (c >= 'A' && c <= 'Z') c = static_cast<char>(c - 'A' + 'a');
    return result;
}

/// The signs of other keyboards and fonts.
std::string plainSigns(std::string text) {
    constexpr std::array<std::pair<std::string_view, std::string_view>, 4> kSigns = {
        {{"\u2212", "-"}, {"\u2013", "-"}, {"\u00a0", " "}, {"\u202f", " "}}};
    for (const auto& [from, to] : kSigns)
        for (auto at = text.find(from); at != std::string::npos; at = text.find(from))
            text.replace(at, from.size(), to);
    return text;
}

/// Length of the number that the text starts with; blanks stand only between digits.
std::size_t numberLength(std::string_view text) {
    std::size_t at = !text.empty() && (text[0] == '-' || text[0] == '+') ? 1 : 0;
    while (at < text.size() && text[at] == ' ') ++at;
    std::size_t end = at;
    while (at < text.size() && (isDigit(text[at]) || text[at] == '.' || text[at] == ',' ||
                                (text[at] == ' ' && at + 1 < text.size() && isDigit(text[at + 1]))))
        end = ++at;
    // An exponent needs its digits: the letter alone is none.
    if (end < text.size() && (text[end] == 'e' || text[end] == 'E')) {
        std::size_t digits = end + 1;
        if (digits < text.size() && (text[digits] == '-' || text[digits] == '+')) ++digits;
        const std::size_t first = digits;
        while (digits < text.size() && isDigit(text[digits])) ++digits;
        if (digits > first) end = digits;
    }
    return end;
}

/// Whether commas stand where thousands end, before a point: "1,234,567.8".
bool groupsThousands(std::string_view number) {
    const std::size_t point = std::min(number.find('.'), number.size());
    std::size_t last = number.find(',');
    if (last == 0 || last > 3) return false;
    for (std::size_t at = last; at < point; at = last) {
        last = std::min(number.find(',', at + 1), point);
        if (last - at != 4) return false;
    }
    return number.find(',', point) == std::string_view::npos;
}

/// The number with a point as its decimal mark and nothing else; a problem where that is unclear.
std::string withPoint(std::string number, std::string& problem) {
    std::erase(number, ' ');
    if (!number.empty() && number.front() == '+') number.erase(0, 1);
    const auto commas = std::count(number.begin(), number.end(), ',');
    if (commas == 0) return number;
    const std::size_t sign = number.front() == '-' ? 1 : 0;
    const std::string_view digits = std::string_view(number).substr(sign);
    const bool point = digits.find('.') != std::string_view::npos;
    if (point || commas > 1) {
        if (!groupsThousands(digits)) {
            problem = "Of comma and point only one can be the decimal mark";
            return number;
        }
        std::erase(number, ',');
        return number;
    }
    const std::size_t comma = digits.find(',');
    std::string decimal = number;
    decimal[comma + sign] = '.';
    // "0,500" is no thousand; "1,500" may be one.
    if (digits.size() - comma == 4 && comma > 0 && comma <= 3 && digits[0] != '0') {
        std::string whole = number;
        std::erase(whole, ',');
        problem = number + " can be " + decimal + " or " + whole + ": write it without the comma";
    }
    return decimal;
}

/// A bare number of hertz with the prefix that the panel writes it with, where that reads back as
/// the same number.
std::string withPrefix(const std::string& number, double hertz) {
    for (const auto& [factor, prefix] : {std::pair{1e9, " GHz"}, {1e6, " MHz"}, {1e3, " kHz"}}) {
        if (std::fabs(hertz) < factor) continue;
        const std::string scaled = generalNumber(hertz / factor);
        return parseNumber(scaled).value_or(0) * factor == hertz ? scaled + prefix : number;
    }
    return number;
}

std::string unitProblem(std::string_view unit, EntryUnit kind) {
    const KindName& name = nameOf(kind);
    return "\"" + std::string(unit) + "\" is no unit of " + name.name + ", such as " + name.example;
}

}  // namespace

EntryReading readEntry(std::string_view typed, EntryUnit unit) {
    const std::string text = plainSigns(trimmed(typed));
    const std::size_t length = numberLength(text);
    std::string problem;
    const std::string number = withPoint(text.substr(0, length), problem);
    if (!problem.empty()) return refused(problem);
    const std::optional<double> value = parseNumber(number);
    const std::string rest = trimmed(text.substr(length));
    const KindName& name = nameOf(unit);
    if (!value)
        return refused("\"" + text + "\" is not " + name.name + ", such as " + name.example);
    if (rest.empty()) return {true, number, {}, *value};
    for (const UnitRow& row : kUnits) {
        if (row.kind != unit || (row.anyCase ? small(rest) != row.typed : rest != row.typed))
            continue;
        const double base = *value * row.factor;
        if (!row.written.empty()) return {true, number + " " + std::string(row.written), {}, base};
        if (unit == EntryUnit::Hertz) return {true, withPrefix(number, base), {}, base};
        return {true, row.factor == 1 ? number : generalNumber(base), {}, base};
    }
    if (unit == EntryUnit::Hertz && rest.front() == 'm')
        return refused("A small m is a thousandth: write " + number + " MHz");
    return refused(unitProblem(rest, unit));
}

}  // namespace zel
