#include "desktop/windows/GraphMenu.h"

#include <QMenu>
#include <functional>

#include "desktop/binders/Binder.h"
#include "desktop/graph/GraphNavigator.h"
#include "desktop/graph/GraphWidget.h"
#include "desktop/windows/MainMenus.h"
#include "desktop/windows/ThemeIcons.h"
#include "forms/ControllerForm.h"
#include "platform/Controls.h"

namespace zel {
namespace {

/// The entry of the window's menu, under words that fit here.
void addControl(QMenu& menu, const char* icon, const QString& text, MenuItem& item,
                Binder& binder) {
    auto* other = qobject_cast<QAction*>(binder.widgetOf(item));
    QAction* action = menu.addAction(themeIcon(icon), text, &menu, [other] { other->trigger(); });
    action->setEnabled(other != nullptr && other->isEnabled());
}

void addMarker(double x, GraphWidget& graph, ControllerForm& panel, Binder& binder) {
    auto* box = qobject_cast<QAbstractButton*>(binder.widgetOf(panel.MarkerCheckBox));
    if (!panel.CWGraph1.cursor(1).Visible && box != nullptr) box->click();
    if (!panel.CWGraph1.cursor(1).Visible) return;
    graph.drawNow();
    const QPointF point = graph.picture().pointAt(x);
    panel.CWGraph1.CursorMoved(1, point.x(), point.y());
}

}  // namespace

void showGraphMenu(QPoint place, double x, GraphWidget& graph, GraphNavigator& navigator,
                   ControllerForm& panel, Binder& binder,
                   const std::function<void()>& copyPicture) {
    // No loop of its own: a sweep that is under way goes on below an open menu.
    auto* shown = new QMenu(&graph);
    shown->setAttribute(Qt::WA_DeleteOnClose);
    QMenu& menu = *shown;
    const bool trace = !panel.CWGraph1.values().empty();
    menu.addAction(themeIcon("copy"), QObject::tr("Copy Picture"), &menu, copyPicture)
        ->setEnabled(trace);
    addControl(menu, "picture", QObject::tr("Save Picture..."), panel.MenuFileSaveImage, binder);
    addControl(menu, "save", QObject::tr("Save View..."), panel.SaveCurrentView, binder);
    menu.addSeparator();
    QAction* marker = menu.addAction(QObject::tr("Add Marker Here"), &menu,
                                     [&, x] { addMarker(x, graph, panel, binder); });
    const auto* box = qobject_cast<QAbstractButton*>(binder.widgetOf(panel.MarkerCheckBox));
    marker->setEnabled(trace && (panel.CWGraph1.cursor(1).Visible ||
                                 (panel.isConnected && box != nullptr && box->isEnabled())));
    menu.addSeparator();
    menu.addAction(QObject::tr("Zoom Back\tAlt+Left"), &menu, [&navigator] { navigator.back(); })
        ->setEnabled(navigator.canGoBack());
    menu.addAction(QObject::tr("Zoom Forward\tAlt+Right"), &menu,
                   [&navigator] { navigator.forward(); })
        ->setEnabled(navigator.canGoForward());
    menu.addAction(themeIcon("home"), QObject::tr("Whole View\tHome"), &menu,
                   [&graph] { graph.wholeView(); })
        ->setEnabled(trace);
    addControl(menu, "zoom", QObject::tr("Manual Scale..."), panel.UtilityGraphSettings, binder);
    giveLetters(menu);
    menu.popup(place);
}

}  // namespace zel
