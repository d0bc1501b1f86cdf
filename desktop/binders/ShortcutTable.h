#pragma once
// The keys of the keyboard that stand for the keys of the panel.

#include <QKeySequence>
#include <QString>
#include <vector>

#include "platform/Form.h"

namespace zel {

/// A control by its name and what is pressed for it, in the form of QKeySequence's portable text.
/// A button is clicked, a box or a list takes the focus; a menu opens.
struct ShortcutRow {
    const char* control;
    const char* keys;
};

const std::vector<ShortcutRow>& shortcutTable();
/// The keys of a control of the panel; empty for one without any.
QString shortcutOf(const Control& control);

/// A terminator key: what ends a number, after Alt.
constexpr const char* kTerminatorLetters = "GMKUC";

}  // namespace zel
