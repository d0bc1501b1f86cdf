#pragma once
// The instrument's line protocol: commands, settings and queries, each a dialogue of two steps.

#include <cstdint>
#include <string>

#include "forms/ControllerForm.h"
#include "link/AnswerReader.h"
#include "link/ByteLink.h"
#include "link/LinkDelays.h"
#include "link/ZELBas.h"
#include "platform/Clock.h"
#include "platform/Event.h"
#include "platform/Session.h"

namespace zel {

/// A line ends with CR. The mode word goes first ("cmd", "set", "GET"), the instrument answers a
/// status digit, then the keyword goes, and a second status comes; a query's value follows it.
/// All results are true on success. Failures are reported to the user here, nobody else has to.
class CommandExchange {
  public:
    CommandExchange(ControllerForm& panel, ZELBas& state, ByteLink& link, AnswerReader& reader,
                    const Session& session);

    /// Carries out a keyword that needs no value. After "WAIT" the time-out of every read follows
    /// the sweep time, until the next command.
    bool CmdInstrument(const std::string& keyword);
    /// The same, for an exchange that ends when an external trigger fires.
    bool CmdInstrumentTriggered(const std::string& keyword, std::int32_t timeoutSeconds);
    /// Changes a setting: keyword, comma, value.
    bool SetInstrument(const std::string& keywordAndValue);
    /// Reads a value; left as it was on failure. An empty answer is a success.
    bool GetInstrument(const std::string& keyword, std::string& value);
    /// A setting or a command that may change one goes out next: not WAIT, INIT, REMOTE, LOCAL.
    Event<> SettingBegins;
    /// The instrument did not take a setting: the digit of its answer. Before the box that says so.
    Event<int> SettingRefused;
    /// A query has succeeded: its keyword and its value, whoever asked.
    Event<const std::string&, const std::string&> Answered;
    /// A dialogue is under way further up the stack, and only lets events run: the line is taken.
    bool busy() const { return state_.DialoguesUnderWay > 0; }
    /// The user does not wait any longer for what is under way; an answer that comes within
    /// `graceMs` milliseconds still counts. The next exchange sends a bare CR first.
    void leaveWait(int graceMs);
    /// LOCAL as the last word of a program that ends at once: at most about 1.5 s, and nothing is
    /// reported.
    void sayLocal();
    /// For a loop of exchanges, before its next round: what waits for its turn has it now.
    void giveTurn() { state_.TurnGiven(); }
    /// The line is taken for as long as the result lives: a cycle of several exchanges.
    DialogueScope hold() { return DialogueScope(state_); }
    /// The last read of a line failed, or the link is gone: loops end.
    bool ExchangeFailed() const { return state_.ExchangeFailed; }
    /// The next exchange starts as if none had failed before.
    void forgetFailure() { state_.ExchangeFailed = false; }

  private:
    void beginLine(const char* kind, const std::string& text, float& t0);
    void finishLine(const char* kind, const std::string& text, float t0);
    void delay(DelayPlace place);
    void settleOwedAnswer();
    void report(int status, const std::string& keyword);
    bool triggeredDialogue(const std::string& keyword, std::int32_t timeoutSeconds);
    bool refuseCommand(const std::string& keyword, int status, float t0);
    bool finishCommand(const std::string& keyword, const std::string& firstAnswer, int status,
                       float t0);
    bool readValue(std::string& value);

    ControllerForm& panel_;
    ZELBas& state_;
    ByteLink& link_;
    AnswerReader& reader_;
    Session session_;
};

/// The number that a status line starts with; junk gives 0.
int statusNumber(const std::string& answer);
/// "0.02": the seconds of the day since `t0`, negative when midnight lies between.
std::string elapsedSecondsText(const Clock& clock, float t0);

}  // namespace zel
