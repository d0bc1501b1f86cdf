#pragma once
// The state that the line's routines share with the loops above them.

#include <algorithm>
#include <cstdint>
#include <optional>
#include <string>

#include "platform/Event.h"

namespace zel {

struct ZELBas {
    std::string InputBuffer;         ///< received and not yet consumed
    bool ExchangeFailed = false;     ///< the last read failed
    bool WaitCommandActive = false;  ///< the last command was WAIT: reads last as long as sweeps
    bool RemoteAccepted = false;     ///< while false, no error box of the instrument is shown
    bool ScanInProgress = false;     ///< a script scans: no error box of the instrument
    bool TCPDataArrived = false;     ///< set by the socket's data arrival
    bool DialCancelled = false;      ///< the user cancelled a dial: failure boxes stay silent
    bool ComplexTraceActive = false;
    bool ComplexTraceRequested = false;  ///< a complex transfer had to be asked for again
    std::int16_t BinaryDecodeIndex = 0;
    bool AnswerOverdue = false;  ///< an exchange ended in a time-out: its answer may still come
    /// The line that was just sent follows such an exchange: what comes first may be its answer.
    bool LateAnswerFirst = false;
    /// The line brought more than was asked for, as when the detector is another than is known.
    bool RestFound = false;
    bool LossTold = false;     ///< the end of this connection was reported to the user
    double SweepTimeTold = 0;  ///< s, SWPTIME as the instrument last answered or accepted it
    /// Exchanges, transfers and whole cycles of them that have begun and not ended. What would
    /// begin another one waits until it is 0 again.
    int DialoguesUnderWay = 0;
    Event<> LineFree;   ///< the last of them has ended
    Event<> TurnGiven;  ///< a loop of exchanges lets those that wait go before its next round

    /// The user leaves the waits of what is under way, at once or, with a clock time in
    /// microseconds, when that has come: an answer before it still counts.
    void leaveWait(std::int64_t atMicros) {
        if (DialoguesUnderWay > 0) leaveAt = std::min(leaveAt.value_or(atMicros), atMicros);
    }
    bool mustLeave(std::int64_t nowMicros) const {
        return Ending || (leaveAt && *leaveAt <= nowMicros);
    }
    std::optional<std::int64_t> leaveAt;
    bool WaitLeft = false;     ///< a wait of what is under way was left: no box reports that
    bool BareCrFirst = false;  ///< an answer is still owed: a bare CR goes before the next word
    bool Ending = false;       ///< the program ends: no wait goes on
};

/// Counts a dialogue for as long as it lives.
class DialogueScope {
  public:
    explicit DialogueScope(ZELBas& state) : state_(state) { ++state_.DialoguesUnderWay; }
    ~DialogueScope() {
        if (--state_.DialoguesUnderWay > 0) return;
        // A wait that the user left says nothing about the line.
        if (state_.WaitLeft) state_.ExchangeFailed = false;
        state_.WaitLeft = false;
        state_.leaveAt.reset();
        state_.LineFree();
    }
    DialogueScope(const DialogueScope&) = delete;
    DialogueScope& operator=(const DialogueScope&) = delete;

  private:
    ZELBas& state_;
};

}  // namespace zel
