#pragma once
// The connections that were made last, as the settings keep them.

#include <QStringList>
#include <vector>

#include "forms/Forms.h"
#include "platform/LinkAddress.h"
#include "platform/Services.h"

namespace zel {

class RecentConnections {
  public:
    explicit RecentConnections(SettingsStore& settings);

    /// Puts an address at the top. Dialled ones are not kept: they need their profile.
    void add(const LinkAddress& address);
    const std::vector<LinkAddress>& addresses() const { return addresses_; }
    /// "/dev/ttyUSB0, 57600 baud", "host:2277", "host:2277 (TLS)".
    QStringList names() const;

  private:
    SettingsStore& settings_;
    std::vector<LinkAddress> addresses_;
};

/// Where the session of the forms goes; nothing for a dialled link.
bool addressOf(const Forms& forms, LinkAddress& address);

}  // namespace zel
