#pragma once
// The script window: which file is open, its list, and the way to the editor.

#include <string>

#include "files/FileOps.h"
#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "forms/ScriptForms.h"
#include "platform/Event.h"
#include "platform/Services.h"
#include "platform/Session.h"

namespace zel {

class ScriptWindow {
  public:
    /// Connects the panel's key, the window's buttons and its list of files.
    ScriptWindow(Forms& forms, FileOps& files, ApplicationFolder& folder, const Session& session);

    /// Shows the window; the panel's saving takes its file name from here until it is closed.
    void cmdSpecial_Click();
    void cmdCancel_Click();
    /// Asks for a script and opens it; nothing changes when the dialog is cancelled.
    void cmdOpenCommandsFile_Click();
    /// Fills the list from a file; it is empty when the file cannot be read.
    void open(const std::string& path);
    void cmboSpecialMeasList_Click();
    /// Fills the list again from the open script, the slow way.
    void reloadCommands();
    /// The editor on the open script; nothing when it cannot be read.
    void cmdEdit_Click();
    /// The editor on an empty text.
    void cmdNew_Click();
    /// A check of the list from the time when a command took two lines.
    void checkCommandPair(int& index, bool& ok);

  private:
    void Form_Load();
    void fill(const std::string& path);
    void showName(const std::string& path);
    void edit();

    Forms& forms_;
    SpecialMeasForm& form_;
    ScriptEditor& editor_;
    ControllerForm& panel_;
    FileOps& files_;
    ApplicationFolder& folder_;
    Session session_;
    Handlers handlers_;
};

}  // namespace zel
