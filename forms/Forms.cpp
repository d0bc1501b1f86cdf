#include "forms/Forms.h"

#include <string_view>
#include <vector>

#include "platform/Form.h"

namespace zel {

std::vector<Form*> Forms::all() {
    return {&controller, &main,      &server,       &tcpConnection, &devicesChoice,
            &time,       &waterfall, &specialMeas,  &scriptEditor,  &std,
            &about,      &error,     &powerAndRefl, &manualScale,   &doctor};
}

Form* Forms::form(std::string_view name) {
    for (Form* form : all())
        if (form->name() == name) return form;
    return nullptr;
}

Control* Forms::control(std::string_view path) {
    const auto dot = path.find('.');
    if (dot == std::string_view::npos) return controller.control(path);
    Form* owner = form(path.substr(0, dot));
    return owner == nullptr ? nullptr : owner->control(path.substr(dot + 1));
}

}  // namespace zel
