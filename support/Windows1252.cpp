#include "support/Windows1252.h"

#include <algorithm>
#include <cstddef>
#include <iterator>
#include <optional>
#include <string>
#include <string_view>

#include "support/Text.h"

namespace zel {
namespace {

constexpr char32_t kReplacement = 0xFFFD;
constexpr std::size_t kFirst = 0x80;  // of the bytes that are not their own number
constexpr std::size_t kLast = 0x9F;
/// The characters from 0x80 to 0x9F; 0 where nothing is assigned.
constexpr char16_t kTable[] = {0x20AC, 0,      0x201A, 0x0192, 0x201E, 0x2026, 0x2020, 0x2021,
                               0x02C6, 0x2030, 0x0160, 0x2039, 0x0152, 0,      0x017D, 0,
                               0,      0x2018, 0x2019, 0x201C, 0x201D, 0x2022, 0x2013, 0x2014,
                               0x02DC, 0x2122, 0x0161, 0x203A, 0x0153, 0,      0x017E, 0x0178};
static_assert(std::size(kTable) == kLast - kFirst + 1);

}  // namespace

std::optional<char> windows1252Byte(char32_t character) {
    const bool ownNumber = character < kFirst || (character > kLast && character <= 0xFF);
    if (ownNumber) return static_cast<char>(character);
    const auto* const found =
        std::find_if(std::begin(kTable), std::end(kTable),
                     [&](char16_t sign) { return sign != 0 && sign == character; });
    if (found == std::end(kTable)) return std::nullopt;
    return static_cast<char>(kFirst + static_cast<std::size_t>(found - std::begin(kTable)));
}

std::optional<std::string> toWindows1252(std::string_view text) {
    std::string bytes;
    while (!text.empty()) {
        const std::optional<char> byte = windows1252Byte(takeCharacter(text));
        if (!byte) return std::nullopt;
        bytes += *byte;
    }
    return bytes;
}

std::string fromWindows1252(std::string_view bytes) {
    std::string text;
    // Room at once: to grow would take the memory of several files.
    constexpr std::size_t kMore = 2;  // bytes that a letter takes at most besides its first
    const auto wide = std::count_if(bytes.begin(), bytes.end(),
                                    [](char c) { return static_cast<unsigned char>(c) >= kFirst; });
    text.reserve(bytes.size() + kMore * static_cast<std::size_t>(wide));
    for (const char byte : bytes) {
        const auto number = static_cast<unsigned char>(byte);
        const bool special = number >= kFirst && number <= kLast;
        const char32_t character = special ? kTable[number - kFirst] : number;
        appendCharacter(text, special && character == 0 ? kReplacement : character);
    }
    return text;
}

std::string withoutWindows1252(std::string_view text) {
    while (!text.empty()) {
        const std::string_view before = text;
        if (!windows1252Byte(takeCharacter(text)))
            return std::string(before.substr(0, before.size() - text.size()));
    }
    return "";
}

}  // namespace zel
