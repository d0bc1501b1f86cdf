#include "desktop/network/Tls.h"

#include <QFile>
#include <QSslCertificate>
#include <QSslKey>
#include <QSslSocket>
#include <QStringList>
#include <string>

#include "platform/ServerSocket.h"

namespace zel {
namespace {

constexpr qint64 kLongestKey = 64 * 1024;  // bytes
constexpr const char* kNoTls = "This system has no TLS.";

std::string readChain(const QString& path, QList<QSslCertificate>& chain) {
    chain = QSslCertificate::fromPath(path);
    if (!chain.isEmpty()) return {};
    return path.toStdString() + " holds no certificate in PEM form.";
}

std::string readKey(const QString& path, QSslKey& key) {
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) return path.toStdString() + " cannot be read.";
    const QByteArray bytes = file.read(kLongestKey);
    for (const QSsl::KeyAlgorithm kind : {QSsl::Rsa, QSsl::Ec}) {
        key = QSslKey(bytes, kind);
        if (!key.isNull()) return {};
    }
    return path.toStdString() + " holds no private key in PEM form.";
}

std::string readOwn(const QString& certificate, const QString& keyFile,
                    QSslConfiguration& configuration) {
    QList<QSslCertificate> chain;
    QSslKey key;
    std::string problem = readChain(certificate, chain);
    if (problem.empty()) problem = readKey(keyFile, key);
    if (!problem.empty()) return problem;
    configuration.setLocalCertificateChain(chain);
    configuration.setPrivateKey(key);
    return {};
}

QString dateText(const QDateTime& time) { return time.toUTC().toString("yyyy-MM-dd"); }

/// Words for one fault of the server's certificate; empty for one that follows from another.
QString certificateProblem(const QSslError& error, const QString& host) {
    const QSslCertificate certificate = error.certificate();
    switch (error.error()) {
        case QSslError::CertificateExpired:
            return "The server's certificate has expired on " + dateText(certificate.expiryDate()) +
                   ".";
        case QSslError::CertificateNotYetValid:
            return "The server's certificate is valid only from " +
                   dateText(certificate.effectiveDate()) + ". Look at the clock of this computer.";
        case QSslError::HostNameMismatch:
            return "The server's certificate is not for " + host + ".";
        case QSslError::UnableToGetLocalIssuerCertificate:
        case QSslError::UnableToGetIssuerCertificate:
        case QSslError::SelfSignedCertificate:
        case QSslError::SelfSignedCertificateInChain:
        case QSslError::CertificateUntrusted:
            return "The server's certificate is of no authority that this computer knows. Give its "
                   "fingerprint, or the authority's file in ZELREMOTE_TLS_CA.";
        case QSslError::UnableToVerifyFirstCertificate:
            return {};
        default:
            return "The server's certificate is not accepted: " + error.errorString() + ".";
    }
}

}  // namespace

std::string serverTls(const TlsFiles& files, QSslConfiguration& configuration) {
    if (!QSslSocket::supportsSsl()) return kNoTls;
    configuration = QSslConfiguration::defaultConfiguration();
    std::string problem = readOwn(QString::fromStdString(files.certificate),
                                  QString::fromStdString(files.key), configuration);
    configuration.setProtocol(QSsl::TlsV1_2OrLater);
    configuration.setPeerVerifyMode(QSslSocket::VerifyNone);
    if (!problem.empty() || files.clients.empty()) return problem;
    QList<QSslCertificate> known;
    problem = readChain(QString::fromStdString(files.clients), known);
    configuration.setCaCertificates(known);
    configuration.setPeerVerifyMode(QSslSocket::VerifyPeer);
    return problem;
}

std::string clientTls(QSslConfiguration& configuration) {
    if (!QSslSocket::supportsSsl()) return kNoTls;
    configuration = QSslConfiguration::defaultConfiguration();
    configuration.setProtocol(QSsl::TlsV1_2OrLater);
    if (const QString file = qEnvironmentVariable("ZELREMOTE_TLS_CA"); !file.isEmpty()) {
        QList<QSslCertificate> known;
        if (std::string problem = readChain(file, known); !problem.empty()) return problem;
        configuration.setCaCertificates(known);
    }
    const QString own = qEnvironmentVariable("ZELREMOTE_TLS_CERTIFICATE");
    if (own.isEmpty()) return {};
    return readOwn(own, qEnvironmentVariable("ZELREMOTE_TLS_KEY"), configuration);
}

std::string tlsProblem(const QSslSocket& socket, const QString& host) {
    QStringList words;
    for (const QSslError& error : socket.sslHandshakeErrors())
        if (const QString text = certificateProblem(error, host);
            !text.isEmpty() && !words.contains(text))
            words.append(text);
    if (words.isEmpty()) words.append(socket.errorString() + ".");
    return words.join(' ').toStdString();
}

}  // namespace zel
