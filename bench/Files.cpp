#include "bench/Files.h"

#include <QApplication>
#include <QTemporaryDir>
#include <charconv>
#include <cmath>
#include <cstddef>
#include <filesystem>
#include <fstream>
#include <ios>
#include <locale>
#include <random>
#include <stdexcept>
#include <string>
#include <vector>

#include "bench/Figures.h"
#include "desktop/platform/QtPlatform.h"
#include "desktop/platform/SystemFiles.h"
#include "desktop/windows/MainWindow.h"
#include "forms/Forms.h"
#include "model/ZEL3Variables.h"
#include "platform/Event.h"
#include "platform/virtual/VirtualPlatform.h"
#include "shell/Program.h"
#include "trace/Sweep.h"

namespace zelbench {
namespace {

constexpr int kTraces = 1000;
constexpr std::size_t kPoints = 301;
constexpr int kRounds = 9;
constexpr double kWantedRate = 100e6;    // bytes a second
constexpr double kWantedWriting = 1e-3;  // seconds
constexpr double kWantedPlaying = 200;   // traces a second

/// The program without an instrument, and a folder for its files.
struct Bench {
    Bench() {
        program.start();
        zel::ZEL3Variables& mirror = program.variables();
        mirror.ResolutionBandwidth = 7;
        mirror.VideoBandwidth = 9;
        mirror.TraceDetector = 3;
        mirror.CenterFrequency = 1.5e9;
        mirror.Span = 1e6;
        mirror.ReferenceLevel = -20;
        zel::Sweep& sweep = program.sweep();
        sweep.settings = mirror;
        sweep.instrumentMode = panel.InstrumentMode;
        sweep.axis.start = 1.4995e9;
        sweep.axis.stop = 1.5005e9;
        sweep.wanted = sweep.came = kPoints;
    }
    std::string file(const char* name) const { return folder.filePath(name).toStdString(); }
    void newSweep() {
        std::vector<double>& values = program.sweep().physical;
        values.resize(kPoints);
        for (double& value : values) value = std::round(level(random)) / 1000;
    }
    /// The path of a recording of `kTraces` traces.
    std::string recording() {
        panel.CommonDialog1FileName = file("recording.csv");
        program.forms().time.ContinuousRecording = true;
        for (int i = 0; i < kTraces; ++i) {
            newSweep();
            panel.SaveView("trace");
        }
        program.forms().time.ContinuousRecording = false;
        return panel.CommonDialog1FileName;
    }

    zel::VirtualPlatform platform;
    zel::SystemFiles disk;
    zel::Program program{platform.bundle(platform.port, disk), ""};
    zel::ControllerForm& panel = program.forms().controller;
    QTemporaryDir folder;
    std::mt19937 random{1};
    std::uniform_real_distribution<double> level{-110e3, -25e3};
};

double loadSeconds(Bench& bench, const std::string& path) {
    int shown = 0;
    zel::Handlers handlers;
    handlers.on(bench.panel.TraceLoaded, [&shown] { ++shown; });
    const double seconds = timeOf([&] { bench.panel.OpenFile(path); });
    if (shown % kTraces != 0 || shown == 0)
        throw std::runtime_error("the recording was not loaded");
    return seconds;
}

/// Reads the file and turns every field into a number; the sum keeps the work from being dropped.
double plainSeconds(const std::string& path, double& sum) {
    return timeOf([&] {
        std::ifstream in(path, std::ios::binary);
        in.imbue(std::locale::classic());
        std::string text(std::filesystem::file_size(path), '\0');
        in.read(text.data(), static_cast<std::streamsize>(text.size()));
        const char* at = text.data();
        const char* const end = at + text.size();
        while (at < end) {
            const char* stop = at;
            while (stop < end && *stop != ';' && *stop != '\r' && *stop != '\n') ++stop;
            double value = 0;
            std::from_chars(at, stop, value);
            sum += value;
            at = stop + 1;
        }
    });
}

struct Loads {
    double rate = 0;   ///< bytes a second
    double ratio = 0;  ///< program beside plain pass
    double load = 0;
    double plain = 0;
};

Loads measureLoads() {
    Bench bench;
    const std::string path = bench.recording();
    std::vector<double> loads;
    std::vector<double> plains;
    std::vector<double> ratios;
    double sum = 0;
    for (int round = 0; round < kRounds; ++round) {
        loads.push_back(loadSeconds(bench, path));
        plains.push_back(plainSeconds(path, sum));
        ratios.push_back(loads.back() / plains.back());
    }
    if (sum == 0) throw std::runtime_error("the plain pass read nothing");
    Loads result;
    result.load = median(loads);
    result.plain = median(plains);
    result.ratio = median(ratios);
    result.rate = static_cast<double>(std::filesystem::file_size(path)) / result.load;
    return result;
}

}  // namespace

Figure loadRate() {
    const Loads loads = measureLoads();
    return {"(j) loading a recording of 1,000 traces",
            numberText(loads.rate / 1e6) + " MB/s",
            numberText(kWantedRate / 1e6) + " MB/s",
            loads.rate / kWantedRate,
            1,
            true,
            ""};
}

Figure loadBesidePlainPass() {
    const Loads loads = measureLoads();
    return {"(j) the same beside a plain read of its numbers",
            timeText(loads.load),
            "plain pass, " + timeText(loads.plain),
            loads.ratio,
            2,
            false,
            ""};
}

Figure viewWriting() {
    Bench bench;
    bench.panel.CommonDialog1FileName = bench.file("view.csv");
    std::vector<double> times;
    constexpr int kViews = 300;
    for (int i = 0; i < kViews; ++i) {
        bench.newSweep();
        times.push_back(timeOf([&] { bench.panel.SaveView("trace"); }));
    }
    const double seconds = median(times);
    return {"(k) writing a view of 301 rows",
            timeText(seconds),
            timeText(kWantedWriting),
            seconds / kWantedWriting,
            1,
            false,
            ""};
}

Figure seriesPlay() {
    Bench writer;
    const std::string path = writer.recording();
    const QTemporaryDir home;
    zel::QtPlatform platform(home.path());
    zel::Program program(platform.bundle(), "");
    program.start();
    zel::MainWindow window(program);
    window.resize(1280, 760);
    window.show();
    QApplication::processEvents();
    zel::ControllerForm& panel = program.forms().controller;
    int shown = 0;
    zel::Handlers handlers;
    handlers.on(panel.TraceLoaded, [&] {
        ++shown;
        // To the pixels of the window, painting included.
        window.graph().drawNow();
        window.graph().repaint();
    });
    const double seconds = timeOf([&] { panel.OpenFile(path); });
    if (shown != kTraces) throw std::runtime_error("the series was not played");
    const double rate = kTraces / seconds;
    return {"(l) series at the top of the slider",
            numberText(rate) + " traces/s",
            numberText(kWantedPlaying) + " traces/s",
            rate / kWantedPlaying,
            1,
            true,
            ""};
}

}  // namespace zelbench
