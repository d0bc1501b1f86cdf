#include "trace/PaceMonitor.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <string>

#include "forms/ControllerForm.h"
#include "platform/Clock.h"
#include "support/NumberText.h"
#include "trace/ViewAnnotations.h"

namespace zel {
namespace {

constexpr std::size_t kTracesKept = 8;
constexpr double kSecond = 1e6;             // microseconds
constexpr std::int64_t kLongGap = 5000000;  // a pause is no pace
constexpr std::int64_t kShortestCycle = 50000;
constexpr int kQuick = 250;  // ms between two texts
constexpr int kSecondMs = 1000;

/// A view that runs shows tenths. A trace that only gets older is written as seldom as its age
/// means something, since each writing costs an idle program time.
std::string ageText(double seconds, bool running) {
    const auto whole = static_cast<long>(seconds);
    if (seconds < 60 && running) return formatPattern(seconds, "0.0") + " s";
    if (seconds < 60) return std::to_string(whole) + " s";
    return std::to_string(whole / 60) + " min";
}

}  // namespace

PaceMonitor::PaceMonitor(ControllerForm& panel, const Clock& clock) : panel_(panel), clock_(clock) {
    handlers_.on(panel_.PaceTimer.Tick, [this] { show(); });
}

void PaceMonitor::cycleBegins() {
    cycleStart_ = clock_.micros();
    waited_ = 0;
}

void PaceMonitor::sweepWaitBegins() { waitStart_ = clock_.micros(); }

void PaceMonitor::sweepWaitEnds() {
    waited_ = clock_.micros() - waitStart_;
    sweepDate_ = clock_.date();
}

void PaceMonitor::drawn() {
    const std::int64_t now = clock_.micros();
    if (!drawnAt_.empty() && now - drawnAt_.back() > kLongGap) drawnAt_.clear();
    drawnAt_.push_back(now);
    if (drawnAt_.size() > kTracesKept) drawnAt_.pop_front();
    cycleMicros_ = now - cycleStart_;
    sweepMicros_ = waited_;
    panel_.PaceTimer.Interval = kQuick;
    panel_.PaceTimer.Enabled = true;
    if (panel_.CWGraph1.Old) show();
}

double PaceMonitor::sweepsPerSecond() const {
    if (drawnAt_.size() < 2 || drawnAt_.back() == drawnAt_.front()) return 0;
    return static_cast<double>(drawnAt_.size() - 1) * kSecond /
           static_cast<double>(drawnAt_.back() - drawnAt_.front());
}

void PaceMonitor::show() {
    if (drawnAt_.empty()) return;
    const std::int64_t age = clock_.micros() - drawnAt_.back();
    const bool running = viewRuns();
    std::string text = ageText(static_cast<double>(age) / kSecond, running) + " old";
    // A view that reads no sweeps, such as that of a power, has no pace of them.
    if (running && sweepsPerSecond() > 0 && age <= kLongGap) {
        text += "   " + formatPattern(sweepsPerSecond(), "0.0") + " sweeps/s   ";
        text += sweepSetsThePace() ? "the sweep sets the pace" : "the line sets the pace";
    }
    panel_.CWGraph1.Old = panel_.LinkLost || ofAnotherMode(panel_) ||
                          (running && age > 2 * std::max(cycleMicros_, kShortestCycle));
    panel_.PaceLabel.Caption = text;
    // At rest the text changes with whole seconds of the age.
    if (!running) panel_.PaceTimer.Interval = kSecondMs - static_cast<int>(age / 1000 % kSecondMs);
}

}  // namespace zel
