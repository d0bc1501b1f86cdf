#pragma once
// Requests from outside that the program end.

#include <functional>
#include <string>

#include "platform/Event.h"

namespace zel {

class Signals {
  public:
    virtual ~Signals() = default;
    /// Runs inside the event loop, with the name of the signal ("SIGTERM").
    Event<const std::string&> EndRequested;
    /// Uses a signal for something else than the end, such as the stop of a script; true when it
    /// has done so. May be empty.
    std::function<bool(const std::string&)> takes;

    /// What came goes to `takes`, and to `EndRequested` when that does not want it.
    void request(const std::string& name) {
        if (!takes || !takes(name)) EndRequested(name);
    }
};

}  // namespace zel
