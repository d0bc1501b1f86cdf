#pragma once
// The header of a saved view: the settings of the instrument, a line each.

#include <functional>

#include "files/OutputFile.h"
#include "model/ZEL3Variables.h"
#include "platform/Clock.h"

namespace zel {

struct ViewHeader {
    const ZEL3Variables& settings;  ///< that the trace was read with
    int mode;                       ///< ANALYZER to RECEIVER, at that moment
    const ZEL3Variables& mirror;    ///< for what was measured since: the power values
    const Clock& clock;
    /// Asks for a bandwidth that is on automatic ("RBW", "VBW"): for the next file.
    std::function<void(const char* word)> askBandwidth;

    /// All lines, the empty one at the end too.
    void write(OutputFile& file) const;
};

}  // namespace zel
