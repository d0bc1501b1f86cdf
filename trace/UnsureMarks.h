#pragma once
// Strikes the readouts that rest on what is unsure: centre and span after a setting that was not
// taken, the markers when the axis has become one of another kind since they were read.

#include <string>

#include "forms/ControllerForm.h"
#include "model/UnsureSettings.h"
#include "model/ZEL3Variables.h"
#include "platform/Controls.h"

namespace zel {

class UnsureMarks {
  public:
    UnsureMarks(ControllerForm& panel, ZEL3Variables& mirror);

  private:
    /// The text of a marker and the unit of the axis that it was read on.
    struct Reading {
        std::string text;
        std::string unit;
    };

    void strikeSettings();
    void strikeMarkers();
    void strikeMarker(Label& label, Reading& reading);

    ControllerForm& panel_;
    ZEL3Variables& mirror_;
    Reading marker_;
    Reading delta_;
    Handlers changes_;
};

}  // namespace zel
