#include "support/DebugIf.h"

#include <optional>
#include <string>

#include "platform/Files.h"
#include "support/FileText.h"
#include "support/NumberText.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr const char* kEnding = ".log";

/// "debug.1.log" of "debug.log".
std::string oldName(const std::string& name, int age) {
    const auto ending = name.rfind(kEnding);
    const bool has = ending != std::string::npos && ending + 4 == name.size();
    return name.substr(0, has ? ending : name.size()) + "." + std::to_string(age) + kEnding;
}

}  // namespace

void DebugIf::KillOld() {
    if (!DebugFileName.empty() && files_.stat(DebugFileName).isRegular())
        files_.remove(DebugFileName);
}

void DebugIf::putAside() {
    for (int age = kOldFiles; age >= 1; --age) {
        const std::string from = age > 1 ? oldName(DebugFileName, age - 1) : DebugFileName;
        if (!files_.stat(from).isRegular()) continue;
        FileProblem problem;
        const std::optional<std::string> bytes = readFile(files_, from, 2 * kLargestFile, problem);
        // What cannot be kept is given up: a log must not grow without end.
        if (bytes) files_.replace(oldName(DebugFileName, age), *bytes);
    }
    files_.remove(DebugFileName);
}

void DebugIf::OutputDebug(const std::string& text) {
    if (!STAT || DebugFileName.empty()) return;
    std::string line;
    if (TimeSamping) line += formatPattern(clock_.secondsOfDay(), "00,000,000.000") + ":";
    if (!trimmed(DebugHeader).empty()) line += DebugHeader + " ";
    line += text + kCrLf;
    const FileStatus before = files_.stat(DebugFileName);
    if (before.isRegular() && before.size + line.size() > kLargestFile) putAside();
    files_.append(DebugFileName, line);
}

}  // namespace zel
