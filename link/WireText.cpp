#include "link/WireText.h"

#include <string>
#include <string_view>

#include "platform/MessageBox.h"
#include "support/Text.h"
#include "support/Windows1252.h"

namespace zel {

std::string wireProblem(std::string_view text) {
    const std::string unknown = withoutWindows1252(text);
    return unknown.empty() ? "" : "The instrument has no character for \"" + unknown + "\".";
}

bool sendable(std::string_view text, MessageBoxes& boxes) {
    const std::string problem = wireProblem(text);
    if (problem.empty()) return true;
    boxes.show({BoxIcon::Plain, problem + kCrLf + "Nothing was sent."});
    return false;
}

}  // namespace zel
