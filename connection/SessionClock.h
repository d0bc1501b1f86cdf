#pragma once
// The clock that shows how long the session lasts.

#include <string_view>

#include "forms/ControllerForm.h"
#include "platform/Clock.h"

namespace zel {

class SessionClock {
  public:
    SessionClock(ControllerForm& panel, const Clock& clock) : panel_(panel), clock_(clock) {}

    /// "stop" stops the display; any other word begins the session now.
    void InitTimer(std::string_view word);
    /// The time of day while no session has begun, else the session's length.
    void show();

  private:
    ControllerForm& panel_;
    const Clock& clock_;
};

}  // namespace zel
