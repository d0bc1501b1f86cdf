#include "console/AnalysisOptions.h"

#include <cstdint>
#include <map>
#include <optional>
#include <string>
#include <vector>

#include "analysis/AnalysisText.h"
#include "analysis/Hold.h"
#include "analysis/MaskWatch.h"
#include "analysis/TraceAnalysis.h"
#include "support/NumberOption.h"
#include "support/NumberText.h"

namespace zel {
namespace {

constexpr int kMostPeaks = 1000;
constexpr int kMostAfter = 100'000;
constexpr double kLargestDecibels = 1000;
constexpr double kSmallestWidth = 1e-6;

const std::map<std::string, HoldKind> kHolds = {{"max", HoldKind::Max},
                                                {"min", HoldKind::Min},
                                                {"average", HoldKind::Average},
                                                {"power", HoldKind::PowerAverage}};

std::optional<Channel> channelOf(const std::string& text) {
    const auto comma = text.find(',');
    if (comma == std::string::npos) return std::nullopt;
    const std::optional<double> start = parseNumber(text.substr(0, comma));
    const std::optional<double> stop = parseNumber(text.substr(comma + 1));
    if (!start || !stop || *stop < *start) return std::nullopt;
    return Channel{*start, *stop};
}

std::string channelProblem(const std::string& text) {
    if (channelOf(text)) return {};
    return "takes START,STOP with STOP not below START, not " + text;
}

std::string holdProblem(const std::string& text) {
    return kHolds.count(text) != 0 ? std::string()
                                   : "takes max, min, average or power, not " + text;
}

std::string commandProblem(const std::string& text) {
    const auto words = commandWords(text);
    if (!words) return "has a quote without an end: " + text;
    return words->empty() ? "takes a program and its arguments" : std::string();
}

/// A number option into an optional number.
void optionalNumber(CLI::App& app, const std::string& name, std::optional<double>& target,
                    double lowest, double highest, const std::string& what) {
    const auto problem = [lowest, highest](const std::string& text) {
        const std::optional<double> value = parseNumber(text);
        if (value && *value >= lowest && *value <= highest) return std::string();
        return "takes a number from " + generalNumber(lowest) + " to " + generalNumber(highest) +
               ", not " + text;
    };
    app.add_option_function<std::string>(
           name, [&target](const std::string& text) { target = parseNumber(text); }, what)
        ->check(problem, "");
}

}  // namespace

void addAnalysisOptions(CLI::App& app, AnalysisOptions& options) {
    AnalysisRequest& request = options.request;
    app.add_option("--peaks", request.peaks, "The N strongest peaks")
        ->type_name("N")
        ->check(CLI::Range(1, kMostPeaks));
    numberOption(app, "--threshold", request.search.threshold, -kLargestDecibels, kLargestDecibels,
                 "Level that a peak reaches at least")
        ->type_name("DB");
    numberOption(app, "--excursion", request.search.excursion, 0, kLargestDecibels,
                 "How far the trace falls beside a peak; 6 by default")
        ->type_name("DB");
    optionalNumber(app, "--bandwidth", request.bandwidth, kSmallestWidth, kLargestDecibels,
                   "Width of the strongest peak, DB down");
    app.add_option_function<std::vector<std::string>>(
           "--channel",
           [&request](const std::vector<std::string>& texts) {
               for (const std::string& text : texts) request.channels.push_back(*channelOf(text));
           },
           "Power from START to STOP; can be given several times")
        ->type_name("START,STOP")
        ->expected(1)
        ->multi_option_policy(CLI::MultiOptionPolicy::TakeAll)
        ->check(channelProblem, "");
    optionalNumber(app, "--occupied", request.occupied, 0, 100,
                   "Bandwidth that holds this share of the power, percent");
    app.add_option("--mask", options.maskFile,
                   "Table x;upper;lower of limits; status 3 when passed")
        ->type_name("FILE");
    app.add_option_function<std::string>(
           "--hold", [&request](const std::string& text) { request.hold = kHolds.at(text); },
           "One result for all traces: max, min, average (of levels) or power (average)")
        ->check(holdProblem, "");
    optionalNumber(app, "--occupancy", request.occupancy, -kLargestDecibels, kLargestDecibels,
                   "Share of the traces at or over this level, for each sample");
    CLI::Option* json = app.add_flag_function(
        "--json", [&options](std::int64_t) { options.format = AnalysisFormat::Json; },
        "One JSON object a line");
    app.add_flag_function(
           "--csv", [&options](std::int64_t) { options.format = AnalysisFormat::Csv; },
           "A table with a header row")
        ->excludes(json);
}

namespace {

void addWatchOptions(CLI::App& app, AnalysisOptions& options) {
    app.add_option("--save-failed", options.watch.file,
                   "Sweeps that fail the mask are added to this file")
        ->type_name("FILE");
    app.add_option("--save-after", options.watch.after,
                   "So many sweeps after a failing one are added as well")
        ->type_name("N")
        ->check(CLI::Range(0, kMostAfter));
    app.add_option_function<std::string>(
           "--run-failed",
           [&options](const std::string& text) { options.watch.command = *commandWords(text); },
           "A sweep that fails the mask starts this program; {x}, {margin}, {time}, {file} are "
           "filled in")
        ->type_name("COMMAND")
        ->check(commandProblem, "");
}

}  // namespace

std::string parseAnalysisText(const std::string& text, AnalysisOptions& options) {
    CLI::App app("Analysis of live sweeps", "--analyse");
    app.set_help_flag();
    addAnalysisOptions(app, options);
    addWatchOptions(app, options);
    try {
        app.parse(text, false);
    } catch (const CLI::ParseError& problem) {
        return problem.what();
    }
    return analysisProblem(options);
}

std::string analysisProblem(const AnalysisOptions& options) {
    const AnalysisRequest& request = options.request;
    const bool single = request.peaks > 0 || request.bandwidth || !request.channels.empty() ||
                        request.occupied || !options.maskFile.empty();
    if (request.occupancy && single && !request.hold)
        return "--occupancy goes with the other figures only where --hold makes one trace of all";
    const WatchSettings& watch = options.watch;
    if (watch.any() && options.maskFile.empty())
        return "--save-failed and --run-failed need --mask";
    if (watch.any() && request.hold)
        return "--save-failed and --run-failed do not go with --hold, which judges all sweeps at "
               "the end";
    if (watch.after > 0 && watch.file.empty()) return "--save-after needs --save-failed";
    return {};
}

}  // namespace zel
