#include "console/LogAccess.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <variant>
#include <vector>

#include "shell/Logs.h"
#include "support/DebugIf.h"
#include "support/NumberText.h"
#include "support/RootDebug.h"
#include "support/Text.h"

namespace zel {
namespace {

using Field = std::variant<bool*, std::int32_t*, std::string*>;
using Arguments = std::vector<std::string>;

struct Member {
    std::string_view path;
    Field field;
};

std::vector<Member> membersOf(Logs& logs) {
    DebugIf& plain = logs.DebugIt;
    RootDebug& root = logs.rootDebug;
    return {{"DebugIt.DebugFileName", &plain.DebugFileName},
            {"DebugIt.STAT", &plain.STAT},
            {"DebugIt.DebugHeader", &plain.DebugHeader},
            {"DebugIt.TimeSamping", &plain.TimeSamping},
            {"RootDebug.Initialized", &root.Initialized},
            {"RootDebug.FileOpen", &root.FileOpen},
            {"RootDebug.CallStackTop", &root.CallStackTop},
            {"RootDebug.FileLogEnabled", &root.FileLogEnabled},
            {"RootDebug.FileName", &root.FileName},
            {"RootDebug.FileLogLevel", &root.FileLogLevel},
            {"RootDebug.FileTimeStamping", &root.FileTimeStamping},
            {"RootDebug.FileSafeLogMode", &root.FileSafeLogMode},
            {"RootDebug.DebuggerLogEnabled", &root.DebuggerLogEnabled},
            {"RootDebug.FirstCritic", &root.FirstCritic},
            {"RootDebug.LogPushPop", &root.LogPushPop},
            {"RootDebug.ShowRuntimeWindow", &root.ShowRuntimeWindow}};
}

std::optional<Field> find(Logs& logs, std::string_view path) {
    for (const Member& member : membersOf(logs))
        if (member.path == path) return member.field;
    return std::nullopt;
}

struct Routine {
    std::string_view path;
    std::size_t arguments;
    std::function<std::optional<std::string>(Logs&, const Arguments&)> run;
};

const std::vector<Routine>& routines() {
    const auto done = [] { return std::optional<std::string>(""); };
    static const std::vector<Routine> rows = {
        {"DebugIt.KillOld", 0,
         [done](Logs& logs, const Arguments&) {
             logs.DebugIt.KillOld();
             return done();
         }},
        {"DebugIt.OutputDebug", 1,
         [done](Logs& logs, const Arguments& a) {
             logs.DebugIt.OutputDebug(a[0]);
             return done();
         }},
        {"RootDebug.Activate", 0,
         [done](Logs& logs, const Arguments&) {
             logs.rootDebug.Activate();
             return done();
         }},
        {"RootDebug.MarkReady", 0,  // the same by its other name
         [done](Logs& logs, const Arguments&) {
             logs.rootDebug.Activate();
             return done();
         }},
        {"RootDebug.LogMessage", 3,
         [done](Logs& logs, const Arguments& a) -> std::optional<std::string> {
             const std::optional<int> level = wholeNumber(a[0]);
             if (!level) return std::nullopt;
             logs.rootDebug.LogMessage(*level, a[1], a[2]);
             return done();
         }},
        {"RootDebug.LogRuntimeError", 4,
         [done](Logs& logs, const Arguments& a) {
             RuntimeFailure failure;
             failure.description = a[3];
             logs.rootDebug.LogRuntimeError(a[0], a[1], a[2], failure);
             return done();
         }},
        {"RootDebug.Push", 3,
         [done](Logs& logs, const Arguments& a) {
             logs.rootDebug.Push(a[0], a[1], a[2]);
             return done();
         }},
        {"RootDebug.PushInfo", 1,
         [done](Logs& logs, const Arguments& a) {
             logs.rootDebug.PushInfo(a[0]);
             return done();
         }},
        {"RootDebug.Pop", 0,
         [done](Logs& logs, const Arguments&) {
             logs.rootDebug.Pop();
             return done();
         }},
        {"RootDebug.GetLevelText", 1,
         [](Logs&, const Arguments& a) -> std::optional<std::string> {
             const std::optional<int> level = wholeNumber(a[0]);
             if (!level) return std::nullopt;
             return RootDebug::GetLevelText(*level);
         }},
    };
    return rows;
}

}  // namespace

bool namesALog(std::string_view path) {
    return startsWith(path, "RootDebug.") || startsWith(path, "DebugIt.");
}

std::optional<std::string> logMember(const Logs& logs, std::string_view path) {
    const std::optional<Field> field = find(const_cast<Logs&>(logs), path);
    if (!field) return std::nullopt;
    if (const auto* flag = std::get_if<bool*>(&*field)) return **flag ? "true" : "false";
    if (const auto* number = std::get_if<std::int32_t*>(&*field)) return std::to_string(**number);
    return *std::get<std::string*>(*field);
}

bool setLogMember(Logs& logs, std::string_view path, const std::string& text) {
    const std::optional<Field> field = find(logs, path);
    if (!field) return false;
    if (auto* const* words = std::get_if<std::string*>(&*field)) {
        **words = text;
        return true;
    }
    const std::string value = lowerCase(trimmed(text));
    if (auto* const* flag = std::get_if<bool*>(&*field)) {
        if (value != "true" && value != "false") return false;
        **flag = value == "true";
        return true;
    }
    // The top of the stack follows the calls; no hand moves it.
    if (path == "RootDebug.CallStackTop") return false;
    const std::optional<int> number = wholeNumber(value);
    if (number) *std::get<std::int32_t*>(*field) = *number;
    return number.has_value();
}

std::optional<std::string> callLog(Logs& logs, std::string_view path,
                                   const std::vector<std::string>& arguments) {
    for (const Routine& row : routines())
        if (row.path == path && row.arguments == arguments.size()) return row.run(logs, arguments);
    return std::nullopt;
}

std::optional<std::vector<std::string>> splitArguments(std::string_view text) {
    constexpr std::string_view kBetween = " \t,";
    std::vector<std::string> arguments;
    for (;;) {
        text.remove_prefix(std::min(text.find_first_not_of(kBetween), text.size()));
        if (text.empty()) return arguments;
        std::string argument;
        if (text.front() != '"') {
            const auto end = std::min(text.find_first_of(kBetween), text.size());
            argument = text.substr(0, end);
            text.remove_prefix(end);
        } else {
            text.remove_prefix(1);
            for (;;) {
                const auto quote = text.find('"');
                if (quote == std::string_view::npos) return std::nullopt;
                argument += text.substr(0, quote);
                text.remove_prefix(quote + 1);
                if (text.empty() || text.front() != '"') break;
                argument += '"';
                text.remove_prefix(1);
            }
        }
        arguments.push_back(std::move(argument));
    }
}

}  // namespace zel
