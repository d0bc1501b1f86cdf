#include <gtest/gtest.h>

#include "files/ViewWriter.h"
#include "tests/files/FileSession.h"

namespace zel {
namespace {

using CF = ControllerForm;

struct ViewWriterTest : FileSession, ::testing::Test {
    ViewWriterTest() {
        narrowSpan();
        mirror.TraceDetector = 3;
    }
    /// The rows of a file.
    Texts rows(const std::string& text) {
        Texts lines = linesOf(text);
        Texts found;
        for (const std::string& line : lines)
            if (!line.empty() && (line[0] == '.' || (line[0] >= '0' && line[0] <= '9')))
                found.push_back(line);
        return found;
    }
};

TEST_F(ViewWriterTest, Rows_RunFromTheStartToTheStop) {
    sweepOf(ramp(-35250, -10));
    const Texts found = rows(save("view.csv"));
    ASSERT_EQ(found.size(), 301U);
    EXPECT_EQ(found[0], "1499500000.000;-35.25; ");
    EXPECT_EQ(found[1], "1499503333.333;-35.26; ");
    EXPECT_EQ(found[300], "1500500000.000;-38.25; ");
}

TEST_F(ViewWriterTest, AutoPeak_WritesAPairARow) {
    mirror.TraceDetector = 0;
    sweepOf(ramp(-35000, -10, 602));
    const Texts found = rows(save("view.csv"));
    ASSERT_EQ(found.size(), 301U);
    EXPECT_EQ(found[0], "1499500000.000;-35;-35.01");
    EXPECT_EQ(found[300], "1500500000.000;-41;-41.01");
}

TEST_F(ViewWriterTest, ZeroSpan_GivesEveryRowTheSameX) {
    mirror.Span = 0;
    mirror.TraceDetector = 0;
    sweepOf(ramp(-35000, -10, 602));
    const Texts found = rows(save("view.csv"));
    ASSERT_EQ(found.size(), 301U);
    EXPECT_EQ(found[0], ".000;-35;-35.01");
    EXPECT_EQ(found[300], ".000;-41;-41.01");
}

TEST_F(ViewWriterTest, SmallX_HasNoLeadingZero) {
    panel.InstrumentMode = CF::DISTTOFAULTMEASURE;
    sweepOf(ramp(-35000, 0));
    program.sweep().axis.start = 0;
    program.sweep().axis.stop = 150;
    const Texts found = rows(save("view.csv"));
    ASSERT_EQ(found.size(), 301U);
    EXPECT_EQ(found[0], ".000;-35; ");
    EXPECT_EQ(found[1], ".500;-35; ");
    EXPECT_EQ(found[300], "150.000;-35; ");
}

TEST_F(ViewWriterTest, LinearRange_SavesTheValuesUnconverted) {
    mirror.ReferenceRange = 4;
    sweepOf(ramp(-35250, 0));
    EXPECT_EQ(rows(save("view.csv")).at(0), "1499500000.000;-35.25; ");
    EXPECT_NE(drawn().at(0), -35.25);
}

TEST_F(ViewWriterTest, Noheader_LeavesAPlainTable) {
    FileSession plain("  noheader ");
    plain.narrowSpan();
    plain.mirror.TraceDetector = 3;
    plain.sweepOf(ramp(-35250, -10));
    const Texts lines = linesOf(plain.save("view.csv"));
    ASSERT_EQ(lines.size(), 301U);
    EXPECT_EQ(lines[0], "1499500000.000;-35.25; ");
}

TEST_F(ViewWriterTest, IncompleteTrace_IsRefusedWithItsSamplesAndNoFile) {
    sweepOf(ramp(-35250, 0));
    program.sweep().came = 150;
    platform.fileDialogs.answer(folder.file("view.csv"));
    panel.SaveCurrentView.Click();
    EXPECT_EQ(boxes.texts(), Texts{"The trace is incomplete, 150 of 301 samples came, and is not "
                                   "saved. Read a new one first."});
    EXPECT_TRUE(platform.fileDialogs.saves.empty());
    EXPECT_FALSE(folder.has("view.csv"));
    // A reading of the power sensor has nothing to do with the trace that stands there.
    panel.InstrumentMode = CF::POWERSENSOR;
    panel.SaveCurrentView.Click();
    EXPECT_EQ(platform.fileDialogs.saves.size(), 1U);
    EXPECT_TRUE(folder.has("view.csv"));
    EXPECT_EQ(boxes.texts().size(), 1U);
}

TEST_F(ViewWriterTest, SecondSave_ReplacesTheFile) {
    sweepOf(ramp(-35250, 0));
    const std::string first = save("view.csv");
    EXPECT_EQ(save("view.csv").size(), first.size());
}

TEST_F(ViewWriterTest, NameWithDat_IsSaidToBeReadAsAnOldLog) {
    sweepOf(ramp(-35250, 0));
    EXPECT_FALSE(save("update.csv").empty());
    EXPECT_EQ(boxes.texts(), Texts{"The name update.csv holds \"dat\": when it is loaded, the file "
                                   "is read as a log of the older format.\r\n"
                                   "Choose another name to load it as a view."});
    EXPECT_EQ(boxes.boxes()[0].icon, BoxIcon::Exclamation);
    save("view.csv");
    EXPECT_EQ(boxes.texts().size(), 1U);
}

TEST_F(ViewWriterTest, WhileRecording_ASaveAppends) {
    sweepOf(ramp(-35250, 0));
    const std::string first = save("view.csv");
    forms.time.ContinuousRecording = true;
    EXPECT_EQ(save("view.csv"), first + first);
}

TEST_F(ViewWriterTest, Script_AppendsToItsOwnFile) {
    sweepOf(ramp(-35250, 0));
    panel.isSpecMeas = true;
    forms.specialMeas.DataFileNameSpec = folder.file("result.csv");
    panel.SaveCurrentView.Click();
    panel.SaveCurrentView.Click();
    EXPECT_EQ(rows(folder.read("result.csv")).size(), 602U);
    EXPECT_EQ(panel.DataFileName, folder.file("result.csv"));
    EXPECT_TRUE(platform.fileDialogs.saves.empty());
}

TEST_F(ViewWriterTest, ScriptWithoutAFile_SavesNothing) {
    panel.isSpecMeas = true;
    panel.SaveCurrentView.Click();
    EXPECT_EQ(boxes.texts(), Texts{});
}

TEST_F(ViewWriterTest, CancelledDialog_SavesNothing) {
    platform.fileDialogs.answer(std::nullopt);
    panel.SaveCurrentView.Click();
    ASSERT_EQ(platform.fileDialogs.saves.size(), 1U);
    EXPECT_EQ(platform.fileDialogs.saves[0].filterIndex, 4);
    EXPECT_EQ(boxes.texts(), Texts{});
}

TEST_F(ViewWriterTest, OtherKind_DoesNothing) {
    panel.CommonDialog1FileName = folder.file("view.csv");
    panel.SaveView("picture");
    EXPECT_FALSE(folder.has("view.csv"));
}

TEST_F(ViewWriterTest, PowerSensor_AppendsTheReadingToTheLog) {
    panel.InstrumentMode = CF::POWERSENSOR;
    panel.LastPowerText = "-12.5";
    panel.LastReflectionText = "1.25";
    EXPECT_EQ(save("power.csv"), "Power at: 2026-01-01 12:00:00: -12.5\r\n");
    forms.powerAndRefl.ReadPowerAndRefl = true;
    EXPECT_EQ(save("power.csv"),
              "Power at: 2026-01-01 12:00:00: -12.5\r\n"
              "Power at: 2026-01-01 12:00:00: -12.5\r\n"
              "VSWR:                          1.25\r\n");
}

struct LogHead {
    int detector;
    int range;
    double span;
    const char* head;
};

TEST_F(ViewWriterTest, OldLog_NamesSpanDetectorAndRange) {
    // A writer beside the program's own: no menu reaches the older format.
    FileOps files(panel, platform.fileDialogs, platform.folder, platform.files, platform.clock);
    ViewWriter writer(forms, mirror, program.sweep(), program.exchange(), files,
                      {platform.clock, platform.events, boxes, panel.DebugTextBox});
    const LogHead heads[] = {{3, 3, 1, "Data at;"},
                             {3, 4, 1, "Data(LIN) at;"},
                             {0, 3, 1, "Data(MinMax) at;"},
                             {0, 4, 1, "Data(LIN/MinMax) at;"},
                             {3, 0, 0, "Data(ZeroSpan) at;"}};
    for (const LogHead& row : heads) {
        mirror.TraceDetector = static_cast<std::uint8_t>(row.detector);
        mirror.ReferenceRange = row.range;
        mirror.Span = row.span;
        OutputFile file(platform.files, folder.file("log.dat"), OutputFile::Mode::Output);
        writer.WriteLogHeader(file);
        writer.WriteFooterAndCloseFile(file);
        EXPECT_EQ(
            linesOf(folder.read("log.dat")),
            (Texts{std::string(row.head) + "2026-01-01 12:00:00;", "______________________________",
                   " ", " ........END OF LOG FOR 2026-01-01 12:00:00",
                   "___________________________________________", " "}));
    }
}

TEST_F(ViewWriterTest, MissingFolder_IsToldAndNamesTheFile) {
    platform.fileDialogs.answer(folder.file("gone/view.csv"));
    panel.SaveCurrentView.Click();
    EXPECT_EQ(boxes.texts(), Texts{"The file " + folder.file("gone/view.csv") +
                                   " cannot be written: No such file or directory"});
    EXPECT_EQ(boxes.boxes()[0].icon, BoxIcon::Critical);
}

TEST_F(ViewWriterTest, FullDisk_IsTold) {
    sweepOf(ramp(-35250, 0));
    platform.files.room = 0;
    EXPECT_EQ(save("view.csv"), "");
    EXPECT_FALSE(folder.has("view.csv"));
    EXPECT_EQ(boxes.texts(), Texts{"The file " + folder.file("view.csv") +
                                   " cannot be written: No space left on device"});
}

TEST_F(ViewWriterTest, AppendThatRunsOutOfRoom_LeavesTheTracesBeforeIt) {
    sweepOf(ramp(-35250, 0));
    const std::string first = save("view.csv");
    forms.time.ContinuousRecording = true;
    platform.files.room = first.size() - 1;
    save("view.csv");
    EXPECT_EQ(folder.read("view.csv"), first);
    EXPECT_EQ(boxes.texts(), Texts{"The file " + folder.file("view.csv") +
                                   " cannot be written: No space left on device"});
}

TEST_F(ViewWriterTest, SaveThatRunsOutOfRoom_LeavesTheOlderFile) {
    sweepOf(ramp(-35250, 0));
    folder.write("view.csv", "older");
    platform.files.room = 2000;
    save("view.csv");
    EXPECT_EQ(folder.read("view.csv"), "older");
    EXPECT_EQ(boxes.texts().size(), 1U);
}

}  // namespace
}  // namespace zel
