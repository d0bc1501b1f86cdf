#include "bench/BareLine.h"

#include <fcntl.h>
#include <poll.h>
#include <sys/types.h>
#include <termios.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <cstddef>
#include <stdexcept>
#include <string>

namespace zelbench {
namespace {

constexpr int kSilenceMs = 5000;
constexpr std::size_t kSingleBytes = 1205;
constexpr std::size_t kDoubleBytes = 2410;
constexpr std::array<const char*, 8> kSettings{"FREQ",  "SPAN",     "REFLVL",   "UNIT",
                                               "RANGE", "DYNRANGE", "TRACEDET", "SWPTIME"};

speed_t speedOf(int baud) { return baud == 115200 ? B115200 : B57600; }

}  // namespace

BareLine::BareLine(const std::string& device, int baud)
    : line_(open(device.c_str(), O_RDWR | O_NOCTTY | O_NONBLOCK | O_CLOEXEC)) {
    termios mode{};
    if (line_ < 0 || tcgetattr(line_, &mode) != 0)
        throw std::runtime_error("cannot open " + device);
    cfmakeraw(&mode);
    mode.c_cflag |= CLOCAL | CREAD;
    cfsetspeed(&mode, speedOf(baud));
    tcsetattr(line_, TCSANOW, &mode);
    tcflush(line_, TCIOFLUSH);
    command("REMOTE");
    // Auto peak, code 0, gives two blocks of samples.
    sampleBytes_ = get("TRACEDET") == "0" ? kDoubleBytes : kSingleBytes;
}

BareLine::~BareLine() {
    if (line_ >= 0) close(line_);
}

void BareLine::write(std::string_view bytes) {
    bytes_ += bytes.size();
    while (!bytes.empty()) {
        const ssize_t count = ::write(line_, bytes.data(), bytes.size());
        if (count > 0) {
            bytes.remove_prefix(static_cast<std::size_t>(count));
        } else if (errno != EAGAIN && errno != EINTR) {
            throw std::runtime_error("the line does not take bytes");
        }
    }
}

void BareLine::readMore() {
    pollfd watched{line_, POLLIN, 0};
    if (poll(&watched, 1, kSilenceMs) <= 0) throw std::runtime_error("the instrument is silent");
    std::array<char, 4096> room{};
    const ssize_t count = read(line_, room.data(), room.size());
    if (count <= 0) throw std::runtime_error("the line is gone");
    buffer_.append(room.data(), static_cast<std::size_t>(count));
    bytes_ += static_cast<std::size_t>(count);
}

std::string_view BareLine::line() {
    std::size_t end = buffer_.find('\r', taken_);
    while (end == std::string::npos) {
        readMore();
        end = buffer_.find('\r', taken_);
    }
    const std::string_view text = std::string_view(buffer_).substr(taken_, end - taken_);
    taken_ = end + 1;
    return text;
}

void BareLine::accepted() {
    if (line() != "0") throw std::runtime_error("the instrument refuses");
}

std::string BareLine::get(std::string_view word) {
    buffer_.clear();
    taken_ = 0;
    write("GET\r");
    accepted();
    write(std::string(word) + "\r");
    accepted();
    return std::string(line());
}

void BareLine::order(std::string_view kind, std::string_view text) {
    buffer_.clear();
    taken_ = 0;
    write(kind);
    accepted();
    write(std::string(text) + "\r");
    accepted();
}

void BareLine::set(std::string_view setting) { order("set\r", setting); }

void BareLine::sweep() {
    for (const char* word : kSettings) get(word);
    pass();
}

void BareLine::pass() {
    command("WAIT");
    buffer_.clear();
    taken_ = 0;
    write("GET\r");
    accepted();
    write("TRACEBIN\r");
    accepted();
    while (buffer_.size() - taken_ < sampleBytes_) readMore();
}

}  // namespace zelbench
