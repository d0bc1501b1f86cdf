#pragma once
// The state of one invocation of a run.

#include <cstdint>
#include <string>

namespace zel {

struct ScriptRun {
    int lineIndex = 0;
    int lastIndex = -1;  ///< entries at the start less 1; what is added later is not reached
    std::int16_t loopCounter = 0;
    int loopStartIndex = 0;
    std::int16_t loadedTraceCount = 0;
    bool upperLimitArmed = false;
    bool lowerLimitArmed = false;
    double upperLimit = 0;
    double lowerLimit = 0;
    double scanFrequency = 0;    ///< Hz
    double scanStep = 0;         ///< Hz
    int scanReturnIndex = 0;     ///< of the SCANSTEP statement
    std::string timeOutText;     ///< stays from one statement to the next
    bool stopped = false;        ///< stop was requested; the run only walks on
    bool released = false;       ///< does not wait for presses any more
    bool ended = false;          ///< the procedure ends after this statement
    ScriptRun* outer = nullptr;  ///< a run that waits further up the stack
};

}  // namespace zel
