#include "files/FileOps.h"

#include <algorithm>
#include <cstddef>
#include <filesystem>
#include <optional>
#include <stdexcept>
#include <string>
#include <utility>

#include "platform/Files.h"
#include "platform/Services.h"
#include "support/FileText.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr const char* kSaveFilter =
    "All Files (*.*)|*.*|Text Files(*.txt)|*.txt|Dat Files (*.dat)|*.dat|CSV Files (*.csv)|*.csv";
constexpr const char* kOpenFilter =
    "All Files (*.*)|*.*|Text Files(*.txt)|*.txt|Data Files (*.dat)|*.dat|CSV Files (*.csv)|*.csv";
/// The kinds of picture beside the one that is offered first.
constexpr const char* kOtherImages =
    "|SVG Files (*.svg)|*.svg|PDF Files (*.pdf)|*.pdf|PNG Files (*.png)|*.png";
constexpr int kImageFilter = 2;
constexpr const char* kScriptFolder = "specialMeas";
/// Up to this size a file is read whatever its bytes are.
constexpr std::size_t kAnyText = std::size_t{1} << 20;

}  // namespace

void FileOps::note(const std::string& path) {
    LastDialogFileName = path;
    panel_.CommonDialog1FileName = path;
}

std::string FileOps::finish(const std::optional<std::string>& chosen) {
    if (!chosen || chosen->empty()) return {};
    note(*chosen);
    return *chosen;
}

std::string FileOps::ShowSaveDataDialog(int filterIndex) {
    FileDialogRequest request;
    request.filter = kSaveFilter;
    request.filterIndex = filterIndex;
    request.folder = folder_.path();
    request.promptOverwrite = true;
    return finish(dialogs_.save(request));
}

std::string FileOps::ShowSaveImageDialog(const std::string& extension) {
    FileDialogRequest request;
    request.filter =
        "All Files (*.*)|*.*|Text Files(*." + extension + ")|*." + extension + kOtherImages;
    request.filterIndex = kImageFilter;
    request.folder = folder_.path();
    request.promptOverwrite = true;
    std::optional<std::string> chosen = dialogs_.save(request);
    if (chosen && !chosen->empty() && !std::filesystem::path(*chosen).has_extension())
        *chosen += "." + extension;
    return finish(chosen);
}

std::string FileOps::ShowOpenDataDialog(int filterIndex) {
    if (LastOpenFolder.empty())
        LastOpenFolder = (std::filesystem::path(folder_.path()) / kScriptFolder).string();
    FileDialogRequest request;
    request.filter = kOpenFilter;
    request.filterIndex = filterIndex;
    request.folder = LastOpenFolder;
    std::string path = finish(dialogs_.open(request));
    if (!path.empty()) LastOpenFolder = std::filesystem::path(path).parent_path().string();
    return path;
}

std::string FileOps::ReadWholeFile(const std::string& path, const ReadProgress& progress) const {
    if (path.empty()) return {};
    FileProblem problem;
    std::optional<std::string> bytes = readFile(files_, path, kLargestFile, problem, progress);
    if (!bytes) throw std::runtime_error(readProblem(path, problem));
    if (isValidUtf8(*bytes)) return std::move(*bytes);
    // Both forms stand in memory for a moment. No measured data is mostly of letters that have
    // several bytes in UTF-8.
    const auto wide = std::count_if(bytes->begin(), bytes->end(),
                                    [](char c) { return static_cast<unsigned char>(c) >= 0x80; });
    if (bytes->size() > kAnyText && static_cast<std::size_t>(wide) > bytes->size() / 4)
        throw std::runtime_error(readProblem(path, "it holds no text"));
    return bytesToUtf8(*bytes);
}

std::string FileOps::LastFileDateTime() const {
    return LastDialogFileName.empty() ? " " : dateTimeOf(LastDialogFileName);
}

std::string FileOps::dateTimeOf(const std::string& path) const {
    const FileStatus file = files_.stat(path);
    return file.exists() ? clock_.dateTimeText(file.modified) : " ";
}

}  // namespace zel
