// An attempt to connect can be left, and one that failed says what to check.

#include "link/CommandExchange.h"
#include "tests/connection/Bench.h"

namespace zel {
namespace {

TEST_F(Connection, CancelWhileConnecting_LeavesTheAttempt) {
    port.expect("\r").silence();
    std::string caption;
    later(3000, [&] {
        caption = dialog.CancelConnButton1.Caption;
        dialog.CancelConnButton1.Click();
    });
    bool connected = true;
    EXPECT_LE(time([&] { connected = connect(); }), 3100);
    EXPECT_FALSE(connected);
    EXPECT_EQ(caption, "Cancel");
    EXPECT_EQ(dialog.CancelConnButton1.Caption.get(), "Close");
    EXPECT_EQ(shown(), Texts{});
    EXPECT_EQ(dialog.AdviceLabel.Caption.get(), "");
    EXPECT_FALSE(port.isOpen());
    EXPECT_EQ(dialog.MousePointer.get(), 0);
}

TEST_F(Connection, AttemptBehindOneThatWasLeft_IsAsTheFirst) {
    port.expect("\r").silence();
    later(3000, [this] { dialog.CancelConnButton1.Click(); });
    EXPECT_FALSE(connect());
    page().whole();
    EXPECT_TRUE(connect());
    expectPlayed();
}

TEST_F(Connection, StopWhileConnecting_LeavesTheAttempt) {
    page().wake().cmd("REMOTE");
    port.expect("GET\r").silence();
    later(4000, [this] {
        EXPECT_TRUE(forms.controller.StopButton.Visible);
        forms.controller.StopButton.Click();
    });
    EXPECT_LE(time([this] { connect(); }), 5200);
    EXPECT_EQ(shown(), Texts{});
    EXPECT_FALSE(forms.controller.isConnected);
}

TEST_F(Connection, Waiting_IsShownInTheDialog) {
    port.expect("\r").silence();
    std::string text;
    later(2500, [&] { text = dialog.AdviceLabel.Caption; });
    connect();
    EXPECT_EQ(text, "Port open, waiting for the instrument, 1 of 9 s");
}

TEST_F(Connection, SilentInstrument_TheAdviceStandsBesideTheBox) {
    port.expect("\r").silence();
    EXPECT_FALSE(connect());
    EXPECT_EQ(shown(), Texts{kAbsent});
    const std::string advice = dialog.AdviceLabel.Caption;
    EXPECT_EQ(advice.rfind("COM3 at 57600 baud: check that ", 0), 0U) << advice;
    EXPECT_EQ(program.connectionAdvice(), advice);
    page().whole();
    EXPECT_TRUE(connect());
    EXPECT_EQ(dialog.AdviceLabel.Caption.get(), "");
}

TEST_F(Connection, RefusedTcpConnection_IsToldWithItsReason) {
    socket.connectsTo(SocketState::Error, 10);
    socket.setProblem("Connection refused");
    EXPECT_FALSE(connectTcp());
    EXPECT_EQ(
        shown(),
        Texts{"critical | ZELRemote | The connection to host:2277 failed: Connection refused"});
    EXPECT_EQ(forms.tcpConnection.IDTextBox.Text.get(), "TCP Socket Error.");
}

TEST_F(Connection, CloseWhileTheSocketConnects_LeavesTheAttempt) {
    socket.connectsTo(SocketState::Connecting);
    later(2000, [this] { forms.tcpConnection.QuitTCPButton.Click(); });
    EXPECT_LE(time([this] { connectTcp(); }), 2100);
    EXPECT_EQ(socket.state(), SocketState::Closed);
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(Connection, Signal_SendsLocalAndClosesWhateverIsUnderWay) {
    page().whole();
    ASSERT_TRUE(connect());
    port.expect("cmd\r").answer("0\r");
    port.expect("WAIT\r").silence();
    port.expect("\r").answer("0\r");
    port.expect("cmd\r").answer("0\r");
    port.expect("LOCAL\r").answer("0\r");
    later(5000, [this] { platform.endSignals.EndRequested("SIGTERM"); });
    EXPECT_LE(time([this] { program.exchange().CmdInstrument("WAIT"); }), 5500);
    EXPECT_TRUE(program.ended());
    EXPECT_EQ(program.endedBy(), "SIGTERM");
    EXPECT_FALSE(port.isOpen());
    EXPECT_EQ(shown(), Texts{});
    expectPlayed();
}

TEST_F(Connection, Signal_WithNothingUnderWay_SendsLocalAlone) {
    page().whole();
    ASSERT_TRUE(connect());
    port.expect("cmd\r").answer("0\r");
    port.expect("LOCAL\r").answer("0\r");
    platform.endSignals.EndRequested("SIGINT");
    EXPECT_TRUE(program.ended());
    expectPlayed();
}

TEST_F(Connection, EndOfTheProgramInTheMiddleOfAnExchange_BeginsNoneInside) {
    page().whole();
    ASSERT_TRUE(connect());
    port.expect("cmd\r").answer("0\r");
    port.expect("WAIT\r").silence();
    port.expect("\r").answer("0\r");
    port.expect("cmd\r").answer("0\r");
    port.expect("LOCAL\r").answer("0\r");
    later(2000, [this] { forms.controller.ExitObject.Click(); });
    EXPECT_LE(time([this] { program.exchange().CmdInstrument("WAIT"); }), 2500);
    EXPECT_TRUE(program.ended());
    expectPlayed();
}

}  // namespace
}  // namespace zel
