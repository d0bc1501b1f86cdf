#pragma once
// Where the instrument of a run is, as `--connect` tells it.

#include <optional>
#include <string>
#include <string_view>

#include "shell/Program.h"

namespace zel {

struct ConnectAddress {
    bool simulated = false;  ///< the built-in simulator, in virtual time
    LinkAddress link;
};

/// "serial:DEVICE[@BAUD]", "tcp:HOST:PORT" or "sim:"; nothing when it is none of them. The baud
/// rate is 57600 unless told.
std::optional<ConnectAddress> parseAddress(std::string_view url);

/// The name of the port behind which the built-in simulator is found.
inline constexpr const char* kSimulatorPort = "SIM";

}  // namespace zel
