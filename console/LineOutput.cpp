#include "console/LineOutput.h"

#include <utility>

namespace zel {

void LineOutput::line(const std::string& text) {
    settle();
    write(text);
}

void LineOutput::lines(const std::vector<std::string>& texts) {
    settle();
    for (const std::string& text : texts) stream_ << text << '\n';
    stream_ << std::flush;
}

void LineOutput::repeatable(const std::string& text) {
    if (count_ > 0 && text == held_) {
        ++count_;
        return;
    }
    settle();
    held_ = text;
    count_ = 1;
}

void LineOutput::settle() {
    if (count_ == 0) return;
    std::string text = std::move(held_);
    if (count_ > 1) text += " (" + std::to_string(count_) + " times)";
    held_.clear();
    count_ = 0;
    write(text);
}

void LineOutput::write(const std::string& text) { stream_ << text << '\n' << std::flush; }

}  // namespace zel
