#pragma once
// Writes the findings on traces: as lines for a person, as JSON objects, as a table.

#include <cstddef>
#include <string>
#include <vector>

#include "analysis/TraceAnalysis.h"

namespace zel {

enum class AnalysisFormat { Text, Json, Csv };

/// One JSON object on one line, without its line end: `file`, `trace`, `time`, `x_unit`, `unit`,
/// then what was asked for. A missing figure is null.
std::string analysisJson(const AnalysisResult& result, const AnalysisRequest& request);

/// The header row of the table; one column a figure, `samples` columns for the occupancy.
std::string analysisCsvHeader(const AnalysisRequest& request, std::size_t samples);
/// A row of the same length; a missing figure is an empty field.
std::string analysisCsvRow(const AnalysisResult& result, const AnalysisRequest& request);

/// Lines for a person.
std::vector<std::string> analysisText(const AnalysisResult& result, const AnalysisRequest& request);

}  // namespace zel
