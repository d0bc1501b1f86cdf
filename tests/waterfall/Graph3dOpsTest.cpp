#include <gtest/gtest.h>

#include "waterfall/Graph3dOps.h"

namespace zel {
namespace {

struct Graph3dOpsTest : ::testing::Test {
    WaterfallForm form;
    Graph3dOps ops{form};
    Graph3D& graph = form.Graph3D;
    int depth = 0;

    /// A row as the read cycle makes it.
    void row(const std::string& time) {
        ops.limitRows(graph, 100);
        ops.stampRow(graph, time);
        graph.plotCurve(std::vector<double>(3, depth++), {1, 2, 3}, {-50, -40, -30}, {0, 50, 100});
    }
    std::string label(int row) const { return graph.valuePairs(2).item(row).Name; }
};

TEST_F(Graph3dOpsTest, LimitRows_AHundredRows_RemovesNothing) {
    for (int i = 0; i < 100; ++i) row("12:00:00");
    EXPECT_EQ(graph.plotCount(), 100);
    EXPECT_EQ(graph.axis(2).Minimum, 0);
    EXPECT_EQ(graph.axis(2).Maximum, 99);
    EXPECT_EQ(graph.plots().front().depth.front(), 0);
}

TEST_F(Graph3dOpsTest, LimitRows_Row101_DropsTheOldestAndMovesTheAxis) {
    for (int i = 0; i < 101; ++i) row("12:00:00");
    EXPECT_EQ(graph.plotCount(), 100);
    EXPECT_EQ(graph.axis(2).Minimum, 1);
    EXPECT_EQ(graph.axis(2).Maximum, 100);
    EXPECT_EQ(graph.plots().front().depth.front(), 1);
    EXPECT_EQ(graph.plots().back().depth.front(), 100);
}

TEST_F(Graph3dOpsTest, LimitRows_TenThousandRows_StayAHundred) {
    for (int i = 0; i < 10000; ++i) row("12:00:00");
    EXPECT_EQ(graph.plotCount(), 100);
    EXPECT_EQ(form.DepthAxisMin, 9900);
    EXPECT_EQ(graph.axis(2).Maximum, 9999);
}

TEST_F(Graph3dOpsTest, LimitRows_BehindAClear_BeginsAgainAtZero) {
    for (int i = 0; i < 120; ++i) row("12:00:00");
    ops.clearGraph(graph);
    row("12:00:00");
    EXPECT_EQ(graph.axis(2).Minimum, 0);
    EXPECT_EQ(graph.axis(2).Maximum, 99);
}

TEST_F(Graph3dOpsTest, StampRow_FirstRow_HasALabelWhateverTheTime) {
    form.LastStampText = "12:00:00";
    row("12:00:00");
    EXPECT_EQ(label(1), "12:00:00     ");
    EXPECT_EQ(graph.valuePairs(2).item(1).Value, 1);
    EXPECT_TRUE(form.StampPending);
}

TEST_F(Graph3dOpsTest, StampRow_SameSecond_HasNoLabel) {
    for (int i = 0; i < 20; ++i) row("12:00:00");
    for (int i = 2; i <= 20; ++i) EXPECT_EQ(label(i), "") << i;
    EXPECT_EQ(graph.valuePairs(2).count(), 20);
    EXPECT_EQ(graph.valuePairs(2).item(20).Value, 20);
}

TEST_F(Graph3dOpsTest, StampRow_TimeChangesEachRow_EveryFourthRowIsLabelled) {
    for (int i = 1; i <= 14; ++i) row("12:00:" + std::to_string(10 + i));
    for (int i = 1; i <= 14; ++i) EXPECT_EQ(label(i).empty(), i % 4 != 1) << i;
}

TEST_F(Graph3dOpsTest, StampRow_LabelComesWithTheFirstRowOfTheNextTime) {
    for (int i = 1; i <= 10; ++i) row("12:00:00");
    row("12:00:01");
    row("12:00:01");
    EXPECT_EQ(label(11), "12:00:01     ");
    EXPECT_EQ(label(12), "");
    // The row after a label moves the last stamp on.
    EXPECT_EQ(form.LastStampText, "12:00:01");
    EXPECT_EQ(form.LastStampRow, 12);
}

TEST_F(Graph3dOpsTest, StampRow_BehindAClear_TreatsTheNextRowAsTheFirst) {
    for (int i = 0; i < 5; ++i) row("12:00:00");
    ops.clearGraph(graph);
    EXPECT_EQ(form.RowCount, 0);
    EXPECT_TRUE(graph.valuePairs(2).empty());
    row("12:00:00");
    EXPECT_EQ(label(1), "12:00:00     ");
    EXPECT_EQ(graph.plots().back().row, 1);
}

TEST_F(Graph3dOpsTest, StyleLastRow_StylesTheNewestByTheMode) {
    row("12:00:00");
    row("12:00:00");
    ops.styleLastRow(graph);
    EXPECT_TRUE(graph.plots()[0].lineVisible);
    EXPECT_FALSE(graph.plots()[1].lineVisible);
    EXPECT_EQ(graph.plots()[1].fillStyle, 2);
    EXPECT_EQ(graph.plots()[1].colorMapStyle, 1);
    form.IsSpectrogram = true;
    ops.styleLastRow(graph);
    EXPECT_EQ(graph.plots()[1].colorMapStyle, 4);
}

TEST_F(Graph3dOpsTest, StyleLastRow_WithoutAPlot_DoesNothing) {
    graph.removePlots();
    ops.styleLastRow(graph);
    EXPECT_EQ(graph.plotCount(), 0);
}

TEST_F(Graph3dOpsTest, SaveGraphView_GoesIntoTheSetOfTheMode) {
    graph.setView({10, 20, 3, 4, 5, 6});
    ops.saveGraphView(graph, false);
    EXPECT_EQ(form.WaterfallView.Latitude, 10);
    EXPECT_EQ(form.SpectrogramView.Latitude, 58);
    form.IsSpectrogram = true;
    graph.setView({11, 21, 3, 7, 8, 9});
    ops.saveGraphView(graph, true);
    EXPECT_EQ(form.SpectrogramView.Longitude, 21);
    EXPECT_EQ(form.WaterfallView.Latitude, 10);
    EXPECT_EQ(form.WaterfallView.TransY, 8);
}

TEST_F(Graph3dOpsTest, ClearGraph_LeavesOneEmptyFilledPlot) {
    for (int i = 0; i < 5; ++i) row("12:00:00");
    ops.clearGraph(graph);
    EXPECT_EQ(graph.plotCount(), 1);
    EXPECT_TRUE(graph.plots()[0].level.empty());
    EXPECT_EQ(graph.plots()[0].fillStyle, 2);
}

TEST_F(Graph3dOpsTest, SetProjection_SwitchesTheLevelTicksOn) {
    graph.LevelTicks = false;
    graph.PerspectiveFactor = 0.5;
    ops.setProjection(graph, true);
    EXPECT_EQ(graph.Projection.get(), Projection3D::Orthographic);
    EXPECT_TRUE(graph.LevelTicks);
    EXPECT_EQ(graph.PerspectiveFactor, 0.5);
    ops.setProjection(graph, false);
    EXPECT_EQ(graph.Projection.get(), Projection3D::Perspective);
    EXPECT_EQ(graph.PerspectiveFactor, 1.0);
}

}  // namespace
}  // namespace zel
