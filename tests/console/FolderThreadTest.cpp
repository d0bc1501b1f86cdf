// A folder that a thread of its own reads.

#include <gtest/gtest.h>

#include "desktop/platform/FolderThread.h"
#include "tests/files/DiskFolder.h"

namespace zel {
namespace {

constexpr int kPatienceMs = 30'000;

TEST(FolderThread, Folder_IsListedByName) {
    DiskFolder folder;
    folder.write("b", "");
    folder.write("a", "");
    folder.write(".hidden", "");
    const auto reading = readInThread(folder.file("."));
    const FolderFiles* found = reading->result(kPatienceMs);
    ASSERT_NE(found, nullptr);
    EXPECT_EQ(found->names, (std::vector<std::string>{"a", "b"}));
    EXPECT_EQ(found->more, 0U);
    EXPECT_EQ(reading->result(0), found);
}

TEST(FolderThread, FolderThatIsNotThere_HasNoFiles) {
    const auto reading = readInThread("/nothing/there");
    const FolderFiles* found = reading->result(kPatienceMs);
    ASSERT_NE(found, nullptr);
    EXPECT_TRUE(found->names.empty());
}

TEST(FolderThread, ReadingThatNobodyWaitsFor_EndsByItself) {
    DiskFolder folder;
    for (int i = 0; i < 100; ++i) readInThread(folder.file("."));
}

}  // namespace
}  // namespace zel
