#include "support/RecordedPort.h"

#include <utility>

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

void RecordedSocket::opened(const std::string& scheme, const std::string& host, int port) {
    if (recorded_) log_.closed();
    recorded_ = true;
    const std::string name = contains(host, ":") ? "[" + host + "]" : host;
    log_.opened(scheme + ":" + name + ":" + std::to_string(port));
}

void RecordedSocket::connectTo(const std::string& host, int port) {
    opened("tcp", host, port);
    socket_.connectTo(host, port);
}

void RecordedSocket::connectTls(const std::string& host, int port, const std::string& pinned) {
    opened("tls", host, port);
    socket_.connectTls(host, port, pinned);
}

void RecordedSocket::close() {
    socket_.close();
    if (std::exchange(recorded_, false)) log_.closed();
}

bool RecordedSocket::sendData(std::string_view bytes) {
    const bool taken = socket_.sendData(bytes);
    if (taken) log_.sent(bytes);
    return taken;
}

std::string RecordedSocket::getData() {
    std::string bytes = socket_.getData();
    log_.came(bytes);
    return bytes;
}

}  // namespace zel
