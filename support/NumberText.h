#pragma once
// Numbers as texts and back, always with a point as the decimal mark.

#include <limits>
#include <optional>
#include <string>
#include <string_view>

namespace zel {

/// The number that a text starts with: blanks are skipped, then sign, digits, point, exponent.
/// Junk gives 0, and so does a number past the range of a double.
double leadingNumber(std::string_view text);
/// The text starts with such a number.
bool startsWithNumber(std::string_view text);
/// The number that the whole text is, blanks around it allowed; nothing for any other text, for one
/// with a comma, and past the range of a double.
std::optional<double> parseNumber(std::string_view text);
/// Up to 15 significant digits: fixed below 1e15 while at most 15 decimals are needed, else with
/// an exponent ("1E+15", "1.5E-16"). What is no number gives "0".
std::string generalNumber(double value);
/// The same with one leading blank when not negative.
std::string numberText(double value);
/// A pattern of 0, #, "." and "," ("0.00", "#.0#", "00,0"); a comma groups thousands.
std::string formatPattern(double value, std::string_view pattern);
/// To that many decimals, ties to even.
double roundHalfEven(double value, int digits);
/// The shortest text that reads back as the same number.
std::string shortestNumber(double value);
/// The whole number that the text is, from `lowest` to `highest`; nothing for any other text.
std::optional<int> wholeNumber(std::string_view text, int lowest = std::numeric_limits<int>::min(),
                               int highest = std::numeric_limits<int>::max());

}  // namespace zel
