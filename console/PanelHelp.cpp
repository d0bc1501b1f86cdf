#include "console/PanelHelp.h"

#include <optional>
#include <string>
#include <vector>

#include "console/ControlAccess.h"
#include "console/ControlActions.h"
#include "forms/Forms.h"
#include "platform/Form.h"

namespace zel {
namespace {

struct KindRow {
    ControlKind kind;
    const char* name;
    const char* value;  ///< the property that says most; empty for none
};
constexpr KindRow kKinds[] = {
    {ControlKind::Button, "Button", "Caption"},
    {ControlKind::CheckBox, "CheckBox", "Value"},
    {ControlKind::DropDownList, "DropDownList", "Text"},
    {ControlKind::Frame, "Frame", "Caption"},
    {ControlKind::Graph, "Graph", ""},
    {ControlKind::Graph3D, "Graph3D", ""},
    {ControlKind::Label, "Label", "Caption"},
    {ControlKind::ListBox, "ListBox", "ListIndex"},
    {ControlKind::MenuItem, "MenuItem", "Caption"},
    {ControlKind::OptionButton, "OptionButton", "Value"},
    {ControlKind::Picture, "Picture", "Image"},
    {ControlKind::RichText, "RichText", "Text"},
    {ControlKind::Slider, "Slider", "Value"},
    {ControlKind::TextBox, "TextBox", "Text"},
    {ControlKind::Timer, "Timer", "Interval"},
};

const char* stateOf(const Control& control) {
    // A timer is never seen; what counts is whether it runs.
    if (control.kind() != ControlKind::Timer)
        if (refusal(control, false) == Done::Hidden) return "hidden";
    if (refusal(control, false) == Done::Disabled || !control.Enabled) return "disabled";
    return refusal(control, true) == Done::Locked ? "locked" : "enabled";
}

}  // namespace

const std::vector<std::string>& panelHelp() {
    static const std::vector<std::string> lines = {
        "click NAME                      a button, menu item, check box or option button",
        "type NAME TEXT                  each character through the box's key events",
        "key NAME enter|left|right|backspace|clear|f1",
        "choose NAME INDEX               an entry of a list, or the place of a slider",
        "set NAME TEXT                   puts the text in the box without events",
        "show NAME.PROPERTY              Caption, Text, Visible, Enabled, Locked, Value, "
        "BackColor,",
        "                                ForeColor, ListIndex, ListCount, List(i), Checked",
        "show VARIABLE                   a variable of the panel or a setting of the instrument",
        "show graph                      the graph as data",
        "show graph3d                    the 3D graph as data",
        "show clipboard                  the text on the clipboard",
        "show help                       the path of the help book",
        "connect                         the connection of --connect",
        "disconnect                      the menu's disconnect",
        "answer TEXT                     the answer to the next question, prompt or file dialog",
        "pump MS                         lets events run for MS milliseconds",
        "move2d INDEX X Y                drags a cursor of the graph to that point",
        "zoom2d LEFT RIGHT BOTTOM TOP    draws a zoom rectangle on the graph",
        "rotate3d LATITUDE LONGITUDE     turns the 3D graph",
        "zoom3d DISTANCE                 the distance of the eye",
        "pan3d X Y Z                     moves the 3D graph",
        "click3d                         a mouse click on the 3D graph",
        "place3d PLOT POINT              the cursor lands on that point",
        "image3d FILE                    writes the picture of the 3D graph",
        "show RootDebug.NAME             a member of the structured log; the same for DebugIt.NAME",
        "set RootDebug.NAME VALUE        sets it",
        "call RootDebug.ROUTINE ARGS     runs a routine of the log; texts stand in double quotes",
        "fail NUMBER \"SOURCE\" \"DESCRIPTION\"  a failure inside an event handler",
        "help                            these lines",
        "list                            the forms",
        "list FORM                       the controls of a form: name, kind, state, value",
        "quit                            ends",
    };
    return lines;
}

std::vector<std::string> formList(Forms& forms) {
    std::vector<std::string> lines;
    for (const Form* form : forms.all())
        lines.push_back(form->name() + "\t" + (form->Visible ? "shown" : "hidden") + "\t" +
                        formPropertyText(*form, "Caption").value_or(""));
    return lines;
}

std::optional<std::vector<std::string>> controlList(Forms& forms, std::string_view name) {
    const Form* form = forms.form(name);
    if (form == nullptr) return std::nullopt;
    std::vector<std::string> lines;
    for (const Control* control : form->controls())
        for (const KindRow& row : kKinds)
            if (row.kind == control->kind())
                lines.push_back(control->name() + "\t" + row.name + "\t" + stateOf(*control) +
                                "\t" + propertyText(*control, row.value).value_or(""));
    return lines;
}

}  // namespace zel
