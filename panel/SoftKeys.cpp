#include "panel/SoftKeys.h"

#include "forms/ControllerForm.h"
#include "panel/Z9GetCommands.h"
#include "panel/Z9SetCommands.h"
#include "platform/Controls.h"
#include "platform/Pointer.h"
#include "trace/Interlock.h"

namespace zel {

SoftKeys::SoftKeys(ControllerForm& panel, Z9GetCommands& queries, Z9SetCommands& settings,
                   const Interlock& interlock)
    : panel_(panel), queries_(queries), settings_(settings), interlock_(interlock) {
    for (int i = 0; i < panel_.SoftKey.count(); ++i) {
        handlers_.on(panel_.SoftKey(i).Clicked, [this, i] { SoftKey_Click(i); });
        handlers_.on(panel_.SoftTextBox(i).KeyPress,
                     [this, i](int& key) { SoftTextBox_KeyPress(i, key); });
        handlers_.on(panel_.SoftTextBox(i).KeyDown,
                     [this](int key, int) { SoftTextBox_KeyDown(key); });
        handlers_.on(panel_.ChoiceBox(i).Clicked, [this, i] { ChoiceBox_Click(i); });
    }
}

void SoftKeys::SoftKey_Click(int index) {
    if (interlock_.refuses(panel_.SoftKey(index))) return;
    const Hourglass busy(panel_, interlock_.session().events);
    queries_.press(index);
}

void SoftKeys::SoftTextBox_KeyPress(int index, int key) {
    TextBox& box = panel_.SoftTextBox(index);
    if (panel_.SoftBoxFirstKey == 1) {
        box.Text = "";
        panel_.SoftBoxFirstKey = 2;
    }
    if (interlock_.refuses(Interlock::Rule::Connected)) return;
    const bool enters = key == kKeyEnter && (!box.Text.get().empty() || panel_.ChoiceBoxActivated);
    if (enters && !interlock_.refuses(Interlock::Rule::NoContinuousView)) {
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
