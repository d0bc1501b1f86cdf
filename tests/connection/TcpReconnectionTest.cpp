// A TCP connection that is lost in a session and can be had again.

#include <gtest/gtest.h>

#include "ZELSim/InProcessPort.h"
#include "link/CommandExchange.h"
#include "platform/virtual/VirtualPlatform.h"
#include "shell/Program.h"
#include "support/Text.h"
#include "tests/ShownBoxes.h"

namespace zel {
namespace {

/// A server with the simulated instrument, which can go and come back.
class ServedInstrument : public Socket {
  public:
    ServedInstrument(const Clock& clock, Events& events) : port_(clock, events) {}

    void goAway() {
        there_ = false;
        port_.close();
        if (state_ == SocketState::Connected) state_ = SocketState::PeerClosing;
    }
    void comeBack() { there_ = true; }
    /// The server is there, and its instrument is switched off.
    void switchInstrument(bool on) { answers_ = on; }
    int attempts() const { return attempts_; }
    const std::string& host() const { return host_; }

    void connectTo(const std::string& host, int) override {
        ++attempts_;
        host_ = host;
        state_ = there_ && port_.open({.CommPort = "tcp", .Settings = "57600,N,8,1"})
                     ? SocketState::Connected
                     : SocketState::Error;
    }
    void connectTls(const std::string& host, int port, const std::string&) override {
        connectTo(host, port);
    }
    void close() override {
        port_.close();
        waiting_.clear();
        state_ = SocketState::Closed;
    }
    SocketState state() const override { return state_; }
    bool sendData(std::string_view bytes) override {
        if (state_ != SocketState::Connected) return false;
        if (answers_) port_.output(bytes);
        return true;
    }
    std::string peekData() override {
        if (state_ == SocketState::Connected) waiting_ += port_.input();
        return waiting_;
    }
    std::string getData() override {
        peekData();
        return std::exchange(waiting_, {});
    }
    std::size_t bytesToWrite() const override { return 0; }
    std::string problem() const override { return there_ ? "" : "Connection refused."; }

  private:
    zelsim::InProcessPort port_;
    SocketState state_ = SocketState::Closed;
    bool there_ = true;
    bool answers_ = true;
    int attempts_ = 0;
    std::string waiting_;
    std::string host_;
};

struct TcpReconnectionTest : ::testing::Test {
    TcpReconnectionTest() { program.start(); }
    Platform bundle() {
        return {platform.clock,      platform.events,  platform.boxes,       platform.port,
                platform.ports,      socket,           platform.serverPort,  platform.serverSocket,
                platform.settings,   platform.debug,   platform.clipboard,   platform.launcher,
                platform.startup,    platform.folder,  platform.fileDialogs, platform.files,
                platform.endSignals, platform.machine, platform.portProbe};
    }
    bool connect() { return program.connect({LinkAddress::Kind::Tcp, "host", 2277}, true); }
    void pass(int ms) { platform.events.runFor(ms); }
    std::string bar() const {
        return panel.ReconnectFrame.Visible ? panel.ReconnectLabel.Caption.get() : "";
    }

