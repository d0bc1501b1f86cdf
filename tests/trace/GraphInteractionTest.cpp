#include <gtest/gtest.h>

#include "forms/Forms.h"
#include "platform/virtual/RecordedBoxes.h"
#include "trace/GraphInteraction.h"
#include "trace/ManualScale.h"

namespace zel {
namespace {

constexpr Color kCyan = 16776960;
constexpr Color kBrightGreen = 65280;

struct GraphInteractionTest : ::testing::Test {
    ControllerForm panel;
    ZEL3Variables mirror;
    GraphInteraction interaction{panel, mirror};
    Graph& graph = panel.CWGraph1;

    GraphInteractionTest() {
        mirror.CenterFrequency = 1e9;
        mirror.Span = 2e8;
        interaction.setUpCursors();
    }
};

TEST_F(GraphInteractionTest, SetUpCursors_MakesTwoHiddenOnesInTheirColours) {
    interaction.setUpCursors();
    ASSERT_EQ(graph.cursorCount(), 2);
    EXPECT_EQ(graph.cursor(1).color, kCyan);
    EXPECT_EQ(graph.cursor(2).color, kBrightGreen);
    EXPECT_FALSE(graph.cursor(1).Visible);
    EXPECT_FALSE(graph.cursor(2).Visible);
    EXPECT_EQ(graph.TrackMode.get(), 1);
}

TEST_F(GraphInteractionTest, FinishCursors_LeavesThemHiddenAndTheTrackModePlain) {
    graph.showCursor(1, true);
    graph.TrackMode = 7;
    interaction.finishCursors();
    EXPECT_FALSE(graph.cursor(1).Visible);
    EXPECT_EQ(graph.TrackMode.get(), 1);
}

TEST_F(GraphInteractionTest, FinishCursors_PutsThemAtTheFootOfTheMiddle) {
    graph.setXRange(200, 500);
    graph.setYRange(-90, -20);
    interaction.finishCursors();
    for (int index = 1; index <= 2; ++index) {
        EXPECT_EQ(graph.cursor(index).X, 350);
        EXPECT_EQ(graph.cursor(index).Y, -90);
    }
}

TEST_F(GraphInteractionTest, Zoom_FirstClick_LetsTheUserDrawARectangle) {
    panel.cmdZoom.Click();
    EXPECT_EQ(graph.TrackMode.get(), 7);
    EXPECT_EQ(panel.cmdZoom.Caption.get(), "Out");
    EXPECT_EQ(panel.cmdZoom.BackColor.get(), 65280U);
    EXPECT_TRUE(panel.GraphZoomed);
}

TEST_F(GraphInteractionTest, Zoom_SecondClick_RestoresTheFullSpan) {
    panel.cmdZoom.Click();
    graph.setXRange(1.01e9, 1.02e9);
    panel.cmdZoom.Click();
    EXPECT_EQ(graph.xAxis().Minimum, 0.9e9);
    EXPECT_EQ(graph.xAxis().Maximum, 1.1e9);
    EXPECT_EQ(panel.cmdZoom.Caption.get(), "Zoom");
    EXPECT_EQ(panel.cmdZoom.BackColor.get(), 14737632U);
    EXPECT_FALSE(panel.GraphZoomed);
}

TEST_F(GraphInteractionTest, Zoom_SecondClick_TracksPlainlyWithoutAMarker) {
    panel.cmdZoom.Click();
    panel.cmdZoom.Click();
    EXPECT_EQ(graph.TrackMode.get(), 1);
}

TEST_F(GraphInteractionTest, Zoom_SecondClick_LetsCursorsBeDraggedWithAMarker) {
    mirror.MarkerOn = true;
    panel.cmdZoom.Click();
    panel.cmdZoom.Click();
    EXPECT_EQ(graph.TrackMode.get(), 2);
}

TEST_F(GraphInteractionTest, Zoom_AnyOtherCaption_CountsAsOut) {
    panel.cmdZoom.Caption = "ZOOM";
    panel.GraphZoomed = true;
    panel.cmdZoom.Click();
    EXPECT_EQ(panel.cmdZoom.Caption.get(), "Zoom");
    EXPECT_FALSE(panel.GraphZoomed);
}

TEST_F(GraphInteractionTest, Zoom_OutOfAnAxisThatIsNoFrequency_RestoresTheView) {
    mirror.Span = 0;
    panel.ViewStart = 0;
    panel.ViewStop = 0.02;
    panel.cmdZoom.Click();
    graph.setXRange(0.01, 0.011);
    panel.cmdZoom.Click();
    EXPECT_EQ(graph.xAxis().Minimum, 0);
    EXPECT_EQ(graph.xAxis().Maximum, 0.02);
}

TEST_F(GraphInteractionTest, Zoom_EachClick_RefreshesTheGraph) {
    int refreshed = 0;
    graph.Changed.connect([&] { ++refreshed; });
    panel.cmdZoom.Caption = "Out";
    interaction.cmdZoom_Click();  // nothing else of the graph changes but the x range
    const int before = refreshed;
    panel.cmdZoom.Caption = "Out";
    interaction.cmdZoom_Click();
    EXPECT_GT(refreshed, before);
}

TEST_F(GraphInteractionTest, ZoomFinished_EndsTheDrawingAndKeepsTheZoom) {
    panel.cmdZoom.Click();
    graph.ZoomFinished();
    EXPECT_EQ(graph.TrackMode.get(), 1);
    EXPECT_TRUE(panel.GraphZoomed);
    EXPECT_EQ(panel.cmdZoom.Caption.get(), "Out");
}

TEST_F(GraphInteractionTest, ZoomFinished_WithAMarker_LetsCursorsBeDragged) {
    mirror.MarkerOn = true;
    panel.cmdZoom.Click();
    graph.ZoomFinished();
    EXPECT_EQ(graph.TrackMode.get(), 2);
}

TEST_F(GraphInteractionTest, ZoomFinished_OutsideOfADrawing_ChangesNothing) {
    mirror.MarkerOn = true;
    graph.TrackMode = 1;
    graph.ZoomFinished();
    EXPECT_EQ(graph.TrackMode.get(), 1);
}

TEST_F(GraphInteractionTest, Tracking_ShowsThePointerInTheUnitOfTheAxis) {
    graph.PlotAreaTracking(1.23456e9, -45.678);
    EXPECT_EQ(panel.DeltaLabel.Caption.get(), "Cursor:1.23 GHz; -45.68 dBm");
    EXPECT_EQ(panel.DeltaLabel.ForeColor.get(), kCyan);
}

TEST_F(GraphInteractionTest, Tracking_LevelNearZero_HasAPrefix) {
    graph.PlotAreaTracking(1e9, 0.0125);
    EXPECT_EQ(panel.DeltaLabel.Caption.get(), "Cursor:1 GHz; 12.5 mdBm");
}

TEST_F(GraphInteractionTest, Tracking_AtZeroSpan_ShowsSeconds) {
    mirror.Span = 0;
    graph.PlotAreaTracking(0.0125, -3);
    EXPECT_EQ(panel.DeltaLabel.Caption.get(), "Cursor:12.5 ms; -3 dBm");
}

TEST_F(GraphInteractionTest, Tracking_InDistanceToFault_ShowsMetres) {
    panel.InstrumentMode = ControllerForm::DISTTOFAULTMEASURE;
    graph.PlotAreaTracking(12, 0);
    EXPECT_EQ(panel.DeltaLabel.Caption.get(), "Cursor:12 m; 0 dBm");
}

TEST_F(GraphInteractionTest, Tracking_InAnyReferenceUnit_NamesDbm) {
    mirror.ReferenceUnit = 6;
    graph.PlotAreaTracking(1e9, 50);
    EXPECT_EQ(panel.DeltaLabel.Caption.get(), "Cursor:1 GHz; 50 dBm");
}

TEST_F(GraphInteractionTest, Cursor1_Moved_SetsTheMarker) {
    graph.CursorMoved(1, 1.5e9, -33.33333);
    EXPECT_EQ(panel.MarkerValue, 1.5e9);
    EXPECT_EQ(panel.MarkerLevel, -33.33333);
    EXPECT_EQ(panel.MarkerLabel.Caption.get(), "Marker:1.5 GHz; -33.33 dBm");
    EXPECT_EQ(graph.cursor(1).X, 1.5e9);
    EXPECT_EQ(graph.cursor(1).Y, -33.33333);
    EXPECT_EQ(graph.cursor(1).color, kCyan);
}

TEST_F(GraphInteractionTest, Cursor1_Moved_RoundsToThreeDecimalsFirst) {
    mirror.Span = 0;
    graph.CursorMoved(1, 0.0124, -0.0004);  // seconds: a millisecond is what is left
    EXPECT_EQ(panel.MarkerLabel.Caption.get(), "Marker:12 ms; 0 dBm");
}

TEST_F(GraphInteractionTest, Cursor1_MovedWithDelta_RenewsTheDelta) {
    mirror.DeltaOn = true;
    graph.moveCursor(2, 1.1e9, -50);
    graph.CursorMoved(1, 1e9, -30);
    EXPECT_EQ(panel.DeltaLabel.Caption.get(), "Delta:100 MHz; -20 dBm");
}

TEST_F(GraphInteractionTest, Cursor1_MovedWithoutDelta_LeavesTheDeltaLabel) {
    panel.DeltaLabel.Caption = "as it was";
    graph.CursorMoved(1, 1e9, -30);
    EXPECT_EQ(panel.DeltaLabel.Caption.get(), "as it was");
}

TEST_F(GraphInteractionTest, Cursor2_MovedWithoutDelta_IsShownAsCursor) {
    panel.DeltaLabel.ForeColor = 0;
    graph.CursorMoved(2, 1.05e9, -40);
    EXPECT_EQ(panel.DeltaLabel.Caption.get(), "Cursor:1.05 GHz; -40 dBm");
    EXPECT_EQ(panel.DeltaLabel.ForeColor.get(), kCyan);
    EXPECT_EQ(graph.cursor(2).color, kBrightGreen);
    EXPECT_EQ(graph.cursor(2).X, 1.05e9);
}

TEST_F(GraphInteractionTest, Cursor2_MovedWithDelta_IsShownFromTheMarker) {
    mirror.DeltaOn = true;
    panel.MarkerValue = 1e9;
    panel.MarkerLevel = -30;
    graph.CursorMoved(2, 0.9e9, -35);
    EXPECT_EQ(panel.DeltaLabel.Caption.get(), "Delta:-100 MHz; -5 dBm");
    EXPECT_EQ(panel.MarkerValue, 1e9);
}

TEST_F(GraphInteractionTest, WithoutCursors_NothingIsShown) {
    graph.removeCursors();
    graph.CursorMoved(1, 1e9, -30);
    EXPECT_EQ(panel.MarkerLabel.Caption.get(), "");
    EXPECT_EQ(panel.MarkerValue, 0);
}

struct ManualScaleTest : ::testing::Test {
    ControllerForm panel;
    ManualScaleForm dialog;
    RecordedBoxes boxes;
    ManualScale scale{panel, dialog, boxes};

