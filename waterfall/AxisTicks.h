#pragma once
// Round numbers along an axis, and their texts in engineering units.

#include <string>
#include <vector>

#include "platform/Graph3D.h"

namespace zel {

/// At most `most` + 1 ticks at steps of 1, 2 or 5 between the two ends; none for a range of no
/// height or that is no number.
std::vector<double> axisTicks(double first, double last, int most);
/// The distance of two of them; 0 without any.
double tickStep(double first, double last, int most);

/// A number as an axis writes it. The format k"Hz" scales by engineering prefix and appends the
/// unit; levels in dB and percent are not scaled. `step` says how exact the number must be.
std::string axisNumber(double value, const std::string& format, double step);
/// The unit in a format: "Hz", "dBm", "%".
std::string axisUnit(const std::string& format);
/// The format of a single level: that of axis 3, but dBm where its numbers are hidden because they
/// are dBm and not the unit (volts and watts on a logarithmic range).
std::string levelFormat(const Graph3D& graph);

}  // namespace zel
