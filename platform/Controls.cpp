#include "platform/Controls.h"

#include <algorithm>
#include <cstddef>
#include <string>
#include <utility>
#include <vector>

#include "platform/Form.h"

namespace zel {

void CheckBox::setValue(bool value) {
    if (value_ == value) return;
    value_ = value;
    noteChange();
    Clicked();
}

void OptionButton::setValue(bool value) {
    if (value_ == value) return;
    value_ = value;
    if (value) {
        for (Control* other : form().controls()) {
            if (other == this || other->kind() != ControlKind::OptionButton) continue;
            auto& option = static_cast<OptionButton&>(*other);
            if (option.group_ != group_ || !option.value_) continue;
            option.value_ = false;
            option.noteChange();
        }
    }
    noteChange();
    Clicked();
}

void DropDownList::setText(const std::string& text) {
    const auto found = std::find(items_.begin(), items_.end(), text);
    const int index = found == items_.end() ? -1 : static_cast<int>(found - items_.begin());
    const std::string& kept = index < 0 && !editable_ ? std::string() : text;
    if (kept == text_ && index == index_) return;
    text_ = kept;
    index_ = index;
    noteChange();
}

void DropDownList::setListIndex(int index) {
    if (index < 0 || index >= ListCount()) index = -1;
    if (index == index_ && text_ == List(index)) return;
    index_ = index;
    text_ = List(index);
    noteChange();
}

const std::string& DropDownList::List(int index) const {
    static const std::string none;
    return index < 0 || index >= ListCount() ? none : items_[static_cast<std::size_t>(index)];
}

void DropDownList::AddItem(std::string item) {
    items_.push_back(std::move(item));
    noteChange();
}

void DropDownList::Clear() {
    if (items_.empty() && text_.empty()) return;
    items_.clear();
    text_.clear();
    index_ = -1;
    noteChange();
}

void DropDownList::setItems(std::vector<std::string> items) {
    items_ = std::move(items);
    text_.clear();
    index_ = -1;
    noteChange();
}

void DropDownList::pick(int index) {
    setListIndex(index);
    Clicked();
}

void RichText::append(TextRun run) {
    if (run.text.empty()) return;
    const bool joins = !runs_.empty() && runs_.back().bold == run.bold &&
                       runs_.back().italic == run.italic && runs_.back().color == run.color;
    if (joins) {
        runs_.back().text += run.text;
    } else {
        runs_.push_back(std::move(run));
    }
    noteChange();
}

void RichText::setRuns(std::vector<TextRun> runs) {
    if (runs == runs_) return;
    runs_ = std::move(runs);
    noteChange();
}

}  // namespace zel
