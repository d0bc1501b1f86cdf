#include "server/Networks.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string_view>
#include <system_error>
#include <vector>

namespace zel {
namespace {

constexpr std::size_t kMostNetworks = 64;
constexpr int kOldKindBits = 96;  // before the four bytes of an address of the old kind
constexpr std::string_view kPrivate =
    "127.0.0.0/8 10.0.0.0/8 172.16.0.0/12 192.168.0.0/16 169.254.0.0/16 ::1 fc00::/7 fe80::/10";
constexpr std::string_view kSeparators = " ,;\t\r\n";

std::optional<unsigned> numberOf(std::string_view text, int base, unsigned highest) {
    unsigned value = 0;
    const char* const end = text.data() + text.size();
    const auto result = std::from_chars(text.data(), end, value, base);
    if (text.empty() || text.size() > 4 || result.ec != std::errc() || result.ptr != end ||
        value > highest)
        return std::nullopt;
    return value;
}

std::optional<std::array<std::uint8_t, 4>> oldKind(std::string_view text) {
    std::array<std::uint8_t, 4> bytes{};
    for (std::size_t i = 0; i < bytes.size(); ++i) {
        const bool last = i + 1 == bytes.size();
        const auto dot = last ? text.size() : text.find('.');
        if (dot == std::string_view::npos) return std::nullopt;
        const auto number = numberOf(text.substr(0, dot), 10, 255);
        if (!number) return std::nullopt;
        bytes.at(i) = static_cast<std::uint8_t>(*number);
        text.remove_prefix(last ? dot : dot + 1);
    }
    return bytes;
}

/// Groups between colons, the last perhaps an address of the old kind.
bool readGroups(std::string_view text, std::vector<std::uint8_t>& bytes) {
    while (!text.empty()) {
        const auto colon = text.find(':');
        const std::string_view group = text.substr(0, colon);
        if (colon == std::string_view::npos && group.find('.') != std::string_view::npos) {
            const auto old = oldKind(group);
            if (!old) return false;
            bytes.insert(bytes.end(), old->begin(), old->end());
            return true;
        }
        const auto number = numberOf(group, 16, 0xFFFF);
        if (!number || bytes.size() > 16) return false;
        bytes.push_back(static_cast<std::uint8_t>(*number >> 8U));
        bytes.push_back(static_cast<std::uint8_t>(*number & 0xFFU));
        if (colon == std::string_view::npos) return true;
        text.remove_prefix(colon + 1);
        if (text.empty()) return false;  // a colon at the end
    }
    return true;
}

std::optional<InternetAddress> newKind(std::string_view text) {
    std::vector<std::uint8_t> head;
    std::vector<std::uint8_t> tail;
    const auto gap = text.find("::");
    if (!readGroups(text.substr(0, gap), head)) return std::nullopt;
    if (gap != std::string_view::npos && !readGroups(text.substr(gap + 2), tail))
        return std::nullopt;
    const std::size_t size = head.size() + tail.size();
    if (gap == std::string_view::npos ? size != 16 : size > 14) return std::nullopt;
    InternetAddress address{};
    std::copy(head.begin(), head.end(), address.begin());
    std::copy_backward(tail.begin(), tail.end(), address.end());
    return address;
}

}  // namespace

std::optional<InternetAddress> internetAddressOf(std::string_view text) {
    text = text.substr(0, text.find('%'));  // the link that the address belongs to
    if (text.find(':') != std::string_view::npos) return newKind(text);
    const auto old = oldKind(text);
    if (!old) return std::nullopt;
    InternetAddress address{};
    address[10] = address[11] = 0xFF;
    std::copy(old->begin(), old->end(), address.begin() + 12);
    return address;
}

bool Network::holds(const InternetAddress& other) const {
    for (int bit = 0; bit < bits; ++bit) {
        const auto at = static_cast<std::size_t>(bit / 8);
        const auto mask = static_cast<std::uint8_t>(0x80U >> static_cast<unsigned>(bit % 8));
        if ((address.at(at) & mask) != (other.at(at) & mask)) return false;
    }
    return true;
}

std::optional<Network> networkOf(std::string_view text) {
    const auto slash = text.find('/');
    const std::string_view head = text.substr(0, slash);
    const auto address = internetAddressOf(head);
    if (!address) return std::nullopt;
    Network network{*address};
    if (slash == std::string_view::npos) return network;
    const bool old = head.find(':') == std::string_view::npos;
    const auto bits = numberOf(text.substr(slash + 1), 10, old ? 32 : 128);
    if (!bits) return std::nullopt;
    network.bits = static_cast<int>(*bits) + (old ? kOldKindBits : 0);
    return network;
}

std::optional<std::vector<Network>> networksOf(std::string_view text) {
    std::vector<Network> networks;
    for (;;) {
        const auto begin = text.find_first_not_of(kSeparators);
        if (begin == std::string_view::npos) break;
        text.remove_prefix(begin);
        const auto end = std::min(text.find_first_of(kSeparators), text.size());
        const auto network = networkOf(text.substr(0, end));
        if (!network || networks.size() == kMostNetworks) return std::nullopt;
        networks.push_back(*network);
        text.remove_prefix(end);
    }
    if (networks.empty()) return networksOf(kPrivate);
    return networks;
}

bool mayConnect(const std::vector<Network>& networks, std::string_view address) {
    const auto known = internetAddressOf(address);
    return known && std::any_of(networks.begin(), networks.end(),
                                [&](const Network& network) { return network.holds(*known); });
}

}  // namespace zel
