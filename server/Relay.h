#pragma once
// Carries bytes between the client and the instrument, unchanged, and groups what comes back: a
// whole reply to what the client asked goes on at once, all else when the line has been quiet.

#include <cstddef>
#include <cstdint>
#include <string>

#include "forms/ServerForm.h"
#include "platform/Event.h"
#include "platform/Events.h"
#include "platform/SerialPort.h"
#include "platform/Session.h"
#include "platform/Socket.h"
#include "server/ReplyWatch.h"
#include "support/RootDebug.h"

namespace zel {

/// Looks at the client's bytes for the one word that switches to a binary trace, in either case
/// and also where it was split.
class TraceWatch {
  public:
    /// Takes the client's next bytes. True when the instrument's next bytes are a trace.
    bool take(const std::string& bytes);
    void reset();

  private:
    std::string tail_;  ///< what may be the word's beginning
    bool trace_ = false;
};

class Relay {
  public:
    /// Most bytes that wait for the line before the client is not read any more.
    static constexpr std::size_t kMostForLine = 64 * 1024;
    /// Most bytes that wait for a client before it is closed.
    static constexpr std::size_t kMostForClient = 1024 * 1024;
    static constexpr int kQuietMs = 10;
    static constexpr int kLongestGroupMs = 100;

    /// Connects the events of the port and of the client.
    Relay(ServerForm& form, SerialPort& SystemCommPort, Socket& client, const Session& services,
          RootDebug& log);
    ~Relay();
    Relay(const Relay&) = delete;
    Relay& operator=(const Relay&) = delete;

    /// So long the line is quiet before a group goes on that is no whole reply, in ms; 100 waits
    /// the whole time always, for whole replies as well.
    void setQuiet(int ms);
    /// Another client, or none: what waits from the former one or for it is dropped.
    void restart();
    /// Sends the client's bytes on and judges what kind of answer will come.
    void RelayToInstrument(const std::string& text);

    std::uint64_t bytesToInstrument() const { return toInstrument_; }
    std::uint64_t bytesToClient() const { return toClient_; }
    std::uint64_t sweeps() const { return sweeps_; }
    /// Bytes that wait for the line or for a group to be whole.
    std::size_t waiting() const { return forLine_.size() + group_.size(); }

    /// The client does not take what is sent; its connection is closed.
    Event<> ClientTooSlow;

  private:
    void dataFromClient();
    void dataFromInstrument(int commEvent);
    void feedLine();
    void sendGroup();
    void sendToClient(const std::string& bytes);

    ServerForm& form_;
    SerialPort& port_;
    Socket& client_;
    Session services_;
    RootDebug& log_;
    TraceWatch watch_;
    ReplyWatch replies_;
    int quietMs_ = kQuietMs;
    std::string forLine_;
    std::string group_;
    std::int64_t groupEnds_ = 0;  ///< microseconds; the latest
    TaskId groupTask_ = 0;
    TaskId feedTask_ = 0;
    std::uint64_t toInstrument_ = 0;
    std::uint64_t toClient_ = 0;
    std::uint64_t sweeps_ = 0;
    Handlers handlers_;
};

}  // namespace zel
