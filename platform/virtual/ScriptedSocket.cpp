#include "platform/virtual/ScriptedSocket.h"

#include <string>
#include <string_view>

#include "platform/Events.h"
#include "platform/Socket.h"

namespace zel {

ScriptedSocket::ScriptedSocket(Events& events) : events_(events), script_(events) {
    script_.deliver = [this](const std::string& bytes) { arrive(bytes); };
    script_.died = [this] { peerCloses(); };
}

ScriptedSocket::~ScriptedSocket() { events_.cancel(task_); }

void ScriptedSocket::connectsTo(SocketState end, int ms) {
    end_ = end;
    endMs_ = ms;
}

void ScriptedSocket::arrive(const std::string& bytes) {
    if (state_ != SocketState::Connected) return;
    waiting_ += bytes;
    DataArrival();
}

void ScriptedSocket::peerCloses() {
    if (state_ != SocketState::Connected) return;
    state_ = SocketState::PeerClosing;
    script_.closed();
    PeerClosed();
}

void ScriptedSocket::connectTo(const std::string& host, int port) {
    close();
    host_ = host;
    port_ = port;
    state_ = SocketState::Connecting;
    if (end_ == SocketState::Connecting) return;
    task_ = events_.schedule(endMs_, [this] {
        state_ = end_;
        if (state_ == SocketState::Connected) begin();
    });
}

void ScriptedSocket::connectTls(const std::string& host, int port, const std::string& pinned) {
    connectTo(host, port);
    pinned_ = pinned;
    tls_ = true;
}

void ScriptedSocket::close() {
    events_.cancel(task_);
    script_.closed();
    waiting_.clear();
    tls_ = false;
    backlog_ = 0;
    state_ = SocketState::Closed;
}

bool ScriptedSocket::sendData(std::string_view bytes) {
    if (state_ != SocketState::Connected) return false;
    script_.sent(bytes);
    return true;
}

void ScriptedSocket::begin() {
    state_ = SocketState::Connected;
    waiting_.clear();
    script_.opened();
}

}  // namespace zel
