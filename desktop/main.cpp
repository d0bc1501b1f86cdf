// The desktop program: the panel in a window.

#include <QApplication>
#include <QCommandLineParser>
#include <QTimer>
#include <cstdio>
#include <cstdlib>
#include <iostream>

#include "desktop/platform/QtPlatform.h"
#include "desktop/windows/MainWindow.h"
#include "desktop/windows/Theme.h"
#include "platform/LinkAddress.h"
#include "shell/Program.h"
#include "shell/VersionInfo.h"

namespace {

constexpr int kWrongUse = 2;

struct Options {
    std::optional<zel::LinkAddress> address;
    QString home;
    QString words;
    QString screenshot;
    QSize size;
    std::optional<zel::ThemeChoice> theme;  ///< none: as it was chosen last
    bool valid = true;
};

Options parse(const QApplication& application) {
    QCommandLineParser parser;
    parser.setApplicationDescription("Remote control of the ZEL3 family of spectrum analysers");
    parser.addHelpOption();
    parser.addVersionOption();
    parser.addOption({"connect", "Connect to serial:DEVICE[@BAUD] or tcp:HOST:PORT.", "url"});
    parser.addOption({"home", "Keep all files and settings in this folder.", "dir"});
    parser.addOption({"words", "Words of the program's command line.", "text"});
    parser.addOption({"theme", "light, dark or system; without it the last choice.", "name"});
    parser.addOption({"size", "Size of the window, as 1024x600.", "size"});
    parser.addOption({"screenshot", "Read one sweep, save a picture of the window, end.", "file"});
    parser.addPositionalArgument("words", "Words of the program's command line.", "[words...]");
    parser.process(application);
    Options options;
    options.home = parser.value("home");
    options.words = (QStringList(parser.value("words")) + parser.positionalArguments()).join(' ');
    options.screenshot = parser.value("screenshot");
    if (parser.isSet("theme")) options.theme = zel::themeFromText(parser.value("theme"));
    const QStringList size = parser.value("size").split('x');
    if (size.size() == 2) options.size = {size[0].toInt(), size[1].toInt()};
    if (parser.isSet("connect")) {
        options.address = zel::linkAddressOf(parser.value("connect").toStdString());
        options.valid = options.address.has_value();
        if (!options.valid) {
            std::cerr << "zelremote: --connect takes serial:DEVICE[@BAUD] or tcp:HOST:PORT\n";
        }
    }
    return options;
}

bool saveWindow(zel::MainWindow& window, const QString& file) {
    window.showNow();
    if (window.grab().save(file)) return true;
    std::cerr << "zelremote: cannot write " << file.toStdString() << '\n';
    return false;
}

}  // namespace

int main(int argc, char** argv) {
    QApplication application(argc, argv);
    QApplication::setApplicationName("ZELRemote");
    QApplication::setApplicationVersion(QString::fromStdString(zel::versionText(zel::kVersion)));
    const Options options = parse(application);
    if (!options.valid) return kWrongUse;

    zel::QtPlatform platform(options.home);
    const zel::ThemeChoice theme = options.theme.value_or(zel::themeFromText(
        QString::fromStdString(platform.settings.get("ZELRemote", "Desktop", "Theme", ""))));
    zel::applyTheme(application, theme);
    zel::Program program(platform.bundle(), options.words.toStdString());
    int result = 0;
    program.Ended.connect([&result] {
        // At once: no view, wait or window on the stack holds the end up.
        std::fflush(nullptr);
        std::_Exit(result);
    });
    zel::MainWindow window(program);
    window.addThemeMenu(theme, [&](zel::ThemeChoice choice) {
        zel::applyTheme(application, choice);
        platform.settings.set("ZELRemote", "Desktop", "Theme",
                              zel::themeText(choice).toStdString());
    });
    if (options.size.isValid()) window.resize(options.size);
    const auto run = [&] {
        program.start();
        if (program.ended()) return;
        window.show();
        if (options.address) program.connect(*options.address, true);
        if (options.screenshot.isEmpty()) {
            if (program.forms().controller.isConnected)
                program.forms().controller.PlayContinuousButton.Click();
            return;
        }
        QApplication::processEvents();
        if (!saveWindow(window, options.screenshot)) result = 1;
        program.disconnect();
        QApplication::exit(result);
    };
    QTimer::singleShot(0, &application, run);
    const int code = QApplication::exec();
    return result != 0 ? result : code;
}
