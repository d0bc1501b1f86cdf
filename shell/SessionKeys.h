#pragma once
// The menu entry that records the session.

#include <string>

#include "forms/ControllerForm.h"
#include "platform/Event.h"
#include "platform/MessageBox.h"
#include "platform/Services.h"
#include "support/SessionLog.h"

namespace zel {

/// A click begins the record in a file of the user's choice, the next one ends it.
class SessionKeys {
  public:
    SessionKeys(ControllerForm& panel, SessionLog& log, FileDialogs& dialogs, MessageBoxes& boxes);

    /// Begins the record in that file, as the option of the command line does. False, with the
    /// reason in a box, when the file cannot be written.
    bool begin(const std::string& path, const std::string& arguments);

  private:
    void UtilityRecord_Click();

    ControllerForm& panel_;
    SessionLog& log_;
    FileDialogs& dialogs_;
    MessageBoxes& boxes_;
    Handlers handlers_;
};

}  // namespace zel
