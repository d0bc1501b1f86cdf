#include "desktop/platform/QtServerSocket.h"

#include <QFile>
#include <QHostAddress>
#include <QNetworkInterface>
#include <QSslCertificate>
#include <QSslKey>
#include <QSslSocket>

namespace zel {
namespace {

constexpr int kMostRequests = 16;

QString plainAddress(QHostAddress address) {
    // An address of the old kind at a port that takes both comes as "::ffff:A.B.C.D".
    bool old = false;
    const quint32 number = address.toIPv4Address(&old);
    if (old) address = QHostAddress(number);
    address.setScopeId({});
    return address.toString();
}

}  // namespace

class QtServerSocket::Listener : public QTcpServer {
  public:
    explicit Listener(QtServerSocket& owner) : owner_(owner) {}

  protected:
    void incomingConnection(qintptr descriptor) override {
        auto* socket = owner_.tls_ ? new QSslSocket : new QTcpSocket;
        if (!socket->setSocketDescriptor(descriptor)) {
            delete socket;
            return;
        }
        owner_.knocked(socket);
    }

  private:
    QtServerSocket& owner_;
};

QtServerSocket::QtServerSocket(QtEvents& events)
    : listener_(std::make_unique<Listener>(*this)), client_(events, false) {}

QtServerSocket::~QtServerSocket() { close(); }

void QtServerSocket::knocked(QTcpSocket* socket) {
    // Nothing is read of who has not been let in.
    socket->setReadBufferSize(1);
    if (requests_.size() >= kMostRequests) {
        socket->abort();
        socket->deleteLater();
        return;
    }
    requests_[++lastRequest_] = socket;
    const int request = lastRequest_;
    ConnectionRequest(request);
    refuse(request);  // whom nobody has let in by now
}

QTcpSocket* QtServerSocket::take(int requestId) {
    const auto found = requests_.find(requestId);
    if (found == requests_.end()) return nullptr;
    QTcpSocket* socket = found->second;
    requests_.erase(found);
    return socket;
}

void QtServerSocket::listen(const std::string& address, int port) {
    close();
    const QString text = QString::fromStdString(address);
    const QHostAddress host =
        address.empty() ? QHostAddress(QHostAddress::Any) : QHostAddress(text);
    if (host.isNull()) {
        failed_ = true;
        problem_ = address + " is no address of a network.";
        return;
    }
    bool listens = listener_->listen(host, static_cast<quint16>(port));
    // A machine without IPv6.
    if (!listens && address.empty())
        listens = listener_->listen(QHostAddress::AnyIPv4, static_cast<quint16>(port));
    failed_ = !listens;
    port_ = listens ? listener_->serverPort() : port;
    if (!listens) problem_ = listener_->errorString().toStdString() + ".";
}

void QtServerSocket::close() {
    while (!requests_.empty()) refuse(requests_.begin()->first);
    if (listener_->isListening()) listener_->close();
    failed_ = false;
    problem_.clear();
}

SocketState QtServerSocket::state() const {
    if (failed_) return SocketState::Error;
    return listener_->isListening() ? SocketState::Listening : SocketState::Closed;
}

std::string QtServerSocket::localIP() const {
    for (const QHostAddress& address : QNetworkInterface::allAddresses())
        if (!address.isLoopback() && !address.isLinkLocal())
            return plainAddress(address).toStdString();
    for (const QHostAddress& address : QNetworkInterface::allAddresses())
        if (!address.isLoopback()) return plainAddress(address).toStdString();
    return "127.0.0.1";
}

std::string QtServerSocket::useTls(const TlsFiles& files) {
    const auto path = [](const std::string& name) { return QString::fromStdString(name); };
    if (!QSslSocket::supportsSsl()) return "This system has no TLS.";
    const QList<QSslCertificate> chain = QSslCertificate::fromPath(path(files.certificate));
    if (chain.isEmpty()) return files.certificate + " holds no certificate in PEM form.";
    QFile keyFile(path(files.key));
    if (!keyFile.open(QIODevice::ReadOnly)) return files.key + " cannot be read.";
    const QByteArray bytes = keyFile.readAll();
    QSslKey key(bytes, QSsl::Rsa);
    if (key.isNull()) key = QSslKey(bytes, QSsl::Ec);
    if (key.isNull()) return files.key + " holds no private key in PEM form.";
    configuration_ = QSslConfiguration::defaultConfiguration();
    configuration_.setLocalCertificateChain(chain);
    configuration_.setPrivateKey(key);
    configuration_.setProtocol(QSsl::TlsV1_2OrLater);
    configuration_.setPeerVerifyMode(QSslSocket::VerifyNone);
    if (!files.clients.empty()) {
        const QList<QSslCertificate> known = QSslCertificate::fromPath(path(files.clients));
        if (known.isEmpty()) return files.clients + " holds no certificate in PEM form.";
        configuration_.setCaCertificates(known);
        configuration_.setPeerVerifyMode(QSslSocket::VerifyPeer);
    }
    tls_ = true;
    return {};
}

std::string QtServerSocket::peer(int requestId) const {
    const auto found = requests_.find(requestId);
    if (found == requests_.end()) return {};
    return plainAddress(found->second->peerAddress()).toStdString();
}

void QtServerSocket::accept(int requestId) {
    QTcpSocket* socket = take(requestId);
    if (socket == nullptr) return;
    client_.letIn(socket);
    if (auto* secured = qobject_cast<QSslSocket*>(socket); secured != nullptr) {
        secured->setSslConfiguration(configuration_);
        secured->startServerEncryption();
    }
}

void QtServerSocket::refuse(int requestId) {
    QTcpSocket* socket = take(requestId);
    if (socket == nullptr) return;
    socket->abort();
    socket->deleteLater();
}

}  // namespace zel
