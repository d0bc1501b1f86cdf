#include <gtest/gtest.h>

#include <cmath>
#include <new>

#include "files/ViewFormat.h"
#include "files/ViewReader.h"
#include "tests/files/FileSession.h"

namespace zel {
namespace {

using CF = ControllerForm;

/// Rows of x and value from 100 on, 10 apart.
std::string rowsText(int count, const std::string& value = "-35", const char* end = "\r\n") {
    std::string text;
    for (int i = 0; i < count; ++i)
        text += std::to_string(100 + 10 * i) + ".000;" + value + "; " + end;
    return text;
}

const std::string kHead =
    "Trace Name;Analyzer\r\nDate;2026-01-01\r\nTime;09:30:00\r\nDynamic Range;Low Noise\r\n"
    "Reference Unit;dBm\r\nReference Range;5 dB/div\r\nReference Level;-20\r\n"
    "Trace Detector;RMS\r\nTrace Write Pointer;301\r\n\r\n";

struct ViewReaderTest : FileSession, ::testing::Test {
    void load(const std::string& text, const std::string& name = "view.csv") {
        folder.write(name, text);
        open(name);
    }
    const std::vector<double>& shown() { return panel.CWGraph1.values(); }
};

TEST_F(ViewReaderTest, View_SetsLevelRangeUnitAndDetector) {
    load(kHead + rowsText(301));
    EXPECT_EQ(mirror.ReferenceLevel, -20);
    EXPECT_EQ(mirror.ReferenceRange, 5);  // dB a division, as it stands in the file
    EXPECT_EQ(mirror.ReferenceUnit, 0);
    EXPECT_EQ(mirror.TraceDetector, 3);
    EXPECT_EQ(panel.DataXAxisArrayToLoad.size(), 301U);
    EXPECT_EQ(shown(), std::vector<double>(301, -35));
    EXPECT_EQ(panel.CWGraph1.firstX(), 100);
    EXPECT_EQ(panel.CWGraph1.increment(), 10);
    EXPECT_EQ(panel.CWGraph1.xAxis().Minimum, 100);
    EXPECT_EQ(panel.CWGraph1.xAxis().Maximum, 3100);
    EXPECT_EQ(panel.CWGraph1.yAxis().Minimum, -70);
    EXPECT_EQ(panel.CWGraph1.yAxis().Maximum, -20);
    EXPECT_EQ(mirror.CenterFrequency, 1600);
    EXPECT_EQ(mirror.Span, 3000);
    EXPECT_EQ(panel.CFLabel.Caption.get(), "Center: 1.6 kHz");
    EXPECT_EQ(panel.SpanLabel.Caption.get(), "Span: 3 kHz");
}

TEST_F(ViewReaderTest, AutoPeak_ReadsPairsAtHalfTheSpacing) {
    std::string text = "Trace Detector;Auto Peak (Auto)\r\n" + kHead;
    for (int i = 0; i < 301; ++i) text += std::to_string(i * 2) + ".000;-90;-40\r\n";
    load(text);
    EXPECT_EQ(mirror.TraceDetector, 0);
    ASSERT_EQ(shown().size(), 602U);
    EXPECT_EQ(shown()[0], -70);  // the bottom of 5 dB a division
    EXPECT_EQ(shown()[1], -40);
    EXPECT_EQ(panel.CWGraph1.increment(), 1);
    EXPECT_EQ(panel.CWGraph1.xAxis().Maximum, 600);
}

TEST_F(ViewReaderTest, PairsWithoutTheWord_ReadTheSecondValuesAsX) {
    std::string text = kHead;
    for (int i = 0; i < 301; ++i) text += std::to_string(i) + ".000;-90;-40\r\n";
    load(text);
    EXPECT_EQ(panel.DataXAxisArrayToLoad[1], -40);
    EXPECT_EQ(shown()[1], -20);  // the second row's x, taken as a value and clipped
}

TEST_F(ViewReaderTest, OtherDetectors_LoadAsSample) {
    for (const char* word : {"Min Peak", "Max Peak", "Sample", "RMS"}) {
        mirror.TraceDetector = 1;
        load(std::string("Trace Detector;") + word + "\r\n" + kHead + rowsText(301));
        EXPECT_EQ(mirror.TraceDetector, 3) << word;
    }
}

TEST_F(ViewReaderTest, ValuesBeyondTheDisplay_AreClipped) {
    load(kHead + rowsText(150, "0") + rowsText(151, "-500"));
    EXPECT_EQ(shown().front(), -20);
    EXPECT_EQ(shown().back(), -70);
    EXPECT_EQ(panel.RawTraceData.front(), 0);
    EXPECT_EQ(panel.RawTraceData.back(), -500);
}

TEST_F(ViewReaderTest, Volts_AreDrawnInDbm) {
    load(
        "Reference Unit;V\r\nReference Range;10 dB/div\r\nReference Level;0.1\r\n"
        "Trace Write Pointer;301\r\n\r\n" +
        rowsText(301, "0.01"));
    EXPECT_EQ(mirror.ReferenceUnit, 6);
    EXPECT_NEAR(shown()[0], 20 * std::log10(0.01) - 10 * std::log10(50.0) + 30, 1e-9);
    EXPECT_FALSE(panel.CWGraph1.yAxis().ShowLabels);
}

TEST_F(ViewReaderTest, LinearFile_IsShownInPercent) {
    load(
        "Reference Unit;dBm\r\nReference Range;lin 0 - 100%\r\nReference Level;-20\r\n"
        "Trace Write Pointer;301\r\n\r\n" +
        rowsText(301, "-35.25"));
    EXPECT_TRUE(panel.IsLINValued);
    EXPECT_TRUE(panel.isZELViewLinFile);
    EXPECT_EQ(mirror.ReferenceRange, 4);
    EXPECT_NEAR(shown()[0], 100 * std::pow(10, -15.25 / 20), 1e-9);
    EXPECT_EQ(panel.CWGraph1.yAxis().Minimum, 0);
    EXPECT_EQ(panel.CWGraph1.yAxis().Maximum, 100);
}

TEST_F(ViewReaderTest, LinearFileThatNamesTheProgram_IsItsOwn) {
    load("Program;ZELRemote\r\nReference Range;lin 0 - 100%\r\nTrace Write Pointer;301\r\n\r\n" +
         rowsText(301));
    EXPECT_TRUE(panel.IsLINValued);
    EXPECT_FALSE(panel.isZELViewLinFile);
}

TEST_F(ViewReaderTest, NextFile_ClearsTheLinearFlags) {
    load("Reference Range;lin 0 - 100%\r\nTrace Write Pointer;301\r\n\r\n" + rowsText(301));
    load(kHead + rowsText(301));
    EXPECT_FALSE(panel.IsLINValued);
    EXPECT_FALSE(panel.isZELViewLinFile);
}

TEST_F(ViewReaderTest, RangeWithoutANumber_CountsAsTenDecibels) {
    load("Reference Range;TODO\r\nReference Level;-20\r\nTrace Write Pointer;301\r\n\r\n" +
         rowsText(301, "-500"));
    EXPECT_EQ(mirror.ReferenceRange, 10);
    EXPECT_EQ(shown()[0], -120);
    EXPECT_EQ(panel.CWGraph1.yAxis().Minimum, -120);
}

TEST_F(ViewReaderTest, DynamicRange_IsNoReferenceRange) {
    mirror.ReferenceRange = 2;
    load("Dynamic Range;10\r\nRange;1 dB/div\r\nTrace Write Pointer;301\r\n\r\n" + rowsText(301));
    EXPECT_EQ(mirror.ReferenceRange, 1);
}

TEST_F(ViewReaderTest, FirstHitOfAWord_Wins) {
    load(
        "RefLvl;-30\r\nReference Level;-50\r\nReference Range;10 dB/div\r\n"
        "Trace Write Pointer;301\r\n\r\n" +
        rowsText(301));
    EXPECT_EQ(mirror.ReferenceLevel, -30);
}

TEST_F(ViewReaderTest, UnitThatIsNone_LeavesTheOldOne) {
    mirror.ReferenceUnit = 2;
    load("Reference Unit;dBm \r\nTrace Write Pointer;301\r\n\r\n" + rowsText(301));
    EXPECT_EQ(mirror.ReferenceUnit, 2);
}

TEST_F(ViewReaderTest, Units_AreReadAsTheyAreWritten) {
    const char* const units[] = {"dBm", "dBmV", "dBuV", "dBuV/m", "dBuA/m", "dB", "V", "W"};
    for (int code = 0; code < 8; ++code) {
        load(std::string("Reference Unit;") + units[code] + "\r\nTrace Write Pointer;301\r\n\r\n" +
             rowsText(301));
        EXPECT_EQ(mirror.ReferenceUnit, code);
    }
}

TEST_F(ViewReaderTest, RowsBegin_BehindTheMeasuredValueWhereThereIsOne) {
    load(
        "Trace Write Pointer;301\r\nStart Position;25\r\nStop Position;275\r\n"
        "Measured Value;-33 dBm\r\n\r\n" +
        rowsText(301));
    EXPECT_EQ(panel.DataXAxisArrayToLoad.at(0), 100);
    EXPECT_EQ(panel.DataXAxisArrayToLoad.size(), 301U);
}

TEST_F(ViewReaderTest, ZeroSpanFile_SpreadsOverItsSweepTime) {
    std::string rows;
    for (int i = 0; i < 301; ++i) rows += ".000;-35; \r\n";
    load("Span;ZERO SPAN\r\nSweeptime;0.596\r\n" + kHead + rows);
    EXPECT_EQ(mirror.Span, 0);
    EXPECT_EQ(panel.SpanLabel.Caption.get(), "Span: 0 Hz");
    EXPECT_EQ(panel.ViewStop, 0.596);
    EXPECT_EQ(panel.CWGraph1.firstX(), 0);
    EXPECT_NEAR(panel.CWGraph1.increment(), 0.002, 1e-15);
    EXPECT_EQ(panel.CWGraph1.xAxis().Maximum, 0.596);
}

TEST_F(ViewReaderTest, ZeroSpanFileWithTimes_TakesTheLastAsTheStop) {
    load("Span;ZERO SPAN\r\n" + kHead + rowsText(301));
    EXPECT_EQ(panel.ViewStop, 3100);
    EXPECT_EQ(panel.CWGraph1.firstX(), 0);
    EXPECT_NEAR(panel.CWGraph1.increment(), 3100.0 / 300, 1e-12);
}

TEST_F(ViewReaderTest, Zoomed_KeepsTheXAxis) {
    panel.CWGraph1.setXRange(200, 300);
    panel.GraphZoomed = true;
    load(kHead + rowsText(301));
    EXPECT_EQ(panel.CWGraph1.xAxis().Minimum, 200);
    EXPECT_EQ(panel.CWGraph1.xAxis().Maximum, 300);
}

TEST_F(ViewReaderTest, RowLabel_IsTheTimeAndTheFilesDay) {
    Texts labels;
    forms.waterfall.stampRow.connect([&](const std::string& text) { labels.push_back(text); });
    bool cleared = false;
    bool saved = false;
    forms.waterfall.clearGraph.connect([&] { cleared = true; });
    forms.waterfall.saveGraphView.connect([&] { saved = true; });
    load(kHead + rowsText(301));
    EXPECT_EQ(labels, Texts{"09:30:00 2026-01-01"});
    EXPECT_TRUE(cleared);
    EXPECT_TRUE(saved);
    EXPECT_EQ(panel.YVectorVal, 1);
}

TEST_F(ViewReaderTest, WhileItLoads_OnlyStopIsThere) {
    bool seen = false;
    panel.TraceLoaded.connect([&] {
        seen = !panel.Connection.Enabled && !panel.Utility.Enabled &&
               !panel.PlayContinuousButton.Visible && panel.StopButton.Visible &&
               panel.MousePointer == 11 && panel.STOPFlag;
    });
    load(kHead + rowsText(301));
    EXPECT_TRUE(seen);
    EXPECT_TRUE(panel.Connection.Enabled);
    EXPECT_TRUE(panel.Utility.Enabled);
    EXPECT_TRUE(panel.PlayContinuousButton.Visible);
    EXPECT_FALSE(panel.StopButton.Visible);
    EXPECT_EQ(panel.MousePointer.get(), 0);
    EXPECT_FALSE(panel.STOPFlag);
}

TEST_F(ViewReaderTest, NameWithDat_GoesToTheOldReader) {
    for (const char* name : {"view.dat", "DATA.csv", "myData.txt"}) {
        mirror.ReferenceLevel = -77;
        load(kHead + rowsText(301), name);
        EXPECT_EQ(mirror.ReferenceLevel, -77) << name;
    }
}

TEST_F(ViewReaderTest, ViewUnderANameWithDat_IsSaidToBeReadAsAnOldLog) {
    load("Trace Name;Analyzer\r\n" + kHead + rowsText(301), "update.csv");
    EXPECT_EQ(boxes.texts(),
              Texts{"update.csv begins as a saved view and was read as a log of the older format, "
                    "because its name holds \"dat\".\r\nUnder another name it shows the view."});
}

TEST_F(ViewReaderTest, OldLogUnderANameWithDat_IsReadInSilence) {
    load("Data at;2020-01-01 12:00:00;\r\n____\r\n \r\n100.000;-35; \r\n200.000;-36; \r\n",
         "old.dat");
    EXPECT_EQ(boxes.texts(), Texts{});
    EXPECT_EQ(shown().size(), 2U);
}

TEST_F(ViewReaderTest, FileAboveTheLimit_IsRefusedWithItsSizeAndTheLimit) {
    FileProblem problem;
    platform.files.put("/views/large", std::string(2'000'000, 'x'));
    EXPECT_FALSE(readFile(platform.files, "/views/large", 1'000'000, problem));
    EXPECT_EQ(problem, "it has 2.0 MB, and the limit is 1.0 MB");
    EXPECT_EQ(FileOps::kLargestFile, 1073741824U);
}

TEST_F(ViewReaderTest, DiskThatBreaksWhileItIsRead_IsReported) {
    platform.files.readable = 1000;
    load(kHead + rowsText(301));
    EXPECT_EQ(boxes.texts(),
              Texts{"The file " + folder.file("view.csv") + " cannot be read: Input/output error"});
    EXPECT_TRUE(shown().empty());
}

TEST_F(ViewReaderTest, HandlerThatRunsOutOfMemory_LeavesThePanelUsable) {
    panel.TraceLoaded.connect([] { throw std::bad_alloc(); });
    load(kHead + rowsText(301));
    EXPECT_EQ(boxes.texts(), Texts{"The file " + folder.file("view.csv") +
                                   " cannot be read: there is not enough memory for it"});
    EXPECT_TRUE(panel.Connection.Enabled);
    EXPECT_TRUE(panel.Utility.Enabled);
    EXPECT_TRUE(panel.PlayContinuousButton.Visible);
    EXPECT_FALSE(panel.StopButton.Visible);
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

TEST_F(ViewReaderTest, FolderWithDat_DoesNotDecide) {
    platform.files.putFolder(folder.file("data"));
    load(kHead + rowsText(301), "data/view.csv");
    EXPECT_EQ(mirror.ReferenceLevel, -20);
}

TEST_F(ViewReaderTest, NoWords_LeaveTheOldValuesAndShowTheRows) {
    mirror.ReferenceLevel = -20;
    mirror.ReferenceRange = 10;
    mirror.ReferenceUnit = 1;
    load(rowsText(301));
    EXPECT_EQ(mirror.ReferenceLevel, -20);
    EXPECT_EQ(mirror.ReferenceUnit, 1);
    EXPECT_EQ(shown(), std::vector<double>(301, -35));
    EXPECT_EQ(panel.DataXAxisArrayToLoad.at(0), 100);
}

TEST_F(ViewReaderTest, LineEnds_OfEveryKindReadAlike) {
    for (const char* end : {"\r\n", "\n", "\r"}) {
        std::string other;
        for (const char c : kHead + rowsText(301)) {
            if (c == '\r') continue;
            other += c == '\n' ? std::string(end) : std::string(1, c);
        }
        panel.CWGraph1.clearPlot();
        load(other);
        EXPECT_EQ(shown(), std::vector<double>(301, -35));
        EXPECT_EQ(panel.DataXAxisArrayToLoad.at(300), 3100);
    }
}

TEST_F(ViewReaderTest, DecimalCommas_AreRead) {
    load("Reference Level;-20,5\r\n" + kHead + "100,5;-35,25; \r\n101,5;-36,25; \r\n");
    EXPECT_EQ(mirror.ReferenceLevel, -20.5);
    EXPECT_EQ(panel.DataXAxisArrayToLoad, (std::vector<double>{100.5, 101.5}));
    EXPECT_EQ(shown(), (std::vector<double>{-35.25, -36.25}));
}

TEST_F(ViewReaderTest, TruncatedFile_ShowsTheWholeRows) {
    const std::string text = kHead + rowsText(10);
    load(text.substr(0, text.size() - 3));
    EXPECT_EQ(shown(), std::vector<double>(10, -35));
    load(text.substr(0, text.size() - 8));  // after the last row's x
    EXPECT_EQ(shown().size(), 9U);
}

TEST_F(ViewReaderTest, JunkNumbers_CountAsZero) {
    load("Reference Level;10\r\n" + kHead + "100.000;abc; \r\nxyz;-35; \r\n1e999;-1; \r\n");
    EXPECT_EQ(panel.DataXAxisArrayToLoad, (std::vector<double>{100, 0, 0}));
    EXPECT_EQ(shown()[0], 0);
}

TEST_F(ViewReaderTest, EmptyFile_ChangesNothing) {
    load(kHead + rowsText(301));
    load("", "empty.csv");
    EXPECT_EQ(shown(), std::vector<double>(301, -35));
    EXPECT_EQ(boxes.texts(), Texts{});
}

TEST_F(ViewReaderTest, BinaryAndForeignFiles_DoNoHarm) {
    std::string bytes;
    for (int i = 0; i < 70000; ++i) bytes += static_cast<char>((i * 7919) >> 3);
    load(bytes, "a.csv");
    load(std::string(5000, ';'), "b.csv");
    load(std::string(5000, '\0'), "c.csv");
    load("Trace Write Pointer", "d.csv");
    load("Reference Level;;;;Reference Range;Reference Unit;Trace Write Pointer;Time", "e.csv");
    load("{\"a\": [1, 2, 3]}", "f.csv");
    EXPECT_TRUE(panel.Connection.Enabled);
    EXPECT_EQ(panel.MousePointer.get(), 0);
    load(kHead + rowsText(301));
    EXPECT_EQ(shown(), std::vector<double>(301, -35));
}

TEST_F(ViewReaderTest, MissingFile_IsTold) {
    open("gone.csv");
    EXPECT_EQ(boxes.texts(), Texts{"The file " + folder.file("gone.csv") +
                                   " cannot be read: No such file or directory"});
}

TEST_F(ViewReaderTest, FolderInsteadOfAFile_IsTold) {
    platform.files.putFolder(folder.file("sub"));
    open("sub");
    EXPECT_EQ(boxes.texts(),
              Texts{"The file " + folder.file("sub") + " cannot be read: it is a folder"});
}

TEST_F(ViewReaderTest, Cancel_LoadsNothing) {
    platform.fileDialogs.answer(std::nullopt);
    panel.LoadData.Click();
    ASSERT_EQ(platform.fileDialogs.opens.size(), 1U);
    EXPECT_EQ(platform.fileDialogs.opens[0].filterIndex, 4);
    EXPECT_TRUE(shown().empty());
}

TEST_F(ViewReaderTest, Menu_LoadsTheChosenFile) {
    platform.fileDialogs.answer(folder.write("view.csv", kHead + rowsText(301)));
    panel.LoadData.Click();
    EXPECT_EQ(shown().size(), 301U);
}

TEST(MapRangeCode, BothDirections) {
    const int decibels[] = {10, 5, 2, 1, 10, 10};
    for (int code = 0; code < 6; ++code) {
        int out = -1;
        MapRangeCode(code, false, out);
        EXPECT_EQ(out, decibels[code]);
    }
    const std::pair<int, int> codes[] = {{10, 0}, {5, 1}, {2, 2}, {1, 3}, {4, 4}, {7, 7}, {0, 0}};
    for (const auto& [value, code] : codes) {
        int out = -1;
        MapRangeCode(value, true, out);
        EXPECT_EQ(out, code) << value;
    }
}

// The older log.

std::string logText(const char* head, const std::string& rows) {
    return std::string(head) + "2010-05-01 10:00:00;\r\n______________________________\r\n \r\n" +
           rows +
           " ........END OF LOG FOR 2010-05-01 10:05:00\r\n"
           "___________________________________________\r\n \r\n";
}

TEST_F(ViewReaderTest, OldLog_IsKnownByItsLastLine) {
    load(logText("Data at;", rowsText(301)));
    EXPECT_EQ(shown(), std::vector<double>(301, -35));
    EXPECT_EQ(panel.CWGraph1.firstX(), 100);
    EXPECT_EQ(panel.CWGraph1.increment(), 10);
    EXPECT_EQ(panel.CFLabel.Caption.get(), "Center: 1.6 kHz");
    EXPECT_EQ(panel.SpanLabel.Caption.get(), "Span: 3 kHz");
    EXPECT_LE(panel.CWGraph1.yAxis().Minimum, -35);
    EXPECT_GE(panel.CWGraph1.yAxis().Maximum, -35);
    EXPECT_EQ(panel.CWGraph1.xAxis().Minimum, 100);
    EXPECT_EQ(panel.CWGraph1.xAxis().Maximum, 3100);
}

TEST_F(ViewReaderTest, OldLogOfPairs_HalvesTheSpacing) {
    std::string rows;
    for (int i = 0; i < 301; ++i) rows += std::to_string(i * 2) + ".000;-90;-40\r\n";
    load(logText("Data(MinMax) at;", rows));
    ASSERT_EQ(shown().size(), 602U);
    EXPECT_EQ(shown()[0], -90);
    EXPECT_EQ(shown()[601], -40);
    EXPECT_EQ(panel.CWGraph1.increment(), 1);
}

TEST_F(ViewReaderTest, OldLinearLog_RunsFromZeroToHundred) {
    load(logText("Data(LIN) at;", rowsText(301, "35")));
    EXPECT_EQ(panel.CWGraph1.yAxis().Minimum, 0);
    EXPECT_EQ(panel.CWGraph1.yAxis().Maximum, 100);
}

TEST_F(ViewReaderTest, OldZeroSpanLog_SetsTheStop) {
    load(logText("Data(ZeroSpan) at;", rowsText(301)));
    EXPECT_TRUE(panel.Shown.fromFile);
    EXPECT_EQ(panel.ViewStop, 3100);
    EXPECT_EQ(panel.ViewSpan, 0);
    EXPECT_EQ(panel.SpanLabel.Caption.get(), "Span: 0 Hz");
    load(logText("Data at;", rowsText(301)));
    EXPECT_EQ(panel.ViewSpan, 3000);
}

TEST_F(ViewReaderTest, OldLog_StopsAtTheRowsThatAreThere) {
    load(logText("Data at;", rowsText(7)));
    EXPECT_EQ(shown(), std::vector<double>(7, -35));
    load(logText("Data at;", rowsText(400)));
    EXPECT_EQ(shown().size(), 301U);
}

TEST_F(ViewReaderTest, OldLogWithoutRows_ShowsNothing) {
    load(logText("Data at;", ""));
    EXPECT_TRUE(shown().empty());
}

}  // namespace
}  // namespace zel
