#include "tests/script/ScriptBench.h"

namespace zel {
namespace {

struct ExecutorTest : ScriptBench, testing::Test {
    Texts marks() { return results("OUT.TXT"); }
    static std::string mark(const std::string& text) { return " <comment________>; " + text; }
    static std::string counted(const std::string& text) { return " <loopcount______>; " + text; }
    void expectFree() {
        EXPECT_FALSE(mirror.ScriptInProgress);
        EXPECT_FALSE(mirror.ScanInProgress);
        EXPECT_FALSE(program.link().ScanInProgress);
        EXPECT_TRUE(panel.PlayContinuousButton.Enabled);
        EXPECT_TRUE(panel.RecordData.Enabled);
        EXPECT_TRUE(form.cmdOpenCommandsFile.Enabled);
        EXPECT_TRUE(form.cmdEdit.Enabled);
        EXPECT_EQ(panel.MousePointer, 0);
        EXPECT_EQ(form.RunsActive, 0);
    }
};

TEST_F(ExecutorTest, EmptyList_DoesTheClosingStepsAtOnce) {
    run({});
    EXPECT_TRUE(form.ReachedEnd);
    EXPECT_TRUE(form.cmdExecute.Visible);
    EXPECT_TRUE(form.cmdExecute.Enabled);
    EXPECT_FALSE(form.cmdStop.Visible);
    expectFree();
}

TEST_F(ExecutorTest, Loop_RunsItsBodyAsOftenAsItSays) {
    const std::pair<const char*, std::size_t> cases[] = {
        {"LOOP 3", 3}, {"LOOP 0", 1}, {"LOOP 1", 1}, {"LOOP", 1}, {"LOOP 2.5", 2}, {"LOOP X", 1}};
    for (const auto& [loop, passes] : cases) {
        platform.files.remove(folder.file("OUT.TXT"));
        run({"SAVERESULTS OUT.TXT", "DO", "COMMENT X I Y", loop, "SAVERESULTS OUT.TXT",
             "COMMENT END"});
        const Texts lines = marks();
        ASSERT_EQ(lines.size(), passes + 1) << loop;
        EXPECT_EQ(lines[passes - 1], counted(std::to_string(passes) + "; XY")) << loop;
    }
}

TEST_F(ExecutorTest, SecondLoop_StartsAgainWithPassOne) {
    run({"SAVERESULTS OUT.TXT", "DO", "LOOP 2", "DO", "COMMENT A I B", "LOOP 2"});
    EXPECT_EQ(marks(), (Texts{counted("1; AB"), counted("2; AB")}));
}

TEST_F(ExecutorTest, LoopWithoutDo_ReturnsToTheSecondEntry) {
    run({"SAVERESULTS OUT.TXT", "COMMENT A I B", "LOOP 2"});
    EXPECT_EQ(marks(), (Texts{counted("0; AB"), counted("1; AB"), counted("2; AB")}));
}

TEST_F(ExecutorTest, NegativeLoop_RunsUntilStopAndKeepsItsCount) {
    int passes = 0;
    program.scripts().executor.StatementBegins.connect([&](int index) {
        if (index == 2 && ++passes == 5) form.cmdStop.Click();
    });
    run({"SAVERESULTS OUT.TXT", "DO", "COMMENT A I B", "LOOP -1", "COMMENT END"});
    EXPECT_EQ(marks(), Texts(4, counted("1; AB")));
    EXPECT_FALSE(form.ReachedEnd);
    EXPECT_FALSE(form.cmdStop.Visible);
    expectFree();
}

TEST_F(ExecutorTest, EndlessLoopOfNothing_CanBeStoppedByAnEvent) {
    platform.events.schedule(20, [this] { form.cmdStop.Click(); });
    run({"DO", "#", "LOOP -1"});
    EXPECT_FALSE(form.ReachedEnd);
    expectFree();
}

TEST_F(ExecutorTest, NumbersBeyondSixteenBits_AreAnOverflow) {
    for (const char* line : {"LOOP 40000", "AVGCOUNT 32768", "LOOP -32769"}) {
        boxes.clear();
        run({"DO", line});
        ASSERT_EQ(boxes.boxes().size(), 1U) << line;
        EXPECT_EQ(boxes.boxes()[0].text, "Overflow");
        EXPECT_EQ(boxes.boxes()[0].icon, BoxIcon::Plain);
        EXPECT_FALSE(form.ReachedEnd);
        EXPECT_TRUE(form.cmdStop.Visible);
        EXPECT_FALSE(form.cmdExecute.Enabled);
        expectFree();
        form.cmdStop.Click();
        EXPECT_TRUE(form.cmdExecute.Enabled);
    }
}

TEST_F(ExecutorTest, Comment_JoinsTheNeighboursOfItsToken) {
    run({"SAVERESULTS OUT.TXT", "COMMENT PASS I OF 3", "COMMENT I", "COMMENT plain text",
         "COMMENT"});
    EXPECT_EQ(marks(), (Texts{counted("0; PASSOF 3"), mark("I"), mark("PLAIN TEXT"), mark("")}));
}

TEST_F(ExecutorTest, NoSave_EmptiesTheNameAndAsksNobody) {
    run({"SAVERESULTS OUT.TXT", "NOSAVE", "COMMENT X", "SAVERESULTS OUT.TXT", "COMMENT Y"});
    EXPECT_EQ(marks(), Texts{mark("Y")});
    EXPECT_TRUE(boxTexts().empty());
}

TEST_F(ExecutorTest, Exchanges_AreSentAsTheLineSays) {
    cmd("INIT");
    set("FREQ,1.5E9");
    set("FREQ,1.5.3");
    set("FREQ", "1");
    run({"cmd init", "SET FREQ,1,5E9", " set freq,1,5,3", "SET FREQ", "SET FREQ,1.5E9", "CMD"});
    EXPECT_NE(port.failure(), "");  // the fifth line was not expected
}

TEST_F(ExecutorTest, Setting_KeepsItsPoint) {
    set("FREQ,1.5E9");
    run({"SET FREQ,1.5E9"});
    expectPlayed();
}

TEST_F(ExecutorTest, Get_WritesTheAnswerUnderItsOwnText) {
    get("LEVEL", "-30.25 dBm");
    get("IDN", "text");
    get("MARK1", "1,5");
    run({"SAVERESULTS OUT.TXT", "Get Level", "GET IDN", "GET MARK1"});
    expectPlayed();
    EXPECT_EQ(marks(), (Texts{" <get level______>; -30.25 ", " <get idn________>; 0 ",
                              " <get mark1______>; 1 ; 5 "}));
}

TEST_F(ExecutorTest, FailedGet_WritesNoLine) {
    getRefused("PWR", "4");
    run({"SAVERESULTS OUT.TXT", "GET PWR"});
    EXPECT_FALSE(folder.has("OUT.TXT"));
    EXPECT_TRUE(form.ReachedEnd);
}

TEST_F(ExecutorTest, DeadLine_StopsTheRun) {
    getSilent();
    run({"SAVERESULTS OUT.TXT", "GET LEVEL", "COMMENT X"});
    EXPECT_FALSE(folder.has("OUT.TXT"));
    EXPECT_FALSE(form.ReachedEnd);
    expectFree();
}

TEST_F(ExecutorTest, AFailureOfLongAgo_StopsNoComment) {
    program.link().ExchangeFailed = true;
    run({"SAVERESULTS OUT.TXT", "COMMENT X"});
    EXPECT_EQ(marks(), Texts{mark("X")});
    EXPECT_TRUE(form.ReachedEnd);
}

TEST_F(ExecutorTest, NotConnected_EndsTheRunWithABox) {
    panel.isConnected = false;
    for (const char* line :
         {"CMD INIT", "SET FREQ,1", "GET LEVEL", "GET TRACE", "GETSWEEP", "QUICK TRACE",
          "QUICKSWEEP", "AUTORECALL X", "SCANSTART 1", "SCANSTEP 1", "SCANSTOP 1", "GET CTRACE"}) {
        boxes.clear();
        run({line, "SAVERESULTS OUT.TXT", "COMMENT X"});
        ASSERT_EQ(boxTexts(), Texts{"Please connect to the instrument first"}) << line;
        EXPECT_EQ(boxes.boxes()[0].icon, BoxIcon::Information);
        EXPECT_FALSE(folder.has("OUT.TXT")) << line;
        EXPECT_FALSE(form.ReachedEnd);
        const bool step = std::string(line) == "SCANSTEP 1";
        EXPECT_EQ(form.cmdStop.Visible, step) << line;
        EXPECT_EQ(form.cmdExecute.Enabled, !step) << line;
        EXPECT_FALSE(mirror.ScriptInProgress) << line;
        EXPECT_EQ(panel.MousePointer, 0);
    }
}

TEST_F(ExecutorTest, StatementsWithoutAnInstrument_RunUnconnected) {
    panel.isConnected = false;
    mirror.ResolutionBandwidth = mirror.VideoBandwidth = 7;
    run({"SAVERESULTS OUT.TXT", "COMMENT X", "PAUSE 1", "WATERFALL ON", "WATERFALL OFF",
         "SAVESWEEP", "SHOWDIALOG A CRLF B"});
    EXPECT_EQ(boxTexts(), Texts{"A \r\n B"});
    EXPECT_TRUE(form.ReachedEnd);
}

TEST_F(ExecutorTest, Pause_WaitsItsSeconds) {
    const std::pair<const char*, double> cases[] = {
        {"PAUSE 2.5", 2500}, {"PAUSE 2,5", 2500}, {"PAUSE 1.234,5", 1234}, {"PAUSE -3", 0}};
    for (const auto& [line, ms] : cases) {
        const auto start = platform.clock.micros();
        run({line});
        EXPECT_NEAR(static_cast<double>(platform.clock.micros() - start) / 1000, ms, 2) << line;
    }
    EXPECT_TRUE(boxTexts().empty());
}

TEST_F(ExecutorTest, PauseOfNothing_WaitsForOk) {
    run({"PAUSE 0", "PAUSE", "PAUSE soon"});
    EXPECT_EQ(boxTexts(), Texts(3, "Press OK to continue"));
    EXPECT_EQ(boxes.boxes()[0].icon, BoxIcon::Information);
}

TEST_F(ExecutorTest, Stop_EndsAPauseAtOnce) {
    const auto start = platform.clock.micros();
    platform.events.schedule(1000, [this] { form.cmdStop.Click(); });
    run({"PAUSE 3600", "SAVERESULTS OUT.TXT", "COMMENT X"});
    EXPECT_NEAR(static_cast<double>(platform.clock.micros() - start) / 1000, 1000, 2);
    EXPECT_FALSE(folder.has("OUT.TXT"));
    expectFree();
}

TEST_F(ExecutorTest, AutoRecall_NumbersTheDatasetByThePass) {
    cmd("recall,DATA.001");
    cmd("recall,DATA.002");
    run({"AUTORECALL DATA", "DO", "AUTORECALL DATA", "LOOP 2"});
    expectPlayed();
    ASSERT_EQ(boxes.boxes().size(), 1U);
    EXPECT_EQ(boxes.boxes()[0].title, "Erroneous usage of a statement");
    EXPECT_EQ(boxes.boxes()[0].icon, BoxIcon::Plain);
    EXPECT_EQ(boxes.boxes()[0].text,
              "The filenames can only be genarated automatically within a loop.\r\nThe last "
              "character of your file name will then be replaced with the current index\r\n"
              "Otherwise it is obsolete");
}

TEST_F(ExecutorTest, Scan_StepsToTheStopAndWritesWhatPassesALimit) {
    set("FREQ, 100000000");
    get("FREQ", "100000000");
    get("LEVEL", "-20");
    set("FREQ, 100000000.5");
    get("LEVEL", "-30");
    set("FREQ, 100000001");
    get("LEVEL", "-90.5");
    run({"SAVERESULTS OUT.TXT", "SCANLVLUPPL -30", "SCANLVLLOWL -90", "SCANSTART 100000000",
         "SCANSTEP 0.5", "SCANSTOP 100000001"});
    expectPlayed();
    EXPECT_EQ(marks(), (Texts{" < 100000000_____>; -20 ", " < 100000001_____>; -90.5 "}));
    EXPECT_EQ(mirror.CenterFrequency, 100000001);
    expectFree();
}

TEST_F(ExecutorTest, ScanLimits_AreNotPassedByAnEqualLevelAndCountForOneScan) {
    for (const char* level : {"-30", "-10", "-50"}) {
        set("FREQ, 100");
        get("LEVEL", level);
    }
    run({"SAVERESULTS OUT.TXT", "SCANLVLUPPL -30", "SCANLVLLOWL -30", "SCANSTART 100",
         "SCANSTOP 50", "SCANSTART 100", "SCANSTOP 50", "SCANSTART 100", "SCANSTOP 50"});
    expectPlayed();
    EXPECT_FALSE(folder.has("OUT.TXT"));
}

TEST_F(ExecutorTest, Scan_SettlesForFiftyMillisecondsAndStepsFromWhatTheInstrumentSays) {
    set("FREQ, 100");
    get("FREQ", "200");  // it has its own idea
    get("LEVEL", "-20");
    set("FREQ, 210");
    get("LEVEL", "-20");
    std::int64_t start = 0;
    atStatement(2, [&] { start = platform.clock.micros(); });
    run({"SCANSTART 100", "SCANSTEP 10", "SCANSTOP 210"});
    expectPlayed();
    const std::int64_t passed = platform.clock.micros() - start;
    EXPECT_GE(passed, 2 * 50'000);
    EXPECT_LT(passed, 3 * 50'000);
}

TEST_F(ExecutorTest, ScanOfOneFrequency_MeasuresOnceAndNeedsNoLimit) {
    set("FREQ, .5", "0");
    run({"SCANSTART 0.5"});
    EXPECT_NE(port.failure(), "");  // a half keeps its zero
}

TEST_F(ExecutorTest, ScanWithoutStep_ReturnsToTheSecondEntry) {
    set("FREQ, 100");
    get("LEVEL", "-20");
    run({"SCANSTART 100", "SCANSTOP 99"});
    expectPlayed();
    EXPECT_TRUE(form.ReachedEnd);
}

TEST_F(ExecutorTest, FailedLevel_IsNoHit) {
    set("FREQ, 100");
    getRefused("LEVEL", "4");
    run({"SAVERESULTS OUT.TXT", "SCANLVLLOWL 10", "SCANSTART 100", "SCANSTOP 50"});
    expectPlayed();
    EXPECT_FALSE(folder.has("OUT.TXT"));
    EXPECT_TRUE(boxTexts().empty());  // errors are silent while it scans
}

TEST_F(ExecutorTest, StepOfZero_RepeatsUntilStop) {
    set("FREQ, 100");
    get("FREQ", "100");
    for (int i = 0; i < 3; ++i) {
        get("LEVEL", "-20");
        set("FREQ, 100");
    }
    int levels = 0;
    program.scripts().executor.StatementBegins.connect([&](int index) {
        if (index == 2 && ++levels == 4) form.cmdStop.Click();
    });
    run({"SCANSTART 100", "SCANSTEP 0", "SCANSTOP 100"});
    expectPlayed();
    expectFree();
}

TEST_F(ExecutorTest, StepMode_WaitsForNextAtEachStatementButComments) {
    Texts shown;
    load({"# one", "SAVERESULTS OUT.TXT", "# two", "COMMENT A", "COMMENT B"});
    form.chkStep.Click();
    int presses = 0;
    std::function<void()> press = [&] {
        if (form.WaitsForNext) {
            ++presses;
            EXPECT_TRUE(form.cmdNext.Visible);
            EXPECT_FALSE(form.cmdExecute.Visible);
            form.cmdNext.Click();
        }
        if (form.RunsActive > 0) platform.events.schedule(10, press);
    };
    platform.events.schedule(10, press);
    form.cmdExecute.Click();
    EXPECT_EQ(presses, 3);
    EXPECT_EQ(marks(), (Texts{mark("A"), mark("B")}));
    EXPECT_TRUE(form.cmdExecute.Visible);
    EXPECT_FALSE(form.cmdNext.Visible);
}

TEST_F(ExecutorTest, ClearingTheStepBox_LetsTheRunGo) {
    load({"SAVERESULTS OUT.TXT", "COMMENT A"});
    form.chkStep.Click();
    platform.events.schedule(10, [this] {
        form.chkStep.Click();
        form.cmdNext.Click();
    });
    form.cmdExecute.Click();
    EXPECT_EQ(marks(), Texts{mark("A")});
}

TEST_F(ExecutorTest, StopInTheWait_KeepsItUntilItIsReleasedAndANewRunMayStart) {
    load({"SAVERESULTS OUT.TXT", "COMMENT A"});
    form.chkStep.Click();
    bool newRunEnded = false;
    platform.events.schedule(10, [&] {
        form.cmdStop.Click();
        EXPECT_FALSE(form.cmdNext.Visible);
        EXPECT_TRUE(form.cmdExecute.Enabled);
        EXPECT_EQ(form.RunsActive, 1);
        form.chkStep.Click();
        load({"SAVERESULTS OUT.TXT", "COMMENT B", "COMMENT C"});
        form.cmdExecute.Click();
        EXPECT_TRUE(form.ReachedEnd);
        newRunEnded = true;
    });
    form.cmdExecute.Click();
    EXPECT_TRUE(newRunEnded);
    EXPECT_FALSE(form.ReachedEnd);
    EXPECT_EQ(marks(), (Texts{mark("B"), mark("C")}));
    expectFree();
}

TEST_F(ExecutorTest, DisconnectAndQuit_ReleaseTheWait) {
    load({"COMMENT A"});
    form.chkStep.setValue(true);
    form.noSaveAnswered = true;
    platform.events.schedule(10, [this] {
        form.cmdStop.Click();
        panel.isConnected = false;
    });
    form.cmdExecute.Click();
    panel.isConnected = true;
    platform.events.schedule(10, [this] { panel.unload(1); });
    form.cmdExecute.Click();
    EXPECT_EQ(form.RunsActive, 0);
}

TEST_F(ExecutorTest, ASecondExecute_DuringARunDoesNothing) {
    atStatement(1, [this] { form.cmdExecute.Click(); });
    run({"SAVERESULTS OUT.TXT", "COMMENT A"});
    EXPECT_EQ(marks(), Texts{mark("A")});
}

TEST_F(ExecutorTest, ContinuousView_RefusesTheRun) {
    load({"SAVERESULTS OUT.TXT", "COMMENT A"});
    panel.ContinuosLoopActive = true;
    form.cmdExecute.Click();
    EXPECT_EQ(boxes.boxes().size(), 1U);
    EXPECT_FALSE(folder.has("OUT.TXT"));
}

TEST_F(ExecutorTest, ThePanelsKeys_RestWhileAScriptRuns) {
    bool looked = false;
    atStatement(1, [&] {
        looked = true;
        EXPECT_TRUE(mirror.ScriptInProgress);
        EXPECT_FALSE(panel.PlayContinuousButton.Enabled);
        EXPECT_FALSE(panel.RecordData.Enabled);
        EXPECT_FALSE(form.cmdOpenCommandsFile.Enabled);
        EXPECT_FALSE(form.cmdEdit.Enabled);
        EXPECT_FALSE(form.cmdExecute.Enabled);
        EXPECT_TRUE(form.cmdStop.Visible);
    });
    run({"NOSAVE", "COMMENT A"});
    EXPECT_TRUE(looked);
    expectFree();
}

TEST_F(ExecutorTest, AListThatShrinks_EndsWithIgnoredLines) {
    atStatement(1, [this] { form.lstCommands.Items = Texts{"NOSAVE"}; });
    run({"SAVERESULTS OUT.TXT", "COMMENT A", "COMMENT B"});
    EXPECT_EQ(marks(), Texts{mark("A")});
    EXPECT_TRUE(form.ReachedEnd);
}

TEST_F(ExecutorTest, AListThatGrows_IsReadToItsOldEnd) {
    atStatement(0, [this] {
        Texts lines = form.lstCommands.Items;
        lines.push_back("COMMENT B");
        form.lstCommands.Items = lines;
    });
    run({"SAVERESULTS OUT.TXT", "COMMENT A"});
    EXPECT_EQ(marks(), Texts{mark("A")});
}

TEST_F(ExecutorTest, Highlight_RunsOneAhead) {
    int shown = -2;
    atStatement(1, [&] { shown = form.lstCommands.ListIndex; });
    run({"NOSAVE", "# x", "NOSAVE"});
    EXPECT_EQ(shown, 1);
    EXPECT_EQ(form.lstCommands.ListIndex, 2);
}

TEST_F(ExecutorTest, SaveBoxWithoutAFile_AsksAtTheStart) {
    load({"COMMENT A"});
    form.chkSave.Click();
    boxes.answer(BoxAnswer::No);
    form.cmdExecute.Click();  // the dialog is cancelled
    EXPECT_EQ(platform.fileDialogs.saves.size(), 1U);
    EXPECT_FALSE(form.chkSave.Value());
    EXPECT_FALSE(panel.RecordDataFlag);
    form.chkSave.Click();
    platform.fileDialogs.answer(folder.file("picked.txt"));
    form.cmdExecute.Click();
    EXPECT_EQ(results("picked.txt"), Texts{mark("A")});
}

TEST_F(ExecutorTest, ARun_BeginsWithAnEmptyWaterfallAndNoNameOfTheLastOne) {
    forms.waterfall.Graph3D.plotCurve({7, 7}, {0, 1}, {-10, -20}, {});
    panel.YVectorVal = 7;
    load({"COMMENT A"});
    form.DataFileNameSpec = folder.file("last.txt");
    boxes.answer(BoxAnswer::No);
    form.cmdExecute.Click();
    EXPECT_FALSE(forms.waterfall.Graph3D.hasRows());
    EXPECT_EQ(panel.YVectorVal, 0);
    EXPECT_EQ(boxTexts().size(), 1U);  // asks for a file
    EXPECT_FALSE(folder.has("last.txt"));
}

TEST_F(ExecutorTest, StopAtEveryStatement_LeavesThePanelFree) {
    const Texts lines = {"SAVERESULTS OUT.TXT", "NOSAVE",        "STEPMODE",   "# X",
                         "SHOWDIALOG X",        "WATERFALL ON",  "DO",         "PAUSE 1",
                         "COMMENT A",           "LOOP 2",        "AVGCOUNT 2", "SCANLVLUPPL 1",
                         "SCANLVLLOWL 1",       "WATERFALL OFF", "SAVESWEEP"};
    for (int at = 0; at < static_cast<int>(lines.size()); ++at) {
        form.chkStep.setValue(false);
        atStatement(at, [this] { form.cmdStop.Click(); });
        std::function<void()> press = [&] {
            if (form.WaitsForNext) form.cmdNext.Click();
            if (form.RunsActive > 0) platform.events.schedule(10, press);
        };
        platform.events.schedule(10, press);
        run(lines);
        EXPECT_FALSE(form.ReachedEnd) << at;
        EXPECT_TRUE(form.cmdExecute.Enabled) << at;
        EXPECT_FALSE(form.cmdStop.Visible) << at;
        expectFree();
    }
}

}  // namespace
}  // namespace zel
