#pragma once
// The sweep that the graph shows and the routines that bring one there, in one bundle.

#include "trace/GraphScaling.h"
#include "trace/Sweep.h"
#include "trace/TraceConversion.h"

namespace zel {

/// A copy stands for the same sweep and routines.
struct TraceOnGraph {
    Sweep& sweep;
    TraceConversion& conversion;
    GraphScaling& scaling;
};

}  // namespace zel
