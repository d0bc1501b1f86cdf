// What was saved looks the same when it is loaded again.

#include <gtest/gtest.h>

#include "model/Numeric.h"
#include "tests/files/FileSession.h"

namespace zel {
namespace {

using CF = ControllerForm;

struct View {
    int unit;
    double level;  ///< reference level in that unit
    double first;  ///< raw samples
    double step;
};

// Levels that reach above the reference level and below the display's bottom.
constexpr View kViews[] = {
    {0, -20, -10000, -400},   {1, 27, 37000, -400},     {2, 87, 97000, -400},
    {3, 87, 97000, -400},     {4, 87, 97000, -400},     {5, -20, -10000, -400},
    {6, 0.0224, 30000, -100}, {7, 0.00001, 12000, -40},
};

using Case = std::tuple<int, int, int, bool>;  // view, range, detector, zero span

struct RoundTripTest : ::testing::TestWithParam<Case> {};

TEST_P(RoundTripTest, LoadedView_IsDrawnAsItWas) {
    const auto [viewIndex, range, detector, zeroSpan] = GetParam();
    const View& view = kViews[viewIndex];
    FileSession live;
    live.narrowSpan();
    if (zeroSpan) live.mirror.Span = 0;
    live.mirror.ReferenceUnit = view.unit;
    live.mirror.ReferenceLevel = view.level;
    live.mirror.ReferenceRange = range;
    live.mirror.TraceDetector = static_cast<std::uint8_t>(detector);
    live.sweepOf(FileSession::ramp(view.first, detector == 0 ? view.step / 2 : view.step,
                                   detector == 0 ? 602 : 301));
    const std::string saved = live.save("view.csv");

    FileSession other;
    other.folder.write("view.csv", saved);
    other.panel.OpenFile(live.folder.file("view.csv"));
    const std::vector<double>& drawn = live.drawn();
    const std::vector<double>& loaded = other.panel.CWGraph1.values();
    ASSERT_EQ(loaded.size(), drawn.size());
    for (std::size_t i = 0; i < drawn.size(); ++i)
        ASSERT_NEAR(loaded[i], drawn[i], 1e-9) << "point " << i;
    EXPECT_NEAR(other.panel.ViewStart, live.panel.ViewStart, 1e-3);
    EXPECT_NEAR(other.panel.ViewStop, live.panel.ViewStop, 1e-3);
    EXPECT_EQ(other.mirror.ReferenceLevel, live.mirror.ReferenceLevel);
    EXPECT_EQ(other.mirror.ReferenceUnit, live.mirror.ReferenceUnit);
}

INSTANTIATE_TEST_SUITE_P(Logarithmic, RoundTripTest,
                         ::testing::Combine(::testing::Range(0, 8), ::testing::Range(0, 4),
                                            ::testing::Range(0, 5), ::testing::Bool()));
// In percent, where the level stands low enough for the bottom not to lift percentages.
INSTANTIATE_TEST_SUITE_P(Linear, RoundTripTest,
                         ::testing::Combine(::testing::Values(0, 1, 5), ::testing::Values(4),
                                            ::testing::Range(0, 5), ::testing::Bool()));

TEST(RoundTrip, EveryModeLoadsItsTrace) {
    for (std::int16_t mode = CF::ANALYZER; mode <= CF::RECEIVER; ++mode) {
        if (mode == CF::POWERSENSOR) continue;  // keeps a log, no view
        FileSession live;
        live.narrowSpan();
        live.mirror.TraceDetector = 3;
        live.panel.InstrumentMode = mode;
        live.sweepOf(FileSession::ramp(-35000, -100));
        const std::string saved = live.save("view.csv");
        FileSession other;
        other.folder.write("view.csv", saved);
        other.panel.OpenFile(live.folder.file("view.csv"));
        EXPECT_EQ(other.panel.CWGraph1.values(), live.drawn()) << "mode " << mode;
        EXPECT_EQ(other.panel.DataXAxisArrayToLoad.size(), 301U) << "mode " << mode;
    }
}

TEST(RoundTrip, LinearRangeWithAHighLevel_IsLiftedByTheRangeAsANumber) {
    // The reader takes the range's number as decibels a division: 4 on a linear range, so that
    // its bottom lies higher than the live one's.
    FileSession live;
    live.narrowSpan();
    live.mirror.TraceDetector = 3;
    live.mirror.ReferenceUnit = 2;
    live.mirror.ReferenceLevel = 87;
    live.mirror.ReferenceRange = 4;
    live.sweepOf(std::vector<double>(301, 50000));
    const std::string saved = live.save("view.csv");
    EXPECT_NEAR(live.drawn()[0], DbmToPercent(50, 87), 1e-9);
    FileSession other;
    other.folder.write("view.csv", saved);
    other.panel.OpenFile(live.folder.file("view.csv"));
    EXPECT_EQ(other.panel.CWGraph1.values()[0], 87 - 40);
}

TEST(RoundTrip, LoadedView_SavesAsItWas) {
    FileSession live;
    live.narrowSpan();
    live.mirror.TraceDetector = 3;
    live.mirror.ReferenceRange = 1;
    live.sweepOf(FileSession::ramp(-10000, -400));
    const std::string saved = live.save("view.csv");
    FileSession other;
    other.folder.write("view.csv", saved);
    other.panel.OpenFile(live.folder.file("view.csv"));
    other.save("again.csv");
    const Texts first = linesOf(live.folder.read("view.csv"));
    const Texts second = linesOf(other.folder.read("again.csv"));
    EXPECT_EQ(Texts(first.end() - 301, first.end()), Texts(second.end() - 301, second.end()));
    EXPECT_NE(std::find(second.begin(), second.end(), "Reference Range;5 dB/div"), second.end());
}

}  // namespace
}  // namespace zel
