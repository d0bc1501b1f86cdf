#pragma once
// A folder on the real disk, for tests of what reaches it through the whole program.

#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>

namespace zel {

class DiskFolder {
  public:
    DiskFolder() {
        std::string pattern = (std::filesystem::temp_directory_path() / "views-XXXXXX").string();
        path_ = ::mkdtemp(pattern.data());
    }
    ~DiskFolder() {
        std::error_code ignored;
        std::filesystem::remove_all(path_, ignored);
    }
    DiskFolder(const DiskFolder&) = delete;
    DiskFolder& operator=(const DiskFolder&) = delete;

    std::string file(const std::string& name) const { return (path_ / name).string(); }
    std::string read(const std::string& name) const {
        std::ifstream in(file(name), std::ios::binary);
        return {std::istreambuf_iterator<char>(in), {}};
    }
    std::string write(const std::string& name, const std::string& text) const {
        std::ofstream(file(name), std::ios::binary) << text;
        return file(name);
    }
    bool has(const std::string& name) const { return std::filesystem::exists(file(name)); }

  private:
    std::filesystem::path path_;
};

}  // namespace zel
