// Tab goes through every control of a window, in the order of reading, and comes round.

#include <QDialog>
#include <QTest>
#include <algorithm>

#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

constexpr int kMost = 300;
constexpr int kSameRow = 12;  // pixels between the middles of what stands in one row

bool takesTab(const QWidget& widget) {
    return widget.isEnabled() && widget.isVisible() && !widget.visibleRegion().isEmpty() &&
           (widget.focusPolicy() & Qt::TabFocus) == Qt::TabFocus && widget.focusProxy() == nullptr;
}

std::string nameOf(const QWidget& widget) {
    return widget.metaObject()->className() + std::string(" ") + widget.objectName().toStdString() +
           " \"" + widget.accessibleName().toStdString() + "\"";
}

/// What Tab visits, from the first control on, until it comes round.
std::vector<QWidget*> visits(QWidget& window, Qt::Key key = Qt::Key_Tab) {
    window.activateWindow();
    QApplication::processEvents();
    std::vector<QWidget*> seen;
    QWidget* at = window.focusWidget();
    for (int i = 0; i < kMost && at != nullptr; ++i) {
        if (!seen.empty() && at == seen.front()) return seen;
        if (std::find(seen.begin(), seen.end(), at) != seen.end()) break;
        seen.push_back(at);
        QTest::keyClick(at, key, key == Qt::Key_Backtab ? Qt::ShiftModifier : Qt::NoModifier);
        at = window.focusWidget();
    }
    ADD_FAILURE() << "Tab does not come round: "
                  << (at == nullptr ? std::string("no focus") : nameOf(*at));
    return seen;
}

void expectAllVisited(QWidget& window, const std::vector<QWidget*>& seen) {
    for (QWidget* widget : window.findChildren<QWidget*>()) {
        if (widget->window() != &window || !takesTab(*widget)) continue;
        EXPECT_NE(std::find(seen.begin(), seen.end(), widget), seen.end()) << nameOf(*widget);
    }
}

/// Each step within `part` goes right in its row or down to a later one.
void expectReadingOrder(const QWidget& part, const std::vector<QWidget*>& seen) {
    std::vector<QWidget*> within;
    for (QWidget* widget : seen)
        if (part.isAncestorOf(widget)) within.push_back(widget);
    // It may have been entered in its middle: the first one is the highest, left.
    const auto place = [&part](const QWidget* widget) {
        return QRect(widget->mapTo(&part, QPoint()), widget->size()).center();
    };
    const auto before = [&](const QWidget* one, const QWidget* other) {
        const QPoint a = place(one);
        const QPoint b = place(other);
        return std::abs(a.y() - b.y()) > kSameRow ? a.y() < b.y() : a.x() < b.x();
    };
    if (within.empty()) return;
    std::rotate(within.begin(), std::min_element(within.begin(), within.end(), before),
                within.end());
    for (std::size_t i = 1; i < within.size(); ++i)
        EXPECT_TRUE(before(within[i - 1], within[i]))
            << nameOf(*within[i]) << " comes after " << nameOf(*within[i - 1]);
}

TEST_F(WindowTest, Tab_ReachesEveryControlOfTheWindow) {
    connect();
    window->resize(1440, 1000);
    show();
    window->graph().setFocus();
    const std::vector<QWidget*> seen = visits(*window);
    EXPECT_GT(seen.size(), 40U);
    expectAllVisited(*window, seen);
    expectReadingOrder(window->side(), seen);
    expectReadingOrder(*window->findChild<QWidget*>("Toolbar"), seen);
    EXPECT_EQ(visits(*window, Qt::Key_Backtab).size(), seen.size());
}

TEST_F(WindowTest, Tab_ReachesEveryControlWithoutAnInstrument) {
    show();
    window->graph().setFocus();
    const std::vector<QWidget*> seen = visits(*window);
    expectAllVisited(*window, seen);
    expectReadingOrder(window->side(), seen);
}

TEST_F(WindowTest, Tab_ReachesEveryControlOfEachDialog) {
    window->buildAll();
    for (Form* form : program->forms().all()) {
        auto* dialog = window->findChild<QDialog*>(QString::fromStdString(form->name()));
        // The forms of the panel itself, and what writes tabs.
        if (dialog == nullptr || form->name() == "ScriptEditor") continue;
        SCOPED_TRACE(form->name());
        dialog->show();
        QApplication::processEvents();
        window->binder().flush();
        QTest::keyClick(dialog, Qt::Key_Tab);
        const std::vector<QWidget*> seen = visits(*dialog);
        expectAllVisited(*dialog, seen);
        expectReadingOrder(*dialog, seen);
        dialog->hide();
    }
}

}  // namespace
}  // namespace zel
