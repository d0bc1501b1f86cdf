#pragma once
// One TCP connection that keeps what arrived until it is taken.

#include <cstddef>
#include <string>
#include <string_view>

#include "platform/Event.h"

namespace zel {

enum class SocketState : int {
    Closed = 0,
    Open = 1,
    Listening = 2,
    Connecting = 6,
    Connected = 7,
    PeerClosing = 8,
    Error = 9,
};

class Socket {
  public:
    virtual ~Socket() = default;
    virtual void connectTo(const std::string& host, int port) = 0;
    /// The same over TLS. The server's certificate has to have the SHA-256 fingerprint `pinned`
    /// (64 hex digits in lower case), or where that is empty a known authority.
    virtual void connectTls(const std::string& host, int port, const std::string& pinned) = 0;
    virtual void close() = 0;
    virtual SocketState state() const = 0;
    /// False when the socket is not connected.
    virtual bool sendData(std::string_view bytes) = 0;
    /// Copies what waits without taking it.
    virtual std::string peekData() = 0;
    virtual std::string getData() = 0;
    /// Bytes that were sent and still wait for the far end to take them.
    virtual std::size_t bytesToWrite() const = 0;
    /// Why the connection failed, for a user; empty while nothing has.
    virtual std::string problem() const = 0;

    Event<> DataArrival;
    Event<> PeerClosed;
};

}  // namespace zel
