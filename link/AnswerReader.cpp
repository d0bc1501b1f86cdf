#include "link/AnswerReader.h"

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <string>
#include <utility>

#include "forms/Forms.h"
#include "link/ByteLink.h"
#include "link/WaitNotice.h"
#include "link/ZELBas.h"
#include "platform/MessageBox.h"
#include "platform/Pointer.h"
#include "platform/Session.h"
#include "support/Text.h"
#include "support/Windows1252.h"

namespace zel {
namespace {

constexpr double kDirectTimeoutS = 9;
constexpr double kOtherTimeoutS = 16;
constexpr double kLongestTimeoutS = 86400;  // a sweep time that makes no sense ends as well
constexpr int kPollMs = 20;
// The answer that is due follows a late one at once; the line is silent this long after it.
constexpr int kSilenceMs = 250;
constexpr int kLongestWaitForSilenceMs = 2500;
constexpr int kSettledMs = 20;  // a text that grew later than this is not judged yet
// An answer line is far shorter; noise without a CR must not grow for ever.
constexpr std::size_t kLongestAnswer = 65536;

}  // namespace

bool IsPrintableAnswer(const std::string& text) {
    const bool isShort = text.size() < 3;
    return std::none_of(text.begin(), text.end(), [isShort](char character) {
        const auto code = static_cast<unsigned char>(character);
        return code >= 128 || (code >= 58 && isShort);
    });
}

AnswerReader::AnswerReader(Forms& forms, ZELBas& state, ByteLink& link, const Session& session)
    : panel_(forms.controller),
      dialog_(forms.main),
      state_(state),
      link_(link),
      session_(session),
      notice_(forms),
      StopwatchA_(session.clock),
      sinceGrowth_(session.clock) {}

std::string AnswerReader::ReadAnswer() {
    double timeout =
        panel_.ConnectionState == ControllerForm::DIRECTCON ? kDirectTimeoutS : kOtherTimeoutS;
    if (state_.WaitCommandActive) timeout = std::nearbyint(timeout + 2 * state_.SweepTimeTold);
    timeout = std::clamp(timeout, 0.0, kLongestTimeoutS);
    return read(static_cast<std::int64_t>(timeout * 1000), "No response received!", true);
}

std::string AnswerReader::ReadModeStatus() {
    std::string answer = ReadAnswer();
    const std::string text = trimmed(answer);
    const bool isStatus = text.size() == 1 && isDigit(text.front());
    if (text.empty() || isStatus || !panel_.isConnected) return answer;
    state_.RestFound = true;
    return lastOfAll(answer);
}

std::string AnswerReader::ReadAnswerTriggered(std::int32_t timeoutSeconds) {
    return read(std::int64_t{timeoutSeconds} * 1000, "External trigger timed out!", false);
}

std::string AnswerReader::read(std::int64_t timeoutMs, const char* silenceText,
                               bool quietWhenFailed) {
    answered_ = absenceTold_ = noiseTold_ = false;
    const WaitNotice::Shown shown(notice_);
    if (link_.isTcp()) state_.InputBuffer.clear();
    StopwatchA_.Reset();
    sinceGrowth_.Reset();
    for (;;) {
        if (state_.mustLeave(session_.clock.micros())) {
            leave();
            return "";
        }
        if (!link_.usable()) {
            // A view that has lost its line says so once.
            const bool told = panel_.ContinuosLoopActive && state_.ExchangeFailed;
            if (link_.isTcp()) {
                link_.tellLoss();
                if (!panel_.isConnected) takeConnectionDown();
            } else if (!state_.DialCancelled && !told && !saysLossInTheBar(panel_)) {
                std::string text = "Port not open!";
                if (!link_.problem().empty()) text += kCrLf + link_.problem();
                session_.boxes.show({BoxIcon::Critical, text});
            }
            state_.ExchangeFailed = true;
            return "";
        }
        const std::string arrived = link_.ReadFromLink(true);
        if (!arrived.empty()) {
            state_.InputBuffer += arrived;
            sinceGrowth_.Reset();
        }
        judgeNoise();
        const auto end = state_.InputBuffer.find('\r');
        if (end != std::string::npos) {
            session_.events.pump();
            std::string answer = state_.InputBuffer.substr(0, end);
            state_.InputBuffer.erase(0, end + 1);
            if (std::exchange(state_.LateAnswerFirst, false)) answer = lastOfAll(answer);
            state_.ExchangeFailed = false;
            answered_ = true;
            showLinkLost(panel_, false);
            return answer;
        }
        if (state_.InputBuffer.size() > kLongestAnswer) state_.InputBuffer.clear();
        if (StopwatchA_.Elapsed() > timeoutMs) break;
        notice_.tell(StopwatchA_.Elapsed(), timeoutMs);
        session_.events.wait(kPollMs);
    }
    state_.AnswerOverdue = true;
    if (panel_.isConnected) {
        const bool told = quietWhenFailed && state_.ExchangeFailed;
        state_.ExchangeFailed = true;
        if (!told) session_.boxes.show({BoxIcon::Warning, silenceText});
    } else {
        giveUpConnecting();
    }
    return "";
}

/// What came late belongs to the question before: the answer to this one is the last status.
std::string AnswerReader::lastOfAll(std::string answer) {
    const Stopwatch whole(session_.clock);
    Stopwatch silence(session_.clock);
    while (silence.Elapsed() < kSilenceMs && whole.Elapsed() < kLongestWaitForSilenceMs &&
           link_.usable() && !state_.mustLeave(session_.clock.micros())) {
        session_.events.wait(kPollMs);
        const std::string arrived = link_.takeBytes();
        if (arrived.empty()) continue;
        silence.Reset();
        state_.InputBuffer += arrived;
        if (state_.InputBuffer.size() > kLongestAnswer) state_.InputBuffer.clear();
    }
    // The samples of a late transfer have no line end: only the digit before the last one counts.
    const auto end = state_.InputBuffer.rfind('\r');
    if (end != std::string::npos && end > 0) answer = state_.InputBuffer.substr(end - 1, 1);
    state_.InputBuffer.clear();
    return answer;
}

void AnswerReader::leave() {
    state_.ExchangeFailed = true;
    if (state_.Ending) return;
    state_.WaitLeft = true;
    state_.BareCrFirst = true;
    if (panel_.isConnected) return;
    state_.DialCancelled = true;  // the user knows why there is no session
    giveUpConnecting();
}

void AnswerReader::awaitQuietly(int timeoutMs) {
    const Stopwatch waited(session_.clock);
    std::string bytes;
    while (waited.Elapsed() <= timeoutMs && link_.usable()) {
        bytes += link_.takeBytes();
        if (bytes.find('\r') != std::string::npos || bytes.size() > kLongestAnswer) return;
        session_.events.wait(kPollMs);
    }
}

void AnswerReader::judgeNoise() {
    if (panel_.BinaryModeActive || panel_.ErrorFlag || state_.InputBuffer.empty()) return;
    // The first letter of an answer that is still growing is no noise.
    const bool settled =
        state_.InputBuffer.find('\r') != std::string::npos || sinceGrowth_.Elapsed() >= kSettledMs;
    if (!settled || IsPrintableAnswer(state_.InputBuffer)) return;
    session_.boxes.show({BoxIcon::Information,
                         "Incorrect baud rate for the connection!" + std::string(kCrLf) +
                             "Received: " + fromWindows1252(state_.InputBuffer),
                         "Incorrect baud rate"});
    panel_.ErrorFlag = true;
    noiseTold_ = true;
}

void AnswerReader::giveUpConnecting() {
    if (!panel_.ErrorFlag || noiseTold_) {
        if (!state_.DialCancelled) {
            session_.boxes.show({BoxIcon::Critical, "No ZEL3 found at the specified address!"});
            absenceTold_ = true;
        }
        panel_.ErrorFlag = false;
    }
    takeConnectionDown();
}

void AnswerReader::takeConnectionDown() {
    if (panel_.ConnectionState == ControllerForm::DIRECTCON) link_.CloseComPort();
    AttemptAbandoned();
    dialog_.OnPic.Visible = false;
    dialog_.MousePointer = kArrow;
    session_.events.pump();
}

}  // namespace zel
