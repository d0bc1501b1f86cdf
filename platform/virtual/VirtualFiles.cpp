#include "platform/virtual/VirtualFiles.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <limits>
#include <memory>
#include <span>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "platform/Files.h"

namespace zel {
namespace {

constexpr int kMostLinks = 16;
constexpr const char* kMissing = "No such file or directory";
constexpr const char* kFull = "No space left on device";
constexpr const char* kCircle = "Too many levels of symbolic links";
constexpr const char* kExists = "File exists";
constexpr const char* kFolder = "it is a folder";
constexpr const char* kOther = "it is no regular file";
constexpr const char* kBroken = "Input/output error";

std::string parentOf(const std::string& path) {
    const auto slash = path.find_last_of('/');
    return slash == std::string::npos || slash == 0 ? "/" : path.substr(0, slash);
}

/// Reads a copy: a file that is replaced meanwhile is read as it was opened.
class MemoryReader : public FileReader {
  public:
    MemoryReader(std::string bytes, std::uint64_t readable)
        : bytes_(std::move(bytes)), readable_(readable) {}
    std::uint64_t size() const override { return bytes_.size(); }
    std::size_t read(std::span<char> buffer, FileProblem& problem) override {
        const std::size_t left = std::min(buffer.size(), bytes_.size() - at_);
        const std::size_t got = std::min<std::uint64_t>(left, readable_ - std::min(readable_, at_));
        if (got < left) problem = kBroken;
        std::copy_n(bytes_.data() + at_, got, buffer.data());
        at_ += got;
        return got;
    }

