#pragma once
// The forms of the measurement scripts: the list that runs, the statistics, the editor.

#include <cstdint>
#include <string>
#include <vector>

#include "platform/Controls.h"
#include "platform/Event.h"
#include "platform/Form.h"

namespace zel {

/// The list box is the program that runs: a statement is fetched from it each time it is reached.
class SpecialMeasForm : public Form {
  public:
    SpecialMeasForm();

    // The script and its file.
    std::string currFileName;    ///< chosen last in the open dialog; reloading reads it
    std::string currFilePath;    ///< folder of the scripts, and the name picked in the list
    std::string CurrScriptFile;  ///< what the editor opens; empty without a script
    std::string ScriptFolder;    ///< relative names of a script stand for files in here

    // The result file.
    std::string DataFileNameSpec;    ///< may hold "*"; empty without a result file
    std::string outputFileTemplate;  ///< the name with its "*" while that is replaced
    bool fileNameIsIndexed = false;  ///< after a write the name goes back to the template
    bool DataFileNameTyped = false;  ///< it comes from a dialog and not from a script

    // The run.
    bool continueRun = false;  ///< cleared by Stop
    bool isStepMode = false;
    bool nextRequested = false;
    bool noSaveAnswered = false;
    bool insideLoop = false;
    bool noDate = false;
    bool noTime = false;
    std::int16_t ctraceMeasurementNo = 0;
    std::vector<double> meanLevelSamples;  ///< dBm
    std::vector<double> meanPhaseSamples;  ///< rad
    std::int16_t RunsActive = 0;           ///< invocations of Execute that have not ended
    bool WaitsForNext = false;             ///< step mode: a statement waits for `cmdNext`
    bool ReachedEnd = false;               ///< the last run came to the end of the list

    /// Gives the file that a result name stands for; the name becomes empty for none.
    Event<std::string&> ResolveName;
    /// Ends a wait of the step mode, stopped or not.
    Event<> ReleaseWait;

    /// How long a trace of a loaded series stands at the slider's pace, in milliseconds; 0 at the
    /// slider's top.
    int seriesPauseMs() const;

    Button cmdOpenCommandsFile{*this, "cmdOpenCommandsFile", "Open..."};
    Button cmdEdit{*this, "cmdEdit", "Edit..."};
    Button cmdNew{*this, "cmdNew", "New..."};
    DropDownList cmboSpecialMeasList{*this, "cmboSpecialMeasList"};
    ListBox lstCommands{*this, "lstCommands"};
    CheckBox chkStep{*this, "chkStep", "Step Mode"};
    CheckBox chkWaterfall{*this, "chkWaterfall", "Waterfall"};
    CheckBox chkGetSweep{*this, "chkGetSweep", "Get Sweep"};
    CheckBox chkSave{*this, "chkSave", "Save Results"};
    Button cmdSave{*this, "cmdSave", "Output File..."};
    Slider sldSpeed{*this, "sldSpeed"};  ///< pace of a loaded series; the top is without a pause
    Label lblProgress{*this, "lblProgress"};
    Button cmdRehearse{*this, "cmdRehearse", "Check"};
    Button cmdExecute{*this, "cmdExecute", "Execute"};
    Button cmdNext{*this, "cmdNext", "Next"};
    Button cmdStop{*this, "cmdStop", "Stop"};
    Button cmdCancel{*this, "cmdCancel", "Close"};
};

/// The results of the complex trace measurements.
class STDForm : public Form {
  public:
    STDForm();

    double refMeasLevel = 0;  ///< dBm, of the reference measurement
    double refPhase = 0;      ///< in the unit that is selected
    double pi = 3.14159265;   ///< the constant that the readouts count with

    Frame frameMeanLevel{*this, "frameMeanLevel", "Mean Level"};
    Label lblMeanLevel{*this, "lblMeanLevel"};
    Frame frameStdLevel{*this, "frameStdLevel", "Std Dev Level"};
    Label lblStdLevel{*this, "lblStdLevel"};
    Frame frameMeanPhase{*this, "frameMeanPhase", "Mean Phase"};
    Label lblMeanPhase{*this, "lblMeanPhase"};
    Frame frameStdPhase{*this, "frameStdPhase", "Std Dev Phase"};
    Label lblStdPhase{*this, "lblStdPhase"};
    Frame frameAvgCount{*this, "frameAvgCount", "Traces to Come"};
    Label lblAvgCount{*this, "lblAvgCount"};
    Frame frameUnit{*this, "frameUnit", "Phase Unit"};
    OptionButton optRadians{*this, "optRadians", "unit", "Radians"};
    OptionButton optDegrees{*this, "optDegrees", "unit", "Degrees"};
    Label lblRefMeas{*this, "lblRefMeas", "Reference Measurement:"};
    RichText refMeasBox{*this, "refMeasBox"};
    RichText rtfReceive{*this, "rtfReceive"};
    Button cmdClear{*this, "cmdClear", "Clear"};
    Button cmdExecute{*this, "cmdExecute", "Execute"};
    Button cmdStop{*this, "cmdStop", "Stop"};
};

class ScriptEditor : public Form {
  public:
    ScriptEditor();

    std::string FileName;       ///< what closing writes; empty for a text without a file
    bool HasUtf8Mark = false;   ///< the file began with one
    bool CodePageText = false;  ///< the file is Windows-1252 and no UTF-8

    TextBox txtNotepad{*this, "txtNotepad"};
    Frame buttonsFrame{*this, "buttonsFrame"};
    Button cmdOpen{*this, "cmdOpen", "Open"};
    Button cmdNew{*this, "cmdNew", "New"};
    Button cmdSave{*this, "cmdSave", "Save"};
    Button cmdSaveAs{*this, "cmdSaveAs", "Save As..."};
    Button cmdCancel{*this, "cmdCancel", "Cancel"};
    Button cmdClose{*this, "cmdClose", "Close"};
};

}  // namespace zel
