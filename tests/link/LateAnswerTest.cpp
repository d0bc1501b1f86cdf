// An answer that comes after its time-out belongs to no later question.

#include "tests/link/Line.h"

namespace zel {
namespace {

TEST_F(Line, LateAnswer_InsideTheNextQuery_IsNotTakenForIts) {
    port.expect("cmd\r").answer("0\r");
    port.expect("WAIT\r").answer("0\r").after(9300);
    port.expect("GET\r").answer("0\r").after(300);
    port.expect("FREQ\r").answer("0\r1500000000\r");
    EXPECT_FALSE(exchange.CmdInstrument("WAIT"));
    std::string value;
    EXPECT_TRUE(exchange.GetInstrument("FREQ", value));
    EXPECT_EQ(value, "1500000000");
    expectPlayed();
}

TEST_F(Line, LateAnswer_InsideTheNextSetting_DoesNotAcceptIt) {
    port.expect("set\r").answer("0\r").after(9300);
    port.expect("set\r").answer("0\r").after(300);
    port.expect("SPAN,9e9\r").answer("5\r");
    EXPECT_FALSE(exchange.SetInstrument("FREQ,1000000000"));
    boxes.clear();
    EXPECT_FALSE(exchange.SetInstrument("SPAN,9e9"));
    EXPECT_EQ(shown().size(), 1U);
    expectPlayed();
}

// The separator of a block is a CR for an instrument, and its samples may hold one.
template <class Far>
void expectRestPassedOver(Line& line, Far& far) {
    far.expect("GET\r").answer("...samples\r").answer("0\r").after(5);
    far.expect("FREQ\r").answer("0\r1500000000\r").after(20);
    far.expect("set\r").answer("samples\r").answer("0\r").after(5);
    far.expect("SPAN,1\r").answer("5\r").after(20);
    std::string value;
    EXPECT_TRUE(line.exchange.GetInstrument("FREQ", value));
    EXPECT_EQ(value, "1500000000");
    EXPECT_FALSE(line.exchange.SetInstrument("SPAN,1"));
    line.expectPlayed();
}

TEST_F(Line, RestOfALongerTransfer_IsNoStatus) { expectRestPassedOver(*this, port); }

TEST_F(Line, RestOfALongerTransfer_OverTcp_IsNoStatus) {
    overTcp();
    expectRestPassedOver(*this, socket);
}

TEST_F(Line, TransferThatWasLongerThanAskedFor_IsPassedOverBeforeTheNextQuery) {
    const std::string block(1205, 'x');
    port.expect("GET\r").answer("0\r");
    port.expect("TRACEBIN\r").answer("0\r" + block + block.substr(0, 1200)).answer("5\r").after(30);
    port.expect("GET\r").answer("0\r").after(40);
    port.expect("FREQ\r").answer("0\r1500000000\r");
    RawTrace trace;
    EXPECT_TRUE(binary.GetTraceBinary(trace, false));
    EXPECT_EQ(trace.came, 301U);
    EXPECT_TRUE(state.RestFound);
    std::string value;
    EXPECT_TRUE(exchange.GetInstrument("FREQ", value));
    EXPECT_EQ(value, "1500000000");
    expectPlayed();
}

TEST_F(Line, LineThatIsNoSingleDigit_IsNoStatus) {
    for (const char* rest : {"12\r", "-\r", "0AB\r"}) {
        state.RestFound = false;
        port.expect("GET\r").answer(rest).answer("0\r").after(5);
        port.expect("FREQ\r").answer("0\r1500000000\r").after(20);
        std::string value;
        EXPECT_TRUE(exchange.GetInstrument("FREQ", value)) << rest;
        EXPECT_EQ(value, "1500000000");
        EXPECT_TRUE(state.RestFound) << rest;
    }
    expectPlayed();
}

TEST_F(Line, LineThatIsNoStatus_WithNothingAfterIt_CountsAsAccepted) {
    port.expect("GET\r").answer("junk\r");
    port.expect("FREQ\r").answer("0\r1500000000\r");
    std::string value;
    EXPECT_TRUE(exchange.GetInstrument("FREQ", value));
    EXPECT_EQ(value, "1500000000");
    expectPlayed();
}

TEST_F(Line, LateAnswer_OverTcp_IsNotTakenForTheNext) {
    overTcp();
    socket.expect("cmd\r").answer("0\r");
    socket.expect("WAIT\r").answer("0\r").after(16300);
    socket.expect("GET\r").answer("0\r").after(300);
    socket.expect("FREQ\r").answer("0\r1500000000\r");
    EXPECT_FALSE(exchange.CmdInstrument("WAIT"));
    std::string value;
    EXPECT_TRUE(exchange.GetInstrument("FREQ", value));
    EXPECT_EQ(value, "1500000000");
    expectPlayed();
}

TEST_F(Line, LateAnswer_BetweenTwoExchangesOverTcp_IsEmptiedOnce) {
    overTcp();
    socket.expect("GET\r").answer("0\r");
    socket.expect("SPAN\r").answer("0\r").answer("7\r").after(2000);
    socket.expect("GET\r").answer("0\r");
    socket.expect("FREQ\r").answer("0\r1500000000\r");
    std::string value = "old";
    EXPECT_FALSE(exchange.GetInstrument("SPAN", value));
    EXPECT_EQ(value, "old");
    events.runFor(3000);
    EXPECT_EQ(socket.peekData(), "7\r");
    EXPECT_TRUE(exchange.GetInstrument("FREQ", value));
    EXPECT_EQ(value, "1500000000");
    expectPlayed();
}

TEST_F(Line, RestOfATransfer_InsideTheNextQuery_IsNotTakenForIts) {
    // Samples that look like ends of lines and refusals.
    std::string rest;
    for (int i = 0; i < 200; ++i) rest += std::string("5\r\0\0", 4);
    port.expect("GET\r").answer("0\r");
    port.expect("TRACEBIN\r").answer("0\r" + rest).answer(rest + rest.substr(0, 5)).after(5300);
    port.expect("GET\r").answer("0\r").after(400);
    port.expect("FREQ\r").answer("0\r1500000000\r");
    RawTrace trace;
    EXPECT_TRUE(binary.GetTraceBinary(trace, false));
    EXPECT_EQ(trace.came, 200U);
    std::string value;
    EXPECT_TRUE(exchange.GetInstrument("FREQ", value));
    EXPECT_EQ(value, "1500000000");
    expectPlayed();
}

TEST_F(Line, LateAnswer_BeforeTheNextOne_LeavesTheDigitOfTheLastLine) {
    for (const char* late : {"0\r", "3\r7\r"}) {
        state.AnswerOverdue = true;
        port.expect("cmd\r").answer(late).answer("0\r4\r").after(100);
        link.WriteToLink("cmd\r");
        EXPECT_EQ(reader.ReadAnswer(), "4");
        EXPECT_EQ(state.InputBuffer, "");
    }
    state.AnswerOverdue = true;
    port.expect("cmd\r").answer("5\r").answer("\r").after(100);  // an empty line has none
    link.WriteToLink("cmd\r");
    EXPECT_EQ(reader.ReadAnswer(), "5");
    expectPlayed();
}

TEST_F(Line, AfterATimeOut_OneExchangeLooksForTheLateAnswerAndNoOther) {
    port.expect("set\r").silence();
    exchangeOf("set", "RBW,1", "0\r");
    exchangeOf("set", "RBW,2", "0\r");
    EXPECT_FALSE(exchange.SetInstrument("FREQ,1000000000"));
    EXPECT_LE(time([&] { EXPECT_TRUE(exchange.SetInstrument("RBW,1")); }), 300);
    EXPECT_LE(time([&] { EXPECT_TRUE(exchange.SetInstrument("RBW,2")); }), 50);
    expectPlayed();
}

TEST_F(Line, PauseInsideTheStatusOfATransfer_ShiftsNoSample) {
    for (const int ms : {100, 5500, 9000}) {
        LineSetup rig;
        std::string block;
        for (int i = 0; i < 301; ++i) block += std::string(1, static_cast<char>(i)) + "abc";
        rig.port.expect("GET\r").answer("0\r");
        rig.port.expect("TRACEBIN\r").answer("0").answer("\r" + block + "x").after(ms);
        RawTrace trace;
        EXPECT_TRUE(rig.binary.GetTraceBinary(trace, false));
        EXPECT_TRUE(trace.whole()) << ms;
        EXPECT_EQ(trace.values.at(1) - trace.values.at(0), 1) << ms;
        rig.expectPlayed();
    }
}

}  // namespace
}  // namespace zel
