#pragma once
// The sockets of the program, made when they are first used.

#include <cstddef>
#include <memory>
#include <string>
#include <string_view>

#include "desktop/platform/ArrivalSources.h"
#include "platform/ServerSocket.h"
#include "platform/Socket.h"

namespace zel {

/// Hands all on to a socket that comes later. Closed before; in error when it cannot be made.
class LateSocket : public Socket {
  public:
    /// Makes its socket when it is to connect.
    explicit LateSocket(ArrivalSources& events) : events_(&events) {}
    /// Waits for `forwardTo` to name one.
    LateSocket() = default;
    ~LateSocket() override;

    void connectTo(const std::string& host, int port) override;
    void connectTls(const std::string& host, int port, const std::string& pinned) override;
    void close() override;
    SocketState state() const override;
    bool sendData(std::string_view bytes) override;
    std::string peekData() override;
    std::string getData() override;
    std::size_t bytesToWrite() const override;
    std::string problem() const override;

    /// The socket that all goes to from now on. It outlives this one's last use.
    void forwardTo(Socket& socket);

  private:
    bool made();

    ArrivalSources* events_ = nullptr;
    std::unique_ptr<Socket> own_;
    Socket* socket_ = nullptr;
    std::string problem_;  ///< of the making
};

/// The same for the port that listens.
class LateServerSocket : public ServerSocket {
  public:
    explicit LateServerSocket(ArrivalSources& events) : events_(events) {}
    ~LateServerSocket() override;

    void listen(const std::string& address, int port) override;
    void close() override;
    SocketState state() const override;
    int port() const override;
    std::string problem() const override;
    std::string localIP() const override;
    std::string useTls(const TlsFiles& files) override;
    std::string peer(int requestId) const override;
    void accept(int requestId) override;
    void refuse(int requestId) override;
    Socket& client() override { return client_; }
    bool prove(int requestId) override;

  private:
    ServerSocket* made() const;

    ArrivalSources& events_;
    // Made by questions too: the address of the machine is one.
    mutable std::unique_ptr<ServerSocket> socket_;
    mutable LateSocket client_;
    mutable std::string problem_;
};

}  // namespace zel
