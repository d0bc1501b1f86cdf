#pragma once
// The server: a TCP port, the instrument's serial port, and at most one client between them.

#include <cstdint>
#include <string>
#include <vector>

#include "forms/ControllerForm.h"
#include "forms/ServerForm.h"
#include "platform/Event.h"
#include "platform/Events.h"
#include "platform/SerialPort.h"
#include "platform/ServerSocket.h"
#include "platform/Session.h"
#include "server/InstrumentSearch.h"
#include "server/Networks.h"
#include "server/Relay.h"
#include "support/RootDebug.h"

namespace zel {

/// `Happened` gives a line for each event: "listening ADDRESS:PORT", "instrument DEVICE BAUD",
/// "client ADDRESS", "client gone", "refused ADDRESS", "error TEXT", "closed".
class ServerBridge {
  public:
    ServerBridge(ControllerForm& panel, ServerForm& form, SerialPort& SystemCommPort,
                 ServerSocket& TCPSocket, const Session& services, RootDebug& log);
    ~ServerBridge();
    ServerBridge(const ServerBridge&) = delete;
    ServerBridge& operator=(const ServerBridge&) = delete;

    void StartListening(bool& ok);
    /// Listening and instrument, from the fields of the form; with `quiet` failures show no box.
    /// False when one of them failed, with everything closed.
    bool connect(bool quiet = false);
    /// Closes port, client and socket.
    void disconnect();
    void disconnectClient();
    void CloseCommPort();
    bool bridging() const { return bridging_; }
    bool connecting() const { return connecting_; }
    /// From the next `connect` on. What is wrong with the files, else empty.
    std::string useTls(const TlsFiles& files) { return socket_.useTls(files); }
    /// Why the last attempt failed, or the bridge ended by itself.
    const std::string& problem() const { return problem_; }
    /// A socket in error goes back to listening; to be called once a second.
    void repair();
    /// Brings the form's view of sockets and traffic up to date.
    void showState();

    Relay& relay() { return relay_; }
    const Relay& relay() const { return relay_; }

    Event<const std::string&> Happened;
    /// The instrument has gone while bridging; everything is closed.
    Event<> Lost;

  private:
    void knocked(int requestId);
    void clientGone();
    void watchInstrument();
    void report(int level, const char* routine, const std::string& text);
    void refused(const std::string& address, const std::string& reason);
    void captions(const std::string& text);
    std::string listenText() const;

    ControllerForm& panel_;
    ServerForm& form_;
    SerialPort& port_;
    ServerSocket& socket_;
    Session services_;
    RootDebug& log_;
    Relay relay_;
    InstrumentSearch search_;
    std::vector<Network> allowed_;
    bool bridging_ = false;
    bool connecting_ = false;
    bool hasClient_ = false;
    std::string clientAddress_;
    std::string refusedAddress_;  ///< the last in the log
    std::int64_t refusedAt_ = 0;
    std::string problem_;
    TaskId watchTask_ = 0;
    Handlers handlers_;
};

}  // namespace zel
