#include "support/RTFGen.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include "platform/Controls.h"
#include "platform/Form.h"
#include "support/ColorsEX.h"

namespace zel {
namespace {

struct ColorRow {
    Color color;
    int index;
};
constexpr ColorRow kColors[] = {{0x0000FF, 2}, {0x00FF00, 3}, {0xFF0000, 4}, {0xC0C0C0, 5},
                                {0x00C000, 6}, {0x0080FF, 7}, {0xFFFFFF, 8}};

const char* alignmentWord(RtfAlignment alignment) {
    switch (alignment) {
        case RtfAlignment::Center:
            return "\\qc";
        case RtfAlignment::Right:
            return "\\qr";
        case RtfAlignment::Left:
            break;
    }
    return "\\ql";
}

/// Length of the line break at the position, 0 for none.
std::size_t breakLength(const std::string& text, std::size_t at) {
    if (text[at] == '\r') return at + 1 < text.size() && text[at + 1] == '\n' ? 2 : 1;
    return text[at] == '\n' ? 1 : 0;
}

/// What would be taken for a part of the control word before it.
bool continuesWord(const std::string& text, std::size_t at) {
    if (at >= text.size()) return false;
    const char c = text[at];
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9') || c == '-' ||
           c == ' ';
}

void appendCharacter(std::string& code, std::uint32_t character) {
    const auto unit = [&code](std::uint32_t value) {
        // A 16-bit number with sign, and a sign for readers that know no Unicode.
        const int number =
            value > 0x7FFF ? static_cast<int>(value) - 0x10000 : static_cast<int>(value);
        code += "\\u" + std::to_string(number) + "?";
    };
    if (character < 0x10000) return unit(character);
    unit(0xD800 + ((character - 0x10000) >> 10));
    unit(0xDC00 + ((character - 0x10000) & 0x3FF));
}

/// The text with everything that means something in rich text code written out.
std::string escaped(const std::string& text) {
    std::string code;
    for (std::size_t at = 0; at < text.size();) {
        if (const std::size_t length = breakLength(text, at)) {
            code += "\\par\r\n";
            at += length;
            continue;
        }
        const auto lead = static_cast<unsigned char>(text[at]);
        if (lead >= 0x80) {
            const std::size_t length = lead < 0xE0 ? 2 : lead < 0xF0 ? 3 : 4;
            std::uint32_t character = lead & (0xFFU >> (length + 1));
            for (std::size_t i = 1; i < length && at + i < text.size(); ++i)
                character = character << 6 | (static_cast<unsigned char>(text[at + i]) & 0x3FU);
            appendCharacter(code, character);
            at += length;
            continue;
        }
        const char c = text[at++];
        if (c == '\t') {
            code += "\\tab ";
        } else {
            if (c == '\\' || c == '{' || c == '}') code += '\\';
            code += c;
        }
    }
    return code;
}

}  // namespace

int colorIndex(Color color) {
    for (const ColorRow& row : kColors)
        if (row.color == color) return row.index;
    return 1;
}

std::string formatRun(const std::string& text, int size, bool bold, bool italic, bool underline,
                      Color foreColor, Color backColor, RtfAlignment alignment) {
    std::string code = "{";
    if (bold) code += "\\b";
    if (italic) code += "\\i";
    if (underline) code += "\\ul";
    code += "\\cf" + std::to_string(colorIndex(foreColor));
    if (backColor != 0) code += "\\highlight" + std::to_string(colorIndex(backColor));
    code += alignmentWord(alignment);
    code += ' ';
    for (std::size_t at = 0; at < text.size();) {
        if (const std::size_t length = breakLength(text, at)) {
            at += length;
            code += "\\par";
            if (continuesWord(text, at)) code += ' ';
            continue;
        }
        if (text[at] == '\\') code += '\\';
        code += text[at++];
    }
    code += '}';
    if (size <= 0) return code;
    return "{\\plain\\fs" + std::to_string(size) + code + "}";
}

std::string rtfDocument(const std::vector<TextRun>& runs) {
    std::string code = "{\\rtf1\\ansi\\ansicpg1252\\deff0{\\fonttbl{\\f0 Segoe UI;}}\r\n";
    code += kColorTable;
    code += "\r\n\\f0\\fs18\r\n";
    for (const TextRun& run : runs) {
        code += "{\\cf" + std::to_string(colorIndex(run.color));
        if (run.bold) code += "\\b";
        if (run.italic) code += "\\i";
        code += ' ' + escaped(run.text) + "}";
    }
    return code + "}";
}

}  // namespace zel
