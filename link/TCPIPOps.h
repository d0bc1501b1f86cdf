#pragma once
// Thin routines over a socket, each guarded by the socket's state.

#include <string>

#include "platform/ServerSocket.h"
#include "platform/Socket.h"

namespace zel {

/// Listens on the local port whose number leads the text, at all addresses or at that one.
void ListenOnPort(ServerSocket& socket, const std::string& portText,
                  const std::string& address = {});
void CloseIfOpen(Socket& socket);
void CloseIfNotClosed(Socket& socket);
/// Makes the request the client, closing the connection of the client before.
void AcceptRequest(ServerSocket& socket, int requestId);
/// All that has arrived.
void TakeSocketData(std::string& result, Socket& socket);
/// Sends when connected, else drops.
void SendSocketText(Socket& socket, const std::string& data);
void SendSocketBytes(Socket& socket, const std::string& bytes);

}  // namespace zel
