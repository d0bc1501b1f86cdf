#pragma once
// What the user was shown: each box as one line, so that a test names icon, title and text at once.

#include <string>
#include <vector>

#include "platform/virtual/RecordedBoxes.h"

namespace zel {

using Texts = std::vector<std::string>;

inline std::string iconName(BoxIcon icon) {
    switch (icon) {
        case BoxIcon::Critical:
            return "critical";
        case BoxIcon::Question:
            return "question";
        case BoxIcon::Warning:
            return "warning";
        case BoxIcon::Exclamation:
            return "exclamation";
        case BoxIcon::Information:
            return "information";
        case BoxIcon::Plain:
            break;
    }
    return "plain";
}

/// "critical | ZELRemote | Port not open!"
inline std::string boxLine(const Box& box) {
    return iconName(box.icon) + " | " + box.title + " | " + box.text;
}

/// All boxes so far, in order.
inline Texts shownBoxes(const RecordedBoxes& boxes) {
    Texts lines;
    for (const Box& box : boxes.boxes()) lines.push_back(boxLine(box));
    return lines;
}

}  // namespace zel
