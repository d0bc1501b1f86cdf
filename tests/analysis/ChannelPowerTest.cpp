#include <gtest/gtest.h>

#include "analysis/ChannelPower.h"
#include "tests/analysis/Traces.h"

namespace zel {
namespace {

TEST(ChannelPower, FlatNoise_IsLevelPlusBandwidthOverRbw) {
    SpectrumTrace trace = madeTrace(301, 0, 1000, [](double) { return -90; });
    trace.rbw = 3000;
    // 101 samples of 1 kHz each.
    EXPECT_NEAR(channelPower(trace, 100'000, 200'000).value(),
                -90 + 10 * std::log10(101 * 1000.0 / 3000), 1e-9);
}

TEST(ChannelPower, WithoutRbw_TheStepCounts) {
    const SpectrumTrace trace = madeTrace(301, 0, 1000, [](double) { return -90; });
    EXPECT_NEAR(channelPower(trace, 0, 99'000).value(), -70, 1e-9);
}

TEST(ChannelPower, Halves_SumToTheWhole) {
    SpectrumTrace trace =
        madeTrace(301, 0, 1000, [](double x) { return gaussian(x, 120'000, 50'000, -30); });
    trace.rbw = 1000;
    const double halves = powerOfLevel(channelPower(trace, 0, 150'000).value()) +
                          powerOfLevel(channelPower(trace, 150'001, 300'000).value());
    EXPECT_NEAR(levelOfPower(halves), channelPower(trace, 0, 300'000).value(), 1e-9);
}

TEST(ChannelPower, Edges_BelongToTheChannel) {
    const SpectrumTrace trace = levels({-10, -20, -30});
    EXPECT_NEAR(channelPower(trace, 1, 1).value(), -20, 1e-9);
    EXPECT_NEAR(channelPower(trace, 1, 2).value(), levelOfPower(0.01 + 0.001), 1e-9);
}

TEST(ChannelPower, OutsideOfTheTrace_IsEmpty) {
    EXPECT_FALSE(channelPower(levels({-10, -20}), 0.2, 0.8));
    EXPECT_FALSE(channelPower(levels({-10, -20}), 5, 9));
    EXPECT_FALSE(channelPower(levels({}), 0, 1));
}

TEST(OccupiedBandwidth, FlatTrace_LeavesHalfOfTheRestOnEachSide) {
    const SpectrumTrace trace = madeTrace(101, 0, 1, [](double) { return -50; });
    const OccupiedBandwidth band = occupiedBandwidth(trace, 80).value();
    // c(i) = i + 1/2 of 101 equal powers: 10.1 is passed at x = 9.6, 90.9 at 90.4.
    EXPECT_NEAR(band.low, 9.6, 1e-9);
    EXPECT_NEAR(band.high, 90.4, 1e-9);
    EXPECT_NEAR(band.width(), 80.8, 1e-9);
}

TEST(OccupiedBandwidth, GaussianSpectrum_IsTheClosedForm) {
    // Power exp(-x^2 / 2 s^2): 95.45 % lie within 2 s on both sides.
    const double s = 10'000;
    const SpectrumTrace trace = madeTrace(301, -150'000, 1000, [s](double x) {
        return 10 * std::log10(std::exp(1.0)) * (-x * x / (2 * s * s));
    });
    const OccupiedBandwidth band =
        occupiedBandwidth(trace, 100 * std::erf(2 / std::sqrt(2.0))).value();
    EXPECT_NEAR(band.low, -2 * s, 30);
    EXPECT_NEAR(band.high, 2 * s, 30);
}

TEST(OccupiedBandwidth, PowerInTheFirstSample_EndsAtTheBorder) {
    const OccupiedBandwidth band = occupiedBandwidth(levels({0, -100, -100}), 99).value();
    EXPECT_EQ(band.low, 0);
    EXPECT_GT(band.high, 0);
    EXPECT_LT(band.high, 1);
}

TEST(OccupiedBandwidth, EmptyTrace_HasNone) { EXPECT_FALSE(occupiedBandwidth(levels({}), 99)); }

}  // namespace
}  // namespace zel
