#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "model/CodeTables.h"
#include "tests/trace/ReadCycle.h"

namespace zel {
namespace {

using Texts = std::vector<std::string>;

struct FullCycleTest : ReadCycle {};

TEST_F(FullCycleTest, Words_GoInTheirOrder) {
    askSettings();
    cmd("WAIT");
    trace(levelBlock(-35250));
    EXPECT_TRUE(readFull());
    expectPlayed();
    EXPECT_EQ(boxes.texts(), Texts{});
}

TEST_F(FullCycleTest, Answers_GoIntoTheMirror) {
    askSettings();
    cmd("WAIT");
    trace(levelBlock(-35250));
    readFull();
    EXPECT_EQ(mirror.CenterFrequency, 1.5e9);
    EXPECT_EQ(mirror.Span, 1e6);
    EXPECT_EQ(mirror.ReferenceLevel, -20);
    EXPECT_EQ(mirror.ReferenceUnit, 0);
    EXPECT_EQ(mirror.ReferenceRange, 1);
    EXPECT_EQ(mirror.DynamicRangeMode, 1);
    EXPECT_EQ(mirror.TraceDetector, DETSAMPLE);
    EXPECT_EQ(mirror.SweepTime, 0.02);
}

TEST_F(FullCycleTest, Labels_ShowCentreAndSpan) {
    askSettings();
    cmd("WAIT");
    trace(levelBlock(-35250));
    readFull();
    EXPECT_EQ(panel.CFLabel.Caption.get(), "Center: 1.5 GHz");
    EXPECT_EQ(panel.SpanLabel.Caption.get(), "Span: 1 MHz");
}

TEST_F(FullCycleTest, Trace_IsConvertedScaledAndPlotted) {
    askSettings();
    cmd("WAIT");
    trace(levelBlock(-35250));
    readFull();
    EXPECT_EQ(panel.CWGraph1.values(), std::vector<double>(301, -35.25));
    EXPECT_EQ(panel.RawTraceData, std::vector<double>(301, -35.25));
    EXPECT_EQ(panel.CWGraph1.firstX(), 1.4995e9);
    EXPECT_DOUBLE_EQ(panel.CWGraph1.increment(), 1e6 / 300);
    EXPECT_EQ(panel.CWGraph1.xAxis().Minimum, 1.4995e9);
    EXPECT_EQ(panel.CWGraph1.xAxis().Maximum, 1.5005e9);
    EXPECT_EQ(panel.CWGraph1.yAxis().Minimum, -70);
    EXPECT_EQ(panel.CWGraph1.yAxis().Maximum, -20);
    EXPECT_EQ(panel.ViewXOffset, 1.4995e9);
}

TEST_F(FullCycleTest, Panel_IsBusyDuringTheCycleAndReadyBehindIt) {
    askSettings();
    cmd("WAIT");
    trace(levelBlock(-35250));
    recordIntoNothing();
    bool busy = false;
    panel.SaveView.connect([&](const std::string&) {
        busy = panel.MousePointer == 11 && !panel.PlaySingleButton.Enabled &&
               !panel.RecordData.Visible;
    });
    readFull();
    EXPECT_TRUE(busy);
    EXPECT_EQ(panel.MousePointer.get(), 0);
    EXPECT_TRUE(panel.PlaySingleButton.Enabled);
    EXPECT_TRUE(panel.RecordData.Visible);
}

TEST_F(FullCycleTest, NotConnected_TellsItAndSendsNothing) {
    panel.isConnected = false;
    EXPECT_FALSE(readFull());
    EXPECT_EQ(boxes.texts(), Texts{"Please connect to the intrument first."});
    EXPECT_EQ(boxes.boxes()[0].icon, BoxIcon::Information);
    EXPECT_EQ(boxes.boxes()[0].title, "ZELRemote");
    EXPECT_EQ(port.written(), "");
}

TEST_F(FullCycleTest, SingleSweep_StartsWithInit) {
    panel.SingleSweepModeActive = true;
    cmd("INIT");
    askSettings();
    cmd("WAIT");
    trace(levelBlock(-35250));
    EXPECT_TRUE(readFull());
    expectPlayed();
}

TEST_F(FullCycleTest, RefusedInit_EndsAtOnceAndLeavesThePanelBusy) {
    panel.SingleSweepModeActive = true;
    cmd("INIT", "4");
    EXPECT_FALSE(readFull());
    expectPlayed();
    EXPECT_EQ(boxes.texts(), Texts{});
    EXPECT_EQ(panel.MousePointer.get(), 11);
    EXPECT_FALSE(panel.PlaySingleButton.Enabled);
    EXPECT_FALSE(panel.RecordData.Visible);
}

class LinkFailsAt : public ReadCycle, public ::testing::WithParamInterface<int> {};

TEST_P(LinkFailsAt, FullCycle_TellsAnUnsuccessfulViewAndFreesThePanel) {
    askSettings(GetParam());
    getSilent();
    EXPECT_FALSE(readFull());
    expectPlayed();
    EXPECT_EQ(boxes.texts(), (Texts{"No response received!", "Unsuccessful View"}));
    EXPECT_EQ(boxes.boxes().back().icon, BoxIcon::Information);
    EXPECT_EQ(panel.MousePointer.get(), 0);
    EXPECT_TRUE(panel.PlaySingleButton.Enabled);
    EXPECT_FALSE(panel.RecordData.Visible);
}

INSTANTIATE_TEST_SUITE_P(EachQuery, LinkFailsAt, ::testing::Range(0, 8));

TEST_F(FullCycleTest, SilentWait_TellsAnUnsuccessfulView) {
    askSettings();
    port.expect("cmd\r").answer("0\r");
    port.expect("WAIT\r").silence();
    EXPECT_FALSE(readFull());
    expectPlayed();
    EXPECT_EQ(boxes.texts(), (Texts{"No response received!", "Unsuccessful View"}));
}

TEST_F(FullCycleTest, CancelledDial_KeepsTheFailureSilent) {
    program.link().DialCancelled = true;
    program.link().ExchangeFailed = true;  // reported already
    getSilent();
    EXPECT_FALSE(readFull());
    EXPECT_EQ(boxes.texts(), Texts{});
    EXPECT_TRUE(panel.PlaySingleButton.Enabled);
}

class QueryRefused : public ReadCycle, public ::testing::WithParamInterface<int> {};

TEST_P(QueryRefused, FullCycle_EndsSilentlyAndLeavesTheButtonDisabled) {
    askSettings(GetParam());
    getRefused(kSettings[GetParam()].word, "6");  // a status without a box
    EXPECT_FALSE(readFull());
    expectPlayed();
    EXPECT_EQ(boxes.texts(), Texts{});
    EXPECT_EQ(panel.MousePointer.get(), 0);
    EXPECT_FALSE(panel.PlaySingleButton.Enabled);
    EXPECT_FALSE(panel.RecordData.Visible);
}

INSTANTIATE_TEST_SUITE_P(EachQuery, QueryRefused, ::testing::Range(0, 8));

TEST_F(FullCycleTest, RefusedQuery_IsToldByTheExchangeAlone) {
    getRefused("FREQ", "5");
    readFull();
    ASSERT_EQ(boxes.boxes().size(), 1U);
    EXPECT_EQ(boxes.boxes()[0].title, "ZEL3 Error");
}

TEST_F(FullCycleTest, NextCycle_BringsTheButtonBack) {
    getRefused("FREQ", "6");
    readFull();
    askSettings();
    cmd("WAIT");
    trace(levelBlock(0));
    EXPECT_TRUE(readFull());
    EXPECT_TRUE(panel.PlaySingleButton.Enabled);
    EXPECT_TRUE(panel.RecordData.Visible);
}

TEST_F(FullCycleTest, RefusedWait_IsNotExamined) {
    askSettings();
    cmd("WAIT", "4");
    trace(levelBlock(-35250));
    EXPECT_TRUE(readFull());
    expectPlayed();
}

TEST_F(FullCycleTest, RefusedTransfer_EndsTheCycle) {
    askSettings();
    cmd("WAIT");
    getRefused("TRACEBIN", "2");
    EXPECT_FALSE(readFull());
    expectPlayed();
    ASSERT_EQ(boxes.boxes().size(), 1U);
    EXPECT_EQ(boxes.boxes()[0].title, "ZEL3 Error");
    EXPECT_EQ(panel.MousePointer.get(), 0);
    EXPECT_TRUE(panel.CWGraph1.values().empty());
}

TEST_F(FullCycleTest, TransferThatIsNotReady_IsAskedAgain) {
    askSettings();
    cmd("WAIT");
    getRefused("TRACEBIN", "1");
    getRefused("TRACEBIN", "1");
    trace(levelBlock(-40000));
    EXPECT_TRUE(readFull());
    expectPlayed();
    EXPECT_EQ(panel.TraceData[300], -40);
}

TEST_F(FullCycleTest, ZeroSpan_RunsFromZeroToTheSweepTime) {
    askSettings(8, {{"SPAN", "0"}});
    cmd("WAIT");
    trace(levelBlock(-35250));
    EXPECT_TRUE(readFull());
    EXPECT_EQ(panel.ViewStart, 0);
    EXPECT_EQ(panel.ViewStop, 0.02);
    EXPECT_EQ(panel.ViewXOffset, 0);
    EXPECT_EQ(panel.SpanLabel.Caption.get(), "Span: 0 Hz");
    EXPECT_DOUBLE_EQ(panel.CWGraph1.increment(), 0.02 / 298);
}

TEST_F(FullCycleTest, DistanceToFault_RunsFromZeroToTheCableLength) {
    panel.InstrumentMode = ControllerForm::DISTTOFAULTMEASURE;
    mirror.CableLength = 12.5;
    askSettings();
    cmd("WAIT");
    trace(levelBlock(-35250));
    EXPECT_TRUE(readFull());
    expectPlayed();
    EXPECT_EQ(panel.ViewStart, 0);
    EXPECT_EQ(panel.ViewStop, 12.5);
}

TEST_F(FullCycleTest, DistanceToFault_AtZeroSpan_RunsOverTheCableAllTheSame) {
    panel.InstrumentMode = ControllerForm::DISTTOFAULTMEASURE;
    mirror.CableLength = 12.5;
    askSettings(8, {{"SPAN", "0"}});
    cmd("WAIT");
    trace(levelBlock(-35250));
    EXPECT_TRUE(readFull());
    expectPlayed();
    EXPECT_EQ(panel.ViewStart, 0);
    EXPECT_EQ(panel.ViewStop, 12.5);
    EXPECT_EQ(panel.Shown.xUnit, "m");
}

TEST_F(FullCycleTest, DistanceToFault_UnknownLength_IsAskedOnceAheadOfWait) {
    panel.InstrumentMode = ControllerForm::DISTTOFAULTMEASURE;
    for (int cycle = 0; cycle < 2; ++cycle) {
        askSettings();
        if (cycle == 0) get("CABLELEN", "30");
        cmd("WAIT");
        trace(levelBlock(-35250));
    }
    EXPECT_TRUE(readFull());
    EXPECT_TRUE(readFull());
    expectPlayed();
    EXPECT_EQ(panel.ViewStop, 30);
}

TEST_F(FullCycleTest, DistanceToFault_RefusedLength_DoesNotEndTheCycle) {
    panel.InstrumentMode = ControllerForm::DISTTOFAULTMEASURE;
    askSettings();
    getRefused("CABLELEN", "6");
    cmd("WAIT");
    trace(levelBlock(-35250));
    EXPECT_TRUE(readFull());
    expectPlayed();
    EXPECT_EQ(panel.ViewStop, 0);
}

TEST_F(FullCycleTest, AutoPeak_PairsBlockTwoOneSampleEarlier) {
    std::vector<std::int32_t> first;
    std::vector<std::int32_t> second;
    for (int i = 0; i < 301; ++i) {
        first.push_back(-30000 - i);
        second.push_back(-50000 - i);
    }
    askSettings(8, {{"TRACEDET", "0"}});
    cmd("WAIT");
    trace(traceBlock(first) + traceBlock(second));
    EXPECT_TRUE(readFull());
    expectPlayed();
    const std::vector<double>& peak = panel.PeakTraceData;
    ASSERT_EQ(peak.size(), 602U);
    EXPECT_EQ(peak[0], -30.0);
    EXPECT_EQ(peak[1], -30.3);  // the last sample of block one
    EXPECT_EQ(peak[2], -30.001);
    EXPECT_EQ(peak[3], -50.0);
    EXPECT_EQ(peak[600], -30.3);
    EXPECT_EQ(peak[601], -50.299);  // the very last sample never appears
    EXPECT_DOUBLE_EQ(panel.CWGraph1.increment(), 1e6 / 600);
}

TEST_F(FullCycleTest, XVector_BelongsToTheRangeOfTheTraceBefore) {
    panel.ViewStart = 100;
    panel.ViewStop = 400;
    panel.YVectorVal = 4;
    askSettings();
    cmd("WAIT");
    trace(levelBlock(-35250));
    readFull();
    ASSERT_EQ(panel.XVector.size(), 301U);
    EXPECT_EQ(panel.XVector.front(), 100);
    EXPECT_EQ(panel.XVector.back(), 400);
    EXPECT_EQ(panel.YVector, std::vector<double>(301, 4));
}

TEST_F(FullCycleTest, Recording_SavesTheConvertedTraceAheadOfTheDrawing) {
    recordIntoNothing();
    Texts saved;
    panel.SaveView.connect([&](const std::string& kind) {
        saved.push_back(kind);
        EXPECT_EQ(panel.RawTraceData.at(0), -35.25);
        EXPECT_TRUE(panel.CWGraph1.values().empty());
    });
    askSettings();
    cmd("WAIT");
    trace(levelBlock(-35250));
    EXPECT_TRUE(readFull());
    EXPECT_EQ(saved, Texts{"trace"});
}

TEST_F(FullCycleTest, NotRecording_SavesNothing) {
    bool saved = false;
    panel.SaveView.connect([&](const std::string&) { saved = true; });
    askSettings();
    cmd("WAIT");
    trace(levelBlock(-35250));
    readFull();
    EXPECT_FALSE(saved);
}

struct WaterfallCycleTest : ReadCycle {
    int resets = 0;
    int styled = 0;

