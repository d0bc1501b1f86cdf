#pragma once
// Works the panel by the names of its controls, one command a line.

#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <string_view>

#include "console/ConsoleDialogs.h"
#include "console/ControlActions.h"
#include "console/LineInput.h"
#include "console/LineOutput.h"
#include "console/ServingEvents.h"
#include "platform/Clock.h"
#include "platform/Event.h"
#include "platform/Form.h"
#include "platform/LinkAddress.h"
#include "shell/Program.h"
#include "support/ExitStatus.h"
#include "trace/Interlock.h"

namespace zel {

/// Lines are read between commands, and inside of a command while a modal form, a continuous view,
/// a recording or a script runs.
class PanelSession {
  public:
    struct Services {
        const Clock& clock;
        ServingEvents& events;
        LineInput& input;
        LineOutput& output;
        LineOutput& errors;
        AnswerQueue& answers;
        bool virtualTime = false;  ///< no time passes while a line is awaited
    };
    PanelSession(Program& program, const Services& means, std::optional<LinkAddress> address);
    ~PanelSession();
    PanelSession(const PanelSession&) = delete;
    PanelSession& operator=(const PanelSession&) = delete;

    /// Starts the program and serves lines to the end. An unknown word or name is reported on the
    /// errors and makes the status 2; a connection that did not come about makes it 1.
    int run();
    /// Serves lines also where the program only lets pending events run, as a window takes clicks:
    /// a recorded session needs each line in its place.
    void serveInPumps();
    /// Reports wrong use; the session goes on.
    void complain(const std::string& what);

  private:
    using Command = void (PanelSession::*)(std::string_view rest);
    struct CommandRow;
    static const CommandRow kCommands[];

    void serveLines();
    bool whileWaiting(int ms);
    bool readAndExecute();
    bool holdsBack(std::string_view line) const;
    void execute(std::string_view line);
    void idle(int ms);
    std::int64_t microsLeft() const;

    void click(std::string_view rest);
    void type(std::string_view rest);
    void key(std::string_view rest);
    void choose(std::string_view rest);
    void set(std::string_view rest);
    void show(std::string_view rest);
    void connect(std::string_view rest);
    void disconnect(std::string_view rest);
    void answer(std::string_view rest);
    void pump(std::string_view rest);
    void image3d(std::string_view rest);
    void quit(std::string_view rest);
    void call(std::string_view rest);
    void fail(std::string_view rest);
    void help(std::string_view rest);
    void list(std::string_view rest);
    bool showService(const std::string& path);

    void act(const Control& control, const std::string& name, const std::function<Done()>& work);
    void runCommand(const std::function<void()>& command);
    Control* find(std::string_view name);
    void tell(Done done, std::string_view name);

    Program& program_;
    Services m_;
    std::optional<LinkAddress> address_;
    Interlock& interlock_;
    long line_ = 0;                    ///< number of the line at hand
    int depth_ = 0;                    ///< commands on the stack
    bool connecting_ = false;          ///< the line `connect` is at work
    std::optional<std::string> held_;  ///< a line whose turn comes after it
    bool atEnd_ = false;               ///< of the input
    std::int64_t pumpUntil_ = 0;
    bool ended_ = false;
    int status_ = kDone;
    Handlers handlers_;
};

}  // namespace zel
