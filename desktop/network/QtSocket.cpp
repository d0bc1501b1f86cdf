#include "desktop/network/QtSocket.h"

#include <netinet/in.h>
#include <netinet/tcp.h>
#include <poll.h>
#include <sys/socket.h>

#include <QSslCertificate>
#include <QSslConfiguration>
#include <QSslSocket>
#include <cstddef>
#include <string_view>

#include "desktop/network/Tls.h"
#include "platform/Socket.h"

namespace zel {
namespace {

constexpr qint64 kMostBuffered = 1 << 20;

/// A far end that has vanished without a word is noticed within about two minutes.
void keepAlive(QTcpSocket& socket) {
    socket.setSocketOption(QAbstractSocket::LowDelayOption, 1);
    socket.setSocketOption(QAbstractSocket::KeepAliveOption, 1);
    const auto descriptor = static_cast<int>(socket.socketDescriptor());
    const int idle = 60;
    const int between = 15;
    const int times = 4;
    ::setsockopt(descriptor, IPPROTO_TCP, TCP_KEEPIDLE, &idle, sizeof idle);
    ::setsockopt(descriptor, IPPROTO_TCP, TCP_KEEPINTVL, &between, sizeof between);
    ::setsockopt(descriptor, IPPROTO_TCP, TCP_KEEPCNT, &times, sizeof times);
}

}  // namespace

QtSocket::QtSocket(ArrivalSources& events, bool quick) : events_(events) {
    if (!quick) return;
    source_ = events_.addSource(
        {[this] {
             const bool connected = socket_ && socket_->state() == QAbstractSocket::ConnectedState;
             return connected ? static_cast<int>(socket_->socketDescriptor()) : -1;
         },
         [this] { return socket_ && socket_->bytesAvailable() > 0; }});
}

QtSocket::~QtSocket() {
    if (source_ != 0) events_.removeSource(source_);
    if (socket_) socket_->disconnect();
}

void QtSocket::adopt(QTcpSocket* socket) {
    socket_.reset(socket);
    secured_ = qobject_cast<QSslSocket*>(socket);
    socket_->setParent(nullptr);
    socket_->setReadBufferSize(kMostBuffered);
    QObject::connect(socket, &QTcpSocket::readyRead, socket, [this] {
        received_ = true;
        events_.bytesArrived(source_);
        DataArrival();
    });
    QObject::connect(socket, &QTcpSocket::connected, socket, [socket] { keepAlive(*socket); });
    QObject::connect(socket, &QTcpSocket::disconnected, socket, [this] {
        peerClosed_ = true;
        PeerClosed();
    });
    QObject::connect(
        socket, &QTcpSocket::errorOccurred, socket,
        [this, socket](QAbstractSocket::SocketError error) { brokeBy(error, *socket); });
}

void QtSocket::brokeBy(QAbstractSocket::SocketError error, const QTcpSocket& socket) {
    if (error == QAbstractSocket::SocketTimeoutError || failed_) return;
    const bool stood = secured_ != nullptr ? secured_->isEncrypted()
                                           : socket.state() != QAbstractSocket::ConnectingState;
    const bool peerClosed = error == QAbstractSocket::RemoteHostClosedError;
    // The server looks at the certificate of a client when that takes the connection to stand.
    if (secured_ != nullptr && stood && !received_ && clientEnd_) {
        failed_ = true;
        problem_ =
            "The server closed the connection after the TLS handshake. It may let in only "
            "clients that show a certificate of its authority.";
        return;
    }
    problem_ = secured_ != nullptr && !peerClosed ? tlsProblem(*secured_, secured_->peerName())
                                                  : socket.errorString().toStdString() + ".";
    // An end before the connection is a failure of it.
    failed_ = !(peerClosed && stood);
    peerClosed_ = !failed_;
}

void QtSocket::letIn(QTcpSocket* socket) {
    close();
    adopt(socket);
    keepAlive(*socket);
    // What came with the end of the handshake has no event of its own any more.
    if (socket->bytesAvailable() > 0)
        QMetaObject::invokeMethod(
            socket, [this] { DataArrival(); }, Qt::QueuedConnection);
}

void QtSocket::connectTo(const std::string& host, int port) {
    close();
    adopt(new QTcpSocket);
    socket_->connectToHost(QString::fromStdString(host), static_cast<quint16>(port));
}

void QtSocket::connectTls(const std::string& host, int port, const std::string& pinned) {
    close();
    QSslConfiguration configuration;
    problem_ = clientTls(configuration);
    if (!problem_.empty()) {
        failed_ = true;
        return;
    }
    auto* socket = new QSslSocket;
    adopt(socket);
    clientEnd_ = true;
    socket->setSslConfiguration(configuration);
    // A pinned certificate needs no authority; it is looked at when the connection stands.
    if (!pinned.empty()) socket->setPeerVerifyMode(QSslSocket::QueryPeer);
    QObject::connect(socket, &QSslSocket::encrypted, socket,
                     [this, socket, pinned] { judgeCertificate(*socket, pinned); });
    socket->connectToHostEncrypted(QString::fromStdString(host), static_cast<quint16>(port));
}

void QtSocket::judgeCertificate(QSslSocket& socket, const std::string& pinned) {
    if (pinned.empty()) return;
    const QByteArray digest = socket.peerCertificate().digest(QCryptographicHash::Sha256).toHex();
    if (digest.toStdString() == pinned) return;
    problem_ =
        "The server shows another certificate, with the fingerprint " + digest.toStdString() + ".";
    failed_ = true;
    socket.abort();
}

void QtSocket::close() {
    if (socket_) {
        socket_->disconnect();
        // Bytes that nobody takes must not keep the connection.
        if (socket_->bytesToWrite() > 0) socket_->flush();
        if (socket_->bytesToWrite() > 0) {
            socket_->abort();
        } else {
            socket_->disconnectFromHost();
        }
        socket_.release()->deleteLater();
    }
    secured_ = nullptr;
    failed_ = peerClosed_ = received_ = clientEnd_ = false;
    problem_.clear();
}

SocketState QtSocket::state() const {
    if (failed_) return SocketState::Error;
    if (!socket_) return SocketState::Closed;
    switch (socket_->state()) {
        case QAbstractSocket::ConnectedState:
            return usable() ? SocketState::Connected : SocketState::Connecting;
        case QAbstractSocket::HostLookupState:
        case QAbstractSocket::ConnectingState:
            return SocketState::Connecting;
        case QAbstractSocket::ClosingState:
            return SocketState::PeerClosing;
        default:
            return peerClosed_ ? SocketState::PeerClosing : SocketState::Closed;
    }
}

bool QtSocket::usable() const {
    return socket_ && socket_->state() == QAbstractSocket::ConnectedState &&
           (secured_ == nullptr || secured_->isEncrypted());
}

bool QtSocket::sendData(std::string_view bytes) {
    if (!usable()) return false;
    socket_->write(bytes.data(), static_cast<qint64>(bytes.size()));
    socket_->flush();
    return true;
}

std::size_t QtSocket::bytesToWrite() const {
    if (!socket_) return 0;
    const qint64 encrypted = secured_ != nullptr ? secured_->encryptedBytesToWrite() : 0;
    return static_cast<std::size_t>(socket_->bytesToWrite() + encrypted);
}

void QtSocket::fetch() {
    if (!usable() || socket_->bytesAvailable() > 0) return;
    pollfd descriptor{static_cast<int>(socket_->socketDescriptor()), POLLIN, 0};
    if (::poll(&descriptor, 1, 0) > 0) socket_->waitForReadyRead(1);
}

std::string QtSocket::peekData() {
    fetch();
    return socket_ ? socket_->peek(kMostBuffered).toStdString() : std::string();
}

std::string QtSocket::getData() {
    events_.bytesTaken();
    fetch();
    return socket_ ? socket_->readAll().toStdString() : std::string();
}

}  // namespace zel
