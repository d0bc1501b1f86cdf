#include "support/StringOp.h"

#include <charconv>
#include <cmath>
#include <cstddef>
#include <string>
#include <string_view>
#include <system_error>

#include "support/Text.h"

namespace zel {
namespace {

bool isNumericWithout(std::string_view text, char mark) {
    return IsNumericText(replaceAll(text, std::string_view(&mark, 1), ""));
}

}  // namespace

std::string TrimControlChars(std::string_view text) {
    const std::string blanksGone = trimmed(text);
    constexpr std::string_view kControls("\r\n\0", 3);
    const auto first = blanksGone.find_first_not_of(kControls);
    if (first == std::string::npos) return "";
    return blanksGone.substr(first, blanksGone.find_last_not_of(kControls) - first + 1);
}

bool parsePlainNumber(std::string_view text, double& value) {
    const std::string plain = trimmed(text);
    std::string digits;
    std::size_t i = 0;
    if (i < plain.size() && (plain[i] == '+' || plain[i] == '-')) {
        if (plain[i] == '-') digits += '-';
        ++i;
    }
    std::size_t count = 0;
    for (; i < plain.size() && (isDigit(plain[i]) || (plain[i] == ',' && count > 0)); ++i) {
        if (plain[i] == ',') continue;  // groups, wherever it stands before the point
        digits += plain[i];
        ++count;
    }
    if (i < plain.size() && plain[i] == '.') {
        digits += plain[i++];
        for (; i < plain.size() && isDigit(plain[i]); ++i, ++count) digits += plain[i];
    }
    if (count == 0) return false;
    if (i < plain.size() && (plain[i] == 'e' || plain[i] == 'E')) {
        digits += plain[i++];
        if (i < plain.size() && (plain[i] == '+' || plain[i] == '-')) digits += plain[i++];
        if (i >= plain.size() || !isDigit(plain[i])) return false;
        for (; i < plain.size() && isDigit(plain[i]); ++i) digits += plain[i];
    }
    if (i != plain.size()) return false;
    double number = 0;
    const auto result = std::from_chars(digits.data(), digits.data() + digits.size(), number);
    if (result.ec != std::errc() || !std::isfinite(number)) return false;
    value = number;
    return true;
}

bool IsNumericText(std::string_view text) {
    double ignored = 0;
    if (parsePlainNumber(text, ignored)) return true;
    for (const std::string_view head : {".", "-."})
        if (startsWith(text, head) && parsePlainNumber(text.substr(head.size()), ignored))
            return true;
    bool numeric = false;
    if (contains(text, "s")) numeric = isNumericWithout(text, 's');
    if (contains(text, "%")) numeric = isNumericWithout(text, '%');
    return numeric;
}

}  // namespace zel
