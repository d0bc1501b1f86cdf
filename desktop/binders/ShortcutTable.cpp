#include "desktop/binders/ShortcutTable.h"

#include <vector>

#include "platform/Form.h"

namespace zel {

const std::vector<ShortcutRow>& shortcutTable() {
    // No two rows share their keys, but for a mode's key and the option beside it.
    static const std::vector<ShortcutRow> table = {
        {"SoftKey(0)", "F2"},
        {"SoftKey(1)", "F3"},
        {"SoftKey(2)", "F4"},
        {"SoftKey(3)", "F5"},
        {"SoftKey(4)", "F6"},
        {"SoftTextBox(0)", "Shift+F2"},
        {"SoftTextBox(1)", "Shift+F3"},
        {"SoftTextBox(2)", "Shift+F4"},
        {"SoftTextBox(3)", "Shift+F5"},
        {"SoftTextBox(4)", "Shift+F6"},
        {"ChoiceBox(0)", "Shift+F2"},
        {"ChoiceBox(1)", "Shift+F3"},
        {"ChoiceBox(2)", "Shift+F4"},
        {"ChoiceBox(3)", "Shift+F5"},
        {"ChoiceBox(4)", "Shift+F6"},
        {"GetOption", "Ctrl+Shift+G"},
        {"SetOption", "Ctrl+Shift+T"},
        {"FrequencyButton", "Ctrl+F"},
        {"SpanButton", "Ctrl+Shift+F"},
        {"AmplitudeButton", "Ctrl+A"},
        {"BWButton", "Ctrl+B"},
        {"SweepButton", "Ctrl+W"},
        {"TraceButton", "Ctrl+T"},
        {"MeasButton", "Ctrl+M"},
        {"TrackButton1", "Ctrl+G"},
        {"MarkerButton", "Ctrl+K"},
        {"AnalyzerButton", "Ctrl+1"},
        {"TrackButton", "Ctrl+2"},
        {"PwrButton", "Ctrl+3"},
        {"ChnPwrButton", "Ctrl+4"},
        {"OccBWButton", "Ctrl+5"},
        {"TDMAButton", "Ctrl+6"},
        {"DistFaultButton", "Ctrl+7"},
        {"AnalyzerCheck", "Ctrl+1"},
        {"TrackingGenCheck", "Ctrl+2"},
        {"PowerSensorCheck", "Ctrl+3"},
        {"ChannelPowerCheck", "Ctrl+4"},
        {"OccBWCheck", "Ctrl+5"},
        {"TDMAPowerCheck", "Ctrl+6"},
        {"DistFaultCheck", "Ctrl+7"},
        {"MarkerCheckBox", "Ctrl+Shift+M"},
        {"DeltaCheckBox", "Ctrl+Shift+D"},
        {"MarkPkButton", "Ctrl+P"},
        {"NextPeakButton", "Ctrl+N"},
        {"MinPeakButton", "Ctrl+Shift+N"},
        {"MarkToCentButton", "Ctrl+Shift+C"},
        {"MarkToRefButton", "Ctrl+Shift+R"},
        {"ResetButton", "Ctrl+Shift+P"},
        {"LocalButton", "Ctrl+L"},
        {"OnOffButton", "Ctrl+Shift+L"},
        {"ManualCommandText", "F7"},
        {"SendButton", "Ctrl+Return"},
        {"CWGraph1", "F8"},
        {"PlaySingleButton", "F9"},
        {"PlayContinuousButton", "F10"},
        {"StopButton", "Esc"},
        {"cmdZoom", "Ctrl+Z"},
        {"cmd3D", "Ctrl+Shift+W"},
        {"cmdSpecial", "Ctrl+E"},
        {"FileMenu", "Alt+F"},
        {"Connection", "Alt+N"},
        {"Utility", "Alt+I"},
        {"ViewMenu", "Alt+V"},
        {"HelpMenu", "Alt+H"},
        {"SpectrogramShow", "Ctrl+Y"},
        {"SpectrogramPause", "Ctrl+Shift+Y"},
        {"PlaybackPlay", "Ctrl+Space"},
        {"PlaybackBack", "Ctrl+Left"},
        {"PlaybackForward", "Ctrl+Right"},
        {"PlaybackRepeat", "Ctrl+Shift+O"},
        {"PlaybackRealTime", "Ctrl+Shift+I"},
        {"PlaybackClose", "Ctrl+Shift+X"},
        {"LoadData", "Ctrl+O"},
        {"SaveCurrentView", "Ctrl+S"},
        {"MenuFileSaveImage", "Ctrl+Shift+S"},
        {"RecordData", "Ctrl+R"},
        {"Disconnect", "Ctrl+D"},
        {"ReconnectButton", "Ctrl+J"},
        {"ReconnectCloseButton", "Ctrl+Shift+J"},
        {"ExitObject", "Ctrl+Q"},
    };
    return table;
}

QString shortcutOf(const Control& control) {
    if (control.form().name() != "ControllerForm") return {};
    for (const ShortcutRow& row : shortcutTable())
        if (control.name() == row.control) return row.keys;
    return {};
}

}  // namespace zel
