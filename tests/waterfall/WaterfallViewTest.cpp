#include <gtest/gtest.h>

#include "platform/virtual/MemoryServices.h"
#include "tests/support/Stores.h"
#include "waterfall/WaterfallView.h"

namespace zel {
namespace {

struct WaterfallViewTest : Stores {
    FixedApplicationFolder folder;
    Forms forms;
    WaterfallForm& form = forms.waterfall;
    Graph3D& graph = form.Graph3D;
    Graph3dOps ops{form};
    WaterfallView view{forms, ops, folder, disk_};

    WaterfallViewTest() { folder.folder = folder_; }

    void ini(const std::string& text) { disk_.put(file("3dgraph.ini"), text); }
    std::string stored() const { return read(file("3dgraph.ini")); }
    void rotate(double latitude, double longitude) {
        GraphView3D moved = graph.view();
        moved.Latitude = latitude;
        moved.Longitude = longitude;
        graph.setView(moved);
        graph.RotationEnded();
    }
    void zoom(double distance) {
        GraphView3D moved = graph.view();
        moved.Distance = distance;
        graph.setView(moved);
        graph.ZoomEnded();
    }
    void pan(double x, double y, double z) {
        GraphView3D moved = graph.view();
        moved.TransX = x;
        moved.TransY = y;
        moved.TransZ = z;
        graph.setView(moved);
        graph.TranslationEnded();
    }
    void row(const std::string& time, double depth) {
        ops.limitRows(graph, 100);
        ops.stampRow(graph, time);
        graph.plotCurve({depth, depth, depth}, {1e6, 2e6, 3e6}, {-50, -40, -30}, {0, 50, 100});
    }
};

TEST_F(WaterfallViewTest, Load_WithoutAFile_IsTheDesignsWaterfall) {
    form.load();
    EXPECT_FALSE(form.IsSpectrogram);
    EXPECT_EQ(graph.view(), GraphView3D());
    EXPECT_EQ(graph.axis(1).Maximum, 12);
    EXPECT_TRUE(form.waterfallRotated && form.waterfallZoomed && form.waterfallPanned);
    EXPECT_FALSE(form.spectrogramRotated);
}

TEST_F(WaterfallViewTest, Load_ModeZeroWithoutOtherKeys_IsTheWaterfall) {
    ini("[Mode]\r\nView=0\r\n");
    form.load();
    EXPECT_FALSE(form.IsSpectrogram);
    EXPECT_EQ(graph.view().Latitude, 58);
    EXPECT_EQ(graph.view().Longitude, -325);
}

class ModeText : public WaterfallViewTest,
                 public ::testing::WithParamInterface<std::pair<const char*, bool>> {};

TEST_P(ModeText, Load_DecidesByTheMode) {
    ini(std::string("[Mode]\r\nView=") + GetParam().first + "\r\n");
    form.load();
    EXPECT_EQ(form.IsSpectrogram, GetParam().second);
}

INSTANTIATE_TEST_SUITE_P(Texts, ModeText,
                         ::testing::Values(std::pair{"1", true}, std::pair{"-1", true},
                                           std::pair{"0,5", true}, std::pair{"true", true},
                                           std::pair{"Wahr", true}, std::pair{"0", false},
                                           std::pair{"", false}, std::pair{"false", false},
                                           std::pair{"junk", false}));

TEST_F(WaterfallViewTest, Load_Spectrogram_LeavesTheStoredDistance) {
    ini("[Mode]\r\nView=1\r\n[DistanceS]\r\nZoom=3,5\r\n[RotationS]\r\nLatitude=20\r\n");
    form.load();
    EXPECT_EQ(graph.view().Distance, 3.5);
    EXPECT_EQ(graph.view().Latitude, 0);
    EXPECT_EQ(graph.Projection.get(), Projection3D::Orthographic);
    EXPECT_TRUE(form.ViewOrthographic.Checked);
    EXPECT_TRUE(form.spectrogramZoomed);
}

TEST_F(WaterfallViewTest, Load_SpectrogramWithoutADistance_ComesNoNearer) {
    ini("[Mode]\r\nView=1\r\n");
    form.load();
    EXPECT_EQ(graph.view().Distance, 2.8);
    EXPECT_EQ(form.SpectrogramView.Distance, 2.8);
}

TEST_F(WaterfallViewTest, Load_DistanceIsAppliedLast) {
    ini("[Distance]\r\nZoom=7\r\n[DistanceW]\r\nZoom=3\r\n");
    form.load();
    EXPECT_EQ(graph.view().Distance, 7);
    EXPECT_EQ(form.WaterfallView.Distance, 7);
}

TEST_F(WaterfallViewTest, Load_KeysOfTheOtherMode_AreNotLost) {
    ini("[DistanceS]\r\nZoom=1.5\r\n[TranslationS]\r\nTransX=1\r\n");
    form.load();
    EXPECT_TRUE(form.spectrogramZoomed);
    EXPECT_TRUE(form.spectrogramPanned);
    view.ViewSpectrogram_Click();
    EXPECT_EQ(graph.view().Distance, 1.5);
    EXPECT_EQ(graph.view().TransX, 1);
}

TEST_F(WaterfallViewTest, Load_ValuesWithoutSense_LeaveAWorkingView) {
    ini("[Axis1]\r\nmin=x\r\nmax=1e400\r\n[RotationW]\r\nLatitude=abc\r\nLongitude=--\r\n"
        "[DistanceW]\r\nZoom=-5\r\n[Mode]\r\nView=%%%\r\n");
    form.load();
    EXPECT_EQ(graph.axis(1).Maximum, 0);
    EXPECT_EQ(graph.view().Distance, -5);
    EXPECT_FALSE(form.IsSpectrogram);
}

TEST_F(WaterfallViewTest, Unload_WritesModeThenTheSetsThenTheAxes) {
    form.load();
    graph.setRange(1, 1e6, 3e6);
    form.unload(1);
    EXPECT_EQ(stored(),
              "[Mode]\r\nView=0\r\n"
              "[DistanceW]\r\nZoom=2.8\r\n[DistanceS]\r\nZoom=2.8\r\n"
              "[RotationW]\r\nLatitude=58\r\nLongitude=-325\r\n"
              "[RotationS]\r\nLatitude=58\r\nLongitude=-325\r\n"
              "[TranslationW]\r\nTransX=6.6149042722513\r\nTransY=5.32275199885264\r\n"
              "TransZ=3.29047348804768\r\n"
              "[TranslationS]\r\nTransX=6.6149042722513\r\nTransY=5.32275199885264\r\n"
              "TransZ=3.29047348804768\r\n"
              "[Axis1]\r\nMax=3000000\r\nMin=1000000\r\n"
              "[Axis2]\r\nMax=10\r\nMin=0\r\n[Axis3]\r\nMax=10\r\nMin=0\r\n");
}

TEST_F(WaterfallViewTest, UnloadAndLoad_KeepTheView) {
    form.load();
    view.ViewSpectrogram_Click();
    zoom(0.7);
    pan(1, 2, 3);
    form.unload(1);
    Forms again;
    Graph3dOps otherOps{again.waterfall};
    const WaterfallView other{again, otherOps, folder, disk_};
    again.waterfall.load();
    EXPECT_TRUE(again.waterfall.IsSpectrogram);
    EXPECT_EQ(again.waterfall.Graph3D.view(), graph.view());
}

TEST_F(WaterfallViewTest, Unload_OfAFormThatIsNotLoaded_WritesNothing) {
    form.unload(1);
    EXPECT_EQ(files(), 0U);
}

TEST_F(WaterfallViewTest, Orthographic_ComesNearerOnceAndBackIsNoChange) {
    form.load();
    view.ViewOrthographic_Click();
    EXPECT_NEAR(graph.view().Distance, 1.0, 1e-12);
    view.ViewOrthographic_Click();
    EXPECT_NEAR(graph.view().Distance, 1.0, 1e-12);
    view.ViewPerspective_Click();
    EXPECT_NEAR(graph.view().Distance, 1.0, 1e-12);
    view.ViewOrthographic_Click();
    EXPECT_NEAR(graph.view().Distance, -0.8, 1e-12);
    EXPECT_TRUE(form.ViewOrthographic.Checked);
    EXPECT_FALSE(form.ViewPerspective.Checked);
}

TEST_F(WaterfallViewTest, Projection_CheckedEntry_DoesNothing) {
    form.load();
    graph.LevelTicks = false;
    view.ViewPerspective_Click();
    EXPECT_FALSE(graph.LevelTicks);
}

TEST_F(WaterfallViewTest, Spectrogram_IsSeenFromAboveWithoutTicks) {
    form.load();
    row("12:00:00", 0);
    view.ViewSpectrogram_Click();
    EXPECT_EQ(graph.view().Latitude, 0);
    EXPECT_EQ(graph.view().Longitude, 0);
    EXPECT_FALSE(graph.LevelTicks);
    EXPECT_FALSE(graph.LevelGrid);
    EXPECT_EQ(graph.plots().front().colorMapStyle, 4);
    EXPECT_FALSE(form.waterfallPanned);
    EXPECT_TRUE(form.spectrogramRotated);
    view.ViewWaterfall_Click();
    EXPECT_TRUE(graph.LevelTicks);
    EXPECT_TRUE(graph.LevelGrid);
    EXPECT_EQ(graph.plots().front().colorMapStyle, 1);
}

TEST_F(WaterfallViewTest, ThereAndBack_RestoresTheZoomButNotTheAngles) {
    form.load();
    rotate(30, 40);
    zoom(5);
    view.ViewSpectrogram_Click();
    zoom(0.5);
    view.ViewWaterfall_Click();
    EXPECT_EQ(graph.view().Distance, 5);
    EXPECT_EQ(graph.view().Latitude, 58);
    EXPECT_EQ(graph.view().Longitude, -325);
    EXPECT_EQ(form.WaterfallView.Latitude, 30);
    view.ViewSpectrogram_Click();
    EXPECT_EQ(graph.view().Distance, 0.5);
}

TEST_F(WaterfallViewTest, MouseEnds_GoIntoTheSetOfTheMode) {
    form.load();
    view.ViewReset_Click();
    rotate(30, 40);
    EXPECT_TRUE(form.waterfallRotated);
    EXPECT_FALSE(form.waterfallZoomed);
    EXPECT_EQ(form.WaterfallView.Longitude, 40);
    zoom(5);
    EXPECT_TRUE(form.waterfallZoomed);
    EXPECT_EQ(form.WaterfallView.Distance, 5);
    pan(1, 2, 3);
    EXPECT_TRUE(form.waterfallPanned);
    EXPECT_EQ(form.WaterfallView.TransZ, 3);
    EXPECT_FALSE(form.spectrogramPanned);
    form.IsSpectrogram = true;
    pan(4, 5, 6);
    EXPECT_TRUE(form.spectrogramPanned);
    EXPECT_EQ(form.SpectrogramView.TransX, 4);
    EXPECT_EQ(form.WaterfallView.TransX, 1);
}

TEST_F(WaterfallViewTest, Reset_IsTheDesignAndForgetsWhatWasMoved) {
    form.load();
    rotate(1, 2);
    zoom(9);
    pan(0, 0, 0);
    graph.setRange(1, 5, 6);
    view.ViewReset_Click();
    EXPECT_EQ(graph.view(), GraphView3D());
    EXPECT_EQ(graph.axis(1).Maximum, 12);
    EXPECT_EQ(form.SpectrogramView, GraphView3D());
    EXPECT_FALSE(form.waterfallRotated || form.waterfallZoomed || form.waterfallPanned);
    EXPECT_NE(stored().find("[Axis1]\r\nMax=12\r\nMin=0"), std::string::npos);
    EXPECT_NE(stored().find("[TranslationS]\r\nTransX=6.6149042722513"), std::string::npos);
    EXPECT_NE(stored().find("[TranslationW]"), std::string::npos);
}

TEST_F(WaterfallViewTest, Reset_WithRows_LeavesTheAxes) {
    form.load();
    row("12:00:00", 0);
    graph.setRange(1, 5, 6);
    view.ViewReset_Click();
    EXPECT_EQ(graph.axis(1).Minimum, 5);
    EXPECT_NE(stored().find("[Axis1]\r\nMax=12"), std::string::npos);
}

TEST_F(WaterfallViewTest, Clear_RemovesTheRowsAndStartsAtZero) {
    row("12:00:00", 0);
    forms.controller.YVectorVal = 9;
    form.VewClear.Click();
    EXPECT_FALSE(graph.hasRows());
    EXPECT_EQ(forms.controller.YVectorVal, 0);
}

TEST_F(WaterfallViewTest, Cmd3D_ShowsAndHidesAndKeepsTheRows) {
    row("12:00:00", 0);
    forms.controller.cmd3D.Click();
    EXPECT_TRUE(form.Visible);
    EXPECT_EQ(forms.controller.cmd3D.BackColor.get(), 0x80FF80U);
    forms.controller.cmd3D.Click();
    EXPECT_FALSE(form.Visible);
    EXPECT_EQ(forms.controller.cmd3D.BackColor.get(), 0xE0E0E0U);
    EXPECT_TRUE(graph.hasRows());
}

TEST_F(WaterfallViewTest, CloseByTheFrame_DoesWhatTheKeyDoes) {
    forms.controller.cmd3D.Click();
    int cancel = 0;
    form.QueryUnload(cancel);
    EXPECT_EQ(cancel, -1);
    EXPECT_FALSE(form.Visible);
    EXPECT_EQ(forms.controller.cmd3D.BackColor.get(), 0xE0E0E0U);
}

TEST_F(WaterfallViewTest, Markers_ThereIsAlwaysAFreeCursor) {
    row("12:00:00", 0);
    form.ActionMarkers.Click();
    EXPECT_EQ(graph.MouseMode.get(), MouseMode3D::PlaceCursor);
    ASSERT_EQ(graph.cursors().size(), 1U);
    EXPECT_FALSE(graph.cursors()[0].placed);
    graph.CursorPlaced(1, 2);
    graph.Clicked();
    ASSERT_EQ(graph.cursors().size(), 2U);
    const GraphCursor3D& cursor = graph.cursors()[0];
    EXPECT_TRUE(cursor.placed);
    EXPECT_EQ(cursor.X, 2e6);
    EXPECT_EQ(cursor.Y, 0);
    EXPECT_EQ(cursor.Z, -40);
    EXPECT_EQ(cursor.Name, "12:00:00     ");
    EXPECT_TRUE(cursor.NameVisible);
    EXPECT_EQ(cursor.PointColor, 0xFFFFFFU);
    EXPECT_EQ(cursor.CrosshairColor, 0xFFFFFFU);
    EXPECT_EQ(cursor.PointStyle, 6);
    EXPECT_EQ(cursor.CrosshairStyle, 0);
    form.ActionMarkers.Click();  // checked already
    EXPECT_EQ(graph.cursors().size(), 2U);
    form.ActionMove.Click();
    EXPECT_EQ(graph.cursors().size(), 1U);
    EXPECT_EQ(graph.MouseMode.get(), MouseMode3D::MoveView);
    EXPECT_FALSE(form.ActionMarkers.Checked);
}

TEST_F(WaterfallViewTest, Move_WithoutCursors_RemovesNothing) {
    form.ActionMarkers.Click();
    graph.removeCursors();
    form.ActionMove.Click();
    EXPECT_TRUE(graph.cursors().empty());
    EXPECT_TRUE(form.ActionMove.Checked);
}

TEST_F(WaterfallViewTest, ClickWhileMoving_AddsNoCursor) {
    graph.Clicked();
    EXPECT_TRUE(graph.cursors().empty());
}

TEST_F(WaterfallViewTest, Delete_RemovesAllButAFreeOneForMarkers) {
    row("12:00:00", 0);
    form.ActionMarkers.Click();
    graph.CursorPlaced(1, 1);
    graph.Clicked();
    form.MarkersDelete.Click();
    ASSERT_EQ(graph.cursors().size(), 1U);
    EXPECT_FALSE(graph.cursors()[0].placed);
    form.ActionMove.Click();
    form.MarkersDelete.Click();
    EXPECT_TRUE(graph.cursors().empty());
}

TEST_F(WaterfallViewTest, AddCursor_WithoutACursor_DoesNothing) {
    row("12:00:00", 0);
    view.addCursor(1, 2, 3);
    view.setTimeStamps(0, 0);
    EXPECT_TRUE(graph.cursors().empty());
}

TEST_F(WaterfallViewTest, CursorName_OfARowWithoutATime_IsTheLastStamp) {
    row("12:00:00", 0);
    row("12:00:01", 1);  // the second row bears no label
    form.ActionMarkers.Click();
    graph.CursorPlaced(2, 1);
    EXPECT_EQ(graph.cursors()[0].Name, "12:00:01");
    EXPECT_EQ(form.LastStampText, "12:00:01");
}

TEST_F(WaterfallViewTest, CursorName_BeyondTheLabels_IsTheLastStamp) {
    row("12:00:00", 0);
    form.ActionMarkers.Click();
    form.LastStampText = "11:11:11";
    view.setTimeStamps(1, 500);
    EXPECT_EQ(graph.cursors()[0].Name, "11:11:11");
}

TEST_F(WaterfallViewTest, CursorName_FollowsTheRowsNumberWhenRowsHaveGone) {
    for (int i = 0; i < 105; ++i) row("12:00:" + std::to_string(100 + i), i + 20);
    form.ActionMarkers.Click();
    // The first plot left is row 6; row 9 is labelled.
    graph.CursorPlaced(4, 1);
    EXPECT_EQ(graph.plots()[3].row, 9);
    EXPECT_EQ(graph.cursors()[0].Name, "12:00:108     ");
}

TEST_F(WaterfallViewTest, Place_OutsideOfThePlots_DoesNothing) {
    row("12:00:00", 0);
    form.ActionMarkers.Click();
    graph.CursorPlaced(0, 1);
    graph.CursorPlaced(2, 1);
    graph.CursorPlaced(1, 0);
    graph.CursorPlaced(1, 4);
    EXPECT_FALSE(graph.cursors()[0].placed);
}

}  // namespace
}  // namespace zel
