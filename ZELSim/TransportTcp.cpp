#include "ZELSim/TransportTcp.h"

#include <netdb.h>
#include <netinet/in.h>
#include <netinet/tcp.h>
#include <sys/socket.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <cmath>
#include <cstring>
#include <memory>
#include <string>

#include "ZELSim/Numbers.h"

namespace zelsim {
namespace {

struct Place {
    std::string host;
    std::string port;
};

// "PORT", "ADDRESS:PORT" or "[ADDRESS]:PORT".
Place placeOf(const std::string& text) {
    const auto colon = text.rfind(':');
    if (colon == std::string::npos) {
        return {"127.0.0.1", text};
    }
    std::string host = text.substr(0, colon);
    if (host.size() >= 2 && host.front() == '[' && host.back() == ']') {
        host = host.substr(1, host.size() - 2);
    }
    return {host, text.substr(colon + 1)};
}

int listenAt(const addrinfo& address) {
    const int descriptor = socket(address.ai_family, SOCK_STREAM | SOCK_NONBLOCK | SOCK_CLOEXEC, 0);
    if (descriptor < 0) {
        return -1;
    }
    const int on = 1;
    setsockopt(descriptor, SOL_SOCKET, SO_REUSEADDR, &on, sizeof on);
    if (bind(descriptor, address.ai_addr, address.ai_addrlen) != 0 || listen(descriptor, 4) != 0) {
        const int reason = errno;
        close(descriptor);
        errno = reason;
        return -1;
    }
    return descriptor;
}

std::string ownAddress(int descriptor) {
    sockaddr_storage own{};
    socklen_t length = sizeof own;
    std::array<char, NI_MAXHOST> host{};
    std::array<char, NI_MAXSERV> port{};
    auto* generic = reinterpret_cast<sockaddr*>(&own);
    if (getsockname(descriptor, generic, &length) != 0 ||
        getnameinfo(generic, length, host.data(), host.size(), port.data(), port.size(),
                    NI_NUMERICHOST | NI_NUMERICSERV) != 0) {
        return {};
    }
    const bool six = own.ss_family == AF_INET6;
    return (six ? "[" : "") + std::string(host.data()) + (six ? "]:" : ":") + port.data();
}

}  // namespace

TcpEndpoint::~TcpEndpoint() {
    lost();
    if (listener_ >= 0) {
        close(listener_);
    }
}

bool TcpEndpoint::open(const std::string& place) {
    const Place wanted = placeOf(place);
    constexpr double highestPort = 65535;
    const auto port = parseNumber(wanted.port);
    if (!port || *port < 0 || *port > highestPort || *port != std::floor(*port)) {
        problem_ = place + ": not a port";
        return false;
    }
    addrinfo hints{};
    hints.ai_family = AF_UNSPEC;
    hints.ai_socktype = SOCK_STREAM;
    hints.ai_flags = AI_PASSIVE | AI_NUMERICSERV;
    addrinfo* list = nullptr;
    const int failed = getaddrinfo(wanted.host.empty() ? nullptr : wanted.host.c_str(),
                                   wanted.port.c_str(), &hints, &list);
    if (failed != 0) {
        problem_ = place + ": " + gai_strerror(failed);
        return false;
    }
    const std::unique_ptr<addrinfo, decltype(&freeaddrinfo)> owned(list, &freeaddrinfo);
    for (const addrinfo* address = list; address != nullptr && listener_ < 0;
         address = address->ai_next) {
        listener_ = listenAt(*address);
    }
    if (listener_ < 0) {
        problem_ = place + ": " + std::strerror(errno);
        return false;
    }
    address_ = ownAddress(listener_);
    return true;
}

bool TcpEndpoint::admit() {
    const int host = accept4(listener_, nullptr, nullptr, SOCK_NONBLOCK | SOCK_CLOEXEC);
    if (host < 0) {
        return false;
    }
    lost();
    host_ = host;
    const int on = 1;
    setsockopt(host_, IPPROTO_TCP, TCP_NODELAY, &on, sizeof on);
    return true;
}

void TcpEndpoint::lost() {
    if (host_ >= 0) {
        close(host_);
        host_ = -1;
    }
}

}  // namespace zelsim
