#include <gtest/gtest.h>

#include "tests/Session.h"
#include "tests/link/Line.h"

namespace zel {
namespace {

struct Complex : Line {
    std::vector<double> values;
    const std::string block = levelBlock(-1) + levelBlock(70000);

    bool read() { return binary.GetCTraceBinary(values); }
    void round(const std::string& answer) {
        port.expect("GET\r").answer("0\r");
        port.expect("CTRACEBIN\r").answer(answer);
    }
    void expectGood() const {
        ASSERT_EQ(values.size(), 602U);
        EXPECT_EQ(values[0], -1);
        EXPECT_EQ(values[300], -1);
        EXPECT_EQ(values[301], 70000);
        EXPECT_EQ(values[601], 70000);
    }
};

TEST_F(Complex, Transfer_Gives602ValuesWithoutTheSeparator) {
    round("0\r" + block);
    EXPECT_TRUE(read());
    expectPlayed();
    EXPECT_EQ(port.written(), "GET\rCTRACEBIN\r");
    expectGood();
    EXPECT_FALSE(state.ComplexTraceActive);
    EXPECT_TRUE(panel.BinaryModeActive);
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(Complex, Lines_EndWithTheFinishedLine) {
    round("0\r" + block);
    Texts lines;
    panel.DebugTextBox.Changed.connect([&] { lines.push_back(status()); });
    read();
    EXPECT_EQ(lines.front(), "Binary ctrace transfer starting");
    ASSERT_GE(lines.size(), 4U);
    EXPECT_EQ(lines[lines.size() - 3], "MY INBUFFER LEN IS:  2410");
    EXPECT_EQ(lines[lines.size() - 2], "Trace complete");
    EXPECT_EQ(lines.back(), "Binary trace transfer finished (0.00 s)");
}

TEST_F(Complex, Chunks_OfAnySize_GiveTheSameValues) {
    for (const std::size_t size : {1U, 2U, 3U, 100U, 1206U, 2411U}) {
        LineSetup rig;
        rig.port.expect("GET\r").answer("0\r");
        Dialogue& second = rig.port.expect("CTRACEBIN\r");
        const std::string bytes = "0\r" + block;
        for (std::size_t at = 0; at < bytes.size(); at += size)
            second.answer(bytes.substr(at, size)).after(at > 0 ? 2 : 0);
        EXPECT_TRUE(rig.binary.GetCTraceBinary(values)) << size;
        expectGood();
    }
}

TEST_F(Complex, OverTcp_GivesTheSameValues) {
    overTcp();
    socket.expect("GET\r").answer("0\r");
    socket.expect("CTRACEBIN\r").answer("0\r" + block).chunks({2, 700, 900}, 20);
    EXPECT_TRUE(read());
    expectPlayed();
    expectGood();
}

TEST_F(Complex, BytesBehindTheTransfer_StayInTheBuffer) {
    port.arrive("abcdef");
    EXPECT_EQ(binary.ReadLiteralBytes(4), "abcd");
    EXPECT_EQ(state.InputBuffer, "ef");
}

TEST_F(Complex, ModeWordRefused_IsToldAndFalse) {
    port.expect("GET\r").answer("1\r");
    EXPECT_FALSE(read());
    EXPECT_EQ(shown(), Texts{"information | ZELRemote | GET error 1 for command <CTRACEBIN> (while "
                             "starting)"});
    EXPECT_FALSE(state.ComplexTraceActive);
    EXPECT_EQ(status(), "Binary trace transfer finished (0.00 s)");
}

TEST_F(Complex, KeywordRefused_IsToldTwiceWithTheCommandLine) {
    panel.CommandLine = "button";
    round("5\r");
    EXPECT_FALSE(read());
    EXPECT_EQ(shown(),
              (Texts{"information | ZELRemote | CMD error 5 for command <CTRACEBIN> (while "
                     "executing)",
                     "information | ZEL3 Error | Out of Range  for command <button>\r\n"
                     "The parameter value is out of range and cannot be programmed.\r\n"
                     "Please refer to the ZEL3 Z9 Manual for further instructions."}));
    EXPECT_FALSE(state.ComplexTraceActive);
}

TEST_F(Complex, KeywordRefusedWith2_NamesTheMode) {
    round("2\r");
    EXPECT_FALSE(read());
    ASSERT_EQ(shown().size(), 2U);
    EXPECT_EQ(shown()[0],
              "information | ZELRemote | CMD error 2 for command <CTRACEBIN> (while executing)\r\n"
              "Command not allowed in currend mode");
}

TEST_F(Complex, ModeWordSilent_LeavesTheActiveFlagSet) {
    port.expect("GET\r").silence();
    EXPECT_LE(time([this] { EXPECT_FALSE(read()); }), 9200);
    EXPECT_TRUE(state.ComplexTraceActive);
    EXPECT_EQ(shown(), Texts{"warning | ZELRemote | No response received!"});
}

TEST_F(Complex, BytesThatStop_AreAskedForAgainAndTheTransferStartsOver) {
    round("0\r" + block.substr(0, 100));
    port.expect("get\r").answer("0\r");
    port.expect("CTRACEBIN\r").answer("0\r" + block);
    round("0\r" + block);
    const std::int64_t ms = time([this] { EXPECT_TRUE(read()); });
    expectPlayed();
    expectGood();
    EXPECT_GE(ms, 11500);
    EXPECT_LE(ms, 11600);
    EXPECT_FALSE(state.ComplexTraceRequested);
    EXPECT_FALSE(state.ComplexTraceActive);
}

TEST_F(Complex, PlainTransfer_IsAskedForAgainWithItsOwnKeyword) {
    events.schedule(12'000, [this] { port.arrive("abcd"); });
    EXPECT_EQ(binary.ReadLiteralBytes(4), "abcd");
    EXPECT_EQ(port.written(), "get\rTRACEBIN\r");
    EXPECT_FALSE(state.ComplexTraceRequested);
}

TEST_F(Complex, BytesAheadOfTheReRequest_AreDropped) {
    port.arrive("ab");
    events.schedule(12'000, [this] { port.arrive("cdef"); });
    EXPECT_EQ(binary.ReadLiteralBytes(4), "cdef");
}

TEST_F(Complex, ReRequest_GoesOutAsSoonAsTenSecondsHavePassed) {
    for (const int first : {1, 19, 20}) {  // of a byte, and so of each look at the clock
        LineSetup rig;
        rig.events.runFor(60'000);  // the ten seconds begin with the read
        rig.events.schedule(first, [&] { rig.port.arrive("a"); });
        rig.events.schedule(12'000, [&] { rig.port.arrive("bcde"); });
        EXPECT_EQ(rig.binary.ReadLiteralBytes(4), "bcde");
        EXPECT_EQ(rig.debug.momentOf("-> get\r"), 70'000 + first) << first;
    }
}

TEST_F(Complex, SilentInstrument_IsAskedEvery11AndAHalfSecondsUntilThePortCloses) {
    round("0\r");
    events.schedule(60'000, [this] { port.close(); });
    const std::int64_t ms = time([this] { EXPECT_FALSE(read()); });
    EXPECT_LE(ms, 60'100);
    EXPECT_EQ(shown(), Texts{"critical | ZELRemote | Port is not open!"});
    std::vector<std::int64_t> asked;
    for (const StampedDebug::Entry& entry : debug.entries)
        if (entry.text == "-> get\r") asked.push_back(entry.ms);
    ASSERT_EQ(asked.size(), 5U);
    EXPECT_GE(asked[0], 10'000);
    EXPECT_LE(asked[0], 10'050);
    for (std::size_t i = 1; i < asked.size(); ++i) {
        EXPECT_GE(asked[i] - asked[i - 1], 11'500);
        EXPECT_LE(asked[i] - asked[i - 1], 11'550);
    }
}

TEST_F(Complex, SilentInstrument_UserDisconnects_EndsTheAsking) {
    round("0\r");
    events.schedule(5'000, [this] { panel.isConnected = false; });
    EXPECT_LE(time([this] { EXPECT_FALSE(read()); }), 5'100);
}

TEST_F(Complex, ClosedPort_IsToldAndEmpty) {
    port.close();
    EXPECT_EQ(binary.ReadLiteralBytes(4), "");
    EXPECT_EQ(shown(), Texts{"critical | ZELRemote | Port is not open!"});
}

}  // namespace
}  // namespace zel
