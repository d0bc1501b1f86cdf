#pragma once
// The hourglass of the panel while a handler works.

#include "forms/ControllerForm.h"
#include "platform/Events.h"

namespace zel {

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
