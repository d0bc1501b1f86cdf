#pragma once
// Modal message boxes and input prompts.

#include <optional>
#include <string>

namespace zel {

/// `Warning` and `Exclamation` look alike; they differ only where boxes are shown as text.
enum class BoxIcon { Plain, Critical, Question, Warning, Exclamation, Information };
enum class BoxButtons { Ok, OkCancel, YesNo, YesNoCancel };
enum class BoxAnswer { Ok = 1, Cancel = 2, Yes = 6, No = 7 };

/// The title of a box that is given none.
inline constexpr const char* kProgramTitle = "ZELRemote";

struct Box {
    BoxIcon icon = BoxIcon::Plain;
    std::string text;  ///< lines joined by CR LF
    std::string title = kProgramTitle;
    BoxButtons buttons = BoxButtons::Ok;
};

class MessageBoxes {
  public:
    virtual ~MessageBoxes() = default;
    virtual BoxAnswer show(const Box& box) = 0;
    /// A line of text from the user; nothing when cancelled.
    virtual std::optional<std::string> prompt(const std::string& text, const std::string& title,
                                              const std::string& preset) = 0;
};

}  // namespace zel
