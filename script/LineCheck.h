#pragma once
// What can be seen of a script without running it: lines that do nothing, lines that go wrong.

#include <string>
#include <string_view>
#include <vector>

namespace zel {

struct LineFinding {
    int line = 0;          ///< as an editor counts, from 1
    bool ignored = false;  ///< the line does nothing; else it goes wrong
    std::string text;      ///< a sentence for the user, without the line's number
};

struct ScriptLine {
    int line = 0;  ///< as an editor counts, from 1
    std::string text;
};

/// The entries that a text makes, with the lines they stand in.
std::vector<ScriptLine> scriptLines(std::string_view text);
/// Of a whole text, in the order of the lines.
std::vector<LineFinding> checkScript(std::string_view text);

}  // namespace zel
