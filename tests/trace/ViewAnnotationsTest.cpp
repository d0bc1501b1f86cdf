// The texts around the graph, from the settings and the axes.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "forms/Forms.h"
#include "model/CodeTables.h"
#include "trace/ViewAnnotations.h"

namespace zel {
namespace {

struct ViewAnnotationsTest : ::testing::Test {
    ViewAnnotationsTest() {
        panel.CWGraph1.plotY(std::vector<double>(301, -50), 900e6, 1e6 / 3);
        panel.CWGraph1.setXRange(900e6, 1e9);
        panel.InstrumentMode = ControllerForm::ANALYZER;
        mirror.Span = 100e6;
        mirror.CenterFrequency = 950e6;
        mirror.ReferenceLevel = -20;
        mirror.SweepTime = 0.02;
        mirror.ResolutionBandwidth = 7;
        mirror.TraceDetector = 3;
    }
    ViewAnnotations view() const { return annotateView(panel, mirror); }

    Forms forms;
    ControllerForm& panel = forms.controller;
    ZEL3Variables mirror;
};

TEST_F(ViewAnnotationsTest, Settings_AreNamed) {
    const ViewAnnotations shown = view();
    EXPECT_TRUE(shown.ok);
    EXPECT_EQ(shown.refLevel, "Ref -20 dBm");
    EXPECT_EQ(shown.range, "10dB/DIV");
    EXPECT_EQ(shown.rbw, "RBW 100 kHz");
    EXPECT_EQ(shown.vbw, "VBW Auto");
    EXPECT_EQ(shown.sweepTime, "SWT 20 ms");
    EXPECT_EQ(shown.detector, "Det Sample");
    EXPECT_EQ(shown.mode, "Analyzer");
    EXPECT_EQ(shown.unit, "dBm");
    EXPECT_EQ(shown.xUnit, "Hz");
}

TEST_F(ViewAnnotationsTest, SettingSentSince_StrikesTheTextAndLeavesItThatOfTheSweep) {
    Sweep sweep;
    sweep.wanted = sweep.came = 301;
    sweep.settings = mirror;
    mirror.ResolutionBandwidth = 3;
    EXPECT_NE(annotateSweep(panel, mirror, sweep).rbw, "RBW 100 kHz") << "only asked for";
    sweep.settingsKept = true;
    mirror.VideoBandwidth = 3;
    mirror.SweepTime = 2;
    mirror.ReferenceRange = RANGE5DB;
    mirror.TraceDetector = 0;
    const ViewAnnotations view = annotateSweep(panel, mirror, sweep);
    EXPECT_EQ(view.rbw, "RBW 100 kHz");
    EXPECT_EQ(view.vbw, "VBW Auto");
    EXPECT_EQ(view.sweepTime, "SWT 20 ms");
    EXPECT_EQ(view.range, "10dB/DIV");
    EXPECT_EQ(view.detector, "Det Sample");
    EXPECT_TRUE(view.rbwUnsure && view.vbwUnsure && view.sweepTimeUnsure && view.rangeUnsure &&
                view.detectorUnsure);
    EXPECT_FALSE(view.refLevelUnsure || view.yUnsure || view.xUnsure);
    mirror.ReferenceLevel = -30;
    EXPECT_TRUE(annotateSweep(panel, mirror, sweep).refLevelUnsure);
    EXPECT_EQ(annotateSweep(panel, mirror, sweep).refLevel, "Ref -20 dBm");
    panel.Shown.fromFile = true;
    EXPECT_EQ(annotateSweep(panel, mirror, sweep).refLevel, annotateView(panel, mirror).refLevel);
}

TEST_F(ViewAnnotationsTest, LevelOfAnotherMode_IsUnsure) {
    Sweep sweep;
    sweep.wanted = sweep.came = 301;
    sweep.settings = mirror;
    panel.isConnected = true;
    panel.InstrumentMode = sweep.instrumentMode = ControllerForm::ANALYZER;
    const auto unsure = [&] {
        const ViewAnnotations view = annotateSweep(panel, mirror, sweep);
        EXPECT_EQ(view.refLevelUnsure, view.yUnsure);
        return view.refLevelUnsure;
    };
    EXPECT_FALSE(unsure()) << "never asked";
    sweep.levelMode = ControllerForm::ANALYZER;
    EXPECT_FALSE(unsure());
    sweep.levelMode = ControllerForm::DISTTOFAULTMEASURE;
    EXPECT_TRUE(unsure());
    sweep.settingsKept = true;
    EXPECT_TRUE(unsure());
    sweep.instrumentMode = ControllerForm::DISTTOFAULTMEASURE;
    EXPECT_FALSE(unsure()) << "the trace is of the mode of its level";
    sweep.instrumentMode = ControllerForm::ANALYZER;
    panel.InstrumentMode = ControllerForm::DISTTOFAULTMEASURE;
    EXPECT_FALSE(unsure()) << "so is the instrument";
    panel.InstrumentMode = ControllerForm::ANALYZER;
    panel.Shown.fromFile = true;
    EXPECT_FALSE(unsure());
    panel.Shown.fromFile = false;
    panel.isConnected = false;
    EXPECT_FALSE(unsure());
}

TEST_F(ViewAnnotationsTest, Axis_HasItsEndsAndItsMiddle) {
    EXPECT_EQ(view().left, "Start 900 MHz");
    EXPECT_EQ(view().center, "Center 950 MHz");
    EXPECT_EQ(view().right, "Stop 1 GHz");
}

TEST_F(ViewAnnotationsTest, ZoomedAxis_IsRoundedToFourDigitsOfItsWidth) {
    panel.CWGraph1.setXRange(912345678, 923456789);
    EXPECT_EQ(view().left, "Start 912.345678 MHz");
    panel.GraphZoomed = true;
    EXPECT_EQ(view().left, "Start 912.35 MHz");
    EXPECT_EQ(view().center, "Center 917.905 MHz");
    EXPECT_EQ(view().right, "Stop 923.46 MHz");
}

TEST_F(ViewAnnotationsTest, WithoutATrace_OnlyTheUnitsAreKnown) {
    panel.CWGraph1.clearPlot();
    EXPECT_FALSE(view().ok);
    EXPECT_EQ(view().unit, "dBm");
    EXPECT_EQ(view().left + view().center + view().right + view().refLevel, "");
}

TEST_F(ViewAnnotationsTest, Unit_IsThatOfTheRangeAndOfTheReference) {
    mirror.ReferenceUnit = UNITDBUV;
    EXPECT_EQ(view().unit, "dB\u00B5V");
    mirror.ReferenceUnit = UNITDB;
    mirror.ReferenceLevel = 0.5;
    EXPECT_EQ(view().unit, "dB");
    EXPECT_EQ(view().refLevel, "Ref 0.5 dB") << "decibels have no prefix";
    mirror.ReferenceUnit = UNITV;
    mirror.ReferenceLevel = 0.005;
    EXPECT_EQ(view().unit, "dBm");
    EXPECT_EQ(view().refLevel, "Ref 5 mV");
    mirror.ReferenceRange = RANGELIN;
    EXPECT_EQ(view().unit, "%");
}

TEST_F(ViewAnnotationsTest, RangeOfAFile_IsItsDecibelsADivision) {
    mirror.ReferenceRange = 5;
    EXPECT_EQ(shownRangeCode(panel, mirror), RANGEVSWR6);
    panel.Shown.fromFile = true;
    EXPECT_EQ(shownRangeCode(panel, mirror), RANGE5DB);
    mirror.ReferenceRange = 1;
    EXPECT_EQ(shownRangeCode(panel, mirror), RANGE1DB);
    mirror.ReferenceRange = 10;
    EXPECT_EQ(shownRangeCode(panel, mirror), RANGE10DB);
    mirror.ReferenceRange = RANGELIN;
    EXPECT_EQ(shownRangeCode(panel, mirror), RANGELIN);
}

TEST_F(ViewAnnotationsTest, RefusedSetting_MarksWhatRestsOnIt) {
    const auto marks = [this](const char* word) {
        mirror.Unsure.clear();
        if (*word != 0) mirror.Unsure.sent(word, false);
        const ViewAnnotations shown = view();
        std::string text;
        if (shown.refLevelUnsure) text += "level ";
        if (shown.rangeUnsure) text += "range ";
        if (shown.detectorUnsure) text += "detector ";
        if (shown.xUnsure) text += "x ";
        if (shown.yUnsure) text += "y ";
        return text;
    };
    EXPECT_EQ(marks(""), "");
    EXPECT_EQ(marks("FREQ"), "x ");
    EXPECT_EQ(marks("SPAN"), "x ");
    EXPECT_EQ(marks("REFLVL"), "level y ");
    EXPECT_EQ(marks("RANGE"), "range y ");
    EXPECT_EQ(marks("TRACEDET"), "detector ");
    panel.Shown.xUnit = "s";
    EXPECT_EQ(marks("FREQ"), "");
    EXPECT_EQ(marks("SPAN"), "x ");
    panel.Shown.xUnit = "m";
    EXPECT_EQ(marks("FREQ") + marks("SPAN"), "");
    panel.Shown.fromFile = true;
    EXPECT_EQ(marks("REFLVL"), "");
}

TEST_F(ViewAnnotationsTest, File_SaysWhatOnlyItKnows) {
    panel.Shown.fromFile = true;
    panel.Shown.xUnit = "Hz";
    panel.Shown.rbw = "300000";
    panel.Shown.sweepTime = "0.5";
    panel.Shown.detector = "RMS";
    panel.Shown.mode = "Receiver";
    const ViewAnnotations shown = view();
    EXPECT_EQ(shown.rbw, "RBW 300 kHz");
    EXPECT_EQ(shown.vbw, "");
    EXPECT_EQ(shown.sweepTime, "SWT 500 ms");
    EXPECT_EQ(shown.detector, "Det RMS");
    panel.Shown.detector = "Auto Peak (Auto)";
    EXPECT_EQ(view().detector, "Det Auto Peak") << "as of the instrument";
    EXPECT_EQ(shown.mode, "Receiver");
}

}  // namespace
}  // namespace zel
