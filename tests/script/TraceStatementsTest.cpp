#include "tests/script/ScriptBench.h"
#include "trace/Sweep.h"

namespace zel {
namespace {

struct TraceStatementsTest : ScriptBench, testing::Test {
    void settings() {
        get("FREQ", "1500000000");
        get("SPAN", "1000000");
        get("REFLVL", "-20");
        get("UNIT", "0");
        get("RANGE", "0");
        get("DYNRANGE", "0");
        get("TRACEDET", "3");
        get("SWPTIME", "0.02");
    }
    void sweep() {
        cmd("WAIT");
        trace(levelBlock(-35000));
    }
    void knownView() {
        mirror.TraceDetector = 3;
        mirror.ResolutionBandwidth = mirror.VideoBandwidth = 7;
    }
    int views(const std::string& name) const {
        int found = 0;
        for (const std::string& line : linesOf(folder.read(name)))
            if (startsWith(line, "Trace Name;")) ++found;
        return found;
    }
};

TEST_F(TraceStatementsTest, GetTrace_AsksForTheTriggerAndReadsTheFullCycle) {
    for (const char* line : {"GET TRACE", "GETSWEEP 5"}) {
        get("TRIGSRC", "0");
        settings();
        sweep();
        run({line});
        expectPlayed();
        EXPECT_FALSE(mirror.ExternalTriggerActive);
    }
}

TEST_F(TraceStatementsTest, QuickTrace_StartsTheSweepAndAsksNothing) {
    knownView();
    cmd("INIT");
    sweep();
    cmd("INIT");
    sweep();
    run({"QUICK TRACE", "QUICKSWEEP"});
    expectPlayed();
    EXPECT_TRUE(panel.PlayContinuousButton.Enabled);
}

TEST_F(TraceStatementsTest, RefusedInit_EndsTheRunWithoutTheClosingSteps) {
    cmd("INIT", "2");
    form.chkGetSweep.setValue(true);
    run({"QUICK TRACE", "GET LEVEL"});
    expectPlayed();
    EXPECT_FALSE(form.ReachedEnd);
    EXPECT_TRUE(form.cmdStop.Visible);
    EXPECT_FALSE(form.cmdExecute.Enabled);
    EXPECT_FALSE(mirror.ScriptInProgress);
    EXPECT_EQ(panel.MousePointer, 0);
}

TEST_F(TraceStatementsTest, TheFlagOfTheSaveBox_NeitherSavesNorSendsInit) {
    knownView();
    panel.RecordDataFlag = true;
    bool saved = false;
    panel.SaveView.connect([&](const std::string&) { saved = true; });
    cmd("INIT");
    sweep();
    load({"QUICK TRACE"});
    panel.RecordDataFlag = true;
    form.cmdExecute.Click();
    expectPlayed();
    EXPECT_FALSE(saved);
}

TEST_F(TraceStatementsTest, ExternalTrigger_TakesOneTraceWithTheTimeOutOfTheLine) {
    get("TRIGSRC", "2");
    cmd("INIT");
    cmd("WAIT");
    settings();
    sweep();
    run({"GETSWEEP 5"});
    expectPlayed();
    EXPECT_TRUE(mirror.ExternalTriggerActive);
    EXPECT_TRUE(form.ReachedEnd);
}

TEST_F(TraceStatementsTest, QuickTrace_HasTheTimeOutOfTheStatementBeforeIt) {
    const auto triggered = [this](bool first) {
        cmd("INIT");
        cmd("WAIT");
        if (first) settings();
        sweep();
    };
    get("TRIGSRC", "2");
    triggered(true);
    triggered(false);
    run({"GETSWEEP 5", "QUICK TRACE 40000"});
    expectPlayed();
    EXPECT_TRUE(form.ReachedEnd);
    get("TRIGSRC", "2");
    triggered(false);
    run({"GETSWEEP 5", "QUICKSWEEP 40000"});
    expectPlayed();
    EXPECT_EQ(boxTexts(), Texts{"Overflow"});
}

TEST_F(TraceStatementsTest, TimeOutBeyondSixteenBits_IsAnOverflow) {
    get("TRIGSRC", "3");
    run({"GETSWEEP 40000"});
    EXPECT_EQ(boxTexts(), Texts{"Overflow"});
}

TEST_F(TraceStatementsTest, WaterfallBox_CountsTheRows) {
    knownView();
    cmd("INIT");
    sweep();
    cmd("INIT");
    sweep();
    run({"WATERFALL ON", "QUICK TRACE", "QUICK TRACE"});
    EXPECT_EQ(panel.YVectorVal, 2);
    EXPECT_TRUE(forms.waterfall.Visible);
    EXPECT_TRUE(form.chkWaterfall.Value());
    cmd("INIT");
    sweep();
    run({"WATERFALL OFF", "QUICK TRACE"});
    EXPECT_EQ(panel.YVectorVal, 0);
    EXPECT_FALSE(forms.waterfall.Visible);
}

TEST_F(TraceStatementsTest, SaveSweep_AppendsAViewForEachPass) {
    knownView();
    run({"SAVERESULTS VIEW*.CSV", "DO", "SAVESWEEP", "SAVESWEEP", "LOOP 2"});
    EXPECT_EQ(views("VIEW1.CSV"), 2);
    EXPECT_EQ(views("VIEW2.CSV"), 2);
    EXPECT_TRUE(boxTexts().empty());
}

TEST_F(TraceStatementsTest, SaveSweep_FindsTheFileInAnyCase) {
    knownView();
    folder.write("view.csv", "");
    run({"SAVERESULTS VIEW.CSV", "SAVESWEEP"});
    EXPECT_EQ(views("view.csv"), 1);
    EXPECT_FALSE(folder.has("VIEW.CSV"));
}

TEST_F(TraceStatementsTest, LoadTrace_ShowsTheSavedViewOfThePass) {
    knownView();
    Sweep& shown = program.sweep();
    mirror.Span = 1;
    shown.settings = mirror;
    shown.wanted = shown.came = 301;
    shown.physical.assign(301, -40);
    shown.axis.start = 1;
    shown.axis.stop = 2;
    run({"SAVERESULTS VIEW*.CSV", "DO", "SAVESWEEP", "LOOP 2"});
    int loaded = 0;
    panel.TraceLoaded.connect([&] { ++loaded; });
    run({"DO", "LOADTRACE view*.csv", "LOOP 2"});
    EXPECT_EQ(loaded, 2);
    EXPECT_TRUE(form.ReachedEnd);
}

TEST_F(TraceStatementsTest, LoadTrace_KnowsALogOfTheOlderFormatByItsNameOrItsLastLine) {
    std::string log = "Data at;2010-05-01 10:00:00;\r\n______________________________\r\n \r\n";
    for (int i = 0; i < 301; ++i) log += std::to_string(100 + 10 * i) + ";-35;\r\n";
    folder.write("OLD.DAT", log);
    folder.write("OLD.TXT", log + " ........END OF LOG FOR 2010-05-01 10:05:00\r\n");
    for (const char* name : {"OLD.DAT", "OLD.TXT"}) {
        panel.CWGraph1.plotY({1, 2, 3}, 0, 1);
        panel.DataValArrayToLoad.clear();
        run({std::string("LOADTRACE ") + name});
        EXPECT_TRUE(form.ReachedEnd) << name;
        EXPECT_EQ(panel.DataValArrayToLoad, std::vector<double>(301, -35)) << name;
        EXPECT_EQ(panel.CWGraph1.firstX(), 100) << name;
    }
}

TEST_F(TraceStatementsTest, LoadedRows_AreCountedWhileTheWaterfallIsOn) {
    knownView();
    Sweep& shown = program.sweep();
    mirror.Span = 1;
    shown.settings = mirror;
    shown.wanted = shown.came = 301;
    shown.physical.assign(301, -40);
    shown.axis.start = 1;
    shown.axis.stop = 2;
    run({"SAVERESULTS VIEW.CSV", "SAVESWEEP"});
    const auto depths = [this] {
        std::vector<double> found;
        for (const GraphCurve3D& plot : forms.waterfall.Graph3D.plots())
            if (!plot.depth.empty()) found.push_back(plot.depth.front());
        return found;
    };
    run({"WATERFALL ON", "LOADTRACE VIEW.CSV", "LOADTRACE VIEW.CSV", "LOADTRACE VIEW.CSV"});
    EXPECT_EQ(depths().size(), 3U);
    const std::vector<double> counted = depths();
    run({"WATERFALL ON", "LOADTRACE VIEW.CSV", "WATERFALL OFF", "LOADTRACE VIEW.CSV",
         "WATERFALL ON", "LOADTRACE VIEW.CSV"});
    // Off, the count begins again: the last row is a first one.
    EXPECT_EQ(depths().back(), counted.front());
    EXPECT_NE(counted.front(), counted.back());
}

TEST_F(TraceStatementsTest, FileStatements_BringTheTemplateOfTheResultsBack) {
    knownView();
    panel.DrawImage.connect([](const std::string&, std::string&) {});
    folder.write("OLD.DAT", "");
    run({"SAVERESULTS OUT*.TXT", "DO", "LOOP 1"});
    EXPECT_FALSE(form.fileNameIsIndexed);
    run({"SAVERESULTS OUT*.TXT", "DO", "LOOP 1", "COMMENT A"});
    EXPECT_EQ(form.DataFileNameSpec, "OUTVALUES.TXT");
    run({"SAVERESULTS OUT*.TXT", "DO", "LOOP 1", "SAVESCREEN A.WMF", "COMMENT A"});
    EXPECT_EQ(form.DataFileNameSpec, "OUT*.TXT");
    run({"SAVERESULTS OUT*.TXT", "DO", "LOOP 1", "LOADTRACE OLD.DAT", "COMMENT A"});
    EXPECT_EQ(form.DataFileNameSpec, "OUT*.TXT");
    run({"SAVERESULTS OUT.TXT", "COMMENT A"});
    EXPECT_FALSE(form.fileNameIsIndexed);
}

TEST_F(TraceStatementsTest, LoadTraceOfAMissingFile_TellsAndEndsTheRun) {
    for (const char* name : {"NONE.CSV", "C:\\X.CSV", ""}) {
        boxes.clear();
        run({std::string("LOADTRACE ") + name, "COMMENT X"});
        ASSERT_EQ(boxes.boxes().size(), 1U) << name;
        EXPECT_EQ(boxes.boxes()[0].icon, BoxIcon::Plain);
        EXPECT_NE(boxes.boxes()[0].text.find(name), std::string::npos);
        EXPECT_FALSE(form.ReachedEnd);
    }
}

TEST_F(TraceStatementsTest, SaveScreen_DrawsTheMetafileOfThePass) {
    Texts drawn;
    panel.DrawImage.connect([&](const std::string& path, std::string&) { drawn.push_back(path); });
    run({"DO", "SAVESCREEN pic *.wmf", "LOOP 2", "SAVESCREEN A*.WMF"});
    EXPECT_EQ(drawn,
              (Texts{folder.file("PIC1.WMF"), folder.file("PIC2.WMF"), folder.file("A*.WMF")}));
}

TEST_F(TraceStatementsTest, SaveScreenWithAnotherEnding_IsAMetafileAllTheSame) {
    panel.DrawImage.connect([&](const std::string& path, std::string&) {
        EXPECT_EQ(path, folder.file("WMF.OLD.wmf"));
        platform.files.put(path, "picture");
    });
    run({"SAVESCREEN WMF.OLD"});
    EXPECT_EQ(folder.read("WMF.OLD"), "picture");
    EXPECT_FALSE(folder.has("WMF.OLD.wmf"));
}

TEST_F(TraceStatementsTest, SaveScreenThatFails_TellsAndEndsTheRun) {
    panel.DrawImage.connect([](const std::string&, std::string& problem) { problem = "full"; });
    run({"SAVESCREEN A.WMF", "COMMENT X"});
    EXPECT_EQ(boxTexts(), Texts{"full"});
    EXPECT_FALSE(form.ReachedEnd);
}

TEST_F(TraceStatementsTest, SaveScreenWithoutAName_AsksAndEachAnswerEndsIt) {
    int drawn = 0;
    panel.DrawImage.connect([&](const std::string&, std::string&) { ++drawn; });
    boxes.answer(BoxAnswer::No);
    run({"SAVESCREEN"});
    EXPECT_TRUE(form.noSaveAnswered);
    EXPECT_TRUE(form.ReachedEnd);
    boxes.answer(BoxAnswer::Cancel);
    run({"SAVESCREEN"});
    EXPECT_FALSE(form.ReachedEnd);
    boxes.answer(BoxAnswer::Yes);  // and the dialog is cancelled
    run({"SAVESCREEN"});
    EXPECT_TRUE(form.ReachedEnd);
    EXPECT_EQ(drawn, 0);
    EXPECT_EQ(boxes.boxes().size(), 3U);
    boxes.answer(BoxAnswer::Yes);
    platform.fileDialogs.answer(folder.file("a.wmf"));
    run({"SAVESCREEN"});
    EXPECT_EQ(drawn, 1);
}

TEST_F(TraceStatementsTest, SaveScreenOfAnotherKind_AsksForAName) {
    Texts drawn;
    panel.DrawImage.connect([&](const std::string& path, std::string&) { drawn.push_back(path); });
    run({"SAVESCREEN A.PNG"});
    ASSERT_EQ(boxes.boxes().size(), 1U);
    EXPECT_EQ(boxes.boxes()[0].title, "Wrong file type");
    EXPECT_EQ(boxes.boxes()[0].text, "The file you specified is not a WMF file.");
    EXPECT_TRUE(form.ReachedEnd);
    EXPECT_TRUE(drawn.empty());
    platform.fileDialogs.answer(folder.file("b.wmf"));
    run({"SAVESCREEN A.PNG"});
    EXPECT_EQ(drawn, Texts{folder.file("b.wmf")});
}

TEST_F(TraceStatementsTest, FullDisk_IsToldForASweepAndLosesNothing) {
    knownView();
    folder.write("VIEW.CSV", "before\r\n");
    platform.files.room = 100;
    run({"SAVERESULTS VIEW.CSV", "SAVESWEEP", "COMMENT A COMMENT THAT IS LONGER THAN THE ROOM",
         "NOSAVE"});
    EXPECT_TRUE(form.ReachedEnd);
    EXPECT_EQ(folder.read("VIEW.CSV").substr(0, 8), "before\r\n");
    ASSERT_EQ(boxes.boxes().size(), 1U);
    EXPECT_EQ(boxes.boxes()[0].icon, BoxIcon::Critical);
}

TEST_F(TraceStatementsTest, VanishedFolder_DropsResultsAndTellsOfSweeps) {
    knownView();
    platform.files.putFolder(folder.file("SUB"));
    atStatement(2, [this] { platform.files.vanish(folder.file("SUB")); });
    run({"SAVERESULTS SUB\\X.TXT", "COMMENT A", "COMMENT B", "SAVESWEEP"});
    EXPECT_TRUE(form.ReachedEnd);
    EXPECT_EQ(boxes.boxes().size(), 1U);
    platform.files.comeBack(folder.file("SUB"));
    EXPECT_EQ(linesOf(folder.read("SUB/X.TXT")).size(), 1U);
}

TEST_F(TraceStatementsTest, ReadOnlyFolder_DropsResults) {
    platform.files.refuse("/views", "Permission denied");
    run({"SAVERESULTS X.TXT", "COMMENT A"});
    EXPECT_TRUE(form.ReachedEnd);
    EXPECT_FALSE(folder.has("X.TXT"));
    EXPECT_TRUE(boxTexts().empty());
}

TEST_F(TraceStatementsTest, GetSweepBox_TakesOneSweepAtTheEnd) {
    settings();
    sweep();
    load({"# nothing"});
    form.chkGetSweep.setValue(true);
    form.cmdExecute.Click();
    expectPlayed();
}

}  // namespace
}  // namespace zel
