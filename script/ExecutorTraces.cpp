// The statements of a run that take traces, load them and save them.

#include <cmath>
#include <limits>
#include <string>

#include "model/CodeTables.h"
#include "model/Numeric.h"
#include "platform/Files.h"
#include "platform/MessageBox.h"
#include "platform/Pointer.h"
#include "script/Executor.h"
#include "script/Language.h"
#include "script/ResultNames.h"
#include "script/ScriptFailure.h"
#include "support/CodePage.h"
#include "support/FileText.h"
#include "support/NumberText.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr const char* kImageKind = "wmf";

/// A row more of the waterfall; a session of weeks must not wrap.
template <class Count>
void countUp(Count& count) {
    if (count < std::numeric_limits<Count>::max()) ++count;
}

}  // namespace

void Executor::nextTraceRow() {
    if (form_.chkWaterfall.Value()) {
        countUp(panel_.YVectorVal);
    } else {
        panel_.YVectorVal = 0;
    }
}

void Executor::triggeredTrace() {
    const double timeOut = ParseNumberInvariant(replaceAll(run_->timeOutText, ".", ","));
    routines_.recording.RecordExtTrigger(wholeNumber(timeOut));
}

void Executor::getTrace(const Line& line) {
    nextTraceRow();
    std::string answer;
    if (!get("TRIGSRC", answer) && line_.state.ExchangeFailed) return;
    line_.mirror.TriggerSource = wholeNumber(leadingNumber(answer));
    line_.mirror.ExternalTriggerActive =
        line_.mirror.TriggerSource == TRIGEXTRISE || line_.mirror.TriggerSource == TRIGEXTFALL;
    if (!line_.mirror.ExternalTriggerActive) {
        panel_.PlaySingleButton.Click();
        return;
    }
    run_->timeOutText = line.argument;
    triggeredTrace();
}

void Executor::quickTrace(const Line& line) {
    nextTraceRow();
    if (line_.mirror.ExternalTriggerActive) {
        // QUICK TRACE has no number of its own: the text of the statement before counts.
        if (startsWith(line.text, "QUICKSWEEP")) run_->timeOutText = line.argument;
        triggeredTrace();
        return;
    }
    if (!cmd("INIT")) {
        panel_.MousePointer = kArrow;
        run_->ended = true;
        return;
    }
    bool success = false;
    routines_.traces.ReadSingleTrace2({}, success);
}

void Executor::saveSweep(const Line&) {
    if (form_.DataFileNameSpec.empty()) return;
    std::string none;
    results_.buildOutputFileName(run_->loopCounter, false, "", none);
    panel_.SaveCurrentView.Click();
    results_.restoreOutputFileName();
}

/// Inside a loop "*" is the pass.
std::string Executor::indexedName(const std::string& argument) {
    if (!form_.insideLoop) return argument;
    return replaceAll(replaceAll(argument, "*", numberText(run_->loopCounter)), " ", "");
}

void Executor::loadTrace(const Line& line) {
    form_.fileNameIsIndexed = true;
    const std::string name = indexedName(trimmed(line.argument));
    const auto path = resolveName(routines_.files.service(), name, form_.ScriptFolder, false);
    if (!path) throw ScriptFailure("The file " + name + " cannot be read: no such name here");
    const std::string text = routines_.files.ReadWholeFile(*path);
    if (form_.chkWaterfall.Value()) {
        countUp(run_->loadedTraceCount);
    } else {
        run_->loadedTraceCount = 0;
    }
    if (contains(upperCaseText(name), "DAT") || contains(text, "END OF LOG")) {
        routines_.reader.LoadTheDataForOlderVersions(text);
        return;
    }
    const FileStatus file = routines_.files.service().stat(*path);
    routines_.reader.LoadTheData(text, session_.clock.dateTimeText(file.modified),
                                 run_->loadedTraceCount);
}

std::string Executor::askForImage() {
    const BoxAnswer answer = session_.boxes.show(
        {BoxIcon::Question,
         "There are instructions to save data in the script, but no WMF file has been selected.\r\n"
         "Do you want to select a file now?\r\n\r\n"
         "Please note that you can save images only in WMF format.",
         "No output file specified", BoxButtons::YesNoCancel});
    if (answer == BoxAnswer::No) form_.noSaveAnswered = true;
    if (answer == BoxAnswer::Cancel) form_.cmdStop.Click();
    return answer == BoxAnswer::Yes ? routines_.files.ShowSaveImageDialog(kImageKind)
                                    : std::string();
}

/// What went wrong, else an empty text.
std::string Executor::drawMetafile(const std::string& path) {
    const std::string ending = std::string(".") + kImageKind;
    const bool named = lowerCase(path).ends_with(ending);
    // The ending decides about the kind of a picture, and this one is a metafile in any case.
    const std::string drawn = named ? path : path + ending;
    std::string problem;
    panel_.DrawImage(drawn, problem);
    if (named || !problem.empty()) return problem;
    FileService& files = routines_.files.service();
    FileProblem failure;
    const auto picture = readFile(files, drawn, FileOps::kLargestFile, failure);
    if (picture) failure = files.replace(path, *picture);
    files.remove(drawn);
    return failure.empty() ? std::string() : writeProblem(path, failure);
}

void Executor::saveScreen(const Line& line) {
    form_.fileNameIsIndexed = true;
    std::string name = indexedName(trimmed(line.argument));
    bool typed = false;
    if (name.empty() && !form_.noSaveAnswered) {
        name = askForImage();
        typed = true;
        if (name.empty()) return;
    }
    if (!contains(upperCaseText(name), "WMF")) {
        session_.boxes.show(
            {BoxIcon::Plain, "The file you specified is not a WMF file.", "Wrong file type"});
        name = routines_.files.ShowSaveImageDialog(kImageKind);
        typed = true;
        if (name.empty()) return;
    }
    const auto path = resolveName(routines_.files.service(), name, form_.ScriptFolder, typed);
    if (!path) throw ScriptFailure("The file " + name + " cannot be written: no such name here");
    if (const std::string problem = drawMetafile(*path); !problem.empty())
        throw ScriptFailure(problem);
}

}  // namespace zel
