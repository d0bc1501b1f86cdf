// The platform on Qt over pseudo terminals and loopback sockets.

#include <fcntl.h>
#include <gtest/gtest.h>
#include <pty.h>
#include <termios.h>
#include <unistd.h>

#include <QDir>
#include <QFile>
#include <QTcpServer>
#include <QTcpSocket>
#include <QTemporaryDir>
#include <array>
#include <csignal>

#include "desktop/platform/QtPlatform.h"
#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

/// A pseudo terminal whose master the test holds.
class Terminal {
  public:
    Terminal() {
        std::array<char, 128> name{};
        int slave = -1;
        EXPECT_EQ(openpty(&master, &slave, name.data(), nullptr, nullptr), 0);
        termios raw{};
        tcgetattr(slave, &raw);
        cfmakeraw(&raw);
        tcsetattr(slave, TCSANOW, &raw);
        ::close(slave);
        path = name.data();
    }
    ~Terminal() { hangUp(); }
    Terminal(const Terminal&) = delete;
    Terminal& operator=(const Terminal&) = delete;
    void send(const std::string& bytes) const {
        EXPECT_EQ(::write(master, bytes.data(), bytes.size()), static_cast<ssize_t>(bytes.size()));
    }
    std::string received() const {
        std::array<char, 4096> buffer{};
        const ssize_t count = ::read(master, buffer.data(), buffer.size());
        return count > 0 ? std::string(buffer.data(), static_cast<std::size_t>(count)) : "";
    }
    void hangUp() {
        if (master >= 0) ::close(master);
        master = -1;
    }
    int master = -1;
    std::string path;
};

class OnQt : public testing::Test {
  protected:
    bool openPort(const std::string& name) {
        SerialSetup setup;
        setup.CommPort = name;
        setup.Settings = "57600,N,8,1";
        return platform.serialPort.open(setup);
    }
    QApplication& application = testApplication();  // before all that needs its event loop
    QTemporaryDir home;
    QtPlatform platform{home.path()};
};

TEST_F(OnQt, SerialPort_BytesOfAnEarlierSession_AreNotRead) {
    const Terminal line;
    const int held = ::open(line.path.c_str(), O_RDWR | O_NOCTTY);  // keeps them waiting
    ASSERT_GE(held, 0);
    line.send("9102,100234\r");
    ASSERT_TRUE(openPort(line.path));
    line.send("0\r");
    std::string bytes;
    for (int i = 0; i < 100 && bytes.find('\r') == std::string::npos; ++i) {
        platform.events.wait(10);
        bytes += platform.serialPort.input();
    }
    EXPECT_EQ(bytes, "0\r");
    platform.serialPort.close();
    ::close(held);
}

TEST_F(OnQt, SerialPort_WritesAndReadsBytes) {
    const Terminal line;
    ASSERT_TRUE(openPort(line.path)) << platform.serialPort.problem();
    platform.serialPort.output("GET\r");
    EXPECT_EQ(line.received(), "GET\r");
    line.send(std::string("0\r\0\xFF", 4));
    platform.events.wait(1000);
    EXPECT_EQ(platform.serialPort.input(), std::string("0\r\0\xFF", 4));
    EXPECT_EQ(platform.serialPort.input(), "");
}

TEST_F(OnQt, Wait_EndsWithTheFirstByteOfTheLine) {
    const Terminal line;
    ASSERT_TRUE(openPort(line.path));
    int waits = 0;
    platform.events.schedule(5, [&line] { line.send("0\r"); });
    std::string got;
    while (got.empty() && waits < 20) {
        platform.events.wait(60000);
        ++waits;
        got = platform.serialPort.input();
    }
    EXPECT_EQ(got, "0\r");
    EXPECT_LT(waits, 20);
}

/// How often a loop turns that waits `ms` milliseconds in all, 10 at a time.
int turnsIn(QtPlatform& platform, int ms) {
    const std::int64_t end = platform.clock.micros() + std::int64_t{ms} * 1000;
    int turns = 0;
    for (; platform.clock.micros() < end; ++turns) platform.events.wait(10);
    return turns;
}

