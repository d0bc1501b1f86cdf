#pragma once
// The options that say what is worked out of traces.

#include <CLI/CLI.hpp>
#include <string>

#include "analysis/AnalysisText.h"
#include "analysis/MaskWatch.h"
#include "analysis/TraceAnalysis.h"

namespace zel {

struct AnalysisOptions {
    AnalysisRequest request;
    std::string maskFile;  ///< table of the mask; empty for none
    AnalysisFormat format = AnalysisFormat::Text;
    WatchSettings watch;  ///< of live sweeps: what happens when one fails the mask
};

/// Adds --peaks, --threshold, --excursion, --bandwidth, --channel, --occupied, --mask, --hold,
/// --occupancy, --json and --csv.
void addAnalysisOptions(CLI::App& app, AnalysisOptions& options);

/// Reads the same options out of one text, for live sweeps: "--peaks 3 --json"; they have
/// --save-failed, --save-after and --run-failed as well. What is wrong with
/// them, else an empty text.
std::string parseAnalysisText(const std::string& text, AnalysisOptions& options);

/// What is wrong with the options together, else an empty text.
std::string analysisProblem(const AnalysisOptions& options);

}  // namespace zel
