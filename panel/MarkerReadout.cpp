#include "panel/MarkerReadout.h"

#include <string>

#include "forms/ControllerForm.h"
#include "model/Numeric.h"
#include "platform/Controls.h"
#include "platform/Form.h"
#include "support/NumberText.h"
#include "trace/GraphScaling.h"

namespace zel {
namespace {

constexpr Color kDeltaColor = 65280;

struct MarkerRow {
    const char* word;
    const char* head;
    int cursor;
    int box;
    Label ControllerForm::*label;
    double ControllerForm::*value;
    bool scaledLevel;  // a difference in dB is never prefixed
};
const MarkerRow kRows[] = {
    {"MARK1", "Marker: ", 1, 0, &ControllerForm::MarkerLabel, &ControllerForm::MarkerValue, true},
    {"DELTA1", "Delta: ", 2, 1, &ControllerForm::DeltaLabel, &ControllerForm::DeltaValue, false},
};
const MarkerRow& rowOf(MarkerKind kind) { return kRows[kind == MarkerKind::Marker ? 0 : 1]; }

}  // namespace

bool MarkerReadout::read(MarkerKind kind) {
    std::string answer;
    if (!exchange_.GetInstrument(rowOf(kind).word, answer)) return false;
    showAnswer(kind, answer);
    return true;
}

bool MarkerReadout::readDelta() { return read(MarkerKind::Delta); }

bool MarkerReadout::MakeMarkerReadout() {
    if (!read(MarkerKind::Marker)) return false;
    if (mirror_.DeltaOn) readDelta();
    return true;
}

void MarkerReadout::showAnswer(MarkerKind kind, const std::string& answer) {
    const MarkerRow& row = rowOf(kind);
    const auto comma = answer.find(',');
    const std::string xText = answer.substr(0, comma);
    const std::string levelText = comma == std::string::npos ? "" : answer.substr(comma + 1);
    const double x = leadingNumber(xText);
    const double level = leadingNumber(levelText);
    panel_.*row.value = x;
    if (kind == MarkerKind::Marker) {
        panel_.MarkerLevel = level;
        panel_.CWGraph1.moveCursor(row.cursor, x, level);
    } else {
        // The instrument answers the differences to the marker.
        panel_.CWGraph1.moveCursor(row.cursor, panel_.MarkerValue + x, panel_.MarkerLevel + level);
        panel_.DeltaLabel.ForeColor = kDeltaColor;
    }
    const std::string text = FormatValue(xText, GetDimension(panel_, mirror_)) + "; " +
                             FormatValue(levelText, "dBm", "", row.scaledLevel);
    (panel_.*row.label).Caption = row.head + text;
    if (panel_.State == ControllerForm::Marker) panel_.SoftTextBox(row.box).Text = text;
}

void MarkerReadout::clear(MarkerKind kind) {
    const MarkerRow& row = rowOf(kind);
    showCursor(kind, false);
    (panel_.*row.label).Caption = "";
    if (panel_.State == ControllerForm::Marker) panel_.SoftTextBox(row.box).Text = "";
}

void MarkerReadout::showCursor(MarkerKind kind, bool visible) {
    panel_.CWGraph1.showCursor(rowOf(kind).cursor, visible);
}

}  // namespace zel
