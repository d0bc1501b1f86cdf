#include "analysis/TraceAnalysis.h"

#include <algorithm>
#include <cstdint>
#include <optional>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include "analysis/ChannelPower.h"
#include "analysis/Mask.h"
#include "analysis/Peaks.h"
#include "analysis/SpectrumTrace.h"

namespace zel {

AnalysisResult analyseTrace(const SpectrumTrace& trace, const AnalysisRequest& request) {
    AnalysisResult result;
    result.time = trace.time;
    result.xUnit = trace.xUnit;
    result.unit = trace.unit;
    if (request.peaks > 0 || request.bandwidth) {
        std::vector<Peak> peaks = findPeaks(trace, request.search);
        if (request.bandwidth && !peaks.empty()) {
            result.strongest = peaks.front();
            result.width = widthAtLevel(trace, peaks.front(), *request.bandwidth);
        }
        peaks.resize(std::min(peaks.size(), request.peaks));
        result.peaks = std::move(peaks);
    }
    for (const Channel& channel : request.channels)
        result.channels.push_back({channel, channelPower(trace, channel.start, channel.stop)});
    if (request.occupied) result.occupied = occupiedBandwidth(trace, *request.occupied);
    if (request.mask) result.mask = checkMask(trace, *request.mask);
    return result;
}

AnalysisRun::AnalysisRun(AnalysisRequest request) : request_(std::move(request)) {
    if (request_.hold) hold_.emplace(*request_.hold);
    if (request_.occupancy) occupancy_.emplace(*request_.occupancy);
}

AnalysisResult AnalysisRun::judged(AnalysisResult result) {
    if (result.mask) {
        judged_ = true;
        covered_ = covered_ || result.mask->margin.has_value();
        maskFailed_ = maskFailed_ || !result.mask->pass;
    }
    return result;
}

std::optional<AnalysisResult> AnalysisRun::add(const SpectrumTrace& trace, const std::string& file,
                                               std::uint64_t number) {
    const bool held = !hold_ || hold_->add(trace);
    const bool counted = !occupancy_ || occupancy_->add(trace);
    if (!held || !counted)
        throw std::runtime_error("trace " + std::to_string(number) +
                                 " has another span or unit than those before");
    if (occupancy_ && occupancy_->count() == 1) {
        axes_.xUnit = trace.xUnit;
        axes_.unit = trace.unit;
    }
    if (hold_ || occupancy_) return std::nullopt;
    AnalysisResult result = judged(analyseTrace(trace, request_));
    result.file = file;
    result.trace = number;
    return result;
}

std::optional<AnalysisResult> AnalysisRun::finish() {
    AnalysisResult result;
    if (hold_ && hold_->count() > 0) {
        result = judged(analyseTrace(hold_->result(), request_));
    } else if (occupancy_ && occupancy_->count() > 0) {
        result.xUnit = axes_.xUnit;
        result.unit = axes_.unit;
    } else {
        return std::nullopt;
    }
    if (occupancy_) result.occupancy = occupancy_->share();
    result.time.clear();
    return result;
}

}  // namespace zel
