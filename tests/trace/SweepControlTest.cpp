#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "tests/trace/SweepControl.h"

namespace zel {
namespace {

using Texts = std::vector<std::string>;

TEST_F(SweepControlTest, Single_ReadsOneFullCycle) {
    panel.YVectorVal = 5;
    fullCycle();
    panel.PlaySingleButton.Click();
    expectPlayed();
    EXPECT_EQ(panel.YVectorVal, 0);
}

TEST_F(SweepControlTest, Single_WithTheWaterfallChecked_KeepsTheRowNumber) {
    forms.specialMeas.chkWaterfall.setValue(true);
    panel.YVectorVal = 5;
    fullCycle();
    panel.PlaySingleButton.Click();
    EXPECT_EQ(panel.YVectorVal, 5);
}

TEST_F(SweepControlTest, Single_InATimedRecording_KeepsTheRowNumber) {
    forms.time.ContinuousRecording = true;
    panel.YVectorVal = 5;
    fullCycle();
    panel.PlaySingleButton.Click();
    EXPECT_EQ(panel.YVectorVal, 5);
}

TEST_F(SweepControlTest, Single_InTheTdmaMenu_ReadsATrace) {
    panel.State = ControllerForm::TDMA;
    fullCycle();
    panel.PlaySingleButton.Click();
    expectPlayed();
}

TEST_F(SweepControlTest, Continuous_OfTraces_OpensNoDialog) {
    fullCycle();
    stopAtPlot(1);
    bool opened = false;
    platform.events.schedule(1, [&] {
        opened = forms.powerAndRefl.Visible;
        if (opened) forms.powerAndRefl.unload(1);
    });
    panel.PlayContinuousButton.Click();
    EXPECT_FALSE(opened);
    expectPlayed();
}

TEST_F(SweepControlTest, Continuous_NotConnected_TellsItAndDoesNotLoop) {
    panel.isConnected = false;
    panel.PlayContinuousButton.Click();
    EXPECT_EQ(boxes.texts(), Texts{"Please connect to the intrument first."});
    EXPECT_EQ(boxes.boxes()[0].icon, BoxIcon::Information);
    EXPECT_EQ(port.written(), "");
    EXPECT_TRUE(panel.RecordData.Visible);
    EXPECT_TRUE(panel.PlayContinuousButton.Visible);
    EXPECT_FALSE(panel.ContinuosLoopActive);
}

TEST_F(SweepControlTest, Continuous_FirstPassIsFullAndLaterOnesAreSelective) {
    fullCycle();
    selectiveCycle();
    selectiveCycle();
    stopAtPlot(3);
    panel.PlayContinuousButton.Click();
    expectPlayed();
    expectIdle();
    EXPECT_EQ(panel.YVectorVal, 2);
}

TEST_F(SweepControlTest, Continuous_InSingleSweep_FirstPassAsksFiveWordsAndSendsNoInit) {
    panel.SingleSweepModeActive = true;
    get("FREQ", "1500000000");
    get("SPAN", "1000000");
    get("REFLVL", "-20");
    get("RANGE", "0");
    get("TRACEDET", "3");
    selectiveCycle();
    selectiveCycle();
    stopAtPlot(2);
    panel.PlayContinuousButton.Click();
    expectPlayed();
    expectIdle();
}

TEST_F(SweepControlTest, Continuous_WhileItRuns_LocksTheMenusAndShowsStop) {
    fullCycle();
    bool locked = false;
    panel.CWGraph1.Changed.connect([&] {
        locked = locked || (!panel.Connection.Enabled && !panel.Utility.Enabled &&
                            !panel.PlayContinuousButton.Visible && panel.StopButton.Visible &&
                            panel.ContinuosLoopActive && panel.STOPFlag);
    });
    stopAtPlot(1);
    panel.PlayContinuousButton.Click();
    EXPECT_TRUE(locked);
}

TEST_F(SweepControlTest, Stop_DuringTheFirstPass_StylesItsRowAtTheEndOnly) {
    int styled = 0;
    forms.waterfall.styleLastRow.connect([&] { ++styled; });
    fullCycle();
    stopAtPlot(1);
    panel.PlayContinuousButton.Click();
    expectPlayed();
    EXPECT_EQ(styled, 1);
    expectIdle();
}

TEST_F(SweepControlTest, LaterPass_StylesTheNewestPlotAndTheLastRow) {
    int styled = 0;
    forms.waterfall.styleLastRow.connect([&] { ++styled; });
    fullCycle();
    selectiveCycle();
    stopAtPlot(2);
    panel.PlayContinuousButton.Click();
    EXPECT_EQ(styled, 2);  // before the later pass, and at the end of the view
    EXPECT_FALSE(forms.waterfall.Graph3D.plots().front().lineVisible);
    EXPECT_EQ(forms.waterfall.Graph3D.plots().front().fillStyle, 2);
}

TEST_F(SweepControlTest, SecondView_GoesOnBehindTheLastRow) {
    panel.YVectorVal = 4;
    forms.waterfall.Graph3D.plotCurve({4, 4}, {1, 2}, {-50, -40}, {0, 100});
    fullCycle();
    stopAtPlot(1);
    panel.PlayContinuousButton.Click();
    EXPECT_EQ(panel.YVectorVal, 5);
    EXPECT_EQ(forms.waterfall.Graph3D.plots().back().depth.front(), 5);
}

TEST_F(SweepControlTest, ViewBehindALoadedSeries_LeavesNoGap) {
    panel.YVectorVal = 4;  // raised for the next row already
    forms.waterfall.Graph3D.plotCurve({3, 3}, {1, 2}, {-50, -40}, {0, 100});
    fullCycle();
    stopAtPlot(1);
    panel.PlayContinuousButton.Click();
    EXPECT_EQ(forms.waterfall.Graph3D.plots().back().depth.front(), 4);
}

TEST_F(SweepControlTest, FailedFirstPass_LeavesStopAsTheWayBack) {
    getRefused("FREQ", "6");
    panel.PlayContinuousButton.Click();
    expectPlayed();
    EXPECT_TRUE(panel.StopButton.Visible);
    EXPECT_FALSE(panel.PlayContinuousButton.Visible);
    EXPECT_FALSE(panel.Connection.Enabled);
    EXPECT_FALSE(panel.Utility.Enabled);
    EXPECT_FALSE(panel.ContinuosLoopActive);
    EXPECT_TRUE(panel.RecordData.Visible);
    panel.StopButton.Click();
    EXPECT_FALSE(panel.StopButton.Visible);
    EXPECT_TRUE(panel.PlayContinuousButton.Visible);
    EXPECT_TRUE(panel.PlayContinuousButton.Enabled);
}

TEST_F(SweepControlTest, FailedLink_InALaterPass_EndsTheLoopWithOneView) {
    fullCycle();
    port.expect("cmd\r").silence();
    panel.PlayContinuousButton.Click();
    EXPECT_EQ(boxes.texts(), Texts{"No response received!"});
    EXPECT_FALSE(panel.ContinuosLoopActive);
    EXPECT_FALSE(panel.Connection.Enabled);
    EXPECT_TRUE(panel.RecordData.Visible);
    panel.StopButton.Click();
    EXPECT_TRUE(panel.Connection.Enabled);
    EXPECT_TRUE(panel.Utility.Enabled);
}

TEST_F(SweepControlTest, FailedLink_StatusClockAndGraphSayThatTheConnectionIsLost) {
    fullCycle();
    port.expect("cmd\r").silence();
    panel.PlayContinuousButton.Click();
    EXPECT_TRUE(panel.LinkLost);
    EXPECT_EQ(panel.ConnectedPic.Image.get(), "lost");
    EXPECT_TRUE(panel.CWGraph1.Old);
    const std::string clock = panel.TimeLabel.Caption;
    EXPECT_EQ(clock.rfind("connection lost ", 0), 0U) << clock;
    platform.events.runFor(3000);
    EXPECT_EQ(panel.TimeLabel.Caption.get(), clock);
    EXPECT_TRUE(panel.CWGraph1.Old);
    // The next good answer takes it back.
    panel.StopButton.Click();
    cmd("INIT");
    EXPECT_TRUE(program.exchange().CmdInstrument("INIT"));
    EXPECT_FALSE(panel.LinkLost);
    EXPECT_EQ(panel.ConnectedPic.Image.get(), "connected");
}

TEST_F(SweepControlTest, StopInALongSweep_LeavesTheWaitAfterASecond) {
    askSettings();
    port.expect("cmd\r").answer("0\r");
    port.expect("WAIT\r").silence();
    platform.events.schedule(3000, [this] { panel.StopButton.Click(); });
    forms.waterfall.Graph3D.plotCurve({4, 4}, {1, 2}, {-50, -40}, {0, 100});
    forms.waterfall.Graph3D.plots().back().lineVisible = true;
    panel.PlayContinuousButton.Click();
    EXPECT_FALSE(forms.waterfall.Graph3D.plots().back().lineVisible) << "the last row is styled";
    EXPECT_NEAR(static_cast<double>(platform.clock.micros()) / 1e6, 4, 0.2);
    EXPECT_EQ(boxes.texts(), Texts{});
    EXPECT_TRUE(panel.PlayContinuousButton.Visible);
    EXPECT_TRUE(panel.Connection.Enabled);
    EXPECT_FALSE(panel.LinkLost);
    port.expect("\r").answer("0\r");
    cmd("INIT");
    EXPECT_TRUE(program.exchange().CmdInstrument("INIT"));
    expectPlayed();
}

TEST_F(SweepControlTest, StopInASingleSweep_LeavesTheWait) {
    askSettings();
    port.expect("cmd\r").answer("0\r");
    port.expect("WAIT\r").silence();
    platform.events.schedule(2000, [this] {
        EXPECT_TRUE(panel.StopButton.Visible);
        panel.StopButton.Click();
    });
    panel.PlaySingleButton.Click();
    EXPECT_LT(platform.clock.micros(), 4000000);
    EXPECT_EQ(boxes.texts(), Texts{});
    EXPECT_FALSE(panel.StopButton.Visible);
    EXPECT_TRUE(panel.PlaySingleButton.Enabled);
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

TEST_F(SweepControlTest, FailedLink_SeenBetweenPasses_LeavesWithoutCleanUp) {
    panel.State = ControllerForm::TDMA;  // its first pass gives no result
    getSilent();
    panel.PlayContinuousButton.Click();
    expectPlayed();
    EXPECT_EQ(boxes.texts(), Texts{"No response received!"});
    EXPECT_FALSE(panel.RecordData.Visible);
    EXPECT_TRUE(panel.StopButton.Visible);
    EXPECT_FALSE(panel.Connection.Enabled);
}

TEST_F(SweepControlTest, NextNormalStop_EnablesTheMenusAgain) {
    getRefused("FREQ", "6");
    panel.PlayContinuousButton.Click();
    panel.StopButton.Click();
    fullCycle();
    stopAtPlot(1);
    panel.PlayContinuousButton.Click();
    expectIdle();
}

TEST_F(SweepControlTest, Stop_EndsARecordingToo) {
    panel.RecordDataFlag = true;
    panel.RecordData.Checked = true;
    panel.RecordData.Visible = false;
    panel.MousePointer = 11;
    panel.StopButton.Click();
    EXPECT_FALSE(panel.RecordDataFlag);
    EXPECT_FALSE(panel.RecordData.Checked);
    EXPECT_TRUE(panel.RecordData.Visible);
    EXPECT_EQ(panel.MousePointer.get(), 0);
    EXPECT_FALSE(panel.STOPFlag);
}

TEST_F(SweepControlTest, Stop_BringsTheKeyOfTheViewBackEnabled) {
    panel.PlayContinuousButton.Visible = false;
    panel.PlayContinuousButton.Enabled = false;
    bool ran = false;  // what is due runs inside of the click
    platform.events.schedule(0, [&] { ran = panel.PlayContinuousButton.Visible; });
    panel.StopButton.Click();
    EXPECT_TRUE(ran);
    EXPECT_TRUE(panel.PlayContinuousButton.Enabled);
}

TEST_F(SweepControlTest, Stop_InThePowerMenu_ClosesItsDialog) {
    panel.State = ControllerForm::POWER;
    forms.powerAndRefl.Show();
    panel.StopButton.Click();
    EXPECT_FALSE(forms.powerAndRefl.Visible);
    EXPECT_FALSE(forms.powerAndRefl.loaded());
}

}  // namespace
}  // namespace zel
