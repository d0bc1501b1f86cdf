// Measures the program's speed and prints the table of docs/performance.md.
//
// bench_report [--only LETTERS]: the figures of these letters ("ab"), all without it. Exit code 0
// when every figure keeps its limit, 1 when one does not, 2 on wrong use.

#include <QApplication>
#include <exception>
#include <functional>
#include <iostream>
#include <vector>

#include "bench/Conversion.h"
#include "bench/Figures.h"
#include "bench/Files.h"
#include "bench/PanelWork.h"
#include "bench/Redraw.h"
#include "bench/ScriptWork.h"
#include "bench/ServedLine.h"
#include "bench/SweepRate.h"
#include "bench/TraceWork.h"
#include "bench/Waterfall.h"
#include "bench/Windows.h"

namespace {

using zelbench::Figure;

struct Measurement {
    char letter;
    const char* what;
    std::function<Figure()> run;
};

Figure measure(const Measurement& measurement) {
    try {
        return measurement.run();
    } catch (const std::exception& error) {
        Figure failed;
        failed.what = std::string("(") + measurement.letter + ") " + measurement.what;
        failed.note = error.what();
        return failed;
    }
}

}  // namespace

int main(int argc, char** argv) {
    // What is measured is the program, not a display.
    if (!qEnvironmentVariableIsSet("QT_QPA_PLATFORM")) qputenv("QT_QPA_PLATFORM", "offscreen");
    const QApplication application(argc, argv);
    const QStringList words = QApplication::arguments();
    if (words.size() != 1 && (words.size() != 3 || words[1] != "--only")) {
        std::cerr << "Use: bench_report [--only LETTERS]\n";
        return 2;
    }
    const QString only = words.size() == 3 ? words[2] : QString();
    const std::string build = (QApplication::applicationDirPath() + "/..").toStdString();
    const std::string simulator = build + "/ZELSim/ZELSim";
    const std::string console = build + "/zelctl";
    const std::string panel = build + "/bench/bench_panel_window";
    const std::string empty = build + "/bench/bench_empty_window";

    const std::vector<Measurement> measurements{
        {'a', "full sweeps, unpaced", [&] { return zelbench::unpacedSweeps(simulator); }},
        {'b', "sweeps at 57,600 baud", [&] { return zelbench::pacedSweeps(simulator, false); }},
        {'b', "sweeps at 57,600 baud", [&] { return zelbench::pacedSweeps(simulator, true); }},
        {'c', "conversion", [] { return zelbench::conversionCost(57600); }},
        {'c', "conversion", [] { return zelbench::conversionCost(115200); }},
        {'d', "redraw", [] { return zelbench::graphRedraw(); }},
        {'e', "idle", [&] { return zelbench::idleShare(panel, simulator); }},
        {'f', "first paint", [&] { return zelbench::firstPaint(panel, empty); }},
        {'g', "setting", [&] { return zelbench::settingCost(simulator); }},
        {'h', "menus", [&] { return zelbench::menusAgain(simulator); }},
        {'i', "view", [&] { return zelbench::continuousPaced(simulator); }},
        {'i', "view", [&] { return zelbench::continuousUnpaced(simulator); }},
        {'j', "load", [] { return zelbench::loadRate(); }},
        {'j', "load", [] { return zelbench::loadBesidePlainPass(); }},
        {'k', "view", [] { return zelbench::viewWriting(); }},
        {'l', "series", [] { return zelbench::seriesPlay(); }},
        {'m', "waterfall", [] { return zelbench::waterfallFrames(900, 600, 2, 60); }},
        {'m', "waterfall", [] { return zelbench::waterfallFrames(900, 600, 1, 35); }},
        {'m', "waterfall", [] { return zelbench::waterfallFrames(1920, 1080, 2, 30); }},
        {'m', "spectrogram", [] { return zelbench::spectrogramRow(); }},
        {'m', "growth", [] { return zelbench::waterfallGrowth(); }},
        {'n', "view with rows", [&] { return zelbench::rowsPaced(simulator); }},
        {'n', "view with rows", [&] { return zelbench::rowsUnpaced(simulator); }},
        {'s', "statements", [] { return zelbench::statementRate(); }},
        {'t', "scan", [&] { return zelbench::scanCost(simulator); }},
        {'u', "statistics", [] { return zelbench::traceStatistics(); }},
        {'w', "served", [&] { return zelbench::servedPaced(simulator, console); }},
        {'w', "served", [&] { return zelbench::servedUnpaced(simulator, console); }},
        {'w', "served", [&] { return zelbench::servedRoundTrip(simulator, console); }},
        {'w', "served", [&] { return zelbench::servedIdle(simulator, console); }},
        {'w', "served", [&] { return zelbench::servedMemory(simulator, console); }},
        {'v', "slow road", [] { return zelbench::slowRoad(); }},
        {'x', "rehearsal", [] { return zelbench::rehearsalOfANight(); }},
        {'y', "trace tools", [] { return zelbench::traceToolsCost(); }},
        {'y', "recording", [] { return zelbench::recordingAnalysis(); }},
    };
    zelbench::Figures figures;
    bool allMet = true;
    for (const Measurement& measurement : measurements) {
        if (!only.isEmpty() && !only.contains(QChar(measurement.letter))) continue;
        figures.push_back(measure(measurement));
        allMet = allMet && figures.back().met();
    }
    std::cout << zelbench::markdownTable(figures);
    return allMet ? 0 : 1;
}
