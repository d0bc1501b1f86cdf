// A line that is lost in a session and comes back.

#include "link/CommandExchange.h"
#include "support/Text.h"
#include "tests/connection/ReconnectionSetup.h"

namespace zel {
namespace {

using Kind = LinkAddress::Kind;

struct ReconnectionTest : ReconnectionSetup, ::testing::WithParamInterface<Kind> {
    ReconnectionTest() : ReconnectionSetup(GetParam()) {}
};
struct SerialReconnection : ReconnectionSetup {
    SerialReconnection() : ReconnectionSetup(Kind::Serial) {}
    /// What the instrument was set to meanwhile, at its own keys.
    void turnKnob(const char* line) {
        port.open({.CommPort = kPath, .Settings = "57600,N,8,1"});
        for (const char* part : {"set\r", line}) {
            port.output(part);
            platform.events.runFor(500);
        }
        port.close();
    }
};
struct TcpReconnection : ReconnectionSetup {
    TcpReconnection() : ReconnectionSetup(Kind::Tcp) {}
};

INSTANTIATE_TEST_SUITE_P(Lines, ReconnectionTest, ::testing::Values(Kind::Serial, Kind::Tcp),
                         [](const auto& tested) {
                             return std::string(tested.param == Kind::Tcp ? "Tcp" : "Serial");
                         });

TEST_P(ReconnectionTest, NothingIsOfferedWhileTheOtherEndIsThere) {
    ASSERT_TRUE(connect());
    pass(5000);
    EXPECT_EQ(bar(), "");
    EXPECT_FALSE(panel.ReconnectButton.Visible);
}

TEST_P(ReconnectionTest, Click_ConnectsAgainAndNothingElseDoes) {
    ASSERT_TRUE(connect());
    goAway();
    pass(1500);
    EXPECT_TRUE(panel.LinkLost);
    EXPECT_TRUE(panel.CWGraph1.Old);
    comeBack();
    pass(20'000);
    EXPECT_FALSE(port.isOpen());
    EXPECT_EQ(socket.attempts(), tcp() ? 1 : 0);
    panel.ReconnectButton.Click();
    EXPECT_TRUE(panel.isConnected);
    EXPECT_FALSE(panel.LinkLost);
    EXPECT_EQ(bar(), again());
    EXPECT_FALSE(panel.ReconnectButton.Visible);
    panel.ReconnectCloseButton.Click();
    EXPECT_EQ(bar(), "");
    pass(3000);
    EXPECT_EQ(bar(), "");
    EXPECT_EQ(shown(), Texts{});
}

TEST_P(ReconnectionTest, WithTheOption_ConnectsByItselfAndAsksNoBoxes) {
    ASSERT_TRUE(connect());
    panel.ReconnectAlways.Click();
    goAway();
    std::string answer;
    EXPECT_FALSE(program.exchange().GetInstrument("FREQ", answer));
    pass(1500);
    comeBack();
    pass(10'000);
    EXPECT_TRUE(panel.isConnected);
    EXPECT_EQ(bar(), again());
    EXPECT_EQ(shown(), Texts{});
}

TEST_P(ReconnectionTest, WithTheOption_TheViewGoesOn) {
    ASSERT_TRUE(connect());
    panel.ReconnectAlways.Click();
    bool goesOn = false;
    platform.events.schedule(2000, [this] { goAway(); });
    platform.events.schedule(6000, [this] { comeBack(); });
    platform.events.schedule(30'000, [&] {
        goesOn = panel.ContinuosLoopActive && panel.isConnected && port.isOpen() != tcp();
        panel.StopButton.Click();
    });
    panel.PlayContinuousButton.Click();
    EXPECT_TRUE(panel.LinkLost);
    pass(40'000);
    EXPECT_TRUE(goesOn);
    EXPECT_EQ(shown(), Texts{});
}

TEST_P(ReconnectionTest, WithTheOption_AnInstrumentThatIsOff_IsTriedOnQuietly) {
    ASSERT_TRUE(connect());
    panel.ReconnectAlways.Click();
    goAway();
    pass(1500);
    switchInstrument(false);
    comeBack();
    pass(30'000);
    EXPECT_TRUE(panel.LinkLost);
    if (tcp()) {
        EXPECT_FALSE(panel.isConnected);
        EXPECT_GE(socket.attempts(), 3);
    } else {
        EXPECT_TRUE(contains(bar(), "is back, but no instrument answers at 57600 baud yet."))
            << bar();
    }
    EXPECT_EQ(shown(), Texts{});
    switchInstrument(true);
    pass(20'000);
    EXPECT_TRUE(panel.isConnected);
    EXPECT_FALSE(panel.LinkLost);
    EXPECT_EQ(shown(), Texts{});
}

TEST_P(ReconnectionTest, Disconnect_TakesTheOfferAway) {
    ASSERT_TRUE(connect());
    goAway();
    pass(1500);
    EXPECT_NE(bar(), "");
    program.disconnect();
    EXPECT_EQ(bar(), "");
    comeBack();
    pass(10'000);
    EXPECT_FALSE(panel.isConnected);
}

TEST_F(SerialReconnection, PortThatGoes_IsSaidAndThatItIsBack_IsOffered) {
    ASSERT_TRUE(connect());
    goAway();
    pass(1500);
    EXPECT_EQ(bar(), "/dev/ttyUSB0 has gone. Plug it in again; what is shown stays until then.");
    EXPECT_FALSE(panel.ReconnectButton.Visible);
    comeBack();
    pass(1500);
    EXPECT_EQ(bar(), "/dev/ttyUSB0 is back.");
    EXPECT_TRUE(panel.ReconnectButton.Visible);
    panel.ReconnectButton.Click();
    EXPECT_EQ(program.forms().main.COMList.Text(), kPath);
    EXPECT_EQ(program.forms().main.BaudList.Text(), "57600");
    EXPECT_EQ(shown(), Texts{});
}

TEST_P(ReconnectionTest, ButtonWhileAnAttemptIsUnderWay_IsHidden) {
    ASSERT_TRUE(connect());
    goAway();
    pass(1500);
    switchInstrument(false);
    comeBack();
    pass(1500);
    ASSERT_TRUE(panel.ReconnectButton.Visible);
    bool visible = true;
    std::string said;
    platform.events.schedule(100, [&] {
        visible = panel.ReconnectButton.Visible;
        said = bar();
    });
    panel.ReconnectButton.Click();
    EXPECT_FALSE(visible);
    EXPECT_EQ(said, std::string("Connecting to ") + name() + " again");
    EXPECT_TRUE(panel.ReconnectButton.Visible);
}

TEST_F(SerialReconnection, SettingsThatDiffer_AreNamed) {
    ASSERT_TRUE(connect());
    goAway();
    pass(1500);
    turnKnob("SPAN,2000000\r");
    turnKnob("REFLVL,-10\r");
    comeBack();
    pass(1500);
    panel.ReconnectButton.Click();
    ASSERT_TRUE(panel.isConnected);
    EXPECT_TRUE(contains(bar(), "Changed: Span 2 MHz (before: ")) << bar();
    EXPECT_TRUE(contains(bar(), "; Ref -10 dBm (before: ")) << bar();
    EXPECT_FALSE(contains(bar(), "Center")) << bar();
}

TEST_F(SerialReconnection, TheOption_IsKept) {
    EXPECT_FALSE(panel.ReconnectAlways.Checked);
    panel.ReconnectAlways.Click();
    VirtualPlatform other;
    other.settings.values = platform.settings.values;
    Program next(other.bundle(), "");
    EXPECT_TRUE(next.forms().controller.ReconnectAlways.Checked);
}

TEST_F(TcpReconnection, LostConnection_IsOfferedAtOnceAndToTheSameServer) {
    ASSERT_TRUE(connect());
    goAway();
    pass(1500);
    EXPECT_EQ(bar(), "The connection to host:2277 was lost. What is shown stays until it is back.");
    EXPECT_TRUE(panel.ReconnectButton.Visible);
    comeBack();
    program.forms().tcpConnection.IPAdressTextBox.Text = "elsewhere";
    panel.ReconnectButton.Click();
    EXPECT_TRUE(panel.isConnected);
    EXPECT_EQ(socket.host(), "host");
}

TEST_F(TcpReconnection, ClickInVain_SaysWhyAndCanBeRepeated) {
    ASSERT_TRUE(connect());
    goAway();
    pass(1500);
    panel.ReconnectButton.Click();
    EXPECT_FALSE(panel.isConnected);
    EXPECT_EQ(bar(), "No connection to host:2277. Connection refused.");
    pass(2000);
    EXPECT_TRUE(panel.CWGraph1.Old);
    EXPECT_TRUE(panel.ReconnectButton.Visible);
    EXPECT_EQ(shown(), Texts{});
    comeBack();
    panel.ReconnectButton.Click();
    EXPECT_TRUE(panel.isConnected);
    EXPECT_EQ(bar(), again());
}

TEST_F(TcpReconnection, AfterAVainClick_AConnectionFromTheMenuTakesTheOfferAway) {
    ASSERT_TRUE(connect());
    goAway();
    pass(1500);
    panel.ReconnectButton.Click();
    EXPECT_NE(bar(), "");
    comeBack();
    EXPECT_TRUE(connect());
    EXPECT_EQ(bar(), "");
}

TEST_F(TcpReconnection, WithTheOption_TriesEachFiveSecondsAndSaysWhyNot) {
    ASSERT_TRUE(connect());
    panel.ReconnectAlways.Click();
    goAway();
    pass(13'500);
    EXPECT_FALSE(panel.isConnected);
    EXPECT_GE(socket.attempts(), 3);
    EXPECT_LE(socket.attempts(), 4);
    EXPECT_EQ(bar(),
              "No connection to host:2277 yet: Connection refused. It is tried again each 5 s.");
    EXPECT_EQ(shown(), Texts{});
}

}  // namespace
}  // namespace zel
