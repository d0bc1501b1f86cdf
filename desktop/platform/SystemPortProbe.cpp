#include "desktop/platform/SystemPortProbe.h"

#include <fcntl.h>
#include <grp.h>
#include <pwd.h>
#include <sys/ioctl.h>
#include <sys/stat.h>
#include <sys/sysmacros.h>
#include <sys/types.h>
#include <unistd.h>

#include <QSerialPortInfo>
#include <algorithm>
#include <cstddef>
#include <filesystem>
#include <fstream>
#include <locale>
#include <optional>
#include <string>
#include <string_view>
#include <system_error>
#include <utility>
#include <vector>

#include "platform/PortProbe.h"
#include "support/NumberText.h"
#include "support/Text.h"

namespace zel {
namespace {

namespace fs = std::filesystem;

constexpr int kMostPids = 1 << 22;
constexpr const char* kModemManagers[] = {"ModemManager", "modem-manager", "brltty", "gpsd"};

std::string firstLine(const fs::path& file) {
    std::ifstream stream;
    stream.imbue(std::locale::classic());
    stream.open(file);
    std::string line;
    std::getline(stream, line);
    return line;
}

/// The processes, as their folders.
std::vector<std::pair<long, fs::path>> processes() {
    std::vector<std::pair<long, fs::path>> found;
    std::error_code problem;
    for (fs::directory_iterator at("/proc", problem), end; !problem && at != end;
         at.increment(problem))
        if (const auto number = wholeNumber(at->path().filename().string(), 1, kMostPids))
            found.emplace_back(*number, at->path());
    return found;
}

/// The number of the pseudo terminal whose far side a descriptor is.
bool isFarSide(const fs::path& process, const std::string& descriptor, unsigned terminal) {
    std::ifstream stream;
    stream.imbue(std::locale::classic());
    stream.open(process / "fdinfo" / descriptor);
    std::string line;
    constexpr std::string_view kIndex = "tty-index:";
    while (std::getline(stream, line)) {
        if (!startsWith(line, kIndex)) continue;
        const std::string number = trimmed(replaceAll(line.substr(kIndex.size()), "\t", " "));
        return number == std::to_string(terminal);
    }
    return false;
}

constexpr unsigned kFirstPtsMajor = 136;
constexpr unsigned kLastPtsMajor = 143;
constexpr unsigned kMinorsEach = 256;
constexpr unsigned kTerminalMajor = 4;
constexpr unsigned kConsoles = 64;  // the first minor numbers are those of the screen
constexpr unsigned kMasterMajor = 5;

/// A serial port, or a terminal that may stand for one; known without opening it.
bool isPort(const struct stat& status) {
    if (!S_ISCHR(status.st_mode)) return false;
    const unsigned owner = major(status.st_rdev);
    const unsigned number = minor(status.st_rdev);
    if (owner == kMasterMajor || (owner == kTerminalMajor && number < kConsoles)) return false;
    std::error_code problem;
    const fs::path device = "/sys/dev/char/" + std::to_string(owner) + ":" + std::to_string(number);
    const fs::path subsystem = fs::read_symlink(device / "subsystem", problem);
    // A pseudo terminal is not in that list.
    return problem || subsystem.filename() == "tty";
}

/// The terminal that a process is worked from, which every user may know. Field 7 of its status
/// has the number's parts in the order of the kernel.
bool isWorkedFrom(const fs::path& process, const struct stat& port) {
    const std::string text = firstLine(process / "stat");
    const auto name = text.rfind(')');  // the name before it may hold blanks
    if (name == std::string::npos) return false;
    const std::vector<std::string> fields = split(text.substr(name + 1), ' ');
    constexpr std::size_t kTerminal = 5;
    const unsigned low = minor(port.st_rdev) & 0xFFU;
    const unsigned high = minor(port.st_rdev) & ~0xFFU;
    const unsigned number = low | (major(port.st_rdev) << 8U) | (high << 12U);
    return fields.size() > kTerminal && fields[kTerminal] == std::to_string(number);
}

enum class Holds { No, Yes, Unknown };

Holds holds(const fs::path& process, const struct stat& port) {
    const unsigned owner = major(port.st_rdev);
    const bool pseudo = owner >= kFirstPtsMajor && owner <= kLastPtsMajor;
    const unsigned terminal = (owner - kFirstPtsMajor) * kMinorsEach + minor(port.st_rdev);
    std::error_code problem;
    bool open = false;
    bool farSide = false;
    fs::directory_iterator at(process / "fd", problem);
    if (problem) {
        if (isWorkedFrom(process, port)) return Holds::Yes;
        return fs::exists(process / "fd") ? Holds::Unknown : Holds::No;
    }
    for (const fs::directory_iterator end; !problem && at != end; at.increment(problem)) {
        struct stat status {};
        if (::stat(at->path().c_str(), &status) != 0 || !S_ISCHR(status.st_mode)) continue;
        if (status.st_rdev == port.st_rdev) open = true;
        if (pseudo) farSide |= isFarSide(process, at->path().filename().string(), terminal);
    }
    return open && !farSide ? Holds::Yes : Holds::No;
}

/// A program that locks ports by a file says its process there.
std::optional<long> lockOwner(const std::string& path) {
    const std::string name = "LCK.." + fs::path(path).filename().string();
    for (const char* folder : {"/run/lock/", "/var/lock/"}) {
        const std::string text = trimmed(firstLine(folder + name));
        if (const auto number = wholeNumber(text, 1, kMostPids)) return *number;
    }
    return std::nullopt;
}

bool inGroup(gid_t group, bool ofProcess) {
    if (ofProcess) {
        if (::getegid() == group) return true;
        std::vector<gid_t> mine(static_cast<std::size_t>(std::max(::getgroups(0, nullptr), 0)));
        const int count = ::getgroups(static_cast<int>(mine.size()), mine.data());
        mine.resize(static_cast<std::size_t>(std::max(count, 0)));
        return std::find(mine.begin(), mine.end(), group) != mine.end();
    }
    const passwd* user = ::getpwuid(::geteuid());
    if (user == nullptr) return false;
    if (user->pw_gid == group) return true;
    const std::string name = user->pw_name;
    const struct group* row = ::getgrgid(group);
    if (row == nullptr) return false;
    for (char** member = row->gr_mem; *member != nullptr; ++member)
        if (name == *member) return true;
    return false;
}

}  // namespace

std::vector<SerialDevice> SystemPortProbe::devices() {
    std::vector<SerialDevice> found;
    for (const QSerialPortInfo& info : QSerialPortInfo::availablePorts())
        found.push_back({info.systemLocation().toStdString(), info.manufacturer().toStdString(),
                         info.description().toStdString(), info.serialNumber().toStdString()});
    return found;
}

PortAccess SystemPortProbe::access(const std::string& path) {
    PortAccess access;
    struct stat status {};
    if (::stat(path.c_str(), &status) != 0) return access;
    access.exists = true;
    access.terminal = isPort(status);
    access.usable = ::access(path.c_str(), R_OK | W_OK) == 0;
    // Nobody is to join the group of the administrator.
    if ((status.st_mode & (S_IRGRP | S_IWGRP)) == (S_IRGRP | S_IWGRP) && status.st_gid != 0) {
        const struct group* row = ::getgrgid(status.st_gid);
        access.group = row != nullptr ? row->gr_name : std::to_string(status.st_gid);
        access.member = inGroup(status.st_gid, false);
        access.active = inGroup(status.st_gid, true);
    }
    return access;
}

PortHolders SystemPortProbe::holders(const std::string& path) {
    PortHolders holders;
    struct stat port {};
    if (::stat(path.c_str(), &port) != 0 || !S_ISCHR(port.st_mode)) return holders;
    const auto add = [&holders](long number, const fs::path& process) {
        const std::string name = firstLine(process / "comm");
        holders.found.push_back({number, name, number == ::getpid()});
    };
    for (const auto& [number, process] : processes()) {
        const Holds answer = holds(process, port);
        if (answer == Holds::Yes) add(number, process);
        if (answer == Holds::Unknown) holders.complete = false;
    }
    if (const auto owner = lockOwner(path)) {
        const fs::path process = "/proc/" + std::to_string(*owner);
        const bool known =
            std::any_of(holders.found.begin(), holders.found.end(),
                        [&owner](const PortHolder& row) { return row.process == *owner; });
        if (!known && fs::exists(process)) add(*owner, process);
    }
    return holders;
}

std::vector<std::string> SystemPortProbe::modemManagers() {
    std::vector<std::string> running;
    for (const auto& [number, process] : processes()) {
        const std::string name = firstLine(process / "comm");
        for (const char* known : kModemManagers)
            if (name == known && std::find(running.begin(), running.end(), name) == running.end())
                running.push_back(name);
    }
    return running;
}

std::optional<ModemLines> SystemPortProbe::modemLines(const std::string& path) {
    const int port = ::open(path.c_str(), O_RDWR | O_NOCTTY | O_NONBLOCK | O_CLOEXEC);
    if (port < 0) return std::nullopt;
    int lines = 0;
    const bool known = ::ioctl(port, TIOCMGET, &lines) == 0;
    ::close(port);
    if (!known) return std::nullopt;
    return ModemLines{(lines & TIOCM_CTS) != 0, (lines & TIOCM_DSR) != 0, (lines & TIOCM_CAR) != 0,
                      (lines & TIOCM_RNG) != 0};
}

}  // namespace zel
