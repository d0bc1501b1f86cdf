#pragma once
// The computer's clocks.

#include "platform/Clock.h"

namespace zel {

class QtClock : public Clock {
  public:
    std::int64_t micros() const override;
    double date() const override;
};

}  // namespace zel
