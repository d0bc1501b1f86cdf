#pragma once
// A folder of its own for each test of what is kept in files.

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <iterator>
#include <random>
#include <string>

namespace zel {

class Stores : public testing::Test {
  protected:
    Stores() {
        folder_ = std::filesystem::temp_directory_path() /
                  ("zel-stores-" + std::to_string(std::random_device()()));
        std::filesystem::create_directories(folder_);
    }
    ~Stores() override { std::filesystem::remove_all(folder_); }

    std::string file(const std::string& name) const { return (folder_ / name).string(); }
    std::string write(const std::string& text) const {
        std::ofstream(file("a.ini"), std::ios::binary) << text;
        return file("a.ini");
    }
    static std::string read(const std::string& name) {
        std::ifstream stream(name, std::ios::binary);
        return {std::istreambuf_iterator<char>(stream), {}};
    }
    /// How many files the folder holds.
    std::ptrdiff_t files() const {
        return std::distance(std::filesystem::directory_iterator(folder_), {});
    }

    std::filesystem::path folder_;
};

}  // namespace zel
