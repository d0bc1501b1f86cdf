#pragma once
// One TCP socket, client or server side, that keeps what arrived until it is taken.

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
    virtual void listen(int port) = 0;
    /// Takes the waiting request of that number over as this socket's connection.
    virtual void accept(int requestId) = 0;
    virtual void close() = 0;
    virtual SocketState state() const = 0;
    /// False when the socket is not connected.
    virtual bool sendData(std::string_view bytes) = 0;
    /// Copies what waits without taking it.
    virtual std::string peekData() = 0;
    virtual std::string getData() = 0;
    virtual std::string localIP() const = 0;
    /// Why the socket is in the state Error, for a user; empty when nothing is known.
    virtual std::string problem() const { return {}; }

    Event<> DataArrival;
    Event<int> ConnectionRequest;
    Event<> PeerClosed;
};

}  // namespace zel
