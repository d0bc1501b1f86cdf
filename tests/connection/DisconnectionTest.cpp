#include <gtest/gtest.h>

#include "connection/Disconnection.h"
#include "tests/connection/Bench.h"
#include "tests/link/Line.h"
#include "trace/GraphInteraction.h"

namespace zel {
namespace {

using CF = ControllerForm;

const char* const kQuestion =
    "question | Disconnect | Are you sure you want to close the connection?";
const char* const kSilence = "warning | ZELRemote | No response received!";

struct Connected : Connection {
    Connected() {
        page().whole();
        connect();
        platform.boxes.clear();
    }
};

TEST_F(Connected, Disconnect_AsksFirst) {
    page().cmd("LOCAL");
    panel.Disconnect.Click();
    ASSERT_EQ(boxes.boxes().size(), 1U);
    EXPECT_EQ(shown(), Texts{kQuestion});
    EXPECT_EQ(boxes.boxes()[0].buttons, BoxButtons::OkCancel);
}

TEST_F(Connected, Disconnect_Ok_SendsLocalAndClosesThePort) {
    page().cmd("LOCAL");
    panel.Disconnect.Click();
    expectPlayed();
    EXPECT_FALSE(port.isOpen());
    EXPECT_FALSE(panel.isConnected);
    EXPECT_FALSE(dialog.IsConnectedToPort);
    EXPECT_EQ(port.written().find("+++"), std::string::npos);
}

TEST_F(Connected, Disconnect_Cancel_SendsRemoteAndStays) {
    boxes.answer(BoxAnswer::Cancel);
    page().cmd("REMOTE");
    int pointer = 0;
    panel.Changed.connect([&] { pointer = std::max(pointer, panel.MousePointer.get()); });
    panel.Disconnect.Click();
    expectPlayed();
    EXPECT_TRUE(panel.isConnected);
    EXPECT_TRUE(port.isOpen());
    EXPECT_EQ(pointer, 11);
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

TEST_F(Connection, Disconnect_WithoutASession_GivesThePointerBack) {
    panel.MousePointer = 11;
    panel.Disconnect.Click();
    EXPECT_EQ(shown(), Texts{"information | ZELRemote | Not Connected"});
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

TEST_F(Connected, Disconnect_EachOfItsButtons_Asks) {
    boxes.answer(BoxAnswer::Cancel);
    boxes.answer(BoxAnswer::Cancel);
    page().cmd("REMOTE").cmd("REMOTE");
    dialog.DisconnectButton.Click();
    dialog.DisconnectButton2.Click();
    EXPECT_EQ(shown(), (Texts{kQuestion, kQuestion}));
    expectPlayed();
}

TEST_F(Connected, Disconnect_ContinuousView_IsRefused) {
    panel.ContinuosLoopActive = true;
    panel.Disconnect.Click();
    EXPECT_EQ(shown(), Texts{"warning | ZELRemote | Please exit the Continunous View Mode first\r\n"
                             "Use the red stop button in the upper right corner."});
    EXPECT_TRUE(panel.isConnected);
    expectPlayed();
}

TEST_F(Connected, Disconnect_NotConnectedLook) {
    dialog.Visible = true;
    dialog.AirBaudRateText.Text = "9600";
    dialog.ModemConnected = true;
    page().cmd("LOCAL");
    panel.Disconnect.Click();
    EXPECT_EQ(dialog.IDText.Text.get(), "");
    EXPECT_EQ(dialog.AirBaudRateText.Text.get(), "");
    EXPECT_FALSE(dialog.ModemConnected);
    EXPECT_FALSE(dialog.Visible);
    EXPECT_TRUE(dialog.ZELButton.Visible);
    EXPECT_FALSE(dialog.DisconnectButton2.Visible);
    EXPECT_TRUE(dialog.DialButton.Visible);
    EXPECT_FALSE(dialog.CancelButton.Visible);
    EXPECT_FALSE(dialog.OnPic.Visible);
    EXPECT_FALSE(panel.Disconnect.Enabled);
    EXPECT_FALSE(panel.RecordData.Enabled);
    EXPECT_TRUE(panel.SetDevice.Enabled);
    EXPECT_EQ(panel.State, 0);
    for (const MenuItem* item : {&panel.Direct, &panel.Modem, &panel.GSM, &panel.GSMToModem,
                                 &panel.ModemToGSM, &panel.TCPConnection})
        EXPECT_TRUE(item->Enabled) << item->name();
    EXPECT_FALSE(panel.ConnectedPic.Visible);
    EXPECT_FALSE(panel.Picture3.Visible);
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

TEST_F(Connected, Disconnect_SessionsLength_StaysOnShow) {
    page().cmd("LOCAL");
    platform.events.runFor(61'500);
    const std::string length = panel.TimeLabel.Caption;
    panel.Disconnect.Click();
    platform.events.runFor(10'000);
    EXPECT_FALSE(panel.UpNow.Enabled);
    EXPECT_EQ(panel.TimeLabel.Caption.get(), length);
    EXPECT_EQ(length.substr(length.size() - 4), "1:02");  // half a second of it the handshake
}

TEST_F(Connected, Disconnect_DialogsUnloadHandler_RunsWithOne) {
    page().cmd("LOCAL");
    int argument = 0;
    dialog.Unload.connect([&](int got) { argument = got; });
    dialog.load();
    panel.Disconnect.Click();
    EXPECT_EQ(argument, 1);
}

TEST_F(Connected, Disconnect_StopButtonOnShow_IsClicked) {
    page().cmd("LOCAL");
    panel.StopButton.Visible = true;
    int clicks = 0;
    panel.StopButton.Clicked.connect([&] { ++clicks; });
    panel.Disconnect.Click();
    EXPECT_EQ(clicks, 1);
}

TEST_F(Connected, Disconnect_StopButtonHidden_IsNotClicked) {
    page().cmd("LOCAL");
    int clicks = 0;
    panel.StopButton.Clicked.connect([&] { ++clicks; });
    panel.Disconnect.Click();
    EXPECT_EQ(clicks, 0);
}

TEST_F(Connected, Disconnect_DeadLine_IsToldOnceAndGoesOn) {
    port.expect("cmd\r").silence();
    const std::int64_t ms = time([this] { panel.Disconnect.Click(); });
    EXPECT_LE(ms, 9300);
    EXPECT_EQ(shown(), (Texts{kQuestion, kSilence}));
    EXPECT_FALSE(panel.isConnected);
    EXPECT_FALSE(port.isOpen());
}

TEST_F(Connected, Disconnect_DeviceGone_EndsTheSessionWithoutWaiting) {
    port.die();
    EXPECT_EQ(time([this] { panel.Disconnect.Click(); }), 0);
    EXPECT_EQ(shown(), Texts{kQuestion});
    EXPECT_FALSE(panel.isConnected);
    EXPECT_TRUE(panel.Direct.Enabled);
}

TEST_F(Connected, Disconnect_ThenConnect_WorksAgain) {
    page().cmd("LOCAL").wake().cmd("REMOTE").identity().detectorModeAndFrequency().state();
    panel.Disconnect.Click();
    EXPECT_TRUE(connect());
    expectPlayed();
}

TEST_F(Connection, DisconnectWhileNotConnected_SaysSoOnceUntilTheFlagIsCleared) {
    panel.Disconnect.Click();
    EXPECT_EQ(shown(), Texts{"information | ZELRemote | Not Connected"});
    EXPECT_TRUE(panel.ErrorFlag);
    panel.Disconnect.Click();
    EXPECT_EQ(shown().size(), 1U);
    panel.ErrorFlag = false;
    panel.Disconnect.Click();
    EXPECT_EQ(shown().size(), 2U);
    EXPECT_EQ(status(), " ");
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

TEST_F(Connection, DisconnectWhileNotConnected_PortOpen_ClosesItSilently) {
    page().wake().cmd("REMOTE").identity().line("GET", "TRACEDET", "2");
    connect();
    platform.boxes.clear();
    ASSERT_TRUE(port.isOpen());
    dialog.DisconnectButton.Click();
    EXPECT_FALSE(port.isOpen());
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(Connection, DisconnectOverTcp_SendsLocalThenCloses) {
    socket.expect("\r").answer("0\r");
    Page(socket).whole().cmd("LOCAL");
    ASSERT_TRUE(connectTcp());
    panel.Disconnect.Click();
    EXPECT_EQ(socket.failure(), "");
    EXPECT_EQ(socket.leftOver(), "");
    EXPECT_EQ(socket.state(), SocketState::Closed);
    EXPECT_EQ(forms.tcpConnection.IDTextBox.Text.get(), "");
    EXPECT_FALSE(panel.isConnected);
    EXPECT_EQ(socket.written().find("+++"), std::string::npos);
}

TEST_F(Connected, RemoteKey_CaptionHoldsTheStateToGoTo) {
    page().cmd("LOCAL").cmd("REMOTE").cmd("LOCAL");
    ASSERT_EQ(panel.OnOffButton.Caption.get(), "L");
    panel.OnOffButton.Click();
    EXPECT_EQ(panel.OnOffButton.Caption.get(), "R");
    panel.OnOffButton.Click();
    EXPECT_EQ(panel.OnOffButton.Caption.get(), "L");
    panel.OnOffButton.Caption = "anything";
    panel.OnOffButton.Click();
    EXPECT_EQ(panel.OnOffButton.Caption.get(), "R");
    expectPlayed();
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

TEST_F(Connected, RemoteKey_Pointer_IsTheHourglassMeanwhile) {
    port.expect("cmd\r").answer("0\r").after(100);
    port.expect("LOCAL\r").answer("0\r");
    int pointer = 0;
    later(50, [&] { pointer = panel.MousePointer; });
    panel.OnOffButton.Click();
    EXPECT_EQ(pointer, 11);
}

TEST_F(Connected, LocalKey_SendsLocalAndNothingElse) {
    page().cmd("LOCAL");
    panel.LocalButton.Click();
    expectPlayed();
    EXPECT_EQ(panel.OnOffButton.Caption.get(), "L");
}

/// A dialled link, brought up by no dialog.
struct Dialled : LineSetup, ::testing::Test {
    Dialled() { panel.ConnectionState = CF::MODEMCON; }
    ZEL3Variables mirror;
    GraphInteraction graph{panel, mirror};
    SessionClock sessionClock{panel, platform.clock};
    InstrumentLink line{state, link, reader, exchange, binary};
    Interlock interlock{forms, state, session};
    Disconnection disconnection{forms, line, socket, sessionClock, graph, interlock};
};

TEST_F(Dialled, HangUp_SilentModem_TakesALittleOver11AndAHalfSeconds) {
    port.expect("+++").silence();
    port.expect("ATH0\r").silence();
    const std::int64_t ms = time([this] { disconnection.HangUpModem(); });
    expectPlayed();
    EXPECT_GE(ms, 11'502);
    EXPECT_LE(ms, 11'600);
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(Dialled, HangUp_AnswerAtTheVeryEnd_ComesTooLate) {
    port.expect("+++").answer("O").after(5001);
    port.expect("ATH0\r").answer("OK\r");
    EXPECT_EQ(time([this] { disconnection.HangUpModem(); }), 1000 + 5001 + 500);
    expectPlayed();
}

TEST_F(Dialled, HangUp_ModemThatAnswers_TakesTheSilencesOnly) {
    port.expect("+++").answer("\r\nOK\r\n");
    port.expect("ATH0\r").answer("\r\nOK\r\n");
    EXPECT_EQ(time([this] { disconnection.HangUpModem(); }), 2000);
    expectPlayed();
}

TEST_F(Dialled, HangUp_AnswerOtherThanOk_GoesOn) {
    port.expect("+++").answer("ERROR\r");
    port.expect("ATH0\r").answer("NO CARRIER\r");
    disconnection.HangUpModem();
    expectPlayed();
}

TEST_F(Dialled, Disconnect_SendsLocalHangsUpAndCloses) {
    exchangeOf("cmd", "LOCAL", "0\r");
    port.expect("+++").answer("OK\r");
    port.expect("ATH0\r").answer("OK\r");
    disconnection.DisconnectButton_Click();
    expectPlayed();
    EXPECT_FALSE(port.isOpen());
    EXPECT_FALSE(panel.isConnected);
    EXPECT_FALSE(dialog.IsConnectedToPort);
}

TEST_F(Dialled, ClosePort_ClearsIdentityAndFlags) {
    dialog.IDText.Text = "Marlow";
    dialog.OnPic.Visible = true;
    disconnection.ClosePortAndClearIdentity();
    EXPECT_FALSE(port.isOpen());
    EXPECT_EQ(dialog.IDText.Text.get(), "");
    EXPECT_FALSE(dialog.OnPic.Visible);
    EXPECT_FALSE(dialog.IsConnectedToPort);
    EXPECT_FALSE(panel.isConnected);
}

}  // namespace
}  // namespace zel
