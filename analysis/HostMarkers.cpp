#include "analysis/HostMarkers.h"

#include <cmath>
#include <cstddef>
#include <optional>
#include <vector>

#include "analysis/ChannelPower.h"
#include "analysis/Peaks.h"
#include "analysis/SpectrumTrace.h"

namespace zel {

std::optional<std::size_t> nearestSample(const SpectrumTrace& trace, double x) {
    if (trace.x.empty() || !std::isfinite(x)) return std::nullopt;
    const double step = trace.step();
    if (step <= 0) return x == trace.x.front() ? std::optional<std::size_t>(0) : std::nullopt;
    const double place = std::round((x - trace.x.front()) / step);
    if (place < 0 || place >= static_cast<double>(trace.x.size())) return std::nullopt;
    return static_cast<std::size_t>(place);
}

MarkerReadings readMarkers(const SpectrumTrace& trace, const HostMarkers& markers,
                           const std::vector<Peak>& peaks) {
    MarkerReadings readings;
    for (std::size_t i = 0; i < markers.size(); ++i) {
        const HostMarker& marker = markers.at(i);
        MarkerReading& reading = readings.at(i);
        reading.on = marker.on;
        if (!marker.on) continue;
        if (marker.peak > 0) {
            if (marker.peak > peaks.size()) continue;
            reading.x = peaks[marker.peak - 1].x;
            reading.level = peaks[marker.peak - 1].level;
        } else if (const auto sample = nearestSample(trace, marker.x)) {
            reading.x = trace.x[*sample];
            reading.level = trace.level[*sample];
        }
        if (reading.level && trace.rbw > 0 && trace.xUnit == "Hz")
            reading.density = *reading.level - 10 * std::log10(trace.rbw);
    }
    for (std::size_t i = 0; i < markers.size(); ++i) {
        const std::size_t from = markers.at(i).reference;
        if (from == 0 || from > kHostMarkers || from == i + 1) continue;
        const MarkerReading& reference = readings.at(from - 1);
        MarkerReading& reading = readings.at(i);
        if (!reading.level || !reference.level) continue;
        reading.deltaX = *reading.x - *reference.x;
        reading.deltaLevel = *reading.level - *reference.level;
    }
    return readings;
}

AdjacentChannels adjacentChannels(const SpectrumTrace& trace, double center, double width,
                                  double spacing, std::size_t pairs) {
    AdjacentChannels result;
    const auto power = [&trace, width](double middle) -> std::optional<double> {
        const double start = middle - width / 2;
        const double stop = middle + width / 2;
        if (trace.x.empty() || start < trace.x.front() || stop > trace.x.back())
            return std::nullopt;
        return channelPower(trace, start, stop);
    };
    const auto relative = [&result](std::optional<double> side) -> std::optional<double> {
        if (!side || !result.power) return std::nullopt;
        return *side - *result.power;
    };
    result.power = power(center);
    for (std::size_t i = 1; i <= pairs; ++i) {
        const double away = spacing * static_cast<double>(i);
        result.sides.push_back({relative(power(center - away)), relative(power(center + away))});
    }
    return result;
}

}  // namespace zel
