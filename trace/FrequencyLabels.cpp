#include "trace/FrequencyLabels.h"

#include "model/Numeric.h"
#include "support/NumberText.h"

namespace zel {

std::string centerLabelText(const std::string& answer) {
    return "Center: " + FormatValue(answer, "Hz");
}

std::string spanLabelText(const std::string& answer) {
    return "Span: " + FormatValue(answer, "Hz");
}

void FrequencyLabels::GetFreqForLabel(bool& ok) {
    query("FREQ", mirror_.CenterFrequency, panel_.CFLabel, centerLabelText, ok);
}

void FrequencyLabels::GetSpanForLabel(bool& ok) {
    query("SPAN", mirror_.Span, panel_.SpanLabel, spanLabelText, ok);
}

void FrequencyLabels::query(const char* word, double& field, Label& label,
                            std::string (*text)(const std::string&), bool& ok) {
    dialog_.MousePointer = 11;
    events_.pump();
    std::string answer;
    ok = exchange_.GetInstrument(word, answer);
    if (ok) {
        label.Caption = text(answer);
        field = leadingNumber(answer);
    }
    dialog_.MousePointer = 0;
    events_.pump();
}

}  // namespace zel
