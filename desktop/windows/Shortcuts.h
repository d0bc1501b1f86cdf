#pragma once
// The keyboard's ways to the keys of the panel, as the shortcut table lists them.

#include <QWidget>

#include "desktop/binders/Binder.h"
#include "forms/ControllerForm.h"

namespace zel {

/// Makes the shortcuts of the window. They do what a mouse could do: a key that is hidden, disabled
/// or refused is not pressed. The menus have theirs from the binder.
void buildShortcuts(QWidget& window, ControllerForm& panel, Binder& binder);

}  // namespace zel
