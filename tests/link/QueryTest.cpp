#include <gtest/gtest.h>

#include "tests/link/Line.h"

namespace zel {
namespace {

const char* const kSilence = "warning | ZELRemote | No response received!";
const std::string kManual = "\r\nPlease refer to the ZEL3 Z9 Manual for further instructions.";

struct Query : Line {
    std::string value = "old";
    bool get(const std::string& keyword = "FREQ") { return exchange.GetInstrument(keyword, value); }
};

TEST_F(Query, Dialogue_IsModeWordKeywordStatusAndValue) {
    exchangeOf("GET", "FREQ", "0\r1500000000\r");
    EXPECT_TRUE(get());
    expectPlayed();
    EXPECT_EQ(port.written(), "GET\rFREQ\r");
    EXPECT_EQ(value, "1500000000");
    EXPECT_EQ(status(), "GET <FREQ> finished (0.00 s)");
}

TEST_F(Query, LinesOfTheDialogue_FollowOneAnother) {
    exchangeOf("GET", "RBW", "0\r7\r");
    Texts lines;
    panel.DebugTextBox.Changed.connect([&] { lines.push_back(status()); });
    get("RBW");
    EXPECT_EQ(lines,
              (Texts{"GET <RBW> starting", "<RBW> response: 7", "GET <RBW> finished (0.00 s)"}));
}

TEST_F(Query, ValueLaterThanItsStatus_IsWaitedFor) {
    port.expect("GET\r").answer("0\r");
    port.expect("PWR\r").answer("0\r").answer("-12.5\r").after(8000);
    EXPECT_TRUE(get("PWR"));
    EXPECT_EQ(value, "-12.5");
}

TEST_F(Query, EmptyValue_IsASuccess) {
    exchangeOf("GET", "NAME", "0\r\r");
    EXPECT_TRUE(get("NAME"));
    EXPECT_EQ(value, "");
}

TEST_F(Query, ModeWordRefused_IsToldTwice) {
    port.expect("GET\r").answer("1\r");
    EXPECT_FALSE(get());
    expectPlayed();
    EXPECT_EQ(shown(),
              (Texts{"information | ZELRemote | GET error 1 for command <FREQ> (while starting)",
                     "information | ZEL3 Error | Syntax error!  for command <FREQ>" + kManual}));
    EXPECT_EQ(value, "old");
    EXPECT_EQ(status(), "GET <FREQ> finished (0.00 s)");
}

TEST_F(Query, KeywordRefused_IsToldAndHasNoValue) {
    exchangeOf("GET", "SPAN", "2\r");
    EXPECT_FALSE(get("SPAN"));
    EXPECT_EQ(shown(), Texts{"information | ZEL3 Error | Execution error  for command <SPAN>\r\n"
                             "Command is not allowed in the current measurement mode" +
                             kManual});
    EXPECT_EQ(value, "old");
    EXPECT_FALSE(exchange.ExchangeFailed());
}

TEST_F(Query, KeywordStatus_OnlyItsFirstCharacterCounts) {
    exchangeOf("GET", "FREQ", "05\r7\r");
    EXPECT_TRUE(get());
    EXPECT_EQ(value, "7");
    exchangeOf("GET", "FREQ", "10\r");
    EXPECT_FALSE(get());
    EXPECT_EQ(shown(),
              Texts{"information | ZEL3 Error | Syntax error!  for command <FREQ>" + kManual});
}

TEST_F(Query, LeftOvers_AreDrained) {
    state.InputBuffer = "5\r";
    port.arrive("7\r");
    exchangeOf("GET", "FREQ", "0\r1\r");
    EXPECT_TRUE(get());
    EXPECT_EQ(value, "1");
}

TEST_F(Query, LineThatCameInLate_IsNotTakenForTheAnswer) {
    exchangeOf("GET", "FREQ", "0\r1\r");
    debug.whenSpoken = [this](const std::string& text) {
        if (text == "<-0\r" && port.written() == "GET\r") port.arrive("9\r");
    };
    EXPECT_TRUE(get());
    EXPECT_EQ(value, "1");
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(Query, SilenceOnAnyLine_IsOneBoxAndFalse) {
    for (int answered = 0; answered < 3; ++answered) {
        LineSetup rig;
        Dialogue& first = rig.port.expect("GET\r");
        if (answered > 0) {
            first.answer("0\r");
            Dialogue& second = rig.port.expect("FREQ\r");
            if (answered > 1) second.answer("0\r");
        }
        std::string answer = "old";
        const std::int64_t ms =
            rig.time([&] { EXPECT_FALSE(rig.exchange.GetInstrument("FREQ", answer)); });
        EXPECT_GE(ms, 9000) << answered;
        EXPECT_LE(ms, 9200) << answered;
        EXPECT_EQ(rig.shown(), Texts{kSilence}) << answered;
        EXPECT_EQ(answer, "old") << answered;
        rig.expectPlayed();
    }
}

TEST_F(Query, BurstOfFailingExchanges_GivesOneBox) {
    port.expect("GET\r").silence().repeat(2);
    for (int i = 0; i < 3; ++i) EXPECT_FALSE(get());
    EXPECT_EQ(shown(), Texts{kSilence});
}

TEST_F(Query, Noise_InSession_IsToldOnceAndTheSilenceBehindItAsWell) {
    port.expect("GET\r").answer("\xFF\xFF");
    EXPECT_FALSE(get());
    ASSERT_EQ(shown().size(), 2U);
    EXPECT_EQ(shown()[0].rfind("information | Incorrect baud rate | ", 0), 0U);
    EXPECT_EQ(shown()[1], kSilence);
}

TEST_F(Query, NoiseOnTheModeWordThenSilence_WhileConnecting_IsTheBaudBoxAndTheAbsence) {
    whileConnecting();
    port.expect("GET\r").answer("\xFF\xFF");
    EXPECT_FALSE(get());
    ASSERT_EQ(shown().size(), 2U);
    EXPECT_EQ(shown()[0].rfind("information | Incorrect baud rate | ", 0), 0U);
    EXPECT_EQ(shown()[1], "critical | ZELRemote | No ZEL3 found at the specified address!");
}

TEST_F(Query, BeforeRemoteIsAccepted_TheRefusalOfTheKeywordIsNotTold) {
    state.RemoteAccepted = false;
    exchangeOf("GET", "FREQ", "2\r");
    EXPECT_FALSE(get());
    EXPECT_EQ(shown(), Texts{});
}

struct TcpQuery : Query {
    TcpQuery() { overTcp(); }
    void answerWith(const std::string& bytes) {
        socket.expect("GET\r").answer("0\r");
        socket.expect("FREQ\r").answer(bytes);
    }
    void valueAfter(int ms, const std::string& rest = "1500000000\r") {
        events.schedule(ms, [this, rest] { socket.arrive(rest); });
    }
};

TEST_F(TcpQuery, StatusAndValueInOnePacket_GiveTheValue) {
    answerWith("0\r1500000000\r");
    EXPECT_TRUE(get());
    expectPlayed();
    EXPECT_EQ(value, "1500000000");
}

TEST_F(TcpQuery, EmptyValue_IsASuccess) {
    answerWith("0\r\r");
    EXPECT_TRUE(get());
    EXPECT_EQ(value, "");
}

TEST_F(TcpQuery, SplitPacket_EverySplitPoint_GivesTheValue) {
    const std::string packet = "0\r1500000000\r";
    for (std::size_t at = 1; at < packet.size(); ++at) {
        LineSetup rig;
        rig.overTcp();
        rig.socket.expect("GET\r").answer("0\r");
        rig.socket.expect("FREQ\r").answer(packet).chunks({at}, 200);
        std::string answer;
        EXPECT_TRUE(rig.exchange.GetInstrument("FREQ", answer)) << at;
        EXPECT_EQ(answer, "1500000000") << at;
    }
}

TEST_F(TcpQuery, RestWithinAQuarterOfASecond_IsAwaited) {
    answerWith("0\r");
    valueAfter(245);
    EXPECT_TRUE(get());
    EXPECT_EQ(value, "1500000000");
}

TEST_F(TcpQuery, RestLaterThanThat_IsAFailure) {
    answerWith("0\r15");
    valueAfter(300);
    const std::int64_t ms = time([&] { EXPECT_FALSE(get()); });
    EXPECT_GE(ms, 250);
    EXPECT_LE(ms, 280);
    EXPECT_EQ(value, "old");
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(TcpQuery, LeftOverOfAnEarlierExchange_IsReadWithTheNextAnswer) {
    // Nothing is drained on this link; the answer reader's empty buffer is what helps.
    state.InputBuffer = "9\r";
    answerWith("0\r7\r");
    EXPECT_TRUE(get());
    EXPECT_EQ(value, "7");
}

TEST_F(TcpQuery, Silence_EndsAfterSixteenSeconds) {
    socket.expect("GET\r").silence();
    const std::int64_t ms = time([&] { EXPECT_FALSE(get()); });
    EXPECT_GE(ms, 16000);
    EXPECT_LE(ms, 16300);
    EXPECT_EQ(shown(), Texts{kSilence});
}

}  // namespace
}  // namespace zel
