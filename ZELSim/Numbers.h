#pragma once
// Numbers as the wire writes them: plain decimal text with a point.

#include <cmath>
#include <string>
#include <string_view>

#include "support/NumberText.h"
#include "support/Text.h"

namespace zelsim {

using zel::parseNumber;
using zel::upperCase;

/// Plain decimal text with at most `decimals` places, no trailing zeros, no exponent.
std::string numberText(double value, int decimals);
/// Without blanks at both ends.
std::string_view trimmed(std::string_view text);

/// 10 to the power of db / 10.
inline double dbToPower(double db) { return std::exp2(db * 0.33219280948873623); }
/// 10 log10 with a floor of -400, so that nothing becomes infinite.
inline double powerToDb(double power) { return power > 0 ? 10.0 * std::log10(power) : -400.0; }

}  // namespace zelsim
