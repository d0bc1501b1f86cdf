#include <gtest/gtest.h>

#include "platform/Graph.h"

namespace zel {
namespace {

struct GraphTest : ::testing::Test {
    Form form{"TestForm"};
    Graph graph{form, "graph"};
    int changes = 0;

    GraphTest() {
        graph.Changed.connect([this] { ++changes; });
    }
};

TEST_F(GraphTest, NewGraph_YAxis_RunsFromMinus120ToMinus20) {
    EXPECT_EQ(graph.yAxis().Minimum, -120);
    EXPECT_EQ(graph.yAxis().Maximum, -20);
}

TEST_F(GraphTest, SetXRange_SameRange_NotesNoChange) {
    graph.setXRange(1, 2);
    graph.setXRange(1, 2);
    EXPECT_EQ(changes, 1);
    EXPECT_EQ(graph.xAxis().Minimum, 1);
    EXPECT_EQ(graph.xAxis().Maximum, 2);
}

TEST_F(GraphTest, PlotY_SameValuesAgain_CountsAPlot) {
    graph.plotY({1, 2, 3}, 10, 0.5);
    graph.plotY({1, 2, 3}, 10, 0.5);
    EXPECT_EQ(graph.plotSerial(), 2U);
    EXPECT_EQ(graph.firstX(), 10);
    EXPECT_EQ(graph.increment(), 0.5);
    EXPECT_EQ(graph.values().size(), 3U);
}

TEST_F(GraphTest, ClearPlot_LeavesNoValues) {
    graph.plotY({1}, 0, 1);
    graph.clearPlot();
    EXPECT_TRUE(graph.values().empty());
}

TEST_F(GraphTest, Cursor_IndexFromOne_OutOfRangeGivesAnInvisibleOne) {
    GraphCursor cursor;
    cursor.X = 5;
    cursor.Visible = true;
    graph.addCursor(cursor);
    EXPECT_EQ(graph.cursor(1).X, 5);
    EXPECT_FALSE(graph.cursor(0).Visible);
    EXPECT_FALSE(graph.cursor(2).Visible);
}

TEST_F(GraphTest, MoveCursor_OutOfRange_ChangesNothing) {
    graph.addCursor({});
    changes = 0;
    graph.moveCursor(2, 1, 1);
    graph.showCursor(0, true);
    EXPECT_EQ(changes, 0);
    graph.moveCursor(1, 3, 4);
    EXPECT_EQ(changes, 1);
    EXPECT_EQ(graph.cursor(1).Y, 4);
}

TEST_F(GraphTest, RemoveCursors_LeavesNone) {
    graph.addCursor({});
    graph.removeCursors();
    EXPECT_EQ(graph.cursorCount(), 0);
}

}  // namespace
}  // namespace zel
