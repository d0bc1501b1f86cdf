#pragma once
// Runs something at the end of a scope, whatever way it is left.

#include <utility>

namespace zel {

/// The action must not throw.
template <class Action>
class AtEnd {
  public:
    explicit AtEnd(Action action) : action_(std::move(action)) {}
    ~AtEnd() { action_(); }
    AtEnd(const AtEnd&) = delete;
    AtEnd& operator=(const AtEnd&) = delete;

  private:
    Action action_;
};

}  // namespace zel
