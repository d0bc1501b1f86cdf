// A recording that waits for external triggers, as a page of protocol.

#include <gtest/gtest.h>

#include "link/CommandExchange.h"
#include "tests/files/FileSession.h"

namespace zel {
namespace {

using CF = ControllerForm;

struct ExternalTriggerTest : FileSession, ::testing::Test {
    ExternalTriggerTest() {
        startConnected();
        get("TRIGSRC", "2");
        panel.RecordData.Click();
        forms.time.TimeIntervalBox.Text = "3.6";
        platform.fileDialogs.answer(folder.file("trace.csv"));
    }
    void submit() { forms.time.SubmitTimeButton.Click(); }
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
    /// The sweep of a cycle after the trigger, which waits once more.
    void sweep() {
        cmd("WAIT");
        trace(levelBlock(-35000));
    }
    void stopAfterTraces(int count) {
        panel.SaveView.connect([this, count](const std::string&) {
            if (++saved == count) panel.StopButton.Click();
        });
    }
    int saved = 0;
    void resynchronisation() {
        port.expect("\r").answer("1\r");
        port.expect("\r").answer("1\r");
    }
    int traces() const {
        int found = 0;
        for (const std::string& line : linesOf(folder.read("trace.csv")))
            if (line.compare(0, 11, "Trace Name;") == 0) ++found;
        return found;
    }
};

TEST_F(ExternalTriggerTest, FirstTrace_AsksTheSettingsAndLaterOnesStartTheSweepAnew) {
    cmd("WAIT");
    settings();
    sweep();
    cmd("WAIT");
    cmd("INIT");
    sweep();
    stopAfterTraces(2);
    submit();
    expectPlayed();
    EXPECT_EQ(traces(), 2);
    EXPECT_EQ(boxes.texts(), Texts{});
    EXPECT_FALSE(forms.time.ContinuousRecording);
    EXPECT_FALSE(panel.RecordData.Checked);
    EXPECT_EQ(panel.MousePointer.get(), 0);
    EXPECT_FALSE(forms.time.X.Enabled);
}

TEST_F(ExternalTriggerTest, TimeOut_IsToldResynchronisesAndEndsIt) {
    port.expect("cmd\r").answer("0\r");
    port.expect("WAIT\r").silence();
    resynchronisation();
    std::int64_t told = 0;
    boxes.whileShown = [&](const Box&) { told = platform.clock.micros(); };
    const std::int64_t start = platform.clock.micros();
    submit();
    expectPlayed();
    EXPECT_EQ(boxes.texts(), Texts{"External trigger timed out!"});
    // 3.6 s in the field are four whole seconds.
    EXPECT_NEAR(static_cast<double>(told - start), 4e6, 0.3e6);
    EXPECT_GE(platform.clock.micros() - told, 600000);
    EXPECT_EQ(traces(), 0);
    EXPECT_FALSE(panel.RecordData.Checked);
    EXPECT_FALSE(panel.RecordDataFlag);
    EXPECT_FALSE(panel.STOPFlag);
    EXPECT_TRUE(panel.PlayContinuousButton.Visible);
    EXPECT_TRUE(panel.PlayContinuousButton.Enabled);
    EXPECT_FALSE(panel.StopButton.Visible);
    // The line is in step again.
    get("FREQ", "900000000");
    std::string value;
    EXPECT_TRUE(program.exchange().GetInstrument("FREQ", value));
    EXPECT_EQ(value, "900000000");
}

TEST_F(ExternalTriggerTest, FailedLaterTrace_EndsIt) {
    cmd("WAIT");
    settings();
    sweep();
    cmd("WAIT");
    cmd("INIT", "4");
    submit();
    expectPlayed();
    EXPECT_EQ(traces(), 1);
    EXPECT_EQ(panel.MousePointer.get(), 0);
    EXPECT_FALSE(panel.RecordData.Checked);
    EXPECT_FALSE(forms.time.ContinuousRecording);
}

TEST_F(ExternalTriggerTest, Script_ReadsOneTraceACallAndSavesItItself) {
    panel.isSpecMeas = true;
    cmd("INIT");
    cmd("WAIT");
    settings();
    sweep();
    submit();
    expectPlayed();
    EXPECT_EQ(forms.time.RecordedCount, 1);
    EXPECT_EQ(traces(), 0);
    EXPECT_FALSE(forms.time.ContinuousRecording);
}

TEST_F(ExternalTriggerTest, ScriptsTimeOut_StopsTheScriptAndResynchronises) {
    panel.isSpecMeas = true;
    int stops = 0;
    forms.specialMeas.cmdStop.Clicked.connect([&] { ++stops; });
    cmd("INIT");
    port.expect("cmd\r").answer("0\r");
    port.expect("WAIT\r").silence();
    resynchronisation();
    submit();
    expectPlayed();
    EXPECT_EQ(stops, 1);
    EXPECT_EQ(boxes.texts(), Texts{"External trigger timed out!"});
    EXPECT_FALSE(forms.time.ContinuousRecording);
}

TEST_F(ExternalTriggerTest, FileThatCannotBeWritten_EndsIt) {
    cmd("WAIT");
    settings();
    sweep();
    // The chosen file vanishes with its folder after the choice.
    platform.files.putFolder(folder.file("sub"));
    platform.fileDialogs = {};
    platform.fileDialogs.answer(folder.file("sub/trace.csv"));
    platform.events.schedule(0, [this] { platform.files.vanish(folder.file("sub")); });
    submit();
    EXPECT_EQ(boxes.texts(), Texts{"The file " + folder.file("sub/trace.csv") +
                                   " cannot be written: No such file or directory\r\n"
                                   "The recording was stopped."});
    EXPECT_FALSE(panel.RecordData.Checked);
    EXPECT_FALSE(forms.time.ContinuousRecording);
}

}  // namespace
}  // namespace zel
