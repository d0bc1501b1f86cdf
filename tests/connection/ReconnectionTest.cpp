// A port that is unplugged in a session and comes back.

#include <gtest/gtest.h>

#include "link/CommandExchange.h"
#include "platform/virtual/VirtualPlatform.h"
#include "shell/Program.h"
#include "support/Text.h"
#include "tests/ShownBoxes.h"
#include "tests/connection/SwitchedPort.h"

namespace zel {
namespace {

constexpr const char* kPath = "/dev/ttyUSB0";

struct ReconnectionTest : ::testing::Test {
    ReconnectionTest() {
        plug();
        program.start();
    }
    void plug() {
        platform.portProbe.rights[kPath] = {
            .exists = true, .terminal = true, .usable = true, .group = {}};
    }
    void unplug() {
        platform.portProbe.rights.clear();
        port.close();
    }
    bool connect() { return program.connect({LinkAddress::Kind::Serial, kPath, 57600}, true); }
    void pass(int ms) { platform.events.runFor(ms); }
    std::string bar() const {
        return panel.ReconnectFrame.Visible ? panel.ReconnectLabel.Caption.get() : "";
    }
    /// What the instrument was set to meanwhile, at its own keys.
    void turnKnob(const char* line) {
        port.open({.CommPort = kPath, .Settings = "57600,N,8,1"});
        for (const char* part : {"set\r", line}) {
            port.output(part);
            platform.events.runFor(500);
        }
        port.close();
    }

    VirtualPlatform platform;
    SwitchedPort port{platform.clock, platform.events};
    Program program{platform.bundle(port), ""};
    ControllerForm& panel = program.forms().controller;
};

TEST_F(ReconnectionTest, NothingIsOfferedWhileThePortIsThere) {
    ASSERT_TRUE(connect());
    pass(5000);
    EXPECT_EQ(bar(), "");
    EXPECT_FALSE(panel.ReconnectButton.Visible);
}

TEST_F(ReconnectionTest, PortThatGoes_IsSaidAndThatItIsBack_IsOffered) {
    ASSERT_TRUE(connect());
    unplug();
    pass(1500);
    EXPECT_EQ(bar(), "/dev/ttyUSB0 has gone. Plug it in again; what is shown stays until then.");
    EXPECT_FALSE(panel.ReconnectButton.Visible);
    EXPECT_TRUE(panel.LinkLost);
    EXPECT_TRUE(panel.CWGraph1.Old);
    plug();
    pass(1500);
    EXPECT_EQ(bar(), "/dev/ttyUSB0 is back.");
    EXPECT_TRUE(panel.ReconnectButton.Visible);
    pass(20'000);
    EXPECT_FALSE(port.isOpen()) << "only a click connects";
    EXPECT_EQ(shownBoxes(platform.boxes), Texts{});
}

TEST_F(ReconnectionTest, Click_ConnectsWithTheSameProfile) {
    ASSERT_TRUE(connect());
    unplug();
    pass(1500);
    plug();
    pass(1500);
    panel.ReconnectButton.Click();
    EXPECT_TRUE(panel.isConnected);
    EXPECT_FALSE(panel.LinkLost);
    EXPECT_EQ(program.forms().main.COMList.Text(), kPath);
    EXPECT_EQ(program.forms().main.BaudList.Text(), "57600");
    EXPECT_EQ(bar(), "Connected to /dev/ttyUSB0 again. All settings are as before.");
    EXPECT_FALSE(panel.ReconnectButton.Visible);
    panel.ReconnectCloseButton.Click();
    EXPECT_EQ(bar(), "");
    pass(3000);
    EXPECT_EQ(bar(), "");
    EXPECT_EQ(shownBoxes(platform.boxes), Texts{});
}

TEST_F(ReconnectionTest, SettingsThatDiffer_AreNamed) {
    ASSERT_TRUE(connect());
    unplug();
    pass(1500);
    turnKnob("SPAN,2000000\r");
    turnKnob("REFLVL,-10\r");
    plug();
    pass(1500);
    panel.ReconnectButton.Click();
    ASSERT_TRUE(panel.isConnected);
    EXPECT_TRUE(contains(bar(), "Changed: Span 2 MHz (before: ")) << bar();
    EXPECT_TRUE(contains(bar(), "; Ref -10 dBm (before: ")) << bar();
    EXPECT_FALSE(contains(bar(), "Center")) << bar();
}

TEST_F(ReconnectionTest, WithTheOption_ConnectsByItselfAndAsksNoBoxes) {
    ASSERT_TRUE(connect());
    panel.ReconnectAlways.Click();
    unplug();
    std::string answer;
    EXPECT_FALSE(program.exchange().GetInstrument("FREQ", answer));
    pass(1500);
    plug();
    pass(10'000);
    EXPECT_TRUE(panel.isConnected);
    EXPECT_TRUE(port.isOpen());
    EXPECT_EQ(bar(), "Connected to /dev/ttyUSB0 again. All settings are as before.");
    EXPECT_EQ(shownBoxes(platform.boxes), Texts{});
}

TEST_F(ReconnectionTest, WithTheOption_TheViewGoesOn) {
    ASSERT_TRUE(connect());
    panel.ReconnectAlways.Click();
    bool again = false;
    platform.events.schedule(2000, [this] { unplug(); });
    platform.events.schedule(6000, [this] { plug(); });
    platform.events.schedule(30'000, [&] {
        again = panel.ContinuosLoopActive && panel.isConnected && port.isOpen();
        panel.StopButton.Click();
    });
    panel.PlayContinuousButton.Click();
    EXPECT_TRUE(panel.LinkLost);
    pass(40'000);
    EXPECT_TRUE(again);
    EXPECT_EQ(shownBoxes(platform.boxes), Texts{});
}

TEST_F(ReconnectionTest, WithoutAnInstrument_TheOptionAsksAgainQuietly) {
    ASSERT_TRUE(connect());
    panel.ReconnectAlways.Click();
    unplug();
    pass(1500);
    port.on = false;
    plug();
    pass(6000);
    EXPECT_TRUE(contains(bar(), "is back, but no instrument answers at 57600 baud yet.")) << bar();
    EXPECT_EQ(shownBoxes(platform.boxes), Texts{});
    port.on = true;
    pass(10'000);
    EXPECT_TRUE(panel.isConnected);
    EXPECT_TRUE(port.isOpen());
}

TEST_F(ReconnectionTest, TheOption_IsKept) {
    EXPECT_FALSE(panel.ReconnectAlways.Checked);
    panel.ReconnectAlways.Click();
    VirtualPlatform other;
    other.settings.values = platform.settings.values;
    Program next(other.bundle(), "");
    EXPECT_TRUE(next.forms().controller.ReconnectAlways.Checked);
}

TEST_F(ReconnectionTest, Disconnect_TakesTheOfferAway) {
    ASSERT_TRUE(connect());
    unplug();
    pass(1500);
    EXPECT_NE(bar(), "");
    program.disconnect();
    EXPECT_EQ(bar(), "");
    plug();
    pass(5000);
    EXPECT_FALSE(panel.isConnected);
}

}  // namespace
}  // namespace zel
