#pragma once
// Power readings take the sweep's place where the instrument gives single numbers.

#include <string>
#include <string_view>

#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "link/CommandExchange.h"
#include "platform/Event.h"
#include "platform/Events.h"

namespace zel {

class PowerReadout {
  public:
    /// Connects the dialog's options and its close.
    PowerReadout(Forms& forms, CommandExchange& exchange, Events& events);

    /// Asks one reading ("PWR", "REFL", "TDMAPWR") and shows it in the soft box of that index.
    /// False when the instrument gave none; the box keeps its text.
    bool ReadPowerValue(const std::string& query, int boxIndex, const std::string& unit);
    /// One round of the continuous view, for "PowerSensor" or "TDMAPower".
    bool ReadPowerReadings(std::string_view modeName, int boxIndex);
    /// The power, and the reflection where the dialog says so. False at the first without an
    /// answer.
    bool readPowerSensor(int boxIndex);

  private:
    Forms& forms_;
    ControllerForm& panel_;
    CommandExchange& exchange_;
    Events& events_;
    Handlers handlers_;
};

}  // namespace zel
