#include "console/PanelSession.h"

#include <algorithm>
#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <string_view>
#include <utility>

#include "console/ControlAccess.h"
#include "console/ControlActions.h"
#include "console/Graph3DCommands.h"
#include "console/Graph3DText.h"
#include "console/GraphText.h"
#include "console/LineInput.h"
#include "console/LogAccess.h"
#include "console/PanelHelp.h"
#include "platform/Controls.h"
#include "platform/Event.h"
#include "platform/Form.h"
#include "platform/LinkAddress.h"
#include "shell/Program.h"
#include "support/ExitStatus.h"
#include "support/NumberText.h"
#include "support/RoboHelp_CSH.h"
#include "support/RunTimeError.h"
#include "support/SessionLog.h"
#include "support/Text.h"

namespace zel {
namespace {

/// How often a line is looked for while real time passes.
constexpr int kLookMs = 20;
/// Commands that may wait for one another; more is no use of a panel.
constexpr int kDeepest = 16;
constexpr int kLongestPumpMs = 24 * 3600 * 1000;
constexpr std::string_view kBlanks = " \t";
constexpr std::string_view kUtf8Mark = "\xEF\xBB\xBF";

/// The first word of a text, and what stands after it and one blank.
std::pair<std::string_view, std::string_view> firstWord(std::string_view text) {
    const auto end = text.find_first_of(kBlanks);
    if (end == std::string_view::npos) return {text, {}};
    return {text.substr(0, end), text.substr(end + 1)};
}

}  // namespace

struct PanelSession::CommandRow {
    std::string_view word;
    Command command;
};

const PanelSession::CommandRow PanelSession::kCommands[] = {
    {"click", &PanelSession::click},     {"type", &PanelSession::type},
    {"key", &PanelSession::key},         {"choose", &PanelSession::choose},
    {"set", &PanelSession::set},         {"show", &PanelSession::show},
    {"connect", &PanelSession::connect}, {"disconnect", &PanelSession::disconnect},
    {"answer", &PanelSession::answer},   {"pump", &PanelSession::pump},
    {"image3d", &PanelSession::image3d}, {"quit", &PanelSession::quit},
    {"call", &PanelSession::call},       {"fail", &PanelSession::fail},
    {"help", &PanelSession::help},       {"list", &PanelSession::list},
};

PanelSession::PanelSession(Program& program, const Services& means,
                           std::optional<LinkAddress> address)
    : program_(program), m_(means), address_(std::move(address)), interlock_(program.interlock()) {
    m_.events.whileWaiting = [this](int ms) { return whileWaiting(ms); };
    program_.Ended.connect([this] { ended_ = true; });
    handlers_.on(program_.logs().rootDebug.DebuggerError, [this](const std::string& text) {
        m_.output.line("event DebuggerError " + text);
    });
    handlers_.on(program_.logs().DebuggerLine,
                 [this](const std::string& text) { m_.errors.line(text); });
    // No viewer starts here.
    const auto shown = [this](const std::string&, int, int context) {
        m_.output.line("help " + std::to_string(context));
        return true;
    };
    program_.help().HtmlHelpA = shown;
    program_.help().WinHelpA = shown;
}

void PanelSession::serveInPumps() {
    m_.events.whilePumping = [this] {
        if (!interlock_.userWorks() || depth_ >= kDeepest || ended_ || program_.ended()) return;
        if (microsLeft() <= 0 && interlock_.waiting() == 0) readAndExecute();
    };
}

PanelSession::~PanelSession() {
    m_.events.whilePumping = nullptr;
    m_.events.whileWaiting = nullptr;
    program_.help().HtmlHelpA = nullptr;
    program_.help().WinHelpA = nullptr;
}

int PanelSession::run() {
    interlock_.beginCommand();
    program_.start();
    interlock_.endCommand();
    m_.output.settle();
    serveLines();
    if (!program_.ended()) program_.disconnect();
    m_.output.settle();
    if (!program_.endedBy().empty()) m_.errors.line("zelctl: ended by " + program_.endedBy());
    const bool broken = !program_.endedBy().empty() || program_.failed();
    if (broken && status_ == kDone) status_ = kLinkFailed;
    return status_;
}

void PanelSession::complain(const std::string& what) {
    m_.errors.line("zelctl: line " + std::to_string(line_) + ": " + what);
    status_ = kWrongUse;
}

void PanelSession::serveLines() {
    while (!ended_ && !program_.ended()) {
        try {
            if (microsLeft() > 0) {
                idle(kLongestPumpMs);
            } else if (interlock_.waiting() > 0 || !readAndExecute()) {
                idle(kLookMs);
            }
        } catch (...) {
            program_.showFailure();  // what a timer or the line set off
        }
    }
}

/// The hook of the event loop; true when the wait is over.
bool PanelSession::whileWaiting(int ms) {
    if (!interlock_.userWorks()) return false;
    if (depth_ >= kDeepest) ended_ = true;
    if (ended_ || program_.ended()) {
        interlock_.endLiveStates();
        return false;
    }
    m_.output.settle();
    if (microsLeft() > 0) {
        idle(ms);
    } else if (interlock_.waiting() > 0 || !readAndExecute()) {
        // A line whose turn has not come holds those after it.
        idle(std::min(ms, kLookMs));
    }
    return true;
}

/// False when no line has come yet.
bool PanelSession::readAndExecute() {
    if (!m_.output.problem().empty()) {  // nobody sees what further lines would do
        ended_ = true;
        return true;
    }
    std::string line;
    if (held_) {
        if (holdsBack(*held_)) return false;
        line = *std::exchange(held_, std::nullopt);
        execute(line);
        return true;
    }
    switch (atEnd_ ? LineInput::Got::End : m_.input.next(line, m_.virtualTime)) {
        case LineInput::Got::Nothing:
            return false;
        case LineInput::Got::End:
            // The attempt under way is still to come to its end.
            if (!atEnd_) program_.sessionLog().input("quit");
            atEnd_ = true;
            ended_ = !connecting_;
            return ended_;
        case LineInput::Got::TooLong:
            ++line_;
            complain("the line is too long");
            return true;
        case LineInput::Got::Line:
            break;
    }
    if (++line_ == 1 && startsWith(line, kUtf8Mark)) line.erase(0, kUtf8Mark.size());
    line = bytesToUtf8(line);
    if (holdsBack(line)) {
        held_ = line;
        return false;
    }
    execute(line);
    return true;
}

/// While `connect` reaches for a server, only what leaves the attempt goes at once: the lines after
/// it ask for its outcome.
bool PanelSession::holdsBack(std::string_view line) const {
    if (!connecting_ || !program_.forms().tcpConnection.Connecting) return false;
    const std::string text = trimmed(line);
    const auto [word, rest] = firstWord(text);
    return !word.empty() && word.front() != '#' && word != "pump" && word != "quit" &&
           rest != "TCPConnectionForm.QuitTCPButton";
}

void PanelSession::execute(std::string_view line) {
    if (!line.empty() && line.back() == '\r') line.remove_suffix(1);
    line.remove_prefix(std::min(line.find_first_not_of(kBlanks), line.size()));
    if (line.empty() || line.front() == '#') return;
    program_.sessionLog().input(std::string(line));
    const auto [word, rest] = firstWord(line);
    std::string problem;
    if (runGraph3DCommand(program_.forms().waterfall.Graph3D, word, rest, problem) ||
        runGraphCommand(program_.forms().controller.CWGraph1, word, rest, problem)) {
        if (!problem.empty()) complain(problem);
        return;
    }
    for (const CommandRow& row : kCommands) {
        if (row.word != word) continue;
        runCommand([&, text = rest] { (this->*row.command)(text); });
        return;
    }
    complain("there is no command \"" + std::string(word) + "\"");
}

void PanelSession::runCommand(const std::function<void()>& command) {
    interlock_.beginCommand();
    ++depth_;
    try {
        command();
    } catch (...) {
        connecting_ = false;
        program_.showFailure();
    }
    --depth_;
    interlock_.endCommand();
    m_.output.settle();
}

/// Works a control now, or in its turn when it would begin an exchange inside another.
void PanelSession::act(const Control& control, const std::string& name,
                       const std::function<Done()>& work) {
    const bool later = interlock_.turnOf(control) == Interlock::Turn::Later &&
                       refusal(control, false) == Done::Yes;
    if (!later) return tell(work(), name);
    interlock_.perform(control, [this, name, work] { runCommand([&] { tell(work(), name); }); });
}

/// Lets events run, no longer than to the end of a pump.
void PanelSession::idle(int ms) {
    const std::int64_t left = microsLeft();
    if (left > 0) ms = static_cast<int>(std::clamp<std::int64_t>(left / 1000, 1, ms));
    if (m_.events.always) m_.events.always();
    m_.events.inner().wait(ms);
}

std::int64_t PanelSession::microsLeft() const { return pumpUntil_ - m_.clock.micros(); }

Control* PanelSession::find(std::string_view name) {
    Control* control = program_.forms().control(name);
    if (control == nullptr) complain("there is no control \"" + std::string(name) + "\"");
    return control;
}

void PanelSession::tell(Done done, std::string_view name) {
    const std::string who = "refused: " + std::string(name);
    switch (done) {
        case Done::Yes:
            return;
        case Done::Hidden:
            return m_.output.line(who + " is hidden");
        case Done::Disabled:
            return m_.output.line(who + " is disabled");
        case Done::Locked:
            return m_.output.line(who + " is locked");
        case Done::Unfit:
            return complain("\"" + std::string(name) + "\" cannot do that");
        case Done::NoKey:
            return complain("there is no key of that name");
        case Done::NoEntry:
            return complain("\"" + std::string(name) + "\" has no such entry");
    }
}

void PanelSession::click(std::string_view rest) {
    const std::string name = trimmed(rest);
    if (Control* control = find(name))
        act(*control, name, [control] { return clickControl(*control); });
}

void PanelSession::type(std::string_view rest) {
    const auto [name, text] = firstWord(rest);
    if (Control* control = find(name)) tell(typeInto(*control, std::string(text)), name);
}

void PanelSession::key(std::string_view rest) {
    const auto [name, which] = firstWord(rest);
    if (Control* control = find(name))
        act(*control, std::string(name),
            [control, key = trimmed(which)] { return pressNamedKey(*control, key); });
}

void PanelSession::choose(std::string_view rest) {
    const auto [name, index] = firstWord(rest);
    if (Control* control = find(name))
        act(*control, std::string(name),
            [control, entry = trimmed(index)] { return chooseEntry(*control, entry); });
}

void PanelSession::set(std::string_view rest) {
    const auto [name, text] = firstWord(rest);
    if (namesALog(name)) {
        if (!setLogMember(program_.logs(), name, std::string(text)))
            complain("\"" + std::string(name) + "\" cannot be set to \"" + std::string(text) +
                     "\"");
        return;
    }
    if (Control* control = find(name)) tell(putText(*control, std::string(text)), name);
}

void PanelSession::show(std::string_view rest) {
    const std::string path = trimmed(rest);
    if (path == "graph") {
        for (const std::string& line : graphLines(program_.forms().controller.CWGraph1))
            m_.output.line(line);
        return;
    }
    if (path == "graph3d") {
        for (const std::string& line : graph3DLines(program_.forms().waterfall.Graph3D))
            m_.output.line(line);
        return;
    }
    if (showService(path)) return;
    const std::optional<std::string> text =
        namesALog(path) ? logMember(program_.logs(), path)
                        : textOf(program_.forms(), program_.variables(), path);
    if (text) {
        m_.output.line(*text);
    } else {
        complain("there is nothing to show as \"" + path + "\"");
    }
}

/// What is no property: true when the path names it.
bool PanelSession::showService(const std::string& path) {
    if (path == "help") {
        m_.output.line(program_.help().book());
    } else if (path == "clipboard") {
        const std::string text = replaceAll(program_.clipboard().text(), kCrLf, "\n");
        m_.output.line(replaceAll(replaceAll(text, "\r", "\n"), "\n", " / "));
    } else {
        return false;
    }
    return true;
}

void PanelSession::image3d(std::string_view rest) {
    const std::string file = trimmed(rest);
    if (file.empty()) return complain("image3d takes FILE");
    std::string problem = "pictures cannot be drawn here";
    program_.forms().waterfall.DrawImage(file, problem);
    if (problem.empty()) return;
    m_.errors.line("zelctl: line " + std::to_string(line_) + ": " + problem);
    if (status_ == kDone) status_ = kLinkFailed;
}

void PanelSession::connect(std::string_view) {
    if (!address_) return complain("connect needs the option --connect");
    const ControllerForm& panel = program_.forms().controller;
    const MenuItem& item = address_->overNetwork() ? panel.TCPConnection : panel.Direct;
    if (const Done refused = refusal(item, false); refused != Done::Yes)
        return tell(refused, item.name());
    connecting_ = true;
    const bool connected = program_.connect(*address_, true);
    connecting_ = false;
    if (connected || program_.ended()) return;
    m_.output.settle();
    m_.errors.line("zelctl: line " + std::to_string(line_) + ": no instrument was connected");
    if (const std::string advice = program_.connectionAdvice(); !advice.empty())
        m_.errors.line("zelctl: " + advice);
    if (status_ == kDone) status_ = kLinkFailed;
}

void PanelSession::disconnect(std::string_view) { click("Disconnect"); }

void PanelSession::answer(std::string_view rest) { m_.answers.add(std::string(rest)); }

void PanelSession::pump(std::string_view rest) {
    const std::optional<int> ms = wholeNumber(trimmed(rest), 0, kLongestPumpMs);
    if (!ms) return complain("pump takes milliseconds, at most a day of them");
    if (*ms == 0) return m_.events.pump();
    // The time passes between the commands, or where the command around this one waits.
    pumpUntil_ = m_.clock.micros() + std::int64_t{*ms} * 1000;
}

void PanelSession::quit(std::string_view) { ended_ = true; }

void PanelSession::call(std::string_view rest) {
    const auto [name, text] = firstWord(rest);
    const auto arguments = splitArguments(text);
    const auto result = arguments ? callLog(program_.logs(), name, *arguments) : std::nullopt;
    if (!result)
        return complain("there is no routine \"" + std::string(name) + "\" of these arguments");
    if (!result->empty()) m_.output.line(*result);
}

void PanelSession::fail(std::string_view rest) {
    const auto arguments = splitArguments(rest);
    const auto number =
        arguments && arguments->size() == 3 ? wholeNumber((*arguments)[0]) : std::optional<int>();
    if (!number) return complain("fail takes NUMBER \"SOURCE\" \"DESCRIPTION\"");
    Event<> happened;
    happened.connect([&] { throw RunTimeError(*number, (*arguments)[1], (*arguments)[2]); });
    happened();
}

void PanelSession::help(std::string_view) { m_.output.lines(panelHelp()); }

void PanelSession::list(std::string_view rest) {
    const std::string form = trimmed(rest);
    if (form.empty()) return m_.output.lines(formList(program_.forms()));
    const auto lines = controlList(program_.forms(), form);
    if (!lines) return complain("there is no form \"" + form + "\"");
    m_.output.lines(*lines);
}

}  // namespace zel
