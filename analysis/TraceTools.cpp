#include "analysis/TraceTools.h"

#include <algorithm>
#include <cstddef>
#include <optional>
#include <stdexcept>
#include <utility>
#include <vector>

#include "analysis/Correction.h"
#include "analysis/HostMarkers.h"
#include "analysis/LiveTrace.h"
#include "analysis/Mask.h"
#include "analysis/Peaks.h"
#include "analysis/SpectrumTrace.h"
#include "analysis/TraceAnalysis.h"
#include "trace/Sweep.h"

namespace zel {
namespace {

constexpr std::size_t kPeaks = 10;

}  // namespace

TraceTools::TraceTools() { request.peaks = kPeaks; }

void TraceTools::take(const Sweep& sweep, const SweepSource& source) {
    problem_.clear();
    try {
        SpectrumTrace trace = spectrumOf(sweep);
        if (source.rbw) trace.rbw = *source.rbw;
        SpectrumTrace right = corrected(trace, corrections_);
        plain_ = std::move(trace);
        trace_ = std::move(right);
    } catch (const std::runtime_error& wrong) {
        problem_ = wrong.what();
        plain_.reset();
        trace_.reset();
    }
    if (mode_ >= 0 && source.mode != mode_) traces_.endBecause("mode");
    mode_ = source.mode;
    if (trace_) {
        traces_.take(*trace_);
        if (statistics_ && !statistics_->add(*trace_)) {
            countStatistics(threshold_);
            statistics_->add(*trace_);
        }
    }
    worked_ = false;
    if (!request.mask) return Changed();
    const std::optional<MaskVerdict> verdict = result().mask;
    if (verdict && verdict->margin) {
        ++maskCount_.sweeps;
        if (verdict->pass) ++maskCount_.passed;
    }
    Changed();
    if (verdict && !verdict->pass) MaskFailed();
}

const TraceTools::Found& TraceTools::found() const {
    if (!worked_) found_ = workOut();
    worked_ = true;
    return found_;
}

MaskVerdict TraceTools::verdict() const {
    // Without a mask nothing is worked out for it.
    return request.mask ? result().mask.value_or(MaskVerdict{}) : MaskVerdict{};
}

TraceTools::Found TraceTools::workOut() const {
    Found found;
    if (!trace_) return found;
    found.result = analyseTrace(*trace_, request);
    const std::vector<Peak>& peaks = found.result.peaks;
    std::size_t wanted = 0;
    for (const HostMarker& marker : markers)
        if (marker.on) wanted = std::max(wanted, marker.peak);
    // A marker may follow a peak that the table does not show.
    found.readings = readMarkers(
        *trace_, markers, wanted > peaks.size() ? findPeaks(*trace_, request.search) : peaks);
    if (!adjacent) return found;
    std::optional<double> center = adjacent->center;
    if (!center && !peaks.empty()) center = peaks.front().x;
    if (center)
        found.adjacent =
            adjacentChannels(*trace_, *center, adjacent->width, adjacent->spacing, adjacent->pairs);
    return found;
}

void TraceTools::refresh() {
    worked_ = false;
    found();
    Changed();
}

void TraceTools::setCorrections(std::vector<Correction> corrections) {
    corrections_ = std::move(corrections);
    traces_.endBecause("correction");
    maskCount_ = {};
    if (statistics_) countStatistics(threshold_);
    problem_.clear();
    trace_.reset();
    try {
        if (plain_) trace_ = corrected(*plain_, corrections_);
    } catch (const std::runtime_error& wrong) {
        problem_ = wrong.what();
    }
    if (trace_) traces_.take(*trace_);
    refresh();
}

void TraceTools::setMask(std::optional<Mask> mask) {
    request.mask = std::move(mask);
    maskCount_ = {};
    refresh();
}

void TraceTools::countStatistics(std::optional<double> threshold) {
    threshold_ = threshold;
    statistics_.reset();
    if (threshold) statistics_.emplace(*threshold);
}

}  // namespace zel
