#include "ZELSim/Device.h"

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <limits>
#include <optional>
#include <string>
#include <utility>

#include "ZELSim/Levels.h"
#include "ZELSim/Numbers.h"
#include "ZELSim/Settings.h"
#include "ZELSim/Signals.h"
#include "ZELSim/Sweep.h"

namespace zelsim {
namespace {

constexpr char kSeparator = '\r';
constexpr std::size_t kMostDatasets = 256;
// Sweeps that one look at the display adds to an average or a hold at most; older ones that
// nobody looked at are left out.
constexpr std::uint64_t kMostFolds = 64;
constexpr double kAverageSweeps = 10;
constexpr double kVideoWindow = 0.05;  // s
constexpr double kVideoStep = 20e-6;   // s

bool hasOwnDisplay(Mode mode) { return mode != Mode::Analyzer && mode != Mode::Receiver; }

}  // namespace

Device::Device(const DeviceSetup& setup)
    : setup_(setup),
      scene_(setup.seed),
      sweeper_(scene_, setup.seed),
      timer_([this](double from, double& until) { return triggerAfter(from, until); }) {
    restart();
}

void Device::advance(double seconds) {
    now_ += seconds;
    timer_.advanceTo(now_);
}

std::optional<double> Device::nextEvent() const {
    const auto at = timer_.nextEvent();
    return at ? std::optional<double>(std::max(0.0, *at - now_)) : std::nullopt;
}

void Device::restart() {
    // A trace that is viewed stays as it is.
    if (settings_.display() != TraceMode::View) {
        traceValid_ = false;
    }
    taken_ = 0;
    folded_ = 0;
    blockValid_ = false;
    timer_.setContinuous(settings_.continuous != 0);
    if (settings_.measurement() == Mode::PowerSensor) {
        timer_.halt();
        return;
    }
    const Trigger source = settings_.trigger();
    const bool free =
        source == Trigger::FreeRun || (source == Trigger::Video && !settings_.isZeroSpan());
    timer_.start(now_, settings_.sweepSeconds() / setup_.speed, free);
}

void Device::preset() {
    const double baud = settings_.baud;
    settings_ = Settings{};
    base_ = Settings{};
    settings_.baud = baud;
    markers_ = Markers{};
    restart();
}

void Device::enterMode(Mode mode) {
    if (mode == settings_.measurement()) {
        return;
    }
    if (!hasOwnDisplay(settings_.measurement())) {
        base_ = settings_;
    }
    settings_.mode = static_cast<double>(mode);
    settings_.unit = base_.unit;
    settings_.referenceLevel = base_.referenceLevel;
    settings_.sweepTime = base_.sweepTime;
    double span = base_.span;
    switch (mode) {
        case Mode::ChannelPower:
            span = 1.2 * settings_.channelBandwidth;
            break;
        case Mode::OccupiedBandwidth:
            span = 2 * settings_.occupiedBandwidth;
            break;
        case Mode::TdmaPower:
            span = 0;
            settings_.sweepTime = 0;
            break;
        case Mode::DistanceToFault:
            settings_.unit = static_cast<double>(Unit::DB);
            settings_.referenceLevel = 0;
            // Distances come out of a sweep over frequencies.
            if (span == 0) span = kHighestHz;
            break;
        case Mode::TrackingGenerator:
            if (settings_.transmissionCal + settings_.reflectionCal +
                    settings_.transmissionVectorCal + settings_.reflectionVectorCal >
                0) {
                settings_.unit = static_cast<double>(Unit::DB);
                settings_.referenceLevel = 0;
            }
            break;
        default:
            break;
    }
    settings_.span = std::clamp(span, 0.0, kHighestHz);
    settings_.centre =
        std::clamp(settings_.centre, settings_.span / 2, kHighestHz - settings_.span / 2);
    restart();
}

bool Device::setCentre(double shownHz) {
    const double hz = shownHz - settings_.frequencyOffset;
    if (hz < kLowestHz || hz > kHighestHz) {
        return false;
    }
    settings_.centre = hz;
    settings_.span = std::min({settings_.span, 2 * hz, 2 * (kHighestHz - hz)});
    restart();
    return true;
}

bool Device::setSpan(double hz) {
    constexpr double least = 100;
    if (hz != 0 && (hz < least || hz > kHighestHz)) {
        return false;
    }
    settings_.span = hz;
    settings_.centre = std::clamp(settings_.centre, hz / 2, kHighestHz - hz / 2);
    restart();
    return true;
}

void Device::setContinuous(bool continuous) {
    settings_.continuous = continuous ? 1 : 0;
    timer_.setContinuous(continuous);
    if (continuous && !timer_.busy()) {
        restart();
    }
}

std::optional<double> Device::triggerAfter(double from, double& lookedUntil) const {
    const Trigger source = settings_.trigger();
    if (source == Trigger::Video) {
        return videoTriggerAfter(from, lookedUntil);
    }
    if (setup_.triggerPeriod <= 0) {
        lookedUntil = std::numeric_limits<double>::infinity();
        return std::nullopt;
    }
    const double edge = source == Trigger::ExternalFall ? setup_.triggerPeriod / 2 : 0.0;
    const double periods = std::ceil((from - edge) / setup_.triggerPeriod - 1e-9);
    return std::max(0.0, periods) * setup_.triggerPeriod + edge + settings_.triggerDelay;
}

double Device::powerAtCentre(double seconds) const {
    const double rbw = settings_.rbwHz();
    double sum = dbToPower(noiseFloor(settings_, settings_.centre));
    for (const Emitter& emitter : scene_.emitters()) {
        const double reach = emitter.width + 2 * rbw;
        if (std::abs(emitter.hz - settings_.centre) > reach) {
            continue;
        }
        const Activity now = scene_.at(emitter, seconds, 0);
        const double away = (now.hz - settings_.centre) / rbw;
        sum += now.mw * std::exp2(-4 * away * away);
    }
    return sum;
}

std::optional<double> Device::videoTriggerAfter(double from, double& lookedUntil) const {
    lookedUntil = from + kVideoWindow;
    const double level =
        settings_.referenceLevel - settings_.displayHeight() * (1 - settings_.triggerLevel / 100);
    const double threshold = dbToPower(level);
    bool wasAbove = powerAtCentre(from) >= threshold;
    bool alwaysAbove = wasAbove;
    for (double at = from + kVideoStep; at < lookedUntil; at += kVideoStep) {
        const bool above = powerAtCentre(at) >= threshold;
        if (above && !wasAbove) {
            return at + settings_.triggerDelay;
        }
        wasAbove = above;
        alwaysAbove = alwaysAbove && above;
    }
    // A level that never falls below the threshold has no edge to wait for.
    return alwaysAbove ? std::optional<double>(lookedUntil + settings_.triggerDelay) : std::nullopt;
}

void Device::fold(double start) {
    const Trace next = sweeper_.run(settings_, start);
    const TraceMode display = settings_.display();
    if (!traceValid_ || display == TraceMode::ClearWrite) {
        trace_ = next;
        folded_ = 1;
        traceValid_ = true;
        return;
    }
    const double share = 1.0 / std::min(static_cast<double>(++folded_), kAverageSweeps);
    const auto merge = [&](double& kept, double fresh) {
        switch (display) {
            case TraceMode::Average:
                kept += (fresh - kept) * share;
                break;
            case TraceMode::MinHold:
                kept = std::min(kept, fresh);
                break;
            case TraceMode::MaxHold:
                kept = std::max(kept, fresh);
                break;
            default:
                break;
        }
    };
    for (std::size_t i = 0; i < kPoints; ++i) {
        merge(trace_.low[i], next.low[i]);
        merge(trace_.high[i], next.high[i]);
    }
}

const Trace& Device::trace() {
    const std::uint64_t finished = timer_.finished();
    if (finished == 0) {
        // Before the first sweep's end the display shows the running one.
        if (!traceValid_) {
            fold(timer_.newestStart());
            blockValid_ = false;
        }
        return trace_;
    }
    if (taken_ == finished) {
        return trace_;
    }
    const TraceMode display = settings_.display();
    if (display == TraceMode::View && traceValid_) {
        return trace_;
    }
    if (taken_ == 0 && display != TraceMode::View) {
        traceValid_ = false;  // what was shown of the first sweep counts once
    }
    const bool gathers = display == TraceMode::Average || display == TraceMode::MinHold ||
                         display == TraceMode::MaxHold;
    const std::uint64_t sweeps = gathers ? std::min(finished - taken_, kMostFolds) : 1;
    for (std::uint64_t back = sweeps; back > 0; --back) {
        fold(timer_.newestStart() - static_cast<double>(back - 1) * timer_.length());
    }
    taken_ = finished;
    blockValid_ = false;
    return trace_;
}

const std::string& Device::traceBlock() {
    trace();
    // What beside the sweep decides how the samples look.
    std::string key = numberText(settings_.unit, 0) + ' ' + numberText(settings_.rfInput, 0) + ' ' +
                      numberText(settings_.referenceOffset, 6) + ' ' + settings_.transducer1 + ' ' +
                      settings_.transducer2;
    if (blockValid_ && key == blockKey_) {
        return block_;
    }
    block_.clear();
    if (settings_.traceDetector() == Detector::AutoPeak) {
        block_ += encodeLevels(settings_, trace_.low);
        block_ += kSeparator;
    }
    block_ += encodeLevels(settings_, trace_.high);
    block_ += kSeparator;
    blockKey_ = std::move(key);
    blockValid_ = true;
    return block_;
}

std::string Device::complexBlock() {
    Settings plain = settings_;
    plain.unit = static_cast<double>(Unit::DBm);
    std::string block = encodeLevels(plain, trace().high);
    block += kSeparator;
    block += encodePhases(sweeper_.phases(settings_, sweepStart()));
    block += kSeparator;
    return block;
}

bool Device::save(const std::string& name) {
    if (datasets_.size() >= kMostDatasets && datasets_.count(name) == 0) {
        return false;
    }
    datasets_[name] = settings_;
    return true;
}

bool Device::recall(const std::string& name) {
    const auto found = datasets_.find(name);
    if (found == datasets_.end()) {
        return false;
    }
    const double baud = settings_.baud;
    settings_ = found->second;
    settings_.baud = baud;
    restart();
    return true;
}

}  // namespace zelsim
