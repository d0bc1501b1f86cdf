#include "analysis/AnalysisText.h"

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <initializer_list>
#include <optional>
#include <string>
#include <vector>

#include "analysis/ChannelPower.h"
#include "analysis/Mask.h"
#include "analysis/Peaks.h"
#include "analysis/TraceAnalysis.h"
#include "support/NumberText.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr int kLevelDecimals = 2;

std::string jsonText(const std::string& text) {
    constexpr const char* kHex = "0123456789abcdef";
    std::string quoted = "\"";
    for (const char character : text) {
        const auto code = static_cast<unsigned char>(character);
        if (character == '"' || character == '\\') {
            quoted += '\\';
            quoted += character;
        } else if (code < ' ') {
            quoted += std::string("\\u00") + kHex[code / 16] + kHex[code % 16];
        } else {
            quoted += character;
        }
    }
    return quoted + "\"";
}

std::string jsonNumber(std::optional<double> number) {
    return number && std::isfinite(*number) ? shortestNumber(*number) : "null";
}

std::string jsonName(const char* name) { return std::string("\"") + name + "\": "; }

/// A member with its comma in front.
std::string member(const char* name, const std::string& value) {
    return ", " + jsonName(name) + value;
}

template <class List, class Writer>
std::string jsonList(const List& list, Writer write) {
    std::string text = "[";
    for (const auto& entry : list) text += (text.size() > 1 ? ", " : "") + write(entry);
    return text + "]";
}

std::string csvText(const std::string& text) {
    if (text.find_first_of("\",\r\n") == std::string::npos) return text;
    return "\"" + replaceAll(text, "\"", "\"\"") + "\"";
}

std::string csvNumber(std::optional<double> number) {
    return number && std::isfinite(*number) ? shortestNumber(*number) : "";
}

std::string csvLine(const std::vector<std::string>& fields) {
    std::string line;
    for (const std::string& field : fields) line += (&field == &fields.front() ? "" : ",") + field;
    return line;
}

std::optional<double> levelOf(const std::optional<Peak>& peak) {
    return peak ? std::optional<double>(peak->level) : std::nullopt;
}

std::optional<double> placeOf(const std::optional<Peak>& peak) {
    return peak ? std::optional<double>(peak->x) : std::nullopt;
}

std::string unknownOr(std::optional<double> number, const std::string& unit, bool level = false) {
    if (!number || !std::isfinite(*number)) return "unknown";
    const double shown = level ? roundHalfEven(*number, kLevelDecimals) : *number;
    return generalNumber(shown) + (unit.empty() ? "" : " " + unit);
}

}  // namespace

std::string analysisJson(const AnalysisResult& result, const AnalysisRequest& request) {
    const auto textOrNull = [](const std::string& text) {
        return text.empty() ? std::string("null") : jsonText(text);
    };
    std::string json =
        "{" + jsonName("file") + textOrNull(result.file) +
        member("trace", std::to_string(result.trace)) + member("time", textOrNull(result.time)) +
        member("x_unit", jsonText(result.xUnit)) + member("unit", jsonText(result.unit));
    // Nothing but the occupancy is known of traces that are only counted.
    const bool counted = request.occupancy && !request.hold;
    if (request.peaks > 0 && !counted)
        json += member("peaks", jsonList(result.peaks, [](const Peak& peak) {
                           return "{" + jsonName("x") + jsonNumber(peak.x) +
                                  member("level", jsonNumber(peak.level)) + "}";
                       }));
    if (request.bandwidth && !counted)
        json += member("bandwidth", "{" + jsonName("x") + jsonNumber(placeOf(result.strongest)) +
                                        member("level", jsonNumber(levelOf(result.strongest))) +
                                        member("low", jsonNumber(result.width.low)) +
                                        member("high", jsonNumber(result.width.high)) +
                                        member("width", jsonNumber(result.width.width())) + "}");
    if (!request.channels.empty() && !counted)
        json += member("channels", jsonList(result.channels, [](const ChannelResult& row) {
                           return "{" + jsonName("start") + jsonNumber(row.channel.start) +
                                  member("stop", jsonNumber(row.channel.stop)) +
                                  member("power", jsonNumber(row.power)) + "}";
                       }));
    if (request.occupied && !counted) {
        const auto& found = result.occupied;
        const auto figure = [&found](double value) {
            return jsonNumber(found ? std::optional<double>(value) : std::nullopt);
        };
        const OccupiedBandwidth band = found.value_or(OccupiedBandwidth());
        json += member("occupied", "{" + jsonName("percent") + jsonNumber(request.occupied) +
                                       member("low", figure(band.low)) +
                                       member("high", figure(band.high)) +
                                       member("width", figure(band.width())) + "}");
    }
    if (result.mask) {
        const MaskVerdict& verdict = *result.mask;
        json +=
            member("mask", "{" + jsonName("pass") + (verdict.pass ? "true" : "false") +
                               member("margin", jsonNumber(verdict.margin)) +
                               member("x", verdict.margin ? jsonNumber(verdict.x) : "null") + "}");
    }
    if (request.occupancy)
        json += member("occupancy",
                       jsonList(result.occupancy, [](double share) { return jsonNumber(share); }));
    return json + "}";
}

