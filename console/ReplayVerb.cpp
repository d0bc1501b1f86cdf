#include "console/ReplayVerb.h"

#include <QTemporaryDir>
#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <locale>
#include <memory>
#include <optional>
#include <sstream>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "console/Address.h"
#include "console/ConsoleDialogs.h"
#include "console/Fronts.h"
#include "console/LineOutput.h"
#include "console/Options.h"
#include "console/OverlayFiles.h"
#include "console/ReplayFront.h"
#include "console/ReplayInput.h"
#include "console/Tool.h"
#include "desktop/platform/QtSignals.h"
#include "desktop/platform/SystemFiles.h"
#include "platform/Clock.h"
#include "platform/Events.h"
#include "platform/Files.h"
#include "shell/Program.h"
#include "support/ExitStatus.h"
#include "support/FileText.h"
#include "support/SessionCompare.h"
#include "support/SessionLog.h"
#include "support/SessionText.h"
#include "support/Text.h"

namespace zel {
namespace {

/// The words of the program among the arguments of a window: those of the option, and what stands
/// alone and is no file.
std::string windowWords(const std::vector<std::string>& given) {
    constexpr std::string_view kWords = "--words";
    std::vector<std::string> words;
    for (std::size_t i = 1; i < given.size(); ++i) {
        const std::string& argument = given[i];
        if (!startsWith(argument, "--")) {
            if (argument.find_first_of("./") == std::string::npos) words.push_back(argument);
        } else if (const auto sign = argument.find('='); sign != std::string::npos) {
            if (argument.substr(0, sign) == kWords) words.push_back(argument.substr(sign + 1));
        } else if (++i < given.size() && argument == kWords) {
            words.push_back(given[i]);  // every option of a window has a value
        }
    }
    std::string text;
    for (const std::string& word : words) text += (text.empty() ? "" : " ") + word;
    return text;
}

/// A record that a user began while connected: the state of the panel is not in it.
bool beganConnected(const SessionRecord& record, Verb verb) {
    return verb == Verb::Panel && record.events.size() > 1 &&
           record.events[1].kind == SessionEvent::Kind::Open;
}

/// A record that ended with a click, and not with the session.
bool endedByUser(const SessionRecord& record) {
    constexpr std::string_view kEntry = "UtilityRecord";
    for (auto event = record.events.rbegin(); event != record.events.rend(); ++event) {
        if (event->kind == SessionEvent::Kind::Click) return event->text == kEntry;
        if (event->kind == SessionEvent::Kind::Input)
            return event->text == "click " + std::string(kEntry);
    }
    return false;
}

bool isOfWindow(const SessionRecord& record) {
    const std::vector<std::string> given = splitArgumentLine(record.events.front().text);
    return given.empty() || given.front() == "zelremote";
}

/// The options of the recorded run; those of a window become a panel session.
Options recordedOptions(const SessionRecord& record) {
    Options recorded;
    const std::vector<std::string> given = splitArgumentLine(record.events.front().text);
    std::vector<const char*> arguments = {"zelctl"};
    for (const std::string& argument : given) arguments.push_back(argument.c_str());
    const bool window = isOfWindow(record);
    std::ostringstream silent;
    silent.imbue(std::locale::classic());
    const bool parsed = !window && !parseOptions(static_cast<int>(arguments.size()),
                                                 arguments.data(), recorded, silent, silent);
    if (!parsed || recorded.verb == Verb::Replay) {
        recorded = {};
        recorded.verb = Verb::Panel;
    }
    if (window) recorded.words = windowWords(given);
    recorded.log.clear();
    recorded.image.clear();
    recorded.waterfall.clear();
    recorded.spectrogram.clear();
    return recorded;
}

/// The address of the first opening in the record.
std::optional<ConnectAddress> recordedAddress(const SessionRecord& record) {
    for (const SessionEvent& event : record.events)
        if (event.kind == SessionEvent::Kind::Open) return parseAddress(event.text);
    return std::nullopt;
}

/// What differs, on the two outputs; true when something does.
bool tellDifference(const SessionRecord& record, const SessionCompare& compare, LineOutput& output,
                    LineOutput& errors) {
    const auto line = [&record](std::size_t event) {
        return "line " + std::to_string(record.numbers[event]) + ": " + record.lines[event];
    };
    if (const auto& difference = compare.difference()) {
        const std::size_t last = record.events.size() - 1;
        output.line(line(std::min(difference->event, last)));
        errors.line("zelctl: " + difference->text);
        return true;
    }
    if (compare.complete()) return false;
    output.line(line(compare.place()));
    errors.line("zelctl: the program did not send this");
    return true;
}

}  // namespace

int runReplay(const Options& options, const Streams& streams) {
    LineOutput output(streams.out, streams.outIsTerminal);
    LineOutput errors(streams.errors, streams.errorsAreTerminal);
    const auto fail = [&errors](const std::string& what) {
        errors.line("zelctl: " + what);
        return kLinkFailed;
    };
    SystemFiles files;
    FileProblem problem;
    const auto text = readFile(files, options.argument, kLongestSession, problem);
    if (!text) return fail(readProblem(options.argument, problem));
    const SessionRecord record = parseSession(*text);
    const bool damaged = !record.problem.empty();
    if (damaged) errors.line("zelctl: " + options.argument + ": " + record.problem);
    if (record.events.empty() || record.events.front().kind != SessionEvent::Kind::Start)
        return kLinkFailed;

    const QTemporaryDir own;
    Options recorded = recordedOptions(record);
    if (beganConnected(record, recorded.verb))
        return fail(options.argument +
                    ": the record began while the connection was open, so it cannot run again; "
                    "record from before the connection on");
    recorded.home = options.home.empty() ? own.path().toStdString() : options.home;
    recorded.verbose = options.verbose;
    recorded.address = options.address ? options.address : recorded.address;
    if (!recorded.address) recorded.address = recordedAddress(record);
    std::unique_ptr<Front> front;
    std::function<void(std::int64_t)> passTo;
    if (!options.address) {
        ReplayStage stage = makeReplayFront(record, recorded.home);
        front = std::move(stage.front);
        if (isOfWindow(record)) passTo = std::move(stage.passTo);
        // The answers come from the record, whatever the address says.
        if (recorded.address) recorded.address->simulated = false;
    } else {
        front = options.address->simulated ? makeSimulatorFront(recorded.home)
                                           : makePortFront(recorded.home);
    }
    ReplayProgress progress(record);
    Rerun rerun;
    rerun.ofWindow = isOfWindow(record);
    rerun.begun = [&progress](Program& program) {
        program.forms().controller.ReconnectAlways.Checked = false;  // the record has it clicked
        program.sessionLog().Noted.connect([&progress](const SessionEvent& event) {
            if (event.kind == SessionEvent::Kind::Sent) progress.compare.sent(event.text);
            if (event.kind == SessionEvent::Kind::Came) progress.came += event.text.size();
        });
    };
    rerun.files = [](FileService& disk) { return std::make_unique<OverlayFiles>(disk); };
    const bool byUser = recorded.verb == Verb::Panel && endedByUser(record);
    ReplayInput* input = nullptr;
    rerun.input = [&](const Clock& clock, Events& events) {
        auto made = std::make_unique<ReplayInput>(record, progress, clock, events, passTo);
        input = made.get();
        if (byUser)
            made->cutShort = [&front] { front->endSignals().request("the end of the record"); };
        return made;
    };
    rerun.awaitAnswer = [&input](AnswerQueue& answers) { input->awaitAnswer(answers); };
    const int status = runTool(recorded, *front, streams, &rerun);
    const SessionCompare& compare = progress.compare;
    // Of a log that was cut, or ended by the user, nobody knows how it went on.
    const bool beyond = compare.difference() ? (damaged || byUser) && compare.difference()->event >=
                                                                          record.events.size()
                                             : damaged;
    const bool differs = !beyond && tellDifference(record, compare, output, errors);
    static_cast<void>(status);  // a session that failed then fails again
    return differs || damaged ? kLinkFailed : kDone;
}

}  // namespace zel
