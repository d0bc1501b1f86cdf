#pragma once
// The graph as lines of text, and a sweep as rows of numbers.

#include <string>
#include <vector>

#include "forms/ControllerForm.h"
#include "platform/Graph.h"

namespace zel {

/// Axis ranges, track mode, number of points, first and last point, cursors, annotation.
std::vector<std::string> graphLines(const Graph& graph);

/// "x,value", with the auto peak detector "x,value1,value2".
std::string sweepHeader(bool autoPeak);

/// A row for each of the 301 points of the sweep: x is the place of the row's first value on the
/// graph, the values are `RawTraceData`, both in the shortest form that reads back exactly. Fewer
/// rows where there are fewer values.
std::vector<std::string> sweepRows(const ControllerForm& panel, bool autoPeak);
/// The same of a loaded file, from the loaded arrays.
std::vector<std::string> loadedRows(const ControllerForm& panel, bool autoPeak);

}  // namespace zel
