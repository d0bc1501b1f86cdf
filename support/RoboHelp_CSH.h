#pragma once
// The help with a single call: which viewer shows a help source, and at which topic.

#include <functional>
#include <string>

#include "platform/Files.h"
#include "platform/MessageBox.h"
#include "platform/Services.h"

namespace zel {

class RoboHelp_CSH {
  public:
    // Commands of a call.
    static constexpr int kTableOfContents = 1;
    static constexpr int kIndex = 2;
    static constexpr int kSearch = 3;
    static constexpr int kContextHelp = 15;  ///< a topic by its context number

    /// The name by which the forms ask for the program's own book.
    static constexpr const char* kBookName = "ZELRemoteHelp.chm";
    /// The book itself, below the folder of the program's companions.
    static constexpr const char* kOwnBook = "help/zelremote.qch";

    RoboHelp_CSH(ApplicationFolder& folder, FileService& files, Launcher& launcher,
                 MessageBoxes& boxes)
        : folder_(folder), files_(files), launcher_(launcher), boxes_(boxes) {}

    /// Shows a book at a topic; false when it cannot. The platform's call for compiled help;
    /// without one the system opens the file.
    std::function<bool(const std::string& book, int command, int context)> HtmlHelpA;
    /// The same for the older kind of help files.
    std::function<bool(const std::string& file, int command, int context)> WinHelpA;

    /// The topic of that context number in the program's own book; a box when there is no book.
    void showTopic(int context);
    /// Shows a help source: a compiled help file, an older help file, or a page of the web. False
    /// when it is not there or nothing shows it.
    bool RH_ShowHelp(int parent, const std::string& helpFile, int command, int context);
    /// The path of the program's own book: the installed one, else one in the application's folder.
    std::string book() const;

    /// The address of a topic in help on the web: a page gets its place after the "#", a server's
    /// address its arguments.
    static std::string webAddress(const std::string& source, int command, int context);

  private:
    bool open(const std::string& file, int command, int context,
              const std::function<bool(const std::string&, int, int)>& call);

    ApplicationFolder& folder_;
    FileService& files_;
    Launcher& launcher_;
    MessageBoxes& boxes_;
};

}  // namespace zel