    VirtualPlatform platform;
    ServedInstrument socket{platform.clock, platform.events};
    Program program{bundle(), ""};
    ControllerForm& panel = program.forms().controller;
};

TEST_F(TcpReconnectionTest, NothingIsOfferedWhileTheServerIsThere) {
    ASSERT_TRUE(connect());
    pass(5000);
    EXPECT_EQ(bar(), "");
}

TEST_F(TcpReconnectionTest, LostConnection_IsOffered) {
    ASSERT_TRUE(connect());
    socket.goAway();
    pass(1500);
    EXPECT_EQ(bar(), "The connection to host:2277 was lost. What is shown stays until it is back.");
    EXPECT_TRUE(panel.ReconnectButton.Visible);
    EXPECT_TRUE(panel.LinkLost);
    EXPECT_TRUE(panel.CWGraph1.Old);
    socket.comeBack();
    pass(20'000);
    EXPECT_EQ(socket.attempts(), 1) << "only a click connects";
    EXPECT_EQ(shownBoxes(platform.boxes), Texts{});
}

TEST_F(TcpReconnectionTest, Click_ConnectsToTheSameServer) {
    ASSERT_TRUE(connect());
    socket.goAway();
    pass(1500);
    socket.comeBack();
    program.forms().tcpConnection.IPAdressTextBox.Text = "elsewhere";
    panel.ReconnectButton.Click();
    EXPECT_TRUE(panel.isConnected);
    EXPECT_FALSE(panel.LinkLost);
    EXPECT_EQ(socket.host(), "host");
    EXPECT_EQ(bar(), "Connected to host:2277 again. All settings are as before.");
    EXPECT_FALSE(panel.ReconnectButton.Visible);
    EXPECT_EQ(shownBoxes(platform.boxes), Texts{});
}

TEST_F(TcpReconnectionTest, ClickInVain_SaysWhyAndCanBeRepeated) {
    ASSERT_TRUE(connect());
    socket.goAway();
    pass(1500);
    panel.ReconnectButton.Click();
    EXPECT_FALSE(panel.isConnected);
    EXPECT_EQ(bar(), "No connection to host:2277. Connection refused.");
    pass(2000);
    EXPECT_TRUE(panel.CWGraph1.Old);
    EXPECT_TRUE(panel.ReconnectButton.Visible);
    EXPECT_EQ(shownBoxes(platform.boxes), Texts{});
    socket.comeBack();
    panel.ReconnectButton.Click();
    EXPECT_TRUE(panel.isConnected);
    EXPECT_EQ(bar(), "Connected to host:2277 again. All settings are as before.");
}

TEST_F(TcpReconnectionTest, WithTheOption_TriesAgainUntilTheServerIsBack) {
    ASSERT_TRUE(connect());
    panel.ReconnectAlways.Click();
    socket.goAway();
    std::string answer;
    EXPECT_FALSE(program.exchange().GetInstrument("FREQ", answer));
    pass(12'000);
    EXPECT_FALSE(panel.isConnected);
    EXPECT_GE(socket.attempts(), 3);
    EXPECT_LE(socket.attempts(), 4);
    EXPECT_EQ(bar(),
              "No connection to host:2277 yet: Connection refused. It is tried again each 5 s.");
    socket.comeBack();
    pass(7000);
    EXPECT_TRUE(panel.isConnected);
    EXPECT_EQ(bar(), "Connected to host:2277 again. All settings are as before.");
    EXPECT_EQ(shownBoxes(platform.boxes), Texts{});
}

TEST_F(TcpReconnectionTest, WithTheOption_ServerWithoutInstrument_IsTriedOn) {
    ASSERT_TRUE(connect());
    panel.ReconnectAlways.Click();
    socket.goAway();
    pass(1500);
    socket.comeBack();
    socket.switchInstrument(false);
    pass(30'000);
    EXPECT_FALSE(panel.isConnected);
    EXPECT_GE(socket.attempts(), 3);
    socket.switchInstrument(true);
    pass(20'000);
    EXPECT_TRUE(panel.isConnected);
    EXPECT_EQ(shownBoxes(platform.boxes), Texts{});
}

TEST_F(TcpReconnectionTest, WithTheOption_TheViewGoesOn) {
    ASSERT_TRUE(connect());
    panel.ReconnectAlways.Click();
    bool again = false;
    platform.events.schedule(2000, [this] { socket.goAway(); });
    platform.events.schedule(6000, [this] { socket.comeBack(); });
    platform.events.schedule(30'000, [&] {
        again = panel.ContinuosLoopActive && panel.isConnected;
        panel.StopButton.Click();
    });
    panel.PlayContinuousButton.Click();
    EXPECT_TRUE(panel.LinkLost);
    pass(40'000);
    EXPECT_TRUE(again);
    EXPECT_EQ(shownBoxes(platform.boxes), Texts{});
}

TEST_F(TcpReconnectionTest, Disconnect_TakesTheOfferAway) {
    ASSERT_TRUE(connect());
    socket.goAway();
    pass(1500);
    EXPECT_NE(bar(), "");
    program.disconnect();
    EXPECT_EQ(bar(), "");
    socket.comeBack();
    pass(10'000);
    EXPECT_FALSE(panel.isConnected);
}

}  // namespace
}  // namespace zel
