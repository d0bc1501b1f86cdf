#include <gtest/gtest.h>

#include "ZELSim/InProcessPort.h"
#include "connection/Doctor.h"
#include "platform/virtual/VirtualPlatform.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr const char* kPath = "/dev/ttyUSB0";

struct DoctorTest : ::testing::Test {
    DoctorTest() {
        platform.portProbe.known = {{kPath, "Maker", "Adapter", "A123"}};
        platform.portProbe.rights[kPath] = {
            .exists = true, .terminal = true, .usable = true, .group = {}};
        platform.portProbe.lines[kPath] = {.cts = true};
    }
    /// The findings by name, at a port of the test's choice.
    std::string look(SerialPort& port, std::optional<LinkAddress> address) {
        Doctor doctor(
            {platform.portProbe, port, platform.tcpSocket, platform.clock, platform.events});
        std::string text;
        well = doctor.examine(address, [&](const Finding& finding) {
            text += findingLine(finding) + "\n";
            if (finding.grade != Finding::Grade::Ok) {
                EXPECT_NE(finding.remedy, "");
            }
        });
        return text;
    }
    std::string look(int baud = 57600) {
        return look(platform.port, LinkAddress{LinkAddress::Kind::Serial, kPath, baud});
    }
    bool wrote() const { return !platform.port.written().empty(); }

    VirtualPlatform platform;
    bool well = false;
};

TEST_F(DoctorTest, InstrumentAtTheRightSpeed_IsFound) {
    zelsim::InProcessPort port(platform.clock, platform.events, {}, {.baud = 57600});
    EXPECT_EQ(look(port, LinkAddress{LinkAddress::Kind::Serial, kPath, 57600}),
              "ok device: /dev/ttyUSB0: Maker Adapter, serial number A123\n"
              "ok rights: /dev/ttyUSB0 may be read and written\n"
              "ok holder: no program holds /dev/ttyUSB0\n"
              "ok lines: CTS on, DSR off, DCD off, RI off\n"
              "ok loopback: nothing of what was sent came back\n"
              "ok search: an instrument answers at 57600 baud: "
              "Marlow&Tenby,9102,100234,V2.31\n");
    EXPECT_TRUE(well);
    EXPECT_FALSE(port.isOpen());
}

TEST_F(DoctorTest, InstrumentAtAnotherSpeed_IsFoundWithTheRemedy) {
    zelsim::InProcessPort port(platform.clock, platform.events, {}, {.baud = 38400});
    const std::string text = look(port, LinkAddress{LinkAddress::Kind::Serial, kPath, 57600});
    EXPECT_TRUE(contains(text, "warning search: an instrument answers at 38400 baud")) << text;
    EXPECT_TRUE(contains(text, "; Choose 38400 baud for the connection.\n")) << text;
    EXPECT_TRUE(well);
}

TEST_F(DoctorTest, SilentLine_IsAFault) {
    platform.port.expect("\r");
    EXPECT_TRUE(contains(look(),
                         "fault search: no instrument answers; what came at each speed: "
                         "57600 nothing, 115200 nothing"));
    EXPECT_FALSE(well);
}

TEST_F(DoctorTest, PortThatIsHeld_IsNotWrittenTo) {
    platform.portProbe.held[kPath] = {{{4711, "minicom", false}}, true};
    const std::string text = look();
    EXPECT_TRUE(contains(text,
                         "fault holder: /dev/ttyUSB0 is held by minicom (process 4711); Close "
                         "minicom, then run the doctor again.\n"));
    EXPECT_FALSE(contains(text, "search"));
    EXPECT_FALSE(wrote());
    EXPECT_FALSE(well);
}

/// A holder that comes while the port is being opened.
struct LateHolder : FixedProbe {
    int asked = 0;
    PortHolders holders(const std::string&) override {
        if (++asked < 2) return {};
        return {{{4711, "minicom", false}}, true};
    }
};

TEST_F(DoctorTest, HolderThatComesInBetween_IsNotDisturbed) {
    LateHolder probe;
    probe.known = platform.portProbe.known;
    probe.rights = platform.portProbe.rights;
    Doctor doctor({probe, platform.port, platform.tcpSocket, platform.clock, platform.events});
    std::string text;
    EXPECT_FALSE(doctor.examine(LinkAddress{LinkAddress::Kind::Serial, kPath, 57600},
                                [&](const Finding& f) { text += findingLine(f) + "\n"; }));
    EXPECT_TRUE(contains(text, "fault open:")) << text;
    EXPECT_FALSE(wrote());
    EXPECT_FALSE(platform.port.isOpen());
}

TEST_F(DoctorTest, PortThatDoesNotOpen_IsAFaultWithTheRemedyForIt) {
    platform.port.failOpen("/dev/tty.x. y is held by another program. Close it there.");
    const LinkAddress odd{LinkAddress::Kind::Serial, "/dev/tty.x. y", 57600};
    platform.portProbe.rights[odd.port] = platform.portProbe.rights[kPath];
    EXPECT_TRUE(contains(look(platform.port, odd),
                         "fault open: /dev/tty.x. y is held by another program; Close the program "
                         "that uses the port, then run the doctor again.\n"));
    platform.port.failOpen("/dev/ttyUSB0: Input/output error");
    EXPECT_TRUE(contains(look(), "fault open: /dev/ttyUSB0: Input/output error; Plug the "));
    EXPECT_FALSE(wrote());
}

