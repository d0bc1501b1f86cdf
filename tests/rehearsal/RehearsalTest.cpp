#include "rehearsal/Rehearsal.h"
#include "support/Text.h"
#include "tests/files/FileSession.h"

namespace zel {
namespace {

struct RehearsalTest : testing::Test {
    VirtualPlatform platform;
    Folder folder{platform.files};

    RehearsalReport report(const Texts& lines, int baud = 57600) {
        std::string text;
        for (const std::string& line : lines) text += line + "\r\n";
        RehearsalSetup setup;
        setup.script = folder.write("script.txt", text);
        setup.folder = "/views";
        setup.baud = baud;
        return rehearse(setup, platform.files);
    }
    static Texts findings(const RehearsalReport& report) {
        Texts lines;
        for (const LineReport& finding : report.findings)
            lines.push_back(std::to_string(finding.line) + " " + finding.text);
        return lines;
    }
};

TEST_F(RehearsalTest, GoodScript_TellsItsTimeFilesAndLoadAndWritesNothing) {
    folder.write("OLDVALUES.TXT", "");
    const RehearsalReport good =
        report({"SAVERESULTS NEW*.TXT", "", "# x", "GET LEVEL", "SAVERESULTS OLD*.TXT", "DO",
                "COMMENT A", "PAUSE 10", "LOOP 3", "SAVERESULTS SUB.CSV", "GET TRACE", "SAVESWEEP",
                "SAVESCREEN PIC.WMF"});
    EXPECT_FALSE(good.wrong()) << good.findings[0].text;
    ASSERT_EQ(good.files.size(), 4U);
    EXPECT_EQ(good.files[0].name, "NEWVALUES.TXT");
    EXPECT_STREQ(good.files[0].fate, "new");
    EXPECT_EQ(good.files[1].name, "OLDVALUES.TXT");
    EXPECT_STREQ(good.files[1].fate, "extended");
    EXPECT_EQ(good.files[3].name, "PIC.WMF");
    EXPECT_GT(good.seconds, 30);
    EXPECT_LT(good.seconds, 33);
    EXPECT_GT(good.bytes, 1200U);
    EXPECT_GT(good.load, 0);
    EXPECT_FALSE(folder.has("NEWVALUES.TXT"));
    EXPECT_FALSE(folder.has("PIC.WMF"));
    EXPECT_EQ(folder.read("OLDVALUES.TXT"), "");
}

TEST_F(RehearsalTest, IgnoredLine_IsToldWithTheNearestStatement) {
    EXPECT_EQ(findings(report({"NOSAVE", "", "PUASE 3", "QWERTZ"})),
              (Texts{"3 This line is no statement and is ignored; did you mean PAUSE?",
                     "4 This line is no statement and is ignored."}));
}

TEST_F(RehearsalTest, RefusedSetting_IsTold) {
    EXPECT_EQ(findings(report({"SET FREQ,99000000000", "SET FREQ,100000000", "CMD NONSENSE"})),
              (Texts{"1 The instrument refuses FREQ,99000000000.",
                     "3 The instrument refuses NONSENSE."}));
}

TEST_F(RehearsalTest, LoopsWithoutEnd_AreTold) {
    const char* const noEnd = " The loop has no end.";
    EXPECT_EQ(findings(report({"NOSAVE", "DO", "COMMENT X", "LOOP -1", "COMMENT Y"})),
              Texts{std::string("4") + noEnd});
    EXPECT_EQ(findings(report({"DO", "LOOP 3", "# x", "LOOP 2", "PAUSE 1"})),
              Texts{std::string("4") + noEnd});
    EXPECT_EQ(findings(report({"SCANSTART 100000000", "SCANSTEP 0", "SCANSTOP 100000000"})),
              Texts{std::string("3") + noEnd});
    EXPECT_EQ(findings(report({"SCANSTART 100000000", "SCANSTEP -1000000", "SCANSTOP 100000000"})),
              Texts{std::string("3") + noEnd});
}

TEST_F(RehearsalTest, LoopsThatEnd_AreInOrder) {
    EXPECT_EQ(findings(report({"NOSAVE", "DO", "SCANSTART 100000000", "SCANSTEP 1000000",
                               "SCANSTOP 103000000", "LOOP 3", "DO", "LOOP 2"})),
              Texts{});
}

TEST_F(RehearsalTest, StepModeAndDialogs_TakeNoTime) {
    const RehearsalReport steps =
        report({"STEPMODE", "SHOWDIALOG X", "PAUSE 0", "PAUSE 1", "NOSAVE"});
    EXPECT_FALSE(steps.wrong());
    EXPECT_NEAR(steps.seconds, 1, 0.1);
}

TEST_F(RehearsalTest, RunThatFails_IsToldWithItsLine) {
    EXPECT_EQ(findings(report({"NOSAVE", "", "LOADTRACE NONE.CSV"})).size(), 1U);
    EXPECT_EQ(findings(report({"NOSAVE", "GET CTRACE", "PAUSE 1"})),
              Texts{"2 The run ends here: Overflow"});
}

TEST_F(RehearsalTest, FilesThatTheRunMakes_CanBeLoaded) {
    const RehearsalReport replay = report(
        {"SAVERESULTS V*.CSV", "DO", "GET TRACE", "SAVESWEEP", "LOOP 2", "LOADTRACE v1.csv"});
    EXPECT_EQ(findings(replay), Texts{});
    EXPECT_EQ(replay.files.size(), 2U);
    EXPECT_FALSE(folder.has("V1.CSV"));
}

TEST_F(RehearsalTest, DatasetsOfTheInstrument_AreRecalled) {
    EXPECT_EQ(findings(report(
                  {"CMD SAVE,DATA.001", "CMD SAVE,DATA.002", "DO", "AUTORECALL DATA", "LOOP 2"})),
              Texts{});
    EXPECT_EQ(findings(report({"DO", "AUTORECALL NONE", "LOOP 1"})),
              Texts{"2 The instrument refuses recall,NONE.001."});
}

TEST_F(RehearsalTest, ExternalTriggers_ComeInTheScriptsTime) {
    const RehearsalReport trigger = report({"SET TRIGSRC,2", "DO", "GET TRACE 5", "LOOP 4"});
    EXPECT_EQ(findings(trigger), Texts{});
    EXPECT_GT(trigger.seconds, 1.5);
}

TEST_F(RehearsalTest, ASlowLine_TakesLonger) {
    const Texts lines = {"DO", "GET TRACE", "LOOP 5"};
    const RehearsalReport fast = report(lines, 57600);
    const RehearsalReport slow = report(lines, 9600);
    EXPECT_EQ(findings(slow), Texts{});
    EXPECT_GT(slow.seconds, fast.seconds * 2);
    EXPECT_GT(slow.load, 50);
    EXPECT_LE(slow.load, 100);
}

TEST_F(RehearsalTest, EndlessWork_IsCutAtAMillionStatements) {
    const RehearsalReport cut = report(
        {"NOSAVE", "DO",  "# 1", "# 2", "LOOP 32000", "DO",  "# 1", "# 2",       "# 3", "# 4",
         "# 5",    "# 6", "# 7", "# 8", "# 9",        "# 1", "# 2", "# 3",       "# 4", "# 5",
         "# 6",    "# 7", "# 8", "# 9", "# 1",        "# 2", "# 3", "# 4",       "# 5", "# 6",
         "# 7",    "# 8", "# 9", "# 1", "# 2",        "# 3", "# 4", "LOOP 32000"});
    ASSERT_EQ(cut.findings.size(), 1U);
    EXPECT_TRUE(contains(cut.findings[0].text, "million"));
}

TEST_F(RehearsalTest, Lines_AreAsThePrintedReport) {
    RehearsalReport made;
    made.findings = {{3, "X."}};
    made.files = {{"A.TXT", "new"}};
    made.seconds = 12.34;
    made.bytes = 4096;
    made.load = 1.25;
    EXPECT_EQ(reportLines(made), (Texts{"line 3: X.", "A.TXT: new", "duration: 12.3 s",
                                        "line load: 4096 bytes, 1.2 %"}));
}

TEST_F(RehearsalTest, Button_ShowsTheReportInABox) {
    TestSession session;
    offerRehearsal(session.program, session.boxes, platform.files);
    session.startConnected();
    session.platform.folder.folder = folder.file("home");
    session.panel.cmdSpecial.Click();
    SpecialMeasForm& form = session.forms.specialMeas;
    EXPECT_FALSE(form.cmdRehearse.Enabled);
    session.platform.fileDialogs.answer(folder.write("s.txt", "SAVERESULT X\r\n"));
    session.platform.files.put(folder.file("s.txt"), "SAVERESULT X\r\n");
    form.cmdOpenCommandsFile.Click();
    EXPECT_TRUE(form.cmdRehearse.Enabled);
    form.cmdRehearse.Click();
    ASSERT_EQ(session.boxes.boxes().size(), 1U);
    EXPECT_EQ(session.boxes.boxes()[0].icon, BoxIcon::Exclamation);
    EXPECT_TRUE(contains(session.boxes.boxes()[0].text, "did you mean SAVERESULTS?"));
}

}  // namespace
}  // namespace zel
