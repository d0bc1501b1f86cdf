#include "trace/UnsureMarks.h"

#include <string>

#include "forms/ControllerForm.h"
#include "model/UnsureSettings.h"
#include "model/ZEL3Variables.h"
#include "platform/Controls.h"
#include "trace/GraphScaling.h"

namespace zel {
namespace {

void strike(Label& label, bool unsure, const char* why) {
    label.Struck = unsure;
    label.ToolTip = unsure ? why : "";
}

}  // namespace

UnsureMarks::UnsureMarks(ControllerForm& panel, ZEL3Variables& mirror)
    : panel_(panel), mirror_(mirror) {
    changes_.on(mirror.Unsure.Changed, [this] { strikeSettings(); });
    changes_.on(panel.CWGraph1.Changed, [this] { strikeMarkers(); });
    changes_.on(panel.MarkerLabel.Changed, [this] { strikeMarker(panel_.MarkerLabel, marker_); });
    changes_.on(panel.DeltaLabel.Changed, [this] { strikeMarker(panel_.DeltaLabel, delta_); });
}

void UnsureMarks::strikeSettings() {
    constexpr const char* kWhy = "The instrument did not take this value. The next sweep asks it.";
    strike(panel_.CFLabel, mirror_.Unsure.has(AxisSetting::Frequency), kWhy);
    strike(panel_.SpanLabel, mirror_.Unsure.has(AxisSetting::Span), kWhy);
    panel_.CWGraph1.Refresh();
}

void UnsureMarks::strikeMarkers() {
    strikeMarker(panel_.MarkerLabel, marker_);
    strikeMarker(panel_.DeltaLabel, delta_);
}

void UnsureMarks::strikeMarker(Label& label, Reading& reading) {
    const std::string& text = label.Caption.get();
    const std::string unit = GetDimension(panel_, mirror_);
    // What the pointer shows meanwhile is of now, and the marker's own text comes back after it.
    const bool pointer = text.starts_with("Cursor:");
    if (!pointer && text != reading.text) reading = {text, unit};
    strike(label, !pointer && !text.empty() && reading.unit != unit,
           "Read before the axis changed. The marker's keys read it again.");
}

}  // namespace zel
