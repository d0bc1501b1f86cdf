#pragma once
// The address of an instrument as it is given on a command line.

#include <optional>
#include <string_view>

#include "platform/LinkAddress.h"

namespace zel {

/// "serial:DEVICE[@BAUD]" (57600 baud when none is given), "tcp:HOST:PORT",
/// "tls:HOST:PORT[,FINGERPRINT]", or "modem:", "gsm:", "modemgsm:", "gsmmodem:" with
/// "DEVICE[@BAUD],NUMBER" (two modems, two mobile phones, modem to mobile phone, mobile phone to
/// modem); nothing for any other text. A fingerprint is 64 hex digits, colons between them or not;
/// it is kept in lower case without them.
std::optional<LinkAddress> parseLinkAddress(std::string_view url);

}  // namespace zel
