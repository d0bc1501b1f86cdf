#include "console/LiveStates.h"

#include <algorithm>

namespace zel {

LiveStates::LiveStates(Forms& forms) : forms_(forms) {
    // A form that is closed and shown again begins anew.
    for (Form* form : forms_.all()) {
        form->Changed.connect([this, form] {
            if (form->Modal && form->Visible) return;
            for (States& states : known_) states.erase(form);
        });
    }
}

bool LiveStates::fresh() const {
    const States states = now();
    if (known_.empty()) return !states.empty();
    const States& before = known_.back();
    return std::any_of(states.begin(), states.end(),
                       [&](const void* state) { return before.count(state) == 0; });
}

void LiveStates::end() {
    for (Form* form : forms_.all())
        if (form->Modal && form->Visible) form->Hide();
    const ControllerForm& panel = forms_.controller;
    if (panel.STOPFlag || panel.ContinuosLoopActive || forms_.time.ContinuousRecording)
        forms_.controller.StopButton.Click();
}

LiveStates::States LiveStates::now() const {
    States states;
    for (const Form* form : forms_.all())
        if (form->Modal && form->Visible) states.insert(form);
    const ControllerForm& panel = forms_.controller;
    if (panel.STOPFlag || panel.ContinuosLoopActive) states.insert(&panel.STOPFlag);
    if (panel.isSpecMeas) states.insert(&panel.isSpecMeas);
    if (forms_.time.ContinuousRecording) states.insert(&forms_.time.ContinuousRecording);
    // Ways to the instrument that may take minutes; an ordinary exchange is none of them.
    for (const bool* state : {&forms_.main.Dialling, &forms_.devicesChoice.Configuring,
                              &forms_.server.ServerConnecting, &forms_.tcpConnection.Connecting})
        if (*state) states.insert(state);
    return states;
}

}  // namespace zel
