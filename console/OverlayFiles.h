#pragma once
// Files that are read where they lie and written to memory: a session that runs again changes
// nothing on the disk.

#include <map>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "platform/Files.h"

namespace zel {

class OverlayFiles : public FileService {
  public:
    explicit OverlayFiles(FileService& disk) : disk_(disk) {}

    FileStatus stat(const std::string& path) override;
    std::vector<std::string> list(const std::string& folder) override;
    std::unique_ptr<FileReader> open(const std::string& path, FileProblem& problem) override;
    FileProblem append(const std::string& path, std::string_view bytes) override;
    FileProblem replace(const std::string& path, std::string_view bytes) override;
    FileProblem create(const std::string& path, std::string_view bytes) override;
    FileProblem remove(const std::string& path) override;

  private:
    /// Nothing where a file of the disk was removed.
    using Entry = std::optional<std::string>;
    FileProblem noPlace(const std::string& path);

    FileService& disk_;
    std::map<std::string, Entry> written_;
};

}  // namespace zel
