#include "support/LinkAddressText.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

#include "platform/LinkAddress.h"
#include "support/NumberText.h"
#include "support/Text.h"

namespace zel {
namespace {

using Kind = LinkAddress::Kind;

constexpr int kDefaultBaud = 57600;
constexpr int kHighestPort = 65535;
constexpr std::size_t kLongestPhone = 80;
constexpr std::size_t kFingerprintDigits = 64;

struct KindRow {
    std::string_view head;
    Kind kind;
};
constexpr std::array<KindRow, 7> kKinds{{{"serial:", Kind::Serial},
                                         {"tcp:", Kind::Tcp},
                                         {"tls:", Kind::Tls},
                                         {"modem:", Kind::TwoModems},
                                         {"gsm:", Kind::TwoPhones},
                                         {"modemgsm:", Kind::ModemToPhone},
                                         {"gsmmodem:", Kind::PhoneToModem}}};

bool printable(std::string_view text) {
    return std::all_of(text.begin(), text.end(), [](char c) { return c >= ' ' && c <= '~'; });
}

/// Takes what stands after the first comma off the text; nothing when there is no comma.
std::optional<std::string> takeTail(std::string_view& text) {
    const auto comma = text.find(',');
    if (comma == std::string_view::npos) return std::nullopt;
    std::string tail(text.substr(comma + 1));
    text = text.substr(0, comma);
    return tail;
}

bool readFingerprint(const std::string& text, std::string& fingerprint) {
    for (const char c : text) {
        if (c == ':') continue;
        const char low = c >= 'A' && c <= 'F' ? static_cast<char>(c - 'A' + 'a') : c;
        if ((low < '0' || low > '9') && (low < 'a' || low > 'f')) return false;
        fingerprint.push_back(low);
    }
    return fingerprint.size() == kFingerprintDigits;
}

bool readHostAndPort(std::string_view text, LinkAddress& address) {
    const auto colon = text.rfind(':');
    if (colon == std::string_view::npos || colon == 0) return false;
    std::string_view host = text.substr(0, colon);
    // Brackets keep the colons of an IPv6 address apart from the port's.
    if (host.size() > 2 && host.front() == '[' && host.back() == ']')
        host = host.substr(1, host.size() - 2);
    const auto port = wholeNumber(text.substr(colon + 1), 1, kHighestPort);
    if (!port) return false;
    address.port = host;
    address.number = *port;
    return true;
}

bool readDeviceAndBaud(std::string_view text, LinkAddress& address) {
    const auto mark = text.rfind('@');
    address.number = kDefaultBaud;
    if (mark != std::string_view::npos) {
        const auto baud = wholeNumber(text.substr(mark + 1), 1, kFastestBaud);
        if (!baud) return false;
        address.number = *baud;
        text = text.substr(0, mark);
    }
    address.port = text;
    return !text.empty();
}

bool readRest(std::string_view rest, LinkAddress& address) {
    if (address.kind == Kind::Tls) {
        const auto tail = takeTail(rest);
        if (tail && !readFingerprint(*tail, address.pinned)) return false;
    }
    if (address.overNetwork()) return readHostAndPort(rest, address);
    if (address.dialled()) {
        const auto tail = takeTail(rest);
        if (!tail || tail->empty() || tail->size() > kLongestPhone || !printable(*tail))
            return false;
        address.phone = *tail;
    }
    return readDeviceAndBaud(rest, address);
}

}  // namespace

std::optional<LinkAddress> parseLinkAddress(std::string_view url) {
    for (const KindRow& row : kKinds) {
        if (!startsWith(url, row.head)) continue;
        LinkAddress address;
        address.kind = row.kind;
        if (!readRest(url.substr(row.head.size()), address)) return std::nullopt;
        return address;
    }
    return std::nullopt;
}

}  // namespace zel
