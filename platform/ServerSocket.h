#pragma once
// A TCP port that listens, and the one client that was let in.

#include <string>

#include "platform/Event.h"
#include "platform/Socket.h"

namespace zel {

/// Files in PEM form. With `clients`, a client must show a certificate of that authority.
struct TlsFiles {
    std::string certificate;
    std::string key;
    std::string clients = {};
};

/// Listening goes on while a client is at work; the two have a state each.
class ServerSocket {
  public:
    virtual ~ServerSocket() = default;
    /// Listens at the address, or with an empty one at all addresses, IPv6 too; port 0 takes any
    /// free one. The state is `Listening` then, or `Error`; `problem` says why.
    virtual void listen(const std::string& address, int port) = 0;
    /// Ends the listening and turns away who waits; the client stays.
    virtual void close() = 0;
    /// Closed, Listening or Error.
    virtual SocketState state() const = 0;
    virtual int port() const = 0;
    virtual std::string problem() const = 0;
    /// The machine's first address that is not a loopback, else 127.0.0.1.
    virtual std::string localIP() const = 0;
    /// From the next `listen` on connections are TLS. What is wrong with the files, else empty.
    virtual std::string useTls(const TlsFiles& files) = 0;

    /// The address from which that request comes; no names are looked up.
    virtual std::string peer(int requestId) const = 0;
    /// Makes the request the client; the former client's connection ends, with all that waited.
    virtual void accept(int requestId) = 0;
    /// Closes the request, with nothing read.
    virtual void refuse(int requestId) = 0;
    virtual Socket& client() = 0;

    /// What the request must prove before it is let in, such as its part of TLS, begins here: true,
    /// and `ConnectionRequest` comes once more when it is proved. False when there is nothing to
    /// prove, or it has been proved.
    virtual bool prove(int /*requestId*/) { return false; }

    Event<int> ConnectionRequest;
    /// The proof has failed, for that reason; the request is closed after this event.
    Event<int, const std::string&> ProofFailed;
};

}  // namespace zel
