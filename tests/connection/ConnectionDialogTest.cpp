#include <gtest/gtest.h>

#include "tests/connection/Bench.h"

namespace zel {
namespace {

using CF = ControllerForm;

TEST_F(Connection, Dialog_Load_ListsThePlatformsPorts) {
    dialog.load();
    EXPECT_EQ(dialog.COMList.items(), (Texts{"COM1", "COM3"}));
    EXPECT_EQ(dialog.COMList.ListIndex(), 0);
    EXPECT_EQ(dialog.CommPorts, (Texts{"COM1", "COM3"}));
}

TEST_F(Connection, Dialog_Load_ListsTheBaudRates) {
    dialog.load();
    EXPECT_EQ(dialog.BaudList.items(), (Texts{"19200", "38400", "57600", "115200"}));
    EXPECT_EQ(dialog.BaudList.ListIndex(), 0);
    dialog.unload(1);
    dialog.load();
    EXPECT_EQ(dialog.BaudList.ListCount(), 4);
}

TEST_F(Connection, Dialog_LoadWithoutPorts_ShowsNoBox) {
    platform.ports.ports.clear();
    dialog.load();
    EXPECT_EQ(dialog.COMList.ListCount(), 0);
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(Connection, Dialog_LoadWith999Ports_ListsThem) {
    platform.ports.ports.assign(999, "X");
    dialog.load();
    EXPECT_EQ(dialog.COMList.ListCount(), 999);
}

TEST_F(Connection, Dialog_LoadWith1000Ports_ListsCom1To10) {
    platform.ports.ports.assign(1000, "X");
    dialog.load();
    ASSERT_EQ(dialog.COMList.ListCount(), 10);
    EXPECT_EQ(dialog.COMList.List(0), "COM1");
    EXPECT_EQ(dialog.COMList.List(9), "COM10");
}

TEST_F(Connection, Dialog_Load_ClearsTheModemFlag) {
    dialog.ModemConnected = true;
    dialog.load();
    EXPECT_FALSE(dialog.ModemConnected);
}

TEST_F(Connection, Dialog_LoadForADialledKind_ShowsDialAndHidesCancel) {
    panel.ConnectionState = CF::MODEMCON;
    dialog.DialButton.Visible = false;
    dialog.CancelButton.Visible = true;
    dialog.load();
    EXPECT_TRUE(dialog.DialButton.Visible);
    EXPECT_FALSE(dialog.CancelButton.Visible);
}

TEST_F(Connection, Direct_ShowsTheDialogOfTheDirectLink) {
    bool modal = false;
    later(10, [&] {
        modal = dialog.Visible && dialog.Modal;
        EXPECT_TRUE(dialog.DirectConnectionFrame.Visible);
        EXPECT_TRUE(dialog.ZELButton.Visible);
        EXPECT_TRUE(dialog.DisconnectButton.Visible);
        EXPECT_TRUE(dialog.CancelConnButton1.Visible);
        EXPECT_FALSE(dialog.ModemConnectionFrame.Visible);
        EXPECT_FALSE(dialog.DisconnectButton2.Visible);
        EXPECT_FALSE(dialog.CancelConnButton.Visible);
        dialog.CancelConnButton1.Click();
    });
    panel.Direct.Click();
    EXPECT_TRUE(modal);
    EXPECT_FALSE(dialog.Visible);
    EXPECT_EQ(panel.ConnectionState, CF::DIRECTCON);
}

TEST_F(Connection, Direct_AfterTheDialog_HidesWhatBelongsToDialling) {
    later(10, [this] { dialog.CancelConnButton1.Click(); });
    panel.Direct.Click();
    EXPECT_FALSE(dialog.ModemConnectionFrame.Visible);
    EXPECT_FALSE(dialog.LoadSettingsButton.Visible);
    EXPECT_FALSE(dialog.SaveSettingsButton.Visible);
    EXPECT_FALSE(dialog.CancelConnButton.Visible);
    EXPECT_TRUE(dialog.CancelConnButton1.Visible);
    EXPECT_TRUE(dialog.DisconnectButton.Visible);
    EXPECT_TRUE(dialog.ZELButton.Visible);
}

TEST_F(Connection, Connect_FromTheDialog_DoesTheHandshakeStoresTheFieldsAndReadsOneTrace) {
    page().whole().cmd("WAIT");
    trace(levelBlock(-35250));
    later(10, [this] {
        dialog.COMList.pick(1);
        dialog.BaudList.pick(2);
        dialog.ZELButton.Click();
    });
    later(600'000, [this] { dialog.Hide(); });  // an attempt that fails would leave it open
    panel.Direct.Click();
    expectPlayed();
    EXPECT_EQ(shown(), Texts{});
    EXPECT_TRUE(panel.isConnected);
    EXPECT_EQ(panel.State, CF::Freq);
    EXPECT_EQ(port.openings().back().CommPort, "COM3");
    EXPECT_EQ(port.openings().back().Settings, "57600,N,8,1");
    EXPECT_EQ(panel.RawTraceData, std::vector<double>(301, -35.25));
    EXPECT_EQ(platform.settings.get("ZELRemote", "DIRECTCON", "CommPort", ""), "1");
    EXPECT_EQ(platform.settings.get("ZELRemote", "DIRECTCON", "BaudRate", ""), "2");
    EXPECT_FALSE(dialog.Visible);
    EXPECT_FALSE(dialog.ZELButton.Visible);
}

TEST_F(Connection, Connect_PowerSensor_ReadsNoTrace) {
    page({{"MEAS", "3"}})
        .wake()
        .cmd("REMOTE")
        .identity()
        .detectorModeAndFrequency()
        .get("FREQOFFS", "0");
    EXPECT_TRUE(program.connect({LinkAddress::Kind::Serial, "COM3", 57600}, true));
    expectPlayed();
}

TEST_F(Connection, Connect_StartsTheSessionClock) {
    page().whole();
    connect();
    EXPECT_TRUE(panel.UpNow.Enabled);
    platform.events.runFor(65'000);
    EXPECT_EQ(panel.TimeLabel.Caption.get().substr(panel.TimeLabel.Caption.get().size() - 4),
              "1:05");
}

TEST_F(Connection, Connect_BadField_LeavesTheDialogOpen) {
    later(10, [this] {
        dialog.COMList.setText("COM");
        dialog.ZELButton.Click();
        EXPECT_TRUE(dialog.Visible);
        dialog.CancelConnButton1.Click();
    });
    panel.Direct.Click();
    EXPECT_EQ(shown(), Texts{"plain | ZELRemote | Please enter a valid COM port!"});
    EXPECT_EQ(port.written(), "");
}

TEST_F(Connection, Connect_InVain_LeavesTheKeysOfTheFrequencyMenu) {
    panel.FrequencyButton.Picture = "freq_y";
    panel.SpanButton.Picture = "span_b";
    later(10, [this] {
        dialog.COMList.setText("COM");
        dialog.ZELButton.Click();
        dialog.CancelConnButton1.Click();
    });
    panel.Direct.Click();
    EXPECT_EQ(panel.FrequencyButton.Picture.get(), "freq_b");
    EXPECT_EQ(panel.SpanButton.Picture.get(), "span_y");
}

TEST_F(Connection, Close_ClearsTheErrorFlag) {
    panel.ErrorFlag = true;
    later(10, [this] { dialog.CancelConnButton1.Click(); });
    panel.Direct.Click();
    EXPECT_FALSE(panel.ErrorFlag);
}

TEST(QuickConnect, Click_ConnectsAtOnceWithTheStoredFields) {
    Bench bench("BUTTON");
    bench.platform.settings.set("ZELRemote", "DIRECTCON", "CommPort", "1");
    bench.platform.settings.set("ZELRemote", "DIRECTCON", "BaudRate", "3");
    bench.page().whole().cmd("WAIT");
    bench.trace(levelBlock(-1000));
    bool everShown = false;
    bench.dialog.Changed.connect([&] { everShown = everShown || bench.dialog.Visible; });
    bench.panel.ImmConnect.Click();
    bench.expectPlayed();
    EXPECT_TRUE(bench.panel.isConnected);
    EXPECT_FALSE(everShown);
    EXPECT_TRUE(bench.panel.immConnectState);
    EXPECT_FALSE(bench.panel.ImmConnect.Visible);
    EXPECT_EQ(bench.port.openings().back().CommPort, "COM3");
    EXPECT_EQ(bench.port.openings().back().Settings, "115200,N,8,1");
}

TEST(QuickConnect, WithoutTheWord_IsNotOffered) {
    Bench bench;
    EXPECT_FALSE(bench.panel.ImmConnect.Visible);
}

TEST(QuickConnect, AfterTheDisconnection_IsOfferedAgain) {
    Bench bench("BUTTON");
    bench.page().whole().cmd("LOCAL");
    bench.connect();
    EXPECT_FALSE(bench.panel.ImmConnect.Visible);
    bench.program.disconnect();
    EXPECT_TRUE(bench.panel.ImmConnect.Visible);
}

}  // namespace
}  // namespace zel
