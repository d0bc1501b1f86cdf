#include <gtest/gtest.h>

#include "ZELSim/InProcessPort.h"
#include "platform/virtual/VirtualPlatform.h"
#include "shell/Logs.h"
#include "shell/Program.h"
#include "support/Text.h"

namespace zel {
namespace {

/// A program at a simulated instrument, with its files in memory.
struct LogsTest : ::testing::Test {
    LogsTest() {
        platform.folder.folder = "/home";
        platform.files.putFolder("/home");
        platform.ports.ports = {"SIM"};
    }
    void session(const std::string& words) {
        Program program(platform.bundle(port), words);
        program.start();
        program.connect({LinkAddress::Kind::Serial, "SIM", 57600}, true);
        program.disconnect();
    }
    std::string log() const { return platform.files.bytes("/home/debug.log"); }

    VirtualPlatform platform;
    zelsim::InProcessPort port{platform.clock, platform.events};
};

TEST_F(LogsTest, WordButton_LogsTheTextsOfTheLine) {
    session("x button");
    EXPECT_TRUE(contains(log(), ":-> GET\r\n"));
    EXPECT_TRUE(contains(log(), ":-> IDN?\r\n")) << log().substr(0, 400);
    EXPECT_TRUE(contains(log(), "Marlow&Tenby")) << log().substr(0, 400);
    for (const std::string& line : split(log(), '\n')) {
        if (line.empty()) continue;
        EXPECT_TRUE(contains(line, ":-> ") || contains(line, ":<- ")) << line;
        EXPECT_LT(line.size(), 200U);
    }
}

TEST_F(LogsTest, WithoutTheWord_NothingIsLoggedAndTheOldLogGoes) {
    platform.files.put("/home/debug.log", "old");
    session("");
    EXPECT_FALSE(platform.files.has("/home/debug.log"));
}

TEST_F(LogsTest, FolderThatRefuses_DisturbsNothing) {
    platform.files.refuse("/home", "Read-only file system");
    session("BUTTON");
    EXPECT_EQ(log(), "");
    EXPECT_TRUE(platform.boxes.texts().empty());
}

TEST(LoggedText, LineEndsAndPins_AreShownAsSigns) {
    EXPECT_EQ(loggedText("-> GET\r"), "-> GET");
    EXPECT_EQ(loggedText("<-0\r1500\r\n"), "<- 0\\r1500");
    EXPECT_EQ(loggedText("<-10 \xB5s\r"), "<- 10 µs");
    EXPECT_EQ(loggedText("-> AT+CPIN=1234\r"), "-> AT+CPIN=****");
    EXPECT_EQ(loggedText("-> at+cpin=1234\rx"), "-> at+cpin=****");
    EXPECT_EQ(loggedText(std::string("<-0\r\0\x01\xFF\x7F", 8)), "<- 6 bytes");
    EXPECT_EQ(loggedText(""), "");
}

TEST_F(LogsTest, StructuredLog_WritesAFileInServerModeOnly) {
    VirtualPlatform other;
    other.folder.folder = "/home";
    other.files.putFolder("/home");
    Program quiet(other.bundle(), "");
    EXPECT_TRUE(quiet.logs().rootDebug.Initialized);
    EXPECT_FALSE(quiet.logs().rootDebug.FileLogEnabled);
    Program server(other.bundle(), "Server");
    EXPECT_TRUE(server.logs().rootDebug.FileLogEnabled);
    EXPECT_TRUE(server.logs().rootDebug.FileTimeStamping);
    server.logs().rootDebug.LogMessage(1, "Listen", "listening");
    EXPECT_EQ(other.files.list("/home").size(), 1U);
}

}  // namespace
}  // namespace zel
