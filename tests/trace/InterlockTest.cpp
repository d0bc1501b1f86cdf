// Who may act when, and that no exchange begins inside another.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "link/CommandExchange.h"
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
