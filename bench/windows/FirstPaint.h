#pragma once
// Says when a window has been painted for the first time.

#include <QEvent>
#include <QObject>
#include <QTimer>
#include <QWidget>
#include <functional>
#include <utility>

namespace zelbench {

/// Calls `painted` once, when the window with all that is in it has been drawn.
class FirstPaint : public QObject {
  public:
    FirstPaint(QWidget& window, std::function<void()> painted) : painted_(std::move(painted)) {
        window.installEventFilter(this);
    }

    bool eventFilter(QObject* watched, QEvent* event) override {
        if (event->type() == QEvent::Paint && !told_) {
            told_ = true;
            // The children are painted in the same go, after the window itself.
            QTimer::singleShot(0, this, painted_);
        }
        return QObject::eventFilter(watched, event);
    }

  private:
    std::function<void()> painted_;
    bool told_ = false;
};

}  // namespace zelbench
