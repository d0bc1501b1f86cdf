#pragma once
// What typing does to a text box, for fronts that have no widget to do it.

#include <string>

#include "platform/Controls.h"

namespace zel {

/// One key through KeyDown and KeyPress; a character that no handler swallowed is appended, a
/// backspace takes the last character away.
void typeKey(TextBox& box, int codePoint);
/// A key that gives no character: arrows, clear, F1.
void pressKey(TextBox& box, int keyCode);
/// Each character of a UTF-8 text in turn.
void typeText(TextBox& box, const std::string& text);

}  // namespace zel
