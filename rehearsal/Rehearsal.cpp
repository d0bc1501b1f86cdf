#include "rehearsal/Rehearsal.h"

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <filesystem>
#include <set>
#include <string>
#include <string_view>
#include <tuple>
#include <vector>

#include "ZELSim/InProcessPort.h"
#include "platform/Files.h"
#include "platform/LinkAddress.h"
#include "platform/MessageBox.h"
#include "platform/SerialPort.h"
#include "platform/virtual/VirtualPlatform.h"
#include "rehearsal/RehearsalDisk.h"
#include "script/Executor.h"
#include "script/Language.h"
#include "script/LineCheck.h"
#include "script/ScriptFile.h"
#include "script/ScriptRun.h"
#include "script/Scripts.h"
#include "support/NumberText.h"
#include "support/Text.h"

namespace zel {
namespace {

namespace fs = std::filesystem;

constexpr const char* kPort = "SIM";
constexpr double kAnswerSeconds = 0.0001;
constexpr double kBitsOfByte = 10;
/// A script that takes more is looked at no further.
constexpr long kMostStatements = 1'000'000;

/// A port that counts what passes.
class CountingPort : public SerialPort {
  public:
    explicit CountingPort(SerialPort& port) : port_(port) {
        port_.OnComm.connect([this](int what) { OnComm(what); });
    }
    bool open(const SerialSetup& setup) override { return port_.open(setup); }
    void close() override { port_.close(); }
    bool isOpen() const override { return port_.isOpen(); }
    std::string input() override {
        std::string bytes = port_.input();
        count += bytes.size();
        return bytes;
    }
    void output(std::string_view bytes) override {
        count += bytes.size();
        port_.output(bytes);
    }
    std::string problem() const override { return port_.problem(); }

    std::size_t count = 0;

  private:
    SerialPort& port_;
};

/// What a run goes by when it goes back; the same state once more means that it never ends.
using RunState = std::tuple<int, int, int, int, double, double, bool>;

class Stage {
  public:
    Stage(const RehearsalSetup& setup, FileService& files)
        : setup_(setup),
          disk_(files, [this](const std::string& path, const char* fate) { noteFile(path, fate); }),
          device_(platform_.clock, platform_.events, {},
                  {.baud = setup.baud, .answering = kAnswerSeconds}),
          port_(device_),
          program_(platform_.bundle(port_, disk_), ""),
          form_(program_.forms().specialMeas),
          mirror_(program_.variables()) {}

    RehearsalReport run() {
        const auto script = readScript(disk_, setup_.script);
        const std::string text = script ? script->text : std::string();
        lines_ = scriptLines(text);
        for (const LineFinding& finding : checkScript(text)) add(finding.line, finding.text);
        platform_.ports.ports = {kPort};
        program_.start();
        program_.connect({LinkAddress::Kind::Serial, kPort, setup_.baud}, false);
        watch();
        prepare();
        const std::int64_t start = platform_.clock.micros();
        const std::size_t before = port_.count;
        form_.cmdExecute.Click();
        report_.seconds = static_cast<double>(platform_.clock.micros() - start) / 1e6;
        report_.bytes = port_.count - before;
        if (report_.seconds > 0)
            report_.load = static_cast<double>(report_.bytes) * kBitsOfByte / setup_.baud /
                           report_.seconds * 100;
        if (!form_.ReachedEnd && !cut_) add(lineOf(index_), "The run ends here" + lastBox());
        std::stable_sort(report_.findings.begin(), report_.findings.end(),
                         [](const LineReport& a, const LineReport& b) { return a.line < b.line; });
        return report_;
    }

  private:
    void prepare() {
        program_.forms().controller.cmdSpecial.Click();
        program_.scripts().window.open(setup_.script);
        form_.ScriptFolder = setup_.folder;
        if (setup_.output.empty()) return;
        form_.chkSave.setValue(true);
        form_.DataFileNameSpec = setup_.output;
        form_.DataFileNameTyped = true;
    }

    void watch() {
        Executor& executor = program_.scripts().executor;
        executor.StatementBegins.connect([this](int index) {
            index_ = index;
            form_.ReleaseWait();  // in step mode the presses take no time
            if (++statements_ == kMostStatements) {
                add(lineOf(index),
                    "The check ends here, after a million statements; the run takes longer.");
                cut_ = true;
                form_.cmdStop.Click();
            }
        });
        executor.Refused.connect([this](const std::string& words) {
            add(lineOf(index_), "The instrument refuses " + words + ".");
        });
        executor.GoesBack.connect([this](const ScriptRun& run, bool& stay) {
            const bool forEver = run.lineIndex == index_ && endless(run);
            if (!forEver) return;
            add(lineOf(index_), "The loop has no end.");
            stay = true;
        });
        program_.forms().controller.DrawImage.connect(
            [this](const std::string& path, std::string& problem) {
                problem = disk_.replace(path, " ");
            });
    }

