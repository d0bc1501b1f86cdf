#include <gtest/gtest.h>

#include "link/RS232Ops.h"
#include "link/TCPIPOps.h"
#include "platform/virtual/VirtualPlatform.h"
#include "tests/ShownBoxes.h"

namespace zel {
namespace {

struct PortRoutines : ::testing::Test {
    VirtualPlatform platform;
    ScriptedPort& port = platform.port;
    ScriptedSocket& socket = platform.tcpSocket;
    ScriptedServer& server = platform.serverSocket;
    RS232Ops ops{platform.events, platform.boxes};

    std::string readEvent(int code) {
        std::string result = "old";
        ops.ReadComPortEvent(result, port, code);
        return result;
    }
    void connect() {
        socket.connectTo("host", 1);
        platform.events.pump();
    }
};

TEST_F(PortRoutines, OpenComPort_NameAndBaudText_AreRead) {
    EXPECT_TRUE(ops.OpenComPort(port, "com3", "38400 baud"));
    const SerialSetup& setup = port.openings().back();
    EXPECT_EQ(setup.CommPort, "COM3");
    EXPECT_EQ(setup.Settings, "38400,N,8,1");
    EXPECT_EQ(setup.InBufferSize, 4096);
    EXPECT_EQ(setup.OutBufferSize, 2048);
    EXPECT_EQ(setup.SThreshold, 1);
    EXPECT_EQ(setup.RThreshold, 1);
    EXPECT_EQ(setup.Handshaking, 0);
}

TEST_F(PortRoutines, OpenComPort_NameOfThePlatform_IsTakenAsItStands) {
    for (const char* name : {"/dev/ttyUSB0", "ttyS0"}) {
        port.close();
        EXPECT_TRUE(ops.OpenComPort(port, name, "19200"));
        EXPECT_EQ(port.openings().back().CommPort, name);
    }
}

TEST_F(PortRoutines, OpenComPort_BaudTextWithoutNumber_IsFalse) {
    EXPECT_FALSE(ops.OpenComPort(port, "COM3", "fast"));
    EXPECT_TRUE(port.openings().empty());
}

TEST_F(PortRoutines, OpenComPortNumber_OpenPort_IsToldAndLeftAlone) {
    ops.OpenComPortNumber(port, "COM3", 19200);
    EXPECT_FALSE(ops.OpenComPortNumber(port, "COM4", 19200));
    EXPECT_EQ(shownBoxes(platform.boxes), Texts{"critical | ZELRemote | Port already opened!"});
    EXPECT_EQ(port.openings().size(), 1U);
    EXPECT_TRUE(port.isOpen());
}

TEST_F(PortRoutines, ReadComPortEvent_ClosedPort_IsTold) {
    EXPECT_EQ(readEvent(2), "");
    EXPECT_EQ(shownBoxes(platform.boxes), Texts{"critical | ZELRemote | Not Connected To Port!"});
}

TEST_F(PortRoutines, ReadComPortEvent_DataReceived_WaitsForTheBurst) {
    ops.OpenComPortNumber(port, "COM3", 19200);
    port.arrive("0\r123\r");
    EXPECT_EQ(readEvent(2), "0\r123\r");
    EXPECT_EQ(platform.clock.micros(), 100'000);
}

TEST_F(PortRoutines, ReadComPortEvent_ErrorsAndLineChanges_AreIgnored) {
    ops.OpenComPortNumber(port, "COM3", 19200);
    port.arrive("0\r");
    for (const int code : {1, 4, 5, 6, 1001, 1004, 1006, 1008, 1009, 1010, 1011})
        EXPECT_EQ(readEvent(code), "") << code;
    EXPECT_EQ(port.waiting(), "0\r");
    EXPECT_EQ(platform.clock.micros(), 0);
}

TEST_F(PortRoutines, WriteComPort_Text_GoesOut) {
    ops.OpenComPortNumber(port, "COM3", 19200);
    ops.WriteComPort(port, "AT\r");
    EXPECT_EQ(port.written(), "AT\r");
}

TEST_F(PortRoutines, CloseComPortControl_OpenPort_IsClosed) {
    ops.OpenComPortNumber(port, "COM3", 19200);
    ops.CloseComPortControl(port);
    EXPECT_FALSE(port.isOpen());
}

TEST_F(PortRoutines, ReadSerialPortNames_ThePlatformsNames_FollowWhatIsThere) {
    platform.ports.ports = {"COM4", "COM1"};
    Texts names = {"first"};
    ReadSerialPortNames(platform.ports, names);
    EXPECT_EQ(names, (Texts{"first", "COM4", "COM1"}));
}

TEST_F(PortRoutines, ListenOnPort_Text_GivesTheLocalPort) {
    ListenOnPort(server, "2277", "::1");
    EXPECT_EQ(server.state(), SocketState::Listening);
    EXPECT_EQ(server.port(), 2277);
    EXPECT_EQ(server.address(), "::1");
}

TEST_F(PortRoutines, ListenOnPort_NumberBeyondAllPorts_DoesNotListen) {
    for (const char* text : {"65536", "-1"}) {
        ListenOnPort(server, text);
        EXPECT_EQ(server.state(), SocketState::Closed) << text;
    }
}

TEST_F(PortRoutines, ListenOnPort_LowestAndHighest_Listen) {
    for (const char* text : {"0", "65535"}) {  // 0 is any that is free
        server.close();
        ListenOnPort(server, text);
        EXPECT_EQ(server.state(), SocketState::Listening) << text;
    }
}

TEST_F(PortRoutines, CloseIfOpen_OtherStates_AreLeftAlone) {
    connect();
    CloseIfOpen(socket);
    EXPECT_EQ(socket.state(), SocketState::Connected);
    socket.setState(SocketState::Open);
    CloseIfOpen(socket);
    EXPECT_EQ(socket.state(), SocketState::Closed);
}

TEST_F(PortRoutines, CloseIfNotClosed_AnyOtherState_IsClosed) {
    for (const SocketState state :
         {SocketState::Open, SocketState::Listening, SocketState::Connecting,
          SocketState::Connected, SocketState::PeerClosing, SocketState::Error}) {
        socket.setState(state);
        CloseIfNotClosed(socket);
        EXPECT_EQ(socket.state(), SocketState::Closed) << static_cast<int>(state);
    }
}

TEST_F(PortRoutines, AcceptRequest_SocketInError_IsTakenOver) {
    server.far().setState(SocketState::Error);
    server.listen("", 2277);
    server.ConnectionRequest.connect([this](int id) { AcceptRequest(server, id); });
    server.knock(3);
    platform.events.runFor(1);
    EXPECT_EQ(server.client().state(), SocketState::Connected);
}

TEST_F(PortRoutines, TakeSocketData_WhatWaits_IsTaken) {
    connect();
    socket.arrive(std::string("a\0b", 3));
    std::string result;
    TakeSocketData(result, socket);
    EXPECT_EQ(result, std::string("a\0b", 3));
    EXPECT_EQ(socket.peekData(), "");
}

TEST_F(PortRoutines, SendSocket_NotConnected_SendsNothing) {
    SendSocketText(socket, "A");
    SendSocketBytes(socket, "B");
    EXPECT_EQ(socket.written(), "");
    connect();
    SendSocketText(socket, "A");
    SendSocketBytes(socket, "B");
    EXPECT_EQ(socket.written(), "AB");
}

}  // namespace
}  // namespace zel
