#include "script/ResultNames.h"
#include "script/ResultOutput.h"
#include "tests/script/ScriptBench.h"

namespace zel {
namespace {

struct ResultTest : ScriptBench, testing::Test {
    ResultTest() { form.ScriptFolder = folder.file(""); }
    ResultOutput& output = program.scripts().results;
    void name(const std::string& text, bool typed = false) {
        form.DataFileNameSpec = text;
        form.DataFileNameTyped = typed;
        form.fileNameIsIndexed = contains(text, "*");
    }
};

TEST_F(ResultTest, Line_HasDateTimeNameAndValue) {
    platform.clock.setDate(dateOf(2026, 11, 15, 17, 5, 12.345));
    name("OUT.TXT");
    output.saveValue("get level", "-30 dBm");
    EXPECT_EQ(folder.read("OUT.TXT"), "2026-11-15; 17:05:12.345;  <get level______>; -30 \r\n");
}

TEST_F(ResultTest, Time_IsOneReadingOfTheClock) {
    platform.clock.setDate(dateOf(2026, 11, 15, 23, 59, 59.9996));
    EXPECT_EQ(resultTimeText(platform.clock), "2026-11-15; 23:59:59.999; ");
    platform.clock.setDate(dateOf(2026, 11, 15, 12, 0, 0));
    EXPECT_EQ(resultTimeText(platform.clock), "2026-11-15; 12:00:00.000; ");
}

TEST_F(ResultTest, Numbers_OfAnAnswer) {
    EXPECT_EQ(resultNumbers("-30 dBm"), "-30 ");
    EXPECT_EQ(resultNumbers("text"), "0 ");
    EXPECT_EQ(resultNumbers(""), "0 ");
    EXPECT_EQ(resultNumbers("1500000000"), "1500000000 ");
    EXPECT_EQ(resultNumbers("1,5"), "1.5 ");
    EXPECT_EQ(resultNumbers("1;5"), "1 ; 5 ");
    EXPECT_EQ(resultNumbers("1;5;7"), "1 ; 5 ");
    EXPECT_EQ(resultNumbers(";5"), "0 ; 0 ");
    EXPECT_EQ(resultNumbers("5;"), "5 ; 0 ");
    EXPECT_EQ(resultNumbers(" 0.5"), "0.5 ");
}

TEST_F(ResultTest, Name_IsCutOrFilledToFifteenCharacters) {
    EXPECT_EQ(resultName(" 1:MEANLVL"), " 1:meanlvl_____");
    EXPECT_EQ(resultName("GET 123456789AB"), "get 123456789ab");
    EXPECT_EQ(resultName("GET 123456789ABCDEF"), "get 123456789ab");
    EXPECT_EQ(resultName("\xC3\x84RGER"), "\xC3\xA4rger__________");
}

TEST_F(ResultTest, Name_OfTheCallBecomesCapitals) {
    name("OUT.TXT");
    std::string changed = "get level";
    output.saveValue(changed, "1");
    EXPECT_EQ(changed, "GET LEVEL");
}

TEST_F(ResultTest, Star_MakesAFamilyOfFiles) {
    name("RESULT*.TXT");
    form.ctraceMeasurementNo = 3;
    output.saveValue("GET LEVEL", "1");
    output.saveValue("CTRACE_TEMP", "2");
    output.saveValue(" 3:MEANLVL", "4");
    EXPECT_TRUE(folder.has("RESULTVALUES.TXT"));
    EXPECT_TRUE(folder.has("RESULTTEMP_3.TXT"));
    EXPECT_TRUE(folder.has("RESULT3.TXT"));
    EXPECT_EQ(form.DataFileNameSpec, "RESULT*.TXT");
}

TEST_F(ResultTest, WithoutStar_OneFileAndATemplateAllTheSame) {
    name("RESULT.TXT");
    output.saveValue("GET LEVEL", "1");
    output.saveValue("CTRACE_TEMP", "2");
    EXPECT_EQ(results("RESULT.TXT").size(), 2U);
    EXPECT_EQ(form.outputFileTemplate, "RESULT.TXT");
}

TEST_F(ResultTest, Star_OfATypedNameIsFixedByTheFirstValue) {
    name(folder.file("my R*.txt"), true);
    form.fileNameIsIndexed = false;
    output.saveValue("GET LEVEL", "1");
    output.saveValue("CTRACE_TEMP", "2");
    EXPECT_EQ(results("my RVALUES.txt").size(), 2U);
}

TEST_F(ResultTest, Blanks_OfANameOutOfAScriptGo) {
    name("MY OUT.TXT");
    output.saveValue("GET LEVEL", "1");
    EXPECT_TRUE(folder.has("MYOUT.TXT"));
}

TEST_F(ResultTest, BuildName_ReturnsTheTemplateWhenAsked) {
    name("A*.TXT");
    std::string fileTemplate;
    output.buildOutputFileName(7, true, "", fileTemplate);
    EXPECT_EQ(form.DataFileNameSpec, "A7.TXT");
    EXPECT_EQ(fileTemplate, "A*.TXT");
    fileTemplate = "B*C*.TXT";
    output.buildOutputFileName(7, false, "X", fileTemplate);
    EXPECT_EQ(form.DataFileNameSpec, "BXCX.TXT");
    output.buildOutputFileName(0, false, "*", fileTemplate);
    EXPECT_EQ(form.DataFileNameSpec, "B*C*.TXT");
}

TEST_F(ResultTest, TheNameCtrace_LeavesTheFilesNameAsItIs) {
    name("OUT*.TXT");
    output.saveValue("ctrace", "1");
    EXPECT_EQ(results("OUT*.TXT"), Texts{" <ctrace_________>; 1 "});
}

TEST_F(ResultTest, NoFile_AsksOnceAndNoKeepsSilent) {
    name("");
    boxes.answer(BoxAnswer::No);
    output.saveValue("GET LEVEL", "1");
    output.saveValue("GET LEVEL", "1");
    ASSERT_EQ(boxes.boxes().size(), 1U);
    EXPECT_EQ(boxes.boxes()[0].title, "No output file specified");
    EXPECT_EQ(boxes.boxes()[0].icon, BoxIcon::Question);
    EXPECT_EQ(boxes.boxes()[0].buttons, BoxButtons::YesNoCancel);
    EXPECT_TRUE(form.noSaveAnswered);
}

TEST_F(ResultTest, FileStatement_OffersItsNameToTheDialogsAndAsksNobody) {
    run({"SAVERESULTS OUT*.TXT"});
    EXPECT_EQ(panel.CommonDialog1FileName, "OUT*.TXT");
    run({"SAVERESULTS", "COMMENT A"});  // without a name the value is dropped
    EXPECT_TRUE(boxTexts().empty());
    EXPECT_FALSE(folder.has("OUTVALUES.TXT"));
}

TEST_F(ResultTest, NoFile_YesWritesToTheChosenOne) {
    name("");
    boxes.answer(BoxAnswer::Yes);
    platform.fileDialogs.answer(folder.file("picked one.txt"));
    output.saveValue("comment", "x");
    EXPECT_EQ(results("picked one.txt"), Texts{" <comment________>; x"});
}

TEST_F(ResultTest, NoFile_TheChosenOneStaysAlsoBehindALoadedTrace) {
    name("");
    form.fileNameIsIndexed = true;
    platform.fileDialogs.answer(folder.file("picked.txt"));
    output.saveValue("comment", "x");
    output.saveValue("comment", "y");
    EXPECT_EQ(results("picked.txt").size(), 2U);
    EXPECT_EQ(boxes.boxes().size(), 1U);
}

TEST_F(ResultTest, NoFile_CancelStopsTheRun) {
    name("");
    form.continueRun = true;
    boxes.answer(BoxAnswer::Cancel);
    output.saveValue("comment", "x");
    EXPECT_FALSE(form.continueRun);
    EXPECT_FALSE(form.noSaveAnswered);
}

TEST_F(ResultTest, Comment_KeepsItsTextInTheCodePage) {
    name("OUT.TXT");
    output.saveValue("loopcount", "1; \xC3\x84 \xE2\x82\xAC \xCE\xA9");
    EXPECT_EQ(results("OUT.TXT"), Texts{" <loopcount______>; 1; \xC4 \x80 ?"});
}

TEST_F(ResultTest, WhatCannotBeWritten_IsDroppedWithoutABox) {
    for (const char* bad : {"NONE\\OUT.TXT", "C:\\OUT.TXT", "A\nB.TXT", "HOME"}) {
        platform.files.putFolder(folder.file("HOME"));
        name(bad);
        output.saveValue("comment", "x");
    }
    EXPECT_TRUE(boxTexts().empty());
    EXPECT_EQ(platform.files.list("/views"), Texts{"HOME"});
}

TEST_F(ResultTest, NamesOfAScript_FindFoldersAndFilesInAnyCase) {
    platform.files.putFolder(folder.file("Night Runs"));
    folder.write("Night Runs/old.txt", "");
    EXPECT_EQ(resolveName(platform.files, "NIGHT RUNS\\OLD.TXT", "/views", false),
              folder.file("Night Runs/old.txt"));
    EXPECT_EQ(resolveName(platform.files, "NIGHT RUNS\\NEW.TXT", "/views", false),
              folder.file("Night Runs/NEW.TXT"));
    EXPECT_EQ(resolveName(platform.files, "Night Runs/OLD.TXT", "/views", true),
              folder.file("Night Runs/OLD.TXT"));
    folder.write("B.txt", "");
    folder.write("b.TXT", "");
    folder.write("B.TXT", "");
    EXPECT_EQ(resolveName(platform.files, "B.TXT", "/views", false), folder.file("B.TXT"));
    platform.files.remove(folder.file("B.TXT"));
    EXPECT_EQ(resolveName(platform.files, "B.TXT", "/views", false), folder.file("B.txt"));
    EXPECT_EQ(resolveName(platform.files, "D:\\X.TXT", "/views", false), std::nullopt);
    EXPECT_EQ(resolveName(platform.files, "D:X.TXT", "/views", true), std::nullopt);
    EXPECT_EQ(resolveName(platform.files, "", "/views", false), std::nullopt);
    EXPECT_EQ(resolveName(platform.files, "/VIEWS/B.TXT", "", false), "/views/B.txt");
}

TEST_F(ResultTest, SaveDisplayedMeasurement_NamesTheUnitAndLeavesTheDeviation) {
    name("R*.TXT");
    form.ctraceMeasurementNo = 1;
    output.saveDisplayedMeasurement(-30, 0.5, 1, 0.25);
    forms.std.optDegrees.Click();
    output.saveDisplayedMeasurement(-30, 0.5, 1, 0.25);
    EXPECT_EQ(
        results("R1.TXT"),
        (Texts{" < 1:meanlvl_____>; -30 ", " < 1:stdlvl______>; 0.5 ", " < 1:meanphase(r)>; 1 ",
               " < 1:stdphase(r)_>; 0.25 ", " < 1:meanlvl_____>; -30 ", " < 1:stdlvl______>; 0.5 ",
               " < 1:meanphase(d)>; 57.2957795 ", " < 1:stdphase(d)_>; 0.25 "}));
}

TEST_F(ResultTest, SaveBox_GivesTheFlagToThePanel) {
    form.DataFileNameSpec = "X.TXT";
    form.chkSave.setValue(true);
    EXPECT_FALSE(panel.RecordDataFlag);
    form.chkSave.setValue(false);
    EXPECT_TRUE(panel.RecordDataFlag);
    EXPECT_EQ(form.DataFileNameSpec, "");
}

}  // namespace
}  // namespace zel
