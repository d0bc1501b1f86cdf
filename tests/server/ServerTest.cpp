#include "tests/server/ServerBench.h"

namespace zel {
namespace {

TEST_F(Server, Load_FillsListsAndFields) {
    form.load();
    EXPECT_EQ(form.COMList.items(), (Texts{"COM1", "COM3"}));
    EXPECT_EQ(form.COMList.ListIndex(), 0);
    EXPECT_EQ(form.BaudList.items(), (Texts{"9600", "19200", "38400", "57600", "115200"}));
    EXPECT_EQ(form.BaudList.ListIndex(), 0);
    EXPECT_EQ(form.localPortTextBox.Text.get(), "2277");
    EXPECT_EQ(form.localIPTextBox.Text.get(), "192.168.1.7");
    EXPECT_TRUE(form.chkBaudRate.Value());
    EXPECT_EQ(form.cmdConnect.Caption.get(), "connect");
    EXPECT_EQ(form.cmdCancel.Caption.get(), "cancel");
}

TEST_F(Server, Load_StoredNumberOutsideTheList_SelectsNothing) {
    platform.settings.set("ZELRemote", "ServerForm", "COMPort", "9");
    platform.settings.set("ZELRemote", "ServerForm", "BaudRate", "4");
    form.load();
    EXPECT_EQ(form.COMList.ListIndex(), -1);
    EXPECT_EQ(form.BaudList.ListIndex(), 4);
}

TEST_F(Server, Search_InstrumentAt57600_IsFoundThere) {
    load();
    for (int i = 0; i < 3; ++i) noise();
    identity();
    form.cmdConnect.Click();
    EXPECT_EQ(line.failure(), "");
    EXPECT_EQ(line.leftOver(), "");
    EXPECT_TRUE(program.server().bridging());
    EXPECT_EQ(form.BaudList.Text(), "57600");
    EXPECT_EQ(form.Caption.get(), "ZELRemote Server TCP/IP: 192.168.1.7: 2277 | ZEL: COM3, 57600");
    EXPECT_EQ(panel.Caption.get(), form.Caption.get());
    EXPECT_EQ(form.cmdCancel.Caption.get(), "disconnect");
    EXPECT_FALSE(form.cmdConnect.Enabled);
    EXPECT_TRUE(form.picConnected.Visible);
    EXPECT_EQ(happened, (Texts{"listening 192.168.1.7:2277", "instrument COM3 57600"}));
}

TEST_F(Server, Search_SilenceAtTheFirstSpeed_IsForgiven) {
    load();
    line.expect("\r\n").silence();
    noise();
    noise();
    identity();
    form.cmdConnect.Click();
    EXPECT_TRUE(program.server().bridging());
}

TEST_F(Server, Search_SilenceAboveTheFirstSpeed_EndsIt) {
    load();
    noise();
    line.expect("\r\n").silence();
    form.cmdConnect.Click();
    EXPECT_EQ(line.failure(), "");
    EXPECT_EQ(shown(),
              Texts{"warning | ZELRemote | No instrument found at the specified COM port!"});
    EXPECT_FALSE(line.isOpen());
    EXPECT_EQ(server.state(), SocketState::Closed);
    EXPECT_TRUE(form.cmdConnect.Enabled);
    // The next search starts again.
    line.expect("\r\n").silence();
    noise();
    noise();
    identity();
    form.cmdConnect.Click();
    EXPECT_TRUE(program.server().bridging());
}

TEST_F(Server, Search_InstrumentAtAnotherSpeed_IsSwitched) {
    load();
    noise();
    identity();
    line.expect("SET\r").answer("0\r");
    line.expect("BAUD,2\r").answer("0\r");
    noise();
    identity();
    form.cmdConnect.Click();
    EXPECT_EQ(line.failure(), "");
    EXPECT_EQ(form.BaudList.Text(), "57600");
    EXPECT_TRUE(program.server().bridging());
}

TEST_F(Server, Search_InstrumentThatKeepsItsSpeed_IsTakenThereAndNotSwitchedAgain) {
    load();
    for (int i = 0; i < 4; ++i) noise();
    identity();
    line.expect("SET\r").answer("0\r");
    line.expect("BAUD,2\r").answer("0\r");
    noise();
    noise();
    identity();
    form.cmdConnect.Click();
    EXPECT_EQ(line.failure(), "");
    EXPECT_EQ(form.BaudList.Text(), "115200");
    EXPECT_TRUE(program.server().bridging());
}

TEST_F(Server, Search_NoiseEverywhere_EndsBehindTheLastSpeed) {
    load();
    for (int i = 0; i < 5; ++i) noise();
    form.cmdConnect.Click();
    EXPECT_EQ(line.openings().size(), 5U);
    EXPECT_EQ(shown(),
              Texts{"warning | ZELRemote | No instrument found at the specified COM port!"});
}

TEST_F(Server, Search_OtherDevice_IsNoInstrument) {
    load();
    for (int i = 0; i < 5; ++i) {
        line.expect("\r\n").answer("0\r");
        line.expect("GET\r").answer("0\r");
        line.expect("IDN?\r").answer("0\rSomebody,1,2\r");
    }
    form.cmdConnect.Click();
    EXPECT_EQ(line.failure(), "");
    EXPECT_FALSE(program.server().bridging());
}

TEST_F(Server, SearchOff_SendsNothingAndKeepsTheSpeed) {
    load();
    form.chkBaudRate.setValue(false);
    form.BaudList.setListIndex(1);
    form.cmdConnect.Click();
    EXPECT_TRUE(program.server().bridging());
    EXPECT_EQ(line.written(), "");
    ASSERT_EQ(line.openings().size(), 1U);
    EXPECT_EQ(line.openings()[0].Settings, "19200,N,8,1");
    EXPECT_EQ(line.openings()[0].InBufferSize, 4096);
}

TEST_F(Server, SuccessfulConnect_StoresTheFields) {
    form.load();
    form.COMList.setText("/dev/instrument");
    form.chkBaudRate.setValue(false);
    form.BaudList.setListIndex(3);
    form.localPortTextBox.Text = "4000";
    form.cmdConnect.Click();
    const auto stored = [&](const char* key) {
        return platform.settings.get("ZELRemote", "ServerForm", key, "absent");
    };
    EXPECT_EQ(stored("LocalTCPPort"), "4000");
    EXPECT_EQ(stored("COMPort"), "-1");
    EXPECT_EQ(stored("COMPortName"), "/dev/instrument");
    EXPECT_EQ(stored("BaudRate"), "3");
    EXPECT_EQ(stored("AutoBaud"), "0");
}

TEST_F(Server, BadFields_AreTold) {
    load();
    form.localPortTextBox.Text = "x";
    form.cmdConnect.Click();
    form.localPortTextBox.Text = "2277";
    form.COMList.setText("COM");
    form.cmdConnect.Click();
    form.COMList.setText("COM3");
    form.chkBaudRate.setValue(false);
    form.BaudList.setText("fast");
    form.cmdConnect.Click();
    form.txtAllowed.Text = "somewhere";
    form.cmdConnect.Click();
    EXPECT_EQ(shown(),
              (Texts{"plain | ZELRemote | Please enter a valid TCP port!",
                     "plain | ZELRemote | Please enter a valid COM port!",
                     "plain | ZELRemote | Please enter a valid baud rate!",
                     "plain | ZELRemote | Please enter valid networks, such as 192.168.1.0/24!"}));
    EXPECT_FALSE(line.isOpen());
    EXPECT_EQ(server.state(), SocketState::Closed);
}

TEST_F(Server, PortThatCannotBeHad_IsTold) {
    load();
    line.failOpen("held", 1);
    form.cmdConnect.Click();
    EXPECT_EQ(shown(),
              Texts{"warning | ZELRemote | Could not connect to the specified COM port!\r\nheld"});
    EXPECT_EQ(server.state(), SocketState::Closed);
}

TEST_F(Server, ListenThatFails_EndsTheAttempt) {
    load();
    server.failListen("in use");
    form.cmdConnect.Click();
    EXPECT_EQ(shown(), Texts{"warning | ZELRemote | The TCP port cannot be used!\r\nin use"});
    EXPECT_TRUE(line.openings().empty());
    EXPECT_TRUE(form.cmdConnect.Enabled);
}

}  // namespace
}  // namespace zel
