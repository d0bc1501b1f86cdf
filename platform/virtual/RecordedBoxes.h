#pragma once
// Message boxes that nobody sees: each is recorded and gets the answer that a test has queued.

#include <deque>
#include <functional>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "platform/MessageBox.h"

namespace zel {

/// The button that a user presses who agrees: OK, or Yes.
BoxAnswer affirmativeOf(BoxButtons buttons);

class RecordedBoxes : public MessageBoxes {
  public:
    struct Prompt {
        std::string text;
        std::string title;
        std::string preset;
    };

    /// The answer to the next box that is asked nothing yet; answers queue up. Without one, the
    /// affirmative button.
    void answer(BoxAnswer answer) { answers_.push_back(answer); }
    /// The line typed at the next prompt; nothing cancels it. Without one, the preset.
    void answerPrompt(std::optional<std::string> line) { lines_.push_back(std::move(line)); }

    const std::vector<Box>& boxes() const { return boxes_; }
    const std::vector<Prompt>& prompts() const { return prompts_; }
    /// The texts of all boxes, in order.
    std::vector<std::string> texts() const;
    void clear();

    /// Runs while the box stands, before its answer.
    std::function<void(const Box&)> whileShown;

    BoxAnswer show(const Box& box) override;
    std::optional<std::string> prompt(const std::string& text, const std::string& title,
                                      const std::string& preset) override;

  private:
    std::vector<Box> boxes_;
    std::vector<Prompt> prompts_;
    std::deque<BoxAnswer> answers_;
    std::deque<std::optional<std::string>> lines_;
};

}  // namespace zel
