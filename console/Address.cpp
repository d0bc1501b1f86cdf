#include "console/Address.h"

#include <charconv>

#include "support/Text.h"

namespace zel {
namespace {

constexpr int kDefaultBaud = 57600;
constexpr int kHighestBaud = 4000000;
constexpr int kHighestTcpPort = 65535;
constexpr std::string_view kSerial = "serial:";
constexpr std::string_view kTcp = "tcp:";

/// A whole number from 1 to `highest`.
std::optional<int> positive(std::string_view text, int highest) {
    int number = 0;
    const char* const end = text.data() + text.size();
    const auto result = std::from_chars(text.data(), end, number);
    if (result.ec != std::errc() || result.ptr != end) return std::nullopt;
    if (number < 1 || number > highest) return std::nullopt;
    return number;
}

std::optional<ConnectAddress> serialAddress(std::string_view rest) {
    ConnectAddress address;
    address.link.number = kDefaultBaud;
    const auto at = rest.rfind('@');
    if (at != std::string_view::npos) {
        const auto baud = positive(rest.substr(at + 1), kHighestBaud);
        if (!baud) return std::nullopt;
        address.link.number = *baud;
        rest = rest.substr(0, at);
    }
    if (rest.empty()) return std::nullopt;
    address.link.port = rest;
    return address;
}

std::optional<ConnectAddress> tcpAddress(std::string_view rest) {
    const auto colon = rest.rfind(':');
    if (colon == std::string_view::npos || colon == 0) return std::nullopt;
    const auto port = positive(rest.substr(colon + 1), kHighestTcpPort);
    if (!port) return std::nullopt;
    ConnectAddress address;
    address.link = {LinkAddress::Kind::Tcp, std::string(rest.substr(0, colon)), *port};
    return address;
}

}  // namespace

std::optional<ConnectAddress> parseAddress(std::string_view url) {
    if (url == "sim:") {
        ConnectAddress address;
        address.simulated = true;
        address.link = {LinkAddress::Kind::Serial, kSimulatorPort, kDefaultBaud};
        return address;
    }
    if (startsWith(url, kSerial)) return serialAddress(url.substr(kSerial.size()));
    if (startsWith(url, kTcp)) return tcpAddress(url.substr(kTcp.size()));
    return std::nullopt;
}

}  // namespace zel
