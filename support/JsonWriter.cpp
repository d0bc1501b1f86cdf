#include "support/JsonWriter.h"

#include <cmath>
#include <string>
#include <string_view>

#include "support/NumberText.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr char kHex[] = "0123456789abcdef";
constexpr unsigned char kFirstPrintable = 0x20;

}  // namespace

JsonWriter& JsonWriter::begin(char bracket) {
    separate();
    text_ += bracket;
    first_ = true;
    return *this;
}

JsonWriter& JsonWriter::end(char bracket) {
    text_ += bracket;
    first_ = false;
    return *this;
}

void JsonWriter::separate() {
    if (!first_) text_ += ',';
    first_ = false;
}

void JsonWriter::quote(std::string_view text) {
    std::string replaced;
    if (!isValidUtf8(text)) {
        while (!text.empty()) appendCharacter(replaced, takeCharacter(text));
        text = replaced;
    }
    text_ += '"';
    for (const char character : text) {
        const auto code = static_cast<unsigned char>(character);
        if (character == '"' || character == '\\') {
            text_ += '\\';
            text_ += character;
        } else if (code < kFirstPrintable) {
            text_ += "\\u00";
            text_ += kHex[code / 16];
            text_ += kHex[code % 16];
        } else {
            text_ += character;
        }
    }
    text_ += '"';
}

JsonWriter& JsonWriter::name(std::string_view text) {
    separate();
    quote(text);
    text_ += ':';
    first_ = true;
    return *this;
}

JsonWriter& JsonWriter::value(double number) {
    if (std::isinf(number)) return value(number > 0 ? "inf" : "-inf");
    separate();
    text_ += std::isnan(number) ? std::string("null") : shortestNumber(number);
    return *this;
}

JsonWriter& JsonWriter::value(int number) {
    separate();
    text_ += std::to_string(number);
    return *this;
}

JsonWriter& JsonWriter::value(bool flag) {
    separate();
    text_ += flag ? "true" : "false";
    return *this;
}

JsonWriter& JsonWriter::value(std::string_view text) {
    separate();
    quote(text);
    return *this;
}

}  // namespace zel
