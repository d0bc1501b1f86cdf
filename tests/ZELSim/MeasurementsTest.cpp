#include <algorithm>
#include <cmath>

#include "ZELSim/Markers.h"
#include "ZELSim/Measurements.h"
#include "tests/ZELSim/WireFixture.h"

namespace zelsim {
namespace {

TEST(Measurements, ChannelPower_IsThePowerOfTheSignalInTheChannel) {
    Host host;
    host.setUp({"FREQ,2140000000", "MEAS,4"});
    EXPECT_NEAR(host.number("CHPWR"), -40, 0.5);
    EXPECT_EQ(host.set("CHPWRUNIT,1"), "0\r");
    EXPECT_NEAR(host.number("CHPWR"), -40 + 46.99, 0.5);
    EXPECT_EQ(host.set("CHPWRUNIT,2"), "0\r");
    EXPECT_NEAR(host.number("CHPWR"), -40 + 106.99, 0.5);
}

TEST(Measurements, ChannelPower_OfACarrierIsItsLevel) {
    Host host;
    host.setUp({"FREQ,1500000000", "MEAS,4", "CHPWRSTD,0"});
    EXPECT_NEAR(host.number("CHPWR"), -30, 0.5);
}

TEST(Measurements, Standard_SetsTheChannelAndTheSpanAroundIt) {
    Host host;
    host.setUp({"MEAS,4", "CHPWRSTD,2"});
    EXPECT_EQ(host.value("CHPWRBW"), "1228800");
    EXPECT_NEAR(host.number("SPAN"), 1.2 * 1228800, 1);
}

TEST(Measurements, OccupiedBandwidth_IsThatOfTheSignal) {
    Host host;
    host.setUp({"FREQ,2140000000", "MEAS,5"});
    EXPECT_NEAR(host.number("OBW"), 0.99 * 3.84e6, 0.1e6);
}

TEST(Measurements, TdmaPower_IsThatOfTheBurst) {
    Host host;
    host.setUp({"FREQ,947400000", "MEAS,6"});
    host.sweep();
    EXPECT_NEAR(host.number("TDMAPWR"), -35, 0.8);
}

TEST(Measurements, LevelAdjust_BringsTheSignalBelowTheReference) {
    Host host;
    host.setUp({"FREQ,2140000000", "MEAS,4"});
    host.sweep();
    EXPECT_EQ(host.cmd("LVLADJUST"), "0\r");
    const double reference = host.number("REFLVL");
    EXPECT_LT(reference, -20);
    const auto high = decodeBlock(host.sweep(), 1205);
    EXPECT_LT(*std::max_element(high.begin(), high.end()) / 1000, reference);
}

TEST(Measurements, PowerSensor_ReadsTheWholeSceneAndLessSpreadInALongTime) {
    const auto spread = [](const char* time) {
        Host host;
        host.setUp({"MEAS,3", time});
        double least = 1e9;
        double most = -1e9;
        for (int i = 0; i < 50; ++i) {
            const double power = host.number("PWR");
            least = std::min(least, power);
            most = std::max(most, power);
            host.wire.advance(0.1);
        }
        EXPECT_NEAR(least, -28, 1);
        return most - least;
    };
    EXPECT_GT(spread("MEASTIME,0"), 2 * spread("MEASTIME,2"));
}

TEST(Measurements, Limits_AreUnknownPassedOrFailed) {
    Host host;
    host.setUp({"SWPCONT,0"});
    EXPECT_EQ(host.value("LIMPASS"), "0");
    host.setUp({"LIMUPP,-10"});
    EXPECT_EQ(host.value("LIMPASS"), "2");
    host.setUp({"LIMUPP,-35"});
    EXPECT_EQ(host.value("LIMPASS"), "1");
    EXPECT_EQ(host.cmd("LIMDEL"), "0\r");
    EXPECT_EQ(host.value("LIMPASS"), "0");
    host.setUp({"LIMLOW,-20"});
    EXPECT_EQ(host.value("LIMPASS"), "1");
}

TEST(Measurements, Calibrations_TakeEachOthersPlace) {
    Host host;
    host.setUp({"MEAS,2"});
    EXPECT_EQ(host.value("TRANSCAL"), "0");
    EXPECT_EQ(host.cmd("CAL_TGSCLTRN"), "0\r");
    EXPECT_EQ(host.value("TRANSCAL"), "1");
    EXPECT_EQ(host.cmd("CAL_TGVECRFL"), "0\r");
    EXPECT_EQ(host.value("TRANSCAL"), "0");
    EXPECT_EQ(host.value("REFLVECTCAL"), "1");
    EXPECT_EQ(host.value("UNIT"), "5");
}

TEST(Measurements, TrackingGenerator_ShowsTheFilter) {
    Host host;
    host.setUp({"MEAS,2", "TRACEDET,2"});
    EXPECT_EQ(host.cmd("CAL_TGSCLTRN"), "0\r");
    const auto levels = host.levels();
    EXPECT_NEAR(levels[150], -1200, 100);
    EXPECT_LT(levels[30], -60000);
    EXPECT_LT(levels[290], -30000);
}

TEST(Measurements, TrackingLevel_MovesAnUncalibratedTrace) {
    const auto middle = [](const char* level) {
        Host host;
        host.setUp({"MEAS,2", "TRACEDET,2", level});
        return host.levels()[150];
    };
    EXPECT_NEAR(middle("TGLVL,0") - middle("TGLVL,-10"), 10000, 100);
}

TEST(Measurements, Reflection_IsLowWhereTheFilterPasses) {
    Host host;
    host.setUp({"MEAS,2", "TRACEDET,2"});
    EXPECT_EQ(host.cmd("CAL_TGSCLRFL"), "0\r");
    const auto levels = host.levels();
    EXPECT_LT(levels[150], -20000);
    EXPECT_GT(levels[20], -500);
}

TEST(Measurements, DistanceToFault_ShowsTheFaultsAtTheirPlaces) {
    Host host;
    host.setUp({"MEAS,7", "TRACEDET,2"});
    const auto levels = host.levels();
    const double step = 15.0 / 300;
    for (const double metres : {0.0, 3.7, 8.15, 12.6}) {
        const auto at = static_cast<std::size_t>(std::lround(metres / step));
        EXPECT_GT(levels[at], -45000) << metres;
    }
    EXPECT_LT(levels[static_cast<std::size_t>(6.0 / step)], -55000);
    EXPECT_NEAR(static_cast<double>(highestPoint(levels)) * step, 12.6, 0.1);
}

TEST(Measurements, DistanceToFault_SweepsFrequenciesAlsoFromZeroSpan) {
    Host host;
    host.setUp({"SPAN,0", "MEAS,7"});
    EXPECT_EQ(host.value("SPAN"), "3000000000");
    host.setUp({"MEAS,1"});
    EXPECT_EQ(host.value("SPAN"), "0");
}

TEST(Measurements, LeavingAMode_BringsSpanUnitAndReferenceBack) {
    Host host;
    host.setUp({"SPAN,1000000000", "REFLVL,-10", "MEAS,7"});
    EXPECT_EQ(host.value("UNIT"), "5");
    host.setUp({"MEAS,6", "MEAS,1"});
    EXPECT_EQ(host.value("UNIT"), "0");
    EXPECT_EQ(host.value("REFLVL"), "-10");
    EXPECT_EQ(host.value("SPAN"), "1000000000");
}

TEST(Measurements, Level_IsThatOfTheCentreFrequency) {
    Host host;
    host.setUp({"FREQ,1500000000"});
    EXPECT_NEAR(host.number("LEVEL"), -30, 0.2);
    host.setUp({"FREQ,1300000000"});
    EXPECT_LT(host.number("LEVEL"), -80);
}

}  // namespace
}  // namespace zelsim
