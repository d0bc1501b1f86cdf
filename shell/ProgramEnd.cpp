#include "shell/ProgramEnd.h"

#include "forms/Forms.h"
#include "platform/Form.h"
#include "platform/MessageBox.h"

namespace zel {
namespace {

constexpr int kUnloadArgument = 1;

}  // namespace

ProgramEnd::ProgramEnd(Forms& forms, MessageBoxes& boxes)
    : forms_(forms), panel_(forms.controller), boxes_(boxes) {
    handlers_.on(panel_.ExitObject.Clicked, [this] { ExitObject_Click(); });
    handlers_.on(panel_.QueryUnload, [this](int& cancel) { Form_QueryUnload(cancel); });
    handlers_.on(panel_.Unload,
                 [this](int /*argument*/) { forms_.waterfall.unload(kUnloadArgument); });
}

bool ProgramEnd::confirmed() {
    return boxes_.show({BoxIcon::Question, "Are you sure you want to close ZELRemote?",
                        panel_.Caption, BoxButtons::YesNo}) != BoxAnswer::No;
}

void ProgramEnd::ExitObject_Click() {
    if (confirmed()) leave(true);
}

void ProgramEnd::Form_QueryUnload(int& cancel) {
    if (!confirmed()) {
        cancel = -1;
        return;
    }
    leave(false);
}

void ProgramEnd::leave(bool byMenu) {
    if (panel_.isConnected) forms_.main.DisconnectButton.Click();
    if (byMenu) panel_.isConnected = false;
    for (Form* form :
         {static_cast<Form*>(&forms_.main), static_cast<Form*>(&forms_.about),
          static_cast<Form*>(&forms_.devicesChoice), static_cast<Form*>(&forms_.time),
          static_cast<Form*>(&forms_.scriptEditor), static_cast<Form*>(&forms_.controller)})
        form->unload(kUnloadArgument);
    if (byMenu) forms_.waterfall.unload(kUnloadArgument);
    end();
}

void ProgramEnd::end() {
    if (ended_) return;
    ended_ = true;
    // A view that is still on the stack must not hold the end up.
    panel_.STOPFlag = false;
    panel_.ContinuosLoopActive = false;
    Ended();
}

}  // namespace zel
