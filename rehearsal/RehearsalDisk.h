#pragma once
// A disk over another one: what is written stays in memory, and can be read from there.

#include <functional>
#include <map>
#include <memory>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "platform/Files.h"

namespace zel {

class RehearsalDisk : public FileService {
  public:
    /// `note` gets each file at its first writing: its path, and "new", "extended" or "replaced".
    RehearsalDisk(FileService& below,
                  std::function<void(const std::string& path, const char* fate)> note)
        : below_(below), note_(std::move(note)) {}

    FileStatus stat(const std::string& path) override;
    std::vector<std::string> list(const std::string& folder) override;
    std::unique_ptr<FileReader> open(const std::string& path, FileProblem& problem) override;
    FileProblem append(const std::string& path, std::string_view bytes) override;
    FileProblem replace(const std::string& path, std::string_view bytes) override;
    FileProblem create(const std::string& path, std::string_view bytes) override;
    FileProblem remove(const std::string& path) override;

  private:
    /// The file's bytes in memory, with `before` what stands below; null, with `problem` set,
    /// where no file can be.
    std::string* made(const std::string& path, bool before, FileProblem& problem);

    FileService& below_;
    std::function<void(const std::string&, const char*)> note_;
    std::map<std::string, std::string> made_;
};

}  // namespace zel
