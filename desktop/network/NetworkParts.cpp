// What the program finds in this library.

#include <memory>

#include "desktop/network/QtServerSocket.h"
#include "desktop/network/QtSocket.h"
#include "desktop/platform/ArrivalSources.h"
#include "desktop/platform/SocketParts.h"
#include "platform/ServerSocket.h"
#include "platform/Socket.h"

const zel::SocketParts* zelSocketParts() {
    static constexpr zel::SocketParts kParts{
        [](zel::ArrivalSources& events) -> std::unique_ptr<zel::Socket> {
            return std::make_unique<zel::QtSocket>(events);
        },
        [](zel::ArrivalSources& events) -> std::unique_ptr<zel::ServerSocket> {
            return std::make_unique<zel::QtServerSocket>(events);
        }};
    return &kParts;
}
