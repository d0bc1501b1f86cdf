#include "model/Numeric.h"

#include <cmath>
#include <cstddef>
#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

#include "support/NumberText.h"
#include "support/StringOp.h"
#include "support/Text.h"

namespace zel {
namespace {

struct ScaleRow {
    double lower;
    double upper;
    double divisor;
    double factor;
    const char* prefix;
};
// A magnitude in pico takes "n": that is how the panel shows it.
constexpr ScaleRow kScales[] = {
    {1, 1000, 1, 1, " "},       {1000, 1e6, 1e3, 1, " k"},    {1e6, 1e9, 1e6, 1, " M"},
    {1e9, 1e12, 1e9, 1, " G"},  {0.001, 1, 1, 1e3, " m"},     {1e-6, 0.001, 1, 1e6, " µ"},
    {1e-9, 1e-6, 1, 1e9, " n"}, {1e-12, 1e-9, 1, 1e12, " n"},
};

struct PrefixRow {
    std::string_view letters;  // one or more that stand for the prefix
    double factor;
    const char* prefix;
};
constexpr PrefixRow kPrefixes[] = {
    {"kK", 1000, "k"}, {"M", 1e6, "M"},   {"gG", 1e9, "G"},  {"m", 0.001, "m"},
    {"uU", 1e-6, "µ"}, {"nN", 1e-9, "n"}, {"p", 1e-12, "p"},
};
constexpr std::string_view kMicroSigns[] = {"\xC2\xB5", "\xCE\xBC"};  // the sign, and Greek mu

/// Where the number material of the text ends.
std::size_t materialEnd(std::string_view text) {
    const auto end = text.find_first_not_of("0123456789,. -+Ee");
    return end == std::string_view::npos ? text.size() : end;
}

bool isMicroSign(std::string_view text) {
    for (const std::string_view sign : kMicroSigns)
        if (startsWith(text, sign)) return true;
    return false;
}

double prefixFactor(std::string_view text, std::string& prefix) {
    prefix.clear();
    if (text.empty()) return 1;
    if (isMicroSign(text)) {
        prefix = "µ";
        return 1e-6;
    }
    for (const PrefixRow& row : kPrefixes) {
        if (row.letters.find(text.front()) == std::string_view::npos) continue;
        prefix = row.prefix;
        return row.factor;
    }
    return 1;
}

double lengthFactor(std::string_view text, std::string& unit) {
    unit.clear();
    if (startsWith(text, "mm") || startsWith(text, "cm")) {
        unit = std::string(text.substr(0, 2));
        return unit == "mm" ? 0.001 : 0.01;
    }
    if (startsWith(text, "M") || startsWith(text, "m")) unit = std::string(text.substr(0, 1));
    if (!unit.empty()) return 1;
    if (isMicroSign(text) || startsWith(text, "u") || startsWith(text, "U")) {
        unit = "µ";
        return 1e-6;
    }
    return 1;
}

double scaledNumber(const std::string& text, std::size_t stop, double factor) {
    // Without a prefix the whole text has to be a number.
    const std::string number = factor == 1 ? text : text.substr(0, stop);
    double value{};
    if (!IsNumericText(number) || !parsePlainNumber(number, value)) return 0;
    return value * factor;
}

std::string formatted(double value, const std::string& format) {
    return format.empty() ? generalNumber(value) : formatPattern(value, format);
}

double decimalExponent(double value, double divisor) { return std::pow(10.0, value / divisor); }

}  // namespace

std::string FormatValue(double value, const std::string& unit, const std::string& format,
                        bool scale, bool round, int digits) {
    std::string text = formatted(value, format) + " " + unit;
    if (scale) {
        const double magnitude = std::fabs(value);
        if (value == 0) text = "0 " + unit;
        for (const ScaleRow& row : kScales) {
            if (!(magnitude >= row.lower && magnitude < row.upper)) continue;
            text = formatted(value / row.divisor * row.factor, format) + row.prefix + unit;
            break;
        }
    }
    text = trimmed(text);
    return round ? RoundValueText(text, digits) : text;
}

std::string FormatValue(const std::string& value, const std::string& unit,
                        const std::string& format, bool scale, bool round, int digits) {
    return FormatValue(GetNumeric(value), unit, format, scale, round, digits);
}

std::string RoundValueText(const std::string& text, int digits) {
    const std::vector<std::string> pieces = split(text, ' ');
    const double number = roundHalfEven(ParseNumberInvariant(pieces.front()), digits);
    return generalNumber(number) + " " + (pieces.size() > 1 ? pieces[1] : "");
}

double ParseValue(const std::string& text, std::string& prefix) {
    const std::string plain = TrimControlChars(text);
    const std::size_t stop = materialEnd(plain);
    const double factor = prefixFactor(std::string_view(plain).substr(stop), prefix);
    return scaledNumber(plain, stop, factor);
}

double ParseLength(const std::string& text, std::string& unit) {
    const std::string plain = TrimControlChars(text);
    const std::size_t stop = materialEnd(plain);
    const double factor = lengthFactor(std::string_view(plain).substr(stop), unit);
    const std::string number = factor == 1 ? plain : plain.substr(0, stop);
    double value{};
    if (!IsNumericText(number)) return 0;
    if (!parsePlainNumber(number, value)) throw std::invalid_argument(plain);
    return value * factor;
}

double GetNumeric(const std::string& text) { return leadingNumber(replaceAll(text, ",", ".")); }

double ParseNumberInvariant(const std::string& text) {
    const auto comma = text.find(',');
    const auto point = text.find('.');
    std::string plain = text;
    if (comma != std::string::npos && point != std::string::npos)
        plain = replaceAll(plain, comma < point ? "," : ".", "");
    return leadingNumber(replaceAll(plain, ",", "."));
}

std::string WireNumber(double value) {
    std::string text = generalNumber(value);
    const std::size_t digits = text.front() == '-' ? 1 : 0;
    if (text.compare(digits, 2, "0.") == 0) text.erase(digits, 1);
    return text;
}

double Log10Safe(double x) { return x == 0 ? -400 : std::log(x) / std::log(10.0); }

double VoltsToDbm(double volts) { return 20 * Log10Safe(volts) - 10 * Log10Safe(50) + 30; }

double WattsToDbm(double watts) { return 10 * Log10Safe(watts) + 30; }

double DbmToPercent(double level, double reference) {
    return 100 * decimalExponent(level - 30, 20) / decimalExponent(reference - 30, 20);
}

double LinearToPercent(double value, double reference) { return value * 100 / reference; }

double DbToLinear(double decibels) { return decimalExponent(decibels, 10); }

}  // namespace zel
