#include "desktop/platform/LateSocket.h"

#include <cstddef>
#include <memory>
#include <string>
#include <string_view>

#include "desktop/platform/ArrivalSources.h"
#include "desktop/platform/LateLibrary.h"
#include "desktop/platform/SocketParts.h"
#include "platform/ServerSocket.h"
#include "platform/Socket.h"

namespace zel {
namespace {

constexpr const char* kLibrary = "zelremote-network";

const SocketParts* parts = nullptr;

/// Null when the library cannot be loaded; `problem` then says why.
const SocketParts* loadedParts(std::string& problem) {
    problem.clear();
    if (parts != nullptr) return parts;
    if (const auto found = lateFunction(kLibrary, "zelSocketParts", problem))
        parts = reinterpret_cast<decltype(&zelSocketParts)>(found)();
    return parts;
}

}  // namespace

void haveSocketParts(const SocketParts& own) { parts = &own; }

LateSocket::~LateSocket() = default;

void LateSocket::forwardTo(Socket& socket) {
    socket_ = &socket;
    socket.DataArrival.connect([this] { DataArrival(); });
    socket.PeerClosed.connect([this] { PeerClosed(); });
}

bool LateSocket::made() {
    if (socket_ != nullptr) return true;
    if (events_ == nullptr) return false;
    if (const SocketParts* found = loadedParts(problem_)) {
        own_ = found->socket(*events_);
        forwardTo(*own_);
    }
    return socket_ != nullptr;
}

void LateSocket::connectTo(const std::string& host, int port) {
    if (made()) socket_->connectTo(host, port);
}

void LateSocket::connectTls(const std::string& host, int port, const std::string& pinned) {
    if (made()) socket_->connectTls(host, port, pinned);
}

void LateSocket::close() {
    problem_.clear();
    if (socket_ != nullptr) socket_->close();
}

SocketState LateSocket::state() const {
    if (socket_ != nullptr) return socket_->state();
    return problem_.empty() ? SocketState::Closed : SocketState::Error;
}

bool LateSocket::sendData(std::string_view bytes) {
    return socket_ != nullptr && socket_->sendData(bytes);
}

std::string LateSocket::peekData() {
    return socket_ != nullptr ? socket_->peekData() : std::string();
}

std::string LateSocket::getData() {
    return socket_ != nullptr ? socket_->getData() : std::string();
}

std::size_t LateSocket::bytesToWrite() const {
    return socket_ != nullptr ? socket_->bytesToWrite() : 0;
}

std::string LateSocket::problem() const {
    return socket_ != nullptr ? socket_->problem() : problem_;
}

LateServerSocket::~LateServerSocket() = default;

ServerSocket* LateServerSocket::made() const {
    if (socket_) return socket_.get();
    if (const SocketParts* found = loadedParts(problem_)) {
        socket_ = found->serverSocket(events_);
        client_.forwardTo(socket_->client());
        socket_->ConnectionRequest.connect([this](int id) { ConnectionRequest(id); });
        socket_->ProofFailed.connect(
            [this](int id, const std::string& reason) { ProofFailed(id, reason); });
    }
    return socket_.get();
}

void LateServerSocket::listen(const std::string& address, int port) {
    if (ServerSocket* socket = made()) socket->listen(address, port);
}

void LateServerSocket::close() {
    problem_.clear();
    if (socket_) socket_->close();
}

SocketState LateServerSocket::state() const {
    if (socket_) return socket_->state();
    return problem_.empty() ? SocketState::Closed : SocketState::Error;
}

int LateServerSocket::port() const { return socket_ ? socket_->port() : 0; }

std::string LateServerSocket::problem() const { return socket_ ? socket_->problem() : problem_; }

std::string LateServerSocket::localIP() const {
    const ServerSocket* socket = made();
    return socket != nullptr ? socket->localIP() : "127.0.0.1";
}

std::string LateServerSocket::useTls(const TlsFiles& files) {
    ServerSocket* socket = made();
    return socket != nullptr ? socket->useTls(files) : problem_;
}

std::string LateServerSocket::peer(int requestId) const {
    return socket_ ? socket_->peer(requestId) : std::string();
}

void LateServerSocket::accept(int requestId) {
    if (socket_) socket_->accept(requestId);
}

void LateServerSocket::refuse(int requestId) {
    if (socket_) socket_->refuse(requestId);
}

bool LateServerSocket::prove(int requestId) { return socket_ && socket_->prove(requestId); }

}  // namespace zel
