#pragma once
// The press of a soft key: asks the instrument for one value, or carries out an action.

#include <string>

#include "forms/ControllerForm.h"
#include "link/CommandExchange.h"
#include "model/CodeTables.h"
#include "model/ZEL3Variables.h"
#include "panel/KeyRoutines.h"
#include "panel/SoftPositions.h"
#include "platform/MessageBox.h"

namespace zel {

class Z9GetCommands {
  public:
    Z9GetCommands(ControllerForm& panel, ZEL3Variables& mirror, CommandExchange& exchange,
                  const KeyRoutines& routines, MessageBoxes& boxes);

    /// Runs the operations of all menus in their order for the key of that index; each clause
    /// looks at the state as the clauses before it left it.
    void press(int index);
    /// Asks the word and shows the answer in the soft box: a number with prefix and unit, but for
    /// LENUNIT, which is a text. False when the instrument gave no answer; the box stays.
    bool QueryToSoftBox(const std::string& word, int index, const std::string& unit);

    std::string LastReflAnswer;
    std::string LastQueryAnswer;

  private:
    using Quirk = void (Z9GetCommands::*)(int);
    static Quirk quirk(KeyQuirk which);

    /// The row of the key as it stands now, or null.
    const SoftPosition* row(int index) const { return softPosition(panel_.State, index); }
    void runQuery(const SoftPosition& query);
    void decode(CodeTable table, double code, int index);

    void startFrequency(int index);
    void edgeFrequency(int index, double direction);
    void stopFrequency(int index);
    void fullSpan(int index);
    void zeroSpan(int index);
    void lastSpan(int index);
    void referenceLevel(int index);
    void bandwidth(int index);
    void autoBandwidth(int index);
    void autoSweepTime(int index);
    void triggerSource(int index);
    void triggerValue(int index);
    void singleTrace(int index);
    void transducerMenu(int index);
    void limitMenu(int index);
    void transducerOff(int index);
    void leaveSubMenu(int index);
    void channelPower(int index);
    void channelPowerUnit(int index);
    void levelAdjust(int index);
    void marker(int index);

    bool getSelected() const { return panel_.GetOption.Value(); }
    void readTrace();

    ControllerForm& panel_;
    ZEL3Variables& mirror_;
    CommandExchange& exchange_;
    KeyRoutines routines_;
    MessageBoxes& boxes_;
};

}  // namespace zel
