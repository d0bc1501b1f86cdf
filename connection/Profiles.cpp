#include "connection/Profiles.h"

#include <cstdint>
#include <string>

#include "forms/ControllerForm.h"
#include "platform/Controls.h"
#include "support/NumberText.h"

namespace zel {
namespace {

struct ProfileSection {
    std::int16_t kind;
    const char* name;
    bool dialled;
};

constexpr ProfileSection kSections[] = {
    {ControllerForm::DIRECTCON, "DIRECTCON", false},
    {ControllerForm::MODEMCON, "MODEMCON", true},
    {ControllerForm::GSMCON, "GSMCON", true},
    {ControllerForm::MODEMGSMCON, "MODEMGSMCON", true},
    {ControllerForm::GSMMODEMCON, "GSMMODEMCON", true},
};

const ProfileSection* sectionOf(std::int16_t kind) {
    for (const ProfileSection& section : kSections)
        if (section.kind == kind) return &section;
    return nullptr;
}

void selectStored(DropDownList& list, const std::string& indexText) {
    const double index = leadingNumber(indexText);
    list.setListIndex(index >= 0 && index < list.ListCount() ? static_cast<int>(index) : 0);
}

/// A name that was typed is kept beside the index, since no list may hold it next time.
void selectTyped(DropDownList& list, const std::string& typed) {
    if (!typed.empty()) list.setText(typed);
}

std::string typedText(const DropDownList& list) {
    return list.ListIndex() < 0 ? list.Text() : std::string();
}

}  // namespace

void Profiles::LoadSettings_Click() {
    const ProfileSection* section = sectionOf(panel_.ConnectionState);
    if (section == nullptr) return;
    const auto get = [&](const char* key, const char* fallback) {
        return settings_.get(kProgramName, section->name, key, fallback);
    };
    selectStored(dialog_.COMList, get("CommPort", "0"));
    selectTyped(dialog_.COMList, get("CommPortName", ""));
    selectStored(dialog_.BaudList, get("BaudRate", "0"));
    selectTyped(dialog_.BaudList, get("BaudRateTyped", ""));
    if (section->dialled) dialog_.TelNumberBox.Text = get("TelNumber", "");
}

void Profiles::SaveSettings_Click() {
    const ProfileSection* section = sectionOf(panel_.ConnectionState);
    if (section == nullptr) return;
    const auto set = [&](const char* key, const std::string& value) {
        settings_.set(kProgramName, section->name, key, value);
    };
    set("CommPort", std::to_string(dialog_.COMList.ListIndex()));
    set("CommPortName", typedText(dialog_.COMList));
    set("BaudRate", std::to_string(dialog_.BaudList.ListIndex()));
    set("BaudRateTyped", typedText(dialog_.BaudList));
    if (section->dialled) set("TelNumber", dialog_.TelNumberBox.Text);
}

}  // namespace zel
