#pragma once
// The texts that stand around the graph, as an analyser writes them.

#include <string>

#include "forms/ControllerForm.h"
#include "model/ZEL3Variables.h"
#include "trace/Sweep.h"

namespace zel {

struct ViewAnnotations {
    bool ok = false;       ///< there is a trace that the texts speak of
    std::string refLevel;  ///< "Ref -20 dBm"
    std::string range;     ///< "10dB/DIV"
    std::string rbw;       ///< "RBW 100 kHz", "RBW Auto"
    std::string vbw;
    std::string sweepTime;  ///< "SWT 20 ms"
    std::string detector;   ///< "Det Auto Peak"
    std::string mode;       ///< "Analyzer"
    std::string unit;       ///< of the y axis: "dBm", "%"
    std::string xUnit;      ///< "Hz", "s", "m"
    std::string left;       ///< x at the left edge: "Start 0 Hz"
    std::string center;
    std::string right;
    // The instrument may have another value than the one that is shown.
    bool refLevelUnsure = false;
    bool rangeUnsure = false;
    bool detectorUnsure = false;
    bool rbwUnsure = false;
    bool vbwUnsure = false;
    bool sweepTimeUnsure = false;
    bool xUnsure = false;  ///< the labels of the x axis and left, center, right
    bool yUnsure = false;  ///< the labels of the y axis
};

/// The range code of the view on the graph, also where a file gave dB a division.
double shownRangeCode(const ControllerForm& panel, const ZEL3Variables& mirror);
/// The trace on the graph is one of a mode that the instrument has left.
bool ofAnotherMode(const ControllerForm& panel);
/// The level that is known belongs to a mode which neither the sweep nor the instrument is in: each
/// mode has a level and a unit of its own, and not every sweep asks for them.
bool levelOfAnotherMode(const ControllerForm& panel, const Sweep& sweep);
/// From the mirror and from the axes as they are shown, zoomed or not.
ViewAnnotations annotateView(const ControllerForm& panel, const ZEL3Variables& mirror);
/// The same for the sweep that is on the graph: what was set since does not change what it was read
/// with, and the texts that differ from the mirror are unsure.
ViewAnnotations annotateSweep(const ControllerForm& panel, const ZEL3Variables& mirror,
                              const Sweep& sweep);

}  // namespace zel
