#pragma once
// Reads the instrument's answer lines, with the time-outs of the line and what they lead to.

#include <cstdint>
#include <string>

#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "forms/MainForm.h"
#include "link/ByteLink.h"
#include "link/WaitNotice.h"
#include "link/ZELBas.h"
#include "platform/Clock.h"
#include "platform/Event.h"
#include "platform/Session.h"

namespace zel {

/// True for a text that can be an answer: below three characters only digits and the punctuation
/// below them, and never a character with the top bit set, which is noise of a wrong baud rate.
bool IsPrintableAnswer(const std::string& text);

class AnswerReader {
  public:
    AnswerReader(Forms& forms, ZELBas& state, ByteLink& link, const Session& session);

    /// One line without its CR, or the empty text. A silence in session sets `ExchangeFailed`
    /// and reports "No response received!" once; while connecting it takes the connection down.
    std::string ReadAnswer();
    /// The status of a mode word. In session a line that is no status is left over from something
    /// before it, such as the rest of a transfer that was longer than asked for: the last status
    /// that comes before a silence counts. Where none comes the line stands as it is.
    std::string ReadModeStatus();
    /// The same as `ReadAnswer` with the caller's time-out in seconds, for an exchange that a
    /// trigger ends.
    std::string ReadAnswerTriggered(std::int32_t timeoutSeconds);
    /// Takes a line that the instrument owes, or waits that long; nothing is reported.
    void awaitQuietly(int timeoutMs);

    /// A silence has ended the attempt to connect, which was reported as far as it had to be. Who
    /// owns the connection takes it down.
    Event<> AttemptAbandoned;

    /// The last read found a line, be it an empty one.
    bool answered() const { return answered_; }
    /// The last read reported the user that no instrument was found.
    bool absenceTold() const { return absenceTold_; }

  private:
    std::string read(std::int64_t timeoutMs, const char* silenceText, bool quietWhenFailed);
    void judgeNoise();
    void giveUpConnecting();
    void leave();
    std::string lastOfAll(std::string answer);
    void takeConnectionDown();

    ControllerForm& panel_;
    MainForm& dialog_;
    ZELBas& state_;
    ByteLink& link_;
    Session session_;
    WaitNotice notice_;
    Stopwatch StopwatchA_;
    Stopwatch sinceGrowth_;
    bool answered_ = false;
    bool absenceTold_ = false;
    bool noiseTold_ = false;
};

}  // namespace zel
