#pragma once
// The menu entries of the waterfall's window that go beyond it: its picture in a file.

#include "files/FileOps.h"
#include "forms/WaterfallForm.h"
#include "platform/Event.h"
#include "platform/MessageBox.h"

namespace zel {

class WaterfallKeys {
  public:
    WaterfallKeys(WaterfallForm& form, FileOps& files, MessageBoxes& boxes);

    /// Asks for a file; a failure is shown in a box.
    void PictureSave_Click();

  private:
    WaterfallForm& form_;
    FileOps& files_;
    MessageBoxes& boxes_;
    Handlers handlers_;
};

}  // namespace zel
