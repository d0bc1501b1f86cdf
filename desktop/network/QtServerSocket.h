#pragma once
// A TCP port of the computer that listens, in the clear or over TLS.

#include <QSslConfiguration>
#include <QTcpServer>
#include <map>
#include <memory>
#include <optional>
#include <string>

#include "desktop/network/QtSocket.h"
#include "platform/ServerSocket.h"
#include "platform/Socket.h"

namespace zel {

class QtServerSocket : public ServerSocket {
  public:
    explicit QtServerSocket(ArrivalSources& events);
    ~QtServerSocket() override;

    void listen(const std::string& address, int port) override;
    void close() override;
    SocketState state() const override;
    int port() const override { return port_; }
    std::string problem() const override { return problem_; }
    std::string localIP() const override;
    std::string useTls(const TlsFiles& files) override;
    std::string peer(int requestId) const override;
    void accept(int requestId) override;
    void refuse(int requestId) override;
    Socket& client() override { return client_; }
    bool prove(int requestId) override;

  private:
    class Listener;
    enum class Proof { None, Running, Given };
    struct Request {
        QTcpSocket* socket;
        std::string peer;
        Proof proof = Proof::None;
    };
    void knocked(QTcpSocket* socket);
    QTcpSocket* take(int requestId);
    void proved(int requestId);
    void proofFailed(int requestId, const std::string& reason);

    std::unique_ptr<Listener> listener_;
    QtSocket client_;
    std::map<int, Request> requests_;
    int lastRequest_ = 0;
    int port_ = 0;
    bool failed_ = false;
    std::string problem_;
    /// There with TLS only: making one loads the libraries of TLS.
    std::optional<QSslConfiguration> configuration_;
};

}  // namespace zel
