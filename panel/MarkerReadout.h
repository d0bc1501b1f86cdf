#pragma once
// The readout of the markers: labels, graph cursors and the boxes of the marker menu.

#include <string>

#include "forms/ControllerForm.h"
#include "link/CommandExchange.h"
#include "model/ZEL3Variables.h"

namespace zel {

enum class MarkerKind { Marker, Delta };

/// A marker's answer: x in Hz, s or m, a comma, the level.
class MarkerReadout {
  public:
    MarkerReadout(ControllerForm& panel, const ZEL3Variables& mirror, CommandExchange& exchange)
        : panel_(panel), mirror_(mirror), exchange_(exchange) {}

    /// Asks MARK1 and, with the delta on, DELTA1, and shows them. False when MARK1 was not
    /// answered; the readout stays.
    bool MakeMarkerReadout();
    /// Asks DELTA1 alone.
    bool readDelta();
    void showAnswer(MarkerKind kind, const std::string& answer);
    /// Hides the cursor and empties label and box.
    void clear(MarkerKind kind);
    void showCursor(MarkerKind kind, bool visible);

  private:
    bool read(MarkerKind kind);

    ControllerForm& panel_;
    const ZEL3Variables& mirror_;
    CommandExchange& exchange_;
};

}  // namespace zel
