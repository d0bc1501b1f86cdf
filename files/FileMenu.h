#pragma once
// The entries of the menus that concern files and have no room of their own: image, log file.

#include "files/FileOps.h"
#include "forms/ControllerForm.h"
#include "platform/Event.h"
#include "platform/MessageBox.h"
#include "platform/Services.h"

namespace zel {

class FileMenu {
  public:
    /// Connects the entries.
    FileMenu(ControllerForm& panel, FileOps& files, ApplicationFolder& folder, MessageBoxes& boxes);

    void MenuFileSaveImage_Click();
    /// Deletes the debug log from the application's folder; nothing when there is none.
    void DelLogFile_Click();

  private:
    ControllerForm& panel_;
    FileOps& files_;
    ApplicationFolder& folder_;
    MessageBoxes& boxes_;
    Handlers handlers_;
};

}  // namespace zel
