#pragma once
// The files of the operating system, by its own calls.

#include <sys/stat.h>

#include <functional>
#include <memory>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "platform/Files.h"

namespace zel {

class SystemFiles : public FileService {
  public:
    /// Gives the ending of a temporary file's name; a new one at each call.
    using Ending = std::function<std::string()>;
    explicit SystemFiles(Ending ending = randomEnding) : ending_(std::move(ending)) {}

    FileStatus stat(const std::string& path) override;
    std::vector<std::string> list(const std::string& folder) override;
    std::unique_ptr<FileReader> open(const std::string& path, FileProblem& problem) override;
    FileProblem append(const std::string& path, std::string_view bytes) override;
    FileProblem replace(const std::string& path, std::string_view bytes) override;
    FileProblem create(const std::string& path, std::string_view bytes) override;
    FileProblem remove(const std::string& path) override;

  private:
    static std::string randomEnding();
    /// `older` is what the system says about the file that is replaced; null where none is.
    FileProblem throughTemporary(const std::string& target, std::string_view bytes,
                                 const struct stat* older);

    Ending ending_;
};

}  // namespace zel
