#pragma once
// The pointer of a form while a handler works.

#include <exception>

#include "platform/Events.h"
#include "platform/Form.h"

namespace zel {

/// The values of `MousePointer`.
inline constexpr int kArrow = 0;
inline constexpr int kHourglass = 11;

/// Sets the pointer; one pump of events shows it.
inline void showPointer(Form& form, Events& events, int shape) {
    form.MousePointer = shape;
    events.pump();
}

/// The hourglass for as long as it lives.
class Hourglass {
  public:
    Hourglass(Form& form, Events& events) : form_(form), events_(events) {
        showPointer(form_, events_, kHourglass);
    }
    /// What an event's handler throws goes on from here. After another failure no event runs.
    ~Hourglass() noexcept(false) {
        form_.MousePointer = kArrow;
        if (std::uncaught_exceptions() == failures_) events_.pump();
    }
    Hourglass(const Hourglass&) = delete;
    Hourglass& operator=(const Hourglass&) = delete;

  private:
    Form& form_;
    Events& events_;
    int failures_ = std::uncaught_exceptions();
};

}  // namespace zel
