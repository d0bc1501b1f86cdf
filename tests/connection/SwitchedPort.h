#pragma once
// An instrument that can be switched off.

#include <string_view>

#include "ZELSim/InProcessPort.h"

namespace zel {

struct SwitchedPort : zelsim::InProcessPort {
    using InProcessPort::InProcessPort;
    bool on = true;
    void output(std::string_view bytes) override {
        if (on) InProcessPort::output(bytes);
    }
};

}  // namespace zel
