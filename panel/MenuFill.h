#pragma once
// Fills the boxes of a menu from the mirror, asking the instrument on the menu's first visit.

#include <string>
#include <string_view>

#include "forms/ControllerForm.h"
#include "link/CommandExchange.h"
#include "model/ZEL3Variables.h"
#include "panel/SoftPositions.h"

namespace zel {

class MenuFill;
class SoftPanel;

/// The routines that show a menu: its layout and its values.
struct MenuRoutines {
    SoftPanel& softPanel;
    MenuFill& fill;
};

class MenuFill {
  public:
    MenuFill(ControllerForm& panel, ZEL3Variables& mirror, CommandExchange& exchange)
        : panel_(panel), mirror_(mirror), exchange_(exchange) {}

    /// Takes a menu word. A word without boxes to fill only counts its visit. The first question
    /// without an answer is the last: the boxes show what the mirror holds. Without `mayAsk` none
    /// is asked.
    void FillTextFields(std::string_view menuWord, bool mayAsk = true);

    /// Unit of the channel power readout.
    std::string ChannelPowerUnitName = "dBm";
    /// Last answer to "PWR" of a soft key.
    std::string LastPowerAnswer;

  private:
    /// The answer, unless the menu's values are known or an earlier question failed.
    bool answered(const char* word, std::string& answer);
    void ask(const SoftPosition& position);
    void show(const SoftPosition& position);
    void choose(int index, double code);
    void showTriggerSource();
    void fillMarker();

    ControllerForm& panel_;
    ZEL3Variables& mirror_;
    CommandExchange& exchange_;
    bool asks_ = true;
};

}  // namespace zel
