#include "platform/Form.h"

#include <algorithm>
#include <iterator>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace zel {

Control::Control(Form& form, std::string name, ControlKind kind)
    : form_(form), name_(std::move(name)), kind_(kind) {
    form.controls_.push_back(this);
}

Control* Form::control(std::string_view name) const {
    const auto found = std::find_if(controls_.begin(), controls_.end(),
                                    [&](const Control* c) { return c->name() == name; });
    return found == controls_.end() ? nullptr : *found;
}

const Variable* Form::variable(std::string_view name) const {
    const auto found = std::find_if(variables_.begin(), variables_.end(),
                                    [&](const Variable& v) { return v.name == name; });
    return found == variables_.end() ? nullptr : &*found;
}

void Form::addVariables(std::vector<Variable> variables) {
    variables_.insert(variables_.end(), std::make_move_iterator(variables.begin()),
                      std::make_move_iterator(variables.end()));
}

void Form::load() {
    if (loaded_) return;
    loaded_ = true;
    Load();
}

void Form::unload(int argument) {
    Unload(argument);
    loaded_ = false;
    Visible = false;
}

}  // namespace zel
