#include <gtest/gtest.h>

#include "tests/link/Line.h"

namespace zel {
namespace {

const char* const kNoise =
    "information | Incorrect baud rate | Incorrect baud rate for the connection!\r\nReceived: ";
const char* const kAbsent = "critical | ZELRemote | No ZEL3 found at the specified address!";
const char* const kSilence = "warning | ZELRemote | No response received!";

struct Answers : Line {
    std::string answer;
    /// Reads a line; the result is how long it took, in milliseconds.
    std::int64_t read() {
        return time([this] { answer = reader.ReadAnswer(); });
    }
    std::int64_t readTriggered(int seconds) {
        return time([&] { answer = reader.ReadAnswerTriggered(seconds); });
    }
    void arriveAfter(int ms, const std::string& bytes) {
        events.schedule(ms, [this, bytes] { port.arrive(bytes); });
    }
    void expectSilenceOf(int seconds) {
        const std::int64_t ms = read();
        EXPECT_GE(ms, seconds * 1000);
        EXPECT_LE(ms, seconds * 1000 + 150);
        EXPECT_EQ(answer, "");
    }
};

TEST(IsPrintableAnswer, EmptyText_IsPrintable) { EXPECT_TRUE(IsPrintableAnswer("")); }

TEST(IsPrintableAnswer, OneOrTwoCharacters_MustLieBelow58) {
    EXPECT_TRUE(IsPrintableAnswer("0"));
    EXPECT_TRUE(IsPrintableAnswer("9\r"));
    EXPECT_TRUE(IsPrintableAnswer("-2"));
    EXPECT_FALSE(IsPrintableAnswer(":"));
    EXPECT_FALSE(IsPrintableAnswer("0A"));
    EXPECT_FALSE(IsPrintableAnswer("a0"));
}

TEST(IsPrintableAnswer, ThreeCharacters_MayBeLetters) { EXPECT_TRUE(IsPrintableAnswer("0AB")); }

TEST(IsPrintableAnswer, TopBit_IsNoiseAtAnyLength) {
    EXPECT_FALSE(IsPrintableAnswer("\x80"));
    EXPECT_FALSE(IsPrintableAnswer("Marlow\xFF"));
    EXPECT_TRUE(IsPrintableAnswer("Marlow\x7F"));
}

TEST_F(Answers, Line_IsReturnedWithoutItsCr) {
    port.arrive("1500000000\r");
    EXPECT_EQ(read(), 0);
    EXPECT_EQ(answer, "1500000000");
    EXPECT_TRUE(reader.answered());
}

TEST_F(Answers, CharactersBehindTheFirstCr_AreSeenByTheNextReadFirst) {
    port.arrive("0\r12\r3");
    read();
    EXPECT_EQ(state.InputBuffer, "12\r3");
    port.arrive("4\r");
    read();
    EXPECT_EQ(answer, "12");
    read();
    EXPECT_EQ(answer, "34");
}

TEST_F(Answers, Tcp_LeftOversAreThrownAwayAtTheStart) {
    overTcp();
    state.InputBuffer = "old\r";
    socket.arrive("0\r7\r");
    read();
    EXPECT_EQ(answer, "0");
    EXPECT_EQ(state.InputBuffer, "7\r");
}

TEST_F(Answers, GoodLine_ClearsTheFailure) {
    state.ExchangeFailed = true;
    port.arrive("0\r");
    read();
    EXPECT_FALSE(state.ExchangeFailed);
}

TEST_F(Answers, BareCr_IsAnEmptyLineAndNoFailure) {
    port.arrive("\r");
    EXPECT_EQ(read(), 0);
    EXPECT_EQ(answer, "");
    EXPECT_TRUE(reader.answered());
    EXPECT_FALSE(state.ExchangeFailed);
}

TEST_F(Answers, AnswerJustAheadOfTheTimeOut_IsTaken) {
    arriveAfter(8990, "0\r");
    EXPECT_EQ(read(), 8990);
    EXPECT_EQ(answer, "0");
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(Answers, Silence_DirectLink_EndsAfterNineSeconds) { expectSilenceOf(9); }

TEST_F(Answers, Silence_AnyOtherSerialKind_EndsAfterSixteenSeconds) {
    for (const std::int16_t kind : kSerialKinds) {
        if (kind == ControllerForm::DIRECTCON) continue;
        panel.ConnectionState = kind;
        expectSilenceOf(16);
    }
}

TEST_F(Answers, Silence_Tcp_EndsAfterSixteenSeconds) {
    overTcp();
    expectSilenceOf(16);
}

TEST_F(Answers, Silence_AfterWait_LastsTwoSweepsLonger) {
    state.WaitCommandActive = true;
    state.SweepTimeTold = 3;
    expectSilenceOf(15);
}

TEST_F(Answers, Silence_AfterWait_IsRoundedToWholeSeconds) {
    state.WaitCommandActive = true;
    state.SweepTimeTold = 0.2;
    expectSilenceOf(9);
    state.SweepTimeTold = 0.3;
    expectSilenceOf(10);
}

TEST_F(Answers, Silence_SweepTimeWithoutWait_ChangesNothing) {
    state.SweepTimeTold = 100;
    expectSilenceOf(9);
}

TEST_F(Answers, Silence_SweepTimeBeyondSense_EndsAllTheSame) {
    state.WaitCommandActive = true;
    state.SweepTimeTold = 1e300;
    const std::int64_t ms = read();
    EXPECT_LE(ms, 86'401'000);
    EXPECT_EQ(shown(), Texts{kSilence});
}

TEST_F(Answers, SilenceInSession_IsToldOnceInABurst) {
    read();
    EXPECT_EQ(shown(), Texts{kSilence});
    EXPECT_TRUE(state.ExchangeFailed);
    read();
    EXPECT_EQ(shown().size(), 1U);
    EXPECT_TRUE(state.ExchangeFailed);
    port.arrive("0\r");
    read();
    read();
    EXPECT_EQ(shown().size(), 2U);
}

TEST_F(Answers, SilenceInSession_LeavesTheConnectionUp) {
    read();
    EXPECT_TRUE(panel.isConnected);
    EXPECT_TRUE(port.isOpen());
}

TEST_F(Answers, PortClosed_IsToldAndFails) {
    port.close();
    EXPECT_EQ(read(), 0);
    EXPECT_EQ(shown(), Texts{"critical | ZELRemote | Port not open!"});
    EXPECT_TRUE(state.ExchangeFailed);
    EXPECT_FALSE(reader.answered());
}

TEST_F(Answers, PortDiesUnderWay_IsToldAtOnceWithItsReason) {
    events.schedule(500, [this] { port.die(); });
    const std::int64_t ms = read();
    EXPECT_LE(ms, 520);
    EXPECT_EQ(shown(), Texts{"critical | ZELRemote | Port not open!\r\nCOM1 has gone."});
}

TEST_F(Answers, PortClosed_DialCancelled_IsNotTold) {
    port.close();
    state.DialCancelled = true;
    read();
    EXPECT_EQ(shown(), Texts{});
    EXPECT_TRUE(state.ExchangeFailed);
}

TEST_F(Answers, Noise_IsToldOnceAndReadingGoesOn) {
    arriveAfter(0, "\xFF\xFE");
    arriveAfter(1000, "\xFF");
    arriveAfter(2000, "\r");
    EXPECT_EQ(read(), 2000);
    ASSERT_EQ(shown().size(), 1U);
    EXPECT_EQ(shown()[0], std::string(kNoise) + "\xC3\xBF\xC3\xBE");
    EXPECT_TRUE(panel.ErrorFlag);
    EXPECT_EQ(answer, "\xFF\xFE\xFF");
}

TEST_F(Answers, Noise_WithItsCr_IsJudgedAtOnce) {
    arriveAfter(0, ":\r");
    EXPECT_EQ(read(), 0);
    EXPECT_EQ(shown(), Texts{std::string(kNoise) + ":\r"});
}

TEST_F(Answers, Noise_ErrorFlagSet_IsNotTold) {
    panel.ErrorFlag = true;
    arriveAfter(0, "\xFF\r");
    read();
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(Answers, Noise_AfterABinaryTransfer_IsNoLongerJudged) {
    panel.BinaryModeActive = true;
    arriveAfter(0, "\xFF\r");
    read();
    EXPECT_EQ(shown(), Texts{});
    EXPECT_FALSE(panel.ErrorFlag);
}

TEST_F(Answers, AnswerThatStillGrows_IsNoNoise) {
    // A letter every 19 ms: none of the short beginnings counts.
    const std::string identity = "Marlow\r";
    for (std::size_t i = 0; i < identity.size(); ++i)
        arriveAfter(static_cast<int>(100 + 19 * i), identity.substr(i, 1));
    read();
    EXPECT_EQ(answer, "Marlow");
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(Answers, LetterThatStaysAlone_IsNoise) {
    arriveAfter(0, "M");
    arriveAfter(100, "arlow\r");
    read();
    EXPECT_EQ(answer, "Marlow");
    EXPECT_EQ(shown(), Texts{std::string(kNoise) + "M"});
}

TEST_F(Answers, NoiseWithoutEnd_IsBounded) {
    panel.BinaryModeActive = true;
    for (int i = 0; i < 800; ++i) arriveAfter(10 * i, std::string(1000, '\xFF'));
    read();
    EXPECT_LE(state.InputBuffer.size(), 66000U);
}

struct Connecting : Answers {
    int disconnects = 0;
    Connecting() {
        whileConnecting();
        reader.AttemptAbandoned.connect([this] { ++disconnects; });
    }
};

TEST_F(Connecting, Silence_IsOneBoxAndTheEndOfTheAttempt) {
    dialog.OnPic.Visible = true;
    dialog.MousePointer = 11;
    expectSilenceOf(9);
    EXPECT_EQ(shown(), Texts{kAbsent});
    EXPECT_FALSE(port.isOpen());
    EXPECT_EQ(disconnects, 1);
    EXPECT_FALSE(dialog.OnPic.Visible);
    EXPECT_EQ(dialog.MousePointer.get(), 0);
    EXPECT_FALSE(state.ExchangeFailed);
    EXPECT_FALSE(panel.ErrorFlag);
    EXPECT_TRUE(reader.absenceTold());
}

TEST_F(Connecting, Silence_ErrorFlagSet_IsNotToldAndTheFlagStays) {
    panel.ErrorFlag = true;
    read();
    EXPECT_EQ(shown(), Texts{});
    EXPECT_TRUE(panel.ErrorFlag);
    EXPECT_EQ(disconnects, 1);
}

TEST_F(Connecting, Silence_DialCancelled_IsNotTold) {
    state.DialCancelled = true;
    read();
    EXPECT_EQ(shown(), Texts{});
    EXPECT_FALSE(panel.ErrorFlag);
}

TEST_F(Connecting, Silence_DialledKind_LeavesThePortToTheDisconnection) {
    panel.ConnectionState = ControllerForm::MODEMCON;
    read();
    EXPECT_TRUE(port.isOpen());
    EXPECT_EQ(disconnects, 1);
}

TEST_F(Connecting, NoiseThenSilence_IsTheBaudBoxAndThenTheAbsence) {
    arriveAfter(0, "\xFF\x81");
    read();
    ASSERT_EQ(shown().size(), 2U);
    EXPECT_EQ(shown()[0].rfind(kNoise, 0), 0U);
    EXPECT_EQ(shown()[1], kAbsent);
}

TEST_F(Answers, Triggered_TimeOut_IsTheCallersAlone) {
    state.WaitCommandActive = true;
    state.SweepTimeTold = 100;
    const std::int64_t ms = readTriggered(3);
    EXPECT_GE(ms, 3000);
    EXPECT_LE(ms, 3050);
    EXPECT_EQ(shown(), Texts{"warning | ZELRemote | External trigger timed out!"});
    EXPECT_TRUE(state.ExchangeFailed);
}

TEST_F(Answers, Triggered_TimeOut_IsToldEachTime) {
    readTriggered(1);
    readTriggered(1);
    EXPECT_EQ(shown().size(), 2U);
}

TEST_F(Answers, Triggered_LongTimeOut_WaitsForTheTrigger) {
    arriveAfter(59'000, "0\r");
    EXPECT_EQ(readTriggered(60), 59'000);
    EXPECT_EQ(answer, "0");
}

}  // namespace
}  // namespace zel
