#include "files/ViewWriter.h"

#include <string>
#include <string_view>

#include "files/FileOps.h"
#include "files/OutputFile.h"
#include "files/SweepFile.h"
#include "files/ViewFormat.h"
#include "files/ViewHeader.h"
#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "link/CommandExchange.h"
#include "model/CodeTables.h"
#include "model/ZEL3Variables.h"
#include "platform/MessageBox.h"
#include "platform/Session.h"
#include "support/AtEnd.h"
#include "support/NumberText.h"
#include "support/Text.h"
#include "trace/Sweep.h"

namespace zel {
namespace {

using CF = ControllerForm;

struct AutoBandwidth {
    const char* word;
    const char* message;
};
constexpr double kUnknownBandwidth = 1000000;
constexpr AutoBandwidth kAutoBandwidths[] = {
    {"RBW",
     "No value for the Resolution Bandwidth was saved. Please enter it manually in the .csv file."},
    {"VBW",
     "No value for the Video Bandwidth was saved. Please enter it manually in the .csv file."},
};

}  // namespace

ViewWriter::ViewWriter(Forms& forms, ZEL3Variables& mirror, Sweep& onGraph,
                       CommandExchange& exchange, FileOps& files, const Session& session)
    : forms_(forms),
      panel_(forms.controller),
      mirror_(mirror),
      onGraph_(onGraph),
      exchange_(exchange),
      files_(files),
      session_(session) {
    handlers_.on(panel_.SaveCurrentView.Clicked, [this] { SaveCurrentView_Click(); });
    handlers_.on(panel_.SaveView, [this](const std::string& kind) { SaveView(kind); });
}

void ViewWriter::SaveCurrentView_Click() {
    const bool power = panel_.InstrumentMode == CF::POWERSENSOR;
    if (!power && onGraph_.incomplete()) {
        session_.boxes.show(
            {BoxIcon::Exclamation, "The trace is incomplete, " + std::to_string(onGraph_.came) +
                                       " of " + std::to_string(onGraph_.wanted) +
                                       " samples came, and is not saved. Read a new one first."});
        return;
    }
    panel_.DataFileName = panel_.isSpecMeas ? forms_.specialMeas.DataFileNameSpec
                                            : files_.ShowSaveDataDialog(FileOps::kCsvFilter);
    if (panel_.isSpecMeas) forms_.specialMeas.ResolveName(panel_.DataFileName);
    if (panel_.DataFileName.empty()) return;
    fromMenu_ = true;
    const AtEnd done([this] { fromMenu_ = false; });
    SaveView(power ? "power" : "trace");
    // A script names its files itself, and a power log is never loaded.
    const std::string warning = oldLogWarning(panel_.DataFileName);
    if (!warning.empty() && !panel_.isSpecMeas && !power)
        session_.boxes.show({BoxIcon::Exclamation, warning});
}

void ViewWriter::SaveView(const std::string& kind) {
    if (kind == "trace") SaveTraceView(upperCase(trimmed(panel_.CommandLine)) != "NOHEADER");
    if (kind == "power") savePowerValues();
}

OutputFile ViewWriter::target() const {
    using Mode = OutputFile::Mode;
    if (panel_.isSpecMeas) return {files_.service(), panel_.DataFileName, Mode::Append};
    const bool timed = forms_.time.ContinuousRecording;
    const bool recording = timed && !fromMenu_ && !RecordingFileName.empty();
    return {files_.service(), recording ? RecordingFileName : panel_.CommonDialog1FileName,
            timed ? Mode::Append : Mode::Output};
}

void ViewWriter::SaveTraceView(bool withHeader) {
    OutputFile file = target();
    WriteViewHeader(file, withHeader);
    WriteViewData(file);
    WriteFooterAndCloseFileZELViewFormat(file);
}

void ViewWriter::bandwidth(const char* word) {
    double& value =
        std::string_view(word) == "RBW" ? mirror_.ResolutionBandwidth : mirror_.VideoBandwidth;
    double& ofSweep = std::string_view(word) == "RBW" ? onGraph_.settings.ResolutionBandwidth
                                                      : onGraph_.settings.VideoBandwidth;
    if (panel_.isConnected) {
        std::string answer;
        if (!exchange_.GetInstrument(word, answer) || !startsWithNumber(answer)) return;
        value = leadingNumber(answer);
        // After a setting it may be another than that of the trace.
        if (!onGraph_.settingsKept) ofSweep = value;
        return;
    }
    ofSweep = value = kUnknownBandwidth;
    for (const AutoBandwidth& row : kAutoBandwidths)
        if (std::string_view(word) == row.word)
            session_.boxes.show({BoxIcon::Exclamation, row.message});
}

void ViewWriter::WriteViewHeader(OutputFile& file, bool withHeader) {
    if (!withHeader) return;
    followMirror(onGraph_, mirror_);
    const bool read = onGraph_.wanted > 0;  // else there is only what the panel has now
    ViewHeader{read ? onGraph_.settings : mirror_,
               read ? onGraph_.instrumentMode : panel_.InstrumentMode, mirror_, session_.clock,
               [this](const char* word) { bandwidth(word); }}
        .write(file);
}

void ViewWriter::WriteViewData(OutputFile& file) {
    const double last = writeSweepRows(file, onGraph_);
    if (!onGraph_.physical.empty()) panel_.ViewXOffset = last;
}

void ViewWriter::finish(OutputFile& file) {
    const std::string problem = file.close();
    if (problem.empty()) return;
    const bool recording = panel_.RecordDataFlag && !panel_.isSpecMeas;
    // Before the box, so that no further trace is begun after it.
    if (recording) panel_.StopButton.Click();
    session_.boxes.show(
        {BoxIcon::Critical, recording ? problem + kCrLf + "The recording was stopped." : problem});
}

void ViewWriter::WriteFooterAndCloseFileZELViewFormat(OutputFile& file) { finish(file); }

void ViewWriter::savePowerValues() {
    const bool recording = !fromMenu_ && !panel_.isSpecMeas && !RecordingFileName.empty();
    OutputFile file(files_.service(), recording ? RecordingFileName : panel_.DataFileName,
                    OutputFile::Mode::Append);
    file.line("Power at: " + nowText() + ": " + panel_.LastPowerText);
    if (forms_.powerAndRefl.ReadPowerAndRefl)
        file.line("VSWR:" + std::string(26, ' ') + panel_.LastReflectionText);
    finish(file);
}

void ViewWriter::WriteLogHeader(OutputFile& file) {
    const bool pairs = mirror_.TraceDetector == DETAUTOPEAK;
    const bool linear = mirror_.ReferenceRange >= RANGELIN;
    const char* kind =
        pairs ? (linear ? "(LIN/MinMax) at;" : "(MinMax) at;") : (linear ? "(LIN) at;" : " at;");
    file.line((mirror_.Span == 0 ? "Data(ZeroSpan)" : "Data") + std::string(kind) + nowText() +
              ";");
    file.line("______________________________");
    file.line(" ");
}

void ViewWriter::WriteFooterAndCloseFile(OutputFile& file) {
    file.line(" ........END OF LOG FOR " + nowText());
    file.line("___________________________________________");
    file.line(" ");
    finish(file);
}

}  // namespace zel
