#include "support/INIIO.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstddef>
#include <cstdint>
#include <limits>
#include <optional>
#include <string>
#include <variant>

#include "platform/Files.h"
#include "support/IniFile.h"
#include "support/NumberText.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr std::size_t kLongestValue = 750;  // characters
const IniValue kMissingDefault = std::int16_t{1};

/// The text of a value as it is written.
struct TextOf {
    std::string operator()(bool value) const { return value ? "1" : "0"; }
    std::string operator()(const std::string& value) const { return value; }
    std::string operator()(float value) const {
        // Through its own shortest digits: 0.1 has fifteen others as a double.
        std::array<char, 64> buffer{};
        const auto end = std::to_chars(buffer.data(), buffer.data() + buffer.size(), value).ptr;
        return generalNumber(leadingNumber({buffer.data(), end}));
    }
    template <class Number>
    std::string operator()(Number value) const {
        return generalNumber(static_cast<double>(value));
    }
};

IniType typeOf(const IniValue& value) { return static_cast<IniType>(value.index()); }

/// The nearest whole number that the type holds.
template <class Number>
Number whole(double number) {
    constexpr double kLow = std::numeric_limits<Number>::min();
    constexpr double kHigh = std::numeric_limits<Number>::max();
    return static_cast<Number>(std::clamp(roundHalfEven(number, 0), kLow, kHigh));
}

bool isTrue(const std::string& text) {
    const std::string upper = upperCase(text);
    return upper == "1" || upper == "WAHR" || upper == "TRUE";
}

/// The first characters, none of them cut in the middle.
std::string cut(const std::string& text) {
    std::size_t characters = 0;
    for (std::size_t i = 0; i < text.size(); ++i) {
        const bool begins = (static_cast<unsigned char>(text[i]) & 0xC0) != 0x80;
        if (begins && characters++ == kLongestValue) return text.substr(0, i);
    }
    return text;
}

}  // namespace

IniValue ReadIni(FileService& files, const std::string& fileName, const std::string& section,
                 const std::string& key, const std::optional<IniValue>& fallback,
                 std::optional<IniType> valueType) {
    const IniValue& preset = fallback ? *fallback : kMissingDefault;
    const std::optional<std::string> stored = IniFile::load(files, fileName).value(section, key);
    const std::string text = cut(stored ? *stored : std::visit(TextOf(), preset));
    switch (valueType ? *valueType : typeOf(preset)) {
        case IniType::Boolean:
            return isTrue(text);
        case IniType::Integer:
            return whole<std::int16_t>(leadingNumber(text));
        case IniType::Long:
            return whole<std::int32_t>(leadingNumber(text));
        case IniType::Single:
            return static_cast<float>(leadingNumber(text));
        case IniType::Double:
            return leadingNumber(text);
        case IniType::Text:
            break;
    }
    return text;
}

bool WriteIni(FileService& files, const std::string& fileName, const std::string& section,
              const std::string& key, const IniValue& value) {
    IniFile file = IniFile::load(files, fileName);
    return file.setValue(section, key, std::visit(TextOf(), value)) && file.save(files, fileName);
}

}  // namespace zel
