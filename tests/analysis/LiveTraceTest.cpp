// A sweep becomes a trace for the analysis.

#include <gtest/gtest.h>

#include <limits>
#include <stdexcept>

#include "analysis/LiveTrace.h"

namespace zel {
namespace {

Sweep sweepOf(std::vector<double> physical, int detector, int unit) {
    Sweep sweep;
    sweep.wanted = sweep.came = physical.size();
    sweep.physical = std::move(physical);
    sweep.settings.TraceDetector = static_cast<std::uint8_t>(detector);
    sweep.settings.ReferenceUnit = unit;
    sweep.settings.ResolutionBandwidth = 3;
    sweep.axis.start = 100;
    sweep.axis.stop = 101;
    sweep.axis.unit = "Hz";
    sweep.time = 36925.5;
    return sweep;
}

TEST(SpectrumOf, PairsCountWithTheHighestLevelOfTheirPoint) {
    const SpectrumTrace trace = spectrumOf(sweepOf({-90, -20, -60, -70}, DETAUTOPEAK, UNITDBUV));
    EXPECT_EQ(trace.level, (std::vector<double>{-70, -60}));
    EXPECT_EQ(trace.x, (std::vector<double>{100, 101}));
    EXPECT_EQ(trace.unit, "dBuV");
    EXPECT_EQ(trace.rbw, 1000);
    EXPECT_EQ(trace.time, "2001-02-03T12:00:00");
}

TEST(SpectrumOf, LinearUnits_BecomeDbm) {
    EXPECT_NEAR(spectrumOf(sweepOf({0.2236068}, DETSAMPLE, UNITV)).level[0], 0, 1e-5);
    EXPECT_NEAR(spectrumOf(sweepOf({0.001}, DETSAMPLE, UNITW)).level[0], 0, 1e-9);
    EXPECT_EQ(spectrumOf(sweepOf({0.001}, DETSAMPLE, UNITW)).unit, "dBm");
    EXPECT_THROW(spectrumOf(sweepOf({0}, DETSAMPLE, UNITV)), std::runtime_error);
    EXPECT_THROW(spectrumOf(sweepOf({1}, DETSAMPLE, 8)), std::runtime_error);
}

TEST(SpectrumOf, IncompleteSweep_IsRefused) {
    Sweep sweep = sweepOf({-90, -80}, DETSAMPLE, UNITDBM);
    sweep.came = 1;
    sweep.physical[1] = std::numeric_limits<double>::quiet_NaN();
    EXPECT_THROW(spectrumOf(sweep), std::runtime_error);
}

TEST(IsoTimeOf, DatesThatAreNone_AreEmpty) {
    EXPECT_EQ(isoTimeOf(0), "");
    EXPECT_EQ(isoTimeOf(std::numeric_limits<double>::quiet_NaN()), "");
    EXPECT_EQ(isoTimeOf(1e9), "");
}

}  // namespace
}  // namespace zel
