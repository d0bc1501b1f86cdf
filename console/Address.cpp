#include "console/Address.h"

#include <optional>
#include <string_view>

#include "desktop/platform/DeviceName.h"
#include "platform/LinkAddress.h"
#include "support/LinkAddressText.h"

namespace zel {
namespace {

constexpr int kSimulatorBaud = 57600;

}  // namespace

std::optional<ConnectAddress> parseAddress(std::string_view url) {
    if (url == "sim:")
        return ConnectAddress{true, {LinkAddress::Kind::Serial, kSimulatorPort, kSimulatorBaud}};
    std::optional<LinkAddress> link = parseLinkAddress(url);
    if (!link) return std::nullopt;
    useDevicePath(*link);
    return ConnectAddress{false, *link};
}

}  // namespace zel
