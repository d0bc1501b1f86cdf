#pragma once
// What stands at the far end of a host's serial line: bytes in, bytes out when they are due.

#include <optional>
#include <string>
#include <string_view>

namespace zelsim {

/// All times are durations in seconds; nothing here looks at a clock.
class HostLine {
  public:
    virtual ~HostLine() = default;
    /// The host sends bytes now.
    virtual void receive(std::string_view bytes) = 0;
    /// Time passes.
    virtual void advance(double seconds) = 0;
    /// Takes the bytes that have reached the host by now.
    virtual std::string take() = 0;
    /// Seconds until `take` will have something (more), or the next look is worth while; nothing
    /// when only the host can set things going.
    virtual std::optional<double> nextDue() const = 0;
    /// The line was cut and made again: half a line and what was on its way are gone.
    virtual void reset() = 0;
    /// True while so much waits that the sender should pause.
    virtual bool congested() const = 0;
    /// The baud rate that the host's port is set to, 0 unknown.
    virtual void setHostBaud(int baud) = 0;
};

}  // namespace zelsim
