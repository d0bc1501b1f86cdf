#include "bench/TraceWork.h"

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <random>
#include <string>
#include <vector>

#include "analysis/Correction.h"
#include "analysis/Hold.h"
#include "analysis/HostMarkers.h"
#include "analysis/HostTraces.h"
#include "analysis/Mask.h"
#include "analysis/SavedTraces.h"
#include "analysis/SpectrumTrace.h"
#include "analysis/TraceAnalysis.h"
#include "analysis/TraceTools.h"
#include "bench/Figures.h"
#include "model/CodeTables.h"
#include "support/NumberText.h"
#include "trace/Sweep.h"

namespace zelbench {
namespace {

constexpr std::size_t kSamples = 602;
constexpr std::size_t kRows = 301;
constexpr int kRounds = 21;
constexpr int kTimes = 50;
constexpr double kAllowed = 0.5e-3;  // s a sweep
constexpr std::size_t kRecording = 100'000'000;
constexpr double kRate = 100e6;  // bytes a second

zel::Sweep noisySweep(std::mt19937& random) {
    std::uniform_real_distribution<double> noise(-100, -90);
    zel::Sweep sweep;
    sweep.wanted = sweep.came = kSamples;
    for (std::size_t i = 0; i < kSamples; ++i) {
        const double tone = -30 - std::fabs(static_cast<double>(i) - 300) * 2;
        sweep.physical.push_back(std::max(noise(random), tone));
    }
    sweep.settings.TraceDetector = zel::DETAUTOPEAK;
    sweep.settings.ResolutionBandwidth = 5;
    sweep.axis.start = 0;
    sweep.axis.stop = 3e9;
    sweep.axis.unit = "Hz";
    return sweep;
}

void switchAllOn(zel::TraceTools& tools) {
    for (std::size_t i = 0; i < zel::kHolds; ++i)
        tools.traces().switchOn(static_cast<zel::HoldKind>(i), true);
    for (std::size_t i = 0; i < zel::kHostMarkers; ++i)
        tools.markers.at(i) = {true, 0, i + 1, i == 0 ? 0U : 1U};
    tools.request.search.excursion = 3;
    tools.request.bandwidth = 3;
    tools.request.occupied = 99;
    tools.request.channels = {{1e9, 2e9}};
    tools.adjacent = zel::TraceTools::Adjacent{1.5e9, 1e8, 1e8, 2};
    tools.setMask(zel::readMask("x;upper;lower\n0;-20;-120\n3e9;-20;-120\n"));
    tools.setCorrections(
        {zel::readCorrection("x;db\n0;1\n3e9;4\n", zel::CorrectionKind::Cable, "cable")});
    tools.countStatistics(-80);
}

std::string madeRecording() {
    std::mt19937 random(1);
    std::uniform_real_distribution<double> noise(-100, -90);
    const std::string header =
        "Trace Name;Analyzer\r\nDate;2026-11-21\r\nTime;14:05:09\r\nSpan;3000000000\r\n"
        "Sweeptime;0.02\r\nResolution Bandwidth;1000000\r\nReference Unit;dBm\r\n"
        "Trace Write Pointer;301\r\n\r\n";
    std::string text;
    text.reserve(kRecording + 20'000);
    while (text.size() < kRecording) {
        text += header;
        for (std::size_t i = 0; i < kRows; ++i)
            text += zel::formatPattern(static_cast<double>(i) * 1e7, "#.000") + ";" +
                    zel::generalNumber(zel::roundHalfEven(noise(random), 3)) + "; \r\n";
    }
    return text;
}

}  // namespace

Figure traceToolsCost() {
    std::mt19937 random(1);
    std::vector<zel::Sweep> sweeps;
    for (int i = 0; i < kTimes; ++i) sweeps.push_back(noisySweep(random));
    zel::TraceTools tools;
    switchAllOn(tools);
    std::vector<double> rounds;
    for (int round = 0; round < kRounds; ++round)
        rounds.push_back(timeOf([&] {
                             for (const zel::Sweep& sweep : sweeps) tools.take(sweep, {});
                         }) /
                         kTimes);
    const double seconds = median(rounds);
    return {"(y) trace tools, all on, 602 samples",
            timeText(seconds),
            timeText(kAllowed) + " a sweep",
            seconds / kAllowed,
            1,
            false,
            ""};
}

Figure recordingAnalysis() {
    const std::string text = madeRecording();
    zel::AnalysisRequest request;
    request.peaks = 3;
    request.occupied = 99;
    zel::AnalysisRun run(request);
    std::uint64_t number = 0;
    const double seconds = timeOf([&] {
        zel::readTraces(text, zel::DateOrder::YearMonthDay, [&](const zel::SpectrumTrace& trace) {
            run.add(trace, "recording", ++number);
            return true;
        });
    });
    const double rate = static_cast<double>(text.size()) / seconds;
    return {"(y) recording of 100 MB, " + std::to_string(number) + " traces analysed",
            numberText(rate / 1e6) + " MB/s",
            numberText(kRate / 1e6) + " MB/s",
            rate / kRate,
            1,
            true,
            ""};
}

}  // namespace zelbench
