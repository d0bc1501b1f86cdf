#pragma once
// Requests from outside that the program end.

#include <string>

#include "platform/Event.h"

namespace zel {

class Signals {
  public:
    virtual ~Signals() = default;
    /// Runs inside the event loop, with the name of the signal ("SIGTERM").
    Event<const std::string&> EndRequested;
};

}  // namespace zel
