#include "tests/house/Sources.h"

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <sstream>
#include <stdexcept>

namespace zel::house {
namespace {

namespace fs = std::filesystem;

bool isLeftOut(const fs::path& folder) {
    const std::string name = folder.filename().string();
    return startsWith(name, ".") || name == "build" || name == "run-output";
}

std::vector<std::string> linesOf(const std::string& text) {
    std::vector<std::string> lines;
    std::istringstream stream(text);
    for (std::string line; std::getline(stream, line);) lines.push_back(line);
    return lines;
}

/// Copies the code at `at` to the result, a comment as blanks; the position after it.
std::size_t skipComment(std::string_view text, std::size_t at, std::string& result) {
    const bool block = text[at + 1] == '*';
    std::size_t end = text.find(block ? "*/" : "\n", at + 2);
    if (end == std::string_view::npos) {
        end = text.size();
    } else if (block) {
        end += 2;
    }
    for (; at < end; ++at) result += text[at] == '\n' ? '\n' : ' ';
    return end;
}

/// Copies the quotes of a literal and leaves away what they hold; the position after it.
std::size_t skipLiteral(std::string_view text, std::size_t at, std::string& result) {
    const char quote = text[at];
    result += quote;
    for (++at; at < text.size() && text[at] != quote && text[at] != '\n'; ++at) {
        if (text[at] == '\\') ++at;
    }
    if (at < text.size()) result += text[at];
    return std::min(at + 1, text.size());
}

/// The same for R"tag( ... )tag"; `at` is at the quote.
std::size_t skipRawLiteral(std::string_view text, std::size_t at, std::string& result) {
    const std::size_t open = text.find('(', at);
    if (open == std::string_view::npos) return skipLiteral(text, at, result);
    std::string closing = ")";
    closing += text.substr(at + 1, open - at - 1);
    closing += '"';
    std::size_t end = text.find(closing, open);
    end = end == std::string_view::npos ? text.size() : end + closing.size();
    result += '"';
    result.append(static_cast<std::size_t>(std::count(text.begin() + static_cast<long>(at),
                                                      text.begin() + static_cast<long>(end), '\n')),
                  '\n');
    result += '"';
    return end;
}

bool isDigitSeparator(std::string_view text, std::size_t at) {
    const auto isAlnum = [](char c) {
        return (c >= '0' && c <= '9') || (c >= 'a' && c <= 'f') || (c >= 'A' && c <= 'F');
    };
    return text[at] == '\'' && at > 0 && at + 1 < text.size() && isAlnum(text[at - 1]) &&
           isAlnum(text[at + 1]);
}

}  // namespace

bool startsWith(std::string_view text, std::string_view beginning) {
    return text.substr(0, beginning.size()) == beginning;
}

std::string readText(const std::string& path) {
    std::ifstream stream(path, std::ios::binary);
    std::ostringstream text;
    text << stream.rdbuf();
    if (!stream) throw std::runtime_error("cannot read " + path);
    return text.str();
}

std::vector<SourceFile> readSources(const std::string& root) {
    std::vector<SourceFile> files;
    for (fs::recursive_directory_iterator at(root), end; at != end; ++at) {
        if (at->is_directory() && isLeftOut(at->path())) at.disable_recursion_pending();
        const std::string ending = at->path().extension().string();
        if (!at->is_regular_file() || (ending != ".h" && ending != ".cpp")) continue;
        files.push_back(
            {at->path().lexically_relative(root).generic_string(), readText(at->path().string())});
    }
    std::sort(files.begin(), files.end(),
              [](const SourceFile& a, const SourceFile& b) { return a.path < b.path; });
    return files;
}

std::string codeOnly(std::string_view text) {
    std::string result;
    result.reserve(text.size());
    for (std::size_t at = 0; at < text.size();) {
        const std::string_view rest = text.substr(at);
        if (startsWith(rest, "//") || startsWith(rest, "/*")) {
            at = skipComment(text, at, result);
        } else if (text[at] == '"' && at > 0 && text[at - 1] == 'R') {
            at = skipRawLiteral(text, at, result);
        } else if (text[at] == '"' || (text[at] == '\'' && !isDigitSeparator(text, at))) {
            at = skipLiteral(text, at, result);
        } else {
            result += text[at++];
        }
    }
    return result;
}

std::vector<std::string> includes(const SourceFile& file, IncludeKind kind) {
    const char open = kind == IncludeKind::Quoted ? '"' : '<';
    const char close = kind == IncludeKind::Quoted ? '"' : '>';
    const std::vector<std::string> lines = linesOf(file.text);
    const std::vector<std::string> code = linesOf(codeOnly(file.text));

    std::vector<std::string> found;
    for (std::size_t i = 0; i < code.size() && i < lines.size(); ++i) {
        const std::size_t hash = code[i].find_first_not_of(" \t");
        if (hash == std::string::npos || code[i][hash] != '#') continue;
        const std::size_t word = code[i].find_first_not_of(" \t", hash + 1);
        if (word == std::string::npos || code[i].compare(word, 7, "include") != 0) continue;
        const std::size_t begin = lines[i].find_first_of("\"<", word);
        if (begin == std::string::npos || lines[i][begin] != open) continue;
        const std::size_t end = lines[i].find(close, begin + 1);
        if (end != std::string::npos) found.push_back(lines[i].substr(begin + 1, end - begin - 1));
    }
    return found;
}

}  // namespace zel::house
