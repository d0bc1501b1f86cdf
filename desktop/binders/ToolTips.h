#pragma once
// What the controls are for, in words, and the ink of coloured texts.

#include <QColor>
#include <QString>
#include <string>

#include "platform/Form.h"

namespace zel {

/// The tip of a control; empty for one that speaks for itself.
QString toolTipOf(const Control& control);
/// The name of a control for those who hear the screen: words of the screen, with its number where
/// several are alike, and never a name of the source. Empty where its label says it.
QString accessibleNameOf(const Control& control);
/// A caption in the language of the user where the control is one of the window's own; those of the
/// instrument's panel stay as they are.
QString ownCaption(const Control& control, const std::string& caption);
/// The theme in use shows coloured texts on a dark or a light ground.
void useDarkInk(bool darkTheme);
/// A colour of the panel as a text colour with enough contrast.
QColor inkOf(Color color);

}  // namespace zel
