#pragma once
// A TCP connection of the computer, in the clear or over TLS.

#include <QTcpSocket>
#include <cstddef>
#include <memory>
#include <string>
#include <string_view>

#include "desktop/platform/ArrivalSources.h"
#include "platform/Socket.h"

class QSslSocket;

namespace zel {

class QtSocket : public Socket {
  public:
    /// A `quick` socket wakes a wait on the short way, for loops that take the data themselves.
    explicit QtSocket(ArrivalSources& events, bool quick = true);
    ~QtSocket() override;

    void connectTo(const std::string& host, int port) override;
    void connectTls(const std::string& host, int port, const std::string& pinned) override;
    void close() override;
    SocketState state() const override;
    bool sendData(std::string_view bytes) override;
    std::string peekData() override;
    std::string getData() override;
    std::size_t bytesToWrite() const override;
    std::string problem() const override { return problem_; }
    /// A connection that a server has taken.
    void letIn(QTcpSocket* socket);

  private:
    void adopt(QTcpSocket* socket);
    void judgeCertificate(QSslSocket& socket, const std::string& pinned);
    void brokeBy(QAbstractSocket::SocketError error, const QTcpSocket& socket);
    void fetch();
    bool usable() const;

    ArrivalSources& events_;
    std::unique_ptr<QTcpSocket> socket_;
    QSslSocket* secured_ = nullptr;  ///< the same, where it is TLS
    bool failed_ = false;
    std::string problem_;  ///< of the failure
    bool peerClosed_ = false;
    bool received_ = false;   ///< anything since the connection stands
    bool clientEnd_ = false;  ///< of a TLS connection
    int source_ = 0;
};

}  // namespace zel
