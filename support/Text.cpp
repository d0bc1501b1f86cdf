#include "support/Text.h"

#include <cstdint>
#include <cstring>
#include <string>
#include <string_view>
#include <vector>

#include "support/Windows1252.h"

namespace zel {
namespace {

constexpr char32_t kReplacement = 0xFFFD;

/// Length of the UTF-8 sequence at the position; 0 where none begins.
std::size_t sequenceLength(std::string_view bytes, std::size_t at) {
    const auto byte = [&](std::size_t i) { return static_cast<unsigned char>(bytes[i]); };
    const unsigned lead = byte(at);
    if (lead < 0x80) return 1;
    const std::size_t length = lead >= 0xC2 && lead < 0xE0   ? 2
                               : lead >= 0xE0 && lead < 0xF0 ? 3
                               : lead >= 0xF0 && lead < 0xF5 ? 4
                                                             : 0;
    if (length == 0 || at + length > bytes.size()) return 0;
    for (std::size_t i = 1; i < length; ++i)
        if ((byte(at + i) & 0xC0) != 0x80) return 0;
    const unsigned second = byte(at + 1);
    const bool outside = (lead == 0xE0 && second < 0xA0) || (lead == 0xED && second >= 0xA0) ||
                         (lead == 0xF0 && second < 0x90) || (lead == 0xF4 && second >= 0x90);
    return outside ? 0 : length;
}

}  // namespace

std::string upperCase(std::string_view text) {
    std::string result(text);
    for (char& c : result)
        if (c >= 'a' && c <= 'z') c = static_cast<char>(c - 'a' + 'A');
    return result;
}

std::string lowerCase(std::string_view text) {
    std::string result(text);
    for (char& c : result)
        if (c >= 'A' && c <= 'Z') c = static_cast<char>(c - 'A' + 'a');
    return result;
}

std::string trimmed(std::string_view text) {
    const auto first = text.find_first_not_of(' ');
    if (first == std::string_view::npos) return "";
    return std::string(text.substr(first, text.find_last_not_of(' ') - first + 1));
}

std::vector<std::string> split(std::string_view text, char separator) {
    std::vector<std::string> pieces;
    for (;;) {
        const auto end = text.find(separator);
        pieces.emplace_back(text.substr(0, end));
        if (end == std::string_view::npos) return pieces;
        text.remove_prefix(end + 1);
    }
}

std::string replaceAll(std::string_view text, std::string_view what, std::string_view with) {
    if (what.empty()) return std::string(text);
    std::string result;
    for (;;) {
        const auto found = text.find(what);
        result += text.substr(0, found);
        if (found == std::string_view::npos) return result;
        result += with;
        text.remove_prefix(found + what.size());
    }
}

bool contains(std::string_view text, std::string_view what) {
    return text.find(what) != std::string_view::npos;
}

bool startsWith(std::string_view text, std::string_view head) {
    return text.substr(0, head.size()) == head;
}

bool isValidUtf8(std::string_view bytes) {
    constexpr std::uint64_t kTopBits = 0x8080808080808080;
    for (std::size_t at = 0; at < bytes.size();) {
        // Eight bytes of ASCII at a time, as nearly all of a file is.
        std::uint64_t eight = kTopBits;
        if (at + sizeof eight <= bytes.size()) std::memcpy(&eight, bytes.data() + at, sizeof eight);
        if ((eight & kTopBits) == 0) {
            at += sizeof eight;
            continue;
        }
        const std::size_t length = sequenceLength(bytes, at);
        if (length == 0) return false;
        at += length;
    }
    return true;
}

char32_t takeCharacter(std::string_view& text) {
    constexpr unsigned kLeadBits[] = {0x7F, 0x7F, 0x1F, 0x0F, 0x07};
    const std::size_t length = sequenceLength(text, 0);
    if (length == 0) {
        text.remove_prefix(1);
        return kReplacement;
    }
    char32_t character = static_cast<unsigned char>(text.front()) & kLeadBits[length];
    for (std::size_t i = 1; i < length; ++i)
        character = character << 6 | (static_cast<unsigned char>(text[i]) & 0x3FU);
    text.remove_prefix(length);
    return character;
}

void appendCharacter(std::string& text, char32_t character) {
    const auto tail = [&](int shift) {
        return static_cast<char>(0x80 | (character >> shift & 0x3F));
    };
    if (character < 0x80) {
        text += static_cast<char>(character);
    } else if (character < 0x800) {
        text += {static_cast<char>(0xC0 | character >> 6), tail(0)};
    } else if (character < 0x10000) {
        text += {static_cast<char>(0xE0 | character >> 12), tail(6), tail(0)};
    } else {
        text += {static_cast<char>(0xF0 | character >> 18), tail(12), tail(6), tail(0)};
    }
}

std::string bytesToUtf8(std::string_view bytes) {
    if (isValidUtf8(bytes)) return std::string(bytes);
    return fromWindows1252(bytes);
}

}  // namespace zel
