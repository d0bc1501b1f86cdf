#include "panel/MenuFill.h"

#include <algorithm>
#include <cstdint>
#include <string_view>
#include <variant>
#include <vector>

#include "forms/ControllerForm.h"
#include "model/CodeTables.h"
#include "model/MirrorField.h"
#include "model/Numeric.h"
#include "model/ZEL3Variables.h"
#include "panel/SoftPositions.h"
#include "panel/TriggerKey.h"
#include "platform/Controls.h"
#include "support/NumberText.h"
#include "support/Text.h"

namespace zel {

using CF = ControllerForm;

void MenuFill::FillTextFields(std::string_view menuWord, bool mayAsk) {
    const bool known = mirror_.GetLazyQuery(menuWord);
    asks_ = mayAsk && !known;
    const std::int16_t state = menuOf(menuWord);
    if (state == CF::Marker) return fillMarker();
    std::vector<const SoftPosition*> turns;
    for (const SoftPosition& position : softPositions(state))
        if (position.fill == Fill::Asks) turns.push_back(&position);
    std::stable_sort(turns.begin(), turns.end(),
                     [](const auto* a, const auto* b) { return a->fillTurn < b->fillTurn; });
    for (const SoftPosition* position : turns) ask(*position);
    if (state == CF::SWEEP) showTriggerSource();
    if (state == CF::CHNPOWER)
        ChannelPowerUnitName = ChannelPowerUnitText(mirror_.ChannelPowerUnit, "CHNPWR");
    for (const SoftPosition& position : softPositions(state))
        if (position.fill != Fill::None) show(position);
}

bool MenuFill::answered(const char* word, std::string& answer) {
    asks_ = asks_ && exchange_.GetInstrument(word, answer);
    return asks_;
}

void MenuFill::ask(const SoftPosition& position) {
    if (position.fillAsks != nullptr && !position.fillAsks(panel_, mirror_)) return;
    std::string answer;
    if (!answered(position.word, answer)) return;
    const MirrorField field = position.fieldToFill();
    const bool isText = std::holds_alternative<std::string ZEL3Variables::*>(field);
    if (isText || startsWithNumber(answer))
        storeField(mirror_, field, leadingNumber(answer), answer);
    if (position.state == CF::OCCBW && position.key == 0)
        mirror_.OccBWValueCopy = mirror_.OccBWValue;
}

void MenuFill::show(const SoftPosition& position) {
    if (position.kind == PositionKind::Choice)
        return choose(position.key, fieldNumber(mirror_, position.fieldToFill()));
    const char* unit = position.fillUnit != nullptr ? position.fillUnit : position.unit;
    panel_.SoftTextBox(position.key).Text =
        position.fillText != nullptr
            ? position.fillText(mirror_, *this)
            : FormatValue(fieldNumber(mirror_, position.fieldToFill()), unit);
}

void MenuFill::choose(int index, double code) {
    DropDownList& list = panel_.ChoiceBox(index);
    list.setText(list.List(static_cast<int>(std::clamp(code, -1.0, 1000.0))));
}

void MenuFill::showTriggerSource() {
    showTriggerKey(panel_, mirror_.TriggerSource == TRIGVIDEO);
    mirror_.ExternalTriggerActive =
        mirror_.TriggerSource == TRIGEXTRISE || mirror_.TriggerSource == TRIGEXTFALL;
}

void MenuFill::fillMarker() {
    panel_.SoftTextBox(0).Text = replaceAll(panel_.MarkerLabel.Caption.get(), "Marker: ", "");
    panel_.SoftTextBox(1).Text = replaceAll(panel_.DeltaLabel.Caption.get(), "Delta: ", "");
    std::string answer;
    if (answered("MARKMODE", answer)) mirror_.MarkerModeText = answer;
    if (answered("MARK1ON", answer)) mirror_.MarkerOn = leadingNumber(answer) != 0;
    if (!mirror_.MarkerModeText.empty()) choose(2, leadingNumber(mirror_.MarkerModeText));
}

}  // namespace zel
