#include "script/ScriptEditing.h"

#include <filesystem>

#include "files/FileOps.h"
#include "files/OutputFile.h"
#include "forms/ScriptForms.h"
#include "platform/MessageBox.h"
#include "script/ScriptFile.h"

namespace zel {
namespace {

constexpr int kTextFilter = 2;
constexpr const char* kEnding = ".txt";

}  // namespace

ScriptEditing::ScriptEditing(ScriptEditor& form, FileOps& files, MessageBoxes& boxes)
    : form_(form), files_(files), boxes_(boxes) {
    handlers_.on(form_.cmdClose.Clicked, [this] { cmdClose_Click(); });
    handlers_.on(form_.cmdCancel.Clicked, [this] { cmdCancel_Click(); });
    handlers_.on(form_.cmdNew.Clicked, [this] { cmdNew_Click(); });
    handlers_.on(form_.cmdSave.Clicked, [this] { cmdSave_Click(); });
    handlers_.on(form_.cmdSaveAs.Clicked, [this] { cmdSaveAs_Click(); });
    handlers_.on(form_.cmdOpen.Clicked, [] {});  // has no function
}

bool ScriptEditing::save() {
    if (form_.FileName.empty()) return saveAs();
    OutputFile file(files_.service(), form_.FileName, OutputFile::Mode::Output);
    file.text() = scriptBytes({form_.txtNotepad.Text, form_.HasUtf8Mark, form_.CodePageText});
    const std::string problem = file.close();
    if (problem.empty()) return true;
    boxes_.show({BoxIcon::Critical, problem});
    return false;
}

bool ScriptEditing::saveAs() {
    std::string path = files_.ShowSaveDataDialog(kTextFilter);
    if (path.empty()) return false;
    if (!std::filesystem::path(path).has_extension()) path += kEnding;
    const std::string before = form_.FileName;
    form_.FileName = path;
    if (save()) return true;
    form_.FileName = before;
    return false;
}

void ScriptEditing::cmdClose_Click() {
    // An empty text that never had a file is nothing to keep.
    const bool nothing = form_.FileName.empty() && form_.txtNotepad.Text.get().empty();
    if (nothing || save()) form_.Hide();
}

void ScriptEditing::cmdCancel_Click() { form_.Hide(); }

void ScriptEditing::cmdNew_Click() {
    form_.FileName.clear();
    form_.HasUtf8Mark = false;
    form_.CodePageText = false;
    form_.txtNotepad.Text = "";
}

void ScriptEditing::cmdSave_Click() { save(); }

void ScriptEditing::cmdSaveAs_Click() { saveAs(); }

}  // namespace zel
