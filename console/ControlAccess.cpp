#include "console/ControlAccess.h"

#include <algorithm>
#include <cstddef>
#include <optional>
#include <string>
#include <type_traits>
#include <variant>
#include <vector>

#include "forms/Forms.h"
#include "model/ZEL3Variables.h"
#include "platform/Controls.h"
#include "platform/Form.h"
#include "platform/Graph.h"
#include "support/NumberText.h"
#include "support/RTFGen.h"
#include "support/Text.h"

namespace zel {
namespace {

std::string toText(bool value) { return value ? "true" : "false"; }
std::string toText(int value) { return std::to_string(value); }
std::string toText(Color value) { return std::to_string(value); }
std::string toText(double value) { return generalNumber(value); }
std::string toText(const std::string& value) {
    return replaceAll(replaceAll(value, "\r", "\\r"), "\n", "\\n");
}

using Getter = std::string (*)(const Control&);

/// A member of a control's class, be it a property or a routine, as text.
template <class T, auto member>
std::string read(const Control& control) {
    const T& typed = static_cast<const T&>(control);
    if constexpr (std::is_member_function_pointer_v<decltype(member)>) {
        return toText((typed.*member)());
    } else {
        return toText((typed.*member).get());
    }
}

struct Row {
    ControlKind kind;
    std::string_view property;
    Getter get;
};

struct CommonRow {
    std::string_view property;
    Getter get;
};

constexpr CommonRow kOfAll[] = {
    {"Visible", read<Control, &Control::Visible>},
    {"Enabled", read<Control, &Control::Enabled>},
    {"BackColor", read<Control, &Control::BackColor>},
    {"ForeColor", read<Control, &Control::ForeColor>},
    {"ToolTip", read<Control, &Control::ToolTip>},
};

std::string listBoxCount(const Control& control) {
    return std::to_string(static_cast<const ListBox&>(control).Items.get().size());
}

std::string richTextCode(const Control& control) {
    return toText(rtfDocument(static_cast<const RichText&>(control).runs()));
}

constexpr Row kRows[] = {
    {ControlKind::Button, "Caption", read<Button, &Button::Caption>},
    {ControlKind::Button, "Picture", read<Button, &Button::Picture>},
    {ControlKind::CheckBox, "Caption", read<CheckBox, &CheckBox::Caption>},
    {ControlKind::CheckBox, "Value", read<CheckBox, &CheckBox::Value>},
    {ControlKind::DropDownList, "Text", read<DropDownList, &DropDownList::Text>},
    {ControlKind::DropDownList, "ListIndex", read<DropDownList, &DropDownList::ListIndex>},
    {ControlKind::DropDownList, "ListCount", read<DropDownList, &DropDownList::ListCount>},
    {ControlKind::DropDownList, "Locked", read<DropDownList, &DropDownList::Locked>},
    {ControlKind::Frame, "Caption", read<Frame, &Frame::Caption>},
    {ControlKind::Graph, "TrackMode", read<Graph, &Graph::TrackMode>},
    {ControlKind::Label, "Caption", read<Label, &Label::Caption>},
    {ControlKind::ListBox, "ListIndex", read<ListBox, &ListBox::ListIndex>},
    {ControlKind::ListBox, "ListCount", listBoxCount},
    {ControlKind::MenuItem, "Caption", read<MenuItem, &MenuItem::Caption>},
    {ControlKind::MenuItem, "Checked", read<MenuItem, &MenuItem::Checked>},
    {ControlKind::OptionButton, "Caption", read<OptionButton, &OptionButton::Caption>},
    {ControlKind::OptionButton, "Value", read<OptionButton, &OptionButton::Value>},
    {ControlKind::Picture, "Image", read<Picture, &Picture::Image>},
    {ControlKind::RichText, "Text", read<RichText, &RichText::Text>},
    {ControlKind::RichText, "Rtf", richTextCode},
    {ControlKind::Slider, "Min", read<Slider, &Slider::Min>},
    {ControlKind::Slider, "Max", read<Slider, &Slider::Max>},
    {ControlKind::Slider, "Value", read<Slider, &Slider::Value>},
    {ControlKind::TextBox, "Text", read<TextBox, &TextBox::Text>},
    {ControlKind::TextBox, "Locked", read<TextBox, &TextBox::Locked>},
    {ControlKind::Timer, "Interval", read<Timer, &Timer::Interval>},
};

/// The index in "List(2)".
std::optional<int> listIndex(std::string_view property) {
    constexpr std::string_view head = "List(";
    if (!startsWith(property, head) || property.back() != ')') return std::nullopt;
    return wholeNumber(property.substr(head.size(), property.size() - head.size() - 1));
}

std::optional<std::string> listEntry(const Control& control, std::string_view property) {
    const std::optional<int> index = listIndex(property);
    if (!index) return std::nullopt;
    if (control.kind() == ControlKind::DropDownList)
        return toText(static_cast<const DropDownList&>(control).List(*index));
    if (control.kind() != ControlKind::ListBox) return std::nullopt;
    const auto& items = static_cast<const ListBox&>(control).Items.get();
    const bool inside = *index >= 0 && *index < static_cast<int>(items.size());
    return inside ? toText(items[static_cast<std::size_t>(*index)]) : std::string();
}

}  // namespace

std::optional<std::string> propertyText(const Control& control, std::string_view property) {
    for (const CommonRow& row : kOfAll)
        if (row.property == property) return row.get(control);
    for (const Row& row : kRows)
        if (row.kind == control.kind() && row.property == property) return row.get(control);
    return listEntry(control, property);
}

std::string variableText(const VariableRef& value) {
    return std::visit(
        [](const auto* pointer) -> std::string {
            using T = std::remove_cv_t<std::remove_pointer_t<decltype(pointer)>>;
            if constexpr (std::is_same_v<T, std::vector<double>>) {
                std::string text;
                for (const double number : *pointer) {
                    if (!text.empty()) text += ',';
                    text += toText(number);
                }
                return text;
            } else if constexpr (std::is_integral_v<T> && !std::is_same_v<T, bool>) {
                return toText(static_cast<int>(*pointer));
            } else {
                return toText(*pointer);
            }
        },
        value);
}

std::optional<std::string> formPropertyText(const Form& form, std::string_view property) {
    if (property == "Caption") return toText(form.Caption.get());
    if (property == "Visible") return toText(form.Visible.get());
    if (property == "Modal") return toText(form.Modal.get());
    if (property == "MousePointer") return toText(form.MousePointer.get());
    const Variable* variable = form.variable(property);
    if (variable == nullptr) return std::nullopt;
    return variableText(variable->value);
}

std::optional<std::string> textOf(Forms& forms, const ZEL3Variables& mirror,
                                  std::string_view path) {
    const auto dot = path.rfind('.');
    if (dot != std::string_view::npos) {
        const std::string_view owner = path.substr(0, dot);
        const std::string_view property = path.substr(dot + 1);
        if (const Control* control = forms.control(owner)) return propertyText(*control, property);
        if (const Form* form = forms.form(owner)) return formPropertyText(*form, property);
        return std::nullopt;
    }
    if (const Variable* variable = forms.controller.variable(path))
        return variableText(variable->value);
    const std::vector<Variable> fields = variablesOf(mirror);
    const auto found = std::find_if(fields.begin(), fields.end(),
                                    [&](const Variable& field) { return field.name == path; });
    if (found == fields.end()) return std::nullopt;
    return variableText(found->value);
}

}  // namespace zel
