#pragma once
// The number codec between the operator, the panel and the wire, and the level arithmetic.

#include <string>

namespace zel {

/// "1.5 GHz": the value with unit, scaled by prefix from n to G. With `round` the number is
/// rounded to `digits`, half to even. Both ends are trimmed.
std::string FormatValue(double value, const std::string& unit, const std::string& format = "",
                        bool scale = true, bool round = false, int digits = 0);
/// The value as a text: its leading number, with comma or point.
std::string FormatValue(const std::string& value, const std::string& unit,
                        const std::string& format = "", bool scale = true, bool round = false,
                        int digits = 0);
/// Rounds the number before the blank.
std::string RoundValueText(const std::string& text, int digits);

/// A value with an SI prefix, which is returned as k, M, G, m, µ or n (p counts, but shows none
/// of its own); 0 for a text that is no number or that carries a unit without a prefix.
double ParseValue(const std::string& text, std::string& prefix);
/// A length with "mm", "cm", "µ" or a bare number; a text with "m" after the number gives 0.
/// Throws std::invalid_argument for a text such as "5 s", which passes as numeric and is no number.
double ParseLength(const std::string& text, std::string& unit);
/// Comma becomes point, then the leading number.
double GetNumeric(const std::string& text);
/// A number that may carry thousands separators of either kind.
double ParseNumberInvariant(const std::string& text);
/// The form of a number in a command: "1500000000", ".5", "-20", "1E+15".
std::string WireNumber(double value);

/// -400 for 0, else the decimal logarithm.
double Log10Safe(double x);
/// Volts at 50 Ohm.
double VoltsToDbm(double volts);
double WattsToDbm(double watts);
/// Percent of the voltage that the reference level stands for.
double DbmToPercent(double level, double reference);
double LinearToPercent(double value, double reference);
double DbToLinear(double decibels);

}  // namespace zel
