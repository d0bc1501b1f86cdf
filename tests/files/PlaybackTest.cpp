// The keys that play a loaded recording.

#include <gtest/gtest.h>

#include <memory>

#include "files/SeriesFrames.h"
#include "tests/files/FileSession.h"

namespace zel {
namespace {

struct PlaybackTest : FileSession, ::testing::Test {
    PlaybackTest() {
        narrowSpan();
        mirror.TraceDetector = 3;
        panel.TraceLoaded.connect([this] {
            levels.push_back(panel.CWGraph1.values().at(0));
            moments.push_back(platform.clock.micros());
        });
    }
    /// A recording with these times of day; trace i lies at -30 - i dBm.
    void load(const Texts& times) {
        std::string text;
        for (std::size_t i = 0; i < times.size(); ++i) {
            sweepOf(std::vector<double>(301, -30000 - 1000 * static_cast<int>(i)));
            std::string one = save("one.csv");
            one.replace(one.find("\nTime;") + 6, 8, times[i]);
            text += one;
        }
        folder.write("series.csv", text);
        open("series.csv");
    }
    void loadFive() {
        load({"10:00:01", "10:00:02", "10:00:03", "10:00:04", "10:00:05"});
        levels.clear();
        moments.clear();
    }
    void scrub(int place) {
        panel.PlaybackPosition.Value = place;
        panel.PlaybackPosition.Scrolled();
    }
    int rows() { return forms.waterfall.Graph3D.plotCount(); }

