#pragma once
// Strikes the readouts of centre and span, and has the graph drawn again, when a setting that they
// rest on becomes unsure or known.

#include "forms/ControllerForm.h"
#include "model/ZEL3Variables.h"

namespace zel {

class UnsureMarks {
  public:
    UnsureMarks(ControllerForm& panel, ZEL3Variables& mirror) {
        changes_.on(mirror.Unsure.Changed, [&panel, &mirror] {
            strike(panel.CFLabel, mirror.Unsure.has(AxisSetting::Frequency));
            strike(panel.SpanLabel, mirror.Unsure.has(AxisSetting::Span));
            panel.CWGraph1.Refresh();
        });
    }

  private:
    static void strike(Label& label, bool unsure) {
        label.Struck = unsure;
        label.ToolTip =
            unsure ? "The instrument did not take this value. The next sweep asks it." : "";
    }

    Handlers changes_;
};

}  // namespace zel
