#include "rehearsal/RehearsalDisk.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <filesystem>
#include <memory>
#include <span>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "platform/Files.h"
#include "support/FileText.h"

namespace zel {
namespace {

namespace fs = std::filesystem;

/// A file that is larger is taken as empty: nothing of a check reads so much.
constexpr std::uint64_t kLargestKept = std::uint64_t{64} * 1024 * 1024;

class MemoryReader : public FileReader {
  public:
    explicit MemoryReader(std::string bytes) : bytes_(std::move(bytes)) {}
    std::uint64_t size() const override { return bytes_.size(); }
    std::size_t read(std::span<char> buffer, FileProblem&) override {
        const std::size_t count = std::min(buffer.size(), bytes_.size() - at_);
        std::copy_n(bytes_.data() + at_, count, buffer.data());
        at_ += count;
        return count;
    }

  private:
    std::string bytes_;
    std::size_t at_ = 0;
};

std::string folderOf(const std::string& path) {
    const std::string folder = fs::path(path).parent_path().string();
    return folder.empty() ? "." : folder;
}

}  // namespace

FileStatus RehearsalDisk::stat(const std::string& path) {
    const auto found = made_.find(path);
    if (found == made_.end()) return below_.stat(path);
    FileStatus status = below_.stat(path);
    status.kind = FileKind::Regular;
    status.size = found->second.size();
    return status;
}

std::vector<std::string> RehearsalDisk::list(const std::string& folder) {
    std::vector<std::string> names = below_.list(folder);
    for (const auto& [path, bytes] : made_) {
        const std::string name = fs::path(path).filename().string();
        const bool inside = fs::path(path).parent_path() == fs::path(folder);
        if (inside && std::find(names.begin(), names.end(), name) == names.end())
            names.push_back(name);
    }
    return names;
}

std::unique_ptr<FileReader> RehearsalDisk::open(const std::string& path, FileProblem& problem) {
    const auto found = made_.find(path);
    if (found == made_.end()) return below_.open(path, problem);
    problem.clear();
    return std::make_unique<MemoryReader>(found->second);
}

std::string* RehearsalDisk::made(const std::string& path, bool before, FileProblem& problem) {
    const auto found = made_.find(path);
    if (found != made_.end()) return &found->second;
    const FileStatus there = below_.stat(path);
    if (below_.stat(folderOf(path)).kind != FileKind::Folder) problem = "No such file or directory";
    if (there.kind == FileKind::Folder) problem = "Is a directory";
    if (!problem.empty()) return nullptr;
    std::string& bytes = made_[path];
    if (before && there.isRegular())
        bytes = readFile(below_, path, kLargestKept, problem).value_or("");
    problem.clear();
    note_(path, !there.exists() ? "new" : before ? "extended" : "replaced");
    return &bytes;
}

FileProblem RehearsalDisk::append(const std::string& path, std::string_view bytes) {
    FileProblem problem;
    if (std::string* file = made(path, true, problem)) *file += bytes;
    return problem;
}

FileProblem RehearsalDisk::replace(const std::string& path, std::string_view bytes) {
    FileProblem problem;
    if (std::string* file = made(path, false, problem)) *file = bytes;
    return problem;
}

FileProblem RehearsalDisk::create(const std::string& path, std::string_view bytes) {
    if (stat(path).exists()) return "File exists";
    return replace(path, bytes);
}

FileProblem RehearsalDisk::remove(const std::string& path) {
    return made_.erase(path) > 0 ? FileProblem() : FileProblem("Operation not permitted");
}

}  // namespace zel
