#pragma once
// A TCP socket whose far end is a script.

#include <cstddef>
#include <string>
#include <string_view>
#include <utility>

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
    /// The far end sends.
    void arrive(const std::string& bytes);
    /// The far end closes.
    void peerCloses();
    /// What the platform says about a connection that ends in Error.
    void setProblem(std::string problem) { problem_ = std::move(problem); }
    void setState(SocketState state) { state_ = state; }
    /// A server let this connection in.
    void begin();
    /// What the far end has not taken.
    void setBacklog(std::size_t bytes) { backlog_ = bytes; }

    const std::string& failure() const { return script_.failure(); }
    std::string leftOver() const { return script_.leftOver(); }
    const std::string& written() const { return script_.written(); }
    const std::string& host() const { return host_; }
    int port() const { return port_; }
    const std::string& pinned() const { return pinned_; }
    bool tls() const { return tls_; }

    void connectTo(const std::string& host, int port) override;
    void connectTls(const std::string& host, int port, const std::string& pinned) override;
    void close() override;
    SocketState state() const override { return state_; }
    bool sendData(std::string_view bytes) override;
    std::string peekData() override { return waiting_; }
    std::string getData() override { return std::exchange(waiting_, {}); }
    std::size_t bytesToWrite() const override { return backlog_; }
    std::string problem() const override { return problem_; }

  private:
    Events& events_;
    Dialogue script_;
    SocketState state_ = SocketState::Closed;
    SocketState end_ = SocketState::Connected;
    int endMs_ = 0;
    TaskId task_ = 0;
    std::string waiting_;
    std::string host_;
    int port_ = 0;
    std::string pinned_;
    bool tls_ = false;
    std::size_t backlog_ = 0;
    std::string problem_;
};

}  // namespace zel
