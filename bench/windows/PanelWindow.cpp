// The program's own window, started as the program starts it.
//
// bench_panel_window: prints a line when the panel has been painted for the first time.
// bench_panel_window DEVICE SECONDS: connects to the instrument, reads one sweep, and prints the
// share of a core that the idle program then takes during these seconds.

#include <sys/resource.h>

#include <QApplication>
#include <QTemporaryDir>
#include <iostream>
#include <string>

#include "bench/Figures.h"
#include "bench/windows/FirstPaint.h"
#include "desktop/platform/QtPlatform.h"
#include "desktop/style/FontsAhead.h"
#include "desktop/windows/GuardedApplication.h"
#include "desktop/windows/MainWindow.h"
#include "desktop/windows/Theme.h"
#include "platform/LinkAddress.h"
#include "shell/Program.h"
#include "support/NumberText.h"

namespace {

constexpr int kSettleMs = 1500;
constexpr int kBaud = 57600;

double cpuSeconds() {
    rusage usage{};
    getrusage(RUSAGE_SELF, &usage);
    const auto seconds = [](const timeval& time) {
        return static_cast<double>(time.tv_sec) + static_cast<double>(time.tv_usec) * 1e-6;
    };
    return seconds(usage.ru_utime) + seconds(usage.ru_stime);
}

void runFor(int ms) {
    QTimer::singleShot(ms, [] { QApplication::exit(); });
    QApplication::exec();
}

int idleShare(zel::Program& program, const std::string& device, int seconds) {
    if (!program.connect({zel::LinkAddress::Kind::Serial, device, kBaud}, true)) return 1;
    runFor(kSettleMs);
    const double cpu = cpuSeconds();
    const double start = zelbench::now();
    runFor(seconds * 1000);
    std::cout << zel::shortestNumber((cpuSeconds() - cpu) / (zelbench::now() - start)) << std::endl;
    program.disconnect();
    return 0;
}

}  // namespace

int main(int argc, char** argv) {
    zel::GuardedApplication application(argc, argv);
    zel::FontsAhead fonts;
    zel::applyTheme(application, zel::ThemeChoice::System);
    const QTemporaryDir home;
    zel::QtPlatform platform(home.path());
    zel::Program program(platform.bundle(), "");
    zel::MainWindow window(program);
    if (argc == 3) {
        program.start();
        fonts.wait();
        window.show();
        return idleShare(program, argv[1], zel::wholeNumber(argv[2]).value_or(1));
    }
    const zelbench::FirstPaint watch(window, [] {
        std::cout << "painted" << std::endl;
        QApplication::exit();
    });
    QTimer::singleShot(0, &application, [&] {
        program.start();
        fonts.wait();
        window.show();
    });
    return QApplication::exec();
}
