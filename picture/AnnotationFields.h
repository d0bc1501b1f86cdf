#pragma once
// The names that the texts and flags of a graph's annotations have in the picture's data.

namespace zel {

/// Calls `visit(name, text)` for each text; `View` is `ViewAnnotations`, constant or not.
template <class View, class Visit>
void forEachAnnotationText(View& view, Visit visit) {
    visit("ref_level", view.refLevel);
    visit("range", view.range);
    visit("rbw", view.rbw);
    visit("vbw", view.vbw);
    visit("sweep_time", view.sweepTime);
    visit("detector", view.detector);
    visit("mode", view.mode);
    visit("unit", view.unit);
    visit("x_unit", view.xUnit);
    visit("left", view.left);
    visit("center", view.center);
    visit("right", view.right);
}

/// Calls `visit(name, flag)` for each flag.
template <class View, class Visit>
void forEachAnnotationFlag(View& view, Visit visit) {
    visit("ok", view.ok);
    visit("ref_level_unsure", view.refLevelUnsure);
    visit("range_unsure", view.rangeUnsure);
    visit("detector_unsure", view.detectorUnsure);
    visit("rbw_unsure", view.rbwUnsure);
    visit("vbw_unsure", view.vbwUnsure);
    visit("sweep_time_unsure", view.sweepTimeUnsure);
    visit("x_unsure", view.xUnsure);
    visit("y_unsure", view.yUnsure);
}

}  // namespace zel
