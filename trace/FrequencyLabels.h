#pragma once
// The readouts of centre and span under the graph, from the instrument or from a number.

#include <string>

#include "forms/ControllerForm.h"
#include "forms/MainForm.h"
#include "link/CommandExchange.h"
#include "model/ZEL3Variables.h"
#include "platform/Controls.h"
#include "platform/Events.h"

namespace zel {

/// "Center: 1.5 GHz".
std::string centerLabelText(double hertz);
/// The same from an answer in hertz.
std::string centerLabelText(const std::string& answer);
/// "Span: 3 GHz".
std::string spanLabelText(double hertz);
std::string spanLabelText(const std::string& answer);

class FrequencyLabels {
  public:
    FrequencyLabels(ControllerForm& panel, MainForm& dialog, ZEL3Variables& mirror,
                    CommandExchange& exchange, Events& events)
        : panel_(panel), dialog_(dialog), mirror_(mirror), exchange_(exchange), events_(events) {}

    /// Asks FREQ into the mirror and the label; `ok` says whether the instrument answered.
    void GetFreqForLabel(bool& ok);
    /// Asks SPAN into the mirror and the label.
    void GetSpanForLabel(bool& ok);

  private:
    void query(const char* word, double& field, Label& label,
               std::string (*text)(const std::string&), bool& ok);

    ControllerForm& panel_;
    MainForm& dialog_;
    ZEL3Variables& mirror_;
    CommandExchange& exchange_;
    Events& events_;
};

}  // namespace zel
