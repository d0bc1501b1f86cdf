#pragma once
// The colours of the rich texts: colour values and their places in the colour table.

#include <string_view>

#include "platform/Form.h"

namespace zel {

/// Black, red, green, blue, grey, dark green, orange, white: the indices 1 to 8.
inline constexpr std::string_view kColorTable =
    "{\\colortbl ;\\red0\\green0\\blue0;\\red255\\green0\\blue0;\\red0\\green255\\blue0;"
    "\\red0\\green0\\blue255;\\red127\\green127\\blue127;\\red0\\green127\\blue0;"
    "\\red255\\green128\\blue0;\\red255\\green255\\blue255;}";

/// The place of a colour in the table; 1 for a colour that has none of its own.
int colorIndex(Color color);

}  // namespace zel
