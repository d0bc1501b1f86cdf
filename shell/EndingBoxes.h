#pragma once
// The boxes of a program that may be at its end: then nobody is there to read or answer them.

#include <optional>
#include <string>

#include "link/ZELBas.h"
#include "platform/MessageBox.h"

namespace zel {

class EndingBoxes : public MessageBoxes {
  public:
    EndingBoxes(MessageBoxes& inner, const ZELBas& state) : inner_(inner), state_(state) {}

    /// While the program ends: the answer that changes nothing, and no box.
    BoxAnswer show(const Box& box) override {
        if (!state_.Ending) return inner_.show(box);
        if (box.buttons == BoxButtons::YesNo) return BoxAnswer::No;
        return box.buttons == BoxButtons::OkCancel ? BoxAnswer::Cancel : BoxAnswer::Ok;
    }
    std::optional<std::string> prompt(const std::string& text, const std::string& title,
                                      const std::string& preset) override {
        if (state_.Ending) return std::nullopt;
        return inner_.prompt(text, title, preset);
    }

  private:
    MessageBoxes& inner_;
    const ZELBas& state_;
};

}  // namespace zel
