#include "files/FileMenu.h"

#include <filesystem>
#include <system_error>

namespace zel {
namespace {

namespace fs = std::filesystem;

constexpr const char* kImageExtension = "wmf";

}  // namespace

FileMenu::FileMenu(ControllerForm& panel, FileOps& files, ApplicationFolder& folder,
                   MessageBoxes& boxes)
    : panel_(panel), files_(files), folder_(folder), boxes_(boxes) {
    panel_.MenuFileSaveImage.Clicked.connect([this] { MenuFileSaveImage_Click(); });
    panel_.DelLogFile.Clicked.connect([this] { DelLogFile_Click(); });
}

void FileMenu::MenuFileSaveImage_Click() {
    const std::string path = files_.ShowSaveImageDialog(kImageExtension);
    if (path.empty()) return;
    std::string problem;
    panel_.DrawImage(path, problem);
    if (!problem.empty()) boxes_.show({BoxIcon::Critical, problem});
}

void FileMenu::DelLogFile_Click() {
    std::error_code problem;
    for (const fs::directory_entry& entry : fs::directory_iterator(folder_.path(), problem)) {
        if (entry.path().filename() != panel_.DebugLogName) continue;
        panel_.CloseDebugLog();
        std::error_code refused;
        fs::remove(entry.path(), refused);
        if (refused)
            boxes_.show({BoxIcon::Critical, "The file " + entry.path().string() +
                                                " cannot be deleted: " + refused.message()});
        return;
    }
}

}  // namespace zel
