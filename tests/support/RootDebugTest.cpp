#include "support/MTStandard.h"
#include "support/RootDebug.h"
#include "tests/support/LogFixture.h"

namespace zel {
namespace {

struct RootDebugTest : LogFixture {
    RootDebugTest() {
        log.DebuggerError.connect([this](const std::string& text) { errors.push_back(text); });
        log.DisplayError.connect(
            [this](const RuntimeFailure& failure, const std::vector<std::string>& calls) {
                reported = failure;
                reportedCalls = calls;
                ++reports;
            });
        log.Activate();
        log.FileLogEnabled = true;
    }
    static constexpr const char* kFile = "/home/ELOG_2025_12_09_12_00_00.log";
    Lines lines() const { return linesOf(kFile); }

    RootDebug log{clock, files, debugger, "/home"};
    Lines errors;
    RuntimeFailure reported;
    Lines reportedCalls;
    int reports = 0;
};

TEST_F(RootDebugTest, Members_StartAsTheyShould) {
    const RootDebug fresh(clock, files, debugger, "/home");
    EXPECT_FALSE(fresh.Initialized);
    EXPECT_FALSE(fresh.FileOpen);
    EXPECT_EQ(fresh.CallStackTop, -1);
    EXPECT_FALSE(fresh.FileLogEnabled);
    EXPECT_EQ(fresh.FileName, kFile);
    clock.setDate(46000.5 + 0.9 / 86400);
    EXPECT_EQ(RootDebug(clock, files, debugger, "/home").FileName, kFile)
        << "the second that has begun";
    EXPECT_EQ(fresh.FileLogLevel, 7);
    EXPECT_FALSE(fresh.FileTimeStamping);
    EXPECT_TRUE(fresh.FileSafeLogMode);
    EXPECT_FALSE(fresh.DebuggerLogEnabled);
    EXPECT_EQ(fresh.FirstCritic, 4);
    EXPECT_FALSE(fresh.LogPushPop);
    EXPECT_TRUE(fresh.ShowRuntimeWindow);
    EXPECT_EQ(fresh.CallStack.size(), 11U);
    EXPECT_FALSE(files.has(kFile));
}

TEST_F(RootDebugTest, NotActivated_TellsThatNothingCanBeWritten) {
    log.Initialized = false;
    log.LogPushPop = true;
    log.Push("server", "", "Listen");
    log.LogMessage(1, "Listen", "listening");
    EXPECT_EQ(errors, Lines{std::string("Could not access debugger file ") + kFile});
    EXPECT_FALSE(files.has(kFile));
}

struct LevelRow {
    std::int32_t level;
    const char* head;
};
class EntryLevel : public RootDebugTest, public ::testing::WithParamInterface<LevelRow> {};
TEST_P(EntryLevel, HeadLine_IsMarkAndName) {
    log.LogMessage(GetParam().level, "Listen", "listening");
    EXPECT_EQ(lines(), (Lines{GetParam().head, "          SOURCE      : Listen",
                              "          DESCRIPTION : listening"}));
}
INSTANTIATE_TEST_SUITE_P(
    Levels, EntryLevel,
    ::testing::Values(LevelRow{0, "       Debug"}, LevelRow{1, ".      Info"},
                      LevelRow{2, "..     Notice"}, LevelRow{3, "...    Warning"},
                      LevelRow{4, "****   Error"}, LevelRow{5, "*****  Critical"},
                      LevelRow{6, "****** Alert"}, LevelRow{9, "*********Unknown"},
                      LevelRow{-1, "       Unknown"}));

TEST_F(RootDebugTest, LevelAboveTheFilesLevel_IsWrittenAllTheSame) {
    log.FileLogLevel = 1;
    log.LogMessage(4, "Listen", "refused");
    EXPECT_EQ(lines().size(), 3U);
}

TEST_F(RootDebugTest, Time_StandsBelowTheHead) {
    log.FileTimeStamping = true;
    log.LogMessage(1, "Listen", "listening");
    EXPECT_EQ(lines().at(1), "          TIME        : 2025-12-09 12:00:00.0000");
    EXPECT_EQ(log.CallStackTop, -1);
}

TEST_F(RootDebugTest, IsoTime_HasFourDigitsOfTheFraction) {
    clock.setDate(46000 + (86399.9876 / 86400));
    EXPECT_EQ(GetISOTimeString(clock, log), "2025-12-09 23:59:59.9876");
    clock.setDate(46000 + (86399.99999 / 86400));
    EXPECT_EQ(GetISOTimeString(clock, log), "2025-12-09 23:59:59.9999");
}

TEST_F(RootDebugTest, Failure_IsWrittenWithAllCallsAndReported) {
    log.Push("server", "", "Listen");
    log.Push("server", "Port", "Open");
    log.PushInfo("COM1");
    RuntimeFailure failure;
    failure.number = 13;
    failure.description = "Type mismatch";
    log.LogRuntimeError("MTStandard", "Numbers", "Read", failure);
    EXPECT_EQ(lines(), (Lines{"*******Fatal", "          SOURCE      : Read",
                              "          DESCRIPTION : Numbers Type mismatch",
                              "          ERROR NUMBER: D (13)", "          ERROR SOURCE: ZELRemote",
                              "                 >server.Listen",
                              "                  >server.Port_Open <COM1>",
                              "                   >MTStandard.Numbers_Read"}));
    EXPECT_EQ(reports, 1);
    EXPECT_EQ(reported.number, 13);
    EXPECT_EQ(reportedCalls,
              (Lines{"server.Listen", "server.Port_Open <COM1>", "MTStandard.Numbers_Read"}));
    EXPECT_EQ(log.CallStackTop, 1);
}

TEST_F(RootDebugTest, FailureOfTheNewestCall_IsNotPushedTwice) {
    log.Push("server", "", "Listen");
    log.LogRuntimeError("server", "", "Listen", {});
    EXPECT_EQ(lines().size(), 6U);
    EXPECT_EQ(reportedCalls, Lines{"server.Listen"});
}

TEST_F(RootDebugTest, ReportSwitchedOff_WritesTheEntryOnly) {
    log.ShowRuntimeWindow = false;
    log.LogRuntimeError("server", "", "Listen", {-1, "ZELRemote.cRegistry", "x\r\ny"});
    EXPECT_EQ(reports, 0);
    EXPECT_EQ(lines().at(2), "          DESCRIPTION :  x / y");
    EXPECT_EQ(lines().at(3), "          ERROR NUMBER: FFFFFFFF (-1)");
}

TEST_F(RootDebugTest, PushAndPop_MakeAStaircase) {
    log.LogPushPop = true;
    {
        const CallScope outer(log, "server", "", "Listen");
        const CallScope inner(log, "server", "Port", "Open");
        log.LogMessage(1, "Wait", "waiting");  // its call makes no line
    }
    EXPECT_EQ(lines(), (Lines{"         >server.Listen", "          >server.Port_Open",
                              ".      Info", "          SOURCE      : Wait",
                              "          DESCRIPTION : waiting", "          <", "         <"}));
}

TEST_F(RootDebugTest, TwelfthCall_MakesRoomForMore) {
    for (int i = 0; i < 11; ++i) log.Push("server", "", "Call");
    EXPECT_EQ(log.CallStack.size(), 11U);
    log.Push("server", "", "Call");
    EXPECT_EQ(log.CallStack.size(), 21U);
    EXPECT_EQ(log.CallStackTop, 11);
}

TEST_F(RootDebugTest, PopWithoutACall_MakesTheNextPushAFailure) {
    log.Pop();
    EXPECT_EQ(log.CallStackTop, -2);
    log.Push("server", "", "Listen");
    EXPECT_EQ(reports, 1);
    EXPECT_EQ(reported.number, 9);
    EXPECT_EQ(log.CallStackTop, -1);
    EXPECT_EQ(lines().at(0), "*******Fatal");
    log.Push("server", "", "Listen");  // in step again
    EXPECT_EQ(reports, 1);
    EXPECT_EQ(log.CallStackTop, 0);
}

TEST_F(RootDebugTest, EntryWhileTheStackIsOutOfStep_IsWritten) {
    log.Pop();
    log.Pop();
    log.LogMessage(3, "Listen", "odd");
    EXPECT_EQ(lines().size(), 3U);
    EXPECT_EQ(log.CallStackTop, -2);
}

TEST_F(RootDebugTest, SafeMode_ClosesTheFileBehindEachEntry) {
    log.LogMessage(1, "Listen", "listening");
    EXPECT_FALSE(log.FileOpen);
    log.FileSafeLogMode = false;
    log.LogMessage(1, "Listen", "listening");
    EXPECT_TRUE(log.FileOpen);
    EXPECT_EQ(lines().size(), 6U);
}

TEST_F(RootDebugTest, Debugger_GetsTheLinesWithoutAFile) {
    log.FileLogEnabled = false;
    log.DebuggerLogEnabled = true;
    log.LogMessage(1, "Listen", "listening");
    EXPECT_EQ(debugger.lines, (Lines{".      Info", "          SOURCE      : Listen",
                                     "          DESCRIPTION : listening"}));
    EXPECT_FALSE(files.has(kFile));
    EXPECT_FALSE(log.FileOpen);
}

TEST_F(RootDebugTest, FileThatCannotBeWritten_IsToldAndNothingElse) {
    files.refuse("/home", "Permission denied");
    log.LogMessage(1, "Listen", "listening");
    EXPECT_EQ(errors, Lines{std::string("Could not access debugger file ") + kFile});
    log.FileSafeLogMode = false;
    log.LogMessage(1, "Listen", "listening");
    EXPECT_FALSE(log.FileOpen) << "what could not be opened is not open";
    EXPECT_EQ(errors.size(), 2U);
    log.FileSafeLogMode = true;
    files.refuse("/home", "");
    log.LogMessage(1, "Listen", "again");
    EXPECT_EQ(lines().size(), 3U);
}

TEST_F(RootDebugTest, FilesOfEarlierRuns_TheNewestNineStayBesideTheNewOne) {
    for (int day = 10; day < 22; ++day)
        files.put("/home/ELOG_2025_11_" + std::to_string(day) + "_00_00_00.log", "old");
    files.put("/home/ELOG_notes.txt", "mine");
    log.LogMessage(1, "Listen", "listening");
    EXPECT_FALSE(files.has("/home/ELOG_2025_11_12_00_00_00.log"));
    EXPECT_TRUE(files.has("/home/ELOG_2025_11_13_00_00_00.log"));
    EXPECT_TRUE(files.has("/home/ELOG_2025_11_21_00_00_00.log"));
    EXPECT_TRUE(files.has("/home/ELOG_notes.txt"));
    EXPECT_TRUE(files.has(kFile));
}

}  // namespace
}  // namespace zel
