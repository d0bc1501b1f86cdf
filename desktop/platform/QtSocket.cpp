#include "desktop/platform/QtSocket.h"

#include <poll.h>

#include <QHostAddress>
#include <QNetworkInterface>

namespace zel {
namespace {

constexpr qint64 kMostBuffered = 1 << 20;
constexpr int kMostRequests = 16;

}  // namespace

QtSocket::QtSocket(QtEvents& events) : events_(events) {
    QObject::connect(&server_, &QTcpServer::newConnection, &server_, [this] {
        while (QTcpSocket* waiting = server_.nextPendingConnection()) {
            if (requests_.size() >= kMostRequests) {
                waiting->deleteLater();
                continue;
            }
            requests_[++lastRequest_] = waiting;
            ConnectionRequest(lastRequest_);
        }
    });
    source_ = events_.addSource(
        {[this] {
             const bool connected = socket_ && socket_->state() == QAbstractSocket::ConnectedState;
             return connected ? static_cast<int>(socket_->socketDescriptor()) : -1;
         },
         [this] { return socket_ && socket_->bytesAvailable() > 0; }});
}

QtSocket::~QtSocket() {
    events_.removeSource(source_);
    server_.disconnect();
    if (socket_) socket_->disconnect();
}

void QtSocket::adopt(QTcpSocket* socket) {
    socket_.reset(socket);
    socket_->setParent(nullptr);
    socket_->setReadBufferSize(kMostBuffered);
    QObject::connect(socket, &QTcpSocket::readyRead, socket, [this] { DataArrival(); });
    QObject::connect(socket, &QTcpSocket::connected, socket,
                     [socket] { socket->setSocketOption(QAbstractSocket::LowDelayOption, 1); });
    QObject::connect(socket, &QTcpSocket::disconnected, socket, [this] {
        peerClosed_ = true;
        PeerClosed();
    });
    QObject::connect(socket, &QTcpSocket::errorOccurred, socket,
                     [this](QAbstractSocket::SocketError error) {
                         if (error == QAbstractSocket::SocketTimeoutError) return;
                         if (error == QAbstractSocket::RemoteHostClosedError) {
                             peerClosed_ = true;
                         } else {
                             failed_ = true;
                             problem_ = socket_->errorString().toStdString();
                         }
                     });
}

void QtSocket::connectTo(const std::string& host, int port) {
    close();
    adopt(new QTcpSocket);
    socket_->connectToHost(QString::fromStdString(host), static_cast<quint16>(port));
}

void QtSocket::listen(int port) {
    failed_ = false;
    if (!server_.listen(QHostAddress::Any, static_cast<quint16>(port))) failed_ = true;
}

void QtSocket::accept(int requestId) {
    const auto found = requests_.find(requestId);
    if (found == requests_.end()) return;
    failed_ = peerClosed_ = false;
    adopt(found->second);
    socket_->setSocketOption(QAbstractSocket::LowDelayOption, 1);
    requests_.erase(found);
}

void QtSocket::close() {
    if (socket_) {
        socket_->disconnect();
        socket_->flush();
        socket_->disconnectFromHost();
        socket_.release()->deleteLater();
    }
    server_.close();
    failed_ = peerClosed_ = false;
    problem_.clear();
}

SocketState QtSocket::state() const {
    if (failed_) return SocketState::Error;
    if (socket_) {
        switch (socket_->state()) {
            case QAbstractSocket::ConnectedState:
                return SocketState::Connected;
            case QAbstractSocket::HostLookupState:
            case QAbstractSocket::ConnectingState:
                return SocketState::Connecting;
            case QAbstractSocket::ClosingState:
                return SocketState::PeerClosing;
            default:
                return peerClosed_ ? SocketState::PeerClosing : SocketState::Closed;
        }
    }
    return server_.isListening() ? SocketState::Listening : SocketState::Closed;
}

bool QtSocket::sendData(std::string_view bytes) {
    if (!socket_ || socket_->state() != QAbstractSocket::ConnectedState) return false;
    socket_->write(bytes.data(), static_cast<qint64>(bytes.size()));
    socket_->flush();
    return true;
}

void QtSocket::fetch() {
    if (!socket_ || socket_->bytesAvailable() > 0) return;
    if (socket_->state() != QAbstractSocket::ConnectedState) return;
    pollfd descriptor{static_cast<int>(socket_->socketDescriptor()), POLLIN, 0};
    if (::poll(&descriptor, 1, 0) > 0) socket_->waitForReadyRead(1);
}

std::string QtSocket::peekData() {
    fetch();
    return socket_ ? socket_->peek(kMostBuffered).toStdString() : std::string();
}

std::string QtSocket::getData() {
    fetch();
    return socket_ ? socket_->readAll().toStdString() : std::string();
}

std::string QtSocket::localIP() const {
    for (const QHostAddress& address : QNetworkInterface::allAddresses())
        if (!address.isLoopback() && address.protocol() == QAbstractSocket::IPv4Protocol)
            return address.toString().toStdString();
    return "127.0.0.1";
}

}  // namespace zel
