#include "shell/Failures.h"

#include <functional>
#include <string>
#include <utility>
#include <vector>

#include "shell/Logs.h"
#include "support/AtEnd.h"
#include "support/ErrorReport.h"
#include "support/RootDebug.h"
#include "support/RunTimeError.h"

namespace zel {

Failures::Failures(Logs& logs, ErrorReport& report, std::function<void()> end)
    : logs_(logs), report_(report), end_(std::move(end)) {
    handlers_.on(logs_.rootDebug.DisplayError,
                 [this](const RuntimeFailure& failure, const std::vector<std::string>& callers) {
                     if (std::exchange(handling_, true)) return;
                     const AtEnd over([this] { handling_ = false; });
                     report_.DisplayError(failure, callers);
                     finish();
                 });
}

void Failures::handle() {
    const RuntimeFailure failure = currentFailure();
    RootDebug& log = logs_.rootDebug;
    log.FileLogEnabled = true;
    log.FileTimeStamping = true;
    log.LogRuntimeError("ZELRemote", "Program", "EventHandler", failure);
    // Without the window the program ends all the same.
    if (!handling_) finish();
}

void Failures::finish() {
    if (std::exchange(failed_, true)) return;
    end_();
}

}  // namespace zel
