#include "link/InstrumentErrors.h"

#include <string>
#include <string_view>

#include "link/ZELBas.h"
#include "platform/MessageBox.h"
#include "support/Text.h"

namespace zel {
namespace {

struct StatusText {
    std::string_view head;
    bool namesCommand;        // " for command <...>" after the head
    std::string_view detail;  // a line of its own
    bool refersToManual;
};

constexpr StatusText kStatusTexts[] = {
    {},
    {"Syntax error! ", true, "", true},
    {"Execution error ", true, "Command is not allowed in the current measurement mode", true},
    {"Dataset Storage Full ", true, "", true},
    {"Not Allowed ", true,
     "In the current state of the instrument setting this parameter or value is not allowed.",
     true},
    {"Out of Range ", true, "The parameter value is out of range and cannot be programmed.", true},
    {},  // no message
    {"ERROR: ", false,
     "The baud rate is incorrect.\r\n"
     "The baud rates of the remote modem and the instrument have to match.",
     false},
};
constexpr int kStatusCount = static_cast<int>(sizeof kStatusTexts / sizeof kStatusTexts[0]);

}  // namespace

void ReportInstrumentError(const ZELBas& state, MessageBoxes& boxes, int status,
                           const std::string& keyword) {
    if (!state.RemoteAccepted || state.ScanInProgress) return;
    if (status < 1 || status >= kStatusCount) return;
    const StatusText& row = kStatusTexts[status];
    if (row.head.empty()) return;
    std::string text(row.head);
    if (row.namesCommand) text += " for command <" + keyword + ">";
    if (!row.detail.empty()) {
        if (row.namesCommand) text += kCrLf;
        text += row.detail;
    }
    if (row.refersToManual)
        text += std::string(kCrLf) + "Please refer to the ZEL3 Z9 Manual for further instructions.";
    boxes.show({BoxIcon::Information, text, "ZEL3 Error"});
}

}  // namespace zel
