#pragma once
// Runs the list of the script window from top to bottom, a statement at a time.

#include <cstdint>
#include <string>

#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "forms/ScriptForms.h"
#include "platform/Clock.h"
#include "platform/Event.h"
#include "platform/Session.h"
#include "script/ComplexMeasurement.h"
#include "script/Language.h"
#include "script/ResultOutput.h"
#include "script/ScriptParts.h"
#include "script/ScriptRun.h"
#include "trace/Interlock.h"

namespace zel {

/// A run goes on inside the click of its button, and lets events run meanwhile: Stop, Next, the
/// boxes and the panel act by the form's flags.
class Executor : private StatementRoutines {
  public:
    Executor(Forms& forms, const InstrumentLine& line, const PanelRoutines& panel,
             ResultOutput& results, ComplexMeasurement& complex, const Interlock& interlock);

    void cmdExecute_Click();
    void cmdNext_Click();
    void cmdStop_Click();
    void chkStep_Click();
    /// Ends every wait of the step mode; the runs walk to their ends without acting.
    void release();

    /// Before each statement that is carried out; its index in the list.
    Event<int> StatementBegins;
    /// The instrument refused an exchange of the statement under way.
    Event<const std::string&> Refused;
    /// The list goes back, out of a loop or a scan; what it goes by. A handler that sets the flag
    /// keeps the run from going back.
    Event<const ScriptRun&, bool&> GoesBack;

  private:
    // Lifecycle.
    void begin(ScriptRun& run);
    void walk(ScriptRun& run);
    void waitForNext(const ScriptRun& run);
    void carryOut(ScriptRun& run);
    void close();
    void finish();
    void holdPanel();
    void freePanel();
    void followStepBox(bool releases);
    void selectCommandLine(int index);
    void turn();
    void pointer(int shape);
    void showProgress(bool now);
    const std::string* entry(int index) const;
    bool refusedUnconnected(const Statement& statement);
    void resynchronise();
    void fail(const std::string& text);

    // Statements.
    void comment(const Line& line) override;
    void noSave(const Line& line) override;
    void saveResults(const Line& line) override;
    void stepMode(const Line& line) override;
    void command(const Line& line) override;
    void setting(const Line& line) override;
    void query(const Line& line) override;
    void complexTrace(const Line& line) override;
    void getTrace(const Line& line) override;
    void quickTrace(const Line& line) override;
    void saveSweep(const Line& line) override;
    void showDialog(const Line& line) override;
    void waterfallOn(const Line& line) override;
    void waterfallOff(const Line& line) override;
    void autoRecall(const Line& line) override;
    void writeComment(const Line& line) override;
    void pause(const Line& line) override;
    void beginLoop(const Line& line) override;
    void endLoop(const Line& line) override;
    void upperLimit(const Line& line) override;
    void averageCount(const Line& line) override;
    void lowerLimit(const Line& line) override;
    void scanStart(const Line& line) override;
    void scanStep(const Line& line) override;
    void scanStop(const Line& line) override;
    void loadTrace(const Line& line) override;
    void saveScreen(const Line& line) override;

    // Their parts.
    bool cmd(const std::string& keyword);
    bool set(const std::string& keywordAndValue);
    bool get(const std::string& keyword, std::string& answer);
    bool goBack(int index);
    void nextTraceRow();
    void triggeredTrace();
    void setScanning(bool scanning);
    std::string indexedName(const std::string& argument);
    std::string askForImage();
    std::string drawMetafile(const std::string& path);

    Forms& forms_;
    SpecialMeasForm& form_;
    ControllerForm& panel_;
    InstrumentLine line_;
    PanelRoutines routines_;
    ResultOutput& results_;
    ComplexMeasurement& complex_;
    const Interlock& interlock_;
    Session session_;
    ScriptRun* run_ = nullptr;  ///< the innermost
    Stopwatch elapsed_;
    std::int64_t progressShown_ = 0;  ///< us
    int statementsSinceWait_ = 0;
    bool continuousWasEnabled_ = true;
    bool startPending_ = false;
    Handlers handlers_;
};

}  // namespace zel
