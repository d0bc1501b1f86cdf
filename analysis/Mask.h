#pragma once
// Limits over an axis: an upper and a lower line, and how far a trace stays inside.

#include <optional>
#include <string>
#include <vector>

#include "analysis/SpectrumTrace.h"

namespace zel {

/// One line of a mask: levels at rising x, linear between, none outside. Two points at the same x
/// make a step; at that x the stricter one holds.
struct LimitLine {
    std::vector<double> x;
    std::vector<double> level;
};

struct Mask {
    LimitLine upper;
    LimitLine lower;
};

struct MaskVerdict {
    bool pass = true;
    /// The smallest distance to a limit, dB; negative when passed. Nothing where the mask covers no
    /// sample.
    std::optional<double> margin;
    double x = 0;  ///< of the margin; 0 without one
};

/// Reads a table "x;upper;lower" with that header; a level may be empty and is then left out of
/// its limit. Throws std::runtime_error with the line's number and what is wrong with it.
Mask readMask(const std::string& text);

/// Every sample that a limit covers is held against it; a level on the limit passes.
MaskVerdict checkMask(const SpectrumTrace& trace, const Mask& mask);

}  // namespace zel
