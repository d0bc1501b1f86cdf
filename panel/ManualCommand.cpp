#include "panel/ManualCommand.h"

#include <algorithm>
#include <string>
#include <string_view>

#include "forms/ControllerForm.h"
#include "link/InstrumentLink.h"
#include "link/WireText.h"
#include "link/ZELBas.h"
#include "platform/Controls.h"
#include "platform/Form.h"
#include "platform/MessageBox.h"
#include "platform/Pointer.h"
#include "support/Text.h"
#include "support/Windows1252.h"
#include "trace/Interlock.h"

namespace zel {
namespace {

constexpr const char* kPrompt = "Enter a Command";
constexpr int kModemMs = 100;
constexpr int kPhoneMs = 500;
constexpr Color kAnswerColor = 255;
constexpr Color kOtherAnswerColor = 32896;

constexpr std::string_view kStatusWords[] = {
    "GET",       "SET",    "CMD",     "INIT",       "LOCAL",     "LVLADJUST",
    "MARKNXTPK", "MARKPK", "MARKMIN", "MARKTOCENT", "MARKTOLVL", "PRESET",
    "PWRTOREF",  "RECALL", "REMOTE",  "SAVE",       "WAIT",      "ZERO"};

// Words that stand at the head of a line with any text after them.
constexpr std::string_view kStatusHeads[] = {
    "RECALL",       "LVLADJUST",    "MARKNXTPK",    "MARKPK",      "MARKMIN", "MARKTOCENT",
    "LIMDEL",       "MARKTOLVL",    "PRESET",       "PWRTOREF",    "REMOTE",  "RESTART",
    "SAVE",         "THROFF",       "TRACETOMEM",   "WAIT",        "ZERO",    "CAL_DTF",
    "CAL_TGSCLRFL", "CAL_TGSCLTRN", "CAL_TGVECRFL", "CAL_TGVECTRN"};

struct StatusWord {
    std::string_view answer;
    std::string_view head;
};
constexpr StatusWord kAnswerHeads[] = {
    {"0", "<Ack>: "}, {"1", "<Rejected>: "}, {"2", "<Wrong Modus>: "}};

}  // namespace

bool IsStatusCommand(std::string& line) {
    line = upperCase(line);
    const bool exact =
        std::find(std::begin(kStatusWords), std::end(kStatusWords), line) != std::end(kStatusWords);
    return exact || std::any_of(std::begin(kStatusHeads), std::end(kStatusHeads),
                                [&](std::string_view head) { return line.rfind(head, 0) == 0; });
}

ManualCommand::ManualCommand(ControllerForm& panel, const InstrumentLink& link,
                             const Interlock& interlock)
    : panel_(panel),
      state_(link.state),
      link_(link.bytes),
      reader_(link.reader),
      interlock_(interlock),
      events_(interlock.session().events),
      boxes_(interlock.session().boxes) {
    handlers_.on(panel_.SendButton.Clicked, [this] { SendButton_Click(); });
    handlers_.on(panel_.ManualCommandText.KeyPress,
                 [this](int& key) { ManualCommandText_KeyPress(key); });
    handlers_.on(panel_.ManualCommandText.KeyDown,
                 [this](int key, int) { ManualCommandText_KeyDown(key); });
}

void ManualCommand::ManualCommandText_KeyDown(int key) {
    if (panel_.ManualCommandText.Text.get() == kPrompt) panel_.ManualCommandText.Text = "";
    for (const int editing : {kKeyBackspace, kKeyClear, kKeyLeft, kKeyRight})
        if (key == editing) panel_.ManualFirstKey = 2;
}

void ManualCommand::ManualCommandText_KeyPress(int key) {
    if (panel_.ManualFirstKey == 1) {
        panel_.ManualCommandText.Text = "";
        panel_.ManualFirstKey = 2;
    }
    if (panel_.isConnected) {
        if (key == kKeyEnter) SendButton_Click();
    } else if (!panel_.ErrorFlag) {
        interlock_.refuses(Interlock::Rule::Connected);
        panel_.ErrorFlag = true;
    }
}

void ManualCommand::SendButton_Click() {
    if (interlock_.refuses(panel_.SendButton)) return;
    if (!sendable(panel_.ManualCommandText.Text.get(), boxes_)) return;
    const DialogueScope scope(state_);
    const Hourglass busy(panel_, events_);
    std::string line = panel_.ManualCommandText.Text;
    if (line == "SET" || line == "set") SetLinePending_ = true;
    if (!panel_.isConnected) {  // it may have gone while events ran
        boxes_.show({BoxIcon::Information, "Please Connect to the Instrument first."});
    } else {
        link_.WriteToLink(line + "\r");
        if (panel_.Modem.Checked) events_.sleep(kModemMs);
        if (panel_.GSM.Checked) events_.sleep(kPhoneMs);
        const bool statusOnly = IsStatusCommand(line) || SetLinePending_;
        showAnswer(readAnswer(line, statusOnly), statusOnly);
    }
    if (upperCase(line) != "SET") SetLinePending_ = false;
}

std::string ManualCommand::readAnswer(const std::string& upperLine, bool statusOnly) {
    std::string text;
    if (!link_.isTcp() && !statusOnly) text = reader_.ReadAnswer();
    text += reader_.ReadAnswer();
    if (link_.isTcp() && upperLine != "GET" && upperLine != "SET" && upperLine != "CMD")
        text += state_.InputBuffer;
    return fromWindows1252(text);
}

void ManualCommand::showAnswer(std::string text, bool statusOnly) {
    text = replaceAll(text, "\r", "");
    for (const StatusWord& row : kAnswerHeads) {
        if (row.answer != text) continue;
        text.insert(0, row.head);
        break;
    }
    TextBox& answer = panel_.ManualCommandTextAnsw;
    answer.Text = statusOnly || text.empty() ? text : text.substr(1);
    // Each answer differs from the last in its colour.
    answer.ForeColor = answer.ForeColor == kAnswerColor ? kOtherAnswerColor : kAnswerColor;
}

}  // namespace zel
