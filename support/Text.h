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
/// Takes the first character off a text that is not empty; of bytes that are no UTF-8 one byte, as
/// the replacement character.
char32_t takeCharacter(std::string_view& text);
/// Appends a character as UTF-8.
void appendCharacter(std::string& text, char32_t character);
/// Bytes of a file or of an input: valid UTF-8 as it stands, else read as Windows-1252.
std::string bytesToUtf8(std::string_view bytes);

}  // namespace zel
