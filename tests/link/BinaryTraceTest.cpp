#include <gtest/gtest.h>

#include <numeric>

#include "tests/Session.h"
#include "tests/link/Line.h"

namespace zel {
namespace {

/// Samples from `first` on, each one more than the one before.
std::vector<std::int32_t> ramp(std::int32_t first, std::size_t count = 301) {
    std::vector<std::int32_t> samples(count);
    std::iota(samples.begin(), samples.end(), first);
    return samples;
}

std::vector<double> asDoubles(const std::vector<std::int32_t>& samples) {
    return {samples.begin(), samples.end()};
}

std::string doubleBlock() { return traceBlock(ramp(-1000)) + traceBlock(ramp(70000)); }

struct TraceSetup : LineSetup {
    RawTrace trace;
    std::vector<double>& values = trace.values;
    /// One round; the dialogue is given back for its timing.
    Dialogue& script(const std::string& bytes) {
        port.expect("GET\r").answer("0\r");
        return port.expect("TRACEBIN\r").answer(bytes);
    }
    bool read(bool doubled = false) { return binary.GetTraceBinary(trace, doubled); }
};

struct Trace : TraceSetup, ::testing::Test {};

TEST_F(Trace, SingleBlock_Gives301Values) {
    script("0\r" + traceBlock(ramp(-150)));
    EXPECT_TRUE(read());
    expectPlayed();
    EXPECT_EQ(port.written(), "GET\rTRACEBIN\r");
    EXPECT_EQ(values, asDoubles(ramp(-150)));
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(Trace, DoubleBlock_Gives602ValuesWithoutTheSeparator) {
    script("0\r" + doubleBlock());
    EXPECT_TRUE(read(true));
    ASSERT_EQ(values.size(), 602U);
    EXPECT_EQ(values[300], -700);
    EXPECT_EQ(values[301], 70000);
    EXPECT_EQ(values[601], 70300);
}

TEST_F(Trace, Separators_AreNotLookedAt) {
    std::string block = doubleBlock();
    block[1204] = '\r';
    block[2409] = '\xFF';
    script("0\r" + block);
    EXPECT_TRUE(read(true));
    EXPECT_EQ(values[301], 70000);
    EXPECT_EQ(values[601], 70300);
}

TEST_F(Trace, Samples_AreSignedAndLeastByteFirst) {
    std::vector<std::int32_t> samples(301, 0);
    samples[0] = -1;
    samples[1] = INT32_MIN;
    samples[2] = INT32_MAX;
    samples[3] = 0x01020304;
    const std::string block = traceBlock(samples);
    ASSERT_EQ(block.substr(0, 4), "\xFF\xFF\xFF\xFF");
    ASSERT_EQ(block.substr(12, 4), "\x04\x03\x02\x01");
    script("0\r" + block);
    EXPECT_TRUE(read());
    EXPECT_EQ(values[0], -1);
    EXPECT_EQ(values[1], -2147483648.0);
    EXPECT_EQ(values[2], 2147483647.0);
    EXPECT_EQ(values[3], 16909060);
}

TEST_F(Trace, LinesOfTheTransfer_FollowOneAnother) {
    script("0\r" + levelBlock(1)).after(500);
    Texts lines;
    panel.DebugTextBox.Changed.connect([&] { lines.push_back(status()); });
    read();
    EXPECT_EQ(lines, (Texts{"Binary trace transfer starting", "BIN-BUFFER-LEN:  1204",
                            "Trace complete", "Binary trace transfer finished (0.50 s)"}));
}

TEST_F(Trace, FirstTransfer_EndsTheJudgingOfNoise) {
    script("0\r" + levelBlock(1));
    EXPECT_FALSE(panel.BinaryModeActive);
    read();
    EXPECT_TRUE(panel.BinaryModeActive);
    port.arrive("\xFF\r");
    reader.ReadAnswer();
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(Trace, ModeWordRefused_IsToldAndFalse) {
    port.expect("GET\r").answer("4\r");
    values = {5};
    EXPECT_FALSE(read());
    EXPECT_EQ(shown(), Texts{"information | ZELRemote | GET error 4 for command <TRACEBIN> (while "
                             "starting)"});
    EXPECT_EQ(values, std::vector<double>{5});
    EXPECT_EQ(status(), "Binary trace transfer finished (0.00 s)");
    EXPECT_FALSE(panel.BinaryModeActive);
}

TEST_F(Trace, ModeWordSilent_EndsWithoutAFinishedLine) {
    port.expect("GET\r").silence();
    EXPECT_LE(time([this] { EXPECT_FALSE(read()); }), 9200);
    EXPECT_EQ(shown(), Texts{"warning | ZELRemote | No response received!"});
    EXPECT_EQ(status(), "Binary trace transfer starting");
}

TEST_F(Trace, NothingIsDrainedAheadOfTheModeWord) {
    port.arrive("1\r");
    port.expect("GET\r").silence();
    EXPECT_FALSE(read());
    EXPECT_EQ(shown().size(), 1U);
}

TEST_F(Trace, NoByteInFiveSeconds_IsTrueAndTouchesNothing) {
    values.assign(301, 42);
    port.expect("GET\r").answer("0\r");
    port.expect("TRACEBIN\r").silence();
    const std::int64_t ms = time([this] { EXPECT_TRUE(read()); });
    EXPECT_GE(ms, 5000);
    EXPECT_LE(ms, 5050);
    EXPECT_EQ(values, std::vector<double>(301, 42));
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(Trace, BytesThatStop_GiveAShortTraceAndTrue) {
    values.assign(301, 42);
    script("0\r" + traceBlock(ramp(0)).substr(0, 601));
    EXPECT_TRUE(read());
    EXPECT_EQ(values[149], 149);
    EXPECT_EQ(values[150], 42);
    EXPECT_EQ(values[300], 42);
}

TEST_F(Trace, ShortDoubleTransfer_KeepsTheOldTail) {
    values.assign(602, 42);
    script("0\r" + doubleBlock().substr(0, 1205 + 9));
    EXPECT_TRUE(read(true));
    EXPECT_EQ(values[301], 70000);
    EXPECT_EQ(values[302], 70001);
    EXPECT_EQ(values[303], 42);
}

TEST_F(Trace, LongerArray_IsCutToTheTransfer) {
    values.assign(602, 42);
    script("0\r" + levelBlock(1));
    read();
    EXPECT_EQ(values.size(), 301U);
}

TEST_F(Trace, LastSampleOfASlowLine_IsNotLost) {
    values.assign(301, 42);
    script("0\r" + traceBlock(ramp(0))).chunks({1205}, 150);
    EXPECT_TRUE(read());
    EXPECT_EQ(values[300], 300);
}

TEST_F(Trace, LastBytesLaterThanTheTailsWait_AreAShortTransfer) {
    values.assign(301, 42);
    script("0\r" + traceBlock(ramp(0))).chunks({1205}, 400);
    EXPECT_TRUE(read());
    EXPECT_EQ(values[299], 299);
    EXPECT_EQ(values[300], 42);
}

TEST_F(Trace, EverySplitPoint_GivesTheSameTrace) {
    const std::string bytes = "0\r" + traceBlock(ramp(-20));
    for (std::size_t at = 1; at < bytes.size(); ++at) {
        TraceSetup rig;
        rig.script(bytes).chunks({at}, 30);
        EXPECT_TRUE(rig.read()) << at;
        ASSERT_EQ(rig.values, asDoubles(ramp(-20))) << at;
        EXPECT_EQ(rig.port.waiting(), "") << at;
    }
}

TEST_F(Trace, EverySplitPointOverTcp_GivesTheSameTrace) {
    const std::string bytes = "0\r" + traceBlock(ramp(-20));
    for (std::size_t at = 1; at < bytes.size(); ++at) {
        TraceSetup rig;
        rig.overTcp();
        rig.socket.expect("GET\r").answer("0\r");
        rig.socket.expect("TRACEBIN\r").answer(bytes).chunks({at}, 30);
        EXPECT_TRUE(rig.read()) << at;
        ASSERT_EQ(rig.values, asDoubles(ramp(-20))) << at;
    }
}

TEST_F(Trace, EveryChunkSize_GivesTheSameDoubleTrace) {
    const std::string bytes = "0\r" + doubleBlock();
    std::vector<double> wanted = asDoubles(ramp(-1000));
    for (const double value : asDoubles(ramp(70000))) wanted.push_back(value);
    for (const std::size_t size : {1U, 2U, 3U, 4U, 5U, 7U, 16U, 64U, 255U, 1204U, 1205U, 1206U,
                                   1207U, 2408U, 2409U, 2410U, 2411U}) {
        TraceSetup rig;
        rig.port.expect("GET\r").answer("0\r");
        Dialogue& second = rig.port.expect("TRACEBIN\r");
        for (std::size_t at = 0; at < bytes.size(); at += size) {
            second.answer(bytes.substr(at, size));
            if (at > 0) second.after(2);
        }
        EXPECT_TRUE(rig.read(true)) << size;
        ASSERT_EQ(rig.values, wanted) << size;
    }
}

TEST_F(Trace, RefusalWith1_IsAskedForAgainUntilSamplesCome) {
    for (int i = 0; i < 20; ++i) script("1\r");
    script("0\r" + traceBlock(ramp(7)));
    EXPECT_TRUE(read());
    expectPlayed();
    EXPECT_EQ(values, asDoubles(ramp(7)));
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(Trace, RefusalWith2To7_IsReportedAndFalse) {
    const std::string head = "information | ZEL3 Error | ";
    const Texts heads = {"Execution error  for command <TRACEBIN>\r\n",
                         "Dataset Storage Full  for command <TRACEBIN>\r\n",
                         "Not Allowed  for command <TRACEBIN>\r\n",
                         "Out of Range  for command <TRACEBIN>\r\n",
                         "",
                         "ERROR: The baud rate is incorrect.\r\n"};
    for (int status = 2; status <= 7; ++status) {
        TraceSetup rig;
        rig.values.assign(301, 42);
        rig.script(std::to_string(status) + "\r");
        EXPECT_FALSE(rig.read()) << status;
        rig.expectPlayed();
        EXPECT_EQ(rig.values, std::vector<double>(301, 42)) << status;
        const std::string& text = heads[static_cast<std::size_t>(status - 2)];
        ASSERT_EQ(rig.shown().size(), text.empty() ? 0U : 1U) << status;
        if (text.empty()) continue;
        EXPECT_EQ(rig.shown()[0].rfind(head + text, 0), 0U) << rig.shown()[0];
    }
}

TEST_F(Trace, TwoBytesThatAreNoRefusal_AreTheBeginningOfAShortTransfer) {
    for (const char* bytes : {"8\r", "0\r", "/\r", "5\n"}) {
        TraceSetup rig;
        rig.script("0\r" + std::string(bytes));
        EXPECT_TRUE(rig.read()) << bytes;
        EXPECT_EQ(rig.trace.came, 0U) << bytes;
        EXPECT_EQ(rig.shown(), Texts{}) << bytes;
    }
}

/// An instrument that goes on refusing, and something that happens half a second later.
struct Refused : Trace {
    Refused() {
        for (int i = 0; i < 200; ++i) script("1\r").after(20);
    }
    void expectEnd() {
        EXPECT_LE(time([this] { EXPECT_FALSE(read()); }), 1000);
        EXPECT_EQ(port.failure(), "");
        EXPECT_NE(port.leftOver(), "");
    }
};

TEST_F(Refused, StopOfTheView_EndsTheAsking) {
    panel.ContinuosLoopActive = true;
    events.schedule(500, [this] { panel.ContinuosLoopActive = false; });
    expectEnd();
}

TEST_F(Refused, StopOfTheRecording_EndsTheAsking) {
    panel.RecordDataFlag = true;
    events.schedule(500, [this] { panel.RecordDataFlag = false; });
    expectEnd();
}

TEST_F(Refused, Disconnection_EndsTheAsking) {
    events.schedule(500, [this] { panel.isConnected = false; });
    expectEnd();
}

TEST_F(Refused, ClosedPort_EndsTheAsking) {
    events.schedule(500, [this] { port.close(); });
    expectEnd();
}

TEST_F(Trace, PortDiesInTheMiddle_IsToldWithItsReasonAndFalse) {
    script("0\r" + levelBlock(1).substr(0, 500)).dies();
    values.assign(301, 42);
    EXPECT_LE(time([this] { EXPECT_FALSE(read()); }), 100);
    EXPECT_EQ(trace.came, 125U);
    EXPECT_EQ(values[124], 1);
    EXPECT_EQ(values[125], 42);
    EXPECT_EQ(shown(), Texts{"critical | ZELRemote | Port is not open!\r\nCOM1 has gone."});
    EXPECT_TRUE(exchange.ExchangeFailed());
}

TEST_F(Trace, SocketDiesInTheMiddle_IsFalseAndKeepsWhatCame) {
    overTcp();
    socket.expect("GET\r").answer("0\r");
    socket.expect("TRACEBIN\r").answer("0\r" + levelBlock(1).substr(0, 500)).dies();
    values.assign(301, 42);
    EXPECT_LE(time([this] { EXPECT_FALSE(read()); }), 100);
    EXPECT_EQ(trace.came, 125U);
    EXPECT_EQ(trace.wanted, 301U);
    EXPECT_EQ(values[125], 42);
    EXPECT_EQ(shown().size(), 1U);
    EXPECT_TRUE(exchange.ExchangeFailed());
}

/// What came of a transfer that brings the first `bytes` bytes of its block, or of both blocks.
std::size_t cameOf(std::size_t bytes, bool doubled) {
    TraceSetup rig;
    const std::string block = doubled ? doubleBlock() : traceBlock(ramp(0));
    rig.script("0\r" + block.substr(0, bytes));
    EXPECT_TRUE(rig.read(doubled));
    EXPECT_EQ(rig.trace.wanted, doubled ? 602U : 301U);
    EXPECT_EQ(rig.trace.whole(), bytes == block.size());
    return rig.trace.came;
}

TEST(TransferThatIsCut, Single_CountsTheSamplesThatCame) {
    EXPECT_EQ(cameOf(0, false), 0U);
    EXPECT_EQ(cameOf(3, false), 0U);
    EXPECT_EQ(cameOf(4, false), 1U);
    EXPECT_EQ(cameOf(600, false), 150U);
    EXPECT_EQ(cameOf(603, false), 150U);
    EXPECT_EQ(cameOf(1201, false), 300U);
    EXPECT_EQ(cameOf(1205, false), 301U);
}

TEST(TransferThatIsCut, LessThanASampleMissing_LeavesNoSampleToTrust) {
    for (std::size_t bytes = 1202; bytes < 1205; ++bytes) EXPECT_EQ(cameOf(bytes, false), 0U);
    for (std::size_t bytes = 2407; bytes < 2410; ++bytes) EXPECT_EQ(cameOf(bytes, true), 0U);
}

TEST(TransferThatIsCut, Double_DoesNotCountTheSeparator) {
    EXPECT_EQ(cameOf(1204, true), 301U);
    EXPECT_EQ(cameOf(1205 + 3, true), 301U);
    EXPECT_EQ(cameOf(1205 + 4, true), 302U);
    EXPECT_EQ(cameOf(2406, true), 601U);
    EXPECT_EQ(cameOf(2410, true), 602U);
}

TEST_F(Trace, DigitOfARefusalWithSamplesBehindIt_IsAWrongDigit) {
    script("1\r" + traceBlock(ramp(5))).chunks({2}, 5);
    EXPECT_TRUE(read());
    EXPECT_TRUE(trace.whole());
    EXPECT_EQ(values, asDoubles(ramp(5)));
}

}  // namespace
}  // namespace zel
