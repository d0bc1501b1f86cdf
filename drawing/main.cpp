// zeldraw, the program that draws pictures for zelctl.

#include <QApplication>
#include <QFile>
#include <QLoggingCategory>
#include <cstdio>
#include <iostream>

#include "desktop/platform/CommonOptions.h"
#include "desktop/platform/Language.h"
#include "drawing/Draw.h"
#include "support/ExitStatus.h"

int main(int argc, char** argv) {
    CLI::App app{
        "Draws a graph, a waterfall or a spectrogram, given as JSON on standard input, into a "
        "file: png, svg or pdf by its ending, a graph also wmf.",
        "zeldraw"};
    std::string file;
    zel::addVersionOption(app);
    app.add_option("FILE", file, "The picture")->required();
    if (const auto status = zel::readCommandLine(app, argc, argv, std::cout, std::cerr))
        return std::cout.flush() ? *status : zel::kLinkFailed;

    if (!qEnvironmentVariableIsSet("QT_QPA_PLATFORM")) qputenv("QT_QPA_PLATFORM", "offscreen");
    // A start without a session of the desktop has warnings that mean nothing here.
    QLoggingCategory::setFilterRules("default.warning=false");
    QCoreApplication::setApplicationName("ZELRemote");
    const QApplication application(argc, argv);
    QLoggingCategory::setFilterRules({});
    zel::useEnglishMessages();

    QFile input;
    if (!input.open(stdin, QIODevice::ReadOnly)) {
        std::cerr << "zeldraw: standard input cannot be read\n";
        return zel::kLinkFailed;
    }
    const std::string problem = zel::drawPicture(input, file);
    if (problem.empty()) return zel::kDone;
    std::cerr << problem << '\n';
    return zel::kLinkFailed;
}
