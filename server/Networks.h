#pragma once
// Who may connect: internet addresses, and ranges of them.

#include <array>
#include <cstdint>
#include <optional>
#include <string_view>
#include <vector>

namespace zel {

/// An address of either kind; one of the old kind is kept as "::ffff:A.B.C.D".
using InternetAddress = std::array<std::uint8_t, 16>;

/// "192.168.1.5" or "fe80::1%eth0"; nothing for a name or any other text.
std::optional<InternetAddress> internetAddressOf(std::string_view text);

struct Network {
    InternetAddress address{};
    int bits = 128;
    bool holds(const InternetAddress& other) const;
};

/// An address, or an address with "/BITS"; nothing for any other text.
std::optional<Network> networkOf(std::string_view text);

/// Networks between blanks, commas or semicolons, 64 at most; nothing when one of them is none.
/// An empty text gives the loopback, the private ranges and the link's own, of both kinds.
std::optional<std::vector<Network>> networksOf(std::string_view text);

/// A text that is no address is in no network.
bool mayConnect(const std::vector<Network>& networks, std::string_view address);

}  // namespace zel
