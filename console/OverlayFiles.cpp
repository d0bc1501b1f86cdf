#include "console/OverlayFiles.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <filesystem>
#include <memory>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "platform/Files.h"
#include "support/FileText.h"

namespace zel {
namespace {

constexpr std::uint64_t kLargest = 256'000'000;
constexpr const char* kMissing = "No such file or directory";

class MemoryReader : public FileReader {
  public:
    explicit MemoryReader(std::string bytes) : bytes_(std::move(bytes)) {}
    std::uint64_t size() const override { return bytes_.size(); }
    std::size_t read(std::span<char> buffer, FileProblem& /*problem*/) override {
        const std::size_t count = std::min(buffer.size(), bytes_.size() - at_);
        std::copy_n(bytes_.begin() + static_cast<std::ptrdiff_t>(at_), count, buffer.begin());
        at_ += count;
        return count;
    }

  private:
    std::string bytes_;
    std::size_t at_ = 0;
};

}  // namespace

FileStatus OverlayFiles::stat(const std::string& path) {
    const auto found = written_.find(path);
    if (found == written_.end()) return disk_.stat(path);
    if (!found->second) return {};
    return {FileKind::Regular, found->second->size(), 0};
}

std::vector<std::string> OverlayFiles::list(const std::string& folder) {
    std::vector<std::string> names = disk_.list(folder);
    for (const auto& [path, entry] : written_) {
        const std::filesystem::path file(path);
        if (file.parent_path() != std::filesystem::path(folder)) continue;
        const std::string name = file.filename().string();
        names.erase(std::remove(names.begin(), names.end(), name), names.end());
        if (entry) names.push_back(name);
    }
    return names;
}

std::unique_ptr<FileReader> OverlayFiles::open(const std::string& path, FileProblem& problem) {
    const auto found = written_.find(path);
    if (found == written_.end()) return disk_.open(path, problem);
    if (found->second) return std::make_unique<MemoryReader>(*found->second);
    problem = kMissing;
    return nullptr;
}

FileProblem OverlayFiles::noPlace(const std::string& path) {
    std::string folder = std::filesystem::path(path).parent_path().string();
    if (folder.empty()) folder = ".";
    if (disk_.stat(folder).kind != FileKind::Folder) return kMissing;
    return disk_.stat(path).kind == FileKind::Folder ? "Is a directory" : "";
}

FileProblem OverlayFiles::append(const std::string& path, std::string_view bytes) {
    std::string all;
    if (stat(path).isRegular()) {
        FileProblem problem;
        const auto before = readFile(*this, path, kLargest, problem);
        if (!before) return problem;
        all = *before;
    }
    return replace(path, all + std::string(bytes));
}

FileProblem OverlayFiles::replace(const std::string& path, std::string_view bytes) {
    FileProblem problem = noPlace(path);
    if (problem.empty()) written_[path] = std::string(bytes);
    return problem;
}

FileProblem OverlayFiles::create(const std::string& path, std::string_view bytes) {
    if (stat(path).exists()) return "File exists";
    return replace(path, bytes);
}

FileProblem OverlayFiles::remove(const std::string& path) {
    if (!stat(path).exists()) return kMissing;
    written_[path] = std::nullopt;
    return {};
}

}  // namespace zel
