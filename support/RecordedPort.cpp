#include "support/RecordedPort.h"

#include <string>
#include <string_view>
#include <utility>

#include "platform/SerialPort.h"
#include "platform/Socket.h"
#include "support/SessionLog.h"
#include "support/Text.h"

namespace zel {

RecordedPort::RecordedPort(SerialPort& port, SessionLog& log) : port_(port), log_(log) {
    handlers_.on(port_.OnComm, [this](int code) { OnComm(code); });
}

bool RecordedPort::open(const SerialSetup& setup) {
    if (std::exchange(recorded_, false)) log_.closed();
    if (!port_.open(setup)) return false;
    recorded_ = true;
    const bool simulated = !setup.CommPort.empty() && setup.CommPort == log_.simulatorPort;
    log_.opened(simulated ? "sim:"
                          : "serial:" + setup.CommPort + "@" + split(setup.Settings, ',').front());
    return true;
}

void RecordedPort::close() {
    port_.close();
    if (std::exchange(recorded_, false)) log_.closed();
}

std::string RecordedPort::input() {
    std::string bytes = port_.input();
    log_.came(bytes);
    return bytes;
}

void RecordedPort::output(std::string_view bytes) {
    if (port_.isOpen()) log_.sent(bytes);
    port_.output(bytes);
}

RecordedSocket::RecordedSocket(Socket& socket, SessionLog& log) : socket_(socket), log_(log) {
    handlers_.on(socket_.DataArrival, [this] { DataArrival(); });
    handlers_.on(socket_.PeerClosed, [this] { PeerClosed(); });
}

void RecordedSocket::reachFor(const std::string& scheme, const std::string& host, int port) {
    if (std::exchange(recorded_, false)) log_.closed();
    const std::string name = contains(host, ":") ? "[" + host + "]" : host;
    address_ = scheme + ":" + name + ":" + std::to_string(port);
}

/// A server that refuses was never open: the first byte shows that the socket is.
void RecordedSocket::noteOpen() {
    if (!std::exchange(recorded_, true)) log_.opened(address_);
}

void RecordedSocket::connectTo(const std::string& host, int port) {
    reachFor("tcp", host, port);
    socket_.connectTo(host, port);
}

void RecordedSocket::connectTls(const std::string& host, int port, const std::string& pinned) {
    reachFor("tls", host, port);
    socket_.connectTls(host, port, pinned);
}

void RecordedSocket::close() {
    socket_.close();
    if (std::exchange(recorded_, false)) log_.closed();
}

bool RecordedSocket::sendData(std::string_view bytes) {
    const bool taken = socket_.sendData(bytes);
    if (taken) {
        noteOpen();
        log_.sent(bytes);
    }
    return taken;
}

std::string RecordedSocket::getData() {
    std::string bytes = socket_.getData();
    if (!bytes.empty()) noteOpen();
    log_.came(bytes);
    return bytes;
}

}  // namespace zel
