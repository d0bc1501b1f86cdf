#include "panel/RemoteToggle.h"

#include "forms/ControllerForm.h"
#include "link/CommandExchange.h"
#include "platform/Pointer.h"
#include "trace/Interlock.h"

namespace zel {

RemoteToggle::RemoteToggle(ControllerForm& panel, CommandExchange& exchange,
                           const Interlock& interlock)
    : panel_(panel), exchange_(exchange), interlock_(interlock) {
    handlers_.on(panel_.OnOffButton.Clicked, [this] { OnOffButton_Click(); });
    handlers_.on(panel_.LocalButton.Clicked, [this] { LocalButton_Click(); });
}

void RemoteToggle::OnOffButton_Click() {
    if (interlock_.refuses(panel_.OnOffButton)) return;
    const Hourglass busy(panel_, interlock_.session().events);
    const bool toRemote = panel_.OnOffButton.Caption.get() == "R";
    exchange_.CmdInstrument(toRemote ? "REMOTE" : "LOCAL");
    panel_.OnOffButton.Caption = toRemote ? "L" : "R";
}

void RemoteToggle::LocalButton_Click() {
    if (!interlock_.refuses(panel_.LocalButton)) exchange_.CmdInstrument("LOCAL");
}

}  // namespace zel
