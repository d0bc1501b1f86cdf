// When the reply to the last line of the client is whole; what is unclear waits for a quiet line.

#include "server/ReplyWatch.h"
#include "tests/server/ServerBench.h"

namespace zel {
namespace {

struct WholeReply : ServerBench, ::testing::Test {
    void SetUp() override {
        bridge();
        enter();
    }
    /// What has gone to the client since the last look.
    std::string gone() {
        const std::string all = sentToClient();
        const std::string fresh = all.substr(seen_);
        seen_ = all.size();
        return fresh;
    }
    /// A mode word that the instrument accepts.
    void mode(const std::string& word) {
        client.arrive(word + "\r");
        line.arrive("0\r");
        ASSERT_EQ(gone(), "0\r");
    }
    /// The dialogue is clear: the status of a mode word goes on at once.
    void expectClear() { mode("GET"); }

  private:
    std::size_t seen_ = 0;
};

TEST_F(WholeReply, Status_GoesOnAtOnceAlsoWhenItIsSplit) {
    client.arrive("cmd\r");
    line.arrive("0");
    EXPECT_EQ(gone(), "");
    run(3);
    line.arrive("\r");
    EXPECT_EQ(gone(), "0\r");
    client.arrive("REMOTE\r");
    line.arrive("0\r");
    EXPECT_EQ(gone(), "0\r");
    expectClear();
}

TEST_F(WholeReply, Setting_IsAnsweredByAStatusAlone) {
    mode("set");
    client.arrive("FREQ,1500000000\r");
    line.arrive("0\r");
    EXPECT_EQ(gone(), "0\r");
    expectClear();
}

TEST_F(WholeReply, QueryInPieces_GoesOnAsOne) {
    mode("GET");
    client.arrive("FREQ\r");
    for (const char* piece : {"0", "\r", "15000", "00000"}) {
        line.arrive(piece);
        run(5);
        EXPECT_EQ(gone(), "");
    }
    line.arrive("\r");
    EXPECT_EQ(gone(), "0\r1500000000\r");
    expectClear();
}

TEST_F(WholeReply, QueryWordSplitAtEachByte_IsUnderstood) {
    for (const char c : std::string("GET\r")) client.arrive(std::string(1, c));
    line.arrive("0\r");
    EXPECT_EQ(gone(), "0\r");
    for (const char c : std::string("SPAN\r")) client.arrive(std::string(1, c));
    line.arrive("0\r");
    EXPECT_EQ(gone(), "");
    line.arrive("1000\r");
    EXPECT_EQ(gone(), "0\r1000\r");
}

TEST_F(WholeReply, AnswerAfterItsStatus_GoesOnAtOnce) {
    mode("GET");
    client.arrive("FREQ\r");
    line.arrive("0\r");
    run(11);
    EXPECT_EQ(gone(), "0\r");
    line.arrive("7");
    EXPECT_EQ(gone(), "");
    line.arrive("\r");
    EXPECT_EQ(gone(), "7\r");
}

TEST_F(WholeReply, RefusedWord_WaitsForTheQuietLine) {
    for (const char* word : {"set", "GET"}) {
        mode(word);
        client.arrive("FREQ,1\r");
        line.arrive("5\r");
        run(9);
        EXPECT_EQ(gone(), "");
        run(2);
        EXPECT_EQ(gone(), "5\r");
        expectClear();
        client.arrive("SPAN\r");
        line.arrive("0\r1\r");
        EXPECT_EQ(gone(), "0\r1\r");
    }
}

TEST_F(WholeReply, RefusedModeWord_WaitsForTheQuietLine) {
    client.arrive("GET\r");
    line.arrive("4\r");
    EXPECT_EQ(gone(), "");
    run(11);
    EXPECT_EQ(gone(), "4\r");
    expectClear();
}

TEST_F(WholeReply, BytesThatNobodyAskedFor_WaitForTheQuietLine) {
    line.arrive("0\r");
    EXPECT_EQ(gone(), "");
    // A question does not make an answer of what came before it.
    client.arrive("GET\r");
    line.arrive("0\r");
    EXPECT_EQ(gone(), "");
    run(11);
    EXPECT_EQ(gone(), "0\r0\r");
    expectClear();
}

TEST_F(WholeReply, BytesBehindTheReply_GoOnWithIt) {
    mode("GET");
    client.arrive("FREQ\r");
    line.arrive("0\r7\rx");
    EXPECT_EQ(gone(), "");
    run(11);
    EXPECT_EQ(gone(), "0\r7\rx");
}

TEST_F(WholeReply, Noise_WaitsForTheQuietLine) {
    mode("GET");
    client.arrive("FREQ\r");
    line.arrive("0\r\xF8\x9C\r");
    EXPECT_EQ(gone(), "");
    run(11);
    EXPECT_EQ(gone(), "0\r\xF8\x9C\r");
}

TEST_F(WholeReply, TextWithoutItsEnd_WaitsForTheQuietLine) {
    mode("GET");
    client.arrive("IDN?\r");
    line.arrive("0\rMarlow");
    run(9);
    EXPECT_EQ(gone(), "");
    run(2);
    EXPECT_EQ(gone(), "0\rMarlow");
}

TEST_F(WholeReply, TwoQuestionsAtOnce_AreNotJudged) {
    client.arrive("GET\rFREQ\r");
    line.arrive("0\r");
    EXPECT_EQ(gone(), "");
    line.arrive("0\r7\r");
    EXPECT_EQ(gone(), "");
    run(11);
    EXPECT_EQ(gone(), "0\r0\r7\r");
    expectClear();
}

TEST_F(WholeReply, BareLineEnd_IsNotJudged) {
    mode("cmd");
    client.arrive("\r");
    line.arrive("1\r0\r");
    EXPECT_EQ(gone(), "");
    run(11);
    EXPECT_EQ(gone(), "1\r0\r");
    expectClear();
}

TEST_F(WholeReply, AfterATrace_IsJudgedAgain) {
    mode("get");
    client.arrive("TRACEBIN\r");
    line.arrive("0\r");
    line.arrive(std::string(1205, '\r'));
    EXPECT_EQ(gone(), "0\r" + std::string(1205, '\r'));
    expectClear();
}

TEST_F(WholeReply, GroupOf100Ms_HoldsItTheWholeTime) {
    program.server().relay().setQuiet(100);
    client.arrive("GET\r");
    line.arrive("0\r");
    run(99);
    EXPECT_EQ(gone(), "");
    run(2);
    EXPECT_EQ(gone(), "0\r");
}

TEST_F(WholeReply, Newcomer_BeginsAfresh) {
    client.arrive("GET\rhalf");
    enter("10.0.0.2");
    expectClear();
}

TEST(ReplyWatch, LongestLines_AreBounded) {
    ReplyWatch watch;
    watch.asked("GET");
    watch.asked(std::string(ReplyWatch::kLongestLine, ' ') + "\r");
    EXPECT_FALSE(watch.answered("0\r"));
    watch.quiet();
    watch.asked("GET\r");
    EXPECT_TRUE(watch.answered("0\r"));
    watch.asked("LONG\r");
    EXPECT_FALSE(watch.answered("0\r" + std::string(ReplyWatch::kLongestReply + 1, 'x') + "\r"));
}

}  // namespace
}  // namespace zel
