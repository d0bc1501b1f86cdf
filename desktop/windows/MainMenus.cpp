#include "desktop/windows/MainMenus.h"

#include <QMenuBar>
#include <QSet>
#include <map>
#include <set>

#include "desktop/binders/Binder.h"
#include "forms/ControllerForm.h"
#include "platform/Controls.h"
#include "platform/Form.h"

namespace zel {
namespace {

/// The letter after the "&" of a text; null without one.
QChar letterOf(const QString& text) {
    for (qsizetype at = text.indexOf('&'); at >= 0; at = text.indexOf('&', at + 2))
        if (at + 1 < text.size() && text[at + 1] != '&') return text[at + 1].toLower();
    return {};
}

/// Places of a text where a letter may stand: words' starts first.
QList<qsizetype> places(const QString& text) {
    QList<qsizetype> starts;
    QList<qsizetype> others;
    for (qsizetype i = 0; i < text.size() && text[i] != '\t'; ++i) {
        if (!text[i].isLetterOrNumber()) continue;
        (i == 0 || !text[i - 1].isLetterOrNumber() ? starts : others) << i;
    }
    return starts + others;
}

}  // namespace

void giveLetters(QMenu& menu) {
    QSet<QChar> taken;
    for (const QAction* action : menu.actions()) {
        const QChar letter = letterOf(action->text());
        if (!letter.isNull()) taken.insert(letter);
    }
    for (QAction* action : menu.actions()) {
        const QString text = action->text();
        if (action->isSeparator() || !letterOf(text).isNull()) continue;
        for (const qsizetype at : places(text)) {
            if (taken.contains(text[at].toLower())) continue;
            taken.insert(text[at].toLower());
            action->setText(QString(text).insert(at, '&'));
            break;
        }
    }
}

QMenu* menuOf(const MenuItem& item, const Binder& binder) {
    auto* action = qobject_cast<QAction*>(binder.widgetOf(item));
    return action == nullptr ? nullptr : action->menu();
}

void buildMainMenus(QMainWindow& window, ControllerForm& panel, Binder& binder) {
    std::map<const MenuItem*, QMenu*> menus;
    std::set<const MenuItem*> parents;
    for (Control* control : panel.controls())
        if (control->kind() == ControlKind::MenuItem)
            parents.insert(static_cast<MenuItem*>(control)->parent());
    const auto make = [&](MenuItem& item) {
        QMenu* menu = item.parent() == nullptr ? window.menuBar()->addMenu(QString())
                                               : menus[item.parent()]->addMenu(QString());
        menu->setToolTipsVisible(&item == &panel.RecentMenu);  // the paths
        QObject::connect(menu, &QMenu::aboutToShow, menu, [menu] { giveLetters(*menu); });
        menus[&item] = menu;
        binder.bind(item, menu->menuAction());
    };
    for (MenuItem* item : {&panel.FileMenu, &panel.Connection, &panel.ViewMenu, &panel.Utility})
        make(*item);
    for (Control* control : panel.controls()) {
        if (control->kind() != ControlKind::MenuItem) continue;
        auto& item = static_cast<MenuItem&>(*control);
        if (menus.count(&item) > 0) continue;
        if (item.parent() == nullptr || parents.count(&item) > 0) {
            make(item);
        } else if (item.Caption.get() == "-") {
            menus[item.parent()]->addSeparator();
        } else {
            binder.bind(item, menus[item.parent()]->addAction(QString()));
        }
    }
}

}  // namespace zel
