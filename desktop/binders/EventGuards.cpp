#include "desktop/binders/EventGuards.h"

#include <QKeyEvent>

#include "desktop/platform/KeyCodes.h"

namespace zel {

bool KeyTeller::eventFilter(QObject* watched, QEvent* event) {
    if (event->type() == QEvent::KeyPress) {
        const auto& key = *static_cast<QKeyEvent*>(event);
        if (const int code = keyCodeOf(key); code != 0)
            control_.KeyDown(code, key.modifiers().testFlag(Qt::ShiftModifier) ? 1 : 0);
    }
    return QObject::eventFilter(watched, event);
}

bool ListGuard::eventFilter(QObject* watched, QEvent* event) {
    switch (event->type()) {
        case QEvent::Wheel:
            if (control_.Locked || !qobject_cast<QWidget*>(watched)->hasFocus()) {
                event->ignore();
                return true;
            }
            break;
        case QEvent::MouseButtonPress:
        case QEvent::MouseButtonDblClick:
            if (control_.Locked) return true;
            break;
        case QEvent::KeyPress: {
            const int key = static_cast<QKeyEvent*>(event)->key();
            const bool leaves = key == Qt::Key_Tab || key == Qt::Key_Backtab;
            if (control_.Locked && !leaves) {
                event->ignore();
                return true;
            }
            break;
        }
        default:
            break;
    }
    return QObject::eventFilter(watched, event);
}

}  // namespace zel
