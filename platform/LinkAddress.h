#pragma once
// Where an instrument is to be found.

#include <string>

namespace zel {

/// The fastest rate that a serial port is opened at, in bits per second.
inline constexpr int kFastestBaud = 10'000'000;

struct LinkAddress {
    enum class Kind { Serial, Tcp };
    Kind kind = Kind::Serial;
    std::string port;  ///< device name, or host
    int number = 0;    ///< baud rate, or TCP port
};

}  // namespace zel
