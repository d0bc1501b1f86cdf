#include <gtest/gtest.h>

#include <string>

#include "platform/virtual/FaultyPort.h"
#include "platform/virtual/ScriptedPort.h"
#include "platform/virtual/ScriptedServer.h"
#include "platform/virtual/ScriptedSocket.h"
#include "platform/virtual/VirtualTime.h"

namespace zel {
namespace {

struct ScriptedLineTest : ::testing::Test {
    VirtualClock clock;
    VirtualEvents events{clock};
    ScriptedPort port{events};
    SerialSetup setup;

    ScriptedLineTest() { setup.CommPort = "COM3"; }

    /// What has arrived after so many milliseconds.
    std::string inputAfter(SerialPort& from, int ms) {
        events.runFor(ms);
        return from.input();
    }
};

TEST_F(ScriptedLineTest, Port_RequestInPieces_IsAnsweredBehindItsLastByte) {
    port.expect("GET\r").answer("0\r");
    port.open(setup);
    port.output("GE");
    EXPECT_EQ(inputAfter(port, 1), "");
    port.output("T\r");
    EXPECT_EQ(inputAfter(port, 1), "0\r");
    EXPECT_EQ(port.failure(), "");
    EXPECT_EQ(port.leftOver(), "");
}

TEST_F(ScriptedLineTest, Port_Answer_DoesNotArriveAheadOfAPump) {
    port.expect("GET\r").answer("0\r");
    port.open(setup);
    port.output("GET\r");
    EXPECT_EQ(port.input(), "");
}

TEST_F(ScriptedLineTest, Port_WrongByte_IsToldInHexWithItsStep) {
    port.expect("A\r").answer("0\r");
    port.expect("FREQ\r").answer("0\r");
    port.open(setup);
    port.output("A\rFRAQ\r");
    EXPECT_EQ(port.failure(),
              "step 2: expected 46 52 45 51 0D (\"FREQ\\r\"), got 46 52 41 51 0D (\"FRAQ\\r\"), "
              "differing at byte 3");
}

TEST_F(ScriptedLineTest, Port_MoreThanTheScript_IsAFailure) {
    port.expect("A").silence();
    port.open(setup);
    port.output("A\x01");
    EXPECT_EQ(port.failure(), "step 2: expected nothing, got 01 (\"\\x01\"), differing at byte 1");
}

TEST_F(ScriptedLineTest, Port_StepsNotPlayed_AreLeftOver) {
    port.expect("A").answer("1");
    port.expect("BC").answer("2");
    port.open(setup);
    port.output("AB");
    EXPECT_EQ(port.failure(), "");
    EXPECT_EQ(port.leftOver(), "step 2 of 2 not played: 42 43 (\"BC\"), sent so far 42 (\"B\")");
}

TEST_F(ScriptedLineTest, Port_LateAnswer_ArrivesAtItsMoment) {
    port.expect("A").answer("0\r").answer("1\r").after(20);
    port.open(setup);
    port.output("A");
    EXPECT_EQ(inputAfter(port, 19), "0\r");
    EXPECT_EQ(inputAfter(port, 1), "1\r");
}

TEST_F(ScriptedLineTest, Port_ChunkedAnswer_ArrivesInPieces) {
    port.expect("A").answer("abcdef").after(5).chunks({1, 2}, 10);
    port.open(setup);
    port.output("A");
    EXPECT_EQ(inputAfter(port, 5), "a");
    EXPECT_EQ(inputAfter(port, 10), "bc");
    EXPECT_EQ(inputAfter(port, 9), "");
    EXPECT_EQ(inputAfter(port, 1), "def");
}

TEST_F(ScriptedLineTest, Port_NoiseAheadOfTheSteps_ComesAtTheOpening) {
    port.noise("\xFF?");
    port.expect("A").answer("0");
    port.open(setup);
    EXPECT_EQ(inputAfter(port, 0), "\xFF?");
}

TEST_F(ScriptedLineTest, Port_RepeatedStep_IsPlayedThatOftenMore) {
    port.expect("A").answer("0").repeat(2);
    port.open(setup);
    port.output("AAA");
    EXPECT_EQ(inputAfter(port, 0), "000");
    EXPECT_EQ(port.leftOver(), "");
}

TEST_F(ScriptedLineTest, Port_DataArrives_FiresCommEvent2) {
    int code = 0;
    port.OnComm.connect([&](int got) { code = got; });
    port.expect("A").answer("0");
    port.open(setup);
    port.output("A");
    EXPECT_EQ(code, 0);
    events.pump();
    EXPECT_EQ(code, 2);
}

TEST_F(ScriptedLineTest, Port_ClosedWithAnswersUnderWay_LosesThem) {
    port.expect("A").answer("0").after(10);
    port.open(setup);
    port.output("A");
    port.close();
    port.open(setup);
    EXPECT_EQ(inputAfter(port, 100), "");
}

TEST_F(ScriptedLineTest, Port_OpeningFails_SaysWhyAndThenWorks) {
    port.failOpen("COM3 is in use.", 1);
    EXPECT_FALSE(port.open(setup));
    EXPECT_EQ(port.problem(), "COM3 is in use.");
    EXPECT_TRUE(port.open(setup));
    EXPECT_EQ(port.problem(), "");
    ASSERT_EQ(port.openings().size(), 2U);
    EXPECT_EQ(port.openings()[0].CommPort, "COM3");
}

TEST_F(ScriptedLineTest, Port_ScriptWithoutSteps_RecordsAll) {
    port.open(setup);
    port.output("AB");
    port.output("C");
    EXPECT_EQ(port.written(), "ABC");
    EXPECT_EQ(port.failure(), "");
}

TEST_F(ScriptedLineTest, Port_DropAfterByte_DeliversSoManyAndIsGone) {
    port.expect("A").answer("0\r12345\r");
    port.dropAfterByte(4);
    port.open(setup);
    port.output("A");
    EXPECT_EQ(inputAfter(port, 0), "0\r12");
    EXPECT_FALSE(port.isOpen());
    EXPECT_EQ(port.problem(), "COM3 has gone.");
}

TEST_F(ScriptedLineTest, Port_DropAtAByteNeverReached_DoesNothing) {
    port.expect("A").answer("0\r");
    port.dropAfterByte(2);
    port.open(setup);
    port.output("A");
    EXPECT_EQ(inputAfter(port, 0), "0\r");
    EXPECT_TRUE(port.isOpen());
}

TEST_F(ScriptedLineTest, Port_GarbleByte_ChangesThatByteOnly) {
    port.expect("A").answer("0\r").answer("12\r");
    port.garbleByte(3);
    port.open(setup);
    port.output("A");
    const std::string got = inputAfter(port, 0);
    ASSERT_EQ(got.size(), 5U);
    EXPECT_EQ(got.substr(0, 3), "0\r1");
    EXPECT_EQ(got[3], garbled('2'));
    EXPECT_NE(got[3], '2');
    EXPECT_EQ(got[4], '\r');
}

TEST_F(ScriptedLineTest, Garbled_AnyByte_IsAnotherByteAndNeverCr) {
    for (int byte = 0; byte < 256; ++byte) {
        const char before = static_cast<char>(byte);
        EXPECT_NE(garbled(before), before);
        EXPECT_NE(garbled(before), '\r');
    }
}

TEST_F(ScriptedLineTest, Port_SplitAtByte_HoldsWhatFollowsInItsOrder) {
    port.expect("A").answer("0\r12\r").answer("end");
    port.splitAtByte(3, 50);
    port.open(setup);
    port.output("A");
    EXPECT_EQ(inputAfter(port, 49), "0\r1");
    EXPECT_EQ(inputAfter(port, 1), "2\rend");
}

struct FaultyPortTest : ScriptedLineTest {
    FaultyPort faulty{port, events};
    FaultyPortTest() {
        port.expect("A").answer("0123456789");
        port.expect("B").answer("abc");
    }
    std::string answerTo(const std::string& request) {
        faulty.output(request);
        return inputAfter(faulty, 0);
    }
};

TEST_F(FaultyPortTest, NotArmed_PassesAllOn) {
    faulty.open(setup);
    EXPECT_EQ(answerTo("A"), "0123456789");
    EXPECT_EQ(faulty.received(), 10);
}

TEST_F(FaultyPortTest, Drop_DeliversSoManyAndIsGoodAgainWhenOpened) {
    faulty.open(setup);
    faulty.arm({.dropAt = 4});
    EXPECT_EQ(answerTo("A"), "0123");
    EXPECT_FALSE(faulty.isOpen());
    EXPECT_NE(faulty.problem(), "");
    ASSERT_TRUE(faulty.open(setup));
    EXPECT_EQ(answerTo("B"), "abc");
}

TEST_F(FaultyPortTest, Split_PausesAheadOfTheByteAndTellsOfTheRest) {
    faulty.open(setup);
    faulty.arm({.splitAt = 4, .splitPauseMs = 30});
    EXPECT_EQ(answerTo("A"), "0123");
    int told = 0;
    faulty.OnComm.connect([&](int) { ++told; });
    EXPECT_EQ(inputAfter(faulty, 29), "");
    EXPECT_EQ(inputAfter(faulty, 1), "456789");
    EXPECT_EQ(told, 1);
}

TEST_F(FaultyPortTest, Garble_ChangesThatByte) {
    faulty.open(setup);
    faulty.arm({.garbleAt = 0});
    EXPECT_EQ(answerTo("A"), std::string(1, garbled('0')) + "123456789");
}

struct ScriptedSocketTest : ScriptedLineTest {
    ScriptedSocket socket{events};
};

TEST_F(ScriptedSocketTest, ConnectTo_Succeeds_AtTheNextPump) {
    socket.connectTo("host", 2277);
    EXPECT_EQ(socket.state(), SocketState::Connecting);
    events.pump();
    EXPECT_EQ(socket.state(), SocketState::Connected);
    EXPECT_EQ(socket.host(), "host");
    EXPECT_EQ(socket.port(), 2277);
}

TEST_F(ScriptedSocketTest, ConnectTo_ToldToFail_EndsInErrorAfterTheTime) {
    socket.connectsTo(SocketState::Error, 300);
    socket.connectTo("host", 1);
    events.runFor(299);
    EXPECT_EQ(socket.state(), SocketState::Connecting);
    events.runFor(1);
    EXPECT_EQ(socket.state(), SocketState::Error);
    EXPECT_FALSE(socket.sendData("A"));
}

TEST_F(ScriptedSocketTest, SendData_ScriptedRequest_BringsDataWithItsEvent) {
    int arrivals = 0;
    socket.DataArrival.connect([&] { ++arrivals; });
    socket.expect("GET\r").answer("0\r7\r");
    socket.connectTo("host", 1);
    events.pump();
    EXPECT_TRUE(socket.sendData("GET\r"));
    events.pump();
    EXPECT_EQ(arrivals, 1);
    EXPECT_EQ(socket.peekData(), "0\r7\r");
    EXPECT_EQ(socket.getData(), "0\r7\r");
    EXPECT_EQ(socket.getData(), "");
}

TEST_F(ScriptedSocketTest, Listen_AClientKnocks_IsTakenOver) {
    ScriptedServer server(events);
    int request = 0;
    server.ConnectionRequest.connect([&](int id) {
        request = id;
        server.accept(id);
    });
    server.listen("", 2277);
    server.knock(5);
    events.pump();
    EXPECT_EQ(request, 5);
    EXPECT_EQ(server.client().state(), SocketState::Connected);
    server.far().arrive("hello");
    EXPECT_EQ(server.client().getData(), "hello");
}

TEST_F(ScriptedSocketTest, PeerCloses_WhileConnected_TellsAndKeepsWhatCame) {
    bool told = false;
    socket.PeerClosed.connect([&] { told = true; });
    socket.connectTo("host", 1);
    events.pump();
    socket.arrive("rest");
    socket.peerCloses();
    EXPECT_TRUE(told);
    EXPECT_EQ(socket.state(), SocketState::PeerClosing);
    EXPECT_EQ(socket.getData(), "rest");
}

TEST_F(ScriptedSocketTest, Close_WhileConnecting_StaysClosed) {
    socket.connectTo("host", 1);
    socket.close();
    events.runFor(10);
    EXPECT_EQ(socket.state(), SocketState::Closed);
}

}  // namespace
}  // namespace zel
