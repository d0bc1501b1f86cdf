#pragma once
// Message boxes, prompts and file dialogs on a console: shown as lines, answered from a queue.

#include <deque>
#include <functional>
#include <optional>
#include <string>
#include <utility>

#include "console/LineOutput.h"
#include "platform/MessageBox.h"
#include "platform/Services.h"

namespace zel {

/// The answers that wait for questions, prompts and file dialogs, first come first served.
class AnswerQueue {
  public:
    void add(std::string text) { answers_.push_back(std::move(text)); }
    bool empty() const { return answers_.empty(); }
    std::optional<std::string> next();
    /// Waits for an answer while there is none; it may stay so.
    std::function<void()> await;

  private:
    std::deque<std::string> answers_;
};

/// "box[ICON] TITLE | TEXT", the lines of the text joined by " / ".
std::string boxLine(BoxIcon icon, const std::string& title, const std::string& text);

/// Answers affirmatively what no answer waits for: OK, Yes, the preset text.
class ConsoleBoxes : public MessageBoxes {
  public:
    ConsoleBoxes(LineOutput& output, AnswerQueue& answers) : output_(output), answers_(answers) {}

    /// Gets an answer that does not fit its question; the affirmative button is taken then.
    std::function<void(const std::string&)> misfit;

    /// Reads the answer of each box as it stands, of those with an OK alone too; nothing agrees.
    /// While it is there, no queued answer is taken.
    std::function<std::optional<std::string>()> reader;

    /// Boxes so far that reported a failure.
    int failures() const { return failures_; }

    BoxAnswer show(const Box& box) override;
    std::optional<std::string> prompt(const std::string& text, const std::string& title,
                                      const std::string& preset) override;

  private:
    LineOutput& output_;
    AnswerQueue& answers_;
    int failures_ = 0;
};

/// Cancelled unless an answer waits; "cancel" cancels as well.
class ConsoleFileDialogs : public FileDialogs {
  public:
    ConsoleFileDialogs(LineOutput& output, AnswerQueue& answers)
        : output_(output), answers_(answers) {}

    /// Reads a path for each dialog, which is then reported as "file[open] TITLE"; an empty one and
    /// nothing cancel it. While it is there, no queued answer is taken.
    std::function<std::optional<std::string>()> reader;

    std::optional<std::string> save(const FileDialogRequest& request) override;
    std::optional<std::string> open(const FileDialogRequest& request) override;

  private:
    std::optional<std::string> next(const char* kind, const FileDialogRequest& request);
    LineOutput& output_;
    AnswerQueue& answers_;
};

}  // namespace zel
