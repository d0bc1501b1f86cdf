#include "trace/FrequencyLabels.h"

#include <string>

#include "model/Numeric.h"
#include "platform/Controls.h"
#include "platform/Pointer.h"
#include "support/NumberText.h"

namespace zel {

std::string centerLabelText(double hertz) { return "Center: " + FormatValue(hertz, "Hz"); }

std::string centerLabelText(const std::string& answer) {
    return centerLabelText(GetNumeric(answer));
}

std::string spanLabelText(double hertz) { return "Span: " + FormatValue(hertz, "Hz"); }

std::string spanLabelText(const std::string& answer) { return spanLabelText(GetNumeric(answer)); }

void FrequencyLabels::GetFreqForLabel(bool& ok) {
    query("FREQ", mirror_.CenterFrequency, panel_.CFLabel, centerLabelText, ok);
}

void FrequencyLabels::GetSpanForLabel(bool& ok) {
    query("SPAN", mirror_.Span, panel_.SpanLabel, spanLabelText, ok);
}

void FrequencyLabels::query(const char* word, double& field, Label& label,
                            std::string (*text)(const std::string&), bool& ok) {
    const Hourglass busy(dialog_, events_);
    std::string answer;
    ok = exchange_.GetInstrument(word, answer);
    if (ok && mirror_.Unsure.answered(word, answer)) {
        label.Caption = text(answer);
        field = leadingNumber(answer);
    }
}

}  // namespace zel