    ManualScaleTest() { panel.CWGraph1.setYRange(-120, -20); }
};

TEST_F(ManualScaleTest, MenuEntry_ShowsTheBoundsOfTheAxis) {
    panel.UtilityGraphSettings.Click();
    EXPECT_TRUE(dialog.Visible);
    EXPECT_EQ(dialog.manualSizeMin.Text.get(), "-120");
    EXPECT_EQ(dialog.manualSizeMax.Text.get(), "-20");
}

TEST_F(ManualScaleTest, Accept_SetsTheRangeAndCloses) {
    panel.UtilityGraphSettings.Click();
    dialog.manualSizeMin.Text = "-80,5";
    dialog.manualSizeMax.Text = "-10.25";
    dialog.cmdAccept.Click();
    EXPECT_EQ(panel.CWGraph1.yAxis().Minimum, -80.5);
    EXPECT_EQ(panel.CWGraph1.yAxis().Maximum, -10.25);
    EXPECT_FALSE(dialog.Visible);
}

TEST_F(ManualScaleTest, Accept_ReadsThousandsSeparators) {
    panel.UtilityGraphSettings.Click();
    dialog.manualSizeMin.Text = "0";
    dialog.manualSizeMax.Text = "1.234,5";
    dialog.cmdAccept.Click();
    EXPECT_EQ(panel.CWGraph1.yAxis().Maximum, 1234.5);
}

TEST_F(ManualScaleTest, Accept_TakesTheLargestBounds) {
    panel.UtilityGraphSettings.Click();
    dialog.manualSizeMin.Text = "-1000000000000000";
    dialog.manualSizeMax.Text = "1000000000000000";
    dialog.cmdAccept.Click();
    EXPECT_EQ(boxes.texts().size(), 0U);
    EXPECT_EQ(panel.CWGraph1.yAxis().Minimum, -1e15);
    EXPECT_EQ(panel.CWGraph1.yAxis().Maximum, 1e15);
}

TEST_F(ManualScaleTest, Cancel_LeavesTheRange) {
    panel.UtilityGraphSettings.Click();
    dialog.manualSizeMin.Text = "-80";
    dialog.cmdCancel.Click();
    EXPECT_EQ(panel.CWGraph1.yAxis().Minimum, -120);
    EXPECT_FALSE(dialog.Visible);
}

TEST_F(ManualScaleTest, OpenedAgain_ShowsTheBoundsOfThatMoment) {
    panel.UtilityGraphSettings.Click();
    dialog.cmdCancel.Click();
    panel.CWGraph1.setYRange(-70, 30);
    panel.UtilityGraphSettings.Click();
    EXPECT_EQ(dialog.manualSizeMin.Text.get(), "-70");
    EXPECT_EQ(dialog.manualSizeMax.Text.get(), "30");
}

struct BadScale {
    const char* minimum;
    const char* maximum;
};

class BadManualScale : public ManualScaleTest, public ::testing::WithParamInterface<BadScale> {};

TEST_P(BadManualScale, Accept_TellsItAndLeavesTheRange) {
    panel.UtilityGraphSettings.Click();
    dialog.manualSizeMin.Text = GetParam().minimum;
    dialog.manualSizeMax.Text = GetParam().maximum;
    dialog.cmdAccept.Click();
    EXPECT_EQ(boxes.texts().size(), 1U);
    EXPECT_EQ(panel.CWGraph1.yAxis().Minimum, -120);
    EXPECT_EQ(panel.CWGraph1.yAxis().Maximum, -20);
    EXPECT_TRUE(dialog.Visible);
}

INSTANTIATE_TEST_SUITE_P(Entries, BadManualScale,
                         ::testing::Values(BadScale{"", ""}, BadScale{"abc", "é"},
                                           BadScale{"10", "10"}, BadScale{"10", "-10"},
                                           BadScale{"-1e300", "1e300"},
                                           BadScale{"0", "1000000000000001"},
                                           BadScale{"-1000000000000001", "0"}));

}  // namespace
}  // namespace zel
