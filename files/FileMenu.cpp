#include "files/FileMenu.h"

#include <algorithm>
#include <filesystem>
#include <string>
#include <vector>

#include "files/FileOps.h"
#include "forms/ControllerForm.h"
#include "platform/Files.h"
#include "platform/MessageBox.h"
#include "platform/Services.h"

namespace zel {
namespace {

constexpr const char* kImageExtension = "wmf";

}  // namespace

FileMenu::FileMenu(ControllerForm& panel, FileOps& files, ApplicationFolder& folder,
                   MessageBoxes& boxes)
    : panel_(panel), files_(files), folder_(folder), boxes_(boxes) {
    handlers_.on(panel_.MenuFileSaveImage.Clicked, [this] { MenuFileSaveImage_Click(); });
    handlers_.on(panel_.DelLogFile.Clicked, [this] { DelLogFile_Click(); });
}

void FileMenu::MenuFileSaveImage_Click() {
    const std::string path = files_.ShowSaveImageDialog(kImageExtension);
    if (path.empty()) return;
    std::string problem;
    panel_.DrawImage(path, problem);
    if (!problem.empty()) boxes_.show({BoxIcon::Critical, problem});
}

void FileMenu::DelLogFile_Click() {
    FileService& files = files_.service();
    const std::vector<std::string> names = files.list(folder_.path());
    if (std::find(names.begin(), names.end(), panel_.DebugLogName) == names.end()) return;
    panel_.CloseDebugLog();
    const std::string path = (std::filesystem::path(folder_.path()) / panel_.DebugLogName).string();
    const FileProblem why = files.remove(path);
    if (!why.empty())
        boxes_.show({BoxIcon::Critical, "The file " + path + " cannot be deleted: " + why});
}

}  // namespace zel
