#include "link/TCPIPOps.h"

#include <string>

#include "platform/ServerSocket.h"
#include "platform/Socket.h"
#include "support/NumberText.h"

namespace zel {
namespace {

constexpr double kHighestPort = 65535;

}  // namespace

void ListenOnPort(ServerSocket& socket, const std::string& portText, const std::string& address) {
    const double port = leadingNumber(portText);
    if (port < 0 || port > kHighestPort) return;
    socket.listen(address, static_cast<int>(port));
}

void CloseIfOpen(Socket& socket) {
    if (socket.state() == SocketState::Open) socket.close();
}

void CloseIfNotClosed(Socket& socket) {
    if (socket.state() != SocketState::Closed) socket.close();
}

void AcceptRequest(ServerSocket& socket, int requestId) {
    CloseIfNotClosed(socket.client());
    socket.accept(requestId);
}

void TakeSocketData(std::string& result, Socket& socket) { result = socket.getData(); }

void SendSocketText(Socket& socket, const std::string& data) {
    if (socket.state() == SocketState::Connected) socket.sendData(data);
}

void SendSocketBytes(Socket& socket, const std::string& bytes) { SendSocketText(socket, bytes); }

}  // namespace zel
