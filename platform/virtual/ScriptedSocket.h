#pragma once
// A TCP socket whose far end is a script.

#include <string>
#include <string_view>

#include "platform/Events.h"
#include "platform/Socket.h"
#include "platform/virtual/Dialogue.h"

namespace zel {

/// Data arrive inside a pump or a wait, with their event. A connection succeeds at the next pump
/// unless set otherwise.
class ScriptedSocket : public Socket {
  public:
    explicit ScriptedSocket(Events& events);
    ~ScriptedSocket() override;
    ScriptedSocket(const ScriptedSocket&) = delete;
    ScriptedSocket& operator=(const ScriptedSocket&) = delete;

    Dialogue& expect(std::string bytes) { return script_.expect(std::move(bytes)); }
    Dialogue& script() { return script_; }

    /// The next connections end in that state after `ms`; `Connecting` never ends.
    void connectsTo(SocketState end, int ms = 0);
    /// A client knocks at a listening socket, at the next pump.
    void knock(int requestId);
    /// The far end sends.
    void arrive(const std::string& bytes);
    /// The far end closes.
    void peerCloses();
    /// What the platform says about a connection that ends in Error.
    void setProblem(std::string problem) { problem_ = std::move(problem); }
    void setState(SocketState state) { state_ = state; }
    void setLocalIP(std::string address) { localIP_ = std::move(address); }

    const std::string& failure() const { return script_.failure(); }
    std::string leftOver() const { return script_.leftOver(); }
    const std::string& written() const { return script_.written(); }
    const std::string& host() const { return host_; }
    int port() const { return port_; }  ///< of the last `connectTo` or `listen`

    void connectTo(const std::string& host, int port) override;
    void listen(int port) override;
    void accept(int requestId) override;
    void close() override;
    SocketState state() const override { return state_; }
    bool sendData(std::string_view bytes) override;
    std::string peekData() override { return waiting_; }
    std::string getData() override { return std::exchange(waiting_, {}); }
    std::string localIP() const override { return localIP_; }
    std::string problem() const override { return problem_; }

  private:
    void begin();

    Events& events_;
    Dialogue script_;
    SocketState state_ = SocketState::Closed;
    SocketState end_ = SocketState::Connected;
    int endMs_ = 0;
    TaskId task_ = 0;
    std::string waiting_;
    std::string host_;
    int port_ = 0;
    std::string problem_;
    std::string localIP_ = "127.0.0.1";
};

}  // namespace zel
