#include "trace/ViewAnnotations.h"

#include "model/CodeTables.h"
#include "model/Numeric.h"
#include "trace/GraphScaling.h"

namespace zel {
namespace {

std::string choiceText(CodeTable table, double code) {
    const CodeRow* row = findCode(table, code);
    if (row == nullptr) return "";
    if (!row->choice.empty()) return std::string(row->choice);
    // A code that no list offers still has the caption that queries write.
    std::string caption(row->caption);
    const auto bracket = caption.rfind(" (");
    return bracket == std::string::npos ? caption : caption.substr(0, bracket);
}

std::string verticalUnit(const ZEL3Variables& mirror) {
    if (mirror.ReferenceRange > RANGE1DB) return "%";
    // On a logarithmic range volts and watts are drawn in dBm.
    if (mirror.ReferenceUnit > UNITDB) return "dBm";
    return levelUnitText(mirror.ReferenceUnit);
}

}  // namespace

ViewAnnotations annotateView(const ControllerForm& panel, const ZEL3Variables& mirror) {
    ViewAnnotations view;
    const Graph& graph = panel.CWGraph1;
    view.ok = !graph.values().empty();
    view.xUnit = GetDimension(panel, mirror);
    view.unit = verticalUnit(mirror);
    if (!view.ok) return view;
    view.refLevel = "Ref " + FormatValue(mirror.ReferenceLevel, levelUnitText(mirror.ReferenceUnit),
                                         "", mirror.ReferenceUnit > UNITDB);
    view.range = choiceText(CodeTable::Range, mirror.ReferenceRange);
    view.rbw = "RBW " + choiceText(CodeTable::ResolutionBandwidth, mirror.ResolutionBandwidth);
    view.vbw = "VBW " + choiceText(CodeTable::VideoBandwidth, mirror.VideoBandwidth);
    view.sweepTime = "SWT " + FormatValue(mirror.SweepTime, "s");
    view.detector = "Det " + choiceText(CodeTable::Detector, mirror.TraceDetector);
    const CodeRow* mode = findCode(CodeTable::MeasurementMode, panel.InstrumentMode);
    if (mode != nullptr) view.mode = std::string(mode->text);
    const double left = graph.xAxis().Minimum;
    const double right = graph.xAxis().Maximum;
    view.left = "Start " + FormatValue(left, view.xUnit);
    view.center = "Center " + FormatValue((left + right) / 2, view.xUnit);
    view.right = "Stop " + FormatValue(right, view.xUnit);
    return view;
}

}  // namespace zel