    WaterfallCycleTest() {
        forms.waterfall.resetRowCount.connect([this] { ++resets; });
        forms.waterfall.styleLastRow.connect([this] { ++styled; });
        forms.waterfall.Graph3D.addPlot();
        forms.waterfall.Graph3D.setValuePair(2, 1, {"12:00:00", 1});
        askSettings();
        cmd("WAIT");
        trace(levelBlock(-35250));
    }
};

TEST_F(WaterfallCycleTest, SingleTrace_StandsAlone) {
    EXPECT_TRUE(readFull());
    EXPECT_EQ(forms.waterfall.Graph3D.plotCount(), 1);
    EXPECT_EQ(forms.waterfall.Graph3D.valuePairs(2).count(), 1);
    EXPECT_NE(forms.waterfall.Graph3D.valuePairs(2).item(1).Name, "12:00:00");
    EXPECT_EQ(resets, 1);
    EXPECT_EQ(styled, 0);
}

TEST_F(WaterfallCycleTest, CheckedWaterfall_StylesItsLastRow) {
    forms.specialMeas.chkWaterfall.setValue(true);
    EXPECT_TRUE(readFull());
    EXPECT_EQ(forms.waterfall.Graph3D.plotCount(), 2);
    EXPECT_EQ(styled, 1);
}

TEST_F(WaterfallCycleTest, TimedRecording_KeepsThePlots) {
    forms.time.ContinuousRecording = true;
    forms.specialMeas.chkWaterfall.setValue(true);
    EXPECT_TRUE(readFull());
    EXPECT_EQ(forms.waterfall.Graph3D.plotCount(), 2);
    EXPECT_EQ(styled, 0);
}

TEST_F(WaterfallCycleTest, PassOfTheContinuousView_KeepsPlotsAndRows) {
    panel.ContinuosLoopActive = true;
    EXPECT_TRUE(readFull());
    EXPECT_EQ(forms.waterfall.Graph3D.plotCount(), 2);
    EXPECT_EQ(forms.waterfall.Graph3D.valuePairs(2).count(), 1);
    EXPECT_EQ(resets, 0);
    EXPECT_EQ(styled, 0);
}

}  // namespace
}  // namespace zel
