#include <gtest/gtest.h>

#include <stdexcept>

#include "shell/Logs.h"
#include "support/ErrorReport.h"
#include "support/RunTimeError.h"
#include "support/SessionLog.h"
#include "support/Text.h"
#include "tests/Session.h"

namespace zel {
namespace {

struct FailuresTest : TestSession, ::testing::Test {
    FailuresTest() {
        platform.folder.folder = "/home";
        platform.files.putFolder("/home");
    }
    void fail() {
        try {
            throw RunTimeError(13, "Bridge", "type mismatch");
        } catch (...) {
            program.showFailure();
        }
    }
};

TEST_F(FailuresTest, Failure_IsReportedThenTheProgramEndsInOrder) {
    startConnected();
    ASSERT_TRUE(program.recordSession("/home/session.log", "test"));
    panel.RecordDataFlag = true;
    panel.MousePointer = 11;
    cmd("LOCAL");
    bool open = false;
    platform.events.schedule(50, [&] {
        open = forms.error.Visible;
        EXPECT_FALSE(program.ended()) << "not before the window is closed";
        forms.error.ButtonOK.Click();
    });
    program.logs().rootDebug.Push("server", "Bridge", "Listen");
    fail();
    EXPECT_TRUE(open);
    EXPECT_TRUE(program.ended());
    EXPECT_TRUE(program.failed());
    EXPECT_TRUE(program.endedBy().empty());
    EXPECT_FALSE(port.isOpen());
    EXPECT_FALSE(panel.RecordDataFlag);
    EXPECT_EQ(panel.MousePointer.get(), 0);
    expectPlayed();
    EXPECT_EQ(parseSession(platform.files.bytes("/home/session.log")).problem, "");
    EXPECT_TRUE(contains(forms.error.reportText, ">server.Bridge_Listen\r\n"));
}

TEST_F(FailuresTest, Failure_SwitchesTheLogFileAndItsTimesOn) {
    program.start();
    program.logs().rootDebug.FileName = "/home/ELOG.log";
    program.errorReport().print = [](const std::string&) {};
    fail();
    EXPECT_TRUE(program.logs().rootDebug.FileLogEnabled);
    const std::string entry = platform.files.bytes("/home/ELOG.log");
    EXPECT_TRUE(startsWith(entry, "*******Fatal\r\n          TIME        : 2026-01-01 12:00:00"))
        << entry;
    EXPECT_TRUE(contains(entry, "ERROR NUMBER: D (13)\r\n"));
}

TEST_F(FailuresTest, WithoutTheWindow_TheProgramEndsAllTheSame) {
    program.start();
    program.logs().rootDebug.ShowRuntimeWindow = false;
    fail();
    EXPECT_TRUE(program.failed());
    EXPECT_FALSE(forms.error.isOpen);
}

TEST_F(FailuresTest, SecondFailureWhileTheReportIsOpen_IsOneReport) {
    program.start();
    platform.events.schedule(50, [&] { fail(); });
    platform.events.schedule(90, [&] { forms.error.ButtonOK.Click(); });
    fail();
    EXPECT_TRUE(program.failed());
    EXPECT_TRUE(platform.boxes.texts().empty());
}

TEST_F(FailuresTest, LogThatCannotBeWritten_HidesNoReport) {
    program.start();
    program.logs().rootDebug.FileName = "/none/ELOG.log";
    std::string printed;
    program.errorReport().print = [&](const std::string& text) { printed = text; };
    fail();
    EXPECT_TRUE(contains(printed, "DESCRIPTION : type mismatch"));
    EXPECT_TRUE(program.failed());
}

TEST_F(FailuresTest, TraceOfAFault_IsTakenOnceAndPutAside) {
    platform.files.put("/home/crash.log", "SIGSEGV");
    EXPECT_EQ(program.takeCrash(), "SIGSEGV");
    EXPECT_EQ(program.takeCrash(), "");
    EXPECT_EQ(platform.files.bytes("/home/crash.1.log"), "SIGSEGV");
}

TEST_F(FailuresTest, MenuEntry_RecordsTheSessionUntilItIsClickedAgain) {
    program.start();
    platform.fileDialogs.answer("/home/a.log");
    panel.UtilityRecord.Click();
    EXPECT_TRUE(panel.UtilityRecord.Checked);
    program.sessionLog().clicked("SpanButton");
    panel.UtilityRecord.Click();
    EXPECT_FALSE(panel.UtilityRecord.Checked);
    EXPECT_EQ(parseSession(platform.files.bytes("/home/a.log")).problem, "");
    EXPECT_TRUE(contains(platform.files.bytes("/home/a.log"), " click SpanButton\n"));
    platform.fileDialogs.answer("/none/a.log");
    panel.UtilityRecord.Click();
    EXPECT_FALSE(panel.UtilityRecord.Checked);
    EXPECT_EQ(platform.boxes.texts().size(), 1U);
    panel.UtilityRecord.Click();  // cancelled
    EXPECT_FALSE(panel.UtilityRecord.Checked);
}

TEST_F(FailuresTest, RecordBegunWhileConnected_BeginsWithTheStart) {
    startConnected();
    program.sessionLog().input("connect");
    program.sessionLog().opened("serial:A@57600");
    platform.fileDialogs.answer("/home/a.log");
    panel.UtilityRecord.Click();
    EXPECT_TRUE(panel.UtilityRecord.Checked);
    EXPECT_TRUE(platform.boxes.texts().empty());
    EXPECT_TRUE(contains(platform.files.bytes("/home/a.log"),
                         " input connect\n0.000000 open serial:A@57600\n"));
}

TEST_F(FailuresTest, RecordBegunInAVeryLongSession_IsSaidNotToRunAgain) {
    startConnected();
    program.sessionLog().opened("serial:A@57600");
    program.sessionLog().came(std::string(SessionLog::kMostKept, 'x'));
    platform.fileDialogs.answer("/home/a.log");
    panel.UtilityRecord.Click();
    EXPECT_TRUE(panel.UtilityRecord.Checked);
    ASSERT_EQ(platform.boxes.texts().size(), 1U);
    EXPECT_TRUE(
        startsWith(platform.boxes.texts()[0], "The session is too long to be written from its"));
}

TEST_F(FailuresTest, RecordBegunByTheMenu_NamesTheWordsOfTheStart) {
    Program other(platform.bundle(), "BUTTON x");
    other.start();
    platform.fileDialogs.answer("/home/b.log");
    other.forms().controller.UtilityRecord.Click();
    EXPECT_TRUE(startsWith(platform.files.bytes("/home/b.log"),
                           "0.000000 start zelremote --words \"BUTTON x\"\n"))
        << platform.files.bytes("/home/b.log");
}

}  // namespace
}  // namespace zel
