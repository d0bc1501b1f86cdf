#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "model/CodeTables.h"
#include "tests/trace/ReadCycle.h"

namespace zel {
namespace {

using Texts = std::vector<std::string>;

constexpr ReadAgain kNothing{};
constexpr ReadAgain kAll{true, true, true, true, true};

struct SelectiveCycleTest : ReadCycle {
    SelectiveCycleTest() {
        mirror.CenterFrequency = 2e9;
        mirror.Span = 4e6;
        mirror.ReferenceLevel = -10;
        mirror.TraceDetector = DETSAMPLE;
        mirror.SweepTime = 0.1;
    }
    void sweep() {
        cmd("WAIT");
        trace(levelBlock(-35250));
    }
    void sweepOfPairs() {
        cmd("WAIT");
        trace(levelBlock(-35250) + levelBlock(-40000));
    }
    void expectReady() {
        EXPECT_EQ(panel.MousePointer.get(), 0);
        EXPECT_TRUE(panel.PlaySingleButton.Enabled);
        EXPECT_TRUE(panel.PlayContinuousButton.Enabled);
        EXPECT_TRUE(panel.RecordData.Visible);
    }
};

TEST_F(SelectiveCycleTest, AllFlagsOff_SendsOnlyWaitAndTheTransfer) {
    sweep();
    EXPECT_TRUE(readAgain(kNothing));
    expectPlayed();
    EXPECT_EQ(panel.CWGraph1.xAxis().Minimum, 1.998e9);
    EXPECT_EQ(panel.CWGraph1.yAxis().Maximum, -10);
    expectReady();
}

TEST_F(SelectiveCycleTest, AllFlagsOn_AsksFiveWordsInTheirOrder) {
    get("FREQ", "1000000000");
    get("SPAN", "2000000");
    get("REFLVL", "0");
    get("RANGE", "2");
    get("TRACEDET", "4");
    sweep();
    EXPECT_TRUE(readAgain(kAll));
    expectPlayed();
    EXPECT_EQ(mirror.CenterFrequency, 1e9);
    EXPECT_EQ(mirror.Span, 2e6);
    EXPECT_EQ(mirror.ReferenceLevel, 0);
    EXPECT_EQ(mirror.ReferenceRange, RANGE2DB);
    EXPECT_EQ(mirror.TraceDetector, DETRMS);
    EXPECT_EQ(panel.CFLabel.Caption.get(), "Center: 1 GHz");
    EXPECT_EQ(panel.SpanLabel.Caption.get(), "Span: 2 MHz");
}

struct FlagRow {
    ReadAgain again;
    const char* word;
};

class OneFlag : public SelectiveCycleTest, public ::testing::WithParamInterface<FlagRow> {};

TEST_P(OneFlag, AsksItsWordAlone) {
    get(GetParam().word, "3");
    sweep();
    EXPECT_TRUE(readAgain(GetParam().again));
    expectPlayed();
}

TEST_P(OneFlag, LinkFailure_IsAnUnsuccessfulView) {
    getSilent();
    EXPECT_FALSE(readAgain(GetParam().again));
    expectPlayed();
    EXPECT_EQ(boxes.texts(), (Texts{"No response received!", "Unsuccessful View"}));
    EXPECT_EQ(panel.MousePointer.get(), 0);
    EXPECT_TRUE(panel.PlaySingleButton.Enabled);
    EXPECT_FALSE(panel.RecordData.Visible);
}

TEST_P(OneFlag, Refusal_EndsTheCycleAndFreesThePanel) {
    getRefused(GetParam().word, "6");
    EXPECT_FALSE(readAgain(GetParam().again));
    expectPlayed();
    EXPECT_EQ(boxes.texts(), Texts{});
    expectReady();
}

// An empty line, or a text, is no value of a setting.
TEST_P(OneFlag, AnswerThatIsNoNumber_IsAskedForOnceMore) {
    for (const char* spoiled : {"", "x", "1x5"}) {
        get(GetParam().word, spoiled);
        get(GetParam().word, "3");
        sweep();
        EXPECT_TRUE(readAgain(GetParam().again));
        expectPlayed();
        EXPECT_FALSE(mirror.Unsure.any());
    }
}

TEST_P(OneFlag, NoNumberTwice_ShowsNoTraceOverIt) {
    const ZEL3Variables before = mirror;
    get(GetParam().word, "");
    get(GetParam().word, "p5");
    EXPECT_FALSE(readAgain(GetParam().again));
    expectPlayed();
    EXPECT_EQ(boxes.texts(), Texts{"Unsuccessful View"});
    EXPECT_TRUE(mirror.Unsure.any());
    EXPECT_EQ(mirror.CenterFrequency, before.CenterFrequency);
    EXPECT_EQ(mirror.Span, before.Span);
    EXPECT_EQ(mirror.ReferenceLevel, before.ReferenceLevel);
    EXPECT_EQ(mirror.TraceDetector, before.TraceDetector);
    // The next cycle asks again, whatever its flags.
    get(GetParam().word, "3");
    sweep();
    EXPECT_TRUE(readAgain(kNothing));
    expectPlayed();
    EXPECT_FALSE(mirror.Unsure.any());
}

INSTANTIATE_TEST_SUITE_P(Flags, OneFlag,
                         ::testing::Values(FlagRow{{true, false, false, false, false}, "FREQ"},
                                           FlagRow{{false, true, false, false, false}, "SPAN"},
                                           FlagRow{{false, false, true, false, false}, "REFLVL"},
                                           FlagRow{{false, false, false, true, false}, "RANGE"},
                                           FlagRow{{false, false, false, false, true},
                                                   "TRACEDET"}));

// The instrument has the detector of pairs, and the mirror does not.
TEST_F(SelectiveCycleTest, LongerTransfer_AsksForTheDetectorInTheNextCycle) {
    sweepOfPairs();
    EXPECT_TRUE(readAgain(kNothing));
    cmd("WAIT");
    get("TRACEDET", "0");
    trace(levelBlock(-35250) + levelBlock(-40000));
    EXPECT_TRUE(readAgain(kNothing));
    EXPECT_EQ(mirror.TraceDetector, DETAUTOPEAK);
    sweepOfPairs();
    EXPECT_TRUE(readAgain(kNothing));
    expectPlayed();
}

TEST_F(SelectiveCycleTest, FailedLink_AbortsAheadOfEverything) {
    program.link().ExchangeFailed = true;
    EXPECT_FALSE(readAgain(kAll));
    EXPECT_EQ(port.written(), "");
    EXPECT_EQ(boxes.texts(), Texts{"Unsuccessful View"});
}

TEST_F(SelectiveCycleTest, NotConnected_IsToldOnce) {
    panel.isConnected = false;
    EXPECT_FALSE(readAgain(kNothing));
    EXPECT_EQ(boxes.texts().size(), 1U);
    EXPECT_FALSE(readAgain(kNothing));
    EXPECT_EQ(boxes.texts(), Texts{"Please connect to the intrument first."});
    EXPECT_TRUE(panel.ErrorFlag);
    EXPECT_EQ(port.written(), "");
    expectReady();
}

TEST_F(SelectiveCycleTest, Recording_StartsTheSweepWithInit) {
    recordIntoNothing();
    Texts saved;
    panel.SaveView.connect([&](const std::string& kind) { saved.push_back(kind); });
    cmd("INIT");
    sweep();
    EXPECT_TRUE(readAgain(kNothing));
    expectPlayed();
    EXPECT_EQ(saved, Texts{"trace"});
}

TEST_F(SelectiveCycleTest, RefusedInit_EndsTheCycleAndFreesThePanel) {
    panel.RecordDataFlag = true;
    cmd("INIT", "4");
    EXPECT_FALSE(readAgain(kNothing));
    expectPlayed();
    expectReady();
}

TEST_F(SelectiveCycleTest, SingleSweep_SendsNoInit) {
    panel.SingleSweepModeActive = true;
    sweep();
    EXPECT_TRUE(readAgain(kNothing));
    expectPlayed();
}

TEST_F(SelectiveCycleTest, SilentWait_IsAnUnsuccessfulView) {
    port.expect("cmd\r").answer("0\r");
    port.expect("WAIT\r").silence();
    EXPECT_FALSE(readAgain(kNothing));
    expectPlayed();
    EXPECT_EQ(boxes.texts(), (Texts{"No response received!", "Unsuccessful View"}));
}

TEST_F(SelectiveCycleTest, FailedTransfer_FreesThePanel) {
    cmd("WAIT");
    getRefused("TRACEBIN", "4");
    EXPECT_FALSE(readAgain(kNothing));
    expectPlayed();
    expectReady();
}

TEST_F(SelectiveCycleTest, XVector_BelongsToTheNewRange) {
    panel.ViewStart = 100;
    panel.ViewStop = 400;
    sweep();
    readAgain(kNothing);
    EXPECT_EQ(panel.XVector.front(), 1.998e9);
    EXPECT_NEAR(panel.XVector.back(), 2.002e9, 1);
}

TEST_F(SelectiveCycleTest, Waterfall_IsNotTouched) {
    int calls = 0;
    forms.waterfall.resetRowCount.connect([&] { ++calls; });
    forms.waterfall.styleLastRow.connect([&] { ++calls; });
    forms.waterfall.Graph3D.addPlot();
    sweep();
    readAgain(kNothing);
    EXPECT_EQ(calls, 0);
    EXPECT_EQ(forms.waterfall.Graph3D.plotCount(), 2);
}

TEST_F(SelectiveCycleTest, ManualScale_IsReplacedByTheNextTrace) {
    panel.CWGraph1.setYRange(-1, 1);
    sweep();
    readAgain(kNothing);
    EXPECT_EQ(panel.CWGraph1.yAxis().Minimum, -110);
    EXPECT_EQ(panel.CWGraph1.yAxis().Maximum, -10);
}

TEST_F(SelectiveCycleTest, UsersZoom_SurvivesTheNextTrace) {
    panel.cmdZoom.Click();
    panel.CWGraph1.setXRange(1.999e9, 2.0e9);
    sweep();
    readAgain(kNothing);
    EXPECT_EQ(panel.CWGraph1.xAxis().Minimum, 1.999e9);
    EXPECT_EQ(panel.CWGraph1.xAxis().Maximum, 2.0e9);
}

TEST_F(SelectiveCycleTest, DeviceUnpluggedInTheSweep_IsToldAndLeavesThePanelUsable) {
    cmd("WAIT");
    port.expect("GET\r").answer("0\r");
    port.expect("TRACEBIN\r").answer("0\r" + levelBlock(0).substr(0, 600)).dies();
    EXPECT_FALSE(readAgain(kNothing));
    EXPECT_EQ(boxes.texts(), Texts{"Port is not open!\r\nCOM1 has gone."});
    EXPECT_TRUE(program.link().ExchangeFailed);
    expectReady();
}

}  // namespace
}  // namespace zel
