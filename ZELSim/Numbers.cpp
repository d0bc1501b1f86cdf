#include "ZELSim/Numbers.h"

#include <array>
#include <charconv>
#include <string>
#include <string_view>

namespace zelsim {

std::string numberText(double value, int decimals) {
    std::array<char, 400> room{};
    const auto done = std::to_chars(room.data(), room.data() + room.size(), value,
                                    std::chars_format::fixed, decimals);
    std::string text(room.data(), done.ptr);
    if (text.find('.') != std::string::npos) {
        text.erase(text.find_last_not_of('0') + 1);
        if (text.back() == '.') {
            text.pop_back();
        }
    }
    return text == "-0" ? "0" : text;
}

std::string_view trimmed(std::string_view text) {
    while (!text.empty() && text.front() == ' ') {
        text.remove_prefix(1);
    }
    while (!text.empty() && text.back() == ' ') {
        text.remove_suffix(1);
    }
    return text;
}

}  // namespace zelsim
