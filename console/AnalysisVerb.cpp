#include "console/AnalysisVerb.h"

#include <cstdint>
#include <optional>
#include <stdexcept>
#include <string>
#include <vector>

#include "analysis/AnalysisText.h"
#include "analysis/Mask.h"
#include "analysis/SavedTraces.h"
#include "analysis/SpectrumTrace.h"
#include "console/AnalysisOptions.h"
#include "console/LineOutput.h"
#include "platform/Clock.h"
#include "platform/Files.h"
#include "support/ExitStatus.h"
#include "support/FileText.h"

namespace zel {
namespace {

constexpr std::uint64_t kLargestFile = 2'000'000'000;
constexpr std::uint64_t kLargestMask = 10'000'000;
/// 3 February 2001, whose text shows the order of day, month and year.
constexpr double kSampleDay = 36925;

}  // namespace

AnalysisPrinter::AnalysisPrinter(const AnalysisOptions& options, LineOutput& output,
                                 LineOutput& errors)
    : options_(options), output_(output), errors_(errors) {}

std::string AnalysisPrinter::readMaskFile(FileService& files) {
    if (options_.maskFile.empty()) return {};
    FileProblem problem;
    const auto text = readFile(files, options_.maskFile, kLargestMask, problem);
    if (!text) return readProblem(options_.maskFile, problem);
    try {
        options_.request.mask = readMask(*text);
    } catch (const std::runtime_error& wrong) {
        return options_.maskFile + ", " + wrong.what();
    }
    return {};
}

std::optional<MaskVerdict> AnalysisPrinter::add(const SpectrumTrace& trace, const std::string& file,
                                                std::uint64_t number) {
    if (!run_) run_.emplace(options_.request);
    const auto result = run_->add(trace, file, number);
    if (!result) return std::nullopt;
    print(*result);
    return result->mask;
}

int AnalysisPrinter::finish() {
    if (!run_) return kDone;
    if (const auto result = run_->finish()) print(*result);
    if (run_->maskCoveredNothing()) errors_.line("zelctl: the mask covers no sample of the trace");
    return run_->maskFailed() ? kMaskFailed : kDone;
}

void AnalysisPrinter::print(const AnalysisResult& result) {
    const AnalysisRequest& request = options_.request;
    switch (options_.format) {
        case AnalysisFormat::Json:
            return output_.line(analysisJson(result, request));
        case AnalysisFormat::Csv:
            if (!headerPrinted_) output_.line(analysisCsvHeader(request, result.occupancy.size()));
            headerPrinted_ = true;
            return output_.line(analysisCsvRow(result, request));
        case AnalysisFormat::Text:
            return output_.lines(analysisText(result, request));
    }
}

int analyseFiles(const std::vector<std::string>& paths, const AnalysisOptions& options,
                 FileService& files, const Clock& clock, LineOutput& output, LineOutput& errors) {
    AnalysisPrinter printer(options, output, errors);
    if (const std::string problem = printer.readMaskFile(files); !problem.empty()) {
        errors.line("zelctl: " + problem);
        return kWrongUse;
    }
    const DateOrder order = dateOrderOf(clock.dateText(kSampleDay));
    int status = kDone;
    for (const std::string& path : paths) {
        FileProblem problem;
        const auto text = readFile(files, path, kLargestFile, problem);
        if (!text) {
            errors.line("zelctl: " + readProblem(path, problem));
            status = kLinkFailed;
            continue;
        }
        std::uint64_t number = 0;
        try {
            readTraces(*text, order, [&](const SpectrumTrace& trace) {
                printer.add(trace, path, ++number);
                return output.problem().empty();
            });
        } catch (const std::runtime_error& wrong) {
            errors.line("zelctl: " + path + ": " + wrong.what());
            status = kLinkFailed;
        }
    }
    const int verdict = printer.finish();
    return status != kDone ? status : verdict;
}

}  // namespace zel
