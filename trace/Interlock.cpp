#include "trace/Interlock.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <functional>
#include <initializer_list>
#include <string>
#include <utility>
#include <vector>

#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "link/ZELBas.h"
#include "platform/Form.h"
#include "platform/MessageBox.h"
#include "platform/Pointer.h"
#include "platform/Session.h"

namespace zel {
namespace {

constexpr std::size_t kMostWaiting = 64;
/// Places that stand for runs of scripts, one inside the wait of another.
constexpr std::array<char, 64> kRuns{};

struct Words {
    Interlock::Rule rule;
    BoxIcon icon;
    const char* text;
};
using Rule = Interlock::Rule;
constexpr Words kWords[] = {
    {Rule::Connected, BoxIcon::Information, "Please connect to the intrument first."},
    {Rule::ConnectedBySend, BoxIcon::Information, "Please connect to the instrument first."},
    {Rule::NoContinuousView, BoxIcon::Exclamation,
     "Please exit the continuous View Mode first\r\n"
     "Use the red stop button in the upper right corner."},
    {Rule::NoViewToEndFor, BoxIcon::Warning,
     "Please exit the Continunous View Mode first\r\n"
     "Use the red stop button in the upper right corner."},
    {Rule::NoViewForFile, BoxIcon::Information, "Please exit the continuous View Mode first"},
    {Rule::NoRecordingForFile, BoxIcon::Information, "Please stop the recording first"},
    {Rule::NoPowerSensor, BoxIcon::Information, "Please exit the Power Sensor Mode first."},
};

}  // namespace

Interlock::Interlock(Forms& forms, ZELBas& state, const Session& session)
    : forms_(forms), panel_(forms.controller), state_(state), session_(session) {
    ControllerForm& p = panel_;
    rule({&p.MarkPkButton, &p.NextPeakButton, &p.MinPeakButton, &p.MarkToCentButton,
          &p.MarkToRefButton, &p.OnOffButton, &p.LocalButton},
         {Rule::Connected, Rule::NoContinuousView});
    for (int i = 0; i < p.SoftKey.count(); ++i)
        rule({&p.SoftKey(i)}, {Rule::Connected, Rule::NoContinuousView});
    rule({&p.SendButton}, {Rule::ConnectedBySend, Rule::NoContinuousView});
    rule({&p.SpanButton, &p.AmplitudeButton, &p.BWButton, &p.SweepButton, &p.TraceButton,
          &p.MeasButton},
         {Rule::NoPowerSensor});
    rule({&p.MarkerButton}, {Rule::NoPowerSensor, Rule::NoContinuousView});
    rule({&p.AnalyzerButton, &p.TrackButton, &p.TrackButton1, &p.PwrButton, &p.ChnPwrButton,
          &p.OccBWButton, &p.TDMAButton, &p.DistFaultButton, &p.ResetButton},
         {Rule::NoContinuousView});
    // Their handlers refuse by the step at hand; here it only counts that they do.
    for (int i = 0; i < p.SoftTextBox.count(); ++i)
        rule({&p.SoftTextBox(i), &p.ChoiceBox(i)}, {Rule::Connected, Rule::NoContinuousView});
    rule({&p.MarkerCheckBox, &p.DeltaCheckBox}, {Rule::NoPowerSensor, Rule::NoContinuousView});
    rule({&p.ManualCommandText, &p.AnalyzerCheck, &p.TrackingGenCheck, &p.PowerSensorCheck,
          &p.ChannelPowerCheck, &p.OccBWCheck, &p.TDMAPowerCheck, &p.DistFaultCheck},
         {Rule::NoContinuousView});
    rule({&p.LoadData}, {Rule::NoViewForFile, Rule::NoRecordingForFile});
    for (int i = 0; i < p.RecentFile.count(); ++i)
        rule({&p.RecentFile(i)}, {Rule::NoViewForFile, Rule::NoRecordingForFile});
    rule({&p.PlaybackBack, &p.PlaybackPlay, &p.PlaybackForward, &p.PlaybackPosition},
         {Rule::NoViewForFile, Rule::NoRecordingForFile});
    rule({&p.Disconnect, &forms.main.DisconnectButton, &forms.main.DisconnectButton2},
         {Rule::NoViewToEndFor});

    always_ = {&p.StopButton, &p.ExitObject, &forms.main.CancelButton, &forms.main.CancelConnButton,
               &forms.main.CancelConnButton1, &forms.tcpConnection.QuitTCPButton,
               &forms.specialMeas.sldSpeed, &p.cmd3D, &p.SpectrogramShow, &p.SpectrogramPause,
               // A script runs for hours, and its window knows what it may do meanwhile.
               &forms.specialMeas.cmdStop, &forms.specialMeas.cmdNext,
               &forms.specialMeas.cmdExecute, &forms.specialMeas.cmdCancel,
               &forms.specialMeas.chkStep, &forms.specialMeas.chkSave,
               &forms.specialMeas.chkWaterfall, &forms.specialMeas.chkGetSweep,
               &forms.specialMeas.cmdSave, &forms.std.cmdStop};
    playback_ = {&p.PlaybackBack,   &p.PlaybackPlay,     &p.PlaybackForward, &p.PlaybackPosition,
                 &p.PlaybackRepeat, &p.PlaybackRealTime, &p.PlaybackClose,   &p.cmdZoom};
    quietInView_ = {&p.FrequencyButton, &p.SpanButton,  &p.AmplitudeButton, &p.BWButton,
                    &p.SweepButton,     &p.TraceButton, &p.MeasButton};
    silent_ = {&p.GetOption,
               &p.SetOption,
               &p.HelpHelp,
               &p.HelpAbout,
               &p.UtilityGraphSettings,
               &p.UtilityStartup,
               &p.UtilityTrouble,
               &p.DelLogFile,
               &p.MenuFileSaveImage,
               &p.cmdZoom,
               &p.cmd3D,
               &p.PlaybackBack,
               &p.PlaybackPlay,
               &p.PlaybackForward,
               &p.PlaybackPosition,
               &p.PlaybackRepeat,
               &p.PlaybackRealTime,
               &p.PlaybackClose,
               &forms.time.CancelTimeButton};
    handlers_.on(state_.LineFree, [this] { scheduleWaiting(); });
    handlers_.on(state_.TurnGiven, [this] { runWaiting(); });
    // A form that is closed and shown again begins again.
    for (Form* form : forms_.all()) {
        handlers_.on(form->Changed, [this, form] {
            if (form->Modal && form->Visible) return;
            for (States& states : known_) states.erase(form);
        });
    }
}

Interlock::~Interlock() {
    if (scheduled_) session_.events.cancel(task_);
}

void Interlock::rule(std::initializer_list<const Control*> controls,
                     std::initializer_list<Rule> rules) {
    for (const Control* control : controls) rules_[control] = rules;
}

bool Interlock::met(Rule rule) const {
    switch (rule) {
        case Rule::Connected:
        case Rule::ConnectedBySend:
            return panel_.isConnected;
        case Rule::NoContinuousView:
        case Rule::NoViewToEndFor:
            return !panel_.ContinuosLoopActive;
        case Rule::NoViewForFile:
            // Between two passes the view runs as well.
            return !panel_.ContinuosLoopActive &&
                   !(panel_.AcquisitionRunning && panel_.STOPFlag && !panel_.RecordDataFlag);
        case Rule::NoRecordingForFile:
            return !panel_.RecordDataFlag && !forms_.time.ContinuousRecording;
        case Rule::NoPowerSensor:
            return panel_.InstrumentMode != ControllerForm::POWERSENSOR;
    }
    return true;
}

bool Interlock::refuses(Rule rule) const {
    if (met(rule)) return false;
    for (const Words& words : kWords)
        if (words.rule == rule) session_.boxes.show({words.icon, words.text});
    return true;
}

bool Interlock::refuses(const Control& control) const {
    const auto found = rules_.find(&control);
    return found != rules_.end() && std::any_of(found->second.begin(), found->second.end(),
                                                [this](Rule rule) { return refuses(rule); });
}

std::string Interlock::reasonAgainst(const Control& control) const {
    const auto found = rules_.find(&control);
    if (found == rules_.end()) return {};
    for (const Rule rule : found->second) {
        if (met(rule)) continue;
        for (const Words& words : kWords)
            if (words.rule == rule) return words.text;
    }
    return {};
}

bool Interlock::anyUnmet(const Control& control) const {
    const auto found = rules_.find(&control);
    return found != rules_.end() && std::any_of(found->second.begin(), found->second.end(),
                                                [this](Rule rule) { return !met(rule); });
}

bool Interlock::talks(const Control& control) const {
    if (silent_.contains(&control)) return false;
    const Form& form = control.form();
    return &form == &panel_ || &form == &forms_.main || &form == &forms_.tcpConnection ||
           &form == &forms_.time || &form == &forms_.specialMeas || &form == &forms_.devicesChoice;
}

Interlock::Turn Interlock::turnOf(const Control& control) const {
    // What only looks at sweeps that have come disturbs nothing.
    if (always_.contains(&control) || &control.form() == &forms_.waterfall) return Turn::Now;
    if (state_.Ending) return Turn::Never;
    // The loop that plays a recording has the line free and waits for these.
    if (panel_.SeriesPlays && playback_.contains(&control)) return Turn::Now;
    if (anyUnmet(control)) return Turn::Now;  // it refuses by itself, in words
    if (std::find(running_.begin(), running_.end(), &control) != running_.end()) return Turn::Never;
    // While the view runs, a hard key lays out its menu and asks nothing.
    if (panel_.ContinuosLoopActive && quietInView_.contains(&control)) return Turn::Now;
    if (state_.DialoguesUnderWay > 0) return talks(control) ? Turn::Later : Turn::Now;
    if (panel_.ContinuosLoopActive) return Turn::Now;
    const bool busy = panel_.MousePointer == kHourglass || panel_.AcquisitionRunning ||
                      forms_.main.MousePointer == kHourglass;
    return busy ? Turn::Never : Turn::Now;
}

bool Interlock::perform(const Control& control, std::function<void()> act) {
    switch (turnOf(control)) {
        case Turn::Now:
            run({&control, std::move(act)});
            return true;
        case Turn::Later:
            if (waiting_.size() >= kMostWaiting) return false;
            waiting_.push_back({&control, std::move(act)});
            return true;
        case Turn::Never:
            break;
    }
    return false;
}

void Interlock::run(const Act& act) {
    struct Running {
        explicit Running(std::vector<const Control*>& all, const Control* one) : running(all) {
            running.push_back(one);
        }
        ~Running() { running.pop_back(); }
        std::vector<const Control*>& running;
    };
    const Running running(running_, act.control);
    act.run();
}

void Interlock::scheduleWaiting() {
    if (waiting_.empty() || scheduled_) return;
    scheduled_ = true;
    task_ = session_.events.schedule(0, [this] {
        scheduled_ = false;
        runWaiting();
    });
}

void Interlock::runWaiting() {
    while (!waiting_.empty() && state_.DialoguesUnderWay == 0) {
        const Act act = std::move(waiting_.front());
        waiting_.pop_front();
        if (state_.Ending || !act.control->Visible || !act.control->Enabled) continue;
        run(act);
    }
}

bool Interlock::userWorks() const {
    const States states = liveStates();
    if (known_.empty()) return !states.empty();
    const States& before = known_.back();
    return std::any_of(states.begin(), states.end(),
                       [&](const void* state) { return !before.contains(state); });
}

void Interlock::endLiveStates() {
    if (forms_.specialMeas.RunsActive > 0) {
        forms_.specialMeas.cmdStop.Click();
        forms_.specialMeas.ReleaseWait();
    }
    if (forms_.main.Dialling) forms_.main.CancelButton.Click();
    if (forms_.tcpConnection.Connecting) forms_.tcpConnection.QuitTCPButton.Click();
    if (forms_.devicesChoice.Configuring) forms_.devicesChoice.CloseDevicesButton.Click();
    for (Form* form : forms_.all())
        if (form->Modal && form->Visible) form->Hide();
    if (panel_.STOPFlag || panel_.ContinuosLoopActive || forms_.time.ContinuousRecording)
        panel_.StopButton.Click();
}

Interlock::States Interlock::liveStates() const {
    States states;
    for (const Form* form : forms_.all())
        if (form->Modal && form->Visible) states.insert(form);
    // What is dialled, connected or looked for can be left.
    for (const bool* attempt : {&forms_.main.Dialling, &forms_.tcpConnection.Connecting,
                                &forms_.server.ServerConnecting, &forms_.devicesChoice.Configuring})
        if (*attempt) states.insert(attempt);
    if (panel_.STOPFlag || panel_.ContinuosLoopActive) states.insert(&panel_.STOPFlag);
    // A run may begin inside the wait of one that was stopped, and is a state of its own.
    const auto runs = static_cast<std::size_t>(std::max<int>(forms_.specialMeas.RunsActive, 0));
    for (std::size_t i = 0; i < std::min(runs, kRuns.size()); ++i) states.insert(&kRuns.at(i));
    if (forms_.time.ContinuousRecording) states.insert(&forms_.time.ContinuousRecording);
    return states;
}

}  // namespace zel
