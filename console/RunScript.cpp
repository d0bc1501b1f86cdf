#include "console/RunScript.h"

#include <algorithm>
#include <filesystem>
#include <optional>
#include <string>

#include "console/LineOutput.h"
#include "console/Options.h"
#include "forms/ScriptForms.h"
#include "platform/Files.h"
#include "rehearsal/Rehearsal.h"
#include "support/ExitStatus.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr int kLookMs = 20;

struct ScriptRunner {
    const ScriptStage& stage;
    SpecialMeasForm& form = stage.program.forms().specialMeas;
    bool inputEnded = false;
    bool interrupted = false;  ///< stopped by SIGINT

    /// The next line of the input; nothing at its end.
    std::optional<std::string> nextLine() {
        std::string line;
        while (!inputEnded) {
            if (stage.events.always) stage.events.always();
            if (interrupted) return std::nullopt;
            switch (stage.input.next(line, stage.virtualTime)) {
                case LineInput::Got::Line:
                    if (!line.empty() && line.back() == '\r') line.pop_back();
                    return bytesToUtf8(line);
                case LineInput::Got::End:
                    inputEnded = true;
                    break;
                case LineInput::Got::TooLong:
                    return std::string();
                case LineInput::Got::Nothing:
                    stage.events.inner().wait(kLookMs);
                    break;
            }
        }
        return std::nullopt;
    }

    bool take(const std::string& signal) {
        if (signal != "SIGINT") return false;
        interrupted = true;
        form.cmdStop.Click();
        form.ReleaseWait();
        return true;
    }

    /// The hook of the event loop: a line of the input is a press of Next.
    bool whileWaiting(int ms) {
        if (interrupted || !form.WaitsForNext) return false;
        std::string line;
        switch (inputEnded ? LineInput::Got::End : stage.input.next(line, stage.virtualTime)) {
            case LineInput::Got::End:
                inputEnded = true;
                form.ReleaseWait();  // the run goes on by itself
                break;
            case LineInput::Got::Nothing:
                stage.events.inner().wait(std::min(ms, kLookMs));
                break;
            default:
                form.cmdNext.Click();
        }
        return true;
    }

    void execute() {
        stage.signals.takes = [this](const std::string& signal) { return take(signal); };
        stage.boxes.reader = [this] { return nextLine(); };
        stage.dialogs.reader = [this] { return nextLine(); };
        stage.events.whileWaiting = [this](int ms) { return whileWaiting(ms); };
        form.cmdExecute.Click();
        stage.events.whileWaiting = nullptr;
        stage.boxes.reader = nullptr;
        stage.dialogs.reader = nullptr;
        stage.signals.takes = nullptr;
    }
};

bool readable(FileService& files, const std::string& path) {
    FileProblem problem;
    return files.open(path, problem) != nullptr;
}

}  // namespace

namespace {

/// Something is wrong with the script that was checked.
constexpr int kFound = 3;

int unreadable(const Options& options, LineOutput& errors) {
    errors.line("zelctl: " + options.argument + " cannot be read");
    return kWrongUse;
}

}  // namespace

int rehearseScript(const Options& options, FileService& files, LineOutput& output,
                   LineOutput& errors) {
    if (!readable(files, options.argument)) return unreadable(options, errors);
    RehearsalSetup setup;
    setup.script = options.argument;
    setup.folder = std::filesystem::current_path().string();
    setup.output = options.output;
    const bool serial = options.address && !options.address->simulated &&
                        options.address->link.kind == LinkAddress::Kind::Serial;
    if (serial) setup.baud = options.address->link.number;
    const RehearsalReport report = rehearse(setup, files);
    output.lines(reportLines(report));
    return report.wrong() ? kFound : kDone;
}

int runScript(const Options& options, const ScriptStage& stage) {
    SpecialMeasForm& form = stage.program.forms().specialMeas;
    if (!readable(stage.files, options.argument)) return unreadable(options, stage.errors);
    stage.program.forms().controller.cmdSpecial.Click();
    stage.answers.add(options.argument);
    form.cmdOpenCommandsFile.Click();
    form.ScriptFolder = std::filesystem::current_path().string();
    if (!options.output.empty()) {
        form.chkSave.setValue(true);
        form.DataFileNameSpec = options.output;
        form.DataFileNameTyped = true;
    }
    if (stage.progress) {
        form.lblProgress.Changed.connect([&] { stage.progress(form.lblProgress.Caption); });
    }
    ScriptRunner runner{stage};
    runner.execute();
    if (stage.progress) stage.progress("");
    form.cmdCancel.Click();
    return form.ReachedEnd ? kDone : kLinkFailed;
}

}  // namespace zel
