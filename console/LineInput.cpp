#include "console/LineInput.h"

#include <poll.h>
#include <sys/types.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <cstddef>
#include <streambuf>
#include <string>
#include <utility>

namespace zel {
namespace {

/// Bytes taken at once, and only when no whole line is left: as many lines at most.
constexpr std::size_t kReadAhead = 1000;

}  // namespace

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
    // A descriptor below 0 is passed over.
    std::array<pollfd, 2> ready{{{descriptor_, POLLIN, 0}, {wakeDescriptor_, POLLIN, 0}}};
    const int count = ::poll(ready.data(), ready.size(), block ? -1 : 0);
    if (count < 0) return errno == EINTR && block && wakeDescriptor_ < 0;
    if (ready[0].revents == 0) return false;
    std::array<char, kReadAhead> bytes{};
    const ssize_t got = ::read(descriptor_, bytes.data(), bytes.size());
    if (got > 0) {
        waiting_.append(bytes.data(), static_cast<std::size_t>(got));
    } else if (got == 0 || (errno != EINTR && errno != EAGAIN)) {
        ended_ = true;
    }
    return true;
}

}  // namespace zel
