#include "platform/virtual/RecordedBoxes.h"

#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "platform/MessageBox.h"

namespace zel {

BoxAnswer affirmativeOf(BoxButtons buttons) {
    const bool question = buttons == BoxButtons::YesNo || buttons == BoxButtons::YesNoCancel;
    return question ? BoxAnswer::Yes : BoxAnswer::Ok;
}

std::vector<std::string> RecordedBoxes::texts() const {
    std::vector<std::string> texts;
    for (const Box& box : boxes_) texts.push_back(box.text);
    return texts;
}

void RecordedBoxes::clear() {
    boxes_.clear();
    prompts_.clear();
}

BoxAnswer RecordedBoxes::show(const Box& box) {
    boxes_.push_back(box);
    if (whileShown) whileShown(box);
    if (answers_.empty()) return affirmativeOf(box.buttons);
    const BoxAnswer answer = answers_.front();
    answers_.pop_front();
    return answer;
}

std::optional<std::string> RecordedBoxes::prompt(const std::string& text, const std::string& title,
                                                 const std::string& preset) {
    prompts_.push_back({text, title, preset});
    if (lines_.empty()) return preset;
    std::optional<std::string> line = std::move(lines_.front());
    lines_.pop_front();
    return line;
}

}  // namespace zel
