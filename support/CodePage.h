#pragma once
// The single-byte code page of scripts and result files, Windows-1252, beside UTF-8.

#include <cstddef>
#include <string>
#include <string_view>

namespace zel {

/// Every byte has a character: the five that Windows-1252 leaves free stand for U+0081 and so on,
/// so that `codePageBytes` gives the same bytes back.
std::string codePageToUtf8(std::string_view bytes);
/// The bytes of a UTF-8 text; a character without a byte becomes "?".
std::string codePageBytes(std::string_view text);
/// True where `codePageBytes` loses nothing.
bool fitsCodePage(std::string_view text);

/// Letters of the code page, those with accents too. A letter whose other case is not in the code
/// page stays, and so does what is no UTF-8.
std::string upperCaseText(std::string_view text);
std::string lowerCaseText(std::string_view text);
/// Characters of a UTF-8 text.
std::size_t characterCount(std::string_view text);
/// The first characters of a UTF-8 text, at most `count`.
std::string_view firstCharacters(std::string_view text, std::size_t count);

}  // namespace zel
