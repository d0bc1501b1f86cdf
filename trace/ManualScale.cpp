#include "trace/ManualScale.h"

#include <cmath>

#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "model/Numeric.h"
#include "platform/Graph.h"
#include "platform/MessageBox.h"
#include "support/NumberText.h"

namespace zel {
namespace {

constexpr double kLargest = 1e15;

}  // namespace

ManualScale::ManualScale(ControllerForm& panel, ManualScaleForm& dialog, MessageBoxes& boxes)
    : panel_(panel), dialog_(dialog), boxes_(boxes) {
    handlers_.on(panel_.UtilityGraphSettings.Clicked, [this] { dialog_.Show(); });
    handlers_.on(dialog_.Load, [this] { Form_Load(); });
    handlers_.on(dialog_.cmdAccept.Clicked, [this] { cmdAccept_Click(); });
    handlers_.on(dialog_.cmdCancel.Clicked, [this] { dialog_.unload(1); });
}

void ManualScale::Form_Load() {
    const GraphAxis& axis = panel_.CWGraph1.yAxis();
    dialog_.manualSizeMin.Text = generalNumber(axis.Minimum);
    dialog_.manualSizeMax.Text = generalNumber(axis.Maximum);
}

void ManualScale::cmdAccept_Click() {
    const double minimum = ParseNumberInvariant(dialog_.manualSizeMin.Text);
    const double maximum = ParseNumberInvariant(dialog_.manualSizeMax.Text);
    // An axis of no height, upside down or past all bounds cannot be drawn; the entry stays.
    if (!(minimum < maximum) || std::fabs(minimum) > kLargest || std::fabs(maximum) > kLargest) {
        boxes_.show({BoxIcon::Exclamation, "The maximum must be greater than the minimum."});
        return;
    }
    panel_.CWGraph1.setYRange(minimum, maximum);
    dialog_.unload(1);
}

}  // namespace zel
