#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <iterator>

#include "platform/virtual/ScriptedPort.h"
#include "platform/virtual/ScriptedSocket.h"
#include "platform/virtual/VirtualFiles.h"
#include "platform/virtual/VirtualTime.h"
#include "support/RecordedPort.h"
#include "support/SessionLog.h"
#include "support/Text.h"

namespace zel {
namespace {

using Kind = SessionEvent::Kind;

TEST(SessionText, Event_IsALineThatIsReadBack) {
    const SessionEvent event{1'000'042, Kind::Sent, std::string("GE\r\0\xFF|", 6)};
    const std::string line = sessionLine(event);
    EXPECT_EQ(line, "1.000042 > 47 45 0D 00 FF 7C |GE...||");
    const SessionRecord record = parseSession("0.000000 start x\n" + line + "\n2.000000 closed\n");
    EXPECT_EQ(record.problem, "");
    ASSERT_EQ(record.events.size(), 3U);
    EXPECT_EQ(record.events[1].text, event.text);
    EXPECT_EQ(record.events[1].micros, event.micros);
    EXPECT_EQ(record.numbers[1], 2);
}

TEST(SessionText, TextsWithLineEnds_StayOnOneLine) {
    const SessionEvent event{0, Kind::Input, "type A \\n\r\nx"};
    const std::string line = sessionLine(event);
    EXPECT_EQ(line, "0.000000 input type A \\\\n\\r\\nx");
    const SessionRecord record = parseSession("0.000000 start\n" + line + "\n0.000000 closed\n");
    ASSERT_EQ(record.events.size(), 3U);
    EXPECT_EQ(record.events[1].text, event.text);
}

TEST(SessionText, LogCutAnywhere_IsSaidToBe) {
    const std::string whole =
        "0.000000 start panel\n0.000001 open sim:\n0.000002 > 0D |.|\n0.000003 closed\n";
    EXPECT_EQ(parseSession(whole).problem, "");
    EXPECT_EQ(parseSession(whole.substr(0, whole.size() - 1)).problem, "") << "only the line end";
    for (std::size_t length = 0; length + 1 < whole.size(); ++length)
        EXPECT_NE(parseSession(whole.substr(0, length)).problem, "") << length;
}

TEST(SessionText, RecordedLogCutAtAnyLength_IsSaidToBeAndKeepsWhatWasWhole) {
    std::ifstream file(ZEL_SOURCE_DIR "/tests/replays/late_in_handshake.log", std::ios::binary);
    const std::string whole((std::istreambuf_iterator<char>(file)), {});
    ASSERT_GT(whole.size(), 2000U);
    const SessionRecord all = parseSession(whole);
    ASSERT_EQ(all.problem, "");
    for (std::size_t length = 2; length + 1 < whole.size(); ++length) {
        const std::string_view cut(whole.data(), length);
        const SessionRecord record = parseSession(cut);
        // The port was closed there: up to that place it is a whole session.
        const auto last = cut.substr(std::min(cut.rfind('\n', length - 2) + 1, length));
        if (!contains(last, " closed")) {
            ASSERT_NE(record.problem, "") << length;
        }
        // A line that was cut is damaged, or a shorter one that nobody can know to be cut.
        const auto lines = static_cast<std::size_t>(std::count(cut.begin(), cut.end(), '\n'));
        ASSERT_GE(record.events.size() + 1, lines) << length;
        for (std::size_t i = 0; i + 1 < record.events.size(); ++i)
            ASSERT_EQ(record.events[i].text, all.events[i].text) << length;
    }
}

TEST(SessionText, DamagedLines_AreNamed) {
    for (const char* line :
         {"x", "0.0 closed", "0.000000 shut", "0.000000 > 4 |.|", "0.000000 > 41 |AB|",
          "0.000000 > 41", "0.000000 > |.|", "-1.000000 closed", "99999999999999.000000 closed"})
        EXPECT_EQ(
            parseSession("0.000000 start\n" + std::string(line) + "\n0.000000 closed\n").problem,
            "line 2 is damaged")
            << line;
    EXPECT_EQ(parseSession("0.000000 start\n1.000000 open x\n0.500000 closed\n").problem,
              "line 3 is damaged")
        << "time goes on";
    EXPECT_EQ(parseSession("0.000000 closed\n").problem, "it does not begin with \"start\"");
}

TEST(SessionText, Arguments_ComeBackFromTheirLine) {
    const std::vector<std::string> arguments = {"--words", "A B", "", "say \"hi\"", "plain"};
    EXPECT_EQ(joinArguments(arguments), "--words \"A B\" \"\" \"say \"\"hi\"\"\" plain");
    EXPECT_EQ(splitArgumentLine(joinArguments(arguments)), arguments);
}

TEST(WithoutPins, DigitsOfAPin_AreStars) {
    EXPECT_EQ(withoutPins("", "AT+CPIN=1234\r"), "AT+CPIN=****\r");
    EXPECT_EQ(withoutPins("", "at+cpin=\"1234\"\r"), "at+cpin=\"****\"\r");
    EXPECT_EQ(withoutPins("AT+CPIN=12", "34\rATD56"), "**\rATD56");
    EXPECT_EQ(withoutPins("", "ATD1234\r"), "ATD1234\r");
}

struct SessionLogTest : ::testing::Test {
    SessionLogTest() { files.putFolder("/logs"); }
    std::string text() const { return files.bytes("/logs/a.log"); }

