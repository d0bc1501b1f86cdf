// The waits that the instrument needs to change its mode or to move a marker serve no event.

#include <gtest/gtest.h>

#include <cstdint>

#include "tests/panel/Panel.h"

namespace zel {
namespace {

struct BlockingWait : PanelSession, ::testing::Test {
    /// The moment, in milliseconds, at which a task runs that falls due so soon after the click.
    template <class T>
    std::int64_t servedAt(T& key, int dueMs) {
        std::int64_t at = -1;
        platform.events.schedule(dueMs, [&] { at = platform.clock.micros() / 1000; });
        const std::int64_t start = platform.clock.micros() / 1000;
        key.Click();
        platform.events.pump();
        return at - start;
    }
};

TEST_F(BlockingWait, PowerSensorMode_ServesNothingFor2500Ms) {
    set("MEAS,3");
    EXPECT_GE(servedAt(panel.PwrButton, 1000), 2500);
}

TEST_F(BlockingWait, OccupiedBandwidthMode_ServesNothingFor2000Ms) {
    visited();
    set("MEAS,5");
    EXPECT_GE(servedAt(panel.OccBWButton, 1000), 2000);
}

TEST_F(BlockingWait, MarkerToCentre_ServesNothingFor700Ms) {
    cmd("MARKTOCENT");
    get("MARK1", "1500000000,-30");
    get("MARK1", "1500000000,-30");
    sweep();
    EXPECT_GE(servedAt(panel.MarkToCentButton, 300), 700);
    expectPlayed();
}

TEST_F(BlockingWait, DeltaMarker_ServesNothingFor1000Ms) {
    set("DELTA1ON,1");
    get("DELTA1", "1000,-3");
    EXPECT_GE(servedAt(panel.DeltaCheckBox, 500), 1000);
    expectPlayed();
}

}  // namespace
}  // namespace zel
