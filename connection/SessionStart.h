#pragma once
// What every kind of connection does once its link is up: clock, handshake, first sweep.

#include <string_view>

#include "connection/Handshake.h"
#include "connection/SessionClock.h"
#include "forms/ControllerForm.h"
#include "panel/SoftPanel.h"
#include "trace/TraceReader.h"

namespace zel {

class SessionStart {
  public:
    SessionStart(ControllerForm& panel, Handshake& handshake, SessionClock& clock,
                 TraceReader& traces, SoftPanel& softPanel)
        : panel_(panel),
          handshake_(handshake),
          clock_(clock),
          traces_(traces),
          softPanel_(softPanel) {}

    /// "start" or "stop" of the clock that shows the session's length.
    void setClock(std::string_view word) { clock_.InitTimer(word); }
    /// The handshake; `isConnected` shows the outcome.
    void connect() { handshake_.InitConnection(); }
    /// One sweep, unless a power sensor measures.
    void readFirstSweep() {
        if (!panel_.isConnected || panel_.InstrumentMode == ControllerForm::POWERSENSOR) return;
        bool success = false;
        traces_.ReadSingleTrace2({}, success);
    }
    /// The hard keys show the menu that a session begins with.
    void showFirstMenu() { softPanel_.SetButtonsStatus(ControllerForm::Freq); }

  private:
    ControllerForm& panel_;
    Handshake& handshake_;
    SessionClock& clock_;
    TraceReader& traces_;
    SoftPanel& softPanel_;
};

}  // namespace zel
