#pragma once
// Fills the boxes of a menu from the mirror, asking the instrument on the menu's first visit.

#include <cstdint>
#include <string>
#include <string_view>

#include "forms/ControllerForm.h"
#include "link/CommandExchange.h"
#include "model/CodeTables.h"
#include "model/ZEL3Variables.h"

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
    void fillFrequency();
    void fillSpan();
    void fillAmplitude();
    void fillBandwidth();
    void fillSweep();
    void fillTrace();
    void fillMarker();
    void fillMeasurement();
    void fillChannelPower();
    void fillOccupiedBandwidth();
    void fillTDMAPower();
    void fillDistanceToFault();

    /// The answer, unless the menu's values are known or an earlier question failed.
    bool answered(const char* word, std::string& answer);
    /// Asks the instrument; a failure leaves the field.
    void ask(const char* word, double& field);
    void ask(const char* word, std::int16_t& field);
    void ask(const char* word, std::string& field);
    void show(int index, double value, const std::string& unit);
    void choose(int index, double code);

    ControllerForm& panel_;
    ZEL3Variables& mirror_;
    CommandExchange& exchange_;
    bool asks_ = true;
};

}  // namespace zel
