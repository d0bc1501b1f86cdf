#include "desktop/help/HelpKeyFilter.h"

#include <QKeyEvent>
#include <QMainWindow>
#include <QWidget>

namespace zel {
namespace {

struct Topic {
    const char* form;
    int context;
};
constexpr int kContents = 1110;
constexpr int kPanel = 2111;
constexpr Topic kTopics[] = {
    {"ControllerForm", kPanel},  {"MainForm", 1113}, {"TCPConnectionForm", 1113},
    {"DevicesChoiceForm", 1112}, {"TimeForm", 1114}, {"ServerForm", 3113},
    {"SpecialMeasForm", 4111},   {"STDForm", 4111},  {"ScriptEditor", 4111},
    {"WaterfallForm", 5111},
};

}  // namespace

int helpContextOf(const QString& form) {
    for (const Topic& topic : kTopics)
        if (form == QLatin1String(topic.form)) return topic.context;
    return kContents;
}

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
    open_(panel ? kPanel : helpContextOf(form.toString()));
    return true;
}

}  // namespace zel
