#pragma once
// Boxes and file dialogs whose answers go into the session log, as lines of a panel session.

#include <optional>
#include <string>

#include "platform/MessageBox.h"
#include "platform/Services.h"
#include "support/SessionLog.h"

namespace zel {

/// Passes everything on. A box with one button is no question and leaves no line.
class LoggedBoxes : public MessageBoxes {
  public:
    explicit LoggedBoxes(MessageBoxes& boxes) : boxes_(boxes) {}
    SessionLog* log = nullptr;  ///< nothing is written without one

    BoxAnswer show(const Box& box) override;
    std::optional<std::string> prompt(const std::string& text, const std::string& title,
                                      const std::string& preset) override;

  private:
    MessageBoxes& boxes_;
};

class LoggedFileDialogs : public FileDialogs {
  public:
    explicit LoggedFileDialogs(FileDialogs& dialogs) : dialogs_(dialogs) {}
    SessionLog* log = nullptr;

    std::optional<std::string> save(const FileDialogRequest& request) override;
    std::optional<std::string> open(const FileDialogRequest& request) override;

  private:
    FileDialogs& dialogs_;
};

}  // namespace zel
