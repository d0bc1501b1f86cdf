#pragma once
// The program's logs by the names of their members and routines.

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "shell/Logs.h"

namespace zel {

/// "RootDebug.FileName", "DebugIt.STAT": true when the path begins with the name of a log.
bool namesALog(std::string_view path);

/// The text of a member; nothing when there is none of that name.
std::optional<std::string> logMember(const Logs& logs, std::string_view path);
/// False when there is no member of that name or the text does not fit it.
bool setLogMember(Logs& logs, std::string_view path, const std::string& text);
/// Runs a routine with its arguments. Its result, empty where it has none; nothing when there is
/// no such routine or the arguments do not fit it.
std::optional<std::string> callLog(Logs& logs, std::string_view path,
                                   const std::vector<std::string>& arguments);

/// Arguments of a call: numbers and words as they stand, texts in double quotes (a doubled quote
/// stands for one), between them blanks or commas. Nothing when a text does not end.
std::optional<std::vector<std::string>> splitArguments(std::string_view text);

}  // namespace zel
