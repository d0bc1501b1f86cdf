#pragma once
// What keeps the panel's handlers from acting, and the words that say so.

#include "forms/ControllerForm.h"
#include "platform/Events.h"
#include "platform/MessageBox.h"

namespace zel {

/// True, with the box shown, while the continuous view runs.
bool refusedByContinuousView(const ControllerForm& panel, MessageBoxes& boxes);
/// True, with the box shown, in the power sensor mode.
bool refusedByPowerSensor(const ControllerForm& panel, MessageBoxes& boxes);
/// True, with the box shown, without an instrument.
bool refusedUnconnected(const ControllerForm& panel, MessageBoxes& boxes);

/// The hourglass for as long as it lives, each change followed by one pump of events.
class Hourglass {
  public:
    Hourglass(ControllerForm& panel, Events& events) : panel_(panel), events_(events) {
        panel_.MousePointer = 11;
        events_.pump();
    }
    ~Hourglass() {
        panel_.MousePointer = 0;
        events_.pump();
    }
    Hourglass(const Hourglass&) = delete;
    Hourglass& operator=(const Hourglass&) = delete;

  private:
    ControllerForm& panel_;
    Events& events_;
};

}  // namespace zel
