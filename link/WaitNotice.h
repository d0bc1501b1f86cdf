#pragma once
// Shows that an answer is waited for and how long that may still take, with a key to leave it.

#include <cstdint>
#include <string>

#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "platform/Controls.h"

namespace zel {

/// The panel's wait line and the Stop key, which is on show for the length of the wait; a wait that
/// ends within a second shows neither. While connecting, the line of the dialog has the seconds
/// after the step that stands there: "Port open, waiting for the instrument, 4 of 9 s".
class WaitNotice {
  public:
    explicit WaitNotice(Forms& forms);

    /// `elapsedMs` of at most `timeoutMs` milliseconds have passed.
    void tell(std::int64_t elapsedMs, std::int64_t timeoutMs);
    void clear();

    /// Takes the notice away at the end of a scope.
    class Shown {
      public:
        explicit Shown(WaitNotice& notice) : notice_(notice) {}
        ~Shown() { notice_.clear(); }
        Shown(const Shown&) = delete;
        Shown& operator=(const Shown&) = delete;

      private:
        WaitNotice& notice_;
    };

  private:
    Label& dialogLabel() const;
    void showStep(std::int64_t elapsedMs, std::int64_t timeoutMs);

    Forms& forms_;
    ControllerForm& panel_;
    std::int64_t shownSeconds_ = -1;  ///< that the text names; -1 while nothing is shown
    bool lentStop_ = false;           ///< the Stop key is on show for this wait alone
    std::string step_;                ///< what the dialog's line said before the wait
    bool stepShown_ = false;
};

/// Whether the line of the session has died: the picture of the connection says so.
void showLinkLost(ControllerForm& panel, bool lost);

/// A session whose port has gone is connected again by itself: the bar of the reconnection says so,
/// and no box that somebody would have to close.
bool saysLossInTheBar(const ControllerForm& panel);

/// What an attempt to connect is at, in the line of its dialog.
void showConnectingStep(Forms& forms, const std::string& step);

/// "COM3 at 57600 baud: check that the instrument is on, ...": what to look at when no instrument
/// was found; "host:2277: ..." for a connection over TCP.
std::string connectionAdvice(const Forms& forms);

}  // namespace zel
