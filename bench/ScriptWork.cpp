#include "bench/ScriptWork.h"

#include <QApplication>
#include <QTemporaryDir>
#include <QThread>
#include <cstddef>
#include <stdexcept>
#include <vector>

#include "bench/BareLine.h"
#include "bench/CoreSession.h"
#include "bench/Figures.h"
#include "bench/Process.h"
#include "desktop/platform/QtPlatform.h"
#include "desktop/windows/MainWindow.h"
#include "forms/ScriptForms.h"
#include "platform/virtual/VirtualPlatform.h"
#include "rehearsal/Rehearsal.h"
#include "script/ScriptFile.h"
#include "script/Statistics.h"
#include "shell/Program.h"
#include "support/NumberText.h"

namespace zelbench {
namespace {

constexpr int kBaud = 57600;
constexpr int kStatements = 10000;
constexpr double kStatementsAllowed = 0.05;
constexpr int kPoints = 1000;
constexpr int kScanRounds = 1;  // of a minute and a half each
constexpr int kSettlingMs = 50;
constexpr double kFirstHz = 100e6;
constexpr double kStepHz = 1e6;
constexpr int kTraces = 500;
constexpr double kStatisticsAllowed = 0.2e-3;
constexpr std::size_t kCharacters = 200000;
constexpr double kRoadAllowed = 1;
constexpr int kRounds = 9;
constexpr double kRehearsalAllowed = 1;
constexpr double kNightSeconds = 8 * 3600.0;
constexpr int kRehearsals = 3;

}  // namespace

Figure statementRate() {
    const QTemporaryDir home;
    zel::QtPlatform platform(home.path());
    zel::Program program(platform.bundle(), "");
    program.start();
    zel::MainWindow window(program);
    window.resize(1280, 760);
    window.show();
    program.forms().controller.cmdSpecial.Click();
    QApplication::processEvents();
    zel::SpecialMeasForm& form = program.forms().specialMeas;
    const std::vector<std::string> kinds{"# comment", "NOSAVE", "AVGCOUNT 3", "NO WORD",
                                         "SCANLVLUPPL -20.5"};
    std::vector<std::string> lines;
    for (int i = 0; i < kStatements; ++i)
        lines.push_back(kinds[static_cast<std::size_t>(i) % kinds.size()]);
    form.lstCommands.Items = lines;
    window.binder().flush();
    QApplication::processEvents();
    std::vector<double> times;
    for (int round = 0; round < kRounds; ++round) {
        times.push_back(timeOf([&] { form.cmdExecute.Click(); }));
        if (!form.ReachedEnd) throw std::runtime_error("the script did not reach its end");
        QApplication::processEvents();
    }
    const double seconds = median(times);
    return {"(s) 10,000 statements of a script, windows open",
            timeText(seconds),
            timeText(kStatementsAllowed),
            seconds / kStatementsAllowed,
            1,
            false,
            ""};
}

Figure scanCost(const std::string& simulator) {
    const Simulator instrument(simulator, {"--speed", "1000000"});
    std::vector<double> ratios;
    std::vector<double> scans;
    std::vector<double> bares;
    const auto frequency = [](int i) { return zel::numberText(kFirstHz + i * kStepHz); };
    for (int round = 0; round < kScanRounds; ++round) {
        double bare = 0;
        {
            BareLine line(instrument.device(), kBaud);
            bare = timeOf([&] {
                line.set("FREQ," + frequency(0));
                line.get("FREQ");
                for (int i = 0; i < kPoints; ++i) {
                    QThread::msleep(kSettlingMs);
                    line.get("LEVEL");
                    if (i + 1 < kPoints) line.set("FREQ," + frequency(i + 1));
                }
            });
        }
        CoreSession session(instrument.device(), kBaud);
        zel::SpecialMeasForm& form = session.program().forms().specialMeas;
        form.lstCommands.Items = std::vector<std::string>{"NOSAVE", "SCANSTART" + frequency(0),
                                                          "SCANSTEP" + zel::numberText(kStepHz),
                                                          "SCANSTOP" + frequency(kPoints - 1)};
        const double scan = timeOf([&] { form.cmdExecute.Click(); });
        if (!form.ReachedEnd) throw std::runtime_error("the scan did not reach its end");
        scans.push_back(scan / kPoints);
        bares.push_back(bare / kPoints);
        ratios.push_back(scan / bare);
    }
    return {"(t) a point of a scan, with the pause of 50 ms",
            timeText(median(scans)),
            "bare exchanges, " + timeText(median(bares)),
            median(ratios),
            1.1,
            false,
            ""};
}

Figure traceStatistics() {
    std::vector<double> raw(2 * zel::kTracePoints);
    for (std::size_t i = 0; i < raw.size(); ++i) raw[i] = -30000 + static_cast<double>(i % 97);
    double sum = 0;
    const double seconds = timeOf([&] {
                               for (int i = 0; i < kTraces; ++i) {
                                   std::vector<double> data = raw;
                                   zel::scaleComplexTrace(data);
                                   const zel::TraceStatistics trace = zel::statisticsOf(data);
                                   sum += trace.stdLevel + trace.stdPhase;
                               }
                           }) /
                           kTraces;
    if (sum == 0) throw std::runtime_error("nothing was counted");
    return {"(u) statistics of a complex trace",
            timeText(seconds),
            timeText(kStatisticsAllowed),
            seconds / kStatisticsAllowed,
            1,
            false,
            ""};
}

Figure slowRoad() {
    std::string text;
    while (text.size() < kCharacters) text += "GET LEVEL\r\nPAUSE 1\r\n\r\n# a comment\r\n";
    std::vector<double> times;
    int yields = 0;
    for (int round = 0; round < kRounds; ++round)
        times.push_back(timeOf([&] {
            zel::loadCommandsRecursively(text, "", "", [&yields] {
                ++yields;
                QApplication::processEvents();
            });
        }));
    if (yields < kRounds * 20) throw std::runtime_error("the window was not kept alive");
    const double seconds = median(times);
    return {"(v) 200,000 characters of a script by the slow road",
            timeText(seconds),
            timeText(kRoadAllowed),
            seconds / kRoadAllowed,
            1,
            false,
            ""};
}

Figure rehearsalOfANight() {
    const std::string name = "/night.txt";
    zel::VirtualPlatform platform;
    platform.files.put(name,
                       "SAVERESULTS NIGHT*.TXT\r\nDO\r\nGET LEVEL\r\nGETSWEEP\r\nSAVESWEEP\r\n"
                       "COMMENT PASS I IS DONE\r\nPAUSE 60\r\nLOOP 480\r\n");
    zel::RehearsalSetup setup;
    setup.script = name;
    setup.folder = "/";
    setup.baud = kBaud;
    std::vector<double> times;
    for (int round = 0; round < kRehearsals; ++round) {
        zel::RehearsalReport report;
        times.push_back(timeOf([&] { report = zel::rehearse(setup, platform.files); }));
        if (report.wrong() || report.seconds < kNightSeconds)
            throw std::runtime_error("the night was not run to its end");
    }
    const double seconds = median(times);
    return {"(x) the check of a night's script, 480 sweeps in 8 hours",
            timeText(seconds),
            timeText(kRehearsalAllowed),
            seconds / kRehearsalAllowed,
            1,
            false,
            ""};
}

}  // namespace zelbench
