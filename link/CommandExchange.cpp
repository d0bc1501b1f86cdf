#include "link/CommandExchange.h"

#include <algorithm>
#include <cstdint>
#include <iterator>
#include <string>
#include <string_view>

#include "forms/ControllerForm.h"
#include "link/AnswerReader.h"
#include "link/ByteLink.h"
#include "link/InstrumentErrors.h"
#include "link/LinkDelays.h"
#include "link/WireText.h"
#include "link/ZELBas.h"
#include "platform/Clock.h"
#include "platform/MessageBox.h"
#include "platform/Pointer.h"
#include "platform/Session.h"
#include "support/NumberText.h"
#include "support/Text.h"
#include "support/Windows1252.h"

namespace zel {
namespace {

constexpr int kDrainReads = 5;
constexpr int kLongDrainReads = 1001;  // throws away a line that came in late
constexpr int kFirstAnswerMs = 5000;
constexpr int kRetryPauseMs = 50;
constexpr int kValueWaitMs = 250;
constexpr int kValuePollMs = 20;
constexpr int kOwedAnswerMs = 2000;
constexpr int kAfterOwedMs = 50;
constexpr std::string_view kSweepTimeSetting = "SWPTIME,";
constexpr int kFarewellMs = 500;  // for each of its answers

constexpr std::string_view kHarmlessCommands[] = {"WAIT", "INIT", "REMOTE", "LOCAL"};

bool changesSettings(const std::string& command) {
    return std::find(std::begin(kHarmlessCommands), std::end(kHarmlessCommands), command) ==
           std::end(kHarmlessCommands);
}

}  // namespace

int statusNumber(const std::string& answer) {
    const double number = leadingNumber(answer);
    return number > -32768 && number < 32768 ? static_cast<int>(number) : 0;
}

std::string elapsedSecondsText(const Clock& clock, float t0) {
    const float seconds = static_cast<float>(clock.secondsOfDay()) - t0;
    return formatPattern(static_cast<double>(seconds), "0.00");
}

CommandExchange::CommandExchange(ControllerForm& panel, ZELBas& state, ByteLink& link,
                                 AnswerReader& reader, const Session& session)
    : panel_(panel), state_(state), link_(link), reader_(reader), session_(session) {}

void CommandExchange::beginLine(const char* kind, const std::string& text, float& t0) {
    session_.DebugLine(std::string(kind) + " <" + text + "> starting");
    t0 = static_cast<float>(session_.clock.secondsOfDay());
    settleOwedAnswer();
    state_.InputBuffer.clear();
}

void CommandExchange::settleOwedAnswer() {
    if (!state_.BareCrFirst || !link_.usable()) return;
    state_.BareCrFirst = false;
    link_.takeBytes();
    link_.WriteToLink("\r");
    reader_.awaitQuietly(kOwedAnswerMs);
    // The answer that was owed may come with the one to the CR.
    session_.events.sleep(kAfterOwedMs);
    link_.takeBytes();
    state_.AnswerOverdue = true;  // of a long sweep, or over a slow line
}

void CommandExchange::leaveWait(int graceMs) {
    state_.leaveWait(session_.clock.micros() + std::int64_t{graceMs} * 1000);
}

void CommandExchange::sayLocal() {
    const bool inTheMiddle = busy() || state_.BareCrFirst;
    const DialogueScope scope(state_);
    for (const char* line : {"\r", "cmd\r", "LOCAL\r"}) {
        if (!link_.usable()) return;
        if (line[0] == '\r' && !inTheMiddle) continue;
        link_.takeBytes();
        link_.WriteToLink(line);
        reader_.awaitQuietly(kFarewellMs);
    }
}

void CommandExchange::finishLine(const char* kind, const std::string& text, float t0) {
    session_.DebugLine(std::string(kind) + " <" + text + "> finished (" +
                       elapsedSecondsText(session_.clock, t0) + " s)");
}

void CommandExchange::delay(DelayPlace place) {
    if (const int ms = linkDelay(place, panel_.ConnectionState)) session_.events.sleep(ms);
}

void CommandExchange::report(int status, const std::string& keyword) {
    ReportInstrumentError(state_, session_.boxes, status, keyword);
}

bool CommandExchange::finishCommand(const std::string& keyword, const std::string& firstAnswer,
                                    int status, float t0) {
    session_.DebugLine("<" + keyword + "> response: " + fromWindows1252(firstAnswer));
    if (status == 2) {
        report(status, keyword);
    } else if (status != 0) {
        session_.DebugLine("CMD error" + numberText(status) + " for command <" + keyword +
                           "> (while executing)");
    }
    finishLine("CMD", keyword, t0);
    return status == 0;
}

bool CommandExchange::refuseCommand(const std::string& keyword, int status, float t0) {
    report(status, keyword);
    finishLine("CMD", keyword, t0);
    return false;
}

bool CommandExchange::CmdInstrument(const std::string& keyword) {
    const DialogueScope scope(state_);
    if (!sendable(keyword, session_.boxes)) return false;
    if (changesSettings(keyword)) SettingBegins();
    float t0 = 0;
    beginLine("CMD", keyword, t0);
    link_.drain(kDrainReads);
    link_.WriteToLink("cmd\r");
    delay(DelayPlace::AfterModeWord);
    const Stopwatch firstAnswer(session_.clock);
    std::string answer = reader_.ReadModeStatus();
    const auto over = [this] {
        return (link_.isTcp() && !link_.usable()) || state_.mustLeave(session_.clock.micros());
    };
    while (answer.empty() && firstAnswer.Elapsed() <= kFirstAnswerMs && !over()) {
        session_.events.wait(kRetryPauseMs);
        answer = reader_.ReadModeStatus();
    }
    if (!reader_.answered()) return false;
    const int status = statusNumber(answer);
    if (status != 0) return refuseCommand(keyword, status, t0);
    link_.WriteToLink(keyword + "\r");
    state_.WaitCommandActive = keyword == "WAIT";
    delay(DelayPlace::AfterCmdKeyword);
    const int result = statusNumber(reader_.ReadAnswer());
    return reader_.answered() && finishCommand(keyword, answer, result, t0);
}

bool CommandExchange::CmdInstrumentTriggered(const std::string& keyword,
                                             std::int32_t timeoutSeconds) {
    const DialogueScope scope(state_);
    const Hourglass busy(panel_, session_.events);
    return triggeredDialogue(keyword, timeoutSeconds);
}

bool CommandExchange::triggeredDialogue(const std::string& keyword, std::int32_t timeoutSeconds) {
    float t0 = 0;
    beginLine("CMD", keyword, t0);
    link_.WriteToLink("cmd\r");
    delay(DelayPlace::AfterModeWord);
    const std::string answer = reader_.ReadAnswerTriggered(timeoutSeconds);
    if (!reader_.answered()) return false;
    const int status = answer.empty() ? -1 : statusNumber(answer);
    if (status != 0) return refuseCommand(keyword, status, t0);
    link_.WriteToLink(keyword + "\r");
    delay(DelayPlace::AfterCmdKeyword);
    const int result = statusNumber(reader_.ReadAnswerTriggered(timeoutSeconds));
    return reader_.answered() && finishCommand(keyword, answer, result, t0);
}

bool CommandExchange::SetInstrument(const std::string& keywordAndValue) {
    const DialogueScope scope(state_);
    if (!sendable(keywordAndValue, session_.boxes)) return false;
    SettingBegins();
    float t0 = 0;
    beginLine("SET", keywordAndValue, t0);
    link_.drain(kDrainReads);
    link_.WriteToLink("set\r");
    delay(DelayPlace::AfterModeWord);
    int status = statusNumber(reader_.ReadModeStatus());
    if (!reader_.answered()) return false;
    if (status != 0) {
        report(status, keywordAndValue);
        finishLine("SET", keywordAndValue, t0);
        return false;
    }
    link_.WriteToLink(keywordAndValue + "\r");
    delay(DelayPlace::AfterSetKeyword);
    status = statusNumber(reader_.ReadAnswer());
    if (!reader_.answered()) return false;
    session_.DebugLine("<" + keywordAndValue + "> response: " + numberText(status));
    if (status != 0) {
        SettingRefused(status);
        report(status, keywordAndValue);
    }
    if (status == 0 && startsWith(keywordAndValue, kSweepTimeSetting))
        state_.SweepTimeTold = leadingNumber(keywordAndValue.substr(kSweepTimeSetting.size()));
    finishLine("SET", keywordAndValue, t0);
    return status == 0;
}

bool CommandExchange::GetInstrument(const std::string& keyword, std::string& value) {
    const DialogueScope scope(state_);
    if (!sendable(keyword, session_.boxes)) return false;
    float t0 = 0;
    beginLine("GET", keyword, t0);
    link_.drain(kDrainReads);
    link_.WriteToLink("GET\r");
    delay(DelayPlace::AfterModeWord);
    int status = statusNumber(reader_.ReadModeStatus());
    if (!reader_.answered()) return false;
    if (status != 0) {
        session_.boxes.show(
            {BoxIcon::Information,
             "GET error" + numberText(status) + " for command <" + keyword + "> (while starting)"});
        report(status, keyword);
        finishLine("GET", keyword, t0);
        return false;
    }
    if (!link_.isTcp()) link_.drain(kLongDrainReads);
    link_.WriteToLink(keyword + "\r");
    delay(DelayPlace::AfterGetKeyword);
    status = statusNumber(reader_.ReadAnswer().substr(0, 1));
    if (!reader_.answered()) return false;
    if (status != 0) {
        report(status, keyword);
        finishLine("GET", keyword, t0);
        return false;
    }
    delay(DelayPlace::BetweenStatusAndValue);
    std::string answer;
    if (!readValue(answer)) return false;
    value = fromWindows1252(answer);
    if (keyword == "SWPTIME") state_.SweepTimeTold = leadingNumber(value);
    session_.DebugLine("<" + keyword + "> response: " + value);
    finishLine("GET", keyword, t0);
    Answered(keyword, value);
    return true;
}

bool CommandExchange::readValue(std::string& value) {
    if (!link_.isTcp()) {
        value = reader_.ReadAnswer();
        return reader_.answered();
    }
    // On TCP the value came in one packet with the status line, and a read would throw it away.
    Stopwatch waited(session_.clock);
    auto end = state_.InputBuffer.find('\r');
    while (end == std::string::npos && waited.Elapsed() <= kValueWaitMs && link_.usable()) {
        session_.events.wait(kValuePollMs);
        state_.InputBuffer += link_.takeBytes();
        end = state_.InputBuffer.find('\r');
    }
    if (end == std::string::npos) {
        state_.AnswerOverdue = true;
        return false;
    }
    value = state_.InputBuffer.substr(0, end);
    return true;
}

}  // namespace zel
