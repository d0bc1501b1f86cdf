#include "desktop/platform/QtSignals.h"

#include <fcntl.h>
#include <signal.h>
#include <unistd.h>

#include <QCoreApplication>
#include <array>
#include <cerrno>
#include <csignal>
#include <memory>

namespace zel {
namespace {

struct SignalName {
    int number;
    const char* name;
};
constexpr std::array<SignalName, 3> kEnding{
    {{SIGINT, "SIGINT"}, {SIGTERM, "SIGTERM"}, {SIGHUP, "SIGHUP"}}};
constexpr std::array<int, 2> kIgnored{SIGPIPE, SIGXFSZ};

volatile std::sig_atomic_t writeEnd = -1;

void note(int number) {
    const int kept = errno;
    const auto byte = static_cast<unsigned char>(number);
    [[maybe_unused]] const ssize_t written = ::write(writeEnd, &byte, 1);
    errno = kept;
}

}  // namespace

QtSignals::QtSignals() {
    std::array<int, 2> ends{-1, -1};
    if (::pipe2(ends.data(), O_CLOEXEC | O_NONBLOCK) != 0) return;
    readEnd_ = ends[0];
    writeEnd = ends[1];
    if (QCoreApplication::instance() != nullptr) {
        notifier_ = std::make_unique<QSocketNotifier>(readEnd_, QSocketNotifier::Read);
        QObject::connect(notifier_.get(), &QSocketNotifier::activated, notifier_.get(),
                         [this] { deliver(); });
    }
    // Without SA_RESTART: a read that waits for a line of input comes back.
    struct sigaction noted {};
    noted.sa_handler = note;
    for (const SignalName& row : kEnding) ::sigaction(row.number, &noted, &before_[row.number]);
    struct sigaction ignored {};
    ignored.sa_handler = SIG_IGN;
    for (const int number : kIgnored) ::sigaction(number, &ignored, &before_[number]);
}

QtSignals::~QtSignals() {
    for (const auto& [number, action] : before_) ::sigaction(number, &action, nullptr);
    notifier_.reset();
    const int other = writeEnd;
    writeEnd = -1;
    if (readEnd_ >= 0) ::close(readEnd_);
    if (other >= 0) ::close(other);
}

void QtSignals::deliver() {
    unsigned char number = 0;
    while (readEnd_ >= 0 && ::read(readEnd_, &number, 1) == 1)
        for (const SignalName& row : kEnding)
            if (row.number == number) request(row.name);
}

}  // namespace zel
