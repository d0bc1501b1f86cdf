#include "desktop/platform/SystemMachine.h"

#include <fcntl.h>
#include <linux/stat.h>
#include <sys/stat.h>
#include <unistd.h>

#include <QByteArray>
#include <QCoreApplication>
#include <QFileInfo>
#include <QSysInfo>
#include <clocale>
#include <ctime>
#include <initializer_list>
#include <memory>
#include <string>
#include <vector>

#include "desktop/platform/FolderThread.h"
#include "platform/FolderFiles.h"
#include "platform/Machine.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr double kSecondsADay = 86400;
constexpr double kUnixEpoch = 25569;  // 1970-01-01 in days since 1899-12-30

/// Local time of a moment in seconds since 1970.
double dateOfUnix(std::time_t seconds) {
    std::tm local{};
    if (::localtime_r(&seconds, &local) == nullptr) return 0;
    return kUnixEpoch + static_cast<double>(seconds + local.tm_gmtoff) / kSecondsADay;
}

/// The moment at which the root of the file system was made.
double birthOfRoot() {
    struct statx status {};
    if (::statx(AT_FDCWD, "/", 0, STATX_BTIME, &status) != 0) return 0;
    if ((status.stx_mask & STATX_BTIME) == 0 || status.stx_btime.tv_sec <= 0) return 0;
    return dateOfUnix(static_cast<std::time_t>(status.stx_btime.tv_sec));
}

std::string firstThere(std::initializer_list<const char*> paths) {
    for (const char* path : paths)
        if (QFileInfo::exists(path)) return path;
    return {};
}

/// "de_AT.UTF-8@euro": language, territory, codeset.
void splitLocale(const std::string& name, MachineFacts& facts) {
    if (name.empty() || name == "C" || name == "POSIX") {
        facts.locale = name;
        return;
    }
    facts.locale = name;
    const std::string plain = split(name, '@').front();
    const std::vector<std::string> parts = split(plain, '.');
    const std::vector<std::string> words = split(parts.front(), '_');
    if (words.front() != "C") facts.language = words.front();
    if (words.size() > 1) facts.country = words[1];
    if (parts.size() > 1) facts.codeset = parts[1];
}

/// The toolkit of the windows; a program without windows runs on the library of its language.
void nameRuntime(MachineFacts& facts) {
    const QCoreApplication* application = QCoreApplication::instance();
    if (application != nullptr && application->inherits("QGuiApplication")) {
        facts.runtimeName = "Qt";
        facts.runtimeVersion = qVersion();
        return;
    }
    facts.runtimeName = "C++ library";
#if defined(_GLIBCXX_RELEASE)
    facts.runtimeVersion =
        "libstdc++ " + std::to_string(_GLIBCXX_RELEASE) + " (" + std::to_string(__GLIBCXX__) + ")";
#elif defined(_LIBCPP_VERSION)
    facts.runtimeVersion = "libc++ " + std::to_string(_LIBCPP_VERSION);
#else
    facts.runtimeVersion = "unknown";
#endif
}

}  // namespace

std::string SystemMachine::environment(const std::string& name) {
    return qgetenv(name.c_str()).toStdString();
}

std::unique_ptr<FolderReading> SystemMachine::readFolder(const std::string& folder) {
    return readInThread(folder);
}

MachineFacts SystemMachine::facts() {
    MachineFacts facts;
    facts.operatingSystem = QSysInfo::prettyProductName().toStdString() + ", " +
                            QSysInfo::kernelType().toStdString() + " " +
                            QSysInfo::kernelVersion().toStdString();
    facts.installed = birthOfRoot();
    facts.adminRights = ::geteuid() == 0;
    std::string locale;
    for (const char* name : {"LC_ALL", "LC_MESSAGES", "LANG"})
        if (locale.empty()) locale = environment(name);
    splitLocale(locale, facts);
    nameRuntime(facts);
    facts.ieeeDriver = firstThere({"/dev/gpib0", "/dev/gpib1"});
    facts.visa =
        firstThere({"/usr/lib/x86_64-linux-gnu/libvisa.so", "/usr/lib/libvisa.so",
                    "/usr/local/lib/libvisa.so", "/usr/local/vxipnp/linux/bin/libvisa.so"});
    return facts;
}

}  // namespace zel
