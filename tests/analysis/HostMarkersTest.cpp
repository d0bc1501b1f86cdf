// Markers of the host, adjacent channels and corrections, against closed formulas.

#include <gtest/gtest.h>

#include <stdexcept>

#include "analysis/ChannelPower.h"
#include "analysis/Correction.h"
#include "analysis/HostMarkers.h"
#include "tests/analysis/Traces.h"

namespace zel {
namespace {

/// Two tones through a Gaussian filter, 20 dB apart.
SpectrumTrace twoTones() {
    SpectrumTrace trace = madeTrace(301, 1e6, 1e3, [](double x) {
        const double one = gaussian(x, 1.1e6, 10e3, -20);
        const double two = gaussian(x, 1.2e6, 10e3, -40);
        return std::max({one, two, -100.0});
    });
    trace.rbw = 10e3;
    return trace;
}

TEST(HostMarkers, BoundToAPeak_FollowsIt) {
    HostMarkers markers;
    markers[0] = {true, 0, 1, 0};
    markers[1] = {true, 0, 2, 1};
    markers[2] = {true, 0, 3, 0};
    const SpectrumTrace trace = twoTones();
    const MarkerReadings read = readMarkers(trace, markers, findPeaks(trace, {}));
    EXPECT_NEAR(read[0].x.value(), 1.1e6, 1);
    EXPECT_NEAR(read[0].level.value(), -20, 1e-6);
    EXPECT_NEAR(read[1].deltaX.value(), 1e5, 1);
    EXPECT_NEAR(read[1].deltaLevel.value(), -20, 1e-6);
    EXPECT_FALSE(read[2].level);
    EXPECT_FALSE(read[3].on);
}

TEST(HostMarkers, NoiseDensity_IsTheLevelLessTheBandwidth) {
    SpectrumTrace noise = madeTrace(301, 0, 1e3, [](double) { return -90.0; });
    noise.rbw = 1e4;
    HostMarkers markers;
    markers[0] = {true, 5e4, 0, 0};
    EXPECT_NEAR(readMarkers(noise, markers, {})[0].density.value(), -130, 1e-9);
    noise.rbw = 0;
    EXPECT_FALSE(readMarkers(noise, markers, {})[0].density);
    noise.rbw = 1e4;
    noise.xUnit = "s";
    EXPECT_FALSE(readMarkers(noise, markers, {})[0].density);
}

TEST(HostMarkers, OutsideOfTheTrace_ReadNothing) {
    HostMarkers markers;
    markers[0] = {true, -1, 0, 0};
    markers[1] = {true, 3.4, 0, 1};
    markers[2] = {true, 3.6, 0, 0};
    const MarkerReadings read = readMarkers(levels({1, 2, 3, 4}), markers, {});
    EXPECT_FALSE(read[0].level);
    EXPECT_EQ(read[1].level, 4);
    EXPECT_EQ(read[1].x, 3);
    EXPECT_FALSE(read[1].deltaLevel);
    EXPECT_FALSE(read[2].level);
}

TEST(HostMarkers, TimeAxis_GivesTimes) {
    SpectrumTrace trace = levels({-20, -50, -30});
    trace.xUnit = "s";
    HostMarkers markers;
    markers[0] = {true, 0, 0, 0};
    markers[1] = {true, 2, 0, 1};
    const MarkerReadings read = readMarkers(trace, markers, {});
    EXPECT_EQ(read[1].deltaX, 2);
    EXPECT_EQ(read[1].deltaLevel, -10);
}

TEST(AdjacentChannels, FlatSteps_GiveTheirDistance) {
    const SpectrumTrace trace = madeTrace(301, 0, 1, [](double x) {
        return x < 105 ? -60.0 : x < 195.5 ? -20.0 : -50.0;
    });
    const AdjacentChannels found = adjacentChannels(trace, 150, 50, 90, 2);
    EXPECT_NEAR(found.power.value(), -20 + 10 * std::log10(51.0), 1e-9);
    ASSERT_EQ(found.sides.size(), 2U);
    EXPECT_NEAR(found.sides[0].lower.value(), -40, 1e-9);
    EXPECT_NEAR(found.sides[0].upper.value(), -30, 1e-9);
    EXPECT_FALSE(found.sides[1].lower);
    EXPECT_FALSE(found.sides[1].upper);
}

TEST(ChannelPower, HalvesSumToTheWhole) {
    const SpectrumTrace trace = twoTones();
    const double whole = powerOfLevel(channelPower(trace, 1e6, 1.3e6).value());
    const double left = powerOfLevel(channelPower(trace, 1e6, 1.1505e6).value());
    const double right = powerOfLevel(channelPower(trace, 1.1505e6, 1.3e6).value());
    EXPECT_NEAR((left + right) / whole, 1, 1e-12);
}

TEST(Correction, TablesAreAddedAndGainsTakenAway) {
    const Correction cable = readCorrection("x;db\n0;1\n100;3\n", CorrectionKind::Cable, "RG58");
    const Correction amplifier =
        readCorrection("x;db\r\n0;20\r\n100;20\r\n", CorrectionKind::Amplifier, "A1");
    SpectrumTrace trace = levels({-40, -40, -40});
    trace.x = {0, 50, 100};
    EXPECT_EQ(corrected(trace, {cable, amplifier}).level, (std::vector<double>{-59, -58, -57}));
    EXPECT_EQ(corrected(trace, {cable}).unit, "dBm");
    EXPECT_EQ(correctionNames({cable, amplifier}), "cable RG58, amplifier A1");
}

TEST(Correction, Antenna_GivesTheFieldStrength) {
    const Correction antenna =
        readCorrection("x;db\n0;10\n100;10\n", CorrectionKind::Antenna, "LP");
    const SpectrumTrace field = corrected(levels({-40, -40}), {antenna});
    // 0 dBm at 50 ohm is sqrt(0.05) V.
    EXPECT_NEAR(field.level[0], -40 + 20 * std::log10(std::sqrt(0.05) / 1e-6) + 10, 1e-9);
    EXPECT_EQ(field.unit, "dBuV/m");
    SpectrumTrace already = levels({-40, -40});
    already.unit = "dBuV/m";
    EXPECT_THROW(corrected(already, {antenna}), std::runtime_error);
    EXPECT_THROW(corrected(levels({-40, -40}), {antenna, antenna}), std::runtime_error);
}

TEST(Correction, TableThatDoesNotCoverTheSpan_IsRefused) {
    const Correction cable = readCorrection("x;db\n0;1\n1;3\n", CorrectionKind::Cable, "short");
    EXPECT_NO_THROW(corrected(levels({-40, -40}), {cable}));
    EXPECT_THROW(corrected(levels({-40, -40, -40}), {cable}), std::runtime_error);
    SpectrumTrace time = levels({-40, -40});
    time.xUnit = "s";
    EXPECT_THROW(corrected(time, {cable}), std::runtime_error);
}

TEST(Correction, BadTables_AreNamedByTheirLine) {
    const auto complaint = [](const std::string& text) -> std::string {
        try {
            readCorrection(text, CorrectionKind::Cable, "c");
        } catch (const std::runtime_error& wrong) {
            return wrong.what();
        }
        return "none";
    };
    EXPECT_EQ(complaint("1;2\n"), "line 1: the header x;db is missing");
    EXPECT_EQ(complaint("x;db\n1\n"), "line 2: a row is x;db");
    EXPECT_EQ(complaint("x;db\n1;a\n"), "line 2: this is no number: 1;a");
    EXPECT_EQ(complaint("x;db\n2;1\n2;1\n"), "line 3: x does not rise");
    EXPECT_EQ(complaint("x;db\n"), "the table has no row");
}

TEST(Correction, FaultDistance_GoesWithTheVelocity) {
    EXPECT_NEAR(faultDistance(10, 0.66, 0.8), 10 * 0.8 / 0.66, 1e-12);
    ASSERT_GT(velocityFactors().size(), 3U);
    for (const VelocityFactor& row : velocityFactors()) {
        EXPECT_GT(row.factor, 0.5);
        EXPECT_LT(row.factor, 1);
    }
}

}  // namespace
}  // namespace zel
