#include "desktop/windows/RecentConnections.h"

#include <algorithm>
#include <cstddef>
#include <string>
#include <vector>

#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "platform/LinkAddress.h"
#include "platform/Services.h"
#include "support/NumberText.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr std::size_t kMost = 3;
constexpr int kHighestPort = 65535;
constexpr const char* kApplication = "ZELRemote";
constexpr const char* kSection = "Desktop";

struct KindName {
    LinkAddress::Kind kind;
    const char* name;
    int highest;
};
constexpr KindName kKinds[] = {{LinkAddress::Kind::Serial, "serial", kFastestBaud},
                               {LinkAddress::Kind::Tcp, "tcp", kHighestPort},
                               {LinkAddress::Kind::Tls, "tls", kHighestPort}};

std::string keyOf(std::size_t place) { return "Connection" + std::to_string(place + 1); }

/// "serial|57600||/dev/ttyUSB0": the part that may hold any character is the last one.
std::string textOf(const LinkAddress& address) {
    for (const KindName& row : kKinds)
        if (row.kind == address.kind)
            return std::string(row.name) + "|" + std::to_string(address.number) + "|" +
                   address.pinned + "|" + address.port;
    return {};
}

bool readAddress(const std::string& text, LinkAddress& address) {
    const std::vector<std::string> parts = split(text, '|');
    if (parts.size() != 4 || parts[3].empty()) return false;
    for (const KindName& row : kKinds) {
        if (parts[0] != row.name) continue;
        const auto number = wholeNumber(parts[1], 1, row.highest);
        if (!number) return false;
        address = {row.kind, parts[3], *number, {}, parts[2]};
        return true;
    }
    return false;
}

}  // namespace

RecentConnections::RecentConnections(SettingsStore& settings) : settings_(settings) {
    for (std::size_t i = 0; i < kMost; ++i) {
        LinkAddress address;
        if (readAddress(settings_.get(kApplication, kSection, keyOf(i), ""), address))
            addresses_.push_back(address);
    }
}

void RecentConnections::add(const LinkAddress& address) {
    const std::string text = textOf(address);
    if (text.empty()) return;
    if (!addresses_.empty() && textOf(addresses_.front()) == text) return;
    addresses_.erase(std::remove_if(addresses_.begin(), addresses_.end(),
                                    [&](const LinkAddress& old) { return textOf(old) == text; }),
                     addresses_.end());
    addresses_.insert(addresses_.begin(), address);
    if (addresses_.size() > kMost) addresses_.resize(kMost);
    for (std::size_t i = 0; i < addresses_.size(); ++i)
        settings_.set(kApplication, kSection, keyOf(i), textOf(addresses_[i]));
}

QStringList RecentConnections::names() const {
    QStringList names;
    for (const LinkAddress& address : addresses_) {
        const QString port = QString::fromStdString(address.port);
        if (address.kind == LinkAddress::Kind::Serial) {
            names << QString("%1, %2 baud").arg(port).arg(address.number);
        } else {
            const bool tls = address.kind == LinkAddress::Kind::Tls;
            names << QString("%1:%2%3").arg(port).arg(address.number).arg(tls ? " (TLS)" : "");
        }
    }
    return names;
}

bool addressOf(const Forms& forms, LinkAddress& address) {
    using CF = ControllerForm;
    if (forms.controller.ConnectionState == CF::DIRECTCON) {
        const auto baud = wholeNumber(forms.main.BaudList.Text(), 1, kFastestBaud);
        address = {LinkAddress::Kind::Serial, forms.main.COMList.Text(), baud.value_or(0), {}, {}};
        return baud && !address.port.empty();
    }
    if (forms.controller.ConnectionState != CF::TCPCON) return false;
    const TCPConnectionForm& tcp = forms.tcpConnection;
    const auto port = wholeNumber(tcp.RemotePortTextBox.Text.get(), 1, kHighestPort);
    const bool tls = tcp.chkTls.Value();
    address = {tls ? LinkAddress::Kind::Tls : LinkAddress::Kind::Tcp,
               tcp.IPAdressTextBox.Text,
               port.value_or(0),
               {},
               tls ? tcp.FingerprintTextBox.Text.get() : std::string()};
    return port && !address.port.empty();
}

}  // namespace zel
