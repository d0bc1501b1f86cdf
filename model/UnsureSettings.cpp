#include "model/UnsureSettings.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <string_view>

#include "support/NumberText.h"

namespace zel {
namespace {

// In the order of AxisSetting.
constexpr std::array<std::string_view, 5> kWords = {"FREQ", "SPAN", "REFLVL", "RANGE", "TRACEDET"};
constexpr std::string_view kDigits = "0123456789";

/// A unit may follow the number, and no further digit: "15x0000000" was spoiled on its way.
bool isOneNumber(std::string_view text) {
    if (!startsWithNumber(text)) return false;
    const auto end = text.find_first_not_of("+-.eE0123456789", text.find_first_not_of(" \t\n"));
    return end == std::string_view::npos ||
           text.find_first_of(kDigits, end) == std::string_view::npos;
}

}  // namespace

bool UnsureSettings::any() const {
    return std::find(unsure_.begin(), unsure_.end(), true) != unsure_.end();
}

void UnsureSettings::set(std::string_view word, bool unsure) {
    const auto found = std::find(kWords.begin(), kWords.end(), word);
    if (found == kWords.end()) return;
    bool& mark = unsure_.at(static_cast<std::size_t>(found - kWords.begin()));
    if (mark == unsure) return;
    mark = unsure;
    Changed();
}

bool UnsureSettings::answered(std::string_view word, std::string_view answer) {
    const bool isNumber = isOneNumber(answer);
    set(word, !isNumber);
    return isNumber;
}

void UnsureSettings::clear() {
    if (!any()) return;
    unsure_.fill(false);
    Changed();
}

}  // namespace zel
