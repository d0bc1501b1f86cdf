#include <gtest/gtest.h>

#include "files/FileOps.h"
#include "tests/files/FileSession.h"

namespace zel {
namespace {

struct FileMenuTest : FileSession, ::testing::Test {
    FileOps files{panel, platform.fileDialogs, platform.folder, platform.files, platform.clock};
};

TEST_F(FileMenuTest, OpenDialog_BeginsWithTheScriptsAndRemembersTheFolder) {
    platform.folder.folder = "/own";
    platform.fileDialogs.answer(std::nullopt);
    EXPECT_EQ(files.ShowOpenDataDialog(4), "");
    EXPECT_EQ(platform.fileDialogs.opens[0].folder, "/own/specialMeas");
    EXPECT_EQ(platform.fileDialogs.opens[0].filter,
              "All Files (*.*)|*.*|Text Files(*.txt)|*.txt|Data Files (*.dat)|*.dat|"
              "CSV Files (*.csv)|*.csv");
    EXPECT_FALSE(platform.fileDialogs.opens[0].promptOverwrite);
    EXPECT_EQ(platform.fileDialogs.opens[0].fileName, "");
    EXPECT_EQ(files.LastDialogFileName, "");
    platform.fileDialogs.answer("/site/mast/view.csv");
    EXPECT_EQ(files.ShowOpenDataDialog(1), "/site/mast/view.csv");
    EXPECT_EQ(files.LastOpenFolder, "/site/mast");
    files.ShowOpenDataDialog(1);
    EXPECT_EQ(platform.fileDialogs.opens[2].folder, "/site/mast");
    EXPECT_EQ(files.LastDialogFileName, "/site/mast/view.csv");
    EXPECT_EQ(panel.CommonDialog1FileName, "/site/mast/view.csv");
}

TEST_F(FileMenuTest, SaveDialog_BeginsInTheProgramsFolder) {
    platform.folder.folder = "/own";
    platform.fileDialogs.answer("/site/view.csv");
    EXPECT_EQ(files.ShowSaveDataDialog(3), "/site/view.csv");
    EXPECT_EQ(platform.fileDialogs.saves[0].folder, "/own");
    EXPECT_EQ(platform.fileDialogs.saves[0].filterIndex, 3);
    EXPECT_TRUE(platform.fileDialogs.saves[0].promptOverwrite);
}

TEST_F(FileMenuTest, ImageDialog_OffersTheKindFirstAndCompletesTheName) {
    platform.fileDialogs.answer("/site/mast.view/picture");
    EXPECT_EQ(files.ShowSaveImageDialog("wmf"), "/site/mast.view/picture.wmf");
    const FileDialogRequest& request = platform.fileDialogs.saves[0];
    EXPECT_EQ(request.filter.substr(0, 45), "All Files (*.*)|*.*|Text Files(*.wmf)|*.wmf|S");
    EXPECT_EQ(request.filterIndex, 2);
    EXPECT_TRUE(request.promptOverwrite);
    platform.fileDialogs.answer("/site/picture.svg");
    EXPECT_EQ(files.ShowSaveImageDialog("wmf"), "/site/picture.svg");
    platform.fileDialogs.answer(std::nullopt);
    EXPECT_EQ(files.ShowSaveImageDialog("wmf"), "");
}

TEST_F(FileMenuTest, SaveImage_IsDrawnByTheFront) {
    Texts drawn;
    panel.DrawImage.connect([&](const std::string& path, std::string& problem) {
        drawn.push_back(path);
        if (drawn.size() > 1) problem = "no room";
    });
    platform.fileDialogs.answer("/site/a.png");
    panel.MenuFileSaveImage.Click();
    EXPECT_EQ(drawn, Texts{"/site/a.png"});
    EXPECT_EQ(boxes.texts(), Texts{});
    platform.fileDialogs.answer("/site/b.wmf");
    panel.MenuFileSaveImage.Click();
    EXPECT_EQ(boxes.texts(), Texts{"no room"});
    panel.MenuFileSaveImage.Click();  // cancelled
    EXPECT_EQ(drawn.size(), 2U);
}

TEST_F(FileMenuTest, WholeFile_IsRead) {
    EXPECT_EQ(files.ReadWholeFile(""), "");
    EXPECT_EQ(files.ReadWholeFile(folder.write("empty", "")), "");
    EXPECT_EQ(files.ReadWholeFile(folder.write("latin", "dB\xB5V")), "dB\xC2\xB5V");
    EXPECT_EQ(files.ReadWholeFile(folder.write("utf8", "dB\xC2\xB5V")), "dB\xC2\xB5V");
    std::string large;
    large.resize(9'000'000, 'x');
    large.back() = 'y';
    EXPECT_EQ(files.ReadWholeFile(folder.write("large", large)), large);
}

TEST_F(FileMenuTest, LongFile_TellsHowFarItIs) {
    std::string large;
    large.resize(9'000'000, 'x');
    folder.write("large", large);
    std::vector<std::uint64_t> told;
    files.ReadWholeFile(folder.file("large"),
                        [&](std::uint64_t done, std::uint64_t) { told.push_back(done); });
    ASSERT_GE(told.size(), 3U);
    EXPECT_LT(told.front(), 5'000'000U);
    EXPECT_EQ(told.back(), 9'000'000U);
}

TEST_F(FileMenuTest, LastFileDateTime_IsABlankWithoutAFile) {
    EXPECT_EQ(files.LastFileDateTime(), " ");
    files.note(folder.file("gone"));
    EXPECT_EQ(files.LastFileDateTime(), " ");
    files.note(folder.write("view.csv", "x"));
    EXPECT_EQ(files.LastFileDateTime(), "2026-01-01 12:00:00");
}

TEST_F(FileMenuTest, RecentFiles_StandNewestFirstAndStay) {
    EXPECT_FALSE(panel.RecentMenu.Enabled);
    for (const char* name : {"a.csv", "b.csv", "a.csv"}) {
        folder.write(name, "1.000;2; \r\n");
        open(name);
    }
    EXPECT_TRUE(panel.RecentMenu.Enabled);
    EXPECT_EQ(panel.RecentFile(0).Caption.get(), "a.csv");
    EXPECT_EQ(panel.RecentFile(1).Caption.get(), "b.csv");
    EXPECT_EQ(panel.RecentFile(1).ToolTip.get(), folder.file("b.csv"));
    EXPECT_TRUE(panel.RecentFile(1).Visible);
    EXPECT_FALSE(panel.RecentFile(2).Visible);
    // The next start of the program knows them.
    Program next(platform.bundle(), "");
    next.start();
    EXPECT_EQ(next.forms().controller.RecentFile(0).Caption.get(), "a.csv");
    EXPECT_EQ(next.forms().controller.RecentFile(1).Caption.get(), "b.csv");
}

TEST_F(FileMenuTest, RecentFile_OpensWithAClick) {
    folder.write("a.csv", "1.000;2; \r\n");
    folder.write("b.csv", "1.000;3; \r\n");
    open("a.csv");
    open("b.csv");
    int loads = 0;
    panel.TraceLoaded.connect([&] { ++loads; });
    panel.RecentFile(1).Click();
    EXPECT_EQ(loads, 1);
    EXPECT_EQ(panel.RecentFile(0).Caption.get(), "a.csv");
    panel.RecentFile(7).Click();
    EXPECT_EQ(loads, 1);
}

TEST_F(FileMenuTest, RecentFiles_AreEightAtMost) {
    for (int i = 0; i < 12; ++i) {
        const std::string name = std::to_string(i) + ".csv";
        folder.write(name, "1.000;2; \r\n");
        open(name);
    }
    EXPECT_EQ(panel.RecentFile(0).Caption.get(), "11.csv");
    EXPECT_EQ(panel.RecentFile(7).Caption.get(), "4.csv");
}

TEST_F(FileMenuTest, MissingFile_IsNotRemembered) {
    open("gone.csv");
    EXPECT_FALSE(panel.RecentMenu.Enabled);
}

TEST_F(FileMenuTest, DeleteLogFile_RemovesTheDebugLogAlone) {
    platform.folder.folder = "/views";
    folder.write(panel.DebugLogName, "log");
    folder.write("other.log", "log");
    bool closed = false;
    panel.CloseDebugLog.connect([&] { closed = folder.has(panel.DebugLogName); });
    panel.DelLogFile.Click();
    EXPECT_TRUE(closed);
    EXPECT_FALSE(folder.has(panel.DebugLogName));
    EXPECT_TRUE(folder.has("other.log"));
    closed = false;
    panel.DelLogFile.Click();
    EXPECT_FALSE(closed);
    EXPECT_EQ(boxes.texts(), Texts{});
}

}  // namespace
}  // namespace zel
