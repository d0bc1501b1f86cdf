#pragma once
// Small helpers for texts, all of which are UTF-8.

#include <string>
#include <string_view>
#include <vector>

namespace zel {

/// Joins two lines of a caption or a message.
inline constexpr const char* kCrLf = "\r\n";

/// One of 0 to 9.
constexpr bool isDigit(char c) { return c >= '0' && c <= '9'; }
/// ASCII letters only; all else stays.
std::string upperCase(std::string_view text);
std::string lowerCase(std::string_view text);
/// Without blanks at both ends.
std::string trimmed(std::string_view text);
/// At each separator; at least one piece.
std::vector<std::string> split(std::string_view text, char separator);
std::string replaceAll(std::string_view text, std::string_view what, std::string_view with);
bool contains(std::string_view text, std::string_view what);
bool startsWith(std::string_view text, std::string_view head);
bool isValidUtf8(std::string_view bytes);
/// Bytes of the wire or of a file: valid UTF-8 as it stands, else read as Windows-1252.
std::string wireToUtf8(std::string_view bytes);

}  // namespace zel
