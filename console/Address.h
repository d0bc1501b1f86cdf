#pragma once
// Where the instrument of a run is, as `--connect` says it.

#include <optional>
#include <string_view>

#include "platform/LinkAddress.h"

namespace zel {

struct ConnectAddress {
    bool simulated = false;  ///< the built-in simulator, in virtual time
    LinkAddress link;
};

/// "sim:", or an address as `parseLinkAddress` takes it; nothing for any other text.
std::optional<ConnectAddress> parseAddress(std::string_view url);

/// The name of the port that leads to the built-in simulator.
inline constexpr const char* kSimulatorPort = "SIM";

}  // namespace zel
