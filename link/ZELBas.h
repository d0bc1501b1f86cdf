#pragma once
// The state that the line's routines share with the loops above them.

#include <cstdint>
#include <string>

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
    int DialoguesUnderWay = 0;  ///< exchanges and binary transfers that have begun and not ended
};

/// Counts a dialogue for as long as it lives.
class DialogueScope {
  public:
    explicit DialogueScope(ZELBas& state) : state_(state) { ++state_.DialoguesUnderWay; }
    ~DialogueScope() { --state_.DialoguesUnderWay; }
    DialogueScope(const DialogueScope&) = delete;
    DialogueScope& operator=(const DialogueScope&) = delete;

  private:
    ZELBas& state_;
};

}  // namespace zel
