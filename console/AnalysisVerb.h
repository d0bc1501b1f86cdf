#pragma once
// The verb analyse, and the analysis of live sweeps.

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "analysis/Mask.h"
#include "analysis/SpectrumTrace.h"
#include "analysis/TraceAnalysis.h"
#include "console/AnalysisOptions.h"
#include "console/LineOutput.h"
#include "platform/Clock.h"
#include "platform/Files.h"

namespace zel {

/// A mask failed.
inline constexpr int kMaskFailed = 3;

/// Works out what is asked about traces as they come, and writes each result at once.
class AnalysisPrinter {
  public:
    AnalysisPrinter(const AnalysisOptions& options, LineOutput& output, LineOutput& errors);

    /// Reads the table of the mask, if one is asked for. What is wrong with it, else an empty text.
    std::string readMaskFile(FileService& files);
    /// Throws std::runtime_error, with a text for the user, for a trace that does not fit the
    /// others where one result is made of all. The verdict on the trace, where a mask is asked for.
    std::optional<MaskVerdict> add(const SpectrumTrace& trace, const std::string& file,
                                   std::uint64_t number);
    const AnalysisOptions& options() const { return options_; }
    /// Writes what stands out; the exit status: `kDone` or `kMaskFailed`.
    int finish();

  private:
    void print(const AnalysisResult& result);

    AnalysisOptions options_;
    LineOutput& output_;
    LineOutput& errors_;
    std::optional<AnalysisRun> run_;
    bool headerPrinted_ = false;
};

/// `analyse FILE...`: the traces of saved views and recordings, one result a trace. The exit
/// status: `kDone`, `kLinkFailed` with the reason on `errors`, `kWrongUse` for a mask that cannot
/// be read, or `kMaskFailed`.
int analyseFiles(const std::vector<std::string>& paths, const AnalysisOptions& options,
                 FileService& files, const Clock& clock, LineOutput& output, LineOutput& errors);

}  // namespace zel
