// A timed recording over a line that fails now and then.

#include <gtest/gtest.h>

#include "tests/files/FileSession.h"

namespace zel {
namespace {

struct FailedTickTest : FileSession, ::testing::Test {
    FailedTickTest() {
        startConnected();
        get("TRIGSRC", "0");
        panel.RecordData.Click();
        forms.time.TimeIntervalBox.Text = "30";
        platform.fileDialogs.answer(folder.file("trace.csv"));
        forms.time.SubmitTimeButton.Click();
    }
    void fullSweep() {
        get("FREQ", "1500000000");
        get("SPAN", "1000000");
        get("REFLVL", "-20");
        get("UNIT", "0");
        get("RANGE", "0");
        get("DYNRANGE", "0");
        get("TRACEDET", "3");
        get("SWPTIME", "0.02");
        cmd("WAIT");
        trace(levelBlock(-35000));
    }
    void laterSweep() {
        cmd("INIT");
        cmd("WAIT");
        trace(levelBlock(-35000));
    }
    std::size_t traces() const {
        std::size_t found = 0;
        for (const std::string& line : linesOf(folder.read("trace.csv")))
            if (line.compare(0, 11, "Trace Name;") == 0) ++found;
        return found;
    }
};

TEST_F(FailedTickTest, OneSilentTick_DoesNotDecideTheNext) {
    fullSweep();
    platform.events.runFor(31000);
    EXPECT_EQ(traces(), 1U);
    port.expect("cmd\r").silence();
    platform.events.runFor(30000);
    EXPECT_EQ(traces(), 1U);
    laterSweep();
    platform.events.runFor(30000);
    expectPlayed();
    EXPECT_EQ(traces(), 2U);
    EXPECT_TRUE(panel.RecordData.Checked);
}

TEST_F(FailedTickTest, FailedTicks_ShowNoBox) {
    fullSweep();
    platform.events.runFor(31000);
    for (int i = 0; i < 3; ++i) {
        port.expect("cmd\r").silence();
        platform.events.runFor(30000);
    }
    expectPlayed();
    EXPECT_EQ(boxes.texts(), Texts{});
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

TEST_F(FailedTickTest, MissedTraces_AreCountedByWhatTheyLack) {
    const auto progress = [this](std::size_t length) {
        return panel.FileLabel.Caption.get().substr(0, length);
    };
    fullSweep();
    platform.events.runFor(31000);
    EXPECT_EQ(progress(22), "trace.csv: 1 trace, 7.");
    cmd("INIT");
    cmd("WAIT");
    trace(levelBlock(-35000).substr(0, 400));
    platform.events.runFor(30000);
    EXPECT_EQ(progress(34), "trace.csv: 1 trace, 1 incomplete, ");
    port.expect("cmd\r").silence();
    platform.events.runFor(30000);
    EXPECT_EQ(progress(44), "trace.csv: 1 trace, 1 incomplete, 1 failed, ");
    EXPECT_EQ(traces(), 1U);
    expectPlayed();
}

TEST_F(FailedTickTest, FileThatCannotBeWritten_IsShownThough) {
    platform.files.refuse(folder.file("trace.csv"), "Permission denied");
    fullSweep();
    platform.events.runFor(31000);
    EXPECT_EQ(boxes.texts(), Texts{"The file " + folder.file("trace.csv") +
                                   " cannot be written: Permission denied\r\n"
                                   "The recording was stopped."});
    EXPECT_FALSE(panel.RecordData.Checked);
}

}  // namespace
}  // namespace zel