TEST_F(OnQt, BytesThatNobodyTakes_EndNoFurtherWait) {
    const Terminal line;
    ASSERT_TRUE(openPort(line.path));
    line.send("0\r");
    turnsIn(platform, 20);
    EXPECT_LE(turnsIn(platform, 200), 30);
    // What comes then does, and finds its reader.
    platform.events.schedule(5, [&line] { line.send("1\r"); });
    const std::int64_t before = platform.clock.micros();
    platform.events.wait(60000);  // the task
    platform.events.wait(60000);  // the bytes
    EXPECT_LT(platform.clock.micros() - before, 30'000'000);
    EXPECT_EQ(platform.serialPort.input(), "0\r1\r");
}

TEST_F(OnQt, BytesThatNobodyTakesFromASocket_EndNoFurtherWait) {
    QTcpServer server;
    ASSERT_TRUE(server.listen(QHostAddress::LocalHost));
    platform.tcpSocket.connectTo("127.0.0.1", server.serverPort());
    for (int i = 0; i < 100 && platform.tcpSocket.state() != SocketState::Connected; ++i)
        platform.events.wait(50);
    QTcpSocket* const far = server.nextPendingConnection();
    ASSERT_NE(far, nullptr);
    // More than the buffer takes: the rest keeps the descriptor readable.
    far->write(QByteArray(3 << 20, '0'));
    turnsIn(platform, 300);
    EXPECT_LE(turnsIn(platform, 200), 30);
    EXPECT_GE(platform.tcpSocket.getData().size(), std::size_t{1} << 20);
}

TEST_F(OnQt, BytesThatTheLoopFetched_ComeAheadOfThoseOnTheLine) {
    const Terminal line;
    ASSERT_TRUE(openPort(line.path));
    line.send("first ");
    platform.events.sleep(10);
    platform.events.pump();  // the loop fetches what has come
    line.send("second");
    std::string got = platform.serialPort.input();
    for (int i = 0; i < 50 && got.size() < 12; ++i) {
        platform.events.wait(20);
        got += platform.serialPort.input();
    }
    EXPECT_EQ(got, "first second");
}

TEST_F(OnQt, FarEndThatCloses_ClosesThePortAndSaysSo) {
    Terminal line;
    ASSERT_TRUE(openPort(line.path));
    line.hangUp();
    for (int i = 0; i < 50 && platform.serialPort.isOpen(); ++i) {
        platform.events.wait(20);
        platform.serialPort.input();
    }
    EXPECT_FALSE(platform.serialPort.isOpen());
    EXPECT_NE(platform.serialPort.problem().find(line.path + " has gone"), std::string::npos);
    EXPECT_EQ(platform.serialPort.input(), "");
    platform.serialPort.output("nothing happens");
}

