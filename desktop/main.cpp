// The desktop program: the panel in a window.

#include <QApplication>
#include <QTimer>
#include <cstdio>
#include <iostream>
#include <string>

#include "desktop/StartOptions.h"
#include "desktop/help/HelpKeyFilter.h"
#include "desktop/help/HelpViewer.h"
#include "desktop/platform/CrashTrace.h"
#include "desktop/platform/Language.h"
#include "desktop/platform/QtPlatform.h"
#include "desktop/style/FontsAhead.h"
#include "desktop/windows/GuardedApplication.h"
#include "desktop/windows/MainWindow.h"
#include "desktop/windows/Theme.h"
#include "rehearsal/Rehearsal.h"
#include "shell/Logs.h"
#include "shell/Program.h"
#include "support/ErrorReport.h"
#include "support/ExitStatus.h"
#include "support/LoggedDialogs.h"
#include "support/SessionLog.h"
#include "support/VersionInfo.h"

namespace {

bool saveWindow(zel::MainWindow& window, const std::string& file) {
    window.showNow();
    QApplication::processEvents();
    if (window.grab().save(QString::fromStdString(file))) return true;
    std::cerr << "zelremote: cannot write " << file << '\n';
    return false;
}

}  // namespace

int main(int argc, char** argv) {
    zel::StartOptions options;
    // These need no display.
    if (zel::asksForHelp(argc, argv))
        return zel::parseStartOptions(argc, argv, options, std::cout, std::cerr).value_or(0);
    zel::GuardedApplication application(argc, argv);  // takes the toolkit's own options away
    zel::useEnglishMessages();
    zel::FontsAhead fonts;  // reads the locale, which nobody sets from here on
    QApplication::setApplicationName("ZELRemote");
    QGuiApplication::setDesktopFileName("example.zelremote.ZELRemote");
    QApplication::setApplicationVersion(QString::fromStdString(zel::versionText(zel::kVersion)));
    if (const auto status = zel::parseStartOptions(argc, argv, options, std::cout, std::cerr))
        return *status;

    zel::QtPlatform platform(QString::fromStdString(options.home));
    const zel::ThemeChoice theme = options.theme.value_or(zel::themeFromText(
        QString::fromStdString(platform.settings.get("ZELRemote", "Desktop", "Theme", ""))));
    zel::applyTheme(application, theme);
    const QString language =
        options.language.empty()
            ? QString::fromStdString(platform.settings.get("ZELRemote", "Desktop", "Language", ""))
            : QString::fromStdString(options.language);
    zel::useLanguage(language, QString::fromStdString(platform.folder.programPath()));
    zel::LoggedBoxes boxes(platform.boxes);
    zel::LoggedFileDialogs dialogs(platform.fileDialogs);
    zel::Program program(platform.bundle(boxes, dialogs), options.words);
    boxes.log = dialogs.log = &program.sessionLog();
    zel::offerRehearsal(program, platform.boxes, platform.files);
    program.sessionLog().arguments = "zelremote " + options.given;
    if (!options.log.empty()) program.recordSession(options.log, program.sessionLog().arguments);
    // Of what the settings hold this alone decides what the program does by itself.
    if (program.forms().controller.ReconnectAlways.Checked)
        program.sessionLog().clicked(program.forms().controller.ReconnectAlways.name());
    application.catchInto([&program] { program.showFailure(); });
    int result = 0;
    // Every wait and loop on the stack comes back, since the program has ended.
    program.Ended.connect([&] {
        if (!program.endedBy().empty() || program.failed()) result = zel::kLinkFailed;
        QApplication::exit(result);
    });
    zel::HelpViewer help(QString::fromStdString(platform.folder.programPath()),
                         QString::fromStdString(platform.folder.path()));
    platform.launcher.help = [&help](int context) { return help.show(context); };
    zel::HelpKeyFilter helpKey(
        [&program](int context) { program.forms().controller.ShowHelp(context); });
    application.installEventFilter(&helpKey);
    zel::MainWindow window(program);
    window.useSettings(platform.settings);
    platform.launcher.ready = [&] { window.simulatorReady(platform.launcher.link()); };
    platform.launcher.ended = [&](const QString& why) { window.simulatorEnded(why); };
    window.addThemeMenu(theme, [&](zel::ThemeChoice choice) {
        zel::applyTheme(application, choice);
        platform.settings.set("ZELRemote", "Desktop", "Theme",
                              zel::themeText(choice).toStdString());
    });
    window.addLanguageMenu(language, [&](const QString& choice) {
        platform.settings.set("ZELRemote", "Desktop", "Language", choice.toStdString());
    });
    if (options.size.isValid()) window.resize(options.size);
    const auto run = [&] {
        program.start();
        if (program.ended()) return;
        fonts.wait();
        window.show();
        if (const std::string trace = program.takeCrash(); !trace.empty())
            program.errorReport().displayCrash(trace);
        zel::traceFaultsInto({program.crashFile(), program.logs().rootDebug.FileName});
        if (!options.file.empty()) window.openFile(QString::fromStdString(options.file));
        if (options.address) {
            program.sessionLog().input("connect");
            program.connect(*options.address, true);
        }
        if (program.ended()) return;
        if (options.screenshot.empty()) {
            if (program.forms().controller.isConnected) {
                program.sessionLog().clicked("PlayContinuousButton");
                program.forms().controller.PlayContinuousButton.Click();
            }
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
