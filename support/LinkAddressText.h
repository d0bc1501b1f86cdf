#pragma once
// The address of an instrument as it is given on a command line.

#include <optional>
#include <string_view>

#include "platform/LinkAddress.h"

namespace zel {

/// "serial:DEVICE[@BAUD]" (57600 baud when none is given) or "tcp:HOST:PORT"; nothing for any
/// other text.
std::optional<LinkAddress> parseLinkAddress(std::string_view url);

}  // namespace zel
