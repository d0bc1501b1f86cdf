#include "shell/SessionKeys.h"

#include <string>

#include "forms/ControllerForm.h"
#include "platform/MessageBox.h"
#include "platform/Services.h"
#include "support/SessionLog.h"
#include "support/SessionText.h"
#include "support/Text.h"

namespace zel {
namespace {

/// As the arguments of a program that was started with these words.
std::string startLine(const std::string& words) {
    if (words.empty()) return "zelremote";
    return joinArguments({"zelremote", "--words", words});
}

}  // namespace

SessionKeys::SessionKeys(ControllerForm& panel, SessionLog& log, FileDialogs& dialogs,
                         MessageBoxes& boxes)
    : panel_(panel), log_(log), dialogs_(dialogs), boxes_(boxes) {
    handlers_.on(panel_.UtilityRecord.Clicked, [this] { UtilityRecord_Click(); });
    handlers_.on(log_.Failed, [this](const std::string& why) {
        panel_.UtilityRecord.Checked = false;
        boxes_.show({BoxIcon::Exclamation,
                     why + kCrLf + "The record of the session ends here; the session goes on."});
    });
}

bool SessionKeys::begin(const std::string& path, const std::string& arguments) {
    const std::string why = log_.begin(path, arguments);
    if (!why.empty()) boxes_.show({BoxIcon::Exclamation, why});
    panel_.UtilityRecord.Checked = why.empty();
    return why.empty();
}

void SessionKeys::UtilityRecord_Click() {
    if (log_.writing()) {
        log_.end();
        panel_.UtilityRecord.Checked = false;
        return;
    }
    const auto path = dialogs_.save({.title = "Record Session",
                                     .filter = "Session logs (*.log)|*.log|All files (*.*)|*.*",
                                     .folder = {},
                                     .fileName = "session.log",
                                     .promptOverwrite = true});
    if (!path) return;
    const std::string start =
        log_.arguments.empty() ? startLine(panel_.CommandLine) : log_.arguments;
    const bool whole = log_.whole();
    if (!begin(*path, start) || whole || !panel_.isConnected) return;
    boxes_.show({BoxIcon::Information,
                 "The session is too long to be written from its start, so the record begins here. "
                 "It can be read, but not run again: for that, record from before the connection "
                 "on."});
}

}  // namespace zel