    std::vector<double> levels;
    std::vector<std::int64_t> moments;
};

using Levels = std::vector<double>;

TEST_F(PlaybackTest, AfterTheSeries_TheKeysStay) {
    loadFive();
    EXPECT_TRUE(panel.PlaybackFrame.Visible);
    EXPECT_EQ(panel.PlaybackPosition.Max, 5);
    EXPECT_EQ(panel.PlaybackPosition.Value, 5);
    EXPECT_EQ(panel.PlaybackLabel.Caption.get(), "5 of 5   10:00:05");
    EXPECT_EQ(panel.PlaybackPlay.Caption.get(), "Play");
    EXPECT_FALSE(panel.PlaybackForward.Enabled);
    EXPECT_TRUE(panel.PlaybackBack.Enabled);
    EXPECT_FALSE(panel.StopButton.Visible);
}

TEST_F(PlaybackTest, OneBackAndOneForth_ShowThatTrace) {
    loadFive();
    panel.PlaybackBack.Click();
    panel.PlaybackBack.Click();
    panel.PlaybackForward.Click();
    EXPECT_EQ(levels, (Levels{-33, -32, -33}));
    EXPECT_EQ(panel.PlaybackPosition.Value, 4);
    panel.PlaybackForward.Click();
    panel.PlaybackForward.Click();
    EXPECT_EQ(panel.PlaybackPosition.Value, 5);
    EXPECT_EQ(levels.size(), 4U);
}

TEST_F(PlaybackTest, Scrub_ShowsTheTraceAndTheWaterfallUpToIt) {
    loadFive();
    const int all = rows();
    scrub(2);
    EXPECT_EQ(levels, Levels{-31});
    EXPECT_EQ(rows(), all - 3);
    EXPECT_FALSE(forms.waterfall.Graph3D.plots().back().lineVisible) << "the last row is styled";
    scrub(4);
    EXPECT_EQ(levels, (Levels{-31, -33}));
    EXPECT_FALSE(forms.waterfall.Graph3D.plots().back().lineVisible);
    EXPECT_EQ(rows(), all - 1);
    EXPECT_EQ(panel.PlaybackLabel.Caption.get(), "4 of 5   10:00:04");
}

TEST_F(PlaybackTest, Play_AtTheEndBeginsAgain) {
    loadFive();
    int kept = 0;
    forms.waterfall.saveGraphView.connect([&kept] { ++kept; });
    panel.PlaybackPlay.Click();
    EXPECT_EQ(kept, 1);
    EXPECT_EQ(levels, (Levels{-30, -31, -32, -33, -34}));
    EXPECT_EQ(panel.PlaybackPosition.Value, 5);
}

TEST_F(PlaybackTest, Pause_HoldsTheTraceAndPlayGoesOn) {
    forms.specialMeas.sldSpeed.Value = 5;
    platform.events.schedule(1200, [this] {
        EXPECT_EQ(panel.PlaybackPlay.Caption.get(), "Pause");
        EXPECT_TRUE(panel.StopButton.Visible);
        panel.PlaybackPlay.Click();
    });
    load({"10:00:01", "10:00:02", "10:00:03", "10:00:04", "10:00:05"});
    EXPECT_EQ(levels, (Levels{-30, -31, -32}));
    EXPECT_EQ(panel.PlaybackPlay.Caption.get(), "Play");
    EXPECT_TRUE(panel.Connection.Enabled);
    panel.PlaybackPlay.Click();
    EXPECT_EQ(levels, (Levels{-30, -31, -32, -32, -33, -34}));
}

TEST_F(PlaybackTest, ScrubWhileItPlays_GoesOnFromThere) {
    forms.specialMeas.sldSpeed.Value = 5;
    platform.events.schedule(700, [this] { scrub(5); });
    load({"10:00:01", "10:00:02", "10:00:03", "10:00:04", "10:00:05"});
    EXPECT_EQ(levels, (Levels{-30, -31, -34}));
}

TEST_F(PlaybackTest, Repeat_BeginsAgainUntilStop) {
    loadFive();
    forms.specialMeas.sldSpeed.Value = 5;
    panel.PlaybackRepeat.setValue(true);
    platform.events.schedule(3700, [this] { panel.StopButton.Click(); });
    panel.PlaybackPlay.Click();
    EXPECT_EQ(levels, (Levels{-30, -31, -32, -33, -34, -30, -31, -32}));
}

TEST_F(PlaybackTest, Repeat_OfANewFileIsOff) {
    loadFive();
    panel.PlaybackRepeat.setValue(true);
    loadFive();
    EXPECT_FALSE(panel.PlaybackRepeat.Value());
}

TEST_F(PlaybackTest, RealTime_FollowsTheStampsOfTheFile) {
    load({"23:59:58", "23:59:58", "00:00:01", "00:00:02"});
    panel.PlaybackRealTime.setValue(true);
    levels.clear();
    moments.clear();
    panel.PlaybackPlay.Click();
    ASSERT_EQ(moments.size(), 4U);
    EXPECT_NEAR(static_cast<double>(moments[1] - moments[0]), 500000, 110000);
    EXPECT_NEAR(static_cast<double>(moments[2] - moments[1]), 2500000, 110000);
    EXPECT_NEAR(static_cast<double>(moments[3] - moments[2]), 1000000, 110000);
}

TEST_F(PlaybackTest, Close_EndsThePlayAndTakesTheKeysAway) {
    forms.specialMeas.sldSpeed.Value = 0;
    platform.events.schedule(1500, [this] { panel.PlaybackClose.Click(); });
    load({"10:00:01", "10:00:02", "10:00:03", "10:00:04"});
    EXPECT_EQ(levels.size(), 2U);
    EXPECT_FALSE(panel.PlaybackFrame.Visible);
    EXPECT_FALSE(panel.SeriesPlays);
    panel.PlaybackPlay.Click();
    EXPECT_EQ(levels.size(), 2U);
}

TEST_F(PlaybackTest, SweepOfTheInstrument_TakesTheKeysAway) {
    loadFive();
    panel.Shown = {};
    panel.CWGraph1.plotY({1, 2, 3}, 0, 1);
    EXPECT_FALSE(panel.PlaybackFrame.Visible);
}

TEST_F(PlaybackTest, SettingsChangedMeanwhile_DoNotReachTheFile) {
    loadFive();
    mirror.ReferenceLevel = -40;
    panel.PlaybackBack.Click();
    EXPECT_EQ(levels, Levels{-33});
    EXPECT_EQ(mirror.ReferenceLevel, -20);
}

TEST_F(PlaybackTest, ContinuousView_RefusesPlay) {
    loadFive();
    panel.ContinuosLoopActive = true;
    panel.PlaybackPlay.Click();
    panel.PlaybackBack.Click();
    EXPECT_TRUE(levels.empty());
}

TEST(SeriesFrames, Gap_IsThatOfTheStampsAndSharedWithinASecond) {
    const auto gaps = [](const std::vector<std::string>& stamps) {
        std::string text;
        for (const std::string& stamp : stamps) text += "\nTime;" + stamp + "\nMark;;\n1;2";
        const auto whole = std::make_shared<const std::string>(text);
        SeriesFrames frames(whole, FieldList(*whole), 6, "Mark", "2026-11-22 10:00");
        std::vector<int> found;
        for (int i = 0; i < static_cast<int>(stamps.size()); ++i)
            found.push_back(frames.gapAfter(i));
        return found;
    };
    EXPECT_EQ(gaps({"23:59:58", "23:59:58", "00:00:01", "00:00:02"}),
              (std::vector<int>{500, 2500, 1000, 1000}));
    EXPECT_EQ(gaps({"10:00:00", "10:00:07"}), (std::vector<int>{7000, 1000}));
    EXPECT_EQ(gaps({"00:00:00", "00:00:02"}).front(), 2000);
    EXPECT_EQ(gaps({"noon", "10:00:07"}).front(), 0);
}

TEST(SecondOfDay, ReadsBothClocksAndRefusesTheRest) {
    EXPECT_EQ(secondOfDay("10:00:01"), 36001);
    EXPECT_EQ(secondOfDay("02:03:04 PM"), 14 * 3600 + 3 * 60 + 4);
    EXPECT_EQ(secondOfDay("12:00:00 AM"), 0);
    EXPECT_EQ(secondOfDay("12:00:00 PM"), 12 * 3600);
    EXPECT_EQ(secondOfDay("23:59:59"), 86399);
    EXPECT_EQ(secondOfDay("9:5:1"), 9 * 3600 + 5 * 60 + 1);
    EXPECT_EQ(secondOfDay("24:00:00"), -1);
    EXPECT_EQ(secondOfDay("10:60:00"), -1);
    EXPECT_EQ(secondOfDay("10:00:60"), -1);
    EXPECT_EQ(secondOfDay("10:-1:00"), -1);
    EXPECT_EQ(secondOfDay("10:00"), -1);
    EXPECT_EQ(secondOfDay("10:00:"), -1);
    EXPECT_EQ(secondOfDay("10.00.00"), -1);
    EXPECT_EQ(secondOfDay("noon"), -1);
    EXPECT_EQ(secondOfDay(""), -1);
}

}  // namespace
}  // namespace zel