std::string analysisCsvHeader(const AnalysisRequest& request, std::size_t samples) {
    std::vector<std::string> names = {"file", "trace", "time", "x_unit", "unit"};
    const auto add = [&names](std::initializer_list<const char*> more) {
        names.insert(names.end(), more.begin(), more.end());
    };
    for (std::size_t i = 1; i <= request.peaks; ++i) {
        names.push_back("peak" + std::to_string(i) + "_x");
        names.push_back("peak" + std::to_string(i) + "_level");
    }
    if (request.bandwidth)
        add({"bandwidth_x", "bandwidth_level", "bandwidth_low", "bandwidth_high",
             "bandwidth_width"});
    for (std::size_t i = 1; i <= request.channels.size(); ++i)
        for (const char* part : {"_start", "_stop", "_power"})
            names.push_back("channel" + std::to_string(i) + part);
    if (request.occupied)
        add({"occupied_percent", "occupied_low", "occupied_high", "occupied_width"});
    if (request.mask) add({"mask_pass", "mask_margin", "mask_x"});
    if (request.occupancy)
        for (std::size_t i = 1; i <= samples; ++i) names.push_back("occupancy" + std::to_string(i));
    return csvLine(names);
}

std::string analysisCsvRow(const AnalysisResult& result, const AnalysisRequest& request) {
    std::vector<std::string> fields = {csvText(result.file), std::to_string(result.trace),
                                       result.time, result.xUnit, result.unit};
    const auto add = [&fields](std::optional<double> number) {
        fields.push_back(csvNumber(number));
    };
    for (std::size_t i = 0; i < request.peaks; ++i) {
        const bool there = i < result.peaks.size();
        add(there ? std::optional<double>(result.peaks[i].x) : std::nullopt);
        add(there ? std::optional<double>(result.peaks[i].level) : std::nullopt);
    }
    if (request.bandwidth) {
        add(placeOf(result.strongest));
        add(levelOf(result.strongest));
        add(result.width.low);
        add(result.width.high);
        add(result.width.width());
    }
    for (std::size_t i = 0; i < request.channels.size(); ++i) {
        add(request.channels[i].start);
        add(request.channels[i].stop);
        add(i < result.channels.size() ? result.channels[i].power : std::nullopt);
    }
    if (request.occupied) {
        const auto& band = result.occupied;
        add(request.occupied);
        add(band ? std::optional<double>(band->low) : std::nullopt);
        add(band ? std::optional<double>(band->high) : std::nullopt);
        add(band ? std::optional<double>(band->width()) : std::nullopt);
    }
    if (request.mask) {
        const bool known = result.mask && result.mask->margin;
        fields.emplace_back(!result.mask ? "" : result.mask->pass ? "true" : "false");
        add(known ? result.mask->margin : std::nullopt);
        add(known ? std::optional<double>(result.mask->x) : std::nullopt);
    }
    for (const double share : result.occupancy) add(share);
    return csvLine(fields);
}

std::vector<std::string> analysisText(const AnalysisResult& result,
                                      const AnalysisRequest& request) {
    std::vector<std::string> text;
    const auto line = [&text](const std::string& what) { text.push_back(what); };
    const std::string& x = result.xUnit;
    const std::string& unit = result.unit;
    if (result.trace == 0) {
        line("all traces");
    } else {
        line((result.file.empty() ? "" : result.file + ", ") + "trace " +
             std::to_string(result.trace) + (result.time.empty() ? "" : ", " + result.time));
    }
    const bool counted = request.occupancy && !request.hold;
    if (request.peaks > 0 && !counted && result.peaks.empty()) line("  no peak");
    for (std::size_t i = 0; i < result.peaks.size(); ++i)
        line("  peak " + std::to_string(i + 1) + ": " + unknownOr(result.peaks[i].x, x) + ", " +
             unknownOr(result.peaks[i].level, unit, true));
    if (request.bandwidth && !counted)
        line("  bandwidth at -" + generalNumber(*request.bandwidth) +
             " dB: " + unknownOr(result.width.width(), x) + ", from " +
             unknownOr(result.width.low, x) + " to " + unknownOr(result.width.high, x));
    for (const ChannelResult& row : result.channels)
        line("  channel " + generalNumber(row.channel.start) + " to " +
             generalNumber(row.channel.stop) + " " + x + ": " + unknownOr(row.power, unit, true));
    if (request.occupied && !counted) {
        const std::string head =
            "  occupied bandwidth, " + generalNumber(*request.occupied) + " %: ";
        line(!result.occupied ? head + "unknown"
                              : head + unknownOr(result.occupied->width(), x) + ", from " +
                                    unknownOr(result.occupied->low, x) + " to " +
                                    unknownOr(result.occupied->high, x));
    }
    if (result.mask) {
        const std::string verdict = result.mask->pass ? "  mask: pass" : "  mask: FAIL";
        line(!result.mask->margin
                 ? verdict + ", no sample covered"
                 : verdict + ", margin " + unknownOr(result.mask->margin, "dB", true) + " at " +
                       unknownOr(result.mask->x, x));
    }
    if (!result.occupancy.empty()) {
        double highest = 0;
        double sum = 0;
        for (const double share : result.occupancy) {
            highest = std::max(highest, share);
            sum += share;
        }
        constexpr double kPercent = 100;
        const auto count = static_cast<double>(result.occupancy.size());
        line("  occupancy at " + unknownOr(request.occupancy, unit) + ": mean " +
             generalNumber(roundHalfEven(kPercent * sum / count, kLevelDecimals)) + " %, highest " +
             generalNumber(roundHalfEven(kPercent * highest, kLevelDecimals)) + " %");
    }
    return text;
}

}  // namespace zel
