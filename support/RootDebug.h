#pragma once
// The structured log: entries with a level, and the stack of the calls in progress.

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include "platform/Clock.h"
#include "platform/Event.h"
#include "platform/Files.h"
#include "platform/Services.h"

namespace zel {

/// A failure at run time, as the log and the report show it.
struct RuntimeFailure {
    std::int32_t number = 5;
    std::string source = "ZELRemote";
    std::string description;
};

/// A call in progress.
struct CallRecord {
    std::string ComponentName;
    std::string ClassName;
    std::string FunctionName;
    std::string reserved;
    std::string AdditionalInfos;
    double entered = 0;  ///< as `Clock::date`

    /// "Component.Class_Function <infos>"; class and infos where there are any.
    std::string text() const;
    bool sameCall(const CallRecord& other) const;
};

class RootDebug {
  public:
    static constexpr std::int32_t kFatal = 7;
    static constexpr std::size_t kKeptFiles = 10;  ///< of all runs, the newest

    /// The log file will lie in the folder; its name bears the time of now.
    RootDebug(const Clock& clock, FileService& files, DebugChannel& debugger, std::string folder);

    bool Initialized = false;        ///< while false no line is written
    bool FileOpen = false;           ///< lines of an entry are on their way to the file
    std::int32_t CallStackTop = -1;  ///< index of the newest call; -1: none
    bool FileLogEnabled = false;
    std::string FileName;
    std::int32_t FileLogLevel = 7;  ///< for the reader of the property; entries do not ask it
    bool FileTimeStamping = false;
    bool FileSafeLogMode = true;
    bool DebuggerLogEnabled = false;
    std::int32_t FirstCritic = 4;  ///< from this level on the mark is made of stars
    bool LogPushPop = false;       ///< each call and each return is a line
    bool ShowRuntimeWindow = true;
    std::vector<CallRecord> CallStack;

    /// Nothing can be written; the argument says so.
    Event<const std::string&> DebuggerError;
    /// The report of a failure is to be shown, with the texts of the calls from the outermost on.
    Event<const RuntimeFailure&, const std::vector<std::string>&> DisplayError;

    void Activate() { Initialized = true; }
    /// An entry of `Level` 0 to 7; `Source` is the routine that says it.
    void LogMessage(std::int32_t Level, const std::string& Source, const std::string& Description);
    /// An entry of level 7 with the failure and all calls; then the report.
    void LogRuntimeError(const std::string& ComponentName, const std::string& ClassName,
                         const std::string& FunctionName, const RuntimeFailure& failure);
    void Push(const std::string& ComponentName, const std::string& ClassName,
              const std::string& FunctionName);
    /// Attaches a text to the newest call.
    void PushInfo(const std::string& AdditionalInfos);
    /// Without a call in progress the stack is out of step: the next `Push` is a failure.
    void Pop();
    /// "Debug" to "Fatal"; "Unknown" for any other number.
    static std::string GetLevelText(std::int32_t LevelNum);

  private:
    void writeEntry(std::int32_t level, const CallRecord& record, const RuntimeFailure& failure);
    void writeFailure(const RuntimeFailure& failure, const std::string& margin);
    void writeCallStack(const std::string& prefix);
    void enter(const CallRecord& record);
    void openFile();
    void writeLine(const std::string& text);
    void flush();
    void tellFileError();

    const Clock& clock_;
    FileService& files_;
    DebugChannel& debugger_;
    std::string folder_;
    std::string pending_;  ///< lines on their way to the file
};

/// Pushes a call and pops it at the end of the block.
class CallScope {
  public:
    CallScope(RootDebug& log, const std::string& ComponentName, const std::string& ClassName,
              const std::string& FunctionName)
        : log_(log) {
        log_.Push(ComponentName, ClassName, FunctionName);
    }
    ~CallScope() { log_.Pop(); }
    CallScope(const CallScope&) = delete;
    CallScope& operator=(const CallScope&) = delete;

  private:
    RootDebug& log_;
};

}  // namespace zel
