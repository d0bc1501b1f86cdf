#pragma once
// Certificates and keys for TLS, and what went wrong with them in words.

#include <QSslConfiguration>
#include <QString>
#include <string>

#include "platform/ServerSocket.h"

class QSslSocket;

namespace zel {

/// Which is wrong with the files, else empty; the configuration is complete only then.
std::string serverTls(const TlsFiles& files, QSslConfiguration& configuration);

/// A client takes its authorities from the file that ZELREMOTE_TLS_CA names, and its own
/// certificate and key from those of ZELREMOTE_TLS_CERTIFICATE and ZELREMOTE_TLS_KEY. What is wrong
/// with these files, else empty.
std::string clientTls(QSslConfiguration& configuration);

/// Why the connection to that host failed, for a user, with what he can do.
std::string tlsProblem(const QSslSocket& socket, const QString& host);

}  // namespace zel
