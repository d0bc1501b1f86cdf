#include "desktop/help/HelpKeyFilter.h"

#include <QKeyEvent>
#include <QMainWindow>
#include <QWidget>

#include "panel/HelpKeys.h"

namespace zel {

bool HelpKeyFilter::eventFilter(QObject* watched, QEvent* event) {
    if (event->type() != QEvent::KeyPress) return false;
    const auto* key = static_cast<const QKeyEvent*>(event);
    const auto* widget = qobject_cast<const QWidget*>(watched);
    if (key->key() != Qt::Key_F1 || key->modifiers() != Qt::NoModifier || widget == nullptr)
        return false;
    const QWidget* window = widget->window();
    const QVariant form = window->property("form");
    const bool panel =
        qobject_cast<const QMainWindow*>(window) != nullptr && !window->property("help").isValid();
    // A tool window has a topic of its own, be it docked or not.
    for (const QWidget* at = widget; at != nullptr; at = at->parentWidget()) {
        const QVariant topic = at->property("topic");
        if (!topic.isValid()) continue;
        open_(topic.toInt());
        return true;
    }
    if (!form.isValid() && !panel) return false;
    open_(panel ? kPanelTopic : helpTopicOf(form.toString().toStdString()));
    return true;
}

}  // namespace zel
