#include "shell/Logs.h"

#include <algorithm>
#include <string>
#include <string_view>

#include "platform/Platform.h"
#include "support/Text.h"
#include "support/Windows1252.h"

namespace zel {
namespace {

constexpr std::string_view kCame = "<-";
constexpr std::string_view kPin = "CPIN=";

/// Bytes that no text of the instrument has: samples of a trace.
bool isBinary(const std::string& text) {
    return std::any_of(text.begin(), text.end(), [](char c) {
        return static_cast<unsigned char>(c) < ' ' && c != '\r' && c != '\n' && c != '\t';
    });
}

bool holdsWord(const std::string& words, std::string_view word) {
    return contains(upperCase(words), word);
}

}  // namespace

std::string loggedText(const std::string& text) {
    // The bytes that came are the instrument's own; what goes out is text already.
    const bool came = startsWith(text, kCame);
    if (came && isBinary(text))
        return "<- " + std::to_string(text.size() - kCame.size()) + " bytes";
    std::string line =
        came ? std::string(kCame) + " " + fromWindows1252(text.substr(kCame.size())) : text;
    while (!line.empty() && (line.back() == '\r' || line.back() == '\n')) line.pop_back();
    if (const auto pin = upperCase(line).find(kPin); pin != std::string::npos)
        line = line.substr(0, pin + kPin.size()) + "****";
    return replaceAll(replaceAll(line, "\r", "\\r"), "\n", "\\n");
}

Logs::Logs(const Platform& platform, const std::string& words)
    : debugger_(platform.debug, DebuggerLine),
      DebugIt(platform.clock, platform.files),
      rootDebug(platform.clock, platform.files, debugger_, platform.folder.path()),
      line_(platform.debug, DebugIt) {
    DebugIt.DebugFileName = platform.folder.path() + "/debug.log";
    DebugIt.TimeSamping = true;
    DebugIt.STAT = holdsWord(words, "BUTTON");
    DebugIt.KillOld();
    rootDebug.Activate();
    rootDebug.FileLogEnabled = holdsWord(words, "SERVER");
    rootDebug.FileTimeStamping = rootDebug.FileLogEnabled;
}

void Logs::Line::output(const std::string& text) {
    system.output(text);
    plain.OutputDebug(loggedText(text));
}

}  // namespace zel
