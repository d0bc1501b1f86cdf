#pragma once
// Follows the line that the program shows of its exchanges.

#include <functional>
#include <string>

#include "forms/ControllerForm.h"

namespace zel {

/// Calls `onLine` with each new text of the line, and `onExchange` before each that begins one.
class DebugWatch {
  public:
    explicit DebugWatch(ControllerForm& panel) : panel_(panel) {
        panel_.DebugTextBox.Changed.connect([this] { look(); });
    }
    DebugWatch(const DebugWatch&) = delete;
    DebugWatch& operator=(const DebugWatch&) = delete;

    std::function<void()> onExchange;
    std::function<void(const std::string&)> onLine;

  private:
    void look() {
        const std::string& text = panel_.DebugTextBox.Text;
        if (text == last_) return;
        last_ = text;
        const std::string head = " starting";
        const bool begins = text.size() > head.size() &&
                            text.compare(text.size() - head.size(), head.size(), head) == 0;
        if (begins && onExchange) onExchange();
        if (onLine) onLine(text);
    }

    ControllerForm& panel_;
    std::string last_;
};

}  // namespace zel
