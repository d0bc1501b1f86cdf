#include <gtest/gtest.h>

#include <cstddef>
#include <string>
#include <string_view>
#include <utility>

#include "link/CommandExchange.h"
#include "platform/Socket.h"
#include "platform/virtual/VirtualPlatform.h"
#include "shell/Program.h"
#include "support/Text.h"
#include "tests/connection/Bench.h"
#include "trace/TraceReader.h"

namespace zel {
namespace {

using CF = ControllerForm;

struct TcpDialogTest : Connection {
    TCPConnectionForm& tcp = forms.tcpConnection;

    TcpDialogTest() {
        panel.ConnectionState = CF::TCPCON;
        tcp.load();
        tcp.IPAdressTextBox.Text = "host";
        tcp.RemotePortTextBox.Text = "2277";
    }
    void probed() { socket.expect("\r").answer("0\r"); }
    /// The texts that the status field shows one after another.
    Texts states() {
        Texts shown;
        tcp.IDTextBox.Changed.connect([this, &shown] {
            if (shown.empty() || shown.back() != tcp.IDTextBox.Text.get())
                shown.push_back(tcp.IDTextBox.Text);
        });
        tcp.ConnectTCPButton.Click();
        return shown;
    }
    std::string stored(const std::string& key) {
        return platform.settings.get("ZELRemote", "TCPCON", key, "absent");
    }
};

TEST_F(TcpDialogTest, MenuEntry_ShowsTheDialogModally) {
    panel.ConnectionState = 0;
    bool modal = false;
    later(10, [&] {
        modal = tcp.Visible && tcp.Modal;
        tcp.Hide();
    });
    panel.TCPConnection.Click();
    EXPECT_TRUE(modal);
    EXPECT_EQ(panel.ConnectionState, CF::TCPCON);
}

TEST_F(TcpDialogTest, Load_FillsTheFieldsFromTheStore) {
    platform.settings.set("ZELRemote", "TCPCON", "RemoteIP", "10.0.0.7");
    platform.settings.set("ZELRemote", "TCPCON", "RemotePort", "4000");
    tcp.unload(1);
    tcp.load();
    EXPECT_EQ(tcp.IPAdressTextBox.Text.get(), "10.0.0.7");
    EXPECT_EQ(tcp.RemotePortTextBox.Text.get(), "4000");
}

TEST_F(TcpDialogTest, PortThatIsNoNumber_IsToldAndNothingElseDone) {
    for (const char* text : {"", " ", "abc", "22x", "0", "-1", "65536", "1e300", "\xC3\xA4"}) {
        boxes.clear();
        tcp.MousePointer = 11;
        tcp.RemotePortTextBox.Text = text;
        tcp.ConnectTCPButton.Click();
        EXPECT_EQ(shown(), Texts{"plain | ZELRemote | Please enter a valid TCP port!"}) << text;
        EXPECT_EQ(tcp.MousePointer.get(), 0) << text;
    }
    EXPECT_TRUE(platform.settings.values.empty());
    EXPECT_EQ(socket.host(), "");
}

TEST_F(TcpDialogTest, LowestAndHighestPort_AreTried) {
    socket.connectsTo(SocketState::Error);
    socket.setProblem("Connection refused.");
    for (const char* text : {"1", "65535"}) {
        boxes.clear();
        tcp.RemotePortTextBox.Text = text;
        tcp.ConnectTCPButton.Click();
        EXPECT_EQ(stored("RemotePort"), text);
        ASSERT_EQ(shown().size(), 1U);
        EXPECT_TRUE(contains(shown()[0], std::string("host:") + text + " failed")) << shown()[0];
    }
}

TEST_F(TcpDialogTest, BlanksAroundPortAndAddress_AreTrimmed) {
    tcp.RemotePortTextBox.Text = "  2277 ";
    tcp.IPAdressTextBox.Text = " host ";
    socket.connectsTo(SocketState::Error);
    tcp.ConnectTCPButton.Click();
    EXPECT_EQ(socket.host(), "host");
    EXPECT_EQ(socket.port(), 2277);
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(TcpDialogTest, Fields_AreStoredAheadOfTheAttempt) {
    socket.connectsTo(SocketState::Error);
    tcp.ConnectTCPButton.Click();
    EXPECT_EQ(stored("RemoteIP"), "host");
    EXPECT_EQ(stored("RemotePort"), "2277");
}

TEST_F(TcpDialogTest, WrongAddress_EndsInTheSocketsError) {
    socket.connectsTo(SocketState::Error, 3000);
    EXPECT_EQ(states(), (Texts{"CONNECTING...", "TCP Socket Error."}));
    EXPECT_EQ(shown(), Texts{});
    EXPECT_FALSE(panel.isConnected);
    EXPECT_EQ(socket.written(), "");
}

TEST_F(TcpDialogTest, ServerThatNeverAnswers_IsGivenUpAfter30Seconds) {
    socket.connectsTo(SocketState::Connecting);
    const std::int64_t ms = time([this] { tcp.ConnectTCPButton.Click(); });
    EXPECT_GE(ms, 30'000);
    EXPECT_LE(ms, 30'200);
    EXPECT_EQ(tcp.IDTextBox.Text.get(), "TCP Socket Error.");
    EXPECT_EQ(tcp.lblReason.Caption.get(), "The server did not answer within 30 seconds.");
    EXPECT_EQ(socket.state(), SocketState::Closed);
}

TEST_F(TcpDialogTest, Failure_IsToldWithItsReason) {
    socket.connectsTo(SocketState::Error);
    socket.setProblem("Connection refused.");
    tcp.ConnectTCPButton.Click();
    EXPECT_EQ(tcp.IDTextBox.Text.get(), "TCP Socket Error.");
    EXPECT_EQ(tcp.lblReason.Caption.get(), "Connection refused.");
}

TEST_F(TcpDialogTest, Failure_IsToldInTheDialogOrByABoxAndNeverTwice) {
    socket.connectsTo(SocketState::Error);
    socket.setProblem("Connection refused.");
    tcp.Show();
    tcp.ConnectTCPButton.Click();
    EXPECT_EQ(shown(), Texts{});
    EXPECT_EQ(tcp.lblReason.Caption.get(), "Connection refused.");
    tcp.Hide();
    tcp.ConnectTCPButton.Click();
    ASSERT_EQ(shown().size(), 1U);
    EXPECT_NE(shown().front().find(" failed: Connection refused."), std::string::npos);
}

TEST_F(TcpDialogTest, ServerThatClosesAtOnce_IsToldWithWhatItMayMean) {
    socket.expect("\r").silence();
    later(100, [this] { socket.peerCloses(); });
    EXPECT_LE(time([this] { tcp.ConnectTCPButton.Click(); }), 300);
    EXPECT_EQ(shown(), Texts{"information | No ZEL3 found | No M&T ZEL3 found at the specified "
                             "adress!"});
    EXPECT_EQ(tcp.AdviceLabel.Caption.get().find("The server closed the connection."), 0U);
}

TEST_F(TcpDialogTest, Close_EndsTheConnectingAndTheProbeWithoutABox) {
    socket.connectsTo(SocketState::Connecting);
    later(500, [this] { tcp.QuitTCPButton.Click(); });
    EXPECT_LE(time([this] { tcp.ConnectTCPButton.Click(); }), 600);
    socket.connectsTo(SocketState::Connected);
    socket.expect("\r").silence();
    later(500, [this] { tcp.QuitTCPButton.Click(); });
    EXPECT_LE(time([this] { tcp.ConnectTCPButton.Click(); }), 600);
    EXPECT_EQ(shown(), Texts{});
    EXPECT_EQ(socket.state(), SocketState::Closed);
}

TEST_F(TcpDialogTest, ProbeInTwoPackets_IsEmptiedWhole) {
    socket.expect("\r").answer("0").answer("\r").after(100);
    Page(socket).whole();
    EXPECT_TRUE(connectTcp());
    EXPECT_EQ(socket.failure(), "");
}

TEST_F(TcpDialogTest, ProbeWithoutALineEnd_EndsAQuarterSecondAfterItsFirstByte) {
    socket.expect("\r").answer("0").answer("0").after(200);
    Page(socket).whole();
    std::string before;
    std::string after;
    later(240, [&] { before = socket.written(); });
    later(300, [&] { after = socket.written().substr(0, 2); });
    EXPECT_TRUE(connectTcp());
    EXPECT_EQ(before, "\r");
    EXPECT_EQ(after, "\r\r") << "the handshake has begun";
    EXPECT_EQ(socket.failure(), "");
}

TEST_F(TcpDialogTest, Servers_AreRememberedNewestFirst) {
    for (const char* host : {"a", "b", "a"}) {
        socket.expect("\r").silence();
        tcp.IPAdressTextBox.Text = host;
        tcp.ConnectTCPButton.Click();
    }
    EXPECT_EQ(tcp.RecentServersList.items(), (Texts{"a:2277", "b:2277"}));
    tcp.unload(1);
    tcp.load();
    EXPECT_EQ(tcp.RecentServersList.items(), (Texts{"a:2277", "b:2277"}));
    tcp.RecentServersList.pick(1);
    EXPECT_EQ(tcp.IPAdressTextBox.Text.get(), "b");
}

TEST_F(TcpDialogTest, StoredServers_AreListedWhenTheDialogOpens) {
    platform.settings.set("ZELRemote", "TCPCON", "Recent1", "a:1");
    platform.settings.set("ZELRemote", "TCPCON", "Recent3", "c:3");
    platform.settings.set("ZELRemote", "TCPCON", "Recent8", "h:8");
    platform.settings.set("ZELRemote", "TCPCON", "Recent9", "i:9");
    tcp.unload(1);
    tcp.load();
    EXPECT_EQ(tcp.RecentServersList.items(), (Texts{"a:1", "c:3", "h:8"}));
}

TEST_F(TcpDialogTest, Servers_BeyondTheEighth_AreForgotten) {
    for (int i = 1; i <= 9; ++i) {
        socket.expect("\r").silence();
        tcp.IPAdressTextBox.Text = std::string(1, static_cast<char>('a' + i - 1));
        tcp.ConnectTCPButton.Click();
    }
    const Texts kept = {"i:2277", "h:2277", "g:2277", "f:2277",
                        "e:2277", "d:2277", "c:2277", "b:2277"};
    EXPECT_EQ(tcp.RecentServersList.items(), kept);
    EXPECT_EQ(stored("Recent8"), "b:2277");
    EXPECT_EQ(stored("Recent9"), "absent");
}

TEST_F(TcpDialogTest, Tls_PassesTheFingerprintOn) {
    socket.connectsTo(SocketState::Error);
    tcp.chkTls.setValue(true);
    tcp.FingerprintTextBox.Text = " AB:cd ";
    tcp.ConnectTCPButton.Click();
    EXPECT_EQ(socket.pinned(), "abcd");
}

TEST_F(TcpDialogTest, RecentServer_BringsItsTlsBack) {
    const auto connectTo = [this](const char* host, bool tls, const char* fingerprint) {
        socket.expect("\r").silence();
        tcp.IPAdressTextBox.Text = host;
        tcp.chkTls.setValue(tls);
        tcp.FingerprintTextBox.Text = fingerprint;
        tcp.ConnectTCPButton.Click();
    };
    connectTo("safe", true, "ab:cd");
    connectTo("plain", false, "");
    tcp.RecentServersList.pick(1);
    EXPECT_EQ(tcp.IPAdressTextBox.Text.get(), "safe");
    EXPECT_TRUE(tcp.chkTls.Value());
    EXPECT_EQ(tcp.FingerprintTextBox.Text.get(), "ab:cd");
    tcp.RecentServersList.pick(0);
    EXPECT_FALSE(tcp.chkTls.Value());
    EXPECT_EQ(tcp.FingerprintTextBox.Text.get(), "");
}

TEST_F(TcpDialogTest, AttemptThatIsLeft_StopsTheClockOfTheSession) {
    socket.connectsTo(SocketState::Connecting);
    bool ran = false;
    later(500, [&] {
        ran = panel.UpNow.Enabled;
        tcp.QuitTCPButton.Click();
    });
    tcp.ConnectTCPButton.Click();
    EXPECT_TRUE(ran);
    EXPECT_FALSE(panel.UpNow.Enabled);
}

TEST_F(TcpDialogTest, ProbeThatIsLeft_ClosesTheConnection) {
    socket.connectsTo(SocketState::Connected);
    socket.expect("\r").silence();
    later(500, [this] { program.exchange().leaveWait(0); });
    EXPECT_LE(time([this] { tcp.ConnectTCPButton.Click(); }), 600);
    EXPECT_EQ(socket.state(), SocketState::Closed);
    EXPECT_EQ(tcp.IDTextBox.Text.get(), "");
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(TcpDialogTest, PeerClosing_IsShownAndTheWaitGoesOn) {
    socket.connectsTo(SocketState::Connecting);
    later(1000, [this] { socket.setState(SocketState::PeerClosing); });
    later(3000, [this] { socket.setState(SocketState::Error); });
    EXPECT_EQ(states(), (Texts{"CONNECTING...", "Remote host is closing the connection.",
                               "TCP Socket Error."}));
    EXPECT_GE(now(), 3000);
}

TEST_F(TcpDialogTest, SocketClosedByTheUserMeanwhile_EndsTheWait) {
    socket.connectsTo(SocketState::Connecting);
    later(1000, [this] { tcp.QuitTCPButton.Click(); });
    EXPECT_LE(time([this] { tcp.ConnectTCPButton.Click(); }), 1100);
    EXPECT_FALSE(panel.isConnected);
}

TEST_F(TcpDialogTest, Connected_ShowsAddressAndPortThenTheIdentity) {
    probed();
    Page(socket).whole().cmd("WAIT");
    socket.expect("GET\r").answer("0\r");
    socket.expect("TRACEBIN\r").answer("0\r" + levelBlock(-35250));
    EXPECT_EQ(states(), (Texts{"CONNECTING...", "CONNECTED", "CONNECTED to host:2277", kIdentity}));
    EXPECT_EQ(socket.failure(), "");
    EXPECT_EQ(socket.leftOver(), "");
    EXPECT_TRUE(panel.isConnected);
    EXPECT_FALSE(tcp.Visible);
    EXPECT_EQ(dialog.IDText.Text.get(), "");
    EXPECT_EQ(panel.RawTraceData, std::vector<double>(301, -35.25));
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(TcpDialogTest, ProbesAnswer_IsTakenAwayAheadOfTheHandshake) {
    probed();
    Page(socket).whole();
    EXPECT_TRUE(connectTcp());
    EXPECT_EQ(socket.written().substr(0, 6), "\r\rcmd\r");
    EXPECT_EQ(socket.failure(), "");
}

TEST_F(TcpDialogTest, PowerSensor_ReadsNoTrace) {
    probed();
    Page(socket, {{"MEAS", "3"}})
        .wake()
        .cmd("REMOTE")
        .identity()
        .detectorModeAndFrequency()
        .get("FREQOFFS", "0");
    tcp.ConnectTCPButton.Click();
    EXPECT_TRUE(panel.isConnected);
    EXPECT_EQ(socket.failure(), "");
    EXPECT_EQ(socket.leftOver(), "");
}

TEST_F(TcpDialogTest, ServerWithoutInstrument_IsToldAfterFiveSeconds) {
    socket.expect("\r").silence();
    const std::int64_t ms = time([this] { tcp.ConnectTCPButton.Click(); });
    EXPECT_GE(ms, 5000);
    EXPECT_LE(ms, 5150);
    EXPECT_EQ(shown(), Texts{"information | No ZEL3 found | No M&T ZEL3 found at the specified "
                             "adress!"});
    EXPECT_FALSE(panel.UpNow.Enabled);
    EXPECT_EQ(socket.state(), SocketState::Connected);
    EXPECT_FALSE(panel.isConnected);
}

TEST_F(TcpDialogTest, SecondAttempt_ClosesWhatWasLeftOver) {
    socket.expect("\r").silence();
    probed();
    Page(socket).whole();
    EXPECT_FALSE(connectTcp());
    EXPECT_TRUE(connectTcp());
    EXPECT_EQ(socket.failure(), "");
    EXPECT_EQ(socket.leftOver(), "");
}

TEST_F(TcpDialogTest, Quit_EmptiesTheStatusAndUnloads) {
    int argument = 0;
    tcp.Unload.connect([&](int got) { argument = got; });
    tcp.IDTextBox.Text = "CONNECTING...";
    socket.setState(SocketState::Open);
    tcp.QuitTCPButton.Click();
    EXPECT_EQ(tcp.IDTextBox.Text.get(), "");
    EXPECT_EQ(socket.state(), SocketState::Closed);
    EXPECT_EQ(argument, 1);
}

TEST_F(TcpDialogTest, Quit_ConnectedSocket_StaysUp) {
    probed();
    Page(socket).whole();
    connectTcp();
    tcp.QuitTCPButton.Click();
    EXPECT_EQ(socket.state(), SocketState::Connected);
}

TEST_F(TcpDialogTest, PeerGoneInSession_EveryExchangeEndsAtOnceAndTheReasonIsToldOnce) {
    probed();
    Page(socket).whole();
    connectTcp();
    socket.peerCloses();
    std::string value;
    bool success = true;
    const auto useIt = [&] {
        EXPECT_FALSE(program.exchange().GetInstrument("FREQ", value));
        EXPECT_FALSE(program.exchange().SetInstrument("FREQ,1"));
        EXPECT_FALSE(program.exchange().CmdInstrument("WAIT"));
    };
    EXPECT_LE(time(useIt), 1);
    EXPECT_EQ(shown(), Texts{"critical | ZELRemote | TCP/IP Socket error\r\nPlease make a new "
                             "connection.\r\nThe other end closed the connection."});
    EXPECT_TRUE(panel.CWGraph1.Old);
    program.traces().ReadSingleTrace(success);
    EXPECT_FALSE(success);
}

TEST_F(TcpDialogTest, ProbeAnsweredWithoutALineEnd_IsTakenAfterAQuarterOfASecond) {
    socket.expect("\r").answer("0");
    Page(socket).whole();
    int begun = 0;  // the millisecond at which the handshake has sent something
    for (int ms = 300; ms > 0; --ms) {
        later(ms, [&, ms] {
            if (begun == 0 && socket.written() != "\r") begun = ms;
        });
    }
    EXPECT_TRUE(connectTcp());
    EXPECT_EQ(begun, 251);  // as the next look after the 250th finds
    EXPECT_EQ(socket.failure(), "");
}

/// A server that never ends sending: an answer first, then pieces of 64 KiB.
class FloodingSocket : public Socket {
  public:
    int pieces = 0;

    void connectTo(const std::string&, int) override { state_ = SocketState::Connected; }
    void connectTls(const std::string&, int, const std::string&) override {}
    void close() override { state_ = SocketState::Closed; }
    SocketState state() const override { return state_; }
    /// The flood ends where the handshake begins.
    bool sendData(std::string_view) override {
        if (!answered_) return true;
        state_ = SocketState::Error;
        return false;
    }
    std::string peekData() override { return state_ == SocketState::Connected ? "0" : ""; }
    std::string getData() override {
        if (state_ != SocketState::Connected) return "";
        if (!std::exchange(answered_, true)) return "0\r";
        return ++pieces > 100 ? std::string() : std::string(1U << 16, 'x');
    }
    std::size_t bytesToWrite() const override { return 0; }
    std::string problem() const override { return "The end."; }

  private:
    SocketState state_ = SocketState::Closed;
    bool answered_ = false;
};

TEST(FloodedTcpDialogTest, WhatAServerHadWaiting_IsTakenUpToAMillionBytes) {
    VirtualPlatform v;
    FloodingSocket socket;
    Program program({v.clock, v.events, v.boxes, v.port, v.ports, socket, v.serverPort,
                     v.serverSocket, v.settings, v.debug, v.clipboard, v.launcher, v.startup,
                     v.folder, v.fileDialogs, v.files, v.endSignals, v.machine, v.portProbe},
                    "");
    program.start();
    EXPECT_FALSE(program.connect({LinkAddress::Kind::Tcp, "host", 2277}, false));
    EXPECT_EQ(socket.pieces, 17);  // 16 are 2^20 bytes, which are not yet too many
}

}  // namespace
}  // namespace zel
