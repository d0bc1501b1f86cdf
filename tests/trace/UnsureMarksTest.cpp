// Readouts that are struck out because the instrument may have other values.

#include <gtest/gtest.h>

#include "tests/Session.h"

namespace zel {
namespace {

struct UnsureMarksTest : TestSession, ::testing::Test {
    UnsureMarksTest() { startConnected(); }
};

TEST_F(UnsureMarksTest, Readouts_AreStruckAndTheGraphIsDrawnAgain) {
    int drawn = 0;
    panel.CWGraph1.Changed.connect([&] { ++drawn; });
    mirror.Unsure.sent("FREQ", false);
    EXPECT_TRUE(panel.CFLabel.Struck);
    EXPECT_FALSE(panel.SpanLabel.Struck);
    EXPECT_EQ(drawn, 1);
    mirror.Unsure.sent("SPAN", false);
    mirror.Unsure.known("FREQ");
    EXPECT_FALSE(panel.CFLabel.Struck);
    EXPECT_TRUE(panel.SpanLabel.Struck);
}

TEST_F(UnsureMarksTest, MarkerOfAnotherAxis_IsStruckUntilItIsReadAgain) {
    mirror.Span = 1e6;
    panel.MarkerLabel.Caption = "Marker: 0 Hz; -28 dBm";
    panel.DeltaLabel.Caption = "Delta: 1.5 GHz; -2 dBm";
    panel.CWGraph1.noteChange();
    EXPECT_FALSE(panel.MarkerLabel.Struck);
    mirror.Span = 0;
    panel.CWGraph1.noteChange();
    EXPECT_TRUE(panel.MarkerLabel.Struck);
    EXPECT_TRUE(panel.DeltaLabel.Struck);
    panel.DeltaLabel.Caption = "Cursor:2 ms; -50 dBm";
    EXPECT_FALSE(panel.DeltaLabel.Struck) << "of the pointer, now";
    panel.DeltaLabel.Caption = "Delta: 1.5 GHz; -2 dBm";
    EXPECT_TRUE(panel.DeltaLabel.Struck) << "the pointer has left";
    panel.MarkerLabel.Caption = "Marker: 0 s; -30 dBm";
    EXPECT_FALSE(panel.MarkerLabel.Struck);
    EXPECT_EQ(panel.MarkerLabel.ToolTip.get(), "");
    panel.InstrumentMode = ControllerForm::DISTTOFAULTMEASURE;
    panel.CWGraph1.noteChange();
    EXPECT_TRUE(panel.MarkerLabel.Struck);
    panel.MarkerLabel.Caption = "";
    EXPECT_FALSE(panel.MarkerLabel.Struck);
}

}  // namespace
}  // namespace zel
