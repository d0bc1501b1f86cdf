#pragma once
// The Enter key in a soft box and a pick in its list: sends the value to the instrument.

#include <string>

#include "forms/ControllerForm.h"
#include "link/CommandExchange.h"
#include "model/ZEL3Variables.h"
#include "panel/KeyRoutines.h"
#include "panel/SoftPositions.h"
#include "panel/Z9GetCommands.h"
#include "platform/Session.h"

namespace zel {

/// The mirror takes what was asked for, whatever the instrument makes of it; a refusal is reported
/// by the exchange. A text that is no number goes out as 0; a number that its word cannot hold is
/// refused in a box and nothing is sent.
class Z9SetCommands {
  public:
    Z9SetCommands(ControllerForm& panel, ZEL3Variables& mirror, CommandExchange& exchange,
                  const KeyRoutines& routines, Z9GetCommands& queries, const Session& session);

    /// Runs the operations of all menus in their order for the position of that index; each
    /// clause looks at the state as the clauses before it left it.
    void enter(int index);

  private:
    using Quirk = void (Z9SetCommands::*)(int);
    static Quirk quirk(EntryQuirk which);

    void send(const SoftPosition& position);
    /// False for a number that its source cannot hold.
    bool valueText(const SoftPosition& position, std::string& text) const;

    void afterCentre(int index);
    void manualSpan(int index);
    void startFrequency(int index);
    void stopFrequency(int index);
    void edgeFrequency(double span, double centre);
    void afterOffset(int index);
    void zeroSpan(int index);
    void afterBandwidth(int index);
    void afterSweepTime(int index);
    void autoSweepTime(int index);
    void sweepMode(int index);
    void triggerSource(int index);
    void triggerValue(int index);
    void measurementMode(int index);
    void marker(int index);

    double boxValue(int index) const;
    void showEdges();
    void showSpan();
    void readTrace();

    ControllerForm& panel_;
    ZEL3Variables& mirror_;
    CommandExchange& exchange_;
    KeyRoutines routines_;
    Z9GetCommands& queries_;
    Session session_;
};

}  // namespace zel
