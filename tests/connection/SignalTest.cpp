// How long a program takes to end at a signal, with the simulated instrument at the far end.

#include <gtest/gtest.h>

#include "tests/connection/FaultSetup.h"

namespace zel {
namespace {

constexpr std::int64_t kLongestEndMs = 2000;
constexpr std::int64_t kLongestHangUpMs = 15'000;

TEST(Signal, Idle_LeavesTheInstrumentInLocalStateAtOnce) {
    FaultSetup rig;
    ASSERT_TRUE(rig.connect());
    ASSERT_TRUE(rig.instrument.device().remote());
    EXPECT_LE(rig.time([&] { rig.platform.endSignals.EndRequested("SIGHUP"); }), kLongestEndMs);
    EXPECT_FALSE(rig.instrument.device().remote());
    EXPECT_FALSE(rig.instrument.isOpen());
    EXPECT_EQ(rig.program.endedBy(), "SIGHUP");
}

TEST(Signal, AtEachMomentOfASweep_LeavesTheInstrumentInLocalStateAtOnce) {
    for (int ms = 0; ms < 400; ms += 7) {
        FaultSetup rig;
        ASSERT_TRUE(rig.connect());
        std::int64_t asked = 0;
        rig.platform.events.schedule(ms, [&] {
            asked = rig.platform.clock.micros();
            rig.platform.endSignals.EndRequested("SIGTERM");
        });
        rig.readTrace();
        rig.platform.events.runFor(400);
        ASSERT_GT(asked, 0);
        EXPECT_LE((rig.platform.clock.micros() - asked) / 1000, kLongestEndMs + 400) << ms;
        EXPECT_FALSE(rig.instrument.device().remote()) << ms;
        EXPECT_FALSE(rig.instrument.isOpen()) << ms;
    }
}

TEST(Signal, SilentLine_EndsWithinTwoSeconds) {
    FaultSetup rig;
    ASSERT_TRUE(rig.connect());
    LineFaults silent;
    silent.splitAt = 0;
    silent.splitPauseMs = 600'000;
    rig.faulty.arm(silent);
    rig.platform.boxes.clear();
    EXPECT_LE(rig.time([&] { rig.platform.endSignals.EndRequested("SIGINT"); }), kLongestEndMs);
    EXPECT_TRUE(rig.program.ended());
    EXPECT_EQ(shownBoxes(rig.platform.boxes), Texts{});
}

TEST(Signal, DialledLine_IsHungUpWithinFifteenSeconds) {
    FaultSetup rig;
    const LinkAddress modem{LinkAddress::Kind::TwoModems, zelsim::InProcessPort::kModemPort, 57600,
                            "555"};
    ASSERT_TRUE(rig.program.connect(modem, false));
    ASSERT_TRUE(rig.instrument.device().remote());
    std::string sent;
    rig.line.spoken = [&sent](std::string_view bytes) { sent += bytes; };
    EXPECT_LE(rig.time([&] { rig.platform.endSignals.EndRequested("SIGTERM"); }), kLongestHangUpMs);
    EXPECT_EQ(sent, "cmd\rLOCAL\r+++ATH0\r");
    EXPECT_FALSE(rig.instrument.device().remote());
    EXPECT_FALSE(rig.instrument.isOpen());
}

}  // namespace
}  // namespace zel
