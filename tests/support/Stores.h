#pragma once
// A folder of its own for each test of what is kept in files.

#include <gtest/gtest.h>

#include <string>

#include "platform/virtual/VirtualFiles.h"
#include "platform/virtual/VirtualTime.h"

namespace zel {

class Stores : public testing::Test {
  protected:
    Stores() { disk_.putFolder(folder_); }

    std::string file(const std::string& name) const { return folder_ + "/" + name; }
    std::string write(const std::string& text) {
        disk_.put(file("a.ini"), text);
        return file("a.ini");
    }
    std::string read(const std::string& name) const { return disk_.bytes(name); }
    /// How many files the folder holds.
    std::size_t files() { return disk_.list(folder_).size(); }

    const std::string folder_ = "/stores";
    VirtualClock clock_;
    VirtualFiles disk_{clock_};
};

}  // namespace zel
