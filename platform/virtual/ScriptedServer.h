#pragma once
// A listening TCP port at which tests knock.

#include <map>
#include <set>
#include <string>
#include <utility>

#include "platform/Events.h"
#include "platform/ServerSocket.h"
#include "platform/Socket.h"
#include "platform/virtual/ScriptedSocket.h"

namespace zel {

class ScriptedServer : public ServerSocket {
  public:
    explicit ScriptedServer(Events& events) : events_(events), client_(events) {}
    ~ScriptedServer() override {
        for (const TaskId task : tasks_) events_.cancel(task);
    }
    ScriptedServer(const ScriptedServer&) = delete;
    ScriptedServer& operator=(const ScriptedServer&) = delete;

    /// Somebody knocks, at the next pump.
    void knock(int requestId, const std::string& peer = "127.0.0.1") {
        const auto task = events_.schedule(0, [this, requestId, peer] {
            if (state_ != SocketState::Listening) return;
            waiting_[requestId] = peer;
            ConnectionRequest(requestId);
        });
        tasks_.insert(task);
    }
    /// The next listens fail, with that reason.
    void failListen(std::string why) { failure_ = std::move(why); }
    /// Who knocks from now on has something to prove first.
    void wantProof() { wantsProof_ = true; }
    void givesProof(int requestId) {
        proved_.insert(requestId);
        ConnectionRequest(requestId);
    }
    void failsProof(int requestId, const std::string& reason) {
        ProofFailed(requestId, reason);
        refuse(requestId);
    }
    void setState(SocketState state) { state_ = state; }
    void setLocalIP(std::string address) { localIP_ = std::move(address); }
    /// The requests that were turned away.
    const std::set<int>& refused() const { return refused_; }
    const std::string& address() const { return address_; }
    ScriptedSocket& far() { return client_; }

    void listen(const std::string& address, int port) override {
        address_ = address;
        port_ = port;
        state_ = failure_.empty() ? SocketState::Listening : SocketState::Error;
    }
    void close() override {
        waiting_.clear();
        state_ = SocketState::Closed;
    }
    SocketState state() const override { return state_; }
    int port() const override { return port_; }
    std::string problem() const override { return failure_; }
    std::string localIP() const override { return localIP_; }
    std::string useTls(const TlsFiles&) override { return {}; }
    std::string peer(int requestId) const override {
        const auto found = waiting_.find(requestId);
        return found == waiting_.end() ? std::string() : found->second;
    }
    bool prove(int requestId) override { return wantsProof_ && !proved_.contains(requestId); }
    void accept(int requestId) override {
        if (waiting_.erase(requestId) == 0) return;
        client_.close();
        client_.begin();
    }
    void refuse(int requestId) override {
        if (waiting_.erase(requestId) > 0) refused_.insert(requestId);
    }
    Socket& client() override { return client_; }

  private:
    Events& events_;
    ScriptedSocket client_;
    SocketState state_ = SocketState::Closed;
    std::map<int, std::string> waiting_;
    std::set<int> refused_;
    std::set<int> proved_;
    bool wantsProof_ = false;
    std::set<TaskId> tasks_;
    std::string address_;
    int port_ = 0;
    std::string localIP_ = "127.0.0.1";
    std::string failure_;
};

}  // namespace zel
