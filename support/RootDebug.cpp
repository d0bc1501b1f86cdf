#include "support/RootDebug.h"

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <string>
#include <utility>
#include <vector>

#include "platform/Clock.h"
#include "platform/Files.h"
#include "platform/Services.h"
#include "support/MTStandard.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr std::size_t kFirstRoom = 11;
constexpr std::size_t kMoreRoom = 10;
constexpr std::int32_t kMarkWidth = 7;
constexpr std::int32_t kLongestMark = 255;  // a level has no such number
constexpr std::int32_t kStairs = 9;         // blanks of a call at the bottom of the stack
constexpr std::size_t kStackMargin = 14;
constexpr std::int32_t kOutOfBounds = 9;
constexpr const char* kSeparator = "   ";
constexpr const char* kFileHead = "ELOG_";
constexpr const char* kFileTail = ".log";
constexpr const char* kLevels[] = {"Debug", "Info",     "Notice", "Warning",
                                   "Error", "Critical", "Alert",  "Fatal"};

std::string blanks(std::int32_t count) {
    return std::string(static_cast<std::size_t>(std::max(count, 0)), ' ');
}

/// A text on one line.
std::string oneLine(const std::string& text) {
    return replaceAll(replaceAll(replaceAll(text, kCrLf, " / "), "\r", " / "), "\n", " / ");
}

/// "D (13)".
std::string numberLine(std::int32_t number) {
    constexpr char kDigits[] = "0123456789ABCDEF";
    std::string hex;
    auto rest = static_cast<std::uint32_t>(number);
    do {
        hex.insert(hex.begin(), kDigits[rest & 0xF]);
        rest >>= 4;
    } while (rest != 0);
    return hex + " (" + std::to_string(number) + ")";
}

}  // namespace

std::string CallRecord::text() const {
    std::string text = ComponentName + ".";
    if (!ClassName.empty()) text += ClassName + "_";
    text += FunctionName;
    if (!AdditionalInfos.empty()) text += " <" + AdditionalInfos + ">";
    return oneLine(text);
}

bool CallRecord::sameCall(const CallRecord& other) const {
    return ComponentName == other.ComponentName && ClassName == other.ClassName &&
           FunctionName == other.FunctionName;
}

RootDebug::RootDebug(const Clock& clock, FileService& files, DebugChannel& debugger,
                     std::string folder)
    : CallStack(kFirstRoom),
      clock_(clock),
      files_(files),
      debugger_(debugger),
      folder_(std::move(folder)) {
    constexpr double kSecondsADay = 86400;
    constexpr double kRounding = 1e-3;  // of a date, in seconds
    // The second that has begun: a file is never of a time to come.
    const double now = std::floor(clock_.date() * kSecondsADay + kRounding) / kSecondsADay;
    const std::string stamp = clock_.Clock::dateText(now) + "_" + clock_.Clock::timeText(now);
    FileName =
        folder_ + "/" + kFileHead + replaceAll(replaceAll(stamp, "-", "_"), ":", "_") + kFileTail;
}

std::string RootDebug::GetLevelText(std::int32_t LevelNum) {
    const bool known = LevelNum >= 0 && LevelNum <= kFatal;
    return known ? kLevels[LevelNum] : "Unknown";
}

void RootDebug::enter(const CallRecord& record) {
    ++CallStackTop;
    const auto index = static_cast<std::size_t>(CallStackTop);
    if (index >= CallStack.size()) CallStack.resize(CallStack.size() + kMoreRoom);
    CallStack[index] = record;
    CallStack[index].entered = clock_.date();
}

void RootDebug::Push(const std::string& ComponentName, const std::string& ClassName,
                     const std::string& FunctionName) {
    if (CallStackTop < -1) {
        ++CallStackTop;
        RuntimeFailure failure;
        failure.number = kOutOfBounds;
        failure.description = "Subscript out of range";
        LogRuntimeError("RootDebug", "RootDebug", "Push", failure);
        return;
    }
    enter({ComponentName, ClassName, FunctionName, "", "", 0});
    if (!LogPushPop || !Initialized) return;
    writeLine(blanks(CallStackTop + kStairs) + ">" +
              CallStack[static_cast<std::size_t>(CallStackTop)].text());
    flush();
}

void RootDebug::PushInfo(const std::string& AdditionalInfos) {
    if (CallStackTop >= 0)
        CallStack[static_cast<std::size_t>(CallStackTop)].AdditionalInfos = AdditionalInfos;
}

void RootDebug::Pop() {
    const std::int32_t before = CallStackTop;
    // One step below the empty stack marks the missing call; further ones add nothing to it.
    if (CallStackTop > -2) --CallStackTop;
    if (!LogPushPop || !Initialized) return;
    writeLine(blanks(before + kStairs) + "<");
    flush();
}

