#include "shell/SecondTimer.h"

namespace zel {

SecondTimer::SecondTimer(ControllerForm& panel, ServerBridge& server, SessionClock& sessionClock)
    : server_(server), sessionClock_(sessionClock) {
    panel.UpNow.Tick.connect([this] { UpNow_Timer(); });
}

void SecondTimer::UpNow_Timer() {
    server_.repair();
    sessionClock_.show();
}

}  // namespace zel