TEST_F(DoctorTest, OwnSession_IsLeftAlone) {
    SerialSetup setup;
    setup.CommPort = kPath;
    platform.port.open(setup);
    EXPECT_TRUE(contains(look(), "ok port: a session is under way on the serial port"));
    EXPECT_TRUE(platform.port.isOpen());
    EXPECT_FALSE(wrote());
}

TEST_F(DoctorTest, MissingRights_NameTheGroup) {
    PortAccess& access = platform.portProbe.rights[kPath];
    access.usable = false;
    access.group = "dialout";
    EXPECT_TRUE(contains(look(),
                         "fault rights: no rights to use /dev/ttyUSB0; Add yourself to the "
                         "group \"dialout\""));
    access.member = true;
    EXPECT_TRUE(contains(look(), "; Log out and in again, so that your group \"dialout\""));
    access.group = "";
    EXPECT_TRUE(contains(look(), "; Install the udev rule"));
    EXPECT_FALSE(wrote());
}

TEST_F(DoctorTest, WhatIsNoPort_IsSaid) {
    platform.portProbe.rights[kPath].terminal = false;
    EXPECT_TRUE(contains(look(), "fault port: /dev/ttyUSB0 is no serial port"));
    platform.portProbe.rights[kPath].exists = false;
    EXPECT_TRUE(contains(look(), "fault port: /dev/ttyUSB0 is not there"));
}

TEST_F(DoctorTest, ModemManagersAndLinesThatAreOff_AreWarnings) {
    platform.portProbe.managers = {"ModemManager"};
    platform.portProbe.lines[kPath] = {};
    platform.portProbe.held[kPath] = {{}, false};
    const std::string text = look();
    EXPECT_TRUE(contains(text, "warning manager: ModemManager runs"));
    EXPECT_TRUE(contains(text, "warning lines: CTS off, DSR off, DCD off, RI off; Check"));
    EXPECT_TRUE(contains(text, "ok holder: no program that this user may look at holds"));
}

/// Gives back what is sent.
struct EchoPort : SerialPort {
    std::string bytes;
    bool is = false;
    bool open(const SerialSetup&) override { return is = true; }
    void close() override { is = false; }
    bool isOpen() const override { return is; }
    std::string input() override { return std::exchange(bytes, {}); }
    void output(std::string_view sent) override { bytes += sent; }
    std::string problem() const override { return {}; }
};

TEST_F(DoctorTest, LoopbackPlug_IsFound) {
    EchoPort port;
    const std::string text = look(port, LinkAddress{LinkAddress::Kind::Serial, kPath, 57600});
    EXPECT_TRUE(contains(text,
                         "warning loopback: what was sent to /dev/ttyUSB0 came back as it "
                         "was; Take the loopback plug off"))
        << text;
}

TEST_F(DoctorTest, NoDeviceAndNoAddress_IsAWarning) {
    platform.portProbe.known.clear();
    EXPECT_EQ(
        look(platform.port, std::nullopt),
        "warning device: no serial port was found; Plug the cable in, or type the name of the "
        "device.\n");
    EXPECT_TRUE(well);
}

TEST_F(DoctorTest, OfManyPorts_AllAreNamedAndFourAreExamined) {
    platform.portProbe.known.clear();
    for (const char* path : {"/dev/a", "/dev/b", "/dev/c", "/dev/d", "/dev/e"}) {
        platform.portProbe.known.push_back({path, "", "", ""});
        platform.portProbe.rights[path] = platform.portProbe.rights[kPath];
    }
    const std::string text = look(platform.port, std::nullopt);
    EXPECT_TRUE(contains(text, "ok device: /dev/e: no maker is known, no serial number\n"));
    EXPECT_TRUE(contains(text, "ok rights: /dev/d may be read and written\n"));
    EXPECT_FALSE(contains(text, "ok rights: /dev/e"));
}

TEST_F(DoctorTest, ServerThatAnswers_IsFound) {
    platform.tcpSocket.expect("\r");
    platform.tcpSocket.expect("GET\r").answer("0\r");
    platform.tcpSocket.expect("IDN?\r").answer("0\rMarlow&Tenby,9102,1,V1\r");
    EXPECT_EQ(look(platform.port, LinkAddress{LinkAddress::Kind::Tcp, "host", 2277}),
              "ok reach: host:2277 can be reached\n"
              "ok server: a server with an instrument answers: Marlow&Tenby,9102,1,V1\n");
    EXPECT_TRUE(well);
    EXPECT_EQ(platform.tcpSocket.state(), SocketState::Closed);
}

