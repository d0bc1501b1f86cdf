#pragma once
// Text tests of the number codec.

#include <string>
#include <string_view>

namespace zel {

/// Without blanks at both ends, then without CR, LF and NUL at both ends.
std::string TrimControlChars(std::string_view text);
/// A number as the panel reads one: blanks around it, commas that group before the point, also
/// "." or "-." before a number, also with letters "s" or signs "%" anywhere. So it passes texts
/// that `parsePlainNumber` does not read.
bool IsNumericText(std::string_view text);
/// Reads a text that is a number by the strict rule: a point, commas only as groups. False where
/// it is none.
bool parsePlainNumber(std::string_view text, double& value);

}  // namespace zel
