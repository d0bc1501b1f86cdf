#pragma once
// The loop that carries bytes between the wire and one file descriptor, in real time.

#include "ZELSim/HostLine.h"

namespace zelsim {

/// Where hosts come from: a terminal that is always there, or connections that come and go.
class Endpoint {
  public:
    virtual ~Endpoint() = default;
    /// Descriptor of the line to the host, -1 while there is none.
    virtual int line() const = 0;
    /// Descriptor on which hosts ask to be let in, -1 where they do not ask.
    virtual int door() const = 0;
    /// A host asks; true when `line` is a new one now.
    virtual bool admit() = 0;
    /// The line broke or was closed by the host.
    virtual void lost() = 0;
    /// The baud rate that the host has set its port to, 0 where that is unknown.
    virtual int hostBaud() const = 0;
};

/// Blocks the signals that end the program but for the moments in which `serve` waits. To be
/// called once, before `serve`.
void catchEndSignals();
/// Serves the wire at the endpoint until SIGINT, SIGTERM or SIGHUP. False when waiting failed.
bool serve(HostLine& wire, Endpoint& endpoint);

}  // namespace zelsim
