#include "platform/KeyInput.h"

#include <cstddef>
#include <cstdint>
#include <string>

#include "platform/Controls.h"

namespace zel {
namespace {

void appendUtf8(std::string& text, int code) {
    const auto c = static_cast<std::uint32_t>(code);
    if (c < 0x80) {
        text += static_cast<char>(c);
    } else if (c < 0x800) {
        text += static_cast<char>(0xC0 | (c >> 6));
        text += static_cast<char>(0x80 | (c & 0x3F));
    } else if (c < 0x10000) {
        text += static_cast<char>(0xE0 | (c >> 12));
        text += static_cast<char>(0x80 | ((c >> 6) & 0x3F));
        text += static_cast<char>(0x80 | (c & 0x3F));
    } else {
        text += static_cast<char>(0xF0 | (c >> 18));
        text += static_cast<char>(0x80 | ((c >> 12) & 0x3F));
        text += static_cast<char>(0x80 | ((c >> 6) & 0x3F));
        text += static_cast<char>(0x80 | (c & 0x3F));
    }
}

/// The key after a character, as KeyDown counts keys: letters as capitals, digits as they are.
/// Other characters have keys of their own that no handler asks for.
int keyOf(int character) {
    if (character == kKeyEnter || character == kKeyBackspace) return character;
    if (character >= 'a' && character <= 'z') return character - 'a' + 'A';
    const bool named = (character >= 'A' && character <= 'Z') ||
                       (character >= '0' && character <= '9') || character == ' ';
    return named ? character : 0;
}

void removeLast(std::string& text) {
    while (!text.empty()) {
        const auto last = static_cast<unsigned char>(text.back());
        text.pop_back();
        if ((last & 0xC0) != 0x80) break;
    }
}

}  // namespace

void typeKey(TextBox& box, int codePoint) {
    box.KeyDown(keyOf(codePoint), 0);
    int key = codePoint;
    box.KeyPress(key);
    if (key == 0 || key == kKeyEnter) return;
    std::string text = box.Text;
    if (key == kKeyBackspace) {
        removeLast(text);
    } else if (key >= 32) {
        appendUtf8(text, key);
    }
    box.Text = text;
}

void pressKey(TextBox& box, int keyCode) { box.KeyDown(keyCode, 0); }

void typeText(TextBox& box, const std::string& text) {
    for (std::size_t i = 0; i < text.size();) {
        const auto lead = static_cast<unsigned char>(text[i]);
        const std::size_t length = lead < 0xC0 ? 1 : lead < 0xE0 ? 2 : lead < 0xF0 ? 3 : 4;
        std::uint32_t code = length == 1 ? lead : lead & (0xFFU >> (length + 1));
        for (std::size_t k = 1; k < length && i + k < text.size(); ++k)
            code = (code << 6) | (static_cast<unsigned char>(text[i + k]) & 0x3FU);
        typeKey(box, static_cast<int>(code));
        i += length;
    }
}

}  // namespace zel
