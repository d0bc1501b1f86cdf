#include "platform/LinkAddress.h"

#include <charconv>

namespace zel {
namespace {

constexpr int kDefaultBaud = 57600;
constexpr int kHighestBaud = 10'000'000;
constexpr int kHighestPort = 65535;
constexpr const char* kSerial = "serial:";
constexpr const char* kTcp = "tcp:";

std::optional<int> numberOf(const std::string& text, int highest) {
    int number = 0;
    const auto result = std::from_chars(text.data(), text.data() + text.size(), number);
    const bool whole = result.ec == std::errc() && result.ptr == text.data() + text.size();
    if (!whole || number < 1 || number > highest) return std::nullopt;
    return number;
}

}  // namespace

std::optional<LinkAddress> linkAddressOf(const std::string& text) {
    const bool serial = text.rfind(kSerial, 0) == 0;
    if (!serial && text.rfind(kTcp, 0) != 0) return std::nullopt;
    const std::string rest = text.substr(text.find(':') + 1);
    const auto mark = rest.rfind(serial ? '@' : ':');
    const std::string head = rest.substr(0, mark);
    if (head.empty()) return std::nullopt;
    LinkAddress address;
    address.kind = serial ? LinkAddress::Kind::Serial : LinkAddress::Kind::Tcp;
    address.port = head;
    if (mark == std::string::npos) {
        if (!serial) return std::nullopt;
        address.number = kDefaultBaud;
        return address;
    }
    const auto number = numberOf(rest.substr(mark + 1), serial ? kHighestBaud : kHighestPort);
    if (!number) return std::nullopt;
    address.number = *number;
    return address;
}

}  // namespace zel
