#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "shell/StartUp.h"
#include "tests/Session.h"

namespace zel {
namespace {

struct StartUpTest : TestSession, ::testing::Test {};

TEST_F(StartUpTest, Rest_HasNoConnectionAndAShownPanel) {
    program.start();
    EXPECT_TRUE(panel.Visible);
    EXPECT_FALSE(panel.isConnected);
    EXPECT_EQ(panel.ConnectionState, 0);
    EXPECT_EQ(panel.State, 0);
    EXPECT_EQ(panel.InstrumentMode, ControllerForm::ANALYZER);
    EXPECT_TRUE(panel.UpNow.Enabled);
    EXPECT_TRUE(panel.GetOption.Value());
    EXPECT_FALSE(port.isOpen());
    EXPECT_TRUE(boxes.boxes().empty());
    EXPECT_FALSE(program.ended());
}

TEST_F(StartUpTest, TimeLabel_ShowsTheTimeOfDayAtOnce) {
    platform.clock.setDate(dateOf(2026, 5, 6, 7, 8, 9));
    program.start();
    EXPECT_EQ(panel.TimeLabel.Caption.get(), "07:08:09");
}

TEST_F(StartUpTest, SoftKeys_HaveTheCaptionsOfTheFrequencyMenu) {
    program.start();
    const char* captions[] = {"CENTER\r\nFREQ", "MANUAL\r\nSPAN", "START\r\nFREQ", "STOP\r\nFREQ",
                              "FREQ\r\nOFFSET"};
    for (int i = 0; i < 5; ++i) EXPECT_EQ(panel.SoftKey(i).Caption.get(), captions[i]);
}

TEST_F(StartUpTest, Panel_HasItsLookWithoutAConnection) {
    program.start();
    EXPECT_FALSE(panel.ConnectedPic.Visible);
    EXPECT_FALSE(panel.SaveCurrentView.Enabled);
    EXPECT_FALSE(panel.RecordData.Enabled);
    EXPECT_EQ(panel.cmd3D.BackColor.get(), 0xE0E0E0U);
    EXPECT_EQ(panel.SoftFrame(0).Caption.get(), "Frequency");
    EXPECT_EQ(panel.SoftKey(0).BackColor.get(), kRed);
    EXPECT_EQ(panel.SoftKey(1).BackColor.get(), kButtonFace);
    EXPECT_FALSE(panel.StopButton.Visible);
}

TEST_F(StartUpTest, Cursors_AreSetUpHidden) {
    program.start();
    ASSERT_EQ(panel.CWGraph1.cursorCount(), 2);
    EXPECT_EQ(panel.CWGraph1.cursor(1).color, 16776960U);
    EXPECT_EQ(panel.CWGraph1.cursor(2).color, 65280U);
    EXPECT_FALSE(panel.CWGraph1.cursor(1).Visible);
    EXPECT_EQ(panel.CWGraph1.TrackMode.get(), 1);
}

TEST_F(StartUpTest, LastSpan_TakesTheMirrorsSpan) {
    mirror.Span = 5e6;
    program.start();
    EXPECT_EQ(panel.LastSpan, 5e6);
}

TEST_F(StartUpTest, OptionNotStored_IsR) {
    program.start();
    EXPECT_EQ(panel.mLoadOption, "R");
}

TEST_F(StartUpTest, OptionStoredEmpty_IsR) {
    platform.settings.set("ZELRemote", "Properties", "Option", "");
    program.start();
    EXPECT_EQ(panel.mLoadOption, "R");
}

TEST_F(StartUpTest, OptionStored_IsTakenAsItStands) {
    platform.settings.set("ZELRemote", "Properties", "Option", " x ");
    program.start();
    EXPECT_EQ(panel.mLoadOption, " x ");
}

struct VersionRow {
    VersionInfo version;
    const char* caption;
};

class VersionCaption : public StartUpTest, public ::testing::WithParamInterface<VersionRow> {};

TEST_P(VersionCaption, RevisionZero_IsLeftOut) {
    SoftPanel softPanel(panel);
    GraphInteraction graph(panel, mirror);
    ServerMode server(forms, platform.startup, platform.events);
    StartUp startUp(forms, mirror, softPanel, graph, server, {platform.clock, platform.settings});
    EXPECT_TRUE(startUp.Form_Load(GetParam().version));
    EXPECT_EQ(panel.Caption.get(), GetParam().caption);
}

INSTANTIATE_TEST_SUITE_P(Versions, VersionCaption,
                         ::testing::Values(VersionRow{{1, 0, 0}, "Marlow & Tenby ZELRemote v1.0"},
                                           VersionRow{{2, 13, 0}, "Marlow & Tenby ZELRemote v2.13"},
                                           VersionRow{{2, 13, 7},
                                                      "Marlow & Tenby ZELRemote v2.13.7"}));

TEST_F(StartUpTest, NoWord_HidesTheQuickConnection) {
    program.start();
    EXPECT_FALSE(panel.ImmConnect.Visible);
    EXPECT_EQ(panel.ImmConnect.Caption.get(), "Direct Connect");
    EXPECT_FALSE(panel.UtilityStartup.Checked);
    EXPECT_FALSE(panel.STAT);
}

struct CommandLineRow {
    const char* line;
    bool quick;
    bool server;
};

class CommandLine : public ::testing::TestWithParam<CommandLineRow> {};

TEST_P(CommandLine, Words_AreFoundAnywhereInEitherCase) {
    TestSession session(GetParam().line);
    bool serverShown = false;
    bool quickAtServer = false;
    session.forms.server.Changed.connect([&] {
        if (!session.forms.server.Visible) return;
        serverShown = true;
        quickAtServer = session.panel.ImmConnect.Visible;
    });
    session.platform.events.schedule(10, [&] { session.forms.server.Hide(); });
    session.program.start();
    EXPECT_EQ(session.panel.ImmConnect.Visible.get(), GetParam().quick);
    EXPECT_EQ(serverShown, GetParam().server);
    EXPECT_EQ(session.panel.UtilityStartup.Checked.get(), GetParam().server);
    EXPECT_EQ(session.panel.STAT, GetParam().server);
    if (GetParam().server) {
        EXPECT_EQ(quickAtServer, GetParam().quick);
    }
}

INSTANTIATE_TEST_SUITE_P(Lines, CommandLine,
                         ::testing::Values(CommandLineRow{"", false, false},
                                           CommandLineRow{"button", true, false},
                                           CommandLineRow{"--pushbuttons=3", true, false},
                                           CommandLineRow{"server", false, true},
                                           CommandLineRow{"MyServerRoom", false, true},
                                           CommandLineRow{"SERVER Button", true, true},
                                           CommandLineRow{"butt on serv er", false, false}));

TEST(ServerStartTest, ServerWindowClosed_EndsTheProgram) {
    TestSession session("server");
    bool modal = false;
    session.platform.events.schedule(10, [&] {
        modal = session.forms.server.Modal;
        session.forms.server.Hide();
    });
    session.panel.StartT = 5;
    session.program.start();
    EXPECT_TRUE(modal);
    EXPECT_TRUE(session.program.ended());
    EXPECT_FALSE(session.panel.Visible);
    EXPECT_EQ(session.panel.StartT, 0);
}

TEST_F(StartUpTest, RunOnStartup_TogglesTheLink) {
    program.start();
    panel.UtilityStartup.Click();
    EXPECT_TRUE(panel.UtilityStartup.Checked);
    EXPECT_EQ(platform.startup.links,
              (std::map<std::string, std::string>{{"ZELRemote.lnk", "server"}}));
    panel.UtilityStartup.Click();
    EXPECT_FALSE(panel.UtilityStartup.Checked);
    EXPECT_TRUE(platform.startup.links.empty());
}

TEST_F(StartUpTest, RunOnStartup_WithoutRights_IsSilent) {
    platform.startup.works = false;
    program.start();
    panel.UtilityStartup.Click();
    panel.UtilityStartup.Click();
    EXPECT_TRUE(boxes.boxes().empty());
    EXPECT_FALSE(panel.UtilityStartup.Checked);
}

TEST_F(StartUpTest, Simulator_IsStartedBesideTheProgram) {
    platform.folder.programFolder = "/opt/zel";
    program.start();
    panel.UtilityTrouble.Click();
    ASSERT_EQ(platform.launcher.starts.size(), 1U);
    EXPECT_EQ(platform.launcher.starts[0].path, "/opt/zel/ZELSim/ZELSim");
}

TEST_F(StartUpTest, SimulatorThatDoesNotStart_IsNoError) {
    platform.launcher.works = false;
    program.start();
    panel.UtilityTrouble.Click();
    EXPECT_TRUE(boxes.boxes().empty());
}

TEST_F(StartUpTest, Second_ShowsTheTimeOfDayBeforeTheFirstConnection) {
    platform.clock.setDate(dateOf(2026, 5, 6, 7, 8, 9));
    program.start();
    platform.events.runFor(2000);
    EXPECT_EQ(panel.TimeLabel.Caption.get(), "07:08:11");
}

TEST_F(StartUpTest, Second_ShowsTheLengthOfTheSession) {
    program.start();
    panel.StartT = platform.clock.date();
    platform.events.runFor(65000);
    EXPECT_EQ(panel.TimeLabel.Caption.get(), "00:01:05");
}

TEST_F(StartUpTest, Second_BringsABrokenServerBackToListening) {
    program.start();
    forms.server.localPortTextBox.Text = "4711";
    platform.serverSocket.setState(SocketState::Error);
    platform.events.runFor(1000);
    EXPECT_EQ(platform.serverSocket.state(), SocketState::Listening);
    EXPECT_EQ(platform.serverSocket.port(), 4711);
    EXPECT_EQ(forms.server.txtDebug.Text.get(), "Connection broken");
    EXPECT_FALSE(forms.server.Visible);
}

TEST_F(StartUpTest, Second_LeavesAServerThatIsWell) {
    program.start();
    platform.serverSocket.listen("", 2277);
    platform.events.runFor(3000);
    EXPECT_EQ(forms.server.txtDebug.Text.get(), "");
    EXPECT_EQ(platform.serverSocket.port(), 2277);
}

struct KindRow {
    MenuItem ControllerForm::*item;
    const char* caption;
};

class ConnectionKind : public StartUpTest, public ::testing::WithParamInterface<KindRow> {};

TEST_P(ConnectionKind, MenuEntry_HasItsCaptionBelowConnection) {
    const MenuItem& item = panel.*GetParam().item;
    EXPECT_EQ(item.Caption.get(), GetParam().caption);
    EXPECT_EQ(item.parent(), &panel.Connection);
}

INSTANTIATE_TEST_SUITE_P(
    Kinds, ConnectionKind,
    ::testing::Values(KindRow{&ControllerForm::Direct, "Direct Serial Port Connection..."},
                      KindRow{&ControllerForm::Modem, "Two Modems Connection..."},
                      KindRow{&ControllerForm::GSM, "Two Mobile Phones Connection..."},
                      KindRow{&ControllerForm::TCPConnection, "TCP/IP Connection..."},
                      KindRow{&ControllerForm::ModemToGSM, "Modem To Mobile Phone Connection..."},
                      KindRow{&ControllerForm::GSMToModem, "Mobile Phone to Modem Connection..."}));

TEST(ConstantsTest, Menus_HaveTheirNumbers) {
    using CF = ControllerForm;
    EXPECT_EQ((std::vector<int>{CF::AMPT, CF::SPAN, CF::Freq, CF::BW, CF::SWEEP, CF::TRACE,
                                CF::MEAS, CF::Marker, CF::TRACKINGGEN, CF::POWER, CF::CHNPOWER,
                                CF::OCCBW, CF::TDMA, CF::DISTFAULT, CF::MEAS_TRD, CF::MEAS_LLINES}),
              (std::vector<int>{1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 71, 72}));
}

TEST(ConstantsTest, ConnectionKinds_HaveTheirNumbers) {
    using CF = ControllerForm;
    EXPECT_EQ((std::vector<int>{CF::DIRECTCON, CF::MODEMCON, CF::GSMCON, CF::TCPCON, CF::HTTPCON,
                                CF::MODEMGSMCON, CF::GSMMODEMCON}),
              (std::vector<int>{1, 2, 3, 4, 5, 6, 7}));
}

TEST(ConstantsTest, Modes_HaveTheNumbersOfTheInstrument) {
    using CF = ControllerForm;
    EXPECT_EQ((std::vector<int>{CF::ANALYZER, CF::TRACKINGGENERATOR, CF::POWERSENSOR,
                                CF::CHANNELPOWER, CF::OCCBANDWIDTH, CF::TDMAPOWERMODE,
                                CF::DISTTOFAULTMEASURE, CF::RECEIVER}),
              (std::vector<int>{1, 2, 3, 4, 5, 6, 7, 8}));
}

}  // namespace
}  // namespace zel
