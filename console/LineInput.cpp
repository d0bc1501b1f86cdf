#include "console/LineInput.h"

#include <poll.h>
#include <unistd.h>

#include <cerrno>
#include <utility>

namespace zel {

LineInput::Got StreamLines::next(std::string& line, bool /*block*/) {
    line.clear();
    std::streambuf* const buffer = stream_.rdbuf();
    bool any = false;
    bool tooLong = false;
    for (;;) {
        const int byte = buffer->sbumpc();
        if (byte == std::char_traits<char>::eof()) break;
        any = true;
        if (byte == '\n') break;
        if (line.size() < kLongestLine) {
            line += static_cast<char>(byte);
        } else {
            tooLong = true;
        }
    }
    if (!any) return Got::End;
    return tooLong ? Got::TooLong : Got::Line;
}

LineInput::Got DescriptorLines::next(std::string& line, bool block) {
    Got got = Got::Nothing;
    while (!take(line, got))
        if (!fill(block)) return Got::Nothing;
    return got;
}

/// True when a line, or the end, was found.
bool DescriptorLines::take(std::string& line, Got& got) {
    const auto end = waiting_.find('\n');
    if (end == std::string::npos && waiting_.size() > kLongestLine) {
        waiting_.clear();
        passingOver_ = true;
    }
    if (end == std::string::npos && !ended_) return false;
    if (end == std::string::npos && waiting_.empty() && !passingOver_) {
        got = Got::End;
        return true;
    }
    line = waiting_.substr(0, end);
    waiting_.erase(0, end == std::string::npos ? end : end + 1);
    const bool tooLong = std::exchange(passingOver_, false) || line.size() > kLongestLine;
    got = tooLong ? Got::TooLong : Got::Line;
    return true;
}

/// False when nothing has come.
bool DescriptorLines::fill(bool block) {
    pollfd ready{descriptor_, POLLIN, 0};
    if (::poll(&ready, 1, block ? -1 : 0) <= 0) return block;
    char bytes[4096];
    const ssize_t count = ::read(descriptor_, bytes, sizeof bytes);
    if (count > 0) {
        waiting_.append(bytes, static_cast<std::size_t>(count));
    } else if (count == 0 || (errno != EINTR && errno != EAGAIN)) {
        ended_ = true;
    }
    return true;
}

}  // namespace zel
