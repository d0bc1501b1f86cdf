#include "console/ControlActions.h"

#include <optional>
#include <string>
#include <string_view>

#include "platform/Controls.h"
#include "platform/Form.h"
#include "platform/Graph.h"
#include "platform/KeyInput.h"
#include "support/NumberText.h"

namespace zel {
namespace {

struct NamedKey {
    std::string_view name;
    int code;
    bool typed;  ///< gives a character as well
};

constexpr NamedKey kKeys[] = {
    {"enter", kKeyEnter, true},  {"left", kKeyLeft, false},          {"right", kKeyRight, false},
    {"clear", kKeyClear, false}, {"backspace", kKeyBackspace, true}, {"f1", kKeyF1, false},
};

const NamedKey* namedKey(std::string_view name) {
    for (const NamedKey& key : kKeys)
        if (key.name == name) return &key;
    return nullptr;
}

bool locked(const Control& control) {
    if (control.kind() == ControlKind::TextBox) return static_cast<const TextBox&>(control).Locked;
    return control.kind() == ControlKind::DropDownList &&
           static_cast<const DropDownList&>(control).Locked;
}

bool shown(const Control& control) {
    if (!control.Visible) return false;
    if (control.kind() != ControlKind::MenuItem) return true;
    const MenuItem* parent = static_cast<const MenuItem&>(control).parent();
    return parent == nullptr || shown(*parent);
}

bool enabled(const Control& control) {
    if (!control.Enabled) return false;
    if (control.kind() != ControlKind::MenuItem) return true;
    const MenuItem* parent = static_cast<const MenuItem&>(control).parent();
    return parent == nullptr || enabled(*parent);
}

bool clickable(ControlKind kind) {
    return kind == ControlKind::Button || kind == ControlKind::MenuItem ||
           kind == ControlKind::CheckBox || kind == ControlKind::OptionButton;
}

}  // namespace

Done refusal(const Control& control, bool writes) {
    if (!shown(control)) return Done::Hidden;
    if (!enabled(control)) return Done::Disabled;
    return writes && locked(control) ? Done::Locked : Done::Yes;
}

Done clickControl(Control& control) {
    if (!clickable(control.kind())) return Done::Unfit;
    if (const Done refused = refusal(control, false); refused != Done::Yes) return refused;
    switch (control.kind()) {
        case ControlKind::Button:
            static_cast<Button&>(control).Click();
            break;
        case ControlKind::MenuItem:
            static_cast<MenuItem&>(control).Click();
            break;
        case ControlKind::CheckBox:
            static_cast<CheckBox&>(control).Click();
            break;
        default:
            static_cast<OptionButton&>(control).Click();
            break;
    }
    return Done::Yes;
}

Done typeInto(Control& control, const std::string& text) {
    const bool list = control.kind() == ControlKind::DropDownList &&
                      static_cast<DropDownList&>(control).editable();
    if (!list && control.kind() != ControlKind::TextBox) return Done::Unfit;
    if (const Done refused = refusal(control, true); refused != Done::Yes) return refused;
    if (list) {
        auto& box = static_cast<DropDownList&>(control);
        box.setText(box.Text() + text);
    } else {
        typeText(static_cast<TextBox&>(control), text);
    }
    return Done::Yes;
}

Done pressNamedKey(Control& control, std::string_view name) {
    const NamedKey* key = namedKey(name);
    const ControlKind kind = control.kind();
    const bool hasKeys =
        kind == ControlKind::TextBox || kind == ControlKind::Button || kind == ControlKind::Graph;
    if (!hasKeys && (key == nullptr || key->code != kKeyF1)) return Done::Unfit;
    if (key == nullptr) return Done::NoKey;
    if (const Done refused = refusal(control, true); refused != Done::Yes) return refused;
    if (!hasKeys) {
        control.form().KeyDown(key->code, 0);
        return Done::Yes;
    }
    if (kind == ControlKind::Button) {
        static_cast<Button&>(control).KeyDown(key->code, 0);
    } else if (kind == ControlKind::Graph) {
        static_cast<Graph&>(control).KeyDown(key->code, 0);
    } else if (key->typed) {
        typeKey(static_cast<TextBox&>(control), key->code);
    } else {
        pressKey(static_cast<TextBox&>(control), key->code);
    }
    return Done::Yes;
}

namespace {

Done moveSlider(Slider& slider, std::optional<int> position) {
    if (const Done refused = refusal(slider, true); refused != Done::Yes) return refused;
    if (!position || *position < slider.Min || *position > slider.Max) return Done::NoEntry;
    slider.Value = *position;
    slider.Scrolled();
    return Done::Yes;
}

}  // namespace

Done chooseEntry(Control& control, std::string_view text) {
    const std::optional<int> index = wholeNumber(text);
    if (control.kind() == ControlKind::Slider)
        return moveSlider(static_cast<Slider&>(control), index);
    const bool dropDown = control.kind() == ControlKind::DropDownList;
    if (!dropDown && control.kind() != ControlKind::ListBox) return Done::Unfit;
    if (const Done refused = refusal(control, true); refused != Done::Yes) return refused;
    const int count = dropDown
                          ? static_cast<DropDownList&>(control).ListCount()
                          : static_cast<int>(static_cast<ListBox&>(control).Items.get().size());
    if (!index || *index < 0 || *index >= count) return Done::NoEntry;
    if (dropDown) {
        static_cast<DropDownList&>(control).pick(*index);
    } else {
        auto& list = static_cast<ListBox&>(control);
        list.ListIndex = *index;
        list.Clicked();
    }
    return Done::Yes;
}

Done putText(Control& control, const std::string& text) {
    const bool list = control.kind() == ControlKind::DropDownList &&
                      static_cast<DropDownList&>(control).editable();
    if (!list && control.kind() != ControlKind::TextBox) return Done::Unfit;
    if (const Done refused = refusal(control, true); refused != Done::Yes) return refused;
    if (list) {
        static_cast<DropDownList&>(control).setText(text);
    } else {
        static_cast<TextBox&>(control).Text = text;
    }
    return Done::Yes;
}

}  // namespace zel
