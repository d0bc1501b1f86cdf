#include "console/Verbs.h"

#include <utility>
#include <vector>

#include "console/GraphText.h"
#include "console/PanelSession.h"
#include "link/CommandExchange.h"
#include "support/NumberText.h"
#include "trace/TraceReader.h"

namespace zel {
namespace {

struct Run {
    const Options& options;
    Program& program;
    LineOutput& output;
    LineOutput& errors;
    const ImageWriter& image;

    int fail(const std::string& what) const {
        errors.line("zelctl: " + what);
        return kLinkFailed;
    }
};

int info(const Run& run) {
    Forms& forms = run.program.forms();
    const ZEL3Variables& mirror = run.program.variables();
    const bool tcp = run.options.address->link.kind == LinkAddress::Kind::Tcp;
    const std::pair<const char*, std::string> lines[] = {
        {"Identity", tcp ? forms.tcpConnection.IDTextBox.Text : forms.main.IDText.Text},
        {"Model", std::to_string(mirror.InstrumentModel)},
        {"Serial", generalNumber(mirror.InstrumentSerial)},
        {"Mode", std::to_string(forms.controller.InstrumentMode)},
        {"Center", generalNumber(mirror.CenterFrequency)},
        {"Span", generalNumber(mirror.Span)},
        {"RefLevel", generalNumber(mirror.ReferenceLevel)},
        {"Unit", generalNumber(mirror.ReferenceUnit)},
        {"Range", generalNumber(mirror.ReferenceRange)},
        {"SweepTime", generalNumber(mirror.SweepTime)},
        {"Detector", std::to_string(mirror.TraceDetector)},
    };
    for (const auto& [name, value] : lines) run.output.line(std::string(name) + ": " + value);
    return kDone;
}

int get(const Run& run) {
    std::string value;
    if (!run.program.exchange().GetInstrument(run.options.argument, value))
        return run.fail("no answer to GET " + run.options.argument);
    run.output.line(value);
    return kDone;
}

int set(const Run& run) {
    if (run.program.exchange().SetInstrument(run.options.argument)) return kDone;
    return run.fail("the instrument did not take " + run.options.argument);
}

int cmd(const Run& run) {
    if (run.program.exchange().CmdInstrument(run.options.argument)) return kDone;
    return run.fail("the instrument did not carry out " + run.options.argument);
}

int sweep(const Run& run) {
    const ControllerForm& panel = run.program.forms().controller;
    for (int i = 0; i < run.options.count; ++i) {
        bool success = false;
        run.program.traces().ReadSingleTrace(success);
        if (!success) return run.fail("sweep " + std::to_string(i + 1) + " could not be read");
        const bool autoPeak = run.program.variables().TraceDetector == 0;
        run.output.line(i == 0 ? sweepHeader(autoPeak) : std::string());
        run.output.lines(sweepRows(panel, autoPeak));
    }
    if (run.options.image.empty()) return kDone;
    const std::string problem = run.image(run.program, run.options.image);
    return problem.empty() ? kDone : run.fail(problem);
}

using Routine = int (*)(const Run&);
struct VerbRow {
    Verb verb;
    Routine routine;
};
constexpr VerbRow kVerbs[] = {
    {Verb::Info, info}, {Verb::Get, get}, {Verb::Set, set}, {Verb::Cmd, cmd}, {Verb::Sweep, sweep},
};

}  // namespace

int runVerb(const Options& options, Program& program, LineOutput& output, LineOutput& errors,
            const ImageWriter& image) {
    const Run run{options, program, output, errors, image};
    program.start();
    if (!program.connect(options.address->link, false)) {
        errors.settle();
        return run.fail("no instrument was connected");
    }
    int status = kWrongUse;
    for (const VerbRow& row : kVerbs)
        if (row.verb == options.verb) status = row.routine(run);
    program.disconnect();
    errors.settle();
    return status;
}

}  // namespace zel
