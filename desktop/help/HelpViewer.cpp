#include "desktop/help/HelpViewer.h"

#include <QApplication>
#include <QFileInfo>
#include <utility>

#include "desktop/help/HelpWindow.h"

namespace zel {

HelpViewer::HelpViewer(QString programFolder, QString homeFolder)
    : programFolder_(std::move(programFolder)), homeFolder_(std::move(homeFolder)) {}

HelpViewer::~HelpViewer() { delete window_; }

QString HelpViewer::book() const { return programFolder_ + "/help/zelremote.qch"; }

HelpWindow* HelpViewer::window() const { return window_; }

bool HelpViewer::show(int context) {
    if (!QFileInfo(book()).isFile()) return false;
    // A modal dialog blocks every window but its own children.
    QWidget* modal = QApplication::activeModalWidget();
    if (window_ && modal != nullptr && window_->parentWidget() != modal) delete window_;
    if (!window_) {
        auto* window = new HelpWindow(book(), homeFolder_, modal);
        if (!window->ready()) {
            delete window;
            return false;
        }
        window_ = window;
    }
    window_->openContext(context);
    window_->show();
    window_->raise();
    window_->activateWindow();
    return true;
}

}  // namespace zel
