#pragma once
// The keys Single, Continuous and Stop over an instrument in the read cycle.

#include <gtest/gtest.h>

#include "model/CodeTables.h"
#include "tests/trace/ReadCycle.h"

namespace zel {

struct SweepControlTest : ReadCycle {
    SweepControlTest() {
        panel.State = ControllerForm::Freq;
        mirror.Span = 1e6;
        mirror.TraceDetector = DETSAMPLE;
    }
    void fullCycle() {
        askSettings();
        cmd("WAIT");
        trace(levelBlock(-35250));
    }
    void selectiveCycle() {
        cmd("WAIT");
        trace(levelBlock(-35250));
    }
    /// Presses Stop when the trace of that number, from 1, is drawn.
    void stopAtPlot(unsigned long number) {
        panel.CWGraph1.Changed.connect([this, number] {
            if (panel.CWGraph1.plotSerial() == number && panel.StopButton.Visible)
                panel.StopButton.Click();
        });
    }
    void expectIdle() {
        EXPECT_FALSE(panel.ContinuosLoopActive);
        EXPECT_FALSE(panel.STOPFlag);
        EXPECT_FALSE(panel.StopButton.Visible);
        EXPECT_TRUE(panel.PlayContinuousButton.Visible);
        EXPECT_TRUE(panel.Connection.Enabled);
        EXPECT_TRUE(panel.Utility.Enabled);
        EXPECT_TRUE(panel.RecordData.Visible);
    }
};

}  // namespace zel
