// Recordings of several traces in one file.

#include <gtest/gtest.h>

#include "tests/files/FileSession.h"

namespace zel {
namespace {

using CF = ControllerForm;

struct SeriesTest : FileSession, ::testing::Test {
    SeriesTest() {
        narrowSpan();
        mirror.TraceDetector = 3;
        panel.TraceLoaded.connect([this] {
            levels.push_back(panel.CWGraph1.values().at(0));
            moments.push_back(platform.clock.micros());
            labels.push_back(panel.FileLabel.Caption);
        });
    }
    /// A recording of that many traces; trace i lies at -30 - i dBm.
    std::string record(int count) {
        std::string text;
        for (int i = 0; i < count; ++i) {
            sweepOf(std::vector<double>(301, -30000 - 1000 * i));
            text += save("one.csv");
        }
        return text;
    }
    void load(const std::string& text) {
        folder.write("series.csv", text);
        open("series.csv");
    }

    std::vector<double> levels;
    std::vector<std::int64_t> moments;
    Texts labels;
};

TEST_F(SeriesTest, EveryTrace_IsShown) {
    load(record(5));
    EXPECT_EQ(levels, (std::vector<double>{-30, -31, -32, -33, -34}));
    EXPECT_EQ(panel.YVectorVal, 5);
}

TEST_F(SeriesTest, EachTrace_BearsItsOwnTime) {
    Texts stamps;
    forms.waterfall.stampRow.connect([&](const std::string& text) { stamps.push_back(text); });
    std::string text = record(3);
    std::size_t at = 0;
    for (const char* time : {"10:00:01", "10:00:02", "10:00:03"}) {
        at = text.find("\nTime;", at) + 6;
        text.replace(at, 8, time);
    }
    load(text);
    ASSERT_EQ(stamps.size(), 3U);
    EXPECT_EQ(stamps[0].substr(0, 9), "10:00:01 ");
    EXPECT_EQ(stamps[1].substr(0, 9), "10:00:02 ");
    EXPECT_EQ(stamps[2].substr(0, 9), "10:00:03 ");
}

TEST_F(SeriesTest, EachTraceIsStyledAndStamped) {
    int styled = 0;
    int stamped = 0;
    forms.waterfall.styleLastRow.connect([&] { ++styled; });
    forms.waterfall.stampRow.connect([&](const std::string&) { ++stamped; });
    load(record(3));
    EXPECT_EQ(styled, 4);  // before each, and the last one at the end
    EXPECT_EQ(stamped, 3);
}

TEST_F(SeriesTest, SeriesOfPairs_IsShown) {
    mirror.TraceDetector = 0;
    std::string text;
    for (int i = 0; i < 3; ++i) {
        sweepOf(std::vector<double>(602, -30000 - 1000 * i));
        text += save("one.csv");
    }
    load(text);
    EXPECT_EQ(levels, (std::vector<double>{-30, -31, -32}));
    EXPECT_EQ(panel.CWGraph1.values().size(), 602U);
}

TEST_F(SeriesTest, SeriesOfChannelPower_BeginsBehindEachMeasuredValue) {
    panel.InstrumentMode = CF::CHANNELPOWER;
    load(record(3));
    EXPECT_EQ(levels, (std::vector<double>{-30, -31, -32}));
}

TEST_F(SeriesTest, SingleTraceWithALongHeader_IsOneTrace) {
    panel.InstrumentMode = CF::CHANNELPOWER;
    load(record(1));
    EXPECT_EQ(levels, std::vector<double>{-30});
}

TEST_F(SeriesTest, LastTraceCutShort_ShowsWhatIsThere) {
    const std::string text = record(3);
    // The last trace ends after its hundredth row.
    std::size_t end = text.rfind("Reference Unit");
    end = text.find("\r\n1499500000.000;", end) + 2;
    for (int row = 0; row < 100; ++row) end = text.find("\r\n", end) + 2;
    load(text.substr(0, end));
    ASSERT_EQ(levels, (std::vector<double>{-30, -31, -32}));
    EXPECT_EQ(panel.CWGraph1.values().size(), 100U);
}

TEST_F(SeriesTest, HeaderCutShort_EndsTheSeries) {
    const std::string text = record(3);
    load(text.substr(0, text.rfind("Reference Unit")));
    EXPECT_EQ(levels, (std::vector<double>{-30, -31}));
}

TEST_F(SeriesTest, TopOfTheSlider_WaitsForNothing) {
    forms.specialMeas.sldSpeed.Max = 5;
    forms.specialMeas.sldSpeed.Value = 5;
    load(record(4));
    ASSERT_EQ(moments.size(), 4U);
    EXPECT_LT(moments.back() - moments.front(), 1000);
}

TEST_F(SeriesTest, Slider_SetsThePace) {
    forms.specialMeas.sldSpeed.Value = 7;
    load(record(3));
    EXPECT_NEAR(static_cast<double>(moments[1] - moments[0]), 300000, 2000);
    EXPECT_NEAR(static_cast<double>(moments[2] - moments[1]), 300000, 2000);
}

TEST_F(SeriesTest, SliderMovedMeanwhile_ActsAtOnce) {
    forms.specialMeas.sldSpeed.Value = 0;
    platform.events.schedule(200, [this] { forms.specialMeas.sldSpeed.Value = 10; });
    load(record(3));
    EXPECT_LT(moments.back() - moments.front(), 400000);
}

TEST_F(SeriesTest, NegativeSlider_EndsBehindTheTrace) {
    forms.specialMeas.sldSpeed.Value = -1;
    load(record(3));
    EXPECT_EQ(levels, std::vector<double>{-30});
}

TEST_F(SeriesTest, Stop_EndsTheSeriesAtOnce) {
    forms.specialMeas.sldSpeed.Value = 0;
    platform.events.schedule(1500, [this] { panel.StopButton.Click(); });
    load(record(5));
    EXPECT_EQ(levels.size(), 2U);
    EXPECT_TRUE(panel.Connection.Enabled);
    EXPECT_TRUE(panel.PlayContinuousButton.Visible);
    EXPECT_FALSE(panel.StopButton.Visible);
}

TEST_F(SeriesTest, SecondFileMeanwhile_IsNotBegun) {
    forms.specialMeas.sldSpeed.Value = 0;
    platform.events.schedule(1500, [this] { open("series.csv"); });
    load(record(3));
    EXPECT_EQ(levels.size(), 3U);
}

TEST_F(SeriesTest, Position_IsToldAndThePlaybackShownForASeriesOnly) {
    forms.specialMeas.sldSpeed.Value = 5;
    Texts told;
    platform.events.schedule(100, [&] {
        told.push_back(panel.FileLabel.Caption);
        EXPECT_TRUE(panel.PlaybackFrame.Visible);
    });
    load(record(4));
    ASSERT_EQ(told.size(), 1U);
    EXPECT_EQ(told[0].substr(0, 22), "Trace 1 of series.csv,");
    EXPECT_EQ(panel.FileLabel.Caption.get(), "");
    EXPECT_TRUE(panel.PlaybackFrame.Visible);
    told.clear();
    load(record(1));
    EXPECT_FALSE(panel.PlaybackFrame.Visible);
}

TEST_F(SeriesTest, LongSeries_KeepsTheArraysSmall) {
    forms.specialMeas.sldSpeed.Value = 10;
    const std::string one = record(1);
    std::string text;
    for (int i = 0; i < 500; ++i) text += one;
    load(text);
    EXPECT_EQ(levels.size(), 500U);
    EXPECT_EQ(panel.DataXAxisArrayToLoad.size(), 301U);
    EXPECT_LE(forms.waterfall.Graph3D.plotCount(), 101);
}

}  // namespace
}  // namespace zel