TEST_F(DoctorTest, AnswerToAnExchangeOfSomebodyElse_IsAskedOnceMore) {
    platform.tcpSocket.expect("\r");
    platform.tcpSocket.expect("GET\r").answer("2\r");
    platform.tcpSocket.expect("GET\r").answer("0\r");
    platform.tcpSocket.expect("IDN?\r").answer("0\rMarlow&Tenby,9102,1,V1\r");
    EXPECT_TRUE(contains(look(platform.port, LinkAddress{LinkAddress::Kind::Tcp, "host", 2277}),
                         "ok server: a server with an instrument answers: Marlow"));
}

TEST_F(DoctorTest, ServerThatCannotBeReached_IsAFault) {
    platform.tcpSocket.connectsTo(SocketState::Error);
    platform.tcpSocket.setProblem("Connection refused.");
    EXPECT_TRUE(contains(look(platform.port, LinkAddress{LinkAddress::Kind::Tcp, "host", 2277}),
                         "fault reach: host:2277 cannot be reached: Connection refused; Check"));
    platform.tcpSocket.setProblem("");
    platform.tcpSocket.connectsTo(SocketState::Connecting);
    const std::int64_t begun = platform.clock.micros();
    EXPECT_TRUE(contains(look(platform.port, LinkAddress{LinkAddress::Kind::Tcp, "host", 2277}),
                         "fault reach: host:2277 cannot be reached: no answer within 5 s; Check"));
    EXPECT_TRUE(
        contains(look(platform.port, LinkAddress{LinkAddress::Kind::Tls, "::1", 2277}),
                 "fault reach: [::1]:2277 cannot be reached: no TLS handshake within 5 s; Check"));
    EXPECT_LT(platform.clock.micros() - begun, 11'000'000);
    EXPECT_FALSE(well);
}

/// An examination that is left while it waits for an answer finds nothing more.
TEST_F(DoctorTest, ExaminationThatIsLeft_NamesNoFault) {
    const LinkAddress addresses[] = {
        {LinkAddress::Kind::Serial, kPath, 57600},
        {LinkAddress::Kind::Tcp, "host", 2277},
        {LinkAddress::Kind::TwoModems, kPath, 57600, "123", {}},
    };
    for (const LinkAddress& address : addresses) {
        Doctor doctor({platform.portProbe, platform.port, platform.tcpSocket, platform.clock,
                       platform.events});
        platform.events.schedule(100, [&doctor] { doctor.stop(); });
        const std::int64_t begun = platform.clock.micros();
        EXPECT_TRUE(doctor.examine(address, [](const Finding& finding) {
            EXPECT_EQ(finding.grade, Finding::Grade::Ok) << findingLine(finding);
        }));
        EXPECT_LT(platform.clock.micros() - begun, 200'000);
        EXPECT_FALSE(platform.port.isOpen());
        EXPECT_EQ(platform.tcpSocket.state(), SocketState::Closed);
    }
}

TEST_F(DoctorTest, ServerWithoutAnAnswer_IsAFault) {
    platform.tcpSocket.expect("\r");
    platform.tcpSocket.expect("GET\r").silence();
    EXPECT_TRUE(contains(look(platform.port, LinkAddress{LinkAddress::Kind::Tcp, "host", 2277}),
                         "fault server: nothing answers at host:2277; Check"));
}

TEST_F(DoctorTest, EachAnswer_IsAwaitedForItsOwnTime) {
    const auto duration = [this](const LinkAddress& address) {
        const std::int64_t begun = platform.clock.micros();
        look(platform.port, address);
        return (platform.clock.micros() - begun) / 1000;
    };
    const LinkAddress server{LinkAddress::Kind::Tcp, "host", 2277};
    platform.tcpSocket.expect("\r");
    platform.tcpSocket.expect("GET\r").silence();
    EXPECT_EQ(duration(server), 300 + 600);
    platform.tcpSocket.expect("\r");
    platform.tcpSocket.expect("GET\r").answer("0\r");
    platform.tcpSocket.expect("IDN?\r").silence();
    EXPECT_EQ(duration(server), 300 + 1500);
    // Five speeds, and nothing at any of them.
    EXPECT_EQ(duration({LinkAddress::Kind::Serial, kPath, 57600}), 5 * (300 + 600));
    EXPECT_EQ(duration({LinkAddress::Kind::TwoModems, kPath, 57600, "123", {}}), 2000);
    platform.tcpSocket.connectsTo(SocketState::Connecting);
    EXPECT_EQ(duration(server), 5000);
}

TEST_F(DoctorTest, BytesThatAreNoAnswer_AreShownTwelveAtMost) {
    const auto came = [this](const char* bytes) {
        platform.tcpSocket.expect("\r").answer(bytes);
        platform.tcpSocket.expect("GET\r").silence();
        const std::string text =
            look(platform.port, LinkAddress{LinkAddress::Kind::Tcp, "host", 2277});
        const std::size_t start = text.find("what came: ");
        return start == std::string::npos ? text
                                          : text.substr(start, text.find(';', start) - start);
    };
    EXPECT_EQ(came("ABCDEFGHIJKL"), "what came: 41 42 43 44 45 46 47 48 49 4A 4B 4C");
    EXPECT_EQ(came("ABCDEFGHIJKLM"), "what came: 41 42 43 44 45 46 47 48 49 4A 4B 4C ...");
}

}  // namespace
}  // namespace zel
