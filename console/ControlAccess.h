#pragma once
// The properties of controls and forms and the public variables, by their names, as text.

#include <optional>
#include <string>
#include <string_view>

#include "forms/Forms.h"
#include "model/ZEL3Variables.h"
#include "platform/Form.h"

namespace zel {

/// "Caption", "ListIndex", "List(2)" and so on; nothing when the control has no such property.
/// Flags are "true" and "false", colours decimal numbers, CR LF is "\r\n" in four characters.
std::optional<std::string> propertyText(const Control& control, std::string_view property);

/// "Caption", "Visible", "Modal", "MousePointer", or a public variable of the form.
std::optional<std::string> formPropertyText(const Form& form, std::string_view property);

/// A variable's value; the values of a list are joined by commas.
std::string variableText(const VariableRef& value);

/// "NAME.PROPERTY" of a control, "FORM.PROPERTY", or the name of a variable of the panel or of
/// the mirror. Nothing when there is none of that name.
std::optional<std::string> textOf(Forms& forms, const ZEL3Variables& mirror, std::string_view path);

}  // namespace zel
