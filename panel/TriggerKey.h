#pragma once
// The last key of the sweep menu: level of the video trigger, or delay.

#include <string>

#include "forms/ControllerForm.h"
#include "model/CodeTables.h"

namespace zel {

/// Key and caption follow.
inline void showTriggerKey(ControllerForm& panel, bool isLevel) {
    panel.TriggerKeyIsLevel = isLevel;
    const CodeRow* row = findCode(CodeTable::TriggerSource, isLevel ? TRIGVIDEO : TRIGFREERUN);
    panel.SoftKey(4).Caption = std::string(row->text);
}

}  // namespace zel
