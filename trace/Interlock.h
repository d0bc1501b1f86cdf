#pragma once
// Who may act when: the rules of the panel in one place, for its handlers and for every front.

#include <cstddef>
#include <cstdint>
#include <deque>
#include <functional>
#include <initializer_list>
#include <map>
#include <set>
#include <string>
#include <vector>

#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "link/ZELBas.h"
#include "platform/Event.h"
#include "platform/Events.h"
#include "platform/Form.h"
#include "platform/Session.h"

namespace zel {

/// A control acts at once, or after the exchange under way, or not at all. No exchange begins
/// inside another: their words would mix on the wire.
class Interlock {
  public:
    /// What must be so before a handler acts. Each has its words.
    enum class Rule : std::uint8_t {
        Connected,         ///< "Please connect to the intrument first."
        ConnectedBySend,   ///< the same as the manual line spells it
        NoContinuousView,  ///< in the words of the panel
        NoViewToEndFor,    ///< in the words of a disconnection
        NoViewForFile,     ///< in the words of a file that would load
        NoRecordingForFile,
        NoPowerSensor,
    };
    enum class Turn : std::uint8_t {
        Now,
        Later,  ///< it would begin an exchange inside another
        Never,  ///< the work under way must not be disturbed: what the user does is dropped
    };

    Interlock(Forms& forms, ZELBas& state, const Session& session);
    ~Interlock();
    Interlock(const Interlock&) = delete;
    Interlock& operator=(const Interlock&) = delete;

    /// True, with the words of the rule shown, while it is not met.
    bool refuses(Rule rule) const;
    /// The same for all rules of a control, in their order: one box.
    bool refuses(const Control& control) const;

    /// The words in which a control would refuse at this moment; empty while it would act.
    std::string reasonAgainst(const Control& control) const;

    /// For what a user does to a control at this moment.
    Turn turnOf(const Control& control) const;
    /// Runs the act of a user now or when its turn comes; then a control that is hidden or
    /// disabled by that time does nothing. False when it was dropped.
    bool perform(const Control& control, std::function<void()> act);
    /// Acts that wait for their turn.
    std::size_t waiting() const { return waiting_.size(); }

    /// A front that works the panel by commands: a state that was there when a command began
    /// belongs to the command around it, and inside of its own exchanges it is not disturbed.
    void beginCommand() { known_.push_back(liveStates()); }
    void endCommand() { known_.pop_back(); }
    /// A modal form, a view, a recording or a script has begun since the innermost command did, so
    /// that a user goes on working although that command has not come back.
    bool userWorks() const;
    /// Closes modal forms and stops what runs.
    void endLiveStates();

    const Session& session() const { return session_; }

  private:
    struct Act {
        const Control* control;
        std::function<void()> run;
    };
    using States = std::set<const void*>;

    void rule(std::initializer_list<const Control*> controls, std::initializer_list<Rule> rules);
    bool met(Rule rule) const;
    bool anyUnmet(const Control& control) const;
    bool talks(const Control& control) const;
    States liveStates() const;
    void run(const Act& act);
    void scheduleWaiting();
    void runWaiting();

    Forms& forms_;
    ControllerForm& panel_;
    ZELBas& state_;
    Session session_;
    std::map<const Control*, std::vector<Rule>> rules_;
    std::set<const Control*> always_;       ///< stop, end or adjust what runs
    std::set<const Control*> silent_;       ///< begin no exchange
    std::set<const Control*> playback_;     ///< act while a recording plays
    std::set<const Control*> quietInView_;  ///< begin none while the continuous view runs
    std::deque<Act> waiting_;
    std::vector<const Control*> running_;
    std::vector<States> known_;
    TaskId task_ = 0;
    bool scheduled_ = false;
    Handlers handlers_;
};

}  // namespace zel
