// What the user sees stays true when the network between client and server fails, at any byte.

#include <algorithm>
#include <cmath>

#include "tests/server/NetworkSetup.h"

namespace zel {
namespace {

constexpr NetFault kFaults[] = {NetFault::Reset, NetFault::HalfOpen, NetFault::Split};
constexpr int kWays[] = {NetworkSetup::kToServer, NetworkSetup::kToClient};
constexpr std::size_t kSamples = 301;
constexpr std::size_t kMostForLine = 64 * 1024 + 4096;

std::string placeOf(NetFault fault, int way, long byte) {
    constexpr const char* kNames[] = {"none", "reset", "half-open", "split"};
    return std::string(kNames[static_cast<int>(fault)]) + " at byte " + std::to_string(byte) +
           (way == NetworkSetup::kToServer ? " to the server" : " to the client");
}

/// The server is at work, its line is free, and a client that comes now is served.
void expectNextClientWorks(NetworkSetup& rig) {
    EXPECT_TRUE(rig.server.server().bridging());
    EXPECT_EQ(rig.waiting(), 0U);
    rig.client.disconnect();
    rig.desk.boxes.clear();
    ASSERT_TRUE(rig.connect());
    EXPECT_EQ(shownBoxes(rig.desk.boxes), Texts{});
    EXPECT_TRUE(rig.asksRightCentre());
    EXPECT_EQ(shownBoxes(rig.far.boxes), Texts{});
}

void expectWholeTrace(const NetworkSetup& rig) {
    ASSERT_EQ(rig.panel.RawTraceData.size(), kSamples);
    const auto [least, most] =
        std::minmax_element(rig.panel.RawTraceData.begin(), rig.panel.RawTraceData.end());
    EXPECT_GT(*least, -200);
    EXPECT_LT(*most, 50);
}

TEST(Network, Session_OverTheServer_IsAsOnTheDesk) {
    NetworkSetup rig;
    ASSERT_TRUE(rig.connect());
    EXPECT_EQ(shownBoxes(rig.desk.boxes), Texts{});
    EXPECT_TRUE(rig.asksRightCentre());
    EXPECT_TRUE(rig.client.exchange().SetInstrument("TRACEDET,3"));
    rig.client.variables().TraceDetector = 3;
    EXPECT_TRUE(rig.readTrace());
    expectWholeTrace(rig);
    EXPECT_EQ(rig.form.ClientState, 7);
    rig.client.disconnect();
    rig.run(10);
    EXPECT_EQ(rig.form.ClientState, 0);
}

TEST(Network, Query_FaultAtEachByte_NeverShowsAWrongValue) {
    NetworkSetup good;
    ASSERT_TRUE(good.connect());
    std::string value;
    long counts[2];
    for (const int way : kWays) good.arm(way, NetFault::None, 0);
    ASSERT_TRUE(good.get("FREQ", value));
    for (const int way : kWays) counts[way] = good.passed(way);
    ASSERT_EQ(counts[NetworkSetup::kToServer], 9);
    for (const int way : kWays)
        for (const NetFault fault : kFaults)
            for (long byte = 0; byte < counts[way]; ++byte) {
                SCOPED_TRACE(placeOf(fault, way, byte));
                NetworkSetup rig;
                ASSERT_TRUE(rig.connect());
                rig.arm(way, fault, byte);
                std::string got = "old";
                const bool done = rig.get("FREQ", got);
                EXPECT_EQ(done, fault == NetFault::Split);
                EXPECT_EQ(got, done ? value : "old");
                // The end of a connection is reported at the next exchange at the latest.
                rig.client.disconnect();
                EXPECT_EQ(shownBoxes(rig.desk.boxes).empty(), done);
                expectNextClientWorks(rig);
                if (::testing::Test::HasFailure()) return;
            }
}

TEST(Network, Trace_SplitAtEachByte_IsWhole) {
    NetworkSetup rig;
    ASSERT_TRUE(rig.connect());
    ASSERT_TRUE(rig.client.exchange().SetInstrument("TRACEDET,3"));
    rig.client.variables().TraceDetector = 3;
    rig.arm(NetworkSetup::kToClient, NetFault::None, 0);
    ASSERT_TRUE(rig.readTrace());
    const long count = rig.passed(NetworkSetup::kToClient);
    ASSERT_GT(count, 1205);
    for (long byte = 0; byte < count; ++byte) {
        SCOPED_TRACE(byte);
        rig.arm(NetworkSetup::kToClient, NetFault::Split, byte);
        ASSERT_TRUE(rig.readTrace());
        expectWholeTrace(rig);
        if (::testing::Test::HasFailure()) return;
    }
    EXPECT_EQ(shownBoxes(rig.desk.boxes), Texts{});
}

TEST(Network, Trace_ConnectionThatFails_IsNeverShownAsWhole) {
    constexpr long kStep = 61;
    for (const NetFault fault : {NetFault::Reset, NetFault::HalfOpen})
        for (long byte = 0; byte < 1200; byte += kStep) {
            SCOPED_TRACE(placeOf(fault, NetworkSetup::kToClient, byte));
            NetworkSetup rig;
            ASSERT_TRUE(rig.connect());
            ASSERT_TRUE(rig.client.exchange().SetInstrument("TRACEDET,3"));
            rig.client.variables().TraceDetector = 3;
            int cut = 0;
            rig.client.traces().CutShort.connect([&](const Sweep& sweep) {
                ++cut;
                EXPECT_LT(sweep.came, sweep.wanted);
            });
            rig.arm(NetworkSetup::kToClient, fault, byte);
            const bool whole = rig.readTrace() && cut == 0;
            EXPECT_FALSE(whole);
            expectNextClientWorks(rig);
            if (::testing::Test::HasFailure()) return;
        }
}

TEST(Network, LineOfTheServerThatFails_IsReportedOnBothSides) {
    for (long byte = 0; byte < 4; ++byte) {
        SCOPED_TRACE(byte);
        NetworkSetup rig;
        ASSERT_TRUE(rig.connect());
        LineFaults faults;
        faults.dropAt = byte;
        rig.line.arm(faults);
        std::string got = "old";
        EXPECT_FALSE(rig.get("FREQ", got));
        EXPECT_EQ(got, "old");
        EXPECT_FALSE(shownBoxes(rig.desk.boxes).empty());
        rig.run(2000);
        EXPECT_FALSE(rig.server.server().bridging());
        EXPECT_NE(rig.server.server().problem().find("The port has gone."), std::string::npos);
        rig.line.disarm();
        ASSERT_TRUE(rig.server.server().connect());
        EXPECT_TRUE(rig.reconnect());
        EXPECT_TRUE(rig.asksRightCentre());
    }
}

TEST(Network, FirstBytesOfOtherPrograms_HoldUpNobody) {
    const std::string scans[] = {
        "GET / HTTP/1.1\r\nHost: 10.0.0.1\r\nUser-Agent: scanner\r\n\r\n", "SSH-2.0-scanner\r\n",
        std::string("\x16\x03\x01\x00\xF1\x01\x00\x00\xED\x03\x03", 11) + std::string(237, '\xA5'),
        std::string(5000, '\0'), std::string("\xFF\xFD\x18\xFF\xFD\x20\r\n+++ATH0\r", 17)};
    for (const std::string& scan : scans) {
        SCOPED_TRACE(scan.substr(0, 8));
        NetworkSetup rig;
        PipeSocket scanner(rig.desk.events);
        scanner.knocks = [&](PipeSocket& who) { rig.listener.knock(who); };
        scanner.connectTo("127.0.0.1", 2277);
        rig.run(5);
        scanner.sendData(scan);
        rig.run(3000);
        scanner.close();
        rig.run(50);
        EXPECT_EQ(rig.form.ClientState, 0);
        expectNextClientWorks(rig);
        EXPECT_TRUE(rig.readTrace());
    }
}

TEST(Network, Flood_IsTakenAtThePaceOfTheLine) {
    NetworkSetup rig;
    PipeSocket flooder(rig.desk.events);
    flooder.knocks = [&](PipeSocket& who) { rig.listener.knock(who); };
    flooder.connectTo("127.0.0.1", 2277);
    rig.run(5);
    const std::string piece(64 * 1024, 'x');
    for (int i = 0; i < 64; ++i) {
        flooder.sendData(piece);
        rig.run(20);
        ASSERT_LE(rig.waiting(), kMostForLine + piece.size());
        ASSERT_LE(rig.listener.end().bytesToWrite(), std::size_t{1024 * 1024});
    }
    flooder.close();
    rig.run(500);
    expectNextClientWorks(rig);
}

TEST(Network, ClientThatTakesNothing_IsClosedAndTheNextOneWorks) {
    NetworkSetup rig;
    PipeSocket greedy(rig.desk.events);
    greedy.knocks = [&](PipeSocket& who) { rig.listener.knock(who); };
    greedy.connectTo("127.0.0.1", 2277);
    rig.run(5);
    greedy.sendData("\r");
    rig.run(1000);
    // From here on nothing passes to the client: it stays in the server's queue.
    greedy.pipe()->ways[NetworkSetup::kToClient].scheduled = true;
    std::size_t most = 0;
    for (int i = 0; i < 2000 && rig.form.ClientState == 7; ++i) {
        greedy.sendData("GET\r");
        rig.run(120);
        greedy.sendData("TRACEBIN\r");
        rig.run(150);
        most = std::max(most, rig.listener.end().bytesToWrite());
    }
    EXPECT_EQ(rig.form.ClientState, 0);
    EXPECT_GT(most, std::size_t{900 * 1024});
    EXPECT_LE(most, std::size_t{1024 * 1024});
    expectNextClientWorks(rig);
}

}  // namespace
}  // namespace zel
