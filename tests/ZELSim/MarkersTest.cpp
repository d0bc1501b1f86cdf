#include <algorithm>
#include <cmath>
#include <utility>

#include "ZELSim/Markers.h"
#include "ZELSim/Network.h"
#include "tests/ZELSim/WireFixture.h"

namespace zelsim {
namespace {

std::pair<double, double> readout(Host& host, std::string_view word) {
    const std::string text = host.value(word);
    const auto comma = text.find(',');
    return {parseNumber(text.substr(0, comma)).value_or(-1e99),
            parseNumber(text.substr(comma + 1)).value_or(-1e99)};
}

TEST(Markers, Peak_IsTheRealMaximumOfTheTrace) {
    Host host;
    host.setUp({"SWPCONT,0", "TRACEDET,2", "FREQ,1800000000", "SPAN,100000000"});
    const auto levels = host.levels();
    host.setUp({"MARK1ON,1", "MARK1,1760000000"});
    EXPECT_EQ(host.cmd("MARKPK"), "0\r");
    const auto [x, level] = readout(host, "MARK1");
    const auto highest = std::max_element(levels.begin(), levels.end());
    EXPECT_NEAR(level, *highest / 1000, 0.006);
    const auto point = static_cast<double>(highest - levels.begin());
    EXPECT_NEAR(x, 1.75e9 + point * 100e6 / 300, 1);
}

TEST(Markers, NextPeak_GoesDownFromPeakToPeak) {
    Host host;
    host.setUp({"SWPCONT,0", "MARK1ON,1"});
    host.wire.advance(1);
    EXPECT_EQ(host.cmd("MARKPK"), "0\r");
    EXPECT_NEAR(readout(host, "MARK1").first, 0, 1);  // the feed-through
    EXPECT_EQ(host.cmd("MARKNXTPK"), "0\r");
    EXPECT_NEAR(readout(host, "MARK1").first, 1.5e9, 1);
    double last = readout(host, "MARK1").second;
    EXPECT_EQ(host.cmd("MARKNXTPK"), "0\r");
    EXPECT_LT(readout(host, "MARK1").second, last);
}

TEST(Markers, Minimum_IsTheLeastOfTheTrace) {
    Host host;
    host.setUp({"SWPCONT,0", "TRACEDET,3", "MARK1ON,1"});
    const auto levels = host.levels();
    EXPECT_EQ(host.cmd("MARKMIN"), "0\r");
    EXPECT_NEAR(readout(host, "MARK1").second,
                *std::min_element(levels.begin(), levels.end()) / 1000, 0.006);
}

TEST(Markers, MarkerThatIsOff_IsRefused) {
    Host host;
    host.setUp({});
    for (const char* word : {"MARKPK", "MARKNXTPK", "MARKMIN", "MARKTOCENT", "MARKTOLVL"}) {
        EXPECT_EQ(host.cmd(word), "4\r") << word;
    }
    EXPECT_EQ(host.get("MARK1"), "4\r");
    EXPECT_EQ(host.get("DELTA1"), "4\r");
    EXPECT_EQ(host.set("MARK1,1000000000"), "4\r");
}

TEST(Markers, Delta_CountsFromTheMarker) {
    Host host;
    host.setUp({"SWPCONT,0", "MARK1ON,1", "MARK1,1500000000", "DELTA1ON,1", "DELTA1,-300000000"});
    const auto [x, level] = readout(host, "DELTA1");
    EXPECT_NEAR(x, -300e6, 1);
    const auto high = decodeBlock(host.get("TRACEBIN").substr(2), 1205);
    EXPECT_NEAR(level, (high[120] - high[150]) / 1000, 0.006);
}

TEST(Markers, PositionOutsideTheDisplay_IsOutOfRange) {
    Host host;
    host.setUp({"SPAN,1000000", "MARK1ON,1"});
    EXPECT_EQ(host.set("MARK1,1600000000"), "5\r");
}

TEST(Markers, ToCentre_MovesTheCentreAndKeepsTheFrequency) {
    Host host;
    host.setUp({"SPAN,1000000000", "MARK1ON,1", "MARK1,1200000000"});
    EXPECT_EQ(host.cmd("MARKTOCENT"), "0\r");
    EXPECT_EQ(host.value("FREQ"), "1200000000");
    EXPECT_NEAR(readout(host, "MARK1").first, 1.2e9, 1);
}

TEST(Markers, ToReference_TakesTheMarkersLevel) {
    Host host;
    host.setUp({"SWPCONT,0", "MARK1ON,1", "MARK1,1500000000"});
    EXPECT_EQ(host.cmd("MARKTOLVL"), "0\r");
    EXPECT_NEAR(host.number("REFLVL"), -30, 0.1);
}

TEST(Markers, ZeroSpanAndDistance_ReadInSecondsAndMetres) {
    Host host;
    host.setUp({"SPAN,0", "SWPTIME,0.3", "MARK1ON,1", "MARK1,0.1"});
    EXPECT_NEAR(readout(host, "MARK1").first, 0.1, 1e-9);
    host.setUp({"MEAS,7", "CABLELEN,30", "MARK1,12"});
    EXPECT_NEAR(readout(host, "MARK1").first, 12, 1e-9);
}

TEST(Markers, NoiseMode_ReadsIntoOneHertz) {
    Host host;
    host.setUp({"SWPCONT,0", "RBW,7", "MARK1ON,1", "MARK1,1300000000"});
    const double level = readout(host, "MARK1").second;
    EXPECT_EQ(host.set("MARKMODE,1"), "0\r");
    EXPECT_NEAR(readout(host, "MARK1").second, level - 50.27, 0.05);
}

TEST(Markers, CountMode_ReadsTheCarrierAndNotThePoint) {
    Host host;
    host.setUp({"MARK1ON,1", "MARKMODE,2", "MARK1,430000000"});
    EXPECT_NEAR(readout(host, "MARK1").first, 433920000, 1);
}

TEST(Markers, NextPeakOnAFlatTrace_StaysWhereItIs) {
    Levels flat{};
    EXPECT_EQ(nextPeak(flat, 17), 17U);
}

}  // namespace
}  // namespace zelsim
