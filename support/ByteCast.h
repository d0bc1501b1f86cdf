#pragma once
// Numbers out of bytes.

#include <cstdint>

namespace zel {

/// Four bytes, least significant first, as a signed 32-bit integer.
inline std::int32_t int32FromLittleEndian(const unsigned char* bytes) {
    const std::uint32_t value =
        static_cast<std::uint32_t>(bytes[0]) | static_cast<std::uint32_t>(bytes[1]) << 8 |
        static_cast<std::uint32_t>(bytes[2]) << 16 | static_cast<std::uint32_t>(bytes[3]) << 24;
    return static_cast<std::int32_t>(value);
}

}  // namespace zel
