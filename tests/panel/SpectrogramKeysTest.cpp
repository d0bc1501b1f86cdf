// The keys of the spectrogram under the graph.

#include <gtest/gtest.h>

#include <string>

#include "tests/panel/Panel.h"

namespace zel {
namespace {

struct SpectrogramKeysTest : PanelSession, ::testing::Test {};

TEST_F(SpectrogramKeysTest, Show_BringsThePictureAndAllowsThePause) {
    EXPECT_FALSE(panel.SpectrogramPicture.Visible);
    EXPECT_FALSE(panel.SpectrogramPause.Enabled);
    panel.SpectrogramShow.Click();
    EXPECT_TRUE(panel.SpectrogramPicture.Visible);
    EXPECT_TRUE(panel.SpectrogramShow.Checked);
    EXPECT_TRUE(panel.SpectrogramPause.Enabled);
    panel.SpectrogramShow.Click();
    EXPECT_FALSE(panel.SpectrogramPicture.Visible);
    EXPECT_FALSE(panel.SpectrogramShow.Checked);
    EXPECT_FALSE(panel.SpectrogramPause.Enabled);
}

TEST_F(SpectrogramKeysTest, Pause_IsAToggleThatEndsWithThePicture) {
    panel.SpectrogramShow.Click();
    panel.SpectrogramPause.Click();
    EXPECT_TRUE(panel.SpectrogramPause.Checked);
    panel.SpectrogramPause.Click();
    EXPECT_FALSE(panel.SpectrogramPause.Checked);
    panel.SpectrogramPause.Click();
    panel.SpectrogramShow.Click();
    panel.SpectrogramShow.Click();
    EXPECT_TRUE(panel.SpectrogramPicture.Visible);
    EXPECT_FALSE(panel.SpectrogramPause.Checked);
}

TEST_F(SpectrogramKeysTest, Save_WithoutSweeps_SaysSoAndAsksForNoFile) {
    panel.SpectrogramSave.Click();
    EXPECT_EQ(boxes.texts(), Texts{"There are no sweeps to save."});
    EXPECT_TRUE(platform.fileDialogs.saves.empty());
}

}  // namespace
}  // namespace zel