void RootDebug::LogMessage(std::int32_t Level, const std::string& Source,
                           const std::string& Description) {
    CallRecord record;
    // A routine that gives its own name is the call that is already on the stack.
    if (CallStackTop >= 0 &&
        CallStack[static_cast<std::size_t>(CallStackTop)].FunctionName == Source)
        record = CallStack[static_cast<std::size_t>(CallStackTop)];
    record.FunctionName = Source;
    RuntimeFailure failure;
    failure.description = Description;
    writeEntry(Level, record, failure);
}

void RootDebug::LogRuntimeError(const std::string& ComponentName, const std::string& ClassName,
                                const std::string& FunctionName, const RuntimeFailure& failure) {
    writeEntry(kFatal, {ComponentName, ClassName, FunctionName, "", "", 0}, failure);
}

void RootDebug::writeEntry(std::int32_t level, const CallRecord& record,
                           const RuntimeFailure& failure) {
    const std::string time = FileTimeStamping ? GetISOTimeString(clock_, *this) : "";
    if (!Initialized) return tellFileError();
    openFile();
    const std::int32_t length = std::clamp(level, 0, kLongestMark);
    const std::string mark(static_cast<std::size_t>(length), level >= FirstCritic ? '*' : '.');
    const std::string margin = blanks(kMarkWidth) + kSeparator;
    // A stack that is out of step takes the entry's call at its bottom.
    const std::int32_t top = CallStackTop;
    const bool pushed = top < 0 || !CallStack[static_cast<std::size_t>(top)].sameCall(record);
    if (pushed) {
        CallStackTop = std::max(top, -1);
        enter(record);
    }
    writeLine(mark + blanks(kMarkWidth - length) + GetLevelText(level));
    if (!time.empty()) writeLine(margin + "TIME        : " + time);
    if (level == kFatal) {
        writeFailure(failure, margin);
    } else {
        writeLine(margin + "SOURCE      : " + oneLine(record.FunctionName));
        writeLine(margin + "DESCRIPTION : " + oneLine(failure.description));
    }
    if (pushed) CallStackTop = top;
    flush();
}

void RootDebug::writeFailure(const RuntimeFailure& failure, const std::string& margin) {
    const CallRecord& call = CallStack[static_cast<std::size_t>(CallStackTop)];
    writeLine(margin + "SOURCE      : " + oneLine(call.FunctionName));
    writeLine(margin + "DESCRIPTION : " + oneLine(call.ClassName + " " + failure.description));
    writeLine(margin + "ERROR NUMBER: " + numberLine(failure.number));
    writeLine(margin + "ERROR SOURCE: " + oneLine(failure.source));
    writeCallStack(std::string(kStackMargin, ' ') + kSeparator);
    if (!ShowRuntimeWindow) return;
    std::vector<std::string> calls;
    for (std::int32_t i = 0; i <= CallStackTop; ++i)
        calls.push_back(CallStack[static_cast<std::size_t>(i)].text());
    // What the entry holds so far is on disk before the report may end the program.
    flush();
    DisplayError(failure, calls);
}

void RootDebug::writeCallStack(const std::string& prefix) {
    for (std::int32_t i = 0; i <= CallStackTop; ++i)
        writeLine(prefix + blanks(i) + ">" + CallStack[static_cast<std::size_t>(i)].text());
}

void RootDebug::openFile() {
    if (FileOpen || !FileLogEnabled) return;
    FileOpen = true;
    if (files_.stat(FileName).exists()) return;
    // A new file: of those of earlier runs the newest stay. Their names sort by their time.
    std::vector<std::string> old;
    for (const std::string& name : files_.list(folder_)) {
        if (startsWith(name, kFileHead) && name.size() > 4 &&
            name.substr(name.size() - 4) == kFileTail)
            old.push_back(name);
    }
    std::sort(old.begin(), old.end());
    for (std::size_t i = 0; i + kKeptFiles <= old.size(); ++i)
        files_.remove(folder_ + "/" + old[i]);
}

void RootDebug::writeLine(const std::string& text) {
    if (FileLogEnabled) {
        openFile();
        pending_ += text + kCrLf;
    }
    if (DebuggerLogEnabled) debugger_.output(text);
}

void RootDebug::flush() {
    if (!pending_.empty()) {
        const std::string lines = std::exchange(pending_, "");
        const bool written = files_.append(FileName, lines).empty();
        if (!written) FileOpen = false;  // the next entry opens it again
        if (!written) tellFileError();
    }
    if (FileSafeLogMode && FileLogEnabled) FileOpen = false;
}

void RootDebug::tellFileError() { DebuggerError("Could not access debugger file " + FileName); }

}  // namespace zel
