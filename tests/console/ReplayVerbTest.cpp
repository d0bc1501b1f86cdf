// Sessions that are recorded and run again by the console, whole and cut.

#include "support/ExitStatus.h"
#include "support/SessionText.h"
#include "tests/console/ToolRun.h"

namespace zel {
namespace {

struct ReplayVerbTest : ToolRun {
    /// The log of a session that reads a few settings.
    std::string recorded() {
        const std::string path = folder.file("session.log");
        EXPECT_EQ(runConnected({"--log", path, "get", "FREQ"}), kDone);
        return folder.read("session.log");
    }
};

TEST_F(ReplayVerbTest, RecordedVerb_PrintsTheSameAgain) {
    const std::string whole = recorded();
    EXPECT_EQ(parseSession(whole).problem, "");
    const std::string printed = out.str();
    EXPECT_FALSE(printed.empty());
    EXPECT_EQ(run({"replay", folder.file("session.log")}), kDone);
    EXPECT_EQ(out.str(), printed);
    EXPECT_EQ(errors.str(), "");
}

TEST_F(ReplayVerbTest, LogCutAnywhere_IsSaidToBeAndEndsWithOne) {
    const std::string whole = recorded();
    constexpr std::size_t kStep = 29;  // no divisor of a line's length: places of every kind
    for (std::size_t length = 0; length + 1 < whole.size(); length += kStep) {
        folder.write("cut.log", whole.substr(0, length));
        ASSERT_EQ(run({"replay", folder.file("cut.log")}), kLinkFailed) << length;
        ASSERT_NE(errors.str().find("cut.log: "), std::string::npos) << length << errors.str();
    }
}

TEST_F(ReplayVerbTest, ChangedByte_IsNamedWithItsLine) {
    std::string log = recorded();
    const auto sent = log.rfind("|FREQ.|");
    ASSERT_NE(sent, std::string::npos);
    const auto hex = log.rfind("46 52 45 51 0D", sent);
    ASSERT_NE(hex, std::string::npos);
    log.replace(hex, 2, "47");
    folder.write("other.log", log);
    EXPECT_EQ(run({"replay", folder.file("other.log")}), kLinkFailed);
    EXPECT_NE(errors.str().find(" differs: 46 instead of 47"), std::string::npos) << errors.str();
    EXPECT_NE(out.str().find("> 47 52 45 51 0D |FREQ.|"), std::string::npos) << out.str();
}

TEST_F(ReplayVerbTest, ConnectionThatWasRefused_IsRefusedAgain) {
    folder.write("refused.log", "0.000000 start --connect tcp:127.0.0.1:1 info\n0.100000 closed\n");
    EXPECT_EQ(run({"replay", folder.file("refused.log")}), kDone) << errors.str();
    EXPECT_EQ(out.str(), "");
    EXPECT_NE(errors.str().find("no instrument was connected"), std::string::npos) << errors.str();
}

TEST_F(ReplayVerbTest, WordsOfAWindow_HoldAgain) {
    folder.write("window.log",
                 "0.000000 start zelremote --home /h --words \"NOHEADER x\" --log a.log button\n"
                 "0.000001 input show DebugIt.STAT\n0.000002 closed\n");
    EXPECT_EQ(run({"replay", folder.file("window.log")}), kDone) << errors.str();
    EXPECT_EQ(out.str(), "true\n");
    folder.write("window.log",
                 "0.000000 start zelremote --home button\n"
                 "0.000001 input show DebugIt.STAT\n0.000002 closed\n");
    EXPECT_EQ(run({"replay", folder.file("window.log")}), kDone) << errors.str();
    EXPECT_EQ(out.str(), "false\n");
}

TEST_F(ReplayVerbTest, RecordBegunInsideASession_RunsAgainFromItsStart) {
    const std::string log = folder.file("inside.log");
    folder.write("session.txt",
                 "connect\ntype SoftTextBox(0) 900M\nkey SoftTextBox(0) enter\nanswer " + log +
                     "\nclick UtilityRecord\ntype SoftTextBox(0) 1G\nkey SoftTextBox(0) enter\n"
                     "show UtilityRecord.Checked\nclick UtilityRecord\n");
    ASSERT_EQ(runConnected({"panel", folder.file("session.txt")}), kDone) << errors.str();
    const std::string text = folder.read("inside.log");
    EXPECT_NE(text.find("|FREQ,900000000.|"), std::string::npos) << "sent before the record";
    EXPECT_NE(text.find("|FREQ,1000000000.|"), std::string::npos);
    EXPECT_EQ(run({"replay", log}), kDone) << errors.str();
    EXPECT_EQ(out.str(), "true\n") << "up to the end of the record";
    std::string other = text;
    other.replace(other.find("46 52 45 51 2C 39"), 2, "47");
    folder.write("other.log", other);
    EXPECT_EQ(run({"replay", folder.file("other.log")}), kLinkFailed);
}

TEST_F(ReplayVerbTest, ChoiceToReconnect_IsPartOfTheRecord) {
    const std::string log = folder.file("again.log");
    folder.write("first.txt", "click ReconnectAlways\n");
    ASSERT_EQ(run({"panel", folder.file("first.txt")}), kDone);
    folder.write("second.txt", "show ReconnectAlways.Checked\n");
    ASSERT_EQ(run({"--log", log, "panel", folder.file("second.txt")}), kDone);
    EXPECT_EQ(out.str(), "true\n");
    EXPECT_EQ(run({"replay", log}), kDone) << errors.str();
    EXPECT_EQ(out.str(), "true\n") << "at the desk where it was chosen";
    EXPECT_NE(folder.read("again.log").find(" click ReconnectAlways\n"), std::string::npos);
}

TEST_F(ReplayVerbTest, RecordBegunInAVeryLongSession_IsSaidNotToRunAgain) {
    folder.write("late.log",
                 "0.000000 start zelremote\n0.000000 open serial:/dev/ttyUSB0@57600\n"
                 "0.100000 click SpanButton\n0.200000 > 0D |.|\n0.300000 closed\n");
    EXPECT_EQ(run({"replay", folder.file("late.log")}), kLinkFailed);
    EXPECT_EQ(out.str(), "");
    EXPECT_NE(errors.str().find("the record began while the connection was open"),
              std::string::npos)
        << errors.str();
}

}  // namespace
}  // namespace zel
