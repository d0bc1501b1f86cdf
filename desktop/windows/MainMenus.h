#pragma once
// The menus of the window: those of the panel's form, in the order that users expect, with letters.

#include <QMainWindow>
#include <QMenu>

#include "desktop/binders/Binder.h"
#include "forms/ControllerForm.h"
#include "platform/Controls.h"

namespace zel {

/// Makes the menus of the form and binds them. Entries get a letter when their menu opens.
void buildMainMenus(QMainWindow& window, ControllerForm& panel, Binder& binder);
/// The menu that an item of the form opens.
QMenu* menuOf(const MenuItem& item, const Binder& binder);
/// Gives each entry without a letter the first one that is still free, at a word's start if it can.
void giveLetters(QMenu& menu);

}  // namespace zel
