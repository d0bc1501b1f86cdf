#pragma once
// Message boxes, prompts, file dialogs and the clipboard, as windows.

#include <QWidget>
#include <optional>
#include <string>

#include "platform/MessageBox.h"
#include "platform/Services.h"

namespace zel {

class QtMessageBoxes : public MessageBoxes {
  public:
    BoxAnswer show(const Box& box) override;
    std::optional<std::string> prompt(const std::string& text, const std::string& title,
                                      const std::string& preset) override;
};

/// A dialog begins in the folder of the last one, be it of an earlier run; the first of all in the
/// folder that is asked for, but never in one that file managers hide or that is the program's own:
/// then in that of documents.
class QtFileDialogs : public FileDialogs {
  public:
    QtFileDialogs(SettingsStore& settings, ApplicationFolder& own)
        : settings_(settings), own_(own) {}
    std::optional<std::string> save(const FileDialogRequest& request) override;
    std::optional<std::string> open(const FileDialogRequest& request) override;

  private:
    std::optional<std::string> chosen(const FileDialogRequest& request, bool save);

    SettingsStore& settings_;
    ApplicationFolder& own_;
};

class QtClipboard : public Clipboard {
  public:
    void setText(const std::string& text) override;
    std::string text() override;
};

}  // namespace zel
