#pragma once
// The editor's buttons: what is written, where, and when the window closes.

#include "files/FileOps.h"
#include "forms/ScriptForms.h"
#include "platform/Event.h"
#include "platform/MessageBox.h"

namespace zel {

class ScriptEditing {
  public:
    /// Connects the buttons.
    ScriptEditing(ScriptEditor& form, FileOps& files, MessageBoxes& boxes);

    /// Writes the text and closes the window; the window stays when it cannot be written, or when
    /// a text without a file gets no name.
    void cmdClose_Click();
    /// Closes the window, nothing is written.
    void cmdCancel_Click();
    /// An empty text without a file.
    void cmdNew_Click();
    void cmdSave_Click();
    void cmdSaveAs_Click();

  private:
    bool save();
    bool saveAs();

    ScriptEditor& form_;
    FileOps& files_;
    MessageBoxes& boxes_;
    Handlers handlers_;
};

}  // namespace zel
