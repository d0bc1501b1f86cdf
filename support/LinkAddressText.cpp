#include "support/LinkAddressText.h"

#include <string>

#include "support/NumberText.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr int kDefaultBaud = 57600;
constexpr int kHighestTcpPort = 65535;
constexpr std::string_view kSerial = "serial:";
constexpr std::string_view kTcp = "tcp:";

std::optional<LinkAddress> serialAddress(std::string_view rest) {
    const auto mark = rest.rfind('@');
    const std::optional<int> baud = mark == std::string_view::npos
                                        ? kDefaultBaud
                                        : wholeNumber(rest.substr(mark + 1), 1, kFastestBaud);
    const std::string_view device = rest.substr(0, mark);
    if (!baud || device.empty()) return std::nullopt;
    return LinkAddress{LinkAddress::Kind::Serial, std::string(device), *baud};
}

std::optional<LinkAddress> tcpAddress(std::string_view rest) {
    const auto mark = rest.rfind(':');
    if (mark == std::string_view::npos || mark == 0) return std::nullopt;
    const std::optional<int> port = wholeNumber(rest.substr(mark + 1), 1, kHighestTcpPort);
    if (!port) return std::nullopt;
    return LinkAddress{LinkAddress::Kind::Tcp, std::string(rest.substr(0, mark)), *port};
}

}  // namespace

std::optional<LinkAddress> parseLinkAddress(std::string_view url) {
    if (startsWith(url, kSerial)) return serialAddress(url.substr(kSerial.size()));
    if (startsWith(url, kTcp)) return tcpAddress(url.substr(kTcp.size()));
    return std::nullopt;
}

}  // namespace zel
