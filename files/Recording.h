#pragma once
// Records traces into a file: by a timer, or each time that an external trigger fires.

#include <cstdint>
#include <string>

#include "files/FileOps.h"
#include "files/ViewWriter.h"
#include "forms/Forms.h"
#include "link/AnswerReader.h"
#include "link/ByteLink.h"
#include "link/CommandExchange.h"
#include "model/ZEL3Variables.h"
#include "platform/Clock.h"
#include "platform/Events.h"
#include "platform/MessageBox.h"
#include "trace/SweepControl.h"
#include "trace/TraceReader.h"

namespace zel {

class Recording {
  public:
    /// Connects the menu entry, the dialog and its timer `X`.
    Recording(Forms& forms, ZEL3Variables& mirror, ByteLink& link, AnswerReader& reader,
              CommandExchange& exchange, TraceReader& traces, SweepControl& sweeps, FileOps& files,
              ViewWriter& writer, const Clock& clock, Events& events, MessageBoxes& boxes);

    void RecordData_Click();
    /// TRIGSRC, unless a power sensor measures.
    void ReadTriggerSource();
    void SubmitTimeButton_Click();
    void X_Timer();
    /// Waits for triggers and takes a trace at each, until Stop or a time-out (seconds). A script
    /// gets exactly one trace.
    void RecordExtTrigger(std::int32_t timeout);

    /// "trace.csv: 12 traces, 118 kB, 00:01:05, next in 3 s"; empty while nothing is recorded.
    std::string progressText() const;

  private:
    void loadForm();
    bool chooseFile();
    void abandon();
    void windUp();
    bool takeTrace();
    void resynchronise();
    void showProgress();
    void pointer(int shape);

    Forms& forms_;
    ControllerForm& panel_;
    TimeForm& dialog_;
    ZEL3Variables& mirror_;
    ByteLink& link_;
    AnswerReader& reader_;
    CommandExchange& exchange_;
    TraceReader& traces_;
    SweepControl& sweeps_;
    FileOps& files_;
    ViewWriter& writer_;
    const Clock& clock_;
    Events& events_;
    MessageBoxes& boxes_;
    Stopwatch running_;
    std::int64_t lastTick_ = 0;  ///< us, when the timer was started or last fired
    bool inTick_ = false;
};

}  // namespace zel
