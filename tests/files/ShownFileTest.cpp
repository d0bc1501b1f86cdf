// What stands around the graph, and what the next sweep asks, after a loaded file.

#include <gtest/gtest.h>

#include "tests/files/FileSession.h"
#include "trace/TraceReader.h"
#include "trace/ViewAnnotations.h"

namespace zel {
namespace {

using CF = ControllerForm;

struct ShownFileTest : FileSession, ::testing::Test {
    ShownFileTest() {
        FileSession writer;
        writer.narrowSpan();
        writer.mirror.TraceDetector = 4;
        writer.mirror.ReferenceRange = 1;
        writer.mirror.ReferenceLevel = -10;
        writer.sweepOf(ramp(-35000, -100));
        text = writer.save("view.csv");
        writer.panel.InstrumentMode = CF::DISTTOFAULTMEASURE;
        writer.sweepOf(ramp(-35000, -100));
        faults = writer.save("faults.csv");
    }
    void show(const std::string& what) {
        folder.write("shown.csv", what);
        open("shown.csv");
    }
    void fullCycle() {
        get("FREQ", "900000000");
        get("SPAN", "2000000");
        get("REFLVL", "-30");
        get("UNIT", "0");
        get("RANGE", "2");
        get("DYNRANGE", "0");
        get("TRACEDET", "3");
        get("SWPTIME", "0.02");
        cmd("WAIT");
        trace(levelBlock(-45000));
    }
    std::string text;
    std::string faults;
};

TEST_F(ShownFileTest, WhileAViewRuns_NothingIsLoaded) {
    panel.ContinuosLoopActive = true;
    const unsigned long plots = panel.CWGraph1.plotSerial();
    show(text);
    panel.ContinuosLoopActive = false;
    panel.AcquisitionRunning = panel.STOPFlag = true;  // between two passes
    show(text);
    EXPECT_EQ(boxes.texts(), (Texts{"Please exit the continuous View Mode first",
                                    "Please exit the continuous View Mode first"}));
    EXPECT_EQ(panel.CWGraph1.plotSerial(), plots);
    EXPECT_FALSE(panel.Shown.fromFile);
}

TEST_F(ShownFileTest, WhileARecordingRuns_NothingIsLoaded) {
    panel.RecordDataFlag = true;
    platform.fileDialogs.answer(folder.write("shown.csv", text));
    panel.LoadData.Click();
    show(text);
    EXPECT_EQ(boxes.texts(),
              (Texts{"Please stop the recording first", "Please stop the recording first"}));
    EXPECT_TRUE(platform.fileDialogs.opens.empty());
    EXPECT_FALSE(panel.Shown.fromFile);
}

TEST_F(ShownFileTest, Annotations_AreThoseOfTheFile) {
    mirror.ResolutionBandwidth = 1;
    mirror.SweepTime = 9;
    show(text);
    const ViewAnnotations view = annotateView(panel, mirror);
    EXPECT_EQ(view.refLevel, "Ref -10 dBm");
    EXPECT_EQ(view.range, "5dB/DIV");
    EXPECT_EQ(view.rbw, "RBW 100 kHz");
    EXPECT_EQ(view.vbw, "VBW 100 kHz");
    EXPECT_EQ(view.sweepTime, "SWT 20 ms");
    EXPECT_EQ(view.detector, "Det RMS");
    EXPECT_EQ(view.mode, "Analyzer");
    EXPECT_EQ(view.unit, "dBm");
    EXPECT_EQ(view.xUnit, "Hz");
}

TEST_F(ShownFileTest, FileWithoutAHeader_ClaimsNothing) {
    mirror.ResolutionBandwidth = 1;
    show("100.000;-35; \r\n110.000;-36; \r\n");
    const ViewAnnotations view = annotateView(panel, mirror);
    EXPECT_EQ(view.rbw, "");
    EXPECT_EQ(view.vbw, "");
    EXPECT_EQ(view.sweepTime, "");
    EXPECT_EQ(view.detector, "");
}

TEST_F(ShownFileTest, DistanceToFault_IsDrawnOverMetres) {
    show(faults);
    EXPECT_EQ(annotateView(panel, mirror).xUnit, "m");
    EXPECT_EQ(annotateView(panel, mirror).mode, "Fault Location");
}

TEST_F(ShownFileTest, SweepOfAnotherMode_KeepsItsOwnAxisAndName) {
    startConnected();
    fullCycle();
    bool success = false;
    program.traces().ReadSingleTrace(success);
    ASSERT_TRUE(success);
    panel.InstrumentMode = CF::DISTTOFAULTMEASURE;
    EXPECT_EQ(annotateView(panel, mirror).xUnit, "Hz");
    EXPECT_EQ(annotateView(panel, mirror).mode, "Analyzer");
}

TEST_F(ShownFileTest, NextSelectiveCycle_AsksEverythingOnce) {
    startConnected();
    show(text);
    fullCycle();
    cmd("WAIT");
    trace(levelBlock(-45000));
    bool success = false;
    program.traces().ReadSingleTrace2({}, success);
    EXPECT_TRUE(success);
    EXPECT_EQ(mirror.ReferenceRange, 2);
    EXPECT_EQ(mirror.ReferenceLevel, -30);
    EXPECT_EQ(annotateView(panel, mirror).range, "2dB/DIV");
    EXPECT_EQ(annotateView(panel, mirror).detector, "Det Sample");
    program.traces().ReadSingleTrace2({}, success);
    EXPECT_TRUE(success);
    expectPlayed();
}

}  // namespace
}  // namespace zel
