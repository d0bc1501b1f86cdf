#pragma once
// The single-byte characters of the wire and of old files, against Unicode.

#include <optional>
#include <string>
#include <string_view>

namespace zel {

/// The byte of a character in Windows-1252; nothing for one that has none.
std::optional<char> windows1252Byte(char32_t character);
/// The bytes of a text in UTF-8; nothing when one of its characters has none.
std::optional<std::string> toWindows1252(std::string_view text);
/// A character a byte, as UTF-8; a byte that stands for nothing becomes the replacement character.
std::string fromWindows1252(std::string_view bytes);
/// The first character of a text in UTF-8 that has no byte, as UTF-8; empty when all have one.
std::string withoutWindows1252(std::string_view text);

}  // namespace zel