    bool endless(const ScriptRun& run) {
        const RunState state{run.lineIndex,       run.loopStartIndex,      run.loopCounter,
                             run.scanReturnIndex, mirror_.CenterFrequency, run.scanStep,
                             form_.insideLoop};
        if (!states_.insert(state).second) return true;
        const Statement* statement =
            findStatement(statementText(lines_.at(static_cast<std::size_t>(run.lineIndex)).text));
        if (statement == nullptr) return false;
        const double number = numberOf(*statement, run.lineIndex);
        const bool loop = statement->word == "LOOP" && number < -0.5;
        const bool scan = statement->word == "SCANSTOP" && run.scanStep <= 0;
        return loop || scan;
    }

    double numberOf(const Statement& statement, int index) const {
        const std::string text = statementText(lines_.at(static_cast<std::size_t>(index)).text);
        return leadingNumber(argumentOf(statement, text));
    }

    void noteFile(const std::string& path, const char* fate) {
        const fs::path inside = fs::path(path).lexically_relative(setup_.folder);
        const bool below = !inside.empty() && *inside.begin() != "..";
        report_.files.push_back({below ? inside.string() : path, fate});
    }

    int lineOf(int index) const {
        const bool known = index >= 0 && index < static_cast<int>(lines_.size());
        return known ? lines_[static_cast<std::size_t>(index)].line : 0;
    }

    void add(int line, const std::string& text) {
        for (const LineReport& known : report_.findings)
            if (known.line == line && known.text == text) return;
        report_.findings.push_back({line, text});
    }

    std::string lastBox() const {
        const auto texts = platform_.boxes.texts();
        return texts.empty() ? "." : ": " + replaceAll(texts.back(), kCrLf, " ");
    }

    RehearsalSetup setup_;
    RehearsalDisk disk_;
    VirtualPlatform platform_;
    zelsim::InProcessPort device_;
    CountingPort port_;
    Program program_;
    SpecialMeasForm& form_;
    ZEL3Variables& mirror_;
    RehearsalReport report_;
    std::vector<ScriptLine> lines_;
    std::set<RunState> states_;
    long statements_ = 0;
    int index_ = -1;
    bool cut_ = false;
};

std::string rounded(double value) { return generalNumber(roundHalfEven(value, 1)); }

}  // namespace

RehearsalReport rehearse(const RehearsalSetup& setup, FileService& files) {
    return Stage(setup, files).run();
}

std::vector<std::string> reportLines(const RehearsalReport& report) {
    std::vector<std::string> lines;
    for (const LineReport& finding : report.findings)
        lines.push_back("line " + std::to_string(finding.line) + ": " + finding.text);
    for (const FileReport& file : report.files) lines.push_back(file.name + ": " + file.fate);
    lines.push_back("duration: " + rounded(report.seconds) + " s");
    lines.push_back("line load: " + std::to_string(report.bytes) + " bytes, " +
                    rounded(report.load) + " %");
    return lines;
}

void offerRehearsal(Program& program, MessageBoxes& boxes, FileService& files) {
    constexpr std::size_t kMostLines = 24;
    SpecialMeasForm& form = program.forms().specialMeas;
    form.cmdRehearse.Clicked.connect([&form, &boxes, &files] {
        if (form.currFileName.empty() || form.RunsActive > 0) return;
        RehearsalSetup setup;
        setup.script = form.currFileName;
        setup.folder = form.ScriptFolder;
        if (form.chkSave.Value()) setup.output = form.DataFileNameSpec;
        const RehearsalReport report = rehearse(setup, files);
        std::vector<std::string> lines = reportLines(report);
        if (lines.size() > kMostLines) {
            const std::size_t more = lines.size() - kMostLines;
            // The figures at the end are the last to go.
            lines.erase(lines.begin() + kMostLines - 3, lines.end() - 3);
            lines.insert(lines.end() - 3, "... and " + std::to_string(more + 1) + " more");
        }
        std::string text;
        for (const std::string& line : lines) text += (text.empty() ? "" : kCrLf) + line;
        boxes.show({report.wrong() ? BoxIcon::Exclamation : BoxIcon::Information, text,
                    "Check of the script"});
    });
}

}  // namespace zel
