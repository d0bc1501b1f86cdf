#pragma once
// Rich text code: single runs of text, and a whole document out of the runs of a box.

#include <string>
#include <vector>

#include "platform/Controls.h"
#include "platform/Form.h"

namespace zel {

enum class RtfAlignment { Left, Center, Right };

/// "{\plain\fs20{\b\cf2\ql text}}": backslashes are doubled, a line break becomes "\par". No size
/// word for a size of 0, no highlight for the back colour 0.
std::string formatRun(const std::string& text, int size, bool bold, bool italic, bool underline,
                      Color foreColor, Color backColor, RtfAlignment alignment);
/// A document that any word processor opens; its plain text is that of the runs.
std::string rtfDocument(const std::vector<TextRun>& runs);

}  // namespace zel
