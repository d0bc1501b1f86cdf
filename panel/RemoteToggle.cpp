#include "panel/RemoteToggle.h"

#include "panel/Interlock.h"

namespace zel {

RemoteToggle::RemoteToggle(ControllerForm& panel, CommandExchange& exchange, Events& events,
                           MessageBoxes& boxes)
    : panel_(panel), exchange_(exchange), events_(events), boxes_(boxes) {
    panel_.OnOffButton.Clicked.connect([this] { OnOffButton_Click(); });
    panel_.LocalButton.Clicked.connect([this] { LocalButton_Click(); });
}

bool RemoteToggle::mayAct() {
    return !refusedUnconnected(panel_, boxes_) && !refusedByContinuousView(panel_, boxes_);
}

void RemoteToggle::OnOffButton_Click() {
    if (!mayAct()) return;
    const Hourglass busy(panel_, events_);
    const bool toRemote = panel_.OnOffButton.Caption.get() == "R";
    exchange_.CmdInstrument(toRemote ? "REMOTE" : "LOCAL");
    panel_.OnOffButton.Caption = toRemote ? "L" : "R";
}

void RemoteToggle::LocalButton_Click() {
    if (mayAct()) exchange_.CmdInstrument("LOCAL");
}

}  // namespace zel
