#pragma once
// Thin routines over a socket, each guarded by the socket's state.

#include <string>

#include "platform/Socket.h"

namespace zel {

/// Listens on the local port whose number leads the text.
void ListenOnPort(Socket& socket, const std::string& portText);
void CloseIfOpen(Socket& socket);
void CloseIfNotClosed(Socket& socket);
/// Takes a request over, closing what the socket held before.
void AcceptRequest(Socket& socket, int requestId);
/// All that has arrived.
void TakeSocketData(std::string& result, Socket& socket);
/// Sends when connected, else drops.
void SendSocketText(Socket& socket, const std::string& data);
void SendSocketBytes(Socket& socket, const std::string& bytes);

}  // namespace zel
