#include "script/ScriptWindow.h"

#include <cstddef>
#include <filesystem>
#include <optional>
#include <vector>

#include "files/FileOps.h"
#include "forms/Forms.h"
#include "platform/MessageBox.h"
#include "platform/ModalForm.h"
#include "platform/Services.h"
#include "platform/Session.h"
#include "script/Language.h"
#include "script/ScriptFile.h"
#include "support/CodePage.h"
#include "support/Text.h"

namespace zel {
namespace {

namespace fs = std::filesystem;

constexpr int kTextFilter = 2;
constexpr const char* kFolder = "specialMeas";

}  // namespace

ScriptWindow::ScriptWindow(Forms& forms, FileOps& files, ApplicationFolder& folder,
                           const Session& session)
    : forms_(forms),
      form_(forms.specialMeas),
      editor_(forms.scriptEditor),
      panel_(forms.controller),
      files_(files),
      folder_(folder),
      session_(session) {
    handlers_.on(panel_.cmdSpecial.Clicked, [this] { cmdSpecial_Click(); });
    handlers_.on(form_.Load, [this] { Form_Load(); });
    handlers_.on(form_.QueryUnload, [this](int& cancel) {
        cancel = -1;  // the list stays
        cmdCancel_Click();
    });
    handlers_.on(form_.cmdCancel.Clicked, [this] { cmdCancel_Click(); });
    handlers_.on(form_.cmdOpenCommandsFile.Clicked, [this] { cmdOpenCommandsFile_Click(); });
    handlers_.on(form_.cmboSpecialMeasList.Clicked, [this] { cmboSpecialMeasList_Click(); });
    handlers_.on(form_.cmdEdit.Clicked, [this] { cmdEdit_Click(); });
    handlers_.on(form_.cmdNew.Clicked, [this] { cmdNew_Click(); });
}

void ScriptWindow::Form_Load() {
    form_.currFilePath = (fs::path(folder_.path()) / kFolder / "").string();
    if (form_.ScriptFolder.empty()) form_.ScriptFolder = form_.currFilePath;
    form_.cmdEdit.Enabled = false;
    form_.cmdExecute.Enabled = false;
    form_.cmdExecute.Visible = true;
    form_.cmdStop.Visible = false;
    form_.cmdStop.Enabled = false;
    form_.chkStep.setValue(false);
}

void ScriptWindow::cmdSpecial_Click() {
    panel_.isSpecMeas = true;
    form_.Show();
}

void ScriptWindow::cmdCancel_Click() {
    // A run without its window could not be stopped any more.
    if (form_.RunsActive > 0) {
        form_.cmdStop.Click();
        form_.ReleaseWait();
    }
    form_.chkWaterfall.setValue(false);
    panel_.RecordDataFlag = false;
    form_.Hide();
    panel_.isSpecMeas = false;
}

void ScriptWindow::cmdOpenCommandsFile_Click() {
    const std::string path = files_.ShowOpenDataDialog(kTextFilter);
    if (!path.empty()) open(path);
}

void ScriptWindow::open(const std::string& path) {
    form_.currFileName = path;
    form_.CurrScriptFile = path;
    showName(path);
    const auto script = readScript(files_.service(), path);
    form_.lstCommands.Visible = false;
    form_.lstCommands.ListIndex = -1;
    form_.lstCommands.Items =
        script ? loadCommandsFromText(script->text) : std::vector<std::string>();
    form_.lstCommands.Visible = true;
    form_.cmdEdit.Enabled = true;
    form_.cmdRehearse.Enabled = !form_.lstCommands.Items.get().empty();
    form_.chkSave.setValue(false);
    form_.cmdExecute.Enabled = true;
    form_.cmdStop.Enabled = true;
    form_.lblProgress.Caption = "";
}

/// The caption, and the folder that relative names of the script mean.
void ScriptWindow::showName(const std::string& path) {
    const fs::path file = replaceAll(path, "\\", "/");
    form_.Caption = "Special Measurement  " + file.filename().string();
    form_.ScriptFolder = file.parent_path().string();
}

void ScriptWindow::fill(const std::string& path) {
    const auto script = readScript(files_.service(), path);
    form_.lstCommands.ListIndex = -1;
    form_.lstCommands.Items =
        script ? loadCommandsRecursively(script->text, "", "", [this] { session_.events.pump(); })
               : std::vector<std::string>();
    form_.cmdRehearse.Enabled = !form_.lstCommands.Items.get().empty();
}

void ScriptWindow::cmboSpecialMeasList_Click() {
    const std::string folder = (fs::path(folder_.path()) / kFolder / "").string();
    form_.currFilePath = folder + form_.cmboSpecialMeasList.Text();
    fill(form_.currFilePath);
}

void ScriptWindow::reloadCommands() { fill(form_.currFileName); }

void ScriptWindow::edit() {
    editor_.load();
    showModalForm(editor_, session_.events);
    // The text may have got another name meanwhile.
    if (!editor_.FileName.empty() && editor_.FileName != form_.CurrScriptFile) {
        form_.currFileName = editor_.FileName;
        form_.CurrScriptFile = editor_.FileName;
        showName(editor_.FileName);
        form_.cmdExecute.Enabled = true;
        form_.cmdStop.Enabled = true;
    }
    form_.cmdEdit.Enabled = !form_.CurrScriptFile.empty();
    reloadCommands();
}

void ScriptWindow::cmdEdit_Click() {
    const auto script = readScript(files_.service(), form_.CurrScriptFile);
    if (!script) return;
    editor_.FileName = form_.CurrScriptFile;
    editor_.HasUtf8Mark = script->hasUtf8Mark;
    editor_.CodePageText = script->codePage;
    editor_.txtNotepad.Text = script->text;
    edit();
}

void ScriptWindow::cmdNew_Click() {
    editor_.FileName.clear();
    editor_.HasUtf8Mark = false;
    editor_.CodePageText = false;
    editor_.txtNotepad.Text = "";
    edit();
}

void ScriptWindow::checkCommandPair(int& index, bool& ok) {
    const std::vector<std::string>& items = form_.lstCommands.Items.get();
    if (index + 1 >= static_cast<int>(items.size())) {
        session_.boxes.show({BoxIcon::Information,
                             "Erroneous end of file!\r\nPlease note that the lines of the file "
                             "have to be an even number (2 lines for a command)."});
        return;
    }
    const std::string entry = upperCaseText(items[static_cast<std::size_t>(++index)]);
    if (!isCommandValid(entry))
        session_.boxes.show({BoxIcon::Information,
                             "Syntax error in command: " + entry + "\r\nCommand not reckognized!"});
    ok = true;
}

}  // namespace zel
