#pragma once
// The window that a fatal failure opens: what happened, to be copied, saved and sent.

#include <functional>
#include <string>
#include <vector>

#include "forms/SupportForms.h"
#include "platform/Event.h"
#include "platform/Events.h"
#include "platform/Files.h"
#include "platform/MessageBox.h"
#include "platform/Services.h"
#include "support/RootDebug.h"

namespace zel {

class ErrorReport {
  public:
    struct Services {
        Clipboard& clipboard;
        FileDialogs& dialogs;
        FileService& files;
        MessageBoxes& boxes;
        Events& events;
    };
    ErrorReport(ErrorForm& form, const Services& services);
    ErrorReport(const ErrorReport&) = delete;
    ErrorReport& operator=(const ErrorReport&) = delete;

    /// Fills the window and shows it modally; comes back when it is closed. A failure while it is
    /// open is not displayed.
    void DisplayError(const RuntimeFailure& failure, const std::vector<std::string>& callers);
    /// The same window for the trace that an earlier run left when a signal ended it.
    void displayCrash(const std::string& trace);

    /// Gets the report in place of the window, where a front has none.
    std::function<void(const std::string& report)> print;
    /// The last lines of the session's log.
    std::function<std::vector<std::string>()> sessionLines;

  private:
    void CopyToClipboard_Click();
    void ButtonOK_Click();
    void chkAttachLog_Click();
    void cmdSaveReport_Click();
    void fillLabels(const std::string& first);
    void show();

    ErrorForm& form_;
    Services services_;
    std::string own_;  ///< the report without the session
    Handlers handlers_;
};

}  // namespace zel
