#pragma once
// A serial port and a socket whose bytes and events go into the session log.

#include <cstddef>
#include <string>
#include <string_view>

#include "platform/Event.h"
#include "platform/SerialPort.h"
#include "platform/Socket.h"
#include "support/SessionLog.h"

namespace zel {

class RecordedPort : public SerialPort {
  public:
    RecordedPort(SerialPort& port, SessionLog& log);

    bool open(const SerialSetup& setup) override;
    void close() override;
    bool isOpen() const override { return port_.isOpen(); }
    std::string input() override;
    void output(std::string_view bytes) override;
    std::string problem() const override { return port_.problem(); }
    std::size_t bytesToWrite() const override { return port_.bytesToWrite(); }

  private:
    SerialPort& port_;
    SessionLog& log_;
    bool recorded_ = false;  ///< its opening is in the log
    Handlers handlers_;
};

class RecordedSocket : public Socket {
  public:
    RecordedSocket(Socket& socket, SessionLog& log);

    void connectTo(const std::string& host, int port) override;
    void connectTls(const std::string& host, int port, const std::string& pinned) override;
    void close() override;
    SocketState state() const override { return socket_.state(); }
    bool sendData(std::string_view bytes) override;
    std::string peekData() override { return socket_.peekData(); }
    std::string getData() override;
    std::size_t bytesToWrite() const override { return socket_.bytesToWrite(); }
    std::string problem() const override { return socket_.problem(); }

  private:
    void reachFor(const std::string& scheme, const std::string& host, int port);
    void noteOpen();

    Socket& socket_;
    SessionLog& log_;
    std::string address_;    ///< that the socket reaches for
    bool recorded_ = false;  ///< its opening is in the log
    Handlers handlers_;
};

}  // namespace zel
