#include <gtest/gtest.h>

#include "ZELSim/InProcessPort.h"
#include "link/CommandExchange.h"
#include "tests/files/FileSession.h"

namespace zel {
namespace {

using CF = ControllerForm;

std::size_t count(const std::string& text, const std::string& what) {
    std::size_t found = 0;
    for (std::size_t at = 0; (at = text.find(what, at)) != std::string::npos; at += what.size())
        ++found;
    return found;
}

/// A session with the simulated instrument in virtual time.
struct RecordingTest : ::testing::Test {
    explicit RecordingTest(const std::string& commandLine = "")
        : program(platform.bundle(port), commandLine) {
        platform.ports.ports = {"COM1"};
        program.start();
        EXPECT_TRUE(program.connect({LinkAddress::Kind::Serial, "COM1", 57600}, false));
    }
    void begin(const std::string& interval, const std::string& name = "trace.csv") {
        panel.RecordData.Click();
        forms.time.TimeIntervalBox.Text = interval;
        platform.fileDialogs.answer(folder.file(name));
        forms.time.SubmitTimeButton.Click();
    }
    void set(const std::string& setting) { ASSERT_TRUE(program.exchange().SetInstrument(setting)); }
    std::size_t traces() { return count(folder.read("trace.csv"), "Trace Name;"); }