TEST_F(OnQt, LineThatTakesNothing_IsGivenUpAndClosedAtOnce) {
    const Terminal line;
    ASSERT_TRUE(openPort(line.path));
    platform.serialPort.setWriteTimeout(50);
    platform.serialPort.output(std::string(200'000, 'x'));
    EXPECT_GT(platform.serialPort.bytesToWrite(), 0U);
    for (int i = 0; i < 50 && platform.serialPort.bytesToWrite() > 0; ++i) platform.events.wait(20);
    EXPECT_EQ(platform.serialPort.bytesToWrite(), 0U);
    EXPECT_TRUE(platform.serialPort.isOpen());
    const std::int64_t before = platform.clock.micros();
    platform.serialPort.close();
    EXPECT_LT(platform.clock.micros() - before, 2'000'000);
}

TEST_F(OnQt, BothHandshakes_AreAskedOfThePort) {
    const Terminal line;
    SerialSetup setup;
    setup.CommPort = line.path;
    setup.Settings = "57600,N,8,1";
    setup.Handshaking = 3;
    ASSERT_TRUE(platform.serialPort.open(setup)) << platform.serialPort.problem();
    termios settings{};
    ASSERT_EQ(tcgetattr(line.master, &settings), 0);
    EXPECT_EQ(settings.c_iflag & (IXON | IXOFF), static_cast<tcflag_t>(IXON | IXOFF));
    EXPECT_EQ(settings.c_cflag & CRTSCTS, static_cast<tcflag_t>(CRTSCTS));
}

TEST_F(OnQt, PortThatIsNotThere_IsNamed) {
    EXPECT_FALSE(openPort("/dev/zel3-is-not-here"));
    EXPECT_EQ(platform.serialPort.problem(),
              "/dev/zel3-is-not-here is not there. Check the cable and the name of the port.");
}

TEST_F(OnQt, PortWithoutAName_AsksForOne) {
    EXPECT_FALSE(openPort(""));
    EXPECT_EQ(platform.serialPort.problem(),
              "No serial port is chosen. Choose one or type the name of a device.");
}

TEST_F(OnQt, FileThatIsNoPort_IsRefusedByName) {
    const QString file = home.filePath("notes.txt");
    QFile(file).open(QIODevice::WriteOnly);
    EXPECT_FALSE(openPort(file.toStdString()));
    EXPECT_EQ(platform.serialPort.problem().find(file.toStdString() + ": "), 0U)
        << platform.serialPort.problem();
    EXPECT_FALSE(platform.serialPort.isOpen());
}

TEST_F(OnQt, BaudRatesThatAreNone_AreNamed) {
    const Terminal line;
    for (const char* baud : {"", "fast", "0", "-9600", "99999999999"}) {
        SerialSetup setup;
        setup.CommPort = line.path;
        setup.Settings = std::string(baud) + ",N,8,1";
        EXPECT_FALSE(platform.serialPort.open(setup)) << baud;
        EXPECT_EQ(platform.serialPort.problem().find(line.path + " does not take the baud rate"),
                  0U)
            << baud << ": " << platform.serialPort.problem();
        platform.serialPort.close();
    }
}

TEST_F(OnQt, SecondThoughtsAfterAFailedOpen_FindThePortFree) {
    const Terminal line;
    EXPECT_FALSE(openPort("/dev/zel3-is-not-here"));
    EXPECT_TRUE(openPort(line.path)) << platform.serialPort.problem();
    EXPECT_EQ(platform.serialPort.problem(), "");
}

TEST_F(OnQt, Burst_ArrivesWhole) {
    const Terminal line;
    ASSERT_TRUE(openPort(line.path));
    std::string sent(60000, '\0');
    for (std::size_t i = 0; i < sent.size(); ++i) sent[i] = static_cast<char>(i * 7 % 251);
    std::string got;
    for (std::size_t at = 0; at < sent.size(); at += 3000) {
        line.send(sent.substr(at, 3000));
        platform.events.sleep(3);
        platform.events.pump();
        if (at % 9000 == 0) got += platform.serialPort.input();
    }
    for (int i = 0; i < 100 && got.size() < sent.size(); ++i) {
        platform.events.wait(20);
        got += platform.serialPort.input();
    }
    EXPECT_EQ(got, sent);
}

TEST_F(OnQt, Sleep_LastsItsTimeAndServesNoEvent) {
    bool ran = false;
    platform.events.schedule(3, [&ran] { ran = true; });
    const std::int64_t start = platform.clock.micros();
    platform.events.sleep(25);
    EXPECT_GE(platform.clock.micros() - start, 25000);
    EXPECT_FALSE(ran);
    for (int i = 0; i < 20 && !ran; ++i) platform.events.wait(5);
    EXPECT_TRUE(ran);
}

TEST_F(OnQt, Signal_IsAnEventAndCutsADelayShort) {
    std::string got;
    platform.endSignals.EndRequested.connect([&got](const std::string& name) { got = name; });
    std::raise(SIGTERM);
    const std::int64_t start = platform.clock.micros();
    platform.events.sleep(5000);
    EXPECT_LT(platform.clock.micros() - start, 2000000);
    for (int i = 0; i < 20 && got.empty(); ++i) platform.events.wait(5);
    EXPECT_EQ(got, "SIGTERM");
}

TEST_F(OnQt, PortHeldByAnother_IsNamed) {
    const Terminal line;
    ASSERT_TRUE(openPort(line.path));
    QtSerialPort second(platform.events);
    SerialSetup setup;
    setup.CommPort = line.path;
    setup.Settings = "57600,N,8,1";
    EXPECT_FALSE(second.open(setup));
    EXPECT_EQ(second.problem(),
              line.path + " is held by another program. Close it there and try again.");
}

TEST_F(OnQt, ScheduledTasks_RunByTheirTime) {
    std::string order;
    platform.events.schedule(20, [&] { order += "b"; });
    platform.events.schedule(1, [&] { order += "a"; });
    const TaskId cancelled = platform.events.schedule(5, [&] { order += "x"; });
    platform.events.cancel(cancelled);
    for (int i = 0; i < 200 && order.size() < 2; ++i) platform.events.wait(20);
    EXPECT_EQ(order, "ab");
}

TEST_F(OnQt, Sockets_CarryBytesBothWaysAndTellTheirState) {
    ServerSocket& listener = platform.serverSocket;
    Socket& server = listener.client();
    Socket& client = platform.tcpSocket;
    listener.listen("127.0.0.1", 0);
    ASSERT_EQ(listener.state(), SocketState::Listening) << listener.problem();
    const int port = listener.port();
    std::string from;
    listener.ConnectionRequest.connect([&](int id) {
        from = listener.peer(id);
        listener.accept(id);
    });
    EXPECT_EQ(client.state(), SocketState::Closed);
    client.connectTo("127.0.0.1", port);
    for (int i = 0; i < 200 && server.state() != SocketState::Connected; ++i)
        platform.events.wait(20);
    ASSERT_EQ(client.state(), SocketState::Connected);
    EXPECT_EQ(from, "127.0.0.1");
    EXPECT_TRUE(client.sendData("IDN?\r"));
    for (int i = 0; i < 200 && server.peekData().empty(); ++i) platform.events.wait(20);
    EXPECT_EQ(server.peekData(), "IDN?\r");
    EXPECT_EQ(server.getData(), "IDN?\r");
    EXPECT_EQ(server.getData(), "");
    client.close();
    EXPECT_EQ(client.state(), SocketState::Closed);
    EXPECT_FALSE(client.sendData("x"));
    for (int i = 0; i < 200 && server.state() == SocketState::Connected; ++i)
        platform.events.wait(20);
    EXPECT_NE(server.state(), SocketState::Connected);
}

TEST_F(OnQt, Sockets_BeforeTheirFirstUse_AreClosed) {
    Socket& client = platform.tcpSocket;
    ServerSocket& server = platform.serverSocket;
    EXPECT_EQ(client.state(), SocketState::Closed);
    EXPECT_FALSE(client.sendData("ID?"));
    EXPECT_EQ(client.peekData() + client.getData() + client.problem(), "");
    EXPECT_EQ(client.bytesToWrite(), 0U);
    client.close();
    EXPECT_EQ(client.state(), SocketState::Closed);
    EXPECT_EQ(server.state(), SocketState::Closed);
    EXPECT_EQ(server.client().state(), SocketState::Closed);
    EXPECT_EQ(server.peer(1) + server.problem(), "");
    EXPECT_FALSE(server.prove(1));
    server.accept(1);
    server.refuse(1);
    server.close();
    EXPECT_EQ(server.state(), SocketState::Closed);
    EXPECT_FALSE(server.localIP().empty());
}

TEST_F(OnQt, Socket_ToAPortWhereNobodyListens_EndsInError) {
    platform.tcpSocket.connectTo("127.0.0.1", 1);
    for (int i = 0; i < 200 && platform.tcpSocket.state() == SocketState::Connecting; ++i)
        platform.events.wait(20);
    EXPECT_EQ(platform.tcpSocket.state(), SocketState::Error);
}

TEST_F(OnQt, SettingsWrittenByHandWithACommaOrABlank_AreReadAsTheyStand) {
    platform.settings.set("ZELRemote", "DIRECTCON", "CommPort", "3");
    QFile file(home.filePath("user.ini"));
    ASSERT_TRUE(file.open(QIODevice::Append));
    file.write("DIRECTCON\\Label=Lab, upstairs\n");
    file.close();
    QtPlatform later(home.path());
    EXPECT_EQ(later.settings.get("ZELRemote", "DIRECTCON", "Label", ""), "Lab, upstairs");
}

TEST_F(OnQt, Settings_TextWithSignsOfAnIniFile_IsTheSameAfterwards) {
    for (const char* const text :
         {"a;b=c", " blanks ", "\"quoted\"", "#1", "50 \u03A9", "C:\\x", ""}) {
        platform.settings.set("ZELRemote", "DIRECTCON", "Label", text);
        EXPECT_EQ(platform.settings.get("ZELRemote", "DIRECTCON", "Label", "none"), text);
    }
}

TEST_F(OnQt, Settings_SurviveTheProgram) {
    platform.settings.set("ZELRemote", "DIRECTCON", "CommPort", "3");
    QtPlatform later(home.path());
    EXPECT_EQ(later.settings.get("ZELRemote", "DIRECTCON", "CommPort", "0"), "3");
    EXPECT_EQ(platform.settings.get("ZELRemote", "DIRECTCON", "absent", "R"), "R");
}

TEST_F(OnQt, Settings_ThatAreStoredAlready_AreNotWrittenAgain) {
    ASSERT_TRUE(platform.settings.set("ZELRemote", "DIRECTCON", "CommPort", "3"));
    QFile file(home.filePath("user.ini"));
    ASSERT_TRUE(file.open(QIODevice::ReadWrite));
    const QByteArray spaced = file.readAll().replace("CommPort=3", "CommPort = 3");
    file.resize(0);
    file.write(spaced);
    file.close();
    const auto bytes = [&] {
        EXPECT_TRUE(file.open(QIODevice::ReadOnly));
        const QByteArray all = file.readAll();
        file.close();
        return all;
    };
    EXPECT_TRUE(platform.settings.set("ZELRemote", "DIRECTCON", "CommPort", "3"));
    EXPECT_EQ(bytes(), spaced);
    EXPECT_TRUE(platform.settings.set("ZELRemote", "DIRECTCON", "CommPort", "4"));
    EXPECT_NE(bytes(), spaced);
}

TEST_F(OnQt, ApplicationFolder_GetsTheDevices_AndKeepsThoseOfTheUser) {
    const auto fileOf = [](const QString& path) {
        QFile file(path);
        EXPECT_TRUE(file.open(QIODevice::ReadOnly)) << path.toStdString();
        return file.readAll();
    };
    const QString path = home.filePath("settings.ini");
    const QByteArray given = fileOf(":/defaults/settings.ini");
    ASSERT_FALSE(given.isEmpty());
    EXPECT_EQ(fileOf(path), given);
    const auto startAgainWith = [&](const QByteArray& text) {
        QFile file(path);
        EXPECT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(text);
        file.close();
        const QtApplicationFolder again(home.path());
        return fileOf(path);
    };
    EXPECT_EQ(startAgainWith("[DEVICES]\n"), "[DEVICES]\n");
    EXPECT_EQ(startAgainWith(""), given);  // a computer that lost its power after the first start
    EXPECT_TRUE(QFile::permissions(path).testFlag(QFile::WriteOwner));
}

TEST(QtSerialPortList, NamesThePortsOfTheKernelsList) {
    QTemporaryDir folder;
    const auto add = [&](const QString& name, const char* type) {
        QDir().mkpath(folder.filePath(name));
        if (!name.startsWith("tty0") && !name.startsWith("rf"))
            QDir().mkpath(folder.filePath(name + "/device"));
        QFile file(folder.filePath(name + "/type"));
        if (type == nullptr || !file.open(QIODevice::WriteOnly)) return;
        file.write(type);
    };
    add("tty0", nullptr);  // a console
    add("ttyS0", "4\n");   // with a chip
    add("ttyS1", "0\n");   // without
    add("ttyUSB10", nullptr);
    add("ttyUSB2", nullptr);
    add("rfcomm0", nullptr);  // a radio link has no device
    EXPECT_EQ(
        QtSerialPortList(folder.path()).names(),
        (std::vector<std::string>{"/dev/rfcomm0", "/dev/ttyUSB2", "/dev/ttyUSB10", "/dev/ttyS0"}));
}

}  // namespace
}  // namespace zel
