#pragma once
// The program's two logs, and what goes into the plain one.

#include <string>

#include "platform/Event.h"
#include "platform/Platform.h"
#include "platform/Services.h"
#include "support/DebugIf.h"
#include "support/RootDebug.h"

namespace zel {

/// The plain log follows the texts of the serial line when the words hold BUTTON: "-> " and what
/// was sent, "<- " and what came. It is "debug.log" in the application's folder and begins again
/// with each start. The structured log writes its file when the words hold SERVER.
class Logs {
  public:
    Logs(const Platform& platform, const std::string& words);

    /// The debug channel of the line, which the plain log follows.
    DebugChannel& line() { return line_; }

    /// What the structured log says to the debugger.
    Event<const std::string&> DebuggerLine;

  private:
    /// The system's debugger, and who else listens.
    struct Debugger : DebugChannel {
        Debugger(DebugChannel& channel, Event<const std::string&>& line)
            : system(channel), heard(line) {}
        void output(const std::string& text) override {
            system.output(text);
            heard(text);
        }
        DebugChannel& system;
        Event<const std::string&>& heard;
    };
    /// The line's channel, with the plain log beside it.
    struct Line : DebugChannel {
        Line(DebugChannel& channel, DebugIf& log) : system(channel), plain(log) {}
        void output(const std::string& text) override;
        DebugChannel& system;
        DebugIf& plain;
    };

    Debugger debugger_;

  public:
    DebugIf DebugIt;
    RootDebug rootDebug;

  private:
    Line line_;
};

/// A text of the line as one line of a log: a blank after the arrow, without the end, line ends
/// inside as "\r" and "\n", a PIN as stars.
std::string loggedText(const std::string& text);

}  // namespace zel
