#pragma once
// The graph as lines of text, and a sweep as rows of numbers.

#include <string>
#include <vector>

#include "forms/ControllerForm.h"
#include "platform/Graph.h"
#include "trace/Sweep.h"

namespace zel {

/// Axis ranges, track mode, number of points, first and last point, cursors, annotation.
std::vector<std::string> graphLines(const Graph& graph);

/// "x,value", with the auto peak detector "x,value1,value2".
std::string sweepHeader(bool autoPeak);

/// A row for each of the 301 points of the sweep that came whole: x is the place of the row's first
/// value on the graph, the values are physical ones, both in the shortest form that reads back
/// exactly.
std::vector<std::string> sweepRows(const Sweep& sweep);
/// The same of a loaded file, from the loaded arrays.
std::vector<std::string> loadedRows(const ControllerForm& panel, bool autoPeak);

}  // namespace zel
