#include "shell/SecondTimer.h"

#include "connection/SessionClock.h"
#include "forms/ControllerForm.h"
#include "server/ServerBridge.h"

namespace zel {

SecondTimer::SecondTimer(ControllerForm& panel, ServerBridge& server, SessionClock& sessionClock)
    : server_(server), sessionClock_(sessionClock) {
    handlers_.on(panel.UpNow.Tick, [this] { UpNow_Timer(); });
}

void SecondTimer::UpNow_Timer() {
    server_.repair();
    sessionClock_.show();
}

}  // namespace zel
