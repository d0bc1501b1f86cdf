#pragma once
// Message boxes, prompts, file dialogs and the clipboard, as windows.

#include <QWidget>
#include <functional>

#include "platform/MessageBox.h"
#include "platform/Services.h"

namespace zel {

class QtMessageBoxes : public MessageBoxes {
  public:
    BoxAnswer show(const Box& box) override;
    std::optional<std::string> prompt(const std::string& text, const std::string& title,
                                      const std::string& preset) override;
};

class QtFileDialogs : public FileDialogs {
  public:
    std::optional<std::string> save(const FileDialogRequest& request) override;
    std::optional<std::string> open(const FileDialogRequest& request) override;
};

class QtClipboard : public Clipboard {
  public:
    void setText(const std::string& text) override;
    std::string text() override;
};

}  // namespace zel
