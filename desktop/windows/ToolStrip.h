#pragma once
// The tool bar: what is used all the time, with icons.

#include <QToolBar>
#include <functional>

#include "desktop/binders/Binder.h"
#include "forms/Forms.h"
#include "platform/Controls.h"

namespace zel {

class ToolStrip : public QToolBar {
  public:
    /// What is no control of a form.
    struct Own {
        std::function<void()> copyPicture;
        std::function<void()> wholeView;
    };
    ToolStrip(Forms& forms, Binder& binder, Own own, QWidget* parent = nullptr);

    /// The connection has come or gone.
    void showConnected(bool connected);
    /// There is a trace to look at, or none.
    void showTrace(bool there);

  protected:
    /// Words stand beside the icons where there is room.
    void resizeEvent(QResizeEvent* event) override;

  private:
    QAction* add(const char* icon, const QString& text);
    void addButton(Button& control, const char* icon);
    QToolButton* buttonOf(QAction* action) const;

    Forms& forms_;
    Binder& binder_;
    QAction* connect_;
    QAction* disconnect_;
    QList<QAction*> ofTrace_;   ///< do nothing without a trace
    QList<QAction*> wordless_;  ///< have an icon alone in a narrow window
};

}  // namespace zel
