#include "forms/ScriptForms.h"

#include <algorithm>

#include "platform/Form.h"

namespace zel {

SpecialMeasForm::SpecialMeasForm() : Form("SpecialMeasForm") {
    Caption = "Special Measurement";
    addVariables({{"DataFileNameSpec", &DataFileNameSpec},
                  {"outputFileTemplate", &outputFileTemplate},
                  {"fileNameIsIndexed", &fileNameIsIndexed},
                  {"currFileName", &currFileName},
                  {"currFilePath", &currFilePath},
                  {"CurrScriptFile", &CurrScriptFile},
                  {"continue", &continueRun},
                  {"isStepMode", &isStepMode},
                  {"nextRequested", &nextRequested},
                  {"noSaveAnswered", &noSaveAnswered},
                  {"insideLoop", &insideLoop},
                  {"noDate", &noDate},
                  {"noTime", &noTime},
                  {"ctraceMeasurementNo", &ctraceMeasurementNo},
                  {"meanLevelSamples", &meanLevelSamples},
                  {"meanPhaseSamples", &meanPhaseSamples}});
    sldSpeed.Value = sldSpeed.Max.get();
    sldSpeed.ToolTip = "Set the speed for loading traces.";
    cmdEdit.Enabled = false;
    cmdRehearse.Enabled = false;
    cmdExecute.Enabled = false;
    cmdNext.Visible = false;
    cmdStop.Visible = false;
    cmdStop.Enabled = false;
}

int SpecialMeasForm::seriesPauseMs() const {
    constexpr int kSlowestMs = 1000;
    constexpr int kMsPerStep = 100;
    if (sldSpeed.Value == sldSpeed.Max) return 0;
    return std::max(kSlowestMs - kMsPerStep * sldSpeed.Value.get(), 0);
}

STDForm::STDForm() : Form("STDForm") {
    Caption = "Level and Phase";
    addVariables({{"refMeasLevel", &refMeasLevel}, {"refPhase", &refPhase}, {"pi", &pi}});
    optRadians.setValue(true);
    cmdStop.Enabled = false;
}

ScriptEditor::ScriptEditor() : Form("ScriptEditor") {
    Caption = "Script Editor";
    addVariables({{"FileName", &FileName}});
}

}  // namespace zel
