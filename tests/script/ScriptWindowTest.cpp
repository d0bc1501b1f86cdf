#include "tests/script/ScriptBench.h"

namespace zel {
namespace {

struct ScriptWindowTest : ScriptBench, testing::Test {
    ScriptEditor& editor = forms.scriptEditor;
    /// Opens the editor, which `work` has to close.
    void inEditor(const std::function<void()>& work) {
        platform.events.schedule(10, work);
        form.cmdEdit.Click();
        EXPECT_FALSE(editor.Visible);
    }
    void openThroughDialog(const std::string& path) {
        platform.fileDialogs.answer(path);
        form.cmdOpenCommandsFile.Click();
    }
};

TEST_F(ScriptWindowTest, TheKey_ShowsTheWindowAndCloseGivesThePanelBack) {
    EXPECT_TRUE(form.Visible);
    EXPECT_TRUE(panel.isSpecMeas);
    EXPECT_FALSE(form.cmdExecute.Enabled);
    EXPECT_FALSE(form.cmdEdit.Enabled);
    EXPECT_FALSE(form.cmdStop.Visible);
    form.chkWaterfall.setValue(true);
    panel.RecordDataFlag = true;
    form.cmdCancel.Click();
    EXPECT_FALSE(form.Visible);
    EXPECT_FALSE(panel.isSpecMeas);
    EXPECT_FALSE(form.chkWaterfall.Value());
    EXPECT_FALSE(panel.RecordDataFlag);
}

TEST_F(ScriptWindowTest, Load_BeginsWithoutAScriptAndWithoutSteps) {
    form.unload(1);
    form.chkStep.setValue(true);
    form.cmdEdit.Enabled = true;
    form.cmdExecute.Enabled = true;
    form.cmdStop.Enabled = true;
    form.cmdExecute.Visible = false;
    form.cmdStop.Visible = true;
    panel.cmdSpecial.Click();
    EXPECT_FALSE(form.chkStep.Value());
    EXPECT_FALSE(form.cmdEdit.Enabled);
    EXPECT_FALSE(form.cmdExecute.Enabled);
    EXPECT_TRUE(form.cmdExecute.Visible);
    EXPECT_FALSE(form.cmdStop.Enabled);
    EXPECT_FALSE(form.cmdStop.Visible);
}

TEST_F(ScriptWindowTest, ClosingByItsFrame_IsTheCloseButtonAndKeepsTheList) {
    load({"NOSAVE"});
    int cancel = 0;
    form.QueryUnload(cancel);
    EXPECT_EQ(cancel, -1);
    EXPECT_FALSE(form.Visible);
    panel.cmdSpecial.Click();
    EXPECT_EQ(form.lstCommands.Items.get(), Texts{"NOSAVE"});
    EXPECT_TRUE(form.cmdExecute.Enabled);
}

TEST_F(ScriptWindowTest, Open_FillsTheListAndEnablesTheKeys) {
    form.chkSave.setValue(true);
    openThroughDialog(folder.write("Night.txt", "DO\r\n\r\n  \r\nLOOP 2\r\n"));
    EXPECT_EQ(form.Caption.get(), "Special Measurement  Night.txt");
    EXPECT_EQ(form.lstCommands.Items.get(), (Texts{"DO", "LOOP 2"}));
    EXPECT_EQ(form.currFileName, folder.file("Night.txt"));
    EXPECT_EQ(form.CurrScriptFile, folder.file("Night.txt"));
    EXPECT_TRUE(form.cmdEdit.Enabled);
    EXPECT_TRUE(form.cmdExecute.Enabled);
    EXPECT_FALSE(form.chkSave.Value());
    const FileDialogRequest& request = platform.fileDialogs.opens.at(0);
    EXPECT_EQ(request.filterIndex, 2);
    EXPECT_EQ(request.folder, folder.file("home/specialMeas"));
}

TEST_F(ScriptWindowTest, CancelInTheDialog_ChangesNothing) {
    openThroughDialog(folder.write("Night.txt", "DO"));
    form.chkSave.setValue(true);
    form.cmdOpenCommandsFile.Click();
    EXPECT_EQ(form.lstCommands.Items.get(), Texts{"DO"});
    EXPECT_EQ(form.Caption.get(), "Special Measurement  Night.txt");
    EXPECT_TRUE(form.chkSave.Value());
}

TEST_F(ScriptWindowTest, MissingFile_GivesAnEmptyListWithoutABox) {
    openThroughDialog(folder.file("none.txt"));
    EXPECT_TRUE(form.lstCommands.Items.get().empty());
    form.cmdEdit.Click();
    EXPECT_FALSE(editor.Visible);
    program.scripts().window.reloadCommands();
    EXPECT_TRUE(form.lstCommands.Items.get().empty());
    EXPECT_TRUE(boxTexts().empty());
}

TEST_F(ScriptWindowTest, RelativeNames_StandForFilesBesideTheScript) {
    platform.files.putFolder(folder.file("sub"));
    openThroughDialog(folder.write("sub/s.txt", "SAVERESULTS OUT.TXT\nCOMMENT X\n"));
    form.cmdExecute.Click();
    EXPECT_TRUE(folder.has("sub/OUT.TXT"));
}

TEST_F(ScriptWindowTest, ListOfFiles_ReadsFromTheFolderByTheSlowRoad) {
    platform.files.putFolder(folder.file("home/specialMeas"));
    folder.write("home/specialMeas/a.txt", "DO\r\nLOOP\r\n");
    form.cmboSpecialMeasList.AddItem("a.txt");
    form.cmboSpecialMeasList.pick(0);
    EXPECT_EQ(form.lstCommands.Items.get(), (Texts{"DO", "LOOP", "\n"}));
    EXPECT_EQ(form.currFilePath, folder.file("home/specialMeas/a.txt"));
}

TEST_F(ScriptWindowTest, Editor_WritesOnCloseAndReloadsTheList) {
    openThroughDialog(folder.write("s.txt", "COMMENT \xE4\r\n"));
    inEditor([this] {
        EXPECT_TRUE(editor.Modal);
        EXPECT_EQ(editor.txtNotepad.Text.get(), "COMMENT \xC3\xA4\r\n");
        editor.txtNotepad.Text = "COMMENT \xC3\xB6\r\nDO\r\n";
        editor.cmdClose.Click();
    });
    EXPECT_EQ(folder.read("s.txt"), "COMMENT \xF6\r\nDO\r\n");
    EXPECT_EQ(form.lstCommands.Items.get(), (Texts{"COMMENT \xC3\xB6", "DO", "\n"}));
}

TEST_F(ScriptWindowTest, ClosingWithoutAChange_KeepsEveryByte) {
    const std::string bytes =
        "\xEF\xBB\xBF"
        "DO\nCOMMENT \xC3\xA4\r\rLOOP";
    openThroughDialog(folder.write("s.txt", bytes));
    inEditor([this] { editor.cmdClose.Click(); });
    EXPECT_EQ(folder.read("s.txt"), bytes);
}

TEST_F(ScriptWindowTest, Cancel_LeavesTheFileAndReadsTheListAgain) {
    openThroughDialog(folder.write("s.txt", "DO\r\n"));
    folder.write("s.txt", "LOOP\r\n");
    inEditor([this] {
        editor.txtNotepad.Text = "NOSAVE";
        editor.cmdOpen.Click();
        editor.cmdCancel.Click();
    });
    EXPECT_EQ(folder.read("s.txt"), "LOOP\r\n");
    EXPECT_EQ(form.lstCommands.Items.get(), (Texts{"LOOP", "\n"}));
}

TEST_F(ScriptWindowTest, AWriteThatFails_TellsAndKeepsTheTextOpen) {
    platform.files.putFolder(folder.file("gone"));
    openThroughDialog(folder.write("gone/s.txt", "DO\r\n"));
    inEditor([this] {
        platform.files.vanish(folder.file("gone"));
        editor.txtNotepad.Text = "NOSAVE";
        editor.cmdClose.Click();
        EXPECT_TRUE(editor.Visible);
        EXPECT_EQ(boxes.boxes().size(), 1U);
        EXPECT_EQ(editor.txtNotepad.Text.get(), "NOSAVE");
        editor.cmdCancel.Click();
    });
}

TEST_F(ScriptWindowTest, NewScript_GetsItsNameWhenItIsClosed) {
    platform.events.schedule(10, [this] {
        editor.txtNotepad.Text = "DO\r\n";
        editor.cmdClose.Click();  // the dialog is cancelled
        EXPECT_TRUE(editor.Visible);
        platform.fileDialogs.answer(folder.file("new"));
        editor.cmdClose.Click();
    });
    form.cmdNew.Click();
    EXPECT_EQ(folder.read("new.txt"), "DO\r\n");
    EXPECT_EQ(form.CurrScriptFile, folder.file("new.txt"));
    EXPECT_EQ(form.Caption.get(), "Special Measurement  new.txt");
    EXPECT_TRUE(form.cmdExecute.Enabled);
}

TEST_F(ScriptWindowTest, SaveAs_GoesOnWithTheOtherFile) {
    openThroughDialog(folder.write("s.txt", "DO\r\n"));
    inEditor([this] {
        editor.txtNotepad.Text = "LOOP\r\n";
        platform.fileDialogs.answer(folder.file("t.txt"));
        editor.cmdSaveAs.Click();
        EXPECT_TRUE(editor.Visible);
        editor.cmdCancel.Click();
    });
    EXPECT_EQ(folder.read("s.txt"), "DO\r\n");
    EXPECT_EQ(folder.read("t.txt"), "LOOP\r\n");
    EXPECT_EQ(form.CurrScriptFile, folder.file("t.txt"));
}

TEST_F(ScriptWindowTest, SaveAsThatFails_StaysWithTheFileItHad) {
    openThroughDialog(folder.write("s.txt", "DO\r\n"));
    inEditor([this] {
        editor.txtNotepad.Text = "LOOP\r\n";
        platform.files.refuse(folder.file("t.txt"), "Permission denied");
        platform.fileDialogs.answer(folder.file("t.txt"));
        editor.cmdSaveAs.Click();
        EXPECT_EQ(boxes.boxes().size(), 1U);
        EXPECT_EQ(editor.FileName, folder.file("s.txt"));
        EXPECT_EQ(editor.txtNotepad.Text.get(), "LOOP\r\n");
        editor.cmdClose.Click();
    });
    EXPECT_EQ(folder.read("s.txt"), "LOOP\r\n");
    EXPECT_EQ(form.CurrScriptFile, folder.file("s.txt"));
}

TEST_F(ScriptWindowTest, CommandPairs_AreChecked) {
    load({"A", "B"});
    int index = 0;
    bool ok = false;
    program.scripts().window.checkCommandPair(index, ok);
    EXPECT_TRUE(ok);
    EXPECT_EQ(index, 1);
    ok = false;
    program.scripts().window.checkCommandPair(index, ok);
    EXPECT_FALSE(ok);
    EXPECT_EQ(boxTexts(), Texts{"Erroneous end of file!\r\nPlease note that the lines of the file "
                                "have to be an even number (2 lines for a command)."});
}

}  // namespace
}  // namespace zel
