#include "desktop/network/QtServerSocket.h"

#include <QHostAddress>
#include <QNetworkInterface>
#include <QSslSocket>
#include <QTimer>
#include <memory>

#include "desktop/network/Tls.h"
#include "platform/ServerSocket.h"
#include "platform/Socket.h"

namespace zel {
namespace {

constexpr int kMostRequests = 16;
constexpr int kProofMs = 10'000;
constexpr qint64 kMostOfProof = 64 * 1024;  // bytes of TLS before a client is let in

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
        auto* socket = owner_.configuration_ ? new QSslSocket : new QTcpSocket;
        if (!socket->setSocketDescriptor(descriptor)) {
            delete socket;
            return;
        }
        owner_.knocked(socket);
    }

  private:
    QtServerSocket& owner_;
};

QtServerSocket::QtServerSocket(ArrivalSources& events)
    : listener_(std::make_unique<Listener>(*this)), client_(events, false) {
    QObject::connect(listener_.get(), &QTcpServer::acceptError, listener_.get(), [this] {
        problem_ = listener_->errorString().toStdString() + ".";
        failed_ = true;
    });
}

QtServerSocket::~QtServerSocket() { close(); }

void QtServerSocket::knocked(QTcpSocket* socket) {
    // Nothing is read of who has not been let in.
    socket->setReadBufferSize(1);
    // Who is slow to prove himself does not keep others out.
    if (requests_.size() >= kMostRequests)
        proofFailed(requests_.begin()->first, "Too many wait to be let in.");
    const int request = ++lastRequest_;
    requests_[request] = {socket, plainAddress(socket->peerAddress()).toStdString()};
    ConnectionRequest(request);
    const auto left = requests_.find(request);
    // Whom nobody has let in by now.
    if (left != requests_.end() && left->second.proof == Proof::None) refuse(request);
}

bool QtServerSocket::prove(int requestId) {
    const auto found = requests_.find(requestId);
    if (!configuration_ || found == requests_.end() || found->second.proof != Proof::None)
        return false;
    auto* secured = qobject_cast<QSslSocket*>(found->second.socket);
    if (secured == nullptr) return false;
    found->second.proof = Proof::Running;
    secured->setReadBufferSize(kMostOfProof);
    secured->setSslConfiguration(*configuration_);
    QObject::connect(secured, &QSslSocket::encrypted, secured,
                     [this, requestId] { proved(requestId); });
    QObject::connect(secured, &QSslSocket::errorOccurred, secured, [this, requestId, secured] {
        proofFailed(requestId, secured->errorString().toStdString() + ".");
    });
    QTimer::singleShot(kProofMs, secured, [this, requestId] {
        proofFailed(requestId, "The TLS handshake took too long.");
    });
    secured->startServerEncryption();
    return true;
}

void QtServerSocket::proved(int requestId) {
    const auto found = requests_.find(requestId);
    if (found == requests_.end() || found->second.proof != Proof::Running) return;
    found->second.proof = Proof::Given;
    found->second.socket->disconnect();
    ConnectionRequest(requestId);
    refuse(requestId);
}

void QtServerSocket::proofFailed(int requestId, const std::string& reason) {
    const auto found = requests_.find(requestId);
    if (found == requests_.end() || found->second.proof != Proof::Running) return;
    found->second.socket->disconnect();
    ProofFailed(requestId, reason);
    refuse(requestId);
}

QTcpSocket* QtServerSocket::take(int requestId) {
    const auto found = requests_.find(requestId);
    if (found == requests_.end()) return nullptr;
    QTcpSocket* socket = found->second.socket;
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
    QSslConfiguration configuration;
    std::string problem = serverTls(files, configuration);
    if (!problem.empty()) return problem;
    configuration_ = configuration;
    return {};
}

std::string QtServerSocket::peer(int requestId) const {
    const auto found = requests_.find(requestId);
    return found == requests_.end() ? std::string() : found->second.peer;
}

void QtServerSocket::accept(int requestId) {
    QTcpSocket* socket = take(requestId);
    if (socket == nullptr) return;
    client_.letIn(socket);
}

void QtServerSocket::refuse(int requestId) {
    QTcpSocket* socket = take(requestId);
    if (socket == nullptr) return;
    socket->abort();
    socket->deleteLater();
}

}  // namespace zel
