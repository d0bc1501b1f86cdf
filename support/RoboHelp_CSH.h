#pragma once
// Opens the help book at a topic.

#include <string>

#include "platform/Files.h"
#include "platform/MessageBox.h"
#include "platform/Services.h"

namespace zel {

class RoboHelp_CSH {
  public:
    /// The command of a topic by its context number.
    static constexpr int kContextHelp = 15;

    RoboHelp_CSH(ApplicationFolder& folder, FileService& files, Launcher& launcher,
                 MessageBoxes& boxes)
        : folder_(folder), files_(files), launcher_(launcher), boxes_(boxes) {}

    /// The topic of that context number in the program's own book.
    void showTopic(int context);
    /// Opens a help file; false when it is not there or nothing on the system opens it.
    bool RH_ShowHelp(int parent, const std::string& helpFile, int command, int context);

  private:
    ApplicationFolder& folder_;
    FileService& files_;
    Launcher& launcher_;
    MessageBoxes& boxes_;
};

}  // namespace zel
