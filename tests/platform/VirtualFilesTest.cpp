#include <gtest/gtest.h>

#include <array>

#include "platform/virtual/VirtualFiles.h"
#include "platform/virtual/VirtualTime.h"

namespace zel {
namespace {

struct VirtualFilesTest : ::testing::Test {
    std::string read(const std::string& path) {
        FileProblem problem;
        const auto file = files.open(path, problem);
        if (!file) return problem;
        std::array<char, 16> buffer{};
        const std::size_t got = file->read(buffer, problem);
        return std::string(buffer.data(), got) + problem;
    }
    VirtualClock clock;
    VirtualFiles files{clock};
};

TEST_F(VirtualFilesTest, Replace_GivesTheBytesAndKeepsTheMode) {
    files.put("/a/x", "old", 0640);
    EXPECT_EQ(files.replace("/a/x", "new"), "");
    EXPECT_EQ(read("/a/x"), "new");
    EXPECT_EQ(files.mode("/a/x"), 0640U);
    EXPECT_EQ(files.stat("/a/x").size, 3U);
    EXPECT_EQ(files.stat("/a/x").modified, clock.date());
}

TEST_F(VirtualFilesTest, Append_MakesTheFileAndGoesOn) {
    files.putFolder("/a");
    EXPECT_EQ(files.append("/a/x", "one"), "");
    EXPECT_EQ(files.append("/a/x", "two"), "");
    EXPECT_EQ(read("/a/x"), "onetwo");
}

TEST_F(VirtualFilesTest, FullDisk_LeavesEachFileAsItWas) {
    files.put("/a/x", "old");
    files.room = 2;
    EXPECT_EQ(files.append("/a/x", "new"), "No space left on device");
    EXPECT_EQ(files.replace("/a/x", "new"), "No space left on device");
    EXPECT_EQ(files.create("/a/y", "new"), "No space left on device");
    EXPECT_EQ(read("/a/x"), "old");
    EXPECT_FALSE(files.has("/a/y"));
    EXPECT_EQ(files.append("/a/x", "!!"), "");
    EXPECT_EQ(files.append("/a/x", "!"), "No space left on device");
    EXPECT_EQ(files.remove("/a/x"), "");
    EXPECT_EQ(files.room, 5U);
}

TEST_F(VirtualFilesTest, VanishedFolder_HoldsNothingUntilItComesBack) {
    files.put("/a/x", "old");
    files.vanish("/a");
    EXPECT_FALSE(files.stat("/a/x").exists());
    EXPECT_EQ(read("/a/x"), "No such file or directory");
    EXPECT_EQ(files.append("/a/x", "new"), "No such file or directory");
    EXPECT_EQ(files.replace("/a/x", "new"), "No such file or directory");
    EXPECT_EQ(files.create("/a/y", "new"), "No such file or directory");
    EXPECT_TRUE(files.list("/a").empty());
    files.comeBack("/a");
    EXPECT_EQ(read("/a/x"), "old");
    EXPECT_EQ(files.list("/a"), std::vector<std::string>{"x"});
}

TEST_F(VirtualFilesTest, Refusal_IsGivenForTheFileAndForItsFolder) {
    files.put("/a/x", "old");
    files.refuse("/a/x", "Permission denied");
    EXPECT_EQ(read("/a/x"), "Permission denied");
    EXPECT_EQ(files.append("/a/x", "new"), "Permission denied");
    files.refuse("/a/x", "");
    files.refuse("/a", "Read-only file system");
    EXPECT_EQ(files.create("/a/y", ""), "Read-only file system");
    EXPECT_EQ(files.replace("/a/x", ""), "Read-only file system");
    EXPECT_EQ(read("/a/x"), "old");
}

TEST_F(VirtualFilesTest, Create_TakesNoPathThatIsThere) {
    files.put("/a/x", "old");
    files.putLink("/a/link", "/a/nowhere");
    EXPECT_EQ(files.create("/a/x", "new"), "File exists");
    EXPECT_EQ(files.create("/a/link", "new"), "File exists");
    EXPECT_FALSE(files.has("/a/nowhere"));
}

TEST_F(VirtualFilesTest, Link_LeadsToItsTarget) {
    files.put("/b/x", "old");
    files.putLink("/a/link", "/b/x");
    EXPECT_EQ(files.replace("/a/link", "new"), "");
    EXPECT_EQ(files.bytes("/b/x"), "new");
    EXPECT_EQ(read("/a/link"), "new");
    EXPECT_EQ(files.remove("/a/link"), "");
    EXPECT_TRUE(files.has("/b/x"));
    files.putLink("/a/p", "/a/q");
    files.putLink("/a/q", "/a/p");
    EXPECT_EQ(read("/a/p"), "Too many levels of symbolic links");
}

TEST_F(VirtualFilesTest, WhatIsNoRegularFile_IsNotRead) {
    files.putOther("/dev/pipe");
    EXPECT_EQ(read("/dev/pipe"), "it is no regular file");
    EXPECT_EQ(read("/dev"), "it is a folder");
    EXPECT_EQ(files.stat("/dev/pipe").kind, FileKind::Other);
    EXPECT_EQ(files.replace("/dev/pipe", "new"), "");
}

TEST_F(VirtualFilesTest, DiskThatBreaksWhileItIsRead_GivesWhatCame) {
    files.put("/a/x", "abcdef");
    files.readable = 4;
    EXPECT_EQ(read("/a/x"), "abcdInput/output error");
}

}  // namespace
}  // namespace zel
