#pragma once
// A TCP socket of the computer, client or server side.

#include <QTcpServer>
#include <QTcpSocket>
#include <map>
#include <memory>

#include "desktop/platform/QtEvents.h"
#include "platform/Socket.h"

namespace zel {

class QtSocket : public Socket {
  public:
    explicit QtSocket(QtEvents& events);
    ~QtSocket() override;

    void connectTo(const std::string& host, int port) override;
    void listen(int port) override;
    void accept(int requestId) override;
    void close() override;
    SocketState state() const override;
    bool sendData(std::string_view bytes) override;
    std::string peekData() override;
    std::string getData() override;
    std::string localIP() const override;
    std::string problem() const override { return problem_; }

  private:
    void adopt(QTcpSocket* socket);
    void fetch();

    QtEvents& events_;
    QTcpServer server_;
    std::unique_ptr<QTcpSocket> socket_;
    std::map<int, QTcpSocket*> requests_;
    int lastRequest_ = 0;
    bool failed_ = false;
    std::string problem_;  ///< of the failure
    bool peerClosed_ = false;
    int source_ = 0;
};

}  // namespace zel
