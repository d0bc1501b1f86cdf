#pragma once
// The application object of the window: what a handler throws ends in a box, not the program.

#include <QApplication>
#include <functional>
#include <utility>

namespace zel {

class GuardedApplication : public QApplication {
  public:
    using QApplication::QApplication;

    /// Called inside the catch of whatever a handler throws. Without one it goes on its way.
    void catchInto(std::function<void()> report) { report_ = std::move(report); }

    bool notify(QObject* receiver, QEvent* event) override {
        if (!report_) return QApplication::notify(receiver, event);
        try {
            return QApplication::notify(receiver, event);
        } catch (...) {
            report_();
            return true;
        }
    }

  private:
    std::function<void()> report_;
};

}  // namespace zel
