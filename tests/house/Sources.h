#pragma once
// The source files of the tree, as the tests of the house read them.

#include <string>
#include <string_view>
#include <vector>

namespace zel::house {

struct SourceFile {
    std::string path;  ///< relative to the root, with slashes
    std::string text;
};

/// All .h and .cpp files below `root`, sorted by path. Hidden folders, `build` and `run-output` are
/// left out. Throws std::runtime_error when a file cannot be read.
std::vector<SourceFile> readSources(const std::string& root);
/// The whole file; throws std::runtime_error when it cannot be read.
std::string readText(const std::string& path);

/// The code alone: comments become blanks, literals lose what is between their quotes. Lines stay
/// where they are.
std::string codeOnly(std::string_view text);

enum class IncludeKind { Quoted, Angled };
/// What the file includes in one of the two forms, in order. Included lines inside comments do not
/// count.
std::vector<std::string> includes(const SourceFile& file, IncludeKind kind);

bool startsWith(std::string_view text, std::string_view beginning);

}  // namespace zel::house
