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
            panel.CFLabel.Struck = mirror.Unsure.has(AxisSetting::Frequency);
            panel.SpanLabel.Struck = mirror.Unsure.has(AxisSetting::Span);
            panel.CWGraph1.Refresh();
        });
    }

  private:
    Handlers changes_;
};

}  // namespace zel