    VirtualClock clock;
    VirtualEvents events{clock};
    VirtualFiles files{clock};
    SessionLog log{clock, files};
};

TEST_F(SessionLogTest, Port_LeavesItsBytesAndEventsInTheLog) {
    ScriptedPort inner(events);
    RecordedPort port(inner, log);
    inner.expect("GET\r").answer("0\r");
    clock.advance(5);
    ASSERT_EQ(log.begin("/logs/a.log", "panel"), "");
    SerialSetup setup;
    setup.CommPort = "/dev/ttyUSB0";
    setup.Settings = "57600,N,8,1";
    ASSERT_TRUE(port.open(setup));
    clock.advance(1);
    port.output("GET\r");
    events.runFor(10);
    EXPECT_EQ(port.input(), "0\r");
    EXPECT_EQ(port.input(), "");
    port.close();
    log.end();
    EXPECT_EQ(parseSession(text()).problem, "");
    const std::vector<std::string> lines = split(text(), '\n');
    EXPECT_EQ(lines[0], "0.000000 start panel");
    EXPECT_EQ(lines[1], "0.000000 open serial:/dev/ttyUSB0@57600");
    EXPECT_EQ(lines[2], "0.001000 > 47 45 54 0D |GET.|");
    EXPECT_TRUE(contains(lines[3], " < 30 0D |0.|"));
    EXPECT_TRUE(contains(lines[4], " closed"));
    EXPECT_EQ(lines.size(), 6U) << "no second end after that of the port";
}

TEST_F(SessionLogTest, Socket_LeavesItsBytesAndEventsInTheLog) {
    ScriptedSocket inner(events);
    RecordedSocket socket(inner, log);
    ASSERT_EQ(log.begin("/logs/a.log", "panel"), "");
    socket.connectTo("::1", 2277);
    events.runFor(10);
    inner.expect("A").answer("B");
    EXPECT_TRUE(socket.sendData("A"));
    events.runFor(10);
    EXPECT_EQ(socket.peekData(), "B");
    EXPECT_EQ(socket.getData(), "B");
    socket.close();
    log.end();
    EXPECT_TRUE(contains(text(), "open tcp:[::1]:2277\n"));
    EXPECT_TRUE(contains(text(), "> 41 |A|\n"));
    EXPECT_TRUE(contains(text(), "< 42 |B|\n"));
}

TEST_F(SessionLogTest, SocketThatIsRefused_WasNeverOpen) {
    ScriptedSocket inner(events);
    RecordedSocket socket(inner, log);
    ASSERT_EQ(log.begin("/logs/a.log", "panel"), "");
    inner.connectsTo(SocketState::Error);
    socket.connectTo("127.0.0.1", 2277);
    events.runFor(10);
    socket.close();
    log.end();
    EXPECT_EQ(text(), "0.000000 start panel\n0.010000 closed\n");
}

TEST_F(SessionLogTest, FileThatCannotBeMade_IsSaidAndNothingIsWritten) {
    EXPECT_EQ(log.begin("/none/a.log", "x"),
              "The file /none/a.log cannot be written: No such file or directory");
    EXPECT_FALSE(log.writing());
    files.refuse("/logs", "Read-only file system");
    EXPECT_NE(log.begin("/logs/a.log", "x"), "");
    files.putFolder("/logs/folder");
    EXPECT_NE(log.begin("/logs/folder", "x"), "");
}

TEST_F(SessionLogTest, DiskThatFillsUp_EndsTheLogOnce) {
    std::vector<std::string> failed;
    log.Failed.connect([&](const std::string& why) { failed.push_back(why); });
    ASSERT_EQ(log.begin("/logs/a.log", "x"), "");
    files.room = 0;
    log.clicked("A");
    log.clicked("B");
    EXPECT_EQ(failed.size(), 1U);
    EXPECT_FALSE(log.writing());
    EXPECT_EQ(text(), "0.000000 start x\n");
}

TEST_F(SessionLogTest, LastEvents_AreKeptWithoutAFile) {
    for (int i = 0; i < 250; ++i) log.clicked("Key(" + std::to_string(i) + ")");
    const std::vector<std::string> lines = log.lastLines();
    ASSERT_EQ(lines.size(), 200U);
    EXPECT_EQ(lines.back(), "0.000000 click Key(249)");
    log.came(std::string(2409, 'x'));
    EXPECT_TRUE(contains(log.lastLines().back(), "| ... 2409 bytes"));
    EXPECT_LT(log.lastLines().back().size(), 300U);
}

TEST_F(SessionLogTest, LogBegunInASession_HoldsTheSessionFromItsStart) {
    clock.advance(1);
    log.input("connect");
    log.opened("serial:A@57600");
    log.sent("GET\r");
    clock.advance(1);
    ASSERT_EQ(log.begin("/logs/a.log", "x"), "");
    log.clicked("SpanButton");
    log.end();
    const std::string session =
        "0.000000 start x\n0.001000 input connect\n0.001000 open serial:A@57600\n"
        "0.001000 > 47 45 54 0D |GET.|\n0.002000 click SpanButton\n";
    EXPECT_EQ(text(), session + "0.002000 closed\n");
    // The end of a record is no event: the port is still open in the next one.
    clock.advance(1);
    ASSERT_EQ(log.begin("/logs/a.log", "x"), "");
    log.closed();
    log.end();
    EXPECT_EQ(text(), session + "0.003000 closed\n");
    EXPECT_TRUE(log.whole());
}

TEST_F(SessionLogTest, LogBegunInAVeryLongSession_SaysWhatIsOpen) {
    log.opened("serial:A@57600");
    const std::string block(100'000, 'x');
    for (int i = 0; i < 70; ++i) log.came(block);
    EXPECT_TRUE(log.whole());
    for (int i = 0; i < 20; ++i) log.came(block);
    EXPECT_FALSE(log.whole());
    for (int i = 0; i < 300; ++i) log.clicked("A");
    EXPECT_EQ(log.lastLines().size(), SessionLog::kKept);
    clock.advance(1);
    ASSERT_EQ(log.begin("/logs/a.log", "x"), "");
    log.end();
    EXPECT_EQ(text(), "0.000000 start x\n0.000000 open serial:A@57600\n0.000000 closed\n");
}

}  // namespace
}  // namespace zel
