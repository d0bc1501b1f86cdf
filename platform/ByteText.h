#pragma once
// Bytes as text that a person can read.

#include <string>

namespace zel {

/// The two hexadecimal digits of a byte, "0D".
inline std::string hexOf(char byte) {
    constexpr char kDigits[] = "0123456789ABCDEF";
    const auto code = static_cast<unsigned char>(byte);
    return {kDigits[code >> 4], kDigits[code & 0xF]};
}

}  // namespace zel
