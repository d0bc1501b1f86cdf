#include "script/ScriptFile.h"

#include <cstddef>
#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "platform/Files.h"
#include "support/CodePage.h"
#include "support/FileText.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr std::string_view kUtf8Mark = "\xEF\xBB\xBF";
constexpr std::uint64_t kLargestScript = std::uint64_t{64} * 1024 * 1024;
constexpr std::size_t kYieldEvery = 4096;

bool isBlankLine(std::string_view piece) {
    return piece.find_first_not_of(" \t") == std::string_view::npos;
}

}  // namespace

std::optional<ScriptText> readScript(FileService& files, const std::string& path) {
    FileProblem problem;
    std::optional<std::string> read = readFile(files, path, kLargestScript, problem);
    if (!read) return std::nullopt;
    std::string& bytes = *read;
    ScriptText script;
    script.codePage = !isValidUtf8(bytes);
    if (script.codePage) {
        script.text = codePageToUtf8(bytes);
        return script;
    }
    script.hasUtf8Mark = startsWith(bytes, kUtf8Mark);
    script.text = script.hasUtf8Mark ? bytes.substr(kUtf8Mark.size()) : std::move(bytes);
    return script;
}

std::string scriptBytes(const ScriptText& script) {
    if (script.codePage && fitsCodePage(script.text)) return codePageBytes(script.text);
    return (script.hasUtf8Mark ? std::string(kUtf8Mark) : std::string()) + script.text;
}

std::vector<std::string> loadCommandsFromText(std::string_view text) {
    std::vector<std::string> lines;
    while (!text.empty()) {
        const auto end = text.find_first_of("\r\n");
        const std::string_view piece = text.substr(0, end);
        if (!isBlankLine(piece)) lines.emplace_back(piece);
        if (end == std::string_view::npos) break;
        text.remove_prefix(end + 1);
    }
    return lines;
}

std::vector<std::string> loadCommandsRecursively(std::string_view rest, std::string current,
                                                 std::string_view lastCharacter,
                                                 const std::function<void()>& yield) {
    std::vector<std::string> lines;
    bool lineEnded = lastCharacter == "\n" || lastCharacter == "\r" || lastCharacter == kCrLf;
    for (std::size_t at = 0; at < rest.size(); ++at) {
        if (yield && at % kYieldEvery == 0) yield();
        if (lineEnded) {
            if (!current.empty()) current.pop_back();
            if (!current.empty()) lines.push_back(std::move(current));
            current.clear();
        }
        current += rest[at];
        lineEnded = rest[at] == '\n' || rest[at] == '\r';
    }
    lines.push_back(std::move(current));
    return lines;
}

}  // namespace zel
