#pragma once
// Writes down a session: each byte each way, the port's events and what the user does.

#include <cstddef>
#include <cstdint>
#include <deque>
#include <string>
#include <string_view>
#include <vector>

#include "platform/Clock.h"
#include "platform/Event.h"
#include "platform/Files.h"
#include "support/SessionText.h"

namespace zel {

/// All events are kept also while no file is written, so that a record which a user begins inside
/// of a session holds it from its start. Of a session with too many of them only the last ones are
/// kept, for the report of a failure. A file that cannot be written any more ends the log and not
/// the session.
class SessionLog {
  public:
    static constexpr std::size_t kKept = 200;            ///< events, where not all are
    static constexpr std::size_t kMostKept = 8'000'000;  ///< bytes of all events

    SessionLog(const Clock& clock, FileService& files);
    ~SessionLog() { end(); }
    SessionLog(const SessionLog&) = delete;
    SessionLog& operator=(const SessionLog&) = delete;

    /// Begins a new file, over one of that name, with all events of the session where they are
    /// still there. Why it cannot be written, else empty.
    std::string begin(const std::string& path, const std::string& startArguments);
    /// Ends the file with `closed`.
    void end();
    bool writing() const { return !path_.empty(); }
    /// All events since the start of the program are still there.
    bool whole() const { return whole_; }
    const std::string& path() const { return path_; }

    void sent(std::string_view bytes);
    void came(std::string_view bytes);
    void opened(const std::string& address);
    void closed();
    void input(const std::string& line) { note(SessionEvent::Kind::Input, line); }
    void clicked(const std::string& control) { note(SessionEvent::Kind::Click, control); }

    /// The last events as lines, the oldest first; of many bytes the first ones and their count.
    std::vector<std::string> lastLines() const;

    /// Each event as it happens.
    Event<const SessionEvent&> Noted;
    /// The arguments of the program, as one line.
    std::string arguments;
    /// The name of a port that is the built-in simulator.
    std::string simulatorPort;
    /// The file cannot be written any more; the argument says why.
    Event<const std::string&> Failed;

  private:
    void note(SessionEvent::Kind kind, std::string text);
    void forget();
    void write(const std::string& line);

    const Clock& clock_;
    FileService& files_;
    std::int64_t began_;
    std::string path_;
    std::uint64_t written_ = 0;
    bool open_ = false;     ///< the port
    std::string address_;   ///< of the port that is open
    std::string sentTail_;  ///< the last bytes that were sent, for what must not be shown
    std::deque<SessionEvent> events_;
    std::size_t kept_ = 0;  ///< bytes that the events take
    bool whole_ = true;
};

/// A PIN in bytes that are sent, its digits as "*"; `before` are the bytes sent before these.
std::string withoutPins(std::string_view before, std::string_view bytes);

}  // namespace zel