  private:
    std::string bytes_;
    std::uint64_t readable_;
    std::uint64_t at_ = 0;
};

}  // namespace

void VirtualFiles::put(const std::string& path, std::string bytes, unsigned mode) {
    putFolder(parentOf(path));
    entries_[path] = {FileKind::Regular, std::move(bytes), "", mode, clock_.date()};
}

void VirtualFiles::putFolder(const std::string& path) {
    for (std::string folder = path; folder != "/"; folder = parentOf(folder))
        entries_[folder] = {FileKind::Folder, "", "", 0755, clock_.date()};
}

void VirtualFiles::putLink(const std::string& path, const std::string& target) {
    putFolder(parentOf(path));
    entries_[path] = {FileKind::Other, "", target, 0777, clock_.date()};
}

void VirtualFiles::putOther(const std::string& path) {
    putFolder(parentOf(path));
    entries_[path] = {FileKind::Other, "", "", 0666, clock_.date()};
}

std::string VirtualFiles::bytes(const std::string& path) const {
    const auto found = entries_.find(path);
    return found == entries_.end() ? std::string() : found->second.bytes;
}

unsigned VirtualFiles::mode(const std::string& path) const {
    const auto found = entries_.find(path);
    return found == entries_.end() ? 0 : found->second.mode;
}

bool VirtualFiles::gone(const std::string& path) const {
    return std::any_of(vanished_.begin(), vanished_.end(), [&](const std::string& place) {
        return path == place || path.starts_with(place + "/");
    });
}

std::string VirtualFiles::resolved(std::string path) const {
    for (int links = 0; links < kMostLinks; ++links) {
        const auto found = entries_.find(path);
        if (found == entries_.end() || found->second.target.empty()) return path;
        path = found->second.target;
    }
    return {};
}

const VirtualFiles::Entry* VirtualFiles::find(const std::string& path) const {
    const std::string last = resolved(path);
    if (gone(path) || gone(last)) return nullptr;
    const auto found = entries_.find(last);
    return found == entries_.end() ? nullptr : &found->second;
}

FileProblem VirtualFiles::refusal(const std::string& path) const {
    const auto found = refused_.find(path);
    return found == refused_.end() ? FileProblem() : found->second;
}

FileProblem VirtualFiles::noPlace(const std::string& path) const {
    const std::string folder = parentOf(path);
    if (gone(path)) return kMissing;
    if (const FileProblem refused = refusal(folder); !refused.empty()) return refused;
    if (folder == "/") return {};
    const Entry* entry = find(folder);
    if (entry == nullptr) return kMissing;
    return entry->kind == FileKind::Folder ? FileProblem() : FileProblem("Not a directory");
}

FileStatus VirtualFiles::stat(const std::string& path) {
    if (path == "/") return {FileKind::Folder, 0, 0};
    const Entry* entry = find(path);
    if (entry == nullptr) return {};
    return {entry->kind, entry->bytes.size(), entry->modified};
}

std::vector<std::string> VirtualFiles::list(const std::string& folder) {
    const std::string place =
        folder.size() > 1 && folder.back() == '/' ? folder.substr(0, folder.size() - 1) : folder;
    std::vector<std::string> names;
    for (const auto& [path, entry] : entries_)
        if (parentOf(path) == place && !gone(path))
            names.push_back(path.substr(path.find_last_of('/') + 1));
    return names;
}

std::unique_ptr<FileReader> VirtualFiles::open(const std::string& path, FileProblem& problem) {
    problem.clear();
    const Entry* entry = find(path);
    if (resolved(path).empty()) {
        problem = kCircle;
    } else if (entry == nullptr) {
        problem = kMissing;
    } else if (entry->kind == FileKind::Folder) {
        problem = kFolder;
    } else if (entry->kind == FileKind::Other) {
        problem = kOther;
    } else {
        problem = refusal(resolved(path));
    }
    if (!problem.empty()) return nullptr;
    return std::make_unique<MemoryReader>(entry->bytes, readable);
}

FileProblem VirtualFiles::write(const std::string& path, std::string bytes, std::size_t needed,
                                std::size_t freed) {
    if (needed > room) return kFull;
    Entry& entry = entries_[path];
    entry.bytes = std::move(bytes);
    entry.modified = clock_.date();
    if (room != std::numeric_limits<std::uint64_t>::max()) room = room - needed + freed;
    return {};
}

FileProblem VirtualFiles::append(const std::string& path, std::string_view bytes) {
    const std::string last = resolved(path);
    if (last.empty()) return kCircle;
    const Entry* entry = find(path);
    if (entry == nullptr) {
        if (const FileProblem problem = noPlace(last); !problem.empty()) return problem;
        return write(last, std::string(bytes), bytes.size(), 0);
    }
    if (entry->kind == FileKind::Folder) return kFolder;
    if (const FileProblem problem = refusal(last); !problem.empty()) return problem;
    if (entry->kind == FileKind::Other) return {};
    return write(last, entry->bytes + std::string(bytes), bytes.size(), 0);
}

FileProblem VirtualFiles::replace(const std::string& path, std::string_view bytes) {
    const std::string last = resolved(path);
    if (last.empty()) return kCircle;
    const Entry* entry = find(path);
    if (entry != nullptr && entry->kind == FileKind::Folder) return kFolder;
    if (const FileProblem problem = refusal(last); !problem.empty()) return problem;
    if (entry != nullptr && entry->kind == FileKind::Other) return {};
    if (const FileProblem problem = noPlace(last); !problem.empty()) return problem;
    return write(last, std::string(bytes), bytes.size(), entry ? entry->bytes.size() : 0);
}

FileProblem VirtualFiles::create(const std::string& path, std::string_view bytes) {
    if (entries_.contains(path) && !gone(path)) return kExists;
    if (const FileProblem problem = noPlace(path); !problem.empty()) return problem;
    return write(path, std::string(bytes), bytes.size(), 0);
}

FileProblem VirtualFiles::remove(const std::string& path) {
    const auto found = entries_.find(path);
    if (found == entries_.end() || gone(path)) return kMissing;
    if (found->second.kind == FileKind::Folder) return kFolder;
    if (const FileProblem problem = refusal(path); !problem.empty()) return problem;
    if (room != std::numeric_limits<std::uint64_t>::max()) room += found->second.bytes.size();
    entries_.erase(found);
    return {};
}

}  // namespace zel
