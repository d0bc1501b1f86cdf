#include "support/CodePage.h"

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

#include "support/Text.h"
#include "support/Windows1252.h"

namespace zel {
namespace {

constexpr unsigned char kUnassigned[] = {0x81, 0x8D, 0x8F, 0x90, 0x9D};

bool isUnassigned(char32_t code) {
    for (const unsigned char byte : kUnassigned)
        if (code == byte) return true;
    return false;
}

std::optional<char> byteOf(char32_t code) {
    if (isUnassigned(code)) return static_cast<char>(code);
    return windows1252Byte(code);
}

struct CasePair {
    char32_t lower;
    char32_t upper;
};
// Letters whose two cases do not stand 0x20 apart.
constexpr CasePair kPairs[] = {{0x161, 0x160}, {0x153, 0x152}, {0x17E, 0x17D}, {0xFF, 0x178}};
constexpr char32_t kTimes = 0xD7;
constexpr char32_t kDivided = 0xF7;

bool isLatinLower(char32_t code) {
    return (code >= 'a' && code <= 'z') || (code >= 0xE0 && code <= 0xFE && code != kDivided);
}
bool isLatinUpper(char32_t code) {
    return (code >= 'A' && code <= 'Z') || (code >= 0xC0 && code <= 0xDE && code != kTimes);
}

char32_t upperOf(char32_t code) {
    if (isLatinLower(code)) return code - 0x20;
    for (const CasePair& pair : kPairs)
        if (code == pair.lower) return pair.upper;
    return code;
}

char32_t lowerOf(char32_t code) {
    if (isLatinUpper(code)) return code + 0x20;
    for (const CasePair& pair : kPairs)
        if (code == pair.upper) return pair.lower;
    return code;
}

template <class Change>
std::string changed(std::string_view text, Change change) {
    std::string result;
    result.reserve(text.size());
    while (!text.empty()) {
        const std::string_view before = text;
        const char32_t code = takeCharacter(text);
        const char32_t other = change(code);
        if (other == code) {
            result += before.substr(0, before.size() - text.size());
        } else {
            appendCharacter(result, other);
        }
    }
    return result;
}

}  // namespace

std::string codePageToUtf8(std::string_view bytes) {
    std::string text;
    text.reserve(bytes.size());
    for (std::size_t at = 0; at < bytes.size(); ++at) {
        const auto byte = static_cast<unsigned char>(bytes[at]);
        if (isUnassigned(byte)) {
            appendCharacter(text, byte);
        } else {
            text += fromWindows1252(bytes.substr(at, 1));
        }
    }
    return text;
}

std::string codePageBytes(std::string_view text) {
    std::string bytes;
    bytes.reserve(text.size());
    while (!text.empty()) bytes += byteOf(takeCharacter(text)).value_or('?');
    return bytes;
}

bool fitsCodePage(std::string_view text) {
    while (!text.empty())
        if (!byteOf(takeCharacter(text))) return false;
    return true;
}

std::string upperCaseText(std::string_view text) { return changed(text, upperOf); }
std::string lowerCaseText(std::string_view text) { return changed(text, lowerOf); }

std::size_t characterCount(std::string_view text) {
    std::size_t count = 0;
    for (; !text.empty(); ++count) takeCharacter(text);
    return count;
}

std::string_view firstCharacters(std::string_view text, std::size_t count) {
    std::string_view rest = text;
    while (!rest.empty() && count-- > 0) takeCharacter(rest);
    return text.substr(0, text.size() - rest.size());
}

}  // namespace zel
