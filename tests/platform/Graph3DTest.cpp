#include <gtest/gtest.h>

#include "platform/Graph3D.h"

namespace zel {
namespace {

struct Graph3DTest : ::testing::Test {
    Form form{"Form"};
    Graph3D graph{form, "Graph3D"};
};

TEST_F(Graph3DTest, Start_HoldsOneEmptyFilledPlotAndTheDesignsView) {
    EXPECT_EQ(graph.plotCount(), 1);
    EXPECT_TRUE(graph.plots()[0].level.empty());
    EXPECT_EQ(graph.plots()[0].fillStyle, 2);
    EXPECT_EQ(graph.lastRow(), nullptr);
    EXPECT_EQ(graph.axis(1).Maximum, 12);
    EXPECT_EQ(graph.axis(2).Maximum, 10);
    EXPECT_EQ(graph.axis(3).Maximum, 10);
    EXPECT_EQ(graph.view().Latitude, 58);
    EXPECT_EQ(graph.view().Longitude, -325);
    EXPECT_EQ(graph.view().Distance, 2.8);
}

TEST_F(Graph3DTest, PlotCurve_FillsAnEmptyLastPlotElseAddsOne) {
    graph.plotCurve({0}, {2}, {3}, {4});
    EXPECT_EQ(graph.plotCount(), 1);
    EXPECT_EQ(graph.plots()[0].fillStyle, 2);
    graph.plotCurve({1}, {2}, {5}, {4});
    EXPECT_EQ(graph.plotCount(), 2);
    EXPECT_EQ(graph.plots()[0].level, std::vector<double>{3});
    EXPECT_EQ(graph.lastRow(), &graph.plots()[1]);
}

TEST_F(Graph3DTest, PlotCurve_TakesTheStampAndTellsOfIt) {
    int told = 0;
    graph.Plotted.connect([&] { ++told; });
    graph.stampNext(7, "12:00:00");
    graph.plotCurve({0}, {2}, {3}, {4});
    EXPECT_EQ(graph.plots()[0].row, 7);
    EXPECT_EQ(graph.plots()[0].time, "12:00:00");
    EXPECT_EQ(told, 1);
}

TEST_F(Graph3DTest, RemovePlot_CountsFromOne) {
    graph.plotCurve({1}, {1}, {1}, {1});
    graph.addPlot();
    graph.removePlot(1);
    graph.removePlot(5);
    EXPECT_EQ(graph.plotCount(), 1);
    EXPECT_TRUE(graph.plots()[0].x.empty());
}

TEST_F(Graph3DTest, PlotCurveBehindRemovePlots_HasAPlotToGoTo) {
    graph.removePlots();
    graph.plotCurve({1}, {1}, {1}, {1});
    EXPECT_EQ(graph.plotCount(), 1);
}

TEST_F(Graph3DTest, ValuePairs_LengthenWithEmptyOnes) {
    graph.setValuePair(2, 3, {"a", 3});
    EXPECT_EQ(graph.valuePairs(2).count(), 3);
    EXPECT_EQ(graph.valuePairs(2).item(3).Name, "a");
    EXPECT_EQ(graph.valuePairs(2).item(1).Name, "");
    EXPECT_EQ(graph.valuePairs(2).item(0).Name, "");
    EXPECT_EQ(graph.valuePairs(2).item(4).Name, "");
}

TEST_F(Graph3DTest, ValuePairs_ForgetOldOnesButCountThem) {
    const int many = ValuePairs::kKept + 100;
    for (int i = 1; i <= many; ++i) graph.setValuePair(2, i, {"t", static_cast<double>(i)});
    EXPECT_EQ(graph.valuePairs(2).count(), many);
    EXPECT_EQ(graph.valuePairs(2).item(100).Name, "");
    EXPECT_EQ(graph.valuePairs(2).item(101).Name, "t");
    EXPECT_EQ(graph.valuePairs(2).item(many).Value, many);
}

TEST_F(Graph3DTest, ValuePairs_AFarIndex_IsNoHugeList) {
    graph.setValuePair(2, 2000000000, {"far", 1});
    EXPECT_EQ(graph.valuePairs(2).item(2000000000).Name, "far");
}

TEST_F(Graph3DTest, Cursors_AreBounded) {
    for (int i = 0; i < 5000; ++i) graph.addCursor();
    EXPECT_EQ(graph.cursors().size(), 1000U);
}

}  // namespace
}  // namespace zel
