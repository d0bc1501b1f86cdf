#include "panel/SoftKeys.h"

#include "panel/Interlock.h"

namespace zel {

SoftKeys::SoftKeys(ControllerForm& panel, SoftPanel& softPanel, Z9GetCommands& queries,
                   Z9SetCommands& settings, Events& events, MessageBoxes& boxes)
    : panel_(panel),
      softPanel_(softPanel),
      queries_(queries),
      settings_(settings),
      events_(events),
      boxes_(boxes) {
    for (int i = 0; i < panel_.SoftKey.count(); ++i) {
        panel_.SoftKey(i).Clicked.connect([this, i] { SoftKey_Click(i); });
        panel_.SoftTextBox(i).KeyPress.connect(
            [this, i](int& key) { SoftTextBox_KeyPress(i, key); });
        panel_.SoftTextBox(i).KeyDown.connect([this](int key, int) { SoftTextBox_KeyDown(key); });
        panel_.ChoiceBox(i).Clicked.connect([this, i] { ChoiceBox_Click(i); });
    }
}

void SoftKeys::SoftKey_Click(int index) {
    if (refusedUnconnected(panel_, boxes_) || refusedByContinuousView(panel_, boxes_)) return;
    const Hourglass busy(panel_, events_);
    softPanel_.SetSoftButtonsColor(index);
    queries_.press(index);
}

void SoftKeys::SoftTextBox_KeyPress(int index, int key) {
    TextBox& box = panel_.SoftTextBox(index);
    if (panel_.SoftBoxFirstKey == 1) {
        box.Text = "";
        panel_.SoftBoxFirstKey = 2;
    }
    if (refusedUnconnected(panel_, boxes_)) return;
    const bool enters = key == kKeyEnter && (!box.Text.get().empty() || panel_.ChoiceBoxActivated);
    if (enters && !refusedByContinuousView(panel_, boxes_)) {
        panel_.SetOption.setValue(true);
        settings_.enter(index);
        panel_.SoftBoxFirstKey = 1;
        panel_.GetOption.setValue(true);
    }
    panel_.ChoiceBoxActivated = false;
}

void SoftKeys::SoftTextBox_KeyDown(int key) {
    for (const int editing : {kKeyBackspace, kKeyClear, kKeyLeft, kKeyRight})
        if (key == editing) panel_.SoftBoxFirstKey = 2;
}

void SoftKeys::ChoiceBox_Click(int index) {
    panel_.ChoiceBoxActivated = true;
    SoftTextBox_KeyPress(index, kKeyEnter);
}

}  // namespace zel
