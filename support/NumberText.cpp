#include "support/NumberText.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <system_error>

#include "support/Text.h"

namespace zel {
namespace {

constexpr int kSignificant = 15;
constexpr int kMostDecimals = 15;
constexpr double kFixedLimit = 1e15;
constexpr int kMostRounding = 15;  // finer steps than a double has
constexpr int kMostPatternDecimals = 20;

/// 10 to the power of `exponent`, as the library gives it.
double powerOfTen(int exponent) {
    // These are exact and asked for with each sample.
    constexpr std::array<double, 16> kPowers{1e0, 1e1, 1e2,  1e3,  1e4,  1e5,  1e6,  1e7,
                                             1e8, 1e9, 1e10, 1e11, 1e12, 1e13, 1e14, 1e15};
    if (exponent >= 0 && exponent < static_cast<int>(kPowers.size()))
        return kPowers[static_cast<std::size_t>(exponent)];
    return std::pow(10.0, exponent);
}

std::string_view withoutBlanks(std::string_view text) {
    while (!text.empty() && (text.front() == ' ' || text.front() == '\t' || text.front() == '\n'))
        text.remove_prefix(1);
    return text;
}

/// Length of the number at the head of a text that begins with sign, digit or point; 0 for none.
std::size_t numberLength(std::string_view text) {
    std::size_t i = 0;
    if (i < text.size() && (text[i] == '+' || text[i] == '-')) ++i;
    std::size_t digits = 0;
    while (i < text.size() && isDigit(text[i])) ++i, ++digits;
    if (i < text.size() && text[i] == '.') {
        ++i;
        while (i < text.size() && isDigit(text[i])) ++i, ++digits;
    }
    if (digits == 0) return 0;
    std::size_t end = i;
    if (i < text.size() && (text[i] == 'e' || text[i] == 'E')) {
        ++i;
        if (i < text.size() && (text[i] == '+' || text[i] == '-')) ++i;
        if (i < text.size() && isDigit(text[i])) {
            while (i < text.size() && isDigit(text[i])) ++i;
            end = i;
        }
    }
    return end;
}

/// That many decimals, correctly rounded.
std::string printed(double value, std::chars_format format, int decimals) {
    std::array<char, 512> buffer{};
    const auto end =
        std::to_chars(buffer.data(), buffer.data() + buffer.size(), value, format, decimals);
    return {buffer.data(), end.ptr};
}

void dropTrailingZeros(std::string& text) {
    if (text.find('.') == std::string::npos) return;
    while (text.back() == '0') text.pop_back();
    if (text.back() == '.') text.pop_back();
}

void groupThousands(std::string& digits) {
    for (auto i = static_cast<std::ptrdiff_t>(digits.size()) - 3; i > 0; i -= 3)
        digits.insert(static_cast<std::size_t>(i), 1, ',');
}

}  // namespace

bool startsWithNumber(std::string_view text) { return numberLength(withoutBlanks(text)) > 0; }

double leadingNumber(std::string_view text) {
    text = withoutBlanks(text);
    std::size_t length = numberLength(text);
    if (length == 0) return 0;
    if (text.front() == '+') {
        text.remove_prefix(1);
        --length;
    }
    double value = 0;
    const auto result = std::from_chars(text.data(), text.data() + length, value);
    return result.ec == std::errc() && std::isfinite(value) ? value : 0;
}

std::optional<double> parseNumber(std::string_view text) {
    const std::string plain = trimmed(text);
    const bool plus = startsWith(plain, "+") && !startsWith(plain, "+-");
    const char* const end = plain.data() + plain.size();
    double value = 0;
    const auto result = std::from_chars(plain.data() + (plus ? 1 : 0), end, value);
    if (result.ec != std::errc() || result.ptr != end || !std::isfinite(value)) return std::nullopt;
    return value;
}

std::string generalNumber(double value) {
    if (!std::isfinite(value) || value == 0) return "0";
    // A whole number of so few digits is shown as it is.
    if (std::fabs(value) < kFixedLimit && value == std::trunc(value))
        return std::to_string(static_cast<long long>(value));
    // The 15 significant digits and the exponent decide the form.
    const std::string digits = printed(value, std::chars_format::scientific, kSignificant - 1);
    const auto mark = digits.find('e');
    // The exponent comes with its sign and with at least two digits, as it is shown.
    const std::string tail = digits.substr(mark + 1);
    const int exponent = static_cast<int>(leadingNumber(tail));
    std::string mantissa = digits.substr(0, mark);
    dropTrailingZeros(mantissa);
    const auto point = mantissa.find('.');
    const int mantissaDecimals =
        point == std::string::npos ? 0 : static_cast<int>(mantissa.size() - point) - 1;
    const int decimals = mantissaDecimals - exponent;
    const bool fixed =
        std::fabs(value) < kFixedLimit && exponent < kSignificant && decimals <= kMostDecimals;
    if (!fixed) return mantissa + "E" + tail;
    return printed(value, std::chars_format::fixed, std::max(decimals, 0));
}

std::string numberText(double value) {
    const std::string text = generalNumber(value);
    return text.front() == '-' ? text : " " + text;
}

std::string formatPattern(double value, std::string_view pattern) {
    if (!std::isfinite(value)) value = 0;
    const auto point = pattern.find('.');
    const std::string_view whole = pattern.substr(0, point);
    const std::string_view fraction =
        point == std::string_view::npos ? std::string_view() : pattern.substr(point + 1);
    int wholeZeros = 0;
    bool groups = false;
    for (const char c : whole) {
        if (c == '0') ++wholeZeros;
        if (c == ',') groups = true;
    }
    const int decimals = std::min(static_cast<int>(fraction.size()), kMostPatternDecimals);
    int fractionZeros = 0;
    for (int i = 0; i < decimals; ++i)
        if (fraction[static_cast<std::size_t>(i)] == '0') fractionZeros = i + 1;
    // Ties go away from zero here; the shortest digits of the value decide what a tie is.
    const double magnitude = std::fabs(value);
    const double scale = powerOfTen(decimals);
    const double scaled = magnitude * scale;
    const double rounded =
        scaled < 1e15 ? std::floor(scaled + 0.5 + scaled * 1e-15) / scale : magnitude;
    std::string text = printed(rounded, std::chars_format::fixed, decimals);
    std::string digits = text.substr(0, text.find('.'));
    std::string tail = decimals > 0 ? text.substr(text.find('.') + 1) : "";
    while (static_cast<int>(tail.size()) > fractionZeros && tail.back() == '0') tail.pop_back();
    if (digits == "0" && wholeZeros == 0) digits.clear();
    while (static_cast<int>(digits.size()) < wholeZeros) digits.insert(0, 1, '0');
    if (groups) groupThousands(digits);
    std::string result = digits;
    if (point != std::string_view::npos) result += "." + tail;
    return value < 0 && rounded != 0 ? "-" + result : result;
}

double roundHalfEven(double value, int digits) {
    if (!std::isfinite(value) || digits > kMostRounding) return value;
    const double scale = powerOfTen(digits);
    const double scaled = value * scale;
    if (std::fabs(scaled) > 9e15) return value;  // whole already
    return std::nearbyint(scaled) / scale;
}

std::string shortestNumber(double value) {
    if (!std::isfinite(value) || value == 0) return "0";
    std::array<char, 64> buffer{};
    const auto result = std::to_chars(buffer.data(), buffer.data() + buffer.size(), value);
    return {buffer.data(), result.ptr};
}

std::optional<int> wholeNumber(std::string_view text, int lowest, int highest) {
    int number = 0;
    const char* const end = text.data() + text.size();
    const auto result = std::from_chars(text.data(), end, number);
    const bool whole = result.ec == std::errc() && result.ptr == end;
    if (!whole || number < lowest || number > highest) return std::nullopt;
    return number;
}

}  // namespace zel
