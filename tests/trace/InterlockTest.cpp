// Who may act when, and that no exchange begins inside another.

#include <gtest/gtest.h>

#include <string>
#include <utility>
#include <vector>

#include "link/CommandExchange.h"
#include "support/Text.h"
#include "tests/ShownBoxes.h"
#include "tests/trace/ReadCycle.h"
#include "trace/Interlock.h"

namespace zel {
namespace {

using Turn = Interlock::Turn;

struct InterlockTest : ReadCycle {
    Interlock& interlock = program.interlock();
    Texts shown() const { return shownBoxes(boxes); }
    /// A user's click, as a front passes it on.
    template <class T>
    bool click(T& control) {
        return interlock.perform(control, [&control] { control.Click(); });
    }
    void marker(const char* word) {
        cmd(word);
        get("MARK1", "1500000000,-35.2");
    }
};

TEST_F(InterlockTest, ControlsWithoutAnInstrument_RefuseInTheirWords) {
    panel.isConnected = false;
    EXPECT_TRUE(interlock.refuses(panel.MarkPkButton));
    EXPECT_TRUE(interlock.refuses(panel.SendButton));
    EXPECT_EQ(shown(),
              (Texts{"information | ZELRemote | Please connect to the intrument first.",
                     "information | ZELRemote | Please connect to the instrument first."}));
}

TEST_F(InterlockTest, ContinuousView_RefusesInTheWordsOfTheControl) {
    panel.ContinuosLoopActive = true;
    for (const Control* control : {static_cast<const Control*>(&panel.ResetButton),
                                   static_cast<const Control*>(&panel.Disconnect),
                                   static_cast<const Control*>(&panel.LoadData)}) {
        boxes.clear();
        EXPECT_TRUE(interlock.refuses(*control));
        ASSERT_EQ(boxes.boxes().size(), 1U);
        const bool disconnect = control == &panel.Disconnect;
        const char* words = disconnect ? "Please exit the Continunous View Mode first"
                                       : "Please exit the continuous View Mode first";
        EXPECT_EQ(boxes.texts()[0].rfind(words, 0), 0U) << boxes.texts()[0];
        EXPECT_EQ(interlock.turnOf(*control), Turn::Now);  // it refuses by itself
    }
}

TEST_F(InterlockTest, EachControl_RefusesByItsOwnRules) {
    const auto reasons = [this](const Control& control) {
        std::string text;
        const auto add = [&](const char* state) {
            const std::string reason = interlock.reasonAgainst(control);
            if (reason.empty()) return;
            text += std::string(text.empty() ? "" : ", ") + state;
            if (contains(reason, "instrument first")) text += " (instrument)";
            if (contains(reason, "Continunous")) text += " (to end)";
            if (contains(reason, "recording first")) text += " (recording)";
        };
        panel.isConnected = false;
        add("offline");
        panel.isConnected = true;
        panel.ContinuosLoopActive = true;
        add("view");
        panel.ContinuosLoopActive = false;
        panel.AcquisitionRunning = panel.STOPFlag = true;
        add("between passes");
        panel.RecordDataFlag = true;
        add("recording");
        panel.AcquisitionRunning = panel.STOPFlag = panel.RecordDataFlag = false;
        forms.time.ContinuousRecording = true;
        add("interval");
        forms.time.ContinuousRecording = false;
        panel.InstrumentMode = ControllerForm::POWERSENSOR;
        add("sensor");
        panel.InstrumentMode = ControllerForm::ANALYZER;
        return text;
    };
    using All = std::vector<const Control*>;
    All both{&panel.MarkPkButton,     &panel.NextPeakButton,  &panel.MinPeakButton,
             &panel.MarkToCentButton, &panel.MarkToRefButton, &panel.OnOffButton,
             &panel.LocalButton};
    for (int i = 0; i < 5; ++i)
        for (const Control* one :
             All{&panel.SoftKey(i), &panel.SoftTextBox(i), &panel.ChoiceBox(i)})
            both.push_back(one);
    All files{&panel.LoadData, &panel.PlaybackBack, &panel.PlaybackPlay, &panel.PlaybackForward,
              &panel.PlaybackPosition};
    for (int i = 0; i < 8; ++i) files.push_back(&panel.RecentFile(i));
    const std::vector<std::pair<std::string, All>> rows{
        {"offline, view", both},
        {"offline (instrument), view", {&panel.SendButton}},
        {"sensor",
         {&panel.SpanButton, &panel.AmplitudeButton, &panel.BWButton, &panel.SweepButton,
          &panel.TraceButton, &panel.MeasButton}},
        {"view, sensor", {&panel.MarkerButton, &panel.MarkerCheckBox, &panel.DeltaCheckBox}},
        {"view",
         {&panel.AnalyzerButton, &panel.TrackButton, &panel.TrackButton1, &panel.PwrButton,
          &panel.ChnPwrButton, &panel.OccBWButton, &panel.TDMAButton, &panel.DistFaultButton,
          &panel.ResetButton, &panel.ManualCommandText, &panel.AnalyzerCheck,
          &panel.TrackingGenCheck, &panel.PowerSensorCheck, &panel.ChannelPowerCheck,
          &panel.OccBWCheck, &panel.TDMAPowerCheck, &panel.DistFaultCheck}},
        {"view, between passes, recording (recording), interval (recording)", files},
        {"view (to end)",
         {&panel.Disconnect, &forms.main.DisconnectButton, &forms.main.DisconnectButton2}},
        {"", {&panel.FrequencyButton, &panel.PlaySingleButton, &panel.StopButton}},
    };
    for (const auto& [wanted, controls] : rows)
        for (const Control* control : controls)
            EXPECT_EQ(reasons(*control), wanted) << control->name();
}

TEST_F(InterlockTest, WhileARecordingPlays_OnlyItsKeysActInTheBusyProgram) {
    panel.MousePointer = 11;
    EXPECT_EQ(interlock.turnOf(panel.PlaybackPlay), Turn::Never);
    panel.SeriesPlays = true;
    for (const Control* key : std::vector<const Control*>{
             &panel.PlaybackBack, &panel.PlaybackPlay, &panel.PlaybackForward,
             &panel.PlaybackPosition, &panel.PlaybackRepeat, &panel.PlaybackRealTime,
             &panel.PlaybackClose, &panel.cmdZoom})
        EXPECT_EQ(interlock.turnOf(*key), Turn::Now) << key->name();
    EXPECT_EQ(interlock.turnOf(panel.SpanButton), Turn::Never);
}

TEST_F(InterlockTest, ActsThatWait_AreSixtyFourAtMost) {
    const DialogueScope exchange(program.link());
    int taken = 0;
    for (int i = 0; i < 100; ++i) taken += interlock.perform(panel.LocalButton, [] {}) ? 1 : 0;
    EXPECT_EQ(taken, 64);
    EXPECT_EQ(interlock.waiting(), 64U);
}

TEST_F(InterlockTest, FormThatIsShownAgain_IsWorkOfTheUser) {
    EXPECT_FALSE(interlock.userWorks());
    forms.time.Modal = true;
    forms.time.Visible = true;
    EXPECT_TRUE(interlock.userWorks());
    interlock.beginCommand();
    EXPECT_FALSE(interlock.userWorks());
    forms.time.Visible = false;
    forms.time.Visible = true;
    EXPECT_TRUE(interlock.userWorks());
    interlock.endCommand();
}

TEST_F(InterlockTest, EndOfWhatRuns_StopsAScriptAndItsWait) {
    int stops = 0;
    int releases = 0;
    forms.specialMeas.cmdStop.Clicked.connect([&] { ++stops; });
    forms.specialMeas.ReleaseWait.connect([&] { ++releases; });
    interlock.endLiveStates();
    EXPECT_EQ(stops + releases, 0);
    forms.specialMeas.RunsActive = 1;
    interlock.endLiveStates();
    EXPECT_EQ(stops, 1);
    EXPECT_EQ(releases, 1);
    forms.specialMeas.RunsActive = 0;
}

TEST_F(InterlockTest, RuleThatIsMet_ShowsNothing) {
    EXPECT_FALSE(interlock.refuses(panel.MarkPkButton));
    EXPECT_FALSE(interlock.refuses(panel.PlaySingleButton));
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(InterlockTest, ClickInsideAnExchange_WaitsForItsEnd) {
    mirror.Span = 1e6;
    port.expect("GET\r").answer("0\r").after(200);
    port.expect("FREQ\r").answer("0\r1500000000\r");
    marker("MARKPK");
    bool waited = false;
    platform.events.schedule(100, [&] {
        EXPECT_EQ(interlock.turnOf(panel.MarkPkButton), Turn::Later);
        EXPECT_TRUE(click(panel.MarkPkButton));
        waited = interlock.waiting() == 1;
    });
    std::string value;
    EXPECT_TRUE(program.exchange().GetInstrument("FREQ", value));
    EXPECT_TRUE(waited);
    platform.events.runFor(10);
    EXPECT_EQ(interlock.waiting(), 0U);
    EXPECT_NE(panel.MarkerLabel.Caption.get().find("1.5 GHz"), std::string::npos);
    expectPlayed();
}

TEST_F(InterlockTest, ClicksThatWait_ComeInTheirOrder) {
    port.expect("GET\r").answer("0\r").after(200);
    port.expect("FREQ\r").answer("0\r1500000000\r");
    marker("MARKMIN");
    marker("MARKPK");
    platform.events.schedule(100, [&] {
        click(panel.MinPeakButton);
        click(panel.MarkPkButton);
    });
    std::string value;
    program.exchange().GetInstrument("FREQ", value);
    platform.events.runFor(10);
    expectPlayed();
}

TEST_F(InterlockTest, ClickInATickOfTheRecording_WaitsForTheWholeCycle) {
    recordIntoNothing();
    panel.RecordData.Checked = true;
    panel.State = ControllerForm::Freq;
    cmd("INIT");
    askSettings();
    port.expect("cmd\r").answer("0\r");
    port.expect("WAIT\r").answer("0\r").after(300);
    trace(levelBlock(-35250));
    marker("MARKPK");
    panel.SingleSweepModeActive = true;
    forms.time.X.Interval = 1000;
    forms.time.X.Enabled = true;
    platform.events.schedule(1150, [&] { click(panel.MarkPkButton); });
    platform.events.runFor(1900);
    EXPECT_EQ(forms.time.RecordedCount, 1);
    expectPlayed();
}

TEST_F(InterlockTest, TickInsideAnExchange_WaitsForItsEnd) {
    recordIntoNothing();
    panel.RecordData.Checked = true;
    panel.SingleSweepModeActive = true;
    port.expect("GET\r").answer("0\r").after(2000);
    port.expect("RBW\r").answer("0\r4\r");
    cmd("INIT");
    askSettings();
    cmd("WAIT");
    trace(levelBlock(-35250));
    forms.time.X.Interval = 1500;
    forms.time.X.Enabled = true;
    std::string value;
    EXPECT_TRUE(program.exchange().GetInstrument("RBW", value));
    EXPECT_EQ(value, "4");
    platform.events.runFor(300);
    EXPECT_EQ(forms.time.RecordedCount, 1);
    expectPlayed();
}

TEST_F(InterlockTest, Stop_NeverWaits_AndLosesNoOtherClick) {
    port.expect("GET\r").silence();
    platform.events.schedule(100, [&] {
        click(panel.MarkPkButton);
        EXPECT_EQ(interlock.turnOf(panel.StopButton), Turn::Now);
        click(panel.StopButton);
        EXPECT_EQ(interlock.waiting(), 1U);
    });
    port.expect("\r").answer("0\r");  // after the wait that was left
    marker("MARKPK");
    std::string value;
    EXPECT_FALSE(program.exchange().GetInstrument("FREQ", value));
    platform.events.runFor(100);
    expectPlayed();
}

TEST_F(InterlockTest, KeyWhoseHandlerHasNotComeBack_IsDropped) {
    port.expect("cmd\r").answer("0\r").after(500);
    port.expect("MARKPK\r").answer("0\r");
    get("MARK1", "1500000000,-35.2");
    platform.events.schedule(100, [&] { EXPECT_FALSE(click(panel.MarkPkButton)); });
    EXPECT_TRUE(click(panel.MarkPkButton));
    platform.events.runFor(100);
    expectPlayed();
}

TEST_F(InterlockTest, HardKeyInTheContinuousView_LaysOutItsMenuAtOnce) {
    panel.ContinuosLoopActive = true;
    const DialogueScope pass(program.link());
    EXPECT_EQ(interlock.turnOf(panel.SpanButton), Turn::Now);
    EXPECT_EQ(interlock.turnOf(panel.SoftTextBox(0)), Turn::Now);  // refuses an Enter in words
    EXPECT_EQ(interlock.turnOf(panel.MarkerCheckBox), Turn::Now);
    EXPECT_EQ(interlock.turnOf(panel.SaveCurrentView), Turn::Later);
}

TEST_F(InterlockTest, Hourglass_KeepsTheOthersOut) {
    panel.MousePointer = 11;
    EXPECT_EQ(interlock.turnOf(panel.SpanButton), Turn::Never);
    EXPECT_EQ(interlock.turnOf(panel.StopButton), Turn::Now);
    EXPECT_EQ(interlock.turnOf(forms.main.CancelButton), Turn::Now);
    panel.MousePointer = 0;
    EXPECT_EQ(interlock.turnOf(panel.SpanButton), Turn::Now);
}

TEST_F(InterlockTest, SavingInTheContinuousView_ComesBetweenTwoPasses) {
    panel.State = ControllerForm::Freq;
    panel.SaveCurrentView.Enabled = true;
    askSettings();
    cmd("WAIT");
    trace(levelBlock(-35250));
    cmd("WAIT");
    trace(levelBlock(-35250));
    unsigned long plotsAtTheClick = 0;
    platform.events.schedule(0, [&] {
        interlock.perform(panel.SaveCurrentView, [&] {
            plotsAtTheClick = panel.CWGraph1.plotSerial();
            EXPECT_EQ(program.link().DialoguesUnderWay, 0);
        });
    });
    panel.CWGraph1.Changed.connect([this] {
        if (panel.CWGraph1.plotSerial() == 2 && panel.StopButton.Visible) panel.StopButton.Click();
    });
    panel.PlayContinuousButton.Click();
    EXPECT_EQ(plotsAtTheClick, 1U);
    expectPlayed();
}

}  // namespace
}  // namespace zel
