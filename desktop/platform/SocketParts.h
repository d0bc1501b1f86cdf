#pragma once
// What makes the sockets: a library of its own (`desktop/network`), loaded with the first socket
// that is used. Most sessions are over a serial line, and what TCP and TLS need takes as long to
// load as the program's own work until its window is painted takes.

#include <memory>

#include "desktop/platform/ArrivalSources.h"
#include "platform/ServerSocket.h"
#include "platform/Socket.h"

namespace zel {

struct SocketParts {
    std::unique_ptr<Socket> (*socket)(ArrivalSources& events);
    std::unique_ptr<ServerSocket> (*serverSocket)(ArrivalSources& events);
};

/// Programs that have the library inside name it here before the first socket is used.
void haveSocketParts(const SocketParts& parts);

}  // namespace zel

/// The one function of the library.
extern "C" __attribute__((visibility("default"))) const zel::SocketParts* zelSocketParts();
