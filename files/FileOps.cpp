#include "files/FileOps.h"

#include <algorithm>
#include <cerrno>
#include <cstdio>
#include <filesystem>
#include <memory>
#include <stdexcept>
#include <system_error>

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
constexpr std::size_t kChunk = std::size_t{4} * 1024 * 1024;
constexpr std::size_t kLeastRead = 4096;

struct Closer {
    void operator()(std::FILE* file) const { std::fclose(file); }
};

[[noreturn]] void fail(const std::string& path, const std::string& why) {
    throw std::runtime_error("The file " + path + " cannot be read: " + why);
}

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

std::string FileOps::ReadWholeFile(const std::string& path, const Progress& progress) const {
    if (path.empty()) return {};
    std::error_code problem;
    if (std::filesystem::is_directory(path, problem)) fail(path, "it is a folder");
    errno = 0;
    const std::unique_ptr<std::FILE, Closer> file(std::fopen(path.c_str(), "rb"));
    if (!file) fail(path, std::generic_category().message(errno));
    // A device or a pipe has no size; it is read to the same limit.
    const auto told = std::filesystem::file_size(path, problem);
    const std::uint64_t size = problem ? 0 : told;
    if (size > kLargestFile) fail(path, "it is larger than 2 GB");
    std::string bytes;
    bytes.reserve(size + kLeastRead);  // the last read finds the end
    for (std::size_t got = 1; got > 0;) {
        const std::size_t before = bytes.size();
        const std::size_t left = size > before ? static_cast<std::size_t>(size) - before : 0;
        bytes.resize(before + std::min(kChunk, std::max(left, kLeastRead)));
        got = std::fread(bytes.data() + before, 1, bytes.size() - before, file.get());
        bytes.resize(before + got);
        if (bytes.size() > kLargestFile) fail(path, "it is larger than 2 GB");
        if (progress) progress(bytes.size(), std::max<std::uint64_t>(size, bytes.size()));
    }
    if (std::ferror(file.get()) != 0) fail(path, std::generic_category().message(errno));
    if (!isValidUtf8(bytes)) return bytesToUtf8(bytes);
    return bytes;
}

std::string FileOps::LastFileDateTime() const {
    if (LastDialogFileName.empty()) return " ";
    const std::optional<double> date = clock_.modified(LastDialogFileName);
    return date ? clock_.dateTimeText(*date) : " ";
}

}  // namespace zel
