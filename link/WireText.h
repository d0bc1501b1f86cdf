#pragma once
// What can go to the instrument as text.

#include <string>
#include <string_view>

#include "platform/MessageBox.h"

namespace zel {

/// Why a text cannot be sent, for a user: the instrument knows the characters of Windows-1252 only.
/// Empty when it can.
std::string wireProblem(std::string_view text);
/// True when a text can be sent; else a box says why it is not.
bool sendable(std::string_view text, MessageBoxes& boxes);

}  // namespace zel
