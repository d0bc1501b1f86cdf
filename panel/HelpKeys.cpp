#include "panel/HelpKeys.h"

#include <string_view>

#include "forms/Forms.h"
#include "platform/Controls.h"
#include "platform/Event.h"
#include "platform/Form.h"
#include "platform/Graph.h"

namespace zel {
namespace {

struct Topic {
    std::string_view form;
    int context;
};
constexpr Topic kTopics[] = {
    {"ControllerForm", kPanelTopic},
    {"DevicesChoiceForm", 1112},
    {"TCPConnectionForm", 1113},
    {"MainForm", 1113},
    {"TimeForm", 1114},
    {"ServerForm", 3113},
    {"SpecialMeasForm", 4111},
    {"WaterfallForm", 5111},
};

Event<int, int>* keysOf(Control& control) {
    switch (control.kind()) {
        case ControlKind::Button:
            return &static_cast<Button&>(control).KeyDown;
        case ControlKind::TextBox:
            return &static_cast<TextBox&>(control).KeyDown;
        case ControlKind::Graph:
            return &static_cast<Graph&>(control).KeyDown;
        default:
            return nullptr;
    }
}

}  // namespace

int helpTopicOf(std::string_view form) {
    for (const Topic& row : kTopics)
        if (row.form == form) return row.context;
    return kContentsTopic;
}

HelpKeys::HelpKeys(Forms& forms) : panel_(forms.controller) {
    for (Form* form : forms.all()) {
        const int topic = helpTopicOf(form->name());
        const auto help = [this, topic](int key, int) { keyDown(key, topic); };
        handlers_.on(form->KeyDown, help);
        for (Control* control : form->controls())
            if (Event<int, int>* keys = keysOf(*control)) handlers_.on(*keys, help);
    }
    handlers_.on(panel_.HelpHelp.Clicked, [this] { panel_.ShowHelp(kContentsTopic); });
}

void HelpKeys::keyDown(int key, int topic) {
    if (key == kKeyF1) panel_.ShowHelp(topic);
}

}  // namespace zel
