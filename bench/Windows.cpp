#include "bench/Windows.h"

#include <string>
#include <vector>

#include "bench/Figures.h"
#include "bench/Process.h"
#include "support/NumberText.h"

namespace zelbench {
namespace {

constexpr int kIdleSeconds = 5;
constexpr int kIdlePatience = 30;  // seconds, connecting and settling included
constexpr int kStarts = 15;
constexpr double kMostOfEmpty = 3.5;  // times an empty window
constexpr int kStartPatience = 20;    // seconds

double startOf(const std::string& program) {
    const double start = now();
    Process process(program, {});
    process.line(kStartPatience);
    return now() - start;
}

}  // namespace

Figure idleShare(const std::string& panel, const std::string& simulator) {
    const Simulator instrument(simulator, {});
    Process process(panel, {instrument.device(), std::to_string(kIdleSeconds)});
    const double share = zel::leadingNumber(process.line(kIdlePatience));
    return {"(e) idle program, connected, CPU time",
            timeText(share * kIdleSeconds),
            std::to_string(kIdleSeconds) + " s of a core",
            share,
            0.01,
            false,
            ""};
}

Figure firstPaint(const std::string& panel, const std::string& empty) {
    startOf(empty);
    startOf(panel);  // both files are in memory from here on
    std::vector<double> panels;
    std::vector<double> empties;
    for (int i = 0; i < kStarts; ++i) {
        empties.push_back(startOf(empty));
        panels.push_back(startOf(panel));
    }
    const double measured = median(panels);
    const double least = median(empties);
    return {"(f) start of the program to first paint",
            timeText(measured),
            "empty Qt window, " + timeText(least),
            measured / least,
            kMostOfEmpty,
            false,
            ""};
}

}  // namespace zelbench
