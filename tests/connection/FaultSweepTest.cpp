#include <gtest/gtest.h>

#include "tests/connection/FaultSetup.h"

namespace zel {
namespace {

// One time-out of a direct link and some polling; the handshake begins with its pause.
constexpr std::int64_t kLongestExchangeMs = 9'500;
constexpr std::int64_t kLongestHandshakeMs = 10'100;
constexpr long kStatusBytes = 2;

/// Faults that bring every byte in the end.
bool bringsAll(Fault fault) { return fault == Fault::Splits || fault == Fault::Stalls; }

/// Runs `body(fault, byte)` for every kind of fault at every byte of `count`.
template <class Body>
void sweep(long count, const Body& body) {
    ASSERT_GT(count, 0);
    for (const Fault fault : kFaults) {
        for (long byte = 0; byte < count; ++byte) {
            SCOPED_TRACE(std::string(kFaultNames[static_cast<int>(fault)]) + " at byte " +
                         std::to_string(byte));
            body(fault, byte);
            if (::testing::Test::HasFailure()) return;
        }
    }
}

/// An exchange on the good line after a fault. A fault in the answer to the mode word leaves the
/// instrument waiting for a keyword: it refuses the next mode word once, and is in step then.
void expectNextExchangeWorks(FaultSetup& rig, Fault fault, bool inModeWordAnswer) {
    rig.goodLine();
    rig.platform.events.runFor(kStallMs);  // what comes late has come then, and is drained
    if (fault == Fault::Dies) {
        EXPECT_FALSE(rig.line.isOpen());
        ASSERT_TRUE(rig.reconnect());
    }
    ASSERT_TRUE(rig.panel.isConnected);
    const bool first = rig.asksRightCentre();
    if (first) return;
    EXPECT_TRUE(inModeWordAnswer && (fault == Fault::Garbles || fault == Fault::Loses));
    EXPECT_TRUE(rig.asksRightCentre());
}

TEST(FaultSweep, Handshake_EveryByte_TheNextAttemptWorks) {
    FaultSetup good;
    const long count = good.bytesOf([&] { ASSERT_TRUE(good.connect()); });
    sweep(count, [](Fault fault, long byte) {
        FaultSetup rig;
        rig.arm(fault, byte);
        bool connected = false;
        const std::int64_t ms = rig.time([&] { connected = rig.connect(); });
        EXPECT_LE(ms, kLongestHandshakeMs);
        if (bringsAll(fault)) {
            EXPECT_TRUE(connected);
        }
        if (fault == Fault::Splits) {
            EXPECT_EQ(shownBoxes(rig.platform.boxes), Texts{});
        }
        rig.goodLine();
        rig.program.disconnect();
        rig.platform.boxes.clear();
        EXPECT_TRUE(rig.connect());
        EXPECT_EQ(shownBoxes(rig.platform.boxes), Texts{});
        EXPECT_TRUE(rig.asksRightCentre());
    });
}

TEST(FaultSweep, Set_EveryByte_TheNextExchangeWorks) {
    FaultSetup good;
    ASSERT_TRUE(good.connect());
    const long count = good.bytesOf([&] { ASSERT_TRUE(good.set("FREQ,1000000000")); });
    EXPECT_EQ(count, 2 * kStatusBytes);
    sweep(count, [](Fault fault, long byte) {
        FaultSetup rig;
        ASSERT_TRUE(rig.connect());
        rig.arm(fault, byte);
        bool done = false;
        EXPECT_LE(rig.time([&] { done = rig.set("FREQ,1000000000"); }), kLongestExchangeMs);
        if (bringsAll(fault)) {
            EXPECT_TRUE(done);
        }
        if (done) {
            EXPECT_EQ(rig.instrument.device().settings().centre, 1e9);
        }
        expectNextExchangeWorks(rig, fault, byte < kStatusBytes);
    });
}

TEST(FaultSweep, Get_EveryByte_TheNextExchangeWorks) {
    FaultSetup good;
    std::string value;
    ASSERT_TRUE(good.connect());
    const long count = good.bytesOf([&] { ASSERT_TRUE(good.get("FREQ", value)); });
    EXPECT_EQ(count, 2 * kStatusBytes + static_cast<long>(value.size()) + 1);
    sweep(count, [&](Fault fault, long byte) {
        FaultSetup rig;
        ASSERT_TRUE(rig.connect());
        rig.arm(fault, byte);
        std::string got = "old";
        bool done = false;
        EXPECT_LE(rig.time([&] { done = rig.get("FREQ", got); }), kLongestExchangeMs);
        if (bringsAll(fault)) {
            EXPECT_EQ(got, value);
        }
        if (!done) {
            EXPECT_EQ(got, "old");
        }
        expectNextExchangeWorks(rig, fault, byte < kStatusBytes);
    });
}

/// A session whose instrument has that detector.
void begin(FaultSetup& rig, const std::string& detector) {
    ASSERT_TRUE(rig.connect());
    ASSERT_TRUE(rig.set("TRACEDET," + detector));
    rig.program.variables().TraceDetector = static_cast<std::uint8_t>(leadingNumber(detector));
}

void sweepTrace(const std::string& detector, long blockBytes, std::size_t samples) {
    FaultSetup rig;
    begin(rig, detector);
    const long wait = 2 * kStatusBytes;  // WAIT goes before the transfer
    const long count = rig.bytesOf([&] { ASSERT_TRUE(rig.readTrace()); });
    EXPECT_EQ(count, wait + 2 * kStatusBytes + blockBytes);
    sweep(count, [&](Fault fault, long byte) {
        rig.arm(fault, byte);
        bool done = false;
        EXPECT_LE(rig.time([&] { done = rig.readTrace(); }), kLongestExchangeMs);
        if (bringsAll(fault)) {
            EXPECT_TRUE(done);
        }
        if (fault == Fault::Dies) {
            EXPECT_FALSE(done);
        }
        const bool inModeWordAnswer =
            byte < kStatusBytes || (byte >= wait && byte < wait + kStatusBytes);
        expectNextExchangeWorks(rig, fault, inModeWordAnswer);
        ASSERT_TRUE(rig.readTrace());
        ASSERT_EQ(rig.panel.RawTraceData.size(), samples);
        const auto [least, most] =
            std::minmax_element(rig.panel.RawTraceData.begin(), rig.panel.RawTraceData.end());
        EXPECT_GT(*least, -200);
        EXPECT_LT(*most, 50);
    });
}

TEST(FaultSweep, Trace_EveryByte_TheNextTraceWorks) { sweepTrace("3", 1205, 301); }

TEST(FaultSweep, DoubleTrace_EveryByte_TheNextTraceWorks) { sweepTrace("0", 2410, 602); }

TEST(FaultSweep, ManyFaultsInARow_LeaveTheSessionUsable) {
    FaultSetup rig;
    ASSERT_TRUE(rig.connect());
    for (long byte = 0; byte < 60; ++byte) {
        rig.arm(kFaults[byte % 5], byte % 12);
        std::string value;
        rig.get("FREQ", value);
        rig.set("FREQ,1000000000");
        if (!rig.line.isOpen()) {
            rig.goodLine();
            ASSERT_TRUE(rig.reconnect());
        }
    }
    rig.goodLine();
    std::string value;
    rig.get("FREQ", value);
    EXPECT_TRUE(rig.asksRightCentre());
    EXPECT_TRUE(rig.readTrace());
}

}  // namespace
}  // namespace zel
