#include <gtest/gtest.h>

#include "tests/link/Line.h"

namespace zel {
namespace {

TEST_F(Line, OpenSerialPort_Setup_IsThatOfTheInstrument) {
    EXPECT_TRUE(link.OpenSerialPort("COM7", 38400));
    const SerialSetup& setup = port.openings().back();
    EXPECT_EQ(setup.CommPort, "COM7");
    EXPECT_TRUE(setup.DTREnable);
    EXPECT_TRUE(setup.RTSEnable);
    EXPECT_EQ(setup.Handshaking, 0);
    EXPECT_EQ(setup.InBufferSize, 12000);
    EXPECT_EQ(setup.OutBufferSize, 2048);
    EXPECT_EQ(setup.InputLen, 0);
    EXPECT_EQ(setup.RThreshold, 1);
    EXPECT_EQ(setup.Settings, "38400,N,8,1");
}

TEST_F(Line, OpenSerialPort_Success_EmptiesTheInputBuffer) {
    state.InputBuffer = "old";
    dialog.IsConnectedToPort = false;
    link.OpenSerialPort("COM1", 19200);
    EXPECT_EQ(state.InputBuffer, "");
    EXPECT_TRUE(dialog.IsConnectedToPort);
}

TEST_F(Line, OpenSerialPort_Failure_IsFalseAndNothingElse) {
    port.close();
    dialog.IsConnectedToPort = false;
    state.InputBuffer = "old";
    port.failOpen("COM1 is in use.");
    EXPECT_FALSE(link.OpenSerialPort("COM1", 19200));
    EXPECT_FALSE(dialog.IsConnectedToPort);
    EXPECT_EQ(state.InputBuffer, "old");
    EXPECT_EQ(shown(), Texts{});
}

struct PortFromDialog : Line {
    PortFromDialog() {
        port.close();
        dialog.IsConnectedToPort = false;
        dialog.OnPic.Visible = false;
        for (const char* baud : {"19200", "38400", "57600", "115200"})
            dialog.BaudList.AddItem(baud);
        dialog.BaudList.setListIndex(2);
    }
    void open(const std::string& name) {
        dialog.COMList.setText(name);
        link.OpenPortFromDialog();
    }
};

TEST_F(PortFromDialog, GoodFields_OpenThePortAndLightTheLamp) {
    open("com3");
    EXPECT_TRUE(port.isOpen());
    EXPECT_EQ(port.openings().back().CommPort, "COM3");
    EXPECT_EQ(port.openings().back().Settings, "57600,N,8,1");
    EXPECT_TRUE(dialog.OnPic.Visible);
    EXPECT_TRUE(dialog.IsConnectedToPort);
    EXPECT_EQ(dialog.MousePointer.get(), 0);
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(PortFromDialog, WhileThePortOpens_ThePointerIsTheHourglass) {
    int pointer = 0;
    events.schedule(0, [&] { pointer = dialog.MousePointer; });
    open("COM3");
    EXPECT_EQ(pointer, 11);
}

TEST_F(PortFromDialog, PathOfADevice_IsTakenAsItStands) {
    open("/dev/ttyUSB0");
    EXPECT_EQ(port.openings().back().CommPort, "/dev/ttyUSB0");
}

TEST_F(PortFromDialog, NameThatThePlatformListed_IsTakenAsItStands) {
    dialog.CommPorts = {"ttyS0"};
    open("ttyS0");
    EXPECT_EQ(port.openings().back().CommPort, "ttyS0");
}

TEST_F(PortFromDialog, LastPartOfAListedPath_MeansThatPath) {
    dialog.CommPorts = {"/dev/ttyUSB1", "/dev/ttyUSB0"};
    open("ttyUSB0");
    EXPECT_EQ(port.openings().back().CommPort, "/dev/ttyUSB0");
    EXPECT_EQ(serialDeviceName("USB0", dialog.CommPorts), "");
    EXPECT_EQ(serialDeviceName("32767", {}), "COM32767");
    EXPECT_EQ(serialDeviceName("32768", {}), "");
    EXPECT_EQ(serialDeviceName("0", {}), "");
    EXPECT_EQ(serialDeviceName("1.5", {}), "");
}

TEST_F(PortFromDialog, PathFromTheWorkingFolder_IsTakenAsItStands) {
    open("ports/instrument");
    EXPECT_EQ(port.openings().back().CommPort, "ports/instrument");
}

TEST_F(PortFromDialog, NameThatIsNoPort_IsTold) {
    for (const char* name : {"COM", "", " ", "COMx", "x", "COM1.5", "COM0", "COM99999999999",
                             "COM-1", "K\xC3\xB6ln"}) {
        boxes.clear();
        open(name);
        EXPECT_EQ(shown(), Texts{"plain | ZELRemote | Please enter a valid COM port!"}) << name;
        EXPECT_EQ(dialog.MousePointer.get(), 0) << name;
    }
    EXPECT_TRUE(port.openings().empty() || port.openings().size() == 1U);
    EXPECT_FALSE(port.isOpen());
}

TEST_F(PortFromDialog, BaudRateThatIsNoNumber_IsTold) {
    for (const char* baud : {"", "fast", "57600 baud"}) {
        boxes.clear();
        dialog.BaudList.setText(baud);
        open("COM1");
        EXPECT_EQ(shown(), Texts{"plain | ZELRemote | Please enter a valid baud rate!"}) << baud;
        EXPECT_EQ(dialog.MousePointer.get(), 0) << baud;
    }
    EXPECT_FALSE(port.isOpen());
}

TEST_F(PortFromDialog, BaudRateBeyondAllBounds_CannotConnect) {
    for (const char* baud : {"0", "-19200", "1e300"}) {
        boxes.clear();
        dialog.BaudList.setText(baud);
        open("COM1");
        EXPECT_EQ(shown(), Texts{"warning | ZELRemote | Could not connect to the specified port!"})
            << baud;
    }
    EXPECT_FALSE(port.isOpen());
}

TEST_F(PortFromDialog, SecondOpening_IsToldAndLeavesThePortAsItIs) {
    open("COM3");
    const std::size_t openings = port.openings().size();
    open("COM4");
    EXPECT_EQ(shown(), Texts{"plain | ZELRemote | Port is already open!"});
    EXPECT_EQ(port.openings().size(), openings);
    EXPECT_TRUE(port.isOpen());
    EXPECT_TRUE(dialog.IsConnectedToPort);
}

TEST_F(PortFromDialog, PortThatCannotBeHad_IsToldWithItsReason) {
    port.failOpen("COM3 is in use by another program.");
    open("COM3");
    EXPECT_EQ(shown(), Texts{"warning | ZELRemote | Could not connect to the specified port!\r\n"
                             "COM3 is in use by another program."});
    EXPECT_FALSE(dialog.IsConnectedToPort);
    EXPECT_FALSE(dialog.OnPic.Visible);
    EXPECT_EQ(dialog.MousePointer.get(), 0);
}

TEST_F(Line, WriteToLink_Serial_SendsTheTextAndLogsIt) {
    link.WriteToLink("FREQ\r");
    EXPECT_EQ(port.written(), "FREQ\r");
    EXPECT_EQ(debug.texts(), Texts{"-> FREQ\r"});
}

TEST_F(Line, WriteToLink_PortNotOpenedByTheDialog_DropsTheText) {
    dialog.IsConnectedToPort = false;
    link.WriteToLink("FREQ\r");
    EXPECT_EQ(port.written(), "");
    EXPECT_EQ(debug.texts(), Texts{});
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(Line, WriteToLink_Tcp_SendsOnTheSocketAndLogsIt) {
    overTcp();
    link.WriteToLink("FREQ\r");
    EXPECT_EQ(socket.written(), "FREQ\r");
    EXPECT_EQ(debug.texts(), Texts{"-> FREQ\r"});
    link.noteBlock(1205);
    EXPECT_EQ(debug.texts().back(), "<-1205 bytes");
}

TEST_F(Line, WriteToLink_EverySerialKind_GoesToThePort) {
    for (const std::int16_t kind : kSerialKinds) {
        panel.ConnectionState = kind;
        link.WriteToLink("A");
    }
    EXPECT_EQ(port.written(), "AAAAA");
}

TEST_F(Line, WriteToLink_Text_IsAByteACharacter) {
    port.expect("10 \xB5s \x80\r").silence();
    link.WriteToLink("10 µs €\r");
    expectPlayed();
}

TEST_F(Line, WriteToLink_CharacterWithoutAByte_SendsNothing) {
    link.WriteToLink("5 \u03A9\r");
    EXPECT_EQ(port.written(), "");
}

TEST_F(Line, ReadFromLink_Serial_TakesAllAndNeverWaits) {
    port.arrive("0\r12");
    EXPECT_EQ(time([&] {
                  EXPECT_EQ(link.ReadFromLink(true), "0\r12");
                  EXPECT_EQ(link.ReadFromLink(true), "");
                  EXPECT_EQ(link.ReadFromLink(false), "");
              }),
              0);
}

TEST_F(Line, ReadFromLink_Text_IsLoggedAndAnEmptyOneIsNot) {
    port.arrive("0\r");
    link.ReadFromLink(false);
    link.ReadFromLink(false);
    EXPECT_EQ(debug.texts(), Texts{"<-0\r"});
}

TEST_F(Line, ReadFromLink_ClosedPort_IsToldOnceUntilTheFlagIsCleared) {
    port.close();
    link.ReadFromLink(true);
    link.ReadFromLink(true);
    EXPECT_EQ(shown(), Texts{"critical | ZELRemote | Not Connected To Port!"});
    EXPECT_TRUE(panel.ErrorFlag);
    panel.ErrorFlag = false;
    link.ReadFromLink(true);
    EXPECT_EQ(shown().size(), 2U);
}

TEST_F(Line, ReadFromLink_PortNotOpenedByTheDialog_IsNotConnected) {
    dialog.IsConnectedToPort = false;
    port.arrive("0\r");
    EXPECT_EQ(link.ReadFromLink(true), "");
    EXPECT_EQ(shown(), Texts{"critical | ZELRemote | Not Connected To Port!"});
}

TEST_F(Line, Drain_Tcp_ReadsNothing) {
    overTcp();
    socket.arrive("left over");
    link.drain(5);
    EXPECT_EQ(socket.peekData(), "left over");
}

TEST_F(Line, Drain_Serial_TakesEverything) {
    port.arrive("0\r1\r2\r");
    link.drain(5);
    EXPECT_EQ(port.waiting(), "");
}

TEST_F(Line, ReadFromLink_TcpSilence_ReturnsEmptyAfterATenthOfASecond) {
    overTcp();
    const std::int64_t ms = time([&] { EXPECT_EQ(link.ReadFromLink(true), ""); });
    EXPECT_GE(ms, 100);
    EXPECT_LE(ms, 120);
}

TEST_F(Line, ReadFromLink_TcpDataAsTheWaitEnds_IsTaken) {
    overTcp();
    events.schedule(105, [&] { socket.arrive("0\r"); });
    EXPECT_EQ(link.ReadFromLink(true), "0\r");
    EXPECT_EQ(socket.peekData(), "");
}

TEST_F(Line, ReadFromLink_TcpData_WakeTheWait) {
    overTcp();
    events.schedule(37, [&] { socket.arrive("0\r"); });
    EXPECT_EQ(time([&] { EXPECT_EQ(link.ReadFromLink(true), "0\r"); }), 37);
    EXPECT_EQ(debug.texts(), Texts{"<-0\r"});
}

TEST_F(Line, ReadFromLink_AnyLink_ClearsTheArrivalFlag) {
    state.TCPDataArrived = true;
    link.ReadFromLink(false);
    EXPECT_FALSE(state.TCPDataArrived);
    overTcp();
    socket.arrive("0\r");
    EXPECT_TRUE(state.TCPDataArrived);
    link.ReadFromLink(false);
    EXPECT_FALSE(state.TCPDataArrived);
    EXPECT_EQ(socket.peekData(), "0\r");
}

TEST_F(Line, ReadFromLink_TcpPeerGone_DoesNotWait) {
    overTcp();
    socket.peerCloses();
    EXPECT_EQ(time([&] { EXPECT_EQ(link.ReadFromLink(true), ""); }), 0);
}

}  // namespace
}  // namespace zel
