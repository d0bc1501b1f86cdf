#include <gtest/gtest.h>

#include <cmath>
#include <string>
#include <vector>

#include "forms/Forms.h"
#include "model/CodeTables.h"
#include "platform/virtual/VirtualTime.h"
#include "support/NumberText.h"
#include "trace/GraphScaling.h"

namespace zel {
namespace {

const double kOneVoltDbm = 30 - 10 * std::log10(50);

struct GraphScalingTest : ::testing::Test {
    ControllerForm panel;
    WaterfallForm waterfall;
    ZEL3Variables mirror;
    VirtualClock clock;
    GraphScaling scaling{panel, waterfall, mirror, clock};
    Graph& graph = panel.CWGraph1;
    Graph3D& graph3D = waterfall.Graph3D;

    GraphScalingTest() { mirror.Span = 1e6; }

    void expectLevels(double minimum, double maximum) {
        EXPECT_NEAR(graph.yAxis().Minimum, minimum, 1e-9);
        EXPECT_NEAR(graph.yAxis().Maximum, maximum, 1e-9);
        EXPECT_NEAR(graph3D.axis(3).Minimum, minimum, 1e-9);
        EXPECT_NEAR(graph3D.axis(3).Maximum, maximum, 1e-9);
    }
};

struct DimensionRow {
    std::int16_t mode;
    double span;
    const char* unit;
};

class Dimension : public GraphScalingTest, public ::testing::WithParamInterface<DimensionRow> {};

TEST_P(Dimension, GetDimension_FollowsModeAndSpan) {
    panel.InstrumentMode = GetParam().mode;
    mirror.Span = GetParam().span;
    EXPECT_EQ(GetDimension(panel, mirror), GetParam().unit);
}

INSTANTIATE_TEST_SUITE_P(
    Modes, Dimension,
    ::testing::Values(DimensionRow{ControllerForm::ANALYZER, 1e6, "Hz"},
                      DimensionRow{ControllerForm::ANALYZER, 0, "s"},
                      DimensionRow{ControllerForm::CHANNELPOWER, 1, "Hz"},
                      DimensionRow{ControllerForm::DISTTOFAULTMEASURE, 1e6, "m"},
                      DimensionRow{ControllerForm::DISTTOFAULTMEASURE, 0, "m"}));

TEST_F(GraphScalingTest, SetGraphXAxis_ScalesBothGraphsAndStoresTheView) {
    scaling.setGraphXAxis(1e9, 2e9);
    EXPECT_EQ(panel.ViewStart, 1e9);
    EXPECT_EQ(panel.ViewStop, 2e9);
    EXPECT_EQ(graph.xAxis().Minimum, 1e9);
    EXPECT_EQ(graph.xAxis().Maximum, 2e9);
    EXPECT_EQ(graph3D.axis(1).Minimum, 1e9);
    EXPECT_EQ(graph3D.axis(1).Maximum, 2e9);
}

TEST_F(GraphScalingTest, SetGraphXAxis_WhileZoomed_LeavesTheAxesAlone) {
    scaling.setGraphXAxis(1e9, 2e9);
    panel.GraphZoomed = true;
    mirror.Span = 0;
    scaling.setGraphXAxis(0, 0.02);
    EXPECT_EQ(graph.xAxis().Maximum, 2e9);
    EXPECT_EQ(graph3D.axis(1).Maximum, 2e9);
    EXPECT_EQ(panel.ViewStop, 0.02);
    EXPECT_EQ(graph3D.axis(1).Format, "k\"s\"");
}

TEST_F(GraphScalingTest, SetGraphXAxis_FormatIsHertzUnlessTheSpanIsZero) {
    scaling.setGraphXAxis(0, 1);
    EXPECT_EQ(graph3D.axis(1).Format, "k\"Hz\"");
    mirror.Span = 0;
    scaling.setGraphXAxis(0, 1);
    EXPECT_EQ(graph3D.axis(1).Format, "k\"s\"");
}

struct RangeRow {
    int code;
    double decibels;
};

class LogarithmicRange : public GraphScalingTest, public ::testing::WithParamInterface<RangeRow> {};

TEST_P(LogarithmicRange, SetGraphYAxis_ByCode_ShowsTenDivisionsBelowTheLevel) {
    mirror.ReferenceRange = GetParam().code;
    scaling.setGraphYAxis(-20, LevelRange::ofCode(GetParam().code));
    expectLevels(-20 - 10 * GetParam().decibels, -20);
    EXPECT_TRUE(graph.yAxis().ShowLabels);
}

TEST_P(LogarithmicRange, SetGraphYAxis_ByDecibels_LeavesTheDecibelsAsTheRange) {
    mirror.ReferenceRange = RANGELIN;
    scaling.setGraphYAxis(-20, LevelRange::ofDecibels(GetParam().decibels));
    expectLevels(-20 - 10 * GetParam().decibels, -20);
    EXPECT_EQ(mirror.ReferenceRange, GetParam().decibels);
}

INSTANTIATE_TEST_SUITE_P(Codes, LogarithmicRange,
                         ::testing::Values(RangeRow{RANGE10DB, 10}, RangeRow{RANGE5DB, 5},
                                           RangeRow{RANGE2DB, 2}, RangeRow{RANGE1DB, 1}));

class LinearRange : public GraphScalingTest, public ::testing::WithParamInterface<int> {};

TEST_P(LinearRange, SetGraphYAxis_RunsFromZeroToHundredWhateverTheLevel) {
    mirror.ReferenceRange = GetParam();
    graph.showYLabels(false);
    for (const double level : {-20.0, 0.0, 130.0}) {
        scaling.setGraphYAxis(level, LevelRange::ofCode(GetParam()));
        expectLevels(0, 100);
    }
    EXPECT_TRUE(graph.yAxis().ShowLabels);
    EXPECT_EQ(graph3D.axis(3).Format, "%");
}

TEST_P(LinearRange, SetGraphYAxis_KeepsTheFlagOfALinearFile) {
    mirror.ReferenceRange = GetParam();
    panel.isZELViewLinFile = true;
    scaling.setGraphYAxis(-20, LevelRange::ofCode(GetParam()));
    EXPECT_TRUE(panel.isZELViewLinFile);
}

INSTANTIATE_TEST_SUITE_P(Codes, LinearRange, ::testing::Values(4, 5, 6, 7, 8));

TEST_F(GraphScalingTest, SetGraphYAxis_DecibelRange_ClearsTheFlagOfALinearFile) {
    panel.isZELViewLinFile = true;
    scaling.setGraphYAxis(-20, LevelRange::ofCode(RANGE10DB));
    EXPECT_FALSE(panel.isZELViewLinFile);
}

TEST_F(GraphScalingTest, SetGraphYAxis_DecibelLevel_IsRoundedToAWholeNumberHalfToEven) {
    scaling.setGraphYAxis(-20.5, LevelRange::ofCode(RANGE10DB));
    expectLevels(-120, -20);
    scaling.setGraphYAxis(-21.5, LevelRange::ofCode(RANGE10DB));
    expectLevels(-122, -22);
}

TEST_F(GraphScalingTest, SetGraphYAxis_Volts_ScalesInDbmAndHidesTheLabels) {
    mirror.ReferenceUnit = UNITV;
    graph3D.setLabelColor(2, 123);
    graph3D.BackColor = 456;
    scaling.setGraphYAxis(1, LevelRange::ofCode(RANGE10DB));
    expectLevels(kOneVoltDbm - 100, kOneVoltDbm);
    EXPECT_FALSE(graph.yAxis().ShowLabels);
    EXPECT_EQ(graph3D.axis(3).LabelColor, 456U);
}

TEST_F(GraphScalingTest, SetGraphYAxis_Watts_ScalesInDbmAndHidesTheLabels) {
    mirror.ReferenceUnit = UNITW;
    scaling.setGraphYAxis(0.001, LevelRange::ofCode(RANGE5DB));
    expectLevels(-50, 0);
    EXPECT_FALSE(graph.yAxis().ShowLabels);
}

TEST_F(GraphScalingTest, SetGraphYAxis_VoltsAMetre_HidesTheLabelsAndKeepsTheLevel) {
    mirror.ReferenceUnit = 8;
    scaling.setGraphYAxis(50.4, LevelRange::ofCode(RANGE10DB));
    expectLevels(-50, 50);
    EXPECT_FALSE(graph.yAxis().ShowLabels);
}

TEST_F(GraphScalingTest, SetGraphYAxis_BackInDecibels_ShowsTheLabelsAgain) {
    mirror.ReferenceUnit = UNITV;
    graph3D.setLabelColor(2, 123);
    scaling.setGraphYAxis(1, LevelRange::ofCode(RANGE10DB));
    mirror.ReferenceUnit = UNITDBM;
    scaling.setGraphYAxis(-20, LevelRange::ofCode(RANGE10DB));
    EXPECT_TRUE(graph.yAxis().ShowLabels);
    EXPECT_EQ(graph3D.axis(3).LabelColor, 123U);
}

struct FormatRow {
    double unit;
    const char* format;
    const char* shown;
};

class UnitFormat : public GraphScalingTest, public ::testing::WithParamInterface<FormatRow> {};

TEST_P(UnitFormat, SetYAxisFormat_FollowsTheUnit) {
    mirror.ReferenceUnit = GetParam().unit;
    scaling.SetYAxisFormat();
    EXPECT_EQ(graph3D.axis(3).Format, GetParam().format);
}

TEST_P(UnitFormat, SetYAxisFormat_OnALinearRange_IsPercent) {
    mirror.ReferenceUnit = GetParam().unit;
    mirror.ReferenceRange = RANGELIN;
    scaling.SetYAxisFormat();
    EXPECT_EQ(graph3D.axis(3).Format, "%");
}

TEST_P(UnitFormat, SetGraphYAxis_WritesTheBoundsWithTheUnitOfTheFormat) {
    mirror.ReferenceUnit = GetParam().unit;
    scaling.setGraphYAxis(10, LevelRange::ofCode(RANGE10DB));
    const std::string low = generalNumber(roundHalfEven(graph.yAxis().Minimum, 9));
    const std::string high = generalNumber(roundHalfEven(graph.yAxis().Maximum, 9));
    EXPECT_EQ(waterfall.lblMin.Caption.get(), low + " " + GetParam().shown);
    EXPECT_EQ(waterfall.lblMAX.Caption.get(), high + " " + GetParam().shown);
}

TEST_F(GraphScalingTest, SetGraphYAxis_InDbm_WritesTheBoundsAsTexts) {
    scaling.setGraphYAxis(-20, LevelRange::ofCode(RANGE10DB));
    EXPECT_EQ(waterfall.lblMin.Caption.get(), "-120 dBm");
    EXPECT_EQ(waterfall.lblMAX.Caption.get(), "-20 dBm");
}

TEST_F(GraphScalingTest, SetGraphYAxis_InVolts_WritesRoundBoundsInDbm) {
    mirror.ReferenceUnit = UNITV;
    scaling.setGraphYAxis(0.0223606797749979, LevelRange::ofCode(RANGE10DB));
    EXPECT_EQ(waterfall.lblMin.Caption.get(), "-120 dBm");
    EXPECT_EQ(waterfall.lblMAX.Caption.get(), "-20 dBm");
}

INSTANTIATE_TEST_SUITE_P(Units, UnitFormat,
                         ::testing::Values(FormatRow{UNITDBM, "k\"dBm\"", "dBm"},
                                           FormatRow{UNITDBMV, "k\"dBmV\"", "dBmV"},
                                           FormatRow{UNITDBUV, "k\"dBuV\"", "dBuV"},
                                           FormatRow{UNITDBUVM, "k\"dBuV/m\"", "dBuV/m"},
                                           FormatRow{UNITDBUAM, "k\"dBuA/m\"", "dBuA/m"},
                                           FormatRow{UNITDB, "k\"dB\"", "dB"},
                                           FormatRow{UNITV, "%", "dBm"},
                                           FormatRow{UNITW, "%", "dBm"},
                                           FormatRow{8, "k\"V/m\"", "V/m"}));

TEST_F(GraphScalingTest, SetYAxisFormat_UnknownUnit_LeavesTheFormat) {
    graph3D.setFormat(3, "k\"dB\"");
    mirror.ReferenceUnit = 9;
    scaling.SetYAxisFormat();
    EXPECT_EQ(graph3D.axis(3).Format, "k\"dB\"");
}

TEST_F(GraphScalingTest, SetGraphYAxis_LinearRange_WritesTheBoundsInPercent) {
    mirror.ReferenceRange = RANGELIN;
    scaling.setGraphYAxis(-20, LevelRange::ofCode(RANGELIN));
    EXPECT_EQ(waterfall.lblMin.Caption.get(), "0 %");
    EXPECT_EQ(waterfall.lblMAX.Caption.get(), "100 %");
}

TEST_F(GraphScalingTest, SetGraphAxes_CallsTheWaterfallInItsOrder) {
    std::vector<std::string> calls;
    waterfall.limitRows.connect(
        [&](int rows) { calls.push_back("limitRows " + std::to_string(rows)); });
    waterfall.stampRow.connect([&](const std::string& time) { calls.push_back("stamp " + time); });
    waterfall.saveGraphView.connect([&] { calls.emplace_back("saveGraphView"); });
    clock.setDate(dateOf(2026, 3, 4, 9, 8, 7));
    scaling.setGraphAxes(1, 2, -20, LevelRange::ofCode(RANGE10DB));
    EXPECT_EQ(calls,
              (std::vector<std::string>{"limitRows 100", "stamp 09:08:07", "saveGraphView"}));
    EXPECT_EQ(graph.xAxis().Minimum, 1);
    expectLevels(-120, -20);
}

/// A whole sweep without an axis.
Sweep sweepOf(int detector, double span, double sweepTime) {
    Sweep sweep;
    sweep.settings.TraceDetector = static_cast<std::uint8_t>(detector);
    sweep.settings.Span = span;
    sweep.settings.SweepTime = sweepTime;
    sweep.shown.assign(detector == DETAUTOPEAK ? 602 : 301, -40);
    sweep.colours.assign(sweep.shown.size(), 50);
    sweep.wanted = sweep.came = sweep.shown.size();
    return sweep;
}

struct PlotRow {
    double span;
    int detector;
    double first;
    double increment;
};

class Plotted : public GraphScalingTest, public ::testing::WithParamInterface<PlotRow> {};

TEST_P(Plotted, DisplayDataOnGraph_HasItsFirstXAndIncrement) {
    Sweep sweep = sweepOf(GetParam().detector, GetParam().span, 0.5);
    sweep.axis.start = 1e9;
    sweep.axis.stop = 1.6e9;
    placePoints(sweep);
    scaling.DisplayDataOnGraph(sweep);
    EXPECT_EQ(graph.values(), sweep.shown);
    EXPECT_EQ(graph.firstX(), GetParam().first);
    EXPECT_DOUBLE_EQ(graph.increment(), GetParam().increment);
}

INSTANTIATE_TEST_SUITE_P(Cases, Plotted,
                         ::testing::Values(PlotRow{6e8, DETSAMPLE, 1e9, 2e6},
                                           PlotRow{6e8, DETAUTOPEAK, 1e9, 1e6},
                                           PlotRow{0, DETSAMPLE, 0, 0.5 / 298},
                                           PlotRow{0, DETAUTOPEAK, 0, 0.5 / 596}));

TEST_F(GraphScalingTest, DisplayDataOnGraph_AtZeroSpan_EndsTwoStepsBeyondTheSweepTime) {
    Sweep sweep = sweepOf(DETSAMPLE, 0, 0.298);
    sweep.axis.stop = 0.298;
    placePoints(sweep);
    scaling.DisplayDataOnGraph(sweep);
    EXPECT_NEAR(graph.firstX() + 300 * graph.increment(), 0.3, 1e-12);
}

TEST_F(GraphScalingTest, DisplayDataOnGraph_AutoPeak_GivesTheWaterfallItsCurve) {
    panel.YVectorVal = 3;
    panel.ViewStart = 100;
    Sweep sweep = sweepOf(DETAUTOPEAK, 600, 0);
    sweep.axis.start = 100;
    sweep.axis.stop = 700;
    placePoints(sweep);
    scaling.DisplayDataOnGraph(sweep);
    const GraphCurve3D& curve = graph3D.plots().back();
    EXPECT_EQ(curve.depth, std::vector<double>(602, 3));
    ASSERT_EQ(curve.x.size(), 602U);
    EXPECT_EQ(curve.x.front(), 100);
    EXPECT_NEAR(curve.x.back(), 701, 1e-9);
    EXPECT_EQ(curve.level, sweep.shown);
    EXPECT_EQ(curve.colour, sweep.colours);
}

TEST_F(GraphScalingTest, DisplayDataOnGraph_IncompleteSweep_IsMarkedAndNoRowOfTheWaterfall) {
    Sweep sweep = sweepOf(DETSAMPLE, 600, 0);
    sweep.came = 150;
    scaling.DisplayDataOnGraph(sweep);
    EXPECT_EQ(graph.Incomplete.get(), "INCOMPLETE 150/301");
    EXPECT_TRUE(graph3D.plots().back().level.empty());
    sweep.came = 301;
    scaling.DisplayDataOnGraph(sweep);
    EXPECT_EQ(graph.Incomplete.get(), "");
    EXPECT_EQ(graph3D.plots().back().level, sweep.shown);
}

TEST_F(GraphScalingTest, BuildXYVectors_Fills602ValuesFromTheViewsStart) {
    panel.ViewStart = 10;
    panel.YVectorVal = 7;
    scaling.BuildXYVectors(0.5);
    ASSERT_EQ(panel.XVector.size(), 602U);
    EXPECT_EQ(panel.XVector[0], 10);
    EXPECT_EQ(panel.XVector[601], 10 + 601 * 0.5);
    EXPECT_EQ(panel.YVector, std::vector<double>(602, 7));
}

TEST_F(GraphScalingTest, SizeXYVectors_CountsTheIndexZero) {
    scaling.SizeXYVectors(300);
    EXPECT_EQ(panel.XVector.size(), 301U);
    EXPECT_EQ(panel.YVector.size(), 301U);
}

struct TriggerRow {
    double unit;
    double range;
    double level;
    double percent;
    double height;
};

class TriggerLine : public GraphScalingTest, public ::testing::WithParamInterface<TriggerRow> {};

TEST_P(TriggerLine, SetAnnotation_DrawsAtMinusItsHeight) {
    mirror.ReferenceUnit = GetParam().unit;
    mirror.ReferenceRange = GetParam().range;
    mirror.ReferenceLevel = GetParam().level;
    scaling.SetAnnotation(GetParam().percent);
    EXPECT_NEAR(mirror.TriggerLevelValue, -GetParam().height, 1e-9);
    EXPECT_NEAR(graph.trigger().Height, -GetParam().height, 1e-9);
    EXPECT_EQ(graph.trigger().Caption, "T");
    EXPECT_TRUE(graph.trigger().Visible);
}

INSTANTIATE_TEST_SUITE_P(Cases, TriggerLine,
                         ::testing::Values(TriggerRow{UNITDBM, RANGE10DB, -20, 50, 170},
                                           TriggerRow{UNITDBM, RANGE5DB, -20, 50, 145},
                                           TriggerRow{UNITDB, RANGE2DB, 10, 0, 90},
                                           TriggerRow{UNITDBM, RANGE1DB, 0, 100, 110},
                                           TriggerRow{UNITV, RANGE10DB, 1, 50, 150 - kOneVoltDbm},
                                           TriggerRow{UNITW, RANGE10DB, 0.001, 50, 150},
                                           TriggerRow{8, RANGE10DB, 40, 50, 110},
                                           TriggerRow{UNITDBM, RANGELIN, -20, 30, 30},
                                           TriggerRow{UNITV, RANGEVSWR11, 1, 30, 30}));

TEST_F(GraphScalingTest, ShowAnnotation_BringsTheLineBackWhereItStood) {
    mirror.ReferenceRange = RANGELIN;
    scaling.SetAnnotation(30);
    scaling.hideAnnotation();
    EXPECT_FALSE(graph.trigger().Visible);
    scaling.showAnnotation();
    EXPECT_TRUE(graph.trigger().Visible);
    EXPECT_EQ(graph.trigger().Height, -30);
}

}  // namespace
}  // namespace zel
