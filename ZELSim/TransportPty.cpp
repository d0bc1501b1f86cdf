#include "ZELSim/TransportPty.h"

#include <fcntl.h>
#include <stdlib.h>
#include <sys/stat.h>
#include <sys/types.h>
#include <termios.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <climits>
#include <cstdlib>
#include <cstring>
#include <string>
#include <utility>

namespace zelsim {
namespace {

constexpr std::array<std::pair<int, speed_t>, 6> kSpeeds{{{9600, B9600},
                                                          {19200, B19200},
                                                          {38400, B38400},
                                                          {57600, B57600},
                                                          {115200, B115200},
                                                          {230400, B230400}}};

std::string linkTarget(const std::string& link) {
    std::array<char, PATH_MAX> room{};
    const ssize_t length = readlink(link.c_str(), room.data(), room.size());
    return length > 0 ? std::string(room.data(), static_cast<std::size_t>(length)) : std::string();
}

}  // namespace

PtyEndpoint::~PtyEndpoint() {
    if (!link_.empty() && linkTarget(link_) == device_) {
        unlink(link_.c_str());
    }
    for (const int descriptor : {slave_, master_}) {
        if (descriptor >= 0) {
            close(descriptor);
        }
    }
}

bool PtyEndpoint::fail(const std::string& what) {
    problem_ = what + ": " + std::strerror(errno);
    return false;
}

bool PtyEndpoint::open(const std::string& link, int baud, bool strictBaud, bool noticesClose) {
    strictBaud_ = strictBaud;
    master_ = posix_openpt(O_RDWR | O_NOCTTY | O_CLOEXEC);
    if (master_ < 0 || grantpt(master_) != 0 || unlockpt(master_) != 0) {
        return fail("no pseudo terminal");
    }
    std::array<char, 128> name{};
    if (ptsname_r(master_, name.data(), name.size()) != 0) {
        return fail("the pseudo terminal has no name");
    }
    device_ = name.data();
    slave_ = ::open(device_.c_str(), O_RDWR | O_NOCTTY | O_CLOEXEC);
    termios mode{};
    if (slave_ < 0 || tcgetattr(slave_, &mode) != 0) {
        return fail(device_);
    }
    // Raw before the first byte: a terminal that echoes would answer itself.
    cfmakeraw(&mode);
    for (const auto& [rate, speed] : kSpeeds) {
        if (rate == baud) {
            cfsetspeed(&mode, speed);
        }
    }
    if (tcsetattr(slave_, TCSANOW, &mode) != 0 ||
        fcntl(master_, F_SETFL, fcntl(master_, F_GETFL) | O_NONBLOCK) != 0) {
        return fail(device_);
    }
    if (noticesClose) {
        close(slave_);
        slave_ = -1;
    }
    return link.empty() || makeLink(link);
}

bool PtyEndpoint::makeLink(const std::string& link) {
    struct stat found {};
    if (lstat(link.c_str(), &found) == 0) {
        if (!S_ISLNK(found.st_mode)) {
            problem_ = link + ": there is a file of that name";
            return false;
        }
        unlink(link.c_str());
    }
    if (symlink(device_.c_str(), link.c_str()) != 0) {
        return fail(link);
    }
    link_ = link;
    return true;
}

int PtyEndpoint::hostBaud() const {
    termios mode{};
    if (!strictBaud_ || tcgetattr(master_, &mode) != 0) {
        return 0;
    }
    for (const auto& [rate, speed] : kSpeeds) {
        if (speed == cfgetospeed(&mode)) {
            return rate;
        }
    }
    return 0;
}

}  // namespace zelsim
