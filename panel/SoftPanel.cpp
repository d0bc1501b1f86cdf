#include "panel/SoftPanel.h"

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "forms/ControllerForm.h"
#include "model/CodeTables.h"
#include "panel/SoftPositions.h"
#include "platform/Controls.h"
#include "platform/Form.h"

namespace zel {
namespace {

struct KeyColor {
    std::string_view word;
    Color color;
};
constexpr KeyColor kKeyColors[] = {{"gray", kButtonFace}, {"red", kRed}, {"green", kGreen}};

struct HardKeyPicture {
    Button ControllerForm::*key;
    const char* picture;  // without "_y" and "_b"
    std::int16_t state;
};
// In the order in which the pictures are set.
const HardKeyPicture kHardKeyPictures[] = {
    {&ControllerForm::FrequencyButton, "freq", ControllerForm::Freq},
    {&ControllerForm::BWButton, "band", ControllerForm::BW},
    {&ControllerForm::SweepButton, "sweep", ControllerForm::SWEEP},
    {&ControllerForm::TraceButton, "trace", ControllerForm::TRACE},
    {&ControllerForm::MeasButton, "meas", ControllerForm::MEAS},
    {&ControllerForm::TrackButton1, "track", ControllerForm::TRACKINGGEN},
    {&ControllerForm::SpanButton, "span", ControllerForm::SPAN},
    {&ControllerForm::AmplitudeButton, "ampl", ControllerForm::AMPT},
    {&ControllerForm::MarkerButton, "marker", ControllerForm::Marker},
};

std::vector<std::string> choicesOf(CodeTable table) {
    std::vector<std::string> items;
    for (const CodeRow& row : codeTable(table))
        if (!row.choice.empty()) items.emplace_back(row.choice);
    return items;
}

}  // namespace

void SoftPanel::SetStates(std::int16_t oldState, std::int16_t newState) {
    panel_.LastState = oldState;
    panel_.State = newState;
}

void SoftPanel::InitForm(std::int16_t newState) {
    for (TextBox& box : panel_.SoftTextBox) box.Text = "";
    SetStates(panel_.State, newState);
    SetSoftButtonsColor(0);
    ShowAllSoftKeys();
}

void SoftPanel::SetSoftButtonsColor(int index) {
    for (int i = 0; i < panel_.SoftKey.count(); ++i)
        panel_.SoftKey(i).BackColor = i == index ? kRed : kButtonFace;
}

void SoftPanel::SetButtonColor(int index, std::string_view word) {
    for (const KeyColor& row : kKeyColors)
        if (row.word == word) panel_.SoftKey(index).BackColor = row.color;
}

void SoftPanel::ShowAllSoftKeys() {
    for (Button& key : panel_.SoftKey) key.Visible = true;
}

void SoftPanel::HideChoiceBoxes() {
    for (DropDownList& list : panel_.ChoiceBox) {
        list.Visible = false;
        list.Clear();
    }
    for (TextBox& box : panel_.SoftTextBox) box.Visible = true;
}

void SoftPanel::UnlockChoiceBoxes() {
    for (DropDownList& list : panel_.ChoiceBox) list.Locked = false;
}

void SoftPanel::UnlockTextFields() {
    for (TextBox& box : panel_.SoftTextBox) box.Locked = false;
}

void SoftPanel::SetSoftBoxesToEditable() { UnlockTextFields(); }

void SoftPanel::SetButtonsActive() {
    for (Button& key : panel_.SoftKey) key.Enabled = true;
}

void SoftPanel::SetTextFieldsAndFrames(std::int16_t state) {
    HideChoiceBoxes();
    UnlockChoiceBoxes();
    UnlockTextFields();
    SetSoftBoxesToEditable();
    SetButtonsActive();
    for (const SoftPosition& position : softPositions(state)) layPosition(position);
}

void SoftPanel::layPosition(const SoftPosition& position) {
    Frame& frame = panel_.SoftFrame(position.key);
    TextBox& box = panel_.SoftTextBox(position.key);
    DropDownList& list = panel_.ChoiceBox(position.key);
    Button& key = panel_.SoftKey(position.key);
    if (!position.frame.empty()) frame.Caption = std::string(position.frame);
    const bool isChoice =
        position.kind == PositionKind::Choice || position.kind == PositionKind::LockedChoice;
    if (position.kind != PositionKind::HiddenBox)
        frame.Visible = position.kind != PositionKind::None;
    box.Visible = position.kind == PositionKind::Box || position.kind == PositionKind::LockedBox;
    box.Locked = position.kind == PositionKind::LockedBox;
    const std::optional<CodeTable> choices = isChoice ? position.codes : position.listAboveBox;
    if (choices) list.setItems(choicesOf(*choices));
    list.Visible = choices.has_value();
    list.Locked = position.kind == PositionKind::LockedChoice;
    switch (position.action) {
        case KeyAction::Leave:
            break;
        case KeyAction::Enable:
            key.Enabled = true;
            break;
        case KeyAction::Disable:
            key.Enabled = false;
            break;
        case KeyAction::Hide:
            key.Visible = false;
            break;
        case KeyAction::PaintGreen:
            SetButtonColor(position.key, "green");
            break;
    }
}

void SoftPanel::laySubMenu(std::int16_t state) {
    SetButtonsActive();
    setKeyCaptions(state);
    for (const SoftPosition& position : softPositions(state)) {
        const int i = position.key;
        const bool used = position.kind != PositionKind::None;
        panel_.SoftFrame(i).Visible = used;
        if (used) panel_.SoftFrame(i).Caption = std::string(position.frame);
        // The names of transducers and limit lines are typed.
        const bool typed = position.kind == PositionKind::Box;
        panel_.SoftTextBox(i).Visible = typed;
        panel_.SoftTextBox(i).Locked = false;
        if (typed) panel_.SoftTextBox(i).Text = "";
        DropDownList& list = panel_.ChoiceBox(i);
        list.Visible = used && !typed;
        if (!list.Visible) continue;
        list.setItems(choicesOf(*position.codes));
        list.Locked = true;
    }
    SetStates(panel_.State, state);
}

void SoftPanel::layTransducerMenu() { laySubMenu(ControllerForm::MEAS_TRD); }

void SoftPanel::layLimitMenu() { laySubMenu(ControllerForm::MEAS_LLINES); }

void SoftPanel::SetButtonsStatus(std::int16_t state) {
    const HardKeyPicture* current = &kHardKeyPictures[8];  // the marker key stands for the rest
    for (const HardKeyPicture& row : kHardKeyPictures) {
        (panel_.*row.key).Picture = std::string(row.picture) + "_y";
        if (row.state == state) current = &row;
    }
    (panel_.*current->key).Picture = std::string(current->picture) + "_b";
}

void SoftPanel::setKeyCaptions(std::int16_t state) {
    panel_.TriggerKeyIsLevel = false;  // until the menu knows the source
    for (const SoftPosition& position : softPositions(state)) {
        panel_.SoftKey(position.key).Caption = std::string(position.caption.text);
        panel_.SoftKey(position.key).Visible = position.caption.visible;
    }
}

}  // namespace zel
