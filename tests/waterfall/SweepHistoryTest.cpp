#include <gtest/gtest.h>

#include <cmath>

#include "waterfall/SpectrogramImage.h"
#include "waterfall/SweepHistory.h"

namespace zel {
namespace {

struct SweepHistoryTest : ::testing::Test {
    Forms forms;
    ControllerForm& panel = forms.controller;
    Graph3D& graph = forms.waterfall.Graph3D;
    SweepHistory history{forms};
    int number = 0;

    SweepHistoryTest() { graph.setRange(3, -100, 0); }

    void sweep(double level, std::size_t points = 301, double firstX = 1e9, double step = 1e6) {
        std::vector<double> levels(points, level);
        levels[points / 2] = -1;
        panel.CWGraph1.plotY(levels, firstX, step);
        panel.RawTraceData = levels;
        ++number;
        graph.stampNext(number, "12:00:" + std::to_string(number));
        graph.plotCurve(std::vector<double>(points, number), std::vector<double>(points, 0), levels,
                        levels);
        if (graph.plotCount() > 100) graph.removePlot(1);
    }
};

TEST_F(SweepHistoryTest, EachRowOfTheGraph_IsKeptWithItsTimeAndAxis) {
    sweep(-80);
    sweep(-70);
    ASSERT_EQ(history.count(), 2);
    EXPECT_EQ(history.row(0).time, "12:00:2");
    EXPECT_EQ(history.row(1).time, "12:00:1");
    EXPECT_EQ(history.row(0).firstX, 1e9);
    EXPECT_EQ(history.row(0).increment, 1e6);
    EXPECT_NEAR(history.row(0).level(0), -70, 0.002);
    EXPECT_NEAR(history.row(0).level(150), -1, 0.002);
}

TEST_F(SweepHistoryTest, MoreRowsThanItHolds_AreBounded) {
    for (int i = 0; i < SweepHistory::kRows + 50; ++i) sweep(-80);
    EXPECT_EQ(history.count(), SweepHistory::kRows);
    EXPECT_EQ(history.added(), static_cast<unsigned long>(SweepHistory::kRows + 50));
    EXPECT_EQ(history.row(SweepHistory::kRows - 1).time, "12:00:51");
}

TEST_F(SweepHistoryTest, LevelsThatAreNoNumbers_StandAtTheFoot) {
    sweep(std::nan(""));
    EXPECT_EQ(history.row(0).level(0), -100);
    graph.setRange(3, 5, 5);
    sweep(7);
    EXPECT_EQ(history.row(0).level(0), 5);
    graph.setRange(3, std::nan(""), 5);
    sweep(7);
    EXPECT_TRUE(std::isfinite(history.row(0).level(0)));
}

TEST_F(SweepHistoryTest, LongRows_AreCut) {
    sweep(-80, 100000);
    EXPECT_EQ(history.row(0).size(), SweepHistory::kLongestRow);
    EXPECT_EQ(history.row(0).raw().size(), SweepHistory::kLongestRow);
}

TEST_F(SweepHistoryTest, Clear_OfTheWaterfall_ClearsItToo) {
    int cleared = 0;
    history.Cleared.connect([&] { ++cleared; });
    sweep(-80);
    forms.waterfall.clearGraph();
    EXPECT_EQ(history.count(), 0);
    EXPECT_EQ(cleared, 1);
}

TEST_F(SweepHistoryTest, Recording_HasAHeaderAndTheRowsAsRead) {
    history.describe = [this] {
        return "Trace Name;A\r\nDate;2026-01-31\r\nTime;12:00:0" + std::to_string(number) +
               "\r\nTrace Write Pointer;301\r\n\r\n";
    };
    sweep(-80.125, 3);
    sweep(-70, 3);
    EXPECT_EQ(history.recording(),
              "Trace Name;A\r\nDate;2026-01-31\r\nTime;12:00:01\r\nTrace Write Pointer;301\r\n\r\n"
              "1000000000.000;-80.125; \r\n1001000000.000;-1; \r\n1002000000.000;-80.125; \r\n"
              "Trace Name;A\r\nDate;2026-01-31\r\nTime;12:00:02\r\nTrace Write Pointer;301\r\n\r\n"
              "1000000000.000;-70; \r\n1001000000.000;-1; \r\n1002000000.000;-70; \r\n");
    // Sweeps of one setting share the header.
    EXPECT_EQ(history.row(0).header, history.row(1).header);
}

TEST_F(SweepHistoryTest, Recording_OfPairs_HasTwoValuesARow) {
    history.describe = [] { return std::string("Trace Write Pointer;301\r\n\r\n"); };
    sweep(-80, 602);
    const std::string text = history.recording();
    EXPECT_NE(text.find("1000000000.000;-80;-80\r\n1002000000.000;-80;-80\r\n"), std::string::npos);
}

TEST_F(SweepHistoryTest, Recording_LeavesRowsOfAFileOut) {
    history.describe = [] { return std::string("header\r\n"); };
    panel.Shown.fromFile = true;
    sweep(-80);
    EXPECT_EQ(history.recording(), "");
}

struct SpectrogramTest : SweepHistoryTest {
    SpectrogramImage image{history};
    SpectrogramFrame frame{301, 1e9, 1.3e9, -100, 0, 4};
};

TEST_F(SpectrogramTest, TheNewestRow_IsTheFirstLine) {
    sweep(-80);
    image.update(frame);
    sweep(-20);
    image.update(frame);
    ASSERT_EQ(image.rows(), 2);
    const ColourMap& map = ColourMap::ofStyle(4);
    const LevelScale scale(-100, 0);
    EXPECT_EQ(image.line(0)[20], map.colour(scale.index(-20)));
    EXPECT_EQ(image.line(1)[20], map.colour(scale.index(-80)));
}

TEST_F(SpectrogramTest, ACarrier_StandsAtItsX) {
    sweep(-80);
    image.update(frame);
    const Pixel carrier = ColourMap::ofStyle(4).colour(LevelScale(-100, 0).index(-1));
    int first = -1;
    int count = 0;
    for (int x = 0; x < frame.width; ++x) {
        if (image.line(0)[x] != carrier) continue;
        if (first < 0) first = x;
        ++count;
    }
    EXPECT_NEAR(first, 150, 1);
    EXPECT_LE(count, 2);
}

TEST_F(SpectrogramTest, Zoomed_TheCarrierMovesAlong) {
    sweep(-80);
    frame.firstX = 1.1e9;
    frame.lastX = 1.2e9;
    image.update(frame);
    const Pixel carrier = ColourMap::ofStyle(4).colour(LevelScale(-100, 0).index(-1));
    EXPECT_EQ(image.line(0)[150], carrier);
    EXPECT_NE(image.line(0)[140], carrier);
}

TEST_F(SpectrogramTest, NarrowPictures_ShowTheHighestOfTheirSamples) {
    sweep(-80);
    frame.width = 30;
    image.update(frame);
    const Pixel carrier = ColourMap::ofStyle(4).colour(LevelScale(-100, 0).index(-1));
    int count = 0;
    for (int x = 0; x < frame.width; ++x) count += image.line(0)[x] == carrier ? 1 : 0;
    EXPECT_GE(count, 1);
    EXPECT_LE(count, 2);
}

TEST_F(SpectrogramTest, BesideItsSamples_ARowIsEmpty) {
    sweep(-80);
    frame.firstX = 0.9e9;
    image.update(frame);
    EXPECT_EQ(image.line(0)[0], 0U);
    EXPECT_NE(image.line(0)[200], 0U);
}

TEST_F(SpectrogramTest, FramesWithoutSense_GiveAnImage) {
    sweep(-80);
    for (const SpectrogramFrame& odd :
         {SpectrogramFrame{0, 0, 0, 0, 0, 4}, SpectrogramFrame{-3, 5, 5, 1, 1, 99},
          SpectrogramFrame{10, std::nan(""), 1, std::nan(""), 0, 4},
          SpectrogramFrame{10, -1e308, 1e308, -1e308, 1e308, 4}}) {
        image.update(odd);
        EXPECT_EQ(image.rows(), 1);
        EXPECT_NE(image.line(0), nullptr);
    }
}

TEST_F(SpectrogramTest, TheRing_ShowsTheSameAsADrawingOfAll) {
    for (int i = 0; i < SweepHistory::kRows + 30; ++i) {
        sweep(-90 + i % 80);
        if (i % 7 == 0) image.update(frame);
    }
    image.update(frame);
    SpectrogramImage fresh{history};
    fresh.update(frame);
    for (int back = 0; back < SweepHistory::kRows; back += 37)
        for (int x = 0; x < frame.width; x += 50)
            ASSERT_EQ(image.line(back)[x], fresh.line(back)[x]) << back;
}

}  // namespace
}  // namespace zel
