#pragma once
// Records traces into a file: by a timer, or each time that an external trigger fires.

#include <cstdint>
#include <string>

#include "files/ViewWriter.h"
#include "forms/Forms.h"
#include "link/CommandExchange.h"
#include "link/InstrumentLink.h"
#include "model/ZEL3Variables.h"
#include "platform/Clock.h"
#include "platform/Event.h"
#include "platform/Session.h"
#include "trace/SweepControl.h"

namespace zel {

class Recording {
  public:
    /// Connects the menu entry, the dialog and its timer `X`.
    Recording(Forms& forms, ZEL3Variables& mirror, const InstrumentLink& link, SweepControl& sweeps,
              ViewWriter& writer, const Session& session);

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
    /// A tick of the timer reads a trace: what fails is counted in the progress line and shown in
    /// no box. A recording that has ended, as after a full disk, is no tick any more.
    bool inTimedTick() const { return inTick_ && panel_.RecordData.Checked; }

  private:
    std::string missedText() const;
    void loadForm();
    bool chooseFile();
    void abandon();
    void windUp();
    bool takeTrace();
    bool countTrace();
    void clearCounts();
    void resynchronise();
    void showProgress();

    Forms& forms_;
    ControllerForm& panel_;
    TimeForm& dialog_;
    ZEL3Variables& mirror_;
    InstrumentLink link_;
    CommandExchange& exchange_;
    SweepControl& sweeps_;
    ViewWriter& writer_;
    Session session_;
    Stopwatch running_;
    std::int64_t lastTick_ = 0;  ///< us, when the timer was started or last fired
    bool inTick_ = false;
    Handlers handlers_;
};

}  // namespace zel
