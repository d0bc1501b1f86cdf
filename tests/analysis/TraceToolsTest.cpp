// All tools together over sweeps.

#include <gtest/gtest.h>

#include <limits>

#include "analysis/TraceTools.h"

namespace zel {
namespace {

Sweep sweepOf(std::vector<double> levels) {
    Sweep sweep;
    sweep.wanted = sweep.came = levels.size();
    sweep.axis.start = 0;
    sweep.axis.stop = static_cast<double>(levels.size()) - 1;
    sweep.axis.unit = "Hz";
    sweep.physical = std::move(levels);
    sweep.settings.TraceDetector = DETSAMPLE;
    return sweep;
}

TEST(TraceTools, MaskIsCountedSweepBySweep) {
    TraceTools tools;
    int failed = 0;
    tools.MaskFailed.connect([&failed] { ++failed; });
    tools.setMask(readMask("x;upper;lower\n0;-30;\n4;-30;\n"));
    tools.take(sweepOf({-90, -40, -90, -90, -90}), {});
    tools.take(sweepOf({-90, -20, -90, -90, -90}), {});
    EXPECT_EQ(tools.maskCount().text(), "pass 1/2");
    EXPECT_EQ(failed, 1);
    EXPECT_FALSE(tools.result().mask->pass);
    tools.refresh();
    EXPECT_EQ(tools.maskCount().text(), "pass 1/2");
}

TEST(TraceTools, VerdictIsThatOfTheMask_AndAPassWithoutOne) {
    TraceTools tools;
    tools.take(sweepOf({-90, -20, -90, -90, -90}), {});
    EXPECT_TRUE(tools.verdict().pass);
    EXPECT_FALSE(tools.verdict().margin);
    tools.setMask(readMask("x;upper;lower\n0;-30;\n4;-30;\n"));
    EXPECT_FALSE(tools.verdict().pass);
    EXPECT_EQ(tools.verdict().x, 1);
    Sweep cut = sweepOf({-90, -10, std::numeric_limits<double>::quiet_NaN()});
    cut.came = 2;
    tools.take(cut, {});
    EXPECT_TRUE(tools.verdict().pass);
    EXPECT_FALSE(tools.verdict().margin);
}

TEST(TraceTools, IncompleteSweep_LeavesNoFigureOfTheOneBefore) {
    TraceTools tools;
    tools.traces().switchOn(HoldKind::Max, true);
    tools.take(sweepOf({-90, -40, -90}), {});
    ASSERT_EQ(tools.result().peaks.size(), 1U);
    Sweep cut = sweepOf({-90, -10, std::numeric_limits<double>::quiet_NaN()});
    cut.came = 2;
    tools.take(cut, {});
    EXPECT_TRUE(tools.result().peaks.empty());
    EXPECT_EQ(tools.problem(), "incomplete trace: 2 of 3 samples");
    EXPECT_EQ(tools.traces().held(HoldKind::Max).level[1], -40);
    tools.take(sweepOf({-90, -30, -90}), {});
    EXPECT_EQ(tools.traces().held(HoldKind::Max).level[1], -30);
    EXPECT_EQ(tools.traces().count(HoldKind::Max), 2U);
}

TEST(TraceTools, AnotherMode_EndsTheHolds) {
    TraceTools tools;
    tools.traces().switchOn(HoldKind::Max, true);
    tools.take(sweepOf({-90, -40, -90}), {1, {}});
    tools.take(sweepOf({-90, -60, -90}), {2, {}});
    EXPECT_EQ(tools.traces().ended(), "Held traces ended: mode changed");
    EXPECT_EQ(tools.traces().held(HoldKind::Max).level[1], -60);
}

TEST(TraceTools, CorrectionThatDoesNotCover_SaysSoAndGivesNoFigure) {
    TraceTools tools;
    tools.take(sweepOf({-90, -40, -90}), {});
    tools.setCorrections({readCorrection("x;db\n0;1\n1;1\n", CorrectionKind::Cable, "c")});
    EXPECT_EQ(tools.problem(), "cable c does not cover the whole span");
    EXPECT_FALSE(tools.trace());
    EXPECT_TRUE(tools.result().peaks.empty());
    tools.setCorrections({readCorrection("x;db\n0;1\n9;1\n", CorrectionKind::Cable, "c")});
    EXPECT_EQ(tools.result().peaks.at(0).level, -39);
    tools.setCorrections({});
    EXPECT_EQ(tools.result().peaks.at(0).level, -40);
}

TEST(TraceTools, Statistics_BeginAgainWithAnotherSpan) {
    TraceTools tools;
    tools.countStatistics(-50);
    tools.take(sweepOf({-90, -40, -90}), {});
    tools.take(sweepOf({-90, -60, -90}), {});
    EXPECT_EQ(tools.statistics()->occupancy(), (std::vector<double>{0, 0.5, 0}));
    tools.take(sweepOf({-90, -60}), {});
    EXPECT_EQ(tools.statistics()->count(), 1U);
}

TEST(TraceTools, MarkerOnAPeakPastTheTable_IsRead) {
    TraceTools tools;
    tools.request.peaks = 1;
    tools.markers[0] = {true, 0, 2, 0};
    tools.take(sweepOf({-90, -40, -90, -50, -90}), {});
    ASSERT_TRUE(tools.readings()[0].level);
    EXPECT_EQ(tools.readings()[0].level, -50);
}

}  // namespace
}  // namespace zel
