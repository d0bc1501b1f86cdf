#pragma once
// The measurement modes, and the preset.

#include <cstdint>

#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "forms/MainForm.h"
#include "link/CommandExchange.h"
#include "model/ZEL3Variables.h"
#include "panel/MenuFill.h"
#include "panel/SoftPanel.h"
#include "platform/Event.h"
#include "platform/Events.h"
#include "platform/MessageBox.h"
#include "trace/GraphScaling.h"
#include "trace/Interlock.h"

namespace zel {

class ModeKeys {
  public:
    /// Connects the mode keys, their options and the preset key.
    ModeKeys(Forms& forms, ZEL3Variables& mirror, CommandExchange& exchange,
             const MenuRoutines& menus, GraphScaling& scaling, const Interlock& interlock);

    /// Enters the mode of that MEAS number, 2 to 7, and shows its menu.
    void enterMode(std::int16_t mode);
    void AnalyzerButton_Click();
    /// Writes the preset's values into the mirror by hand: the instrument is asked nothing.
    void ResetButton_Click();

  private:
    void showPictureIsOld();
    void presetMirror();

    ControllerForm& panel_;
    MainForm& dialog_;
    ZEL3Variables& mirror_;
    CommandExchange& exchange_;
    SoftPanel& softPanel_;
    MenuFill& fill_;
    GraphScaling& scaling_;
    const Interlock& interlock_;
    Events& events_;
    MessageBoxes& boxes_;
    Handlers handlers_;
};

}  // namespace zel
