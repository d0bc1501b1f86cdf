#include "panel/Interlock.h"

namespace zel {

bool refusedByContinuousView(const ControllerForm& panel, MessageBoxes& boxes) {
    if (!panel.ContinuosLoopActive) return false;
    boxes.show({BoxIcon::Exclamation,
                "Please exit the continuous View Mode first\r\n"
                "Use the red stop button in the upper right corner."});
    return true;
}

bool refusedByPowerSensor(const ControllerForm& panel, MessageBoxes& boxes) {
    if (panel.InstrumentMode != ControllerForm::POWERSENSOR) return false;
    boxes.show({BoxIcon::Information, "Please exit the Power Sensor Mode first."});
    return true;
}

bool refusedUnconnected(const ControllerForm& panel, MessageBoxes& boxes) {
    if (panel.isConnected) return false;
    boxes.show({BoxIcon::Information, "Please connect to the intrument first."});
    return true;
}

}  // namespace zel
