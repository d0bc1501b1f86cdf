#include "script/ScriptEditing.h"

#include <filesystem>

#include "files/OutputFile.h"
#include "script/ScriptFile.h"

namespace zel {
namespace {

constexpr int kTextFilter = 2;
constexpr const char* kEnding = ".txt";

}  // namespace

ScriptEditing::ScriptEditing(ScriptEditor& form, FileOps& files, MessageBoxes& boxes)
    : form_(form), files_(files), boxes_(boxes) {
    form_.cmdClose.Clicked.connect([this] { cmdClose_Click(); });
    form_.cmdCancel.Clicked.connect([this] { cmdCancel_Click(); });
    form_.cmdNew.Clicked.connect([this] { cmdNew_Click(); });
    form_.cmdSave.Clicked.connect([this] { cmdSave_Click(); });
    form_.cmdSaveAs.Clicked.connect([this] { cmdSaveAs_Click(); });
    form_.cmdOpen.Clicked.connect([] {});  // has no function
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
