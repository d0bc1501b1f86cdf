#pragma once
// The states of the program in which a user goes on working although a routine has not come back.

#include <set>
#include <vector>

#include "forms/Forms.h"

namespace zel {

/// A modal form on show, the continuous view, a recording or a script. Commands nest: a state that
/// was there when a command began belongs to the command around it, and inside of its own
/// exchanges the command is not disturbed.
class LiveStates {
  public:
    explicit LiveStates(Forms& forms);

    void beginCommand() { known_.push_back(now()); }
    void endCommand() { known_.pop_back(); }
    /// A state has begun since the innermost command did.
    bool fresh() const;
    /// Closes modal forms and stops what runs.
    void end();

  private:
    using States = std::set<const void*>;
    States now() const;

    Forms& forms_;
    std::vector<States> known_;
};

}  // namespace zel
