#pragma once
// Where an instrument is to be found.

#include <optional>
#include <string>

namespace zel {

struct LinkAddress {
    enum class Kind { Serial, Tcp };
    Kind kind = Kind::Serial;
    std::string port;  ///< device name, or host
    int number = 0;    ///< baud rate, or TCP port
};

/// "serial:DEVICE[@BAUD]" (57600 baud when none is given) or "tcp:HOST:PORT"; nothing for any
/// other text.
std::optional<LinkAddress> linkAddressOf(const std::string& text);

}  // namespace zel
