#include "desktop/windows/Shortcuts.h"

#include <QShortcut>
#include <map>
#include <vector>

#include "desktop/binders/Binder.h"
#include "desktop/binders/ShortcutTable.h"
#include "desktop/windows/FoldGroup.h"
#include "forms/ControllerForm.h"
#include "platform/Form.h"

namespace zel {
namespace {

/// Presses a key, chooses an option, or goes to a box, a list or the graph.
void act(Control& control, QWidget& widget, const Binder& binder) {
    if (auto* button = qobject_cast<QAbstractButton*>(&widget); button != nullptr) {
        if (binder.refuses && binder.refuses(control)) return;
        button->click();
        return;
    }
    FoldGroup::reveal(widget);
    widget.setFocus(Qt::ShortcutFocusReason);
    if (auto* line = qobject_cast<QLineEdit*>(&widget); line != nullptr) line->selectAll();
}

}  // namespace

void buildShortcuts(QWidget& window, ControllerForm& panel, Binder& binder) {
    // Controls that share their keys take turns: the first one that can be used has them.
    std::map<QString, std::vector<Control*>> users;
    for (const ShortcutRow& row : shortcutTable()) {
        Control* control = panel.control(row.control);
        if (control != nullptr && control->kind() != ControlKind::MenuItem)
            users[row.keys].push_back(control);
    }
    for (const auto& [keys, controls] : users) {
        auto* shortcut = new QShortcut(QKeySequence(keys), &window);
        shortcut->setAutoRepeat(false);
        QObject::connect(shortcut, &QShortcut::activated, &window, [&binder, all = controls] {
            binder.flush();
            for (Control* control : all) {
                auto* widget = qobject_cast<QWidget*>(binder.widgetOf(*control));
                if (widget == nullptr || !FoldGroup::offers(*widget) || !widget->isEnabled())
                    continue;
                return act(*control, *widget, binder);
            }
        });
    }
}

}  // namespace zel
