#include "bench/Conversion.h"

#include <cmath>
#include <cstddef>
#include <random>
#include <string>
#include <vector>

#include "bench/Figures.h"
#include "forms/Forms.h"
#include "model/CodeTables.h"
#include "model/ZEL3Variables.h"
#include "trace/Sweep.h"
#include "trace/TraceConversion.h"

namespace zelbench {
namespace {

constexpr std::size_t kSamples = 602;
constexpr double kBytes = kSamples * 4;
constexpr int kRounds = 101;
constexpr int kTimes = 50;  // conversions a round

struct Scale {
    const char* name;
    double unit;
    double range;
    double reference;
    double lowest;  // of the raw samples
    double highest;
};

constexpr Scale kScales[] = {
    {"dBm", 0, 0, -20, -110e3, -15e3},
    {"percent", 0, zel::RANGELIN, -20, -110e3, -15e3},
    {"volt", zel::UNITV, 0, 0.02, 1, 25e3},
    {"watt", zel::UNITW, 0, 1e-5, 1, 12e3},
};

double secondsOf(const Scale& scale) {
    zel::Forms forms;
    zel::Sweep sweep;
    sweep.settings.TraceDetector = zel::DETAUTOPEAK;
    sweep.settings.ReferenceUnit = scale.unit;
    sweep.settings.ReferenceRange = scale.range;
    sweep.settings.ReferenceLevel = scale.reference;
    zel::TraceConversion conversion(forms.controller, forms.waterfall.Graph3D);
    zel::TraceConversion::SelectRawScale(sweep);

    std::mt19937 random(1);
    std::uniform_real_distribution<double> level(scale.lowest, scale.highest);
    std::vector<double> raw(kSamples);
    for (double& sample : raw) sample = std::round(level(random));

    std::vector<double> rounds;
    rounds.reserve(kRounds);
    for (int round = 0; round < kRounds; ++round) {
        rounds.push_back(timeOf([&] {
                             for (int i = 0; i < kTimes; ++i) {
                                 sweep.raw = raw;
                                 conversion.ConvertTrace(sweep);
                             }
                         }) /
                         kTimes);
    }
    return median(rounds);
}

}  // namespace

Figure conversionCost(int baud) {
    double slowest = 0;
    std::string name;
    for (const Scale& scale : kScales) {
        const double seconds = secondsOf(scale);
        if (seconds < slowest) continue;
        slowest = seconds;
        name = scale.name;
    }
    const double line = kBytes * 10 / baud;
    return {"(c) conversion of 602 samples, " + std::to_string(baud) + " baud",
            timeText(slowest) + " (" + name + ")",
            "their bytes on the line, " + timeText(line),
            slowest / line,
            0.01,
            false,
            ""};
}

}  // namespace zelbench
