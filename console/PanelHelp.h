#pragma once
// What a panel session says of itself: its lines, the forms, the controls of a form.

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "forms/Forms.h"

namespace zel {

/// The lines of a session with what each does.
const std::vector<std::string>& panelHelp();
/// The forms: name, state ("shown", "hidden"), title, with tabs between.
std::vector<std::string> formList(Forms& forms);
/// The controls of a form: name, kind, state ("enabled", "disabled", "hidden", "locked"), value,
/// with tabs between. Nothing when there is no form of that name.
std::optional<std::vector<std::string>> controlList(Forms& forms, std::string_view form);

}  // namespace zel
