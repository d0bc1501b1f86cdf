#include "console/LineOutput.h"

#include <cerrno>
#include <ostream>
#include <string>
#include <string_view>
#include <system_error>
#include <utility>
#include <vector>

#include "platform/ByteText.h"
#include "support/Text.h"

namespace zel {

std::string visibleText(std::string_view text) {
    std::string visible;
    while (!text.empty()) {
        const std::string_view before = text;
        const char32_t character = takeCharacter(text);
        const std::string_view bytes = before.substr(0, before.size() - text.size());
        const bool control = character < 0x20 || (character >= 0x7F && character <= 0x9F);
        const bool noUtf8 = bytes.size() == 1 && character > 0x7F;
        if (control) {
            visible += "\\x" + hexOf(static_cast<char>(character));
        } else if (noUtf8) {
            visible += "\\x" + hexOf(bytes.front());
        } else {
            visible += bytes;
        }
    }
    return visible;
}

void LineOutput::line(const std::string& text) {
    settle();
    write(text);
}

void LineOutput::lines(const std::vector<std::string>& texts) {
    settle();
    for (const std::string& text : texts) put(text);
    flush();
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

void LineOutput::write(const std::string& text) {
    put(text);
    flush();
}

void LineOutput::put(const std::string& text) {
    if (!problem_.empty()) return;
    errno = 0;
    stream_ << (terminal_ ? visibleText(text) : text) << '\n';
    note();
}

void LineOutput::flush() {
    if (!problem_.empty()) return;
    errno = 0;
    stream_ << std::flush;
    note();
}

void LineOutput::note() {
    if (stream_) return;
    problem_ = errno != 0 ? std::generic_category().message(errno) : "nothing can be written to it";
}

}  // namespace zel
