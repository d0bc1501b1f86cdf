#pragma once
// A script as a file: its bytes, its encoding, and the two ways in which a text becomes the list.

#include <functional>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "platform/Files.h"

namespace zel {

struct ScriptText {
    std::string text;          ///< UTF-8, line ends as in the file, without a mark
    bool hasUtf8Mark = false;  ///< the file began with one
    bool codePage = false;     ///< the file was no UTF-8 and was read as Windows-1252
};

/// Nothing for a file that cannot be read or is larger than 64 MB.
std::optional<ScriptText> readScript(FileService& files, const std::string& path);
/// The bytes of a text in the encoding that its file had; UTF-8 where the code page has no byte
/// for a character.
std::string scriptBytes(const ScriptText& script);

/// At each line end (CR LF, CR or LF); pieces of blanks, tabs and line ends alone are left out,
/// the others stay as they stand.
std::vector<std::string> loadCommandsFromText(std::string_view text);
/// The road of the list of files and of reloading, a character at a time: lines of blanks stay,
/// and a text that ends in CR LF leaves a last entry with a lone LF. `yield` is called at
/// intervals.
std::vector<std::string> loadCommandsRecursively(std::string_view rest, std::string current,
                                                 std::string_view lastCharacter,
                                                 const std::function<void()>& yield);

}  // namespace zel
