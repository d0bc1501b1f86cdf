// The menu of the waterfall's window: its picture in a file or on the clipboard, the whole screen.

#include <gtest/gtest.h>

#include <optional>
#include <string>

#include "tests/panel/Panel.h"

namespace zel {
namespace {

struct WaterfallKeysTest : PanelSession, ::testing::Test {
    WaterfallKeysTest() {
        form.DrawImage.connect([this](const std::string& path, std::string& said) {
            drawn.push_back(path);
            said = problem;
        });
    }
    WaterfallForm& form = forms.waterfall;
    Texts drawn;
    std::string problem;
};

TEST_F(WaterfallKeysTest, PictureSave_DrawsIntoTheFileOfTheDialog) {
    platform.fileDialogs.answer("/site/rows");
    form.PictureSave.Click();
    EXPECT_EQ(drawn, Texts{"/site/rows.png"});
    EXPECT_EQ(boxes.texts(), Texts{});
}

TEST_F(WaterfallKeysTest, PictureSave_Cancelled_DrawsNothing) {
    platform.fileDialogs.answer(std::nullopt);
    form.PictureSave.Click();
    EXPECT_EQ(platform.fileDialogs.saves.size(), 1U);
    EXPECT_EQ(drawn, Texts{});
    EXPECT_EQ(boxes.texts(), Texts{});
}

TEST_F(WaterfallKeysTest, PictureSave_ThatFails_SaysWhy) {
    problem = "The disk is full.";
    platform.fileDialogs.answer("/site/rows.png");
    form.PictureSave.Click();
    EXPECT_EQ(boxes.texts(), Texts{"The disk is full."});
    EXPECT_EQ(boxes.boxes()[0].icon, BoxIcon::Critical);
}

TEST_F(WaterfallKeysTest, PictureCopy_AsksTheWindowOnce) {
    int copies = 0;
    form.CopyImage.connect([&] { ++copies; });
    form.PictureCopy.Click();
    EXPECT_EQ(copies, 1);
    EXPECT_EQ(drawn, Texts{});
}

TEST_F(WaterfallKeysTest, FullScreen_IsAToggle) {
    form.ViewFullScreen.Click();
    EXPECT_TRUE(form.ViewFullScreen.Checked);
    form.ViewFullScreen.Click();
    EXPECT_FALSE(form.ViewFullScreen.Checked);
}

}  // namespace
}  // namespace zel