    VirtualPlatform platform;
    Folder folder{platform.files};
    zelsim::InProcessPort port{platform.clock, platform.events, {}, {.answering = 0.0001}};
    Program program;
    Forms& forms = program.forms();
    CF& panel = forms.controller;
    ZEL3Variables& mirror = program.variables();
    RecordedBoxes& boxes = platform.boxes;
};

struct RecordingWithoutHeader : RecordingTest {
    RecordingWithoutHeader() : RecordingTest(" noheader ") {}
};

TEST_F(RecordingWithoutHeader, Traces_AreRowsAlone) {
    begin("1");
    platform.events.runFor(2500);
    panel.StopButton.Click();
    const std::string text = folder.read("trace.csv");
    EXPECT_EQ(text.find("Reference Unit"), std::string::npos);
    EXPECT_GT(count(text, "\r\n"), 301U);
}

TEST_F(RecordingTest, Dialog_AsksForTheInterval) {
    panel.RecordData.Click();
    EXPECT_TRUE(forms.time.Visible);
    EXPECT_FALSE(forms.time.Modal);
    EXPECT_EQ(forms.time.lblRecText.Caption.get(), "Record data every");
    EXPECT_FALSE(mirror.ExternalTriggerActive);
    EXPECT_FALSE(panel.RecordData.Checked);
}

TEST_F(RecordingTest, ExternalTrigger_AsksForTheTimeout) {
    for (const char* trigger : {"TRIGSRC,2", "TRIGSRC,3"}) {
        set(trigger);
        panel.RecordData.Click();
        EXPECT_EQ(forms.time.lblRecText.Caption.get(), "Timeout (ExtTrigger): ");
        EXPECT_TRUE(mirror.ExternalTriggerActive);
        forms.time.CancelTimeButton.Click();
    }
    set("TRIGSRC,1");
    panel.RecordData.Click();
    EXPECT_FALSE(mirror.ExternalTriggerActive);
}

TEST_F(RecordingTest, Submit_EmptiesTheFileAndStartsTheTimer) {
    folder.write("trace.csv", "older");
    begin("2.5");
    EXPECT_EQ(folder.read("trace.csv"), "");
    EXPECT_EQ(panel.RecordTimeValue, 2.5);
    EXPECT_EQ(forms.time.X.Interval.get(), 2500);
    EXPECT_TRUE(forms.time.X.Enabled);
    EXPECT_TRUE(panel.RecordData.Checked);
    EXPECT_TRUE(panel.RecordDataFlag);
    EXPECT_FALSE(forms.time.Visible);
    EXPECT_FALSE(panel.PlayContinuousButton.Visible);
    EXPECT_FALSE(panel.PlayContinuousButton.Enabled);
    EXPECT_TRUE(panel.StopButton.Visible);
    EXPECT_EQ(panel.DataFileName, folder.file("trace.csv"));
    ASSERT_EQ(platform.fileDialogs.saves.size(), 1U);
    EXPECT_TRUE(platform.fileDialogs.saves[0].promptOverwrite);
    EXPECT_EQ(platform.fileDialogs.saves[0].filterIndex, 4);
    EXPECT_EQ(platform.fileDialogs.saves[0].filter,
              "All Files (*.*)|*.*|Text Files(*.txt)|*.txt|Dat Files (*.dat)|*.dat|"
              "CSV Files (*.csv)|*.csv");
}

TEST_F(RecordingTest, EachTick_AppendsATraceWithItsHeader) {
    begin("1");
    platform.events.runFor(5500);
    EXPECT_EQ(traces(), 5U);
    EXPECT_EQ(forms.time.RecordedCount, 5);
    EXPECT_TRUE(forms.time.ContinuousRecording);
    EXPECT_EQ(count(folder.read("trace.csv"), "\r\n\r\n"), 5U);
}

TEST_F(RecordingTest, FirstTrace_ReadsTheSettingsAndLaterOnesDoNot) {
    begin("1");
    set("REFLVL,-33");
    platform.events.runFor(1500);
    EXPECT_EQ(mirror.ReferenceLevel, -33);
    set("REFLVL,-44");
    platform.events.runFor(1000);
    EXPECT_EQ(traces(), 2U);
    EXPECT_EQ(mirror.ReferenceLevel, -33);
}

TEST_F(RecordingTest, NextRecording_BeginsWithTheSettingsAgain) {
    begin("1");
    platform.events.runFor(2500);
    panel.StopButton.Click();
    platform.events.runFor(2000);
    begin("1");
    EXPECT_EQ(forms.time.RecordedCount, 0);
    set("REFLVL,-33");
    platform.events.runFor(1500);
    EXPECT_EQ(mirror.ReferenceLevel, -33);
    EXPECT_EQ(traces(), 1U);
}

TEST_F(RecordingTest, Recording_LoadsAsASeries) {
    begin("1");
    platform.events.runFor(3500);
    panel.StopButton.Click();
    int shown = 0;
    panel.TraceLoaded.connect([&] { ++shown; });
    panel.OpenFile(folder.file("trace.csv"));
    EXPECT_EQ(shown, 3);
}

TEST_F(RecordingTest, Stop_EndsIt) {
    begin("1");
    platform.events.runFor(2500);
    panel.StopButton.Click();
    platform.events.runFor(5000);
    EXPECT_EQ(traces(), 2U);
    EXPECT_FALSE(panel.RecordData.Checked);
    EXPECT_FALSE(panel.RecordDataFlag);
    EXPECT_FALSE(forms.time.ContinuousRecording);
    EXPECT_FALSE(forms.time.X.Enabled);
    EXPECT_EQ(forms.time.RecordedCount, 0);
    EXPECT_TRUE(panel.PlayContinuousButton.Visible);
    EXPECT_TRUE(panel.PlayContinuousButton.Enabled);
    EXPECT_EQ(panel.FileLabel.Caption.get(), "");
}

TEST_F(RecordingTest, UncheckedEntry_LetsTheNextTickWindUp) {
    begin("1");
    platform.events.runFor(1500);
    panel.RecordData.Click();
    EXPECT_FALSE(panel.RecordData.Checked);
    EXPECT_FALSE(panel.RecordDataFlag);
    EXPECT_TRUE(forms.time.X.Enabled);
    platform.events.runFor(1000);
    EXPECT_FALSE(forms.time.X.Enabled);
    EXPECT_FALSE(forms.time.ContinuousRecording);
    EXPECT_TRUE(panel.PlayContinuousButton.Enabled);
    EXPECT_EQ(traces(), 1U);
}

TEST_F(RecordingTest, CancelledFile_DoesNotStartIt) {
    panel.RecordData.Click();
    forms.time.TimeIntervalBox.Text = "1";
    platform.fileDialogs.answer(std::nullopt);
    forms.time.SubmitTimeButton.Click();
    EXPECT_FALSE(panel.RecordData.Checked);
    EXPECT_FALSE(panel.RecordDataFlag);
    EXPECT_FALSE(forms.time.Visible);
    EXPECT_FALSE(forms.time.X.Enabled);
    EXPECT_EQ(boxes.texts(), Texts{});
}

TEST_F(RecordingTest, FileThatCannotBeMade_IsToldAndDoesNotStartIt) {
    begin("1", "gone/trace.csv");
    EXPECT_EQ(boxes.texts(), Texts{"The file " + folder.file("gone/trace.csv") +
                                   " cannot be written: No such file or directory"});
    EXPECT_FALSE(panel.RecordData.Checked);
    EXPECT_FALSE(forms.time.X.Enabled);
}

TEST_F(RecordingTest, NameWithDat_IsSaidToBeReadAsAnOldLog) {
    begin("1", "data1.csv");
    EXPECT_EQ(boxes.texts().size(), 1U);
    EXPECT_NE(boxes.texts().at(0).find("The name data1.csv holds \"dat\""), std::string::npos);
    EXPECT_TRUE(panel.RecordData.Checked);
}

TEST_F(RecordingTest, SecondSubmit_DoesNothing) {
    begin("1");
    forms.time.TimeIntervalBox.Text = "9";
    forms.time.SubmitTimeButton.Click();
    EXPECT_EQ(forms.time.X.Interval.get(), 1000);
    EXPECT_EQ(platform.fileDialogs.saves.size(), 1U);
}

TEST_F(RecordingTest, IntervalOfZero_NeverFires) {
    for (const char* interval : {"0", "", "abc", "-3"}) {
        begin(interval);
        platform.events.runFor(10000);
        EXPECT_EQ(folder.read("trace.csv"), "") << interval;
        EXPECT_EQ(forms.time.RecordedCount, 0);
        EXPECT_NE(panel.FileLabel.Caption.get().find("takes no trace"), std::string::npos);
        panel.StopButton.Click();
    }
}

TEST_F(RecordingTest, HugeInterval_IsBounded) {
    begin("1e30");
    EXPECT_EQ(forms.time.X.Interval.get(), 2147483647);
    panel.StopButton.Click();
}

TEST_F(RecordingTest, SweepLongerThanTheInterval_DelaysTheNextTick) {
    set("SWPTIME,2");
    begin("1.5");
    platform.events.runFor(20000);
    // The sweep sets the pace, and no tick is lost to the interval's grid (3 s).
    EXPECT_GE(traces(), 7U);
    EXPECT_LE(traces(), 10U);
}

TEST_F(RecordingTest, OtherFileDialogs_DoNotTurnItAside) {
    begin("1");
    platform.events.runFor(1500);
    platform.fileDialogs.answer(folder.write("other.csv", "1.000;2; \r\n"));
    panel.LoadData.Click();
    platform.events.runFor(2000);
    EXPECT_EQ(traces(), 3U);
    EXPECT_EQ(folder.read("other.csv"), "1.000;2; \r\n");
}

TEST_F(RecordingTest, VanishedFolder_IsToldAndEndsIt) {
    platform.files.putFolder(folder.file("sub"));
    begin("1", "sub/trace.csv");
    platform.events.runFor(1500);
    platform.files.vanish(folder.file("sub"));
    platform.events.runFor(3000);
    EXPECT_EQ(boxes.texts(), Texts{"The file " + folder.file("sub/trace.csv") +
                                   " cannot be written: No such file or directory\r\n"
                                   "The recording was stopped."});
    EXPECT_FALSE(panel.RecordData.Checked);
    EXPECT_FALSE(forms.time.X.Enabled);
    EXPECT_EQ(count(folder.read("sub/trace.csv"), "Trace Name;"), 1U);
    EXPECT_TRUE(panel.PlayContinuousButton.Enabled);
}

TEST_F(RecordingTest, PowerMenu_KeepsAPowerLog) {
    panel.PwrButton.Click();
    platform.events.runFor(1000);
    ASSERT_EQ(panel.State, CF::POWER);
    begin("1");
    platform.events.runFor(3500);
    const Texts lines = linesOf(folder.read("trace.csv"));
    ASSERT_EQ(lines.size(), 3U);
    for (const std::string& line : lines) EXPECT_EQ(line.substr(0, 10), "Power at: ");
    panel.StopButton.Click();
}

TEST_F(RecordingTest, Progress_TellsCountSizeTimeAndWhatIsNext) {
    begin("10");
    platform.events.runFor(2000);
    EXPECT_EQ(panel.FileLabel.Caption.get(), "trace.csv: 0 traces, 0 B, 00:00:01, next in 9 s");
    platform.events.runFor(12000);
    const std::string told = panel.FileLabel.Caption;
    EXPECT_EQ(told.substr(0, 20), "trace.csv: 1 trace, ");
    EXPECT_NE(told.find(" kB, 00:00:13, next in 7 s"), std::string::npos) << told;
}

TEST_F(RecordingTest, ExternalTrigger_TakesATraceATrigger) {
    set("TRIGSRC,2");
    platform.events.schedule(20000, [this] { panel.StopButton.Click(); });
    begin("5");
    EXPECT_FALSE(panel.RecordData.Checked);
    EXPECT_FALSE(forms.time.ContinuousRecording);
    EXPECT_EQ(boxes.texts(), Texts{});
    EXPECT_GE(traces(), 2U);
    EXPECT_EQ(panel.MousePointer.get(), 0);
    EXPECT_TRUE(panel.PlayContinuousButton.Enabled);
}

}  // namespace
}  // namespace zel
