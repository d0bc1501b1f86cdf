#pragma once
// F1 opens the topic of the window in which it was pressed.

#include <QObject>
#include <functional>
#include <utility>

namespace zel {

/// An event filter of the application. A window names its form in the property "form"; a window
/// without one is the panel's. Boxes of the system keep the key.
class HelpKeyFilter : public QObject {
  public:
    explicit HelpKeyFilter(std::function<void(int context)> open) : open_(std::move(open)) {}
    bool eventFilter(QObject* watched, QEvent* event) override;

  private:
    std::function<void(int context)> open_;
};

}  // namespace zel
