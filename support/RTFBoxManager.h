#pragma once
// Appends styled text to the rich text boxes.

#include <string>

#include "platform/Controls.h"
#include "platform/Form.h"

namespace zel {

/// The mark of a carriage return in a text that is shown; see `markCarriageReturns`.
inline constexpr const char* kCarriageReturnMark = "-CR-";

/// Appends a run, and with `newLine` CR LF after it. A text that holds the mark "-CR-" has the
/// marks shown instead and gets no new line.
void appendRichText(RichText& box, const std::string& text, bool bold, bool italic, Color color,
                    bool newLine);
/// Shows each mark "-CR-" of the box as "<CR> ", in bold; the marks of `text` become "<CR>".
void markCarriageReturns(RichText& box, std::string& text);

}  // namespace zel
