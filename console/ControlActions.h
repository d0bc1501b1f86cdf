#pragma once
// What a user does to a control, by words: click, type, key, choose, set.

#include <string>
#include <string_view>

#include "platform/Form.h"

namespace zel {

/// What became of an action.
enum class Done {
    Yes,
    Hidden,    ///< refused: the control is hidden
    Disabled,  ///< refused: it is disabled
    Locked,    ///< refused: it is locked
    Unfit,     ///< a control of that kind cannot do it
    NoKey,     ///< there is no key of that name
    NoEntry,   ///< the list has no entry of that index
};

/// A menu item counts as hidden or disabled also where a menu above it is.
Done refusal(const Control& control, bool writes);

/// A button, a menu item, a check box or an option button.
Done clickControl(Control& control);
/// Each character through the box's key events; into an editable list as it stands.
Done typeInto(Control& control, const std::string& text);
/// "enter", "left", "right", "backspace", "clear", "f1".
Done pressNamedKey(Control& control, std::string_view name);
/// An entry of a list by its index, a number from 0, with the click event.
Done chooseEntry(Control& control, std::string_view text);
/// The text as a whole, without events.
Done putText(Control& control, const std::string& text);

}  // namespace zel
