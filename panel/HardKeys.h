#pragma once
// The hard keys: each lays out its menu and fills it.

#include <cstdint>

#include "forms/ControllerForm.h"
#include "link/CommandExchange.h"
#include "model/ZEL3Variables.h"
#include "panel/MenuFill.h"
#include "panel/SoftPanel.h"
#include "platform/Event.h"
#include "trace/Interlock.h"

namespace zel {

class HardKeys {
  public:
    /// Connects the keys.
    HardKeys(ControllerForm& panel, ZEL3Variables& mirror, CommandExchange& exchange,
             const MenuRoutines& menus, const Interlock& interlock);

    /// In power sensor mode only the frequency key opens its menu, when the analyzer key asked.
    void press(std::int16_t menu);

  private:
    /// False at the first question without an answer.
    bool readMarkers();
    bool readSweepTime();

    ControllerForm& panel_;
    ZEL3Variables& mirror_;
    CommandExchange& exchange_;
    SoftPanel& softPanel_;
    MenuFill& fill_;
    const Interlock& interlock_;
    Handlers handlers_;
};

}  // namespace zel
