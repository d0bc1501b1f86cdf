#pragma once
// The vertical scale of a view: where its top and its bottom lie.

#include "model/LevelRange.h"

namespace zel {

struct VerticalScale {
    double unit;   ///< UNIT code
    double level;  ///< reference level, in the unit
    LevelRange range;

    /// Lowers the value itself to the reference level, and returns it.
    double ClipToReferenceLevel(double& value) const;
    /// Lifts a value to the bottom of the display, ten divisions below the top; a value that is
    /// no number (the logarithm of a negative sample) lies at the bottom as well.
    double ClipToBottom(double value) const;
};

}  // namespace zel
