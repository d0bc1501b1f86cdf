#pragma once
// A disk in memory that can fill up, vanish and refuse.

#include <cstddef>
#include <cstdint>
#include <limits>
#include <map>
#include <memory>
#include <set>
#include <string>
#include <string_view>
#include <vector>

#include "platform/Clock.h"
#include "platform/Files.h"

namespace zel {

/// The root folder "/" is always there. What the tests put, see and break stands first; the
/// service below it behaves as on a real disk.
class VirtualFiles : public FileService {
  public:
    explicit VirtualFiles(const Clock& clock) : clock_(clock) {}

    /// Puts a regular file, with the folders that lead to it.
    void put(const std::string& path, std::string bytes, unsigned mode = 0644);
    void putFolder(const std::string& path);
    void putLink(const std::string& path, const std::string& target);
    /// Puts what is neither file nor folder: a pipe, a device.
    void putOther(const std::string& path);
    /// What a regular file holds, whatever is broken; empty where there is none.
    std::string bytes(const std::string& path) const;
    unsigned mode(const std::string& path) const;
    bool has(const std::string& path) const { return entries_.contains(path); }

    /// Bytes that the disk still takes.
    std::uint64_t room = std::numeric_limits<std::uint64_t>::max();
    /// Every reader fails after so many bytes.
    std::uint64_t readable = std::numeric_limits<std::uint64_t>::max();
    /// Nothing at or below this path is there any more.
    void vanish(const std::string& path) { vanished_.insert(path); }
    void comeBack(const std::string& path) { vanished_.erase(path); }
    /// Reading and writing this file, or making files in this folder, fails for this reason; an
    /// empty reason ends it.
    void refuse(const std::string& path, const FileProblem& reason) { refused_[path] = reason; }

    FileStatus stat(const std::string& path) override;
    std::vector<std::string> list(const std::string& folder) override;
    std::unique_ptr<FileReader> open(const std::string& path, FileProblem& problem) override;
    FileProblem append(const std::string& path, std::string_view bytes) override;
    FileProblem replace(const std::string& path, std::string_view bytes) override;
    FileProblem create(const std::string& path, std::string_view bytes) override;
    FileProblem remove(const std::string& path) override;

  private:
    struct Entry {
        FileKind kind = FileKind::Regular;
        std::string bytes;
        std::string target;  ///< of a link
        unsigned mode = 0644;
        double modified = 0;
    };
    bool gone(const std::string& path) const;
    /// The path behind all links; empty for a circle.
    std::string resolved(std::string path) const;
    const Entry* find(const std::string& path) const;
    FileProblem refusal(const std::string& path) const;
    /// Why no file can be made at the path.
    FileProblem noPlace(const std::string& path) const;
    FileProblem write(const std::string& path, std::string bytes, std::size_t needed,
                      std::size_t freed);

    const Clock& clock_;
    std::map<std::string, Entry> entries_;
    std::set<std::string> vanished_;
    std::map<std::string, FileProblem> refused_;
};

}  // namespace zel
