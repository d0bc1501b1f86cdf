// Holds the includes of the whole tree against the tables in docs/architecture.md.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "tests/house/House.h"

namespace zel::house {
namespace {

/// One breach a line, so that a failure shows them all.
std::string lines(const std::vector<std::string>& breaches) {
    std::string text;
    for (const std::string& breach : breaches) text += breach + "\n";
    return text;
}

class Architecture : public ::testing::Test {
  protected:
    static void SetUpTestSuite() {
        root_ = ZEL_SOURCE_DIR;
        house_ = readHouse(readText(root_ + "/docs/architecture.md"));
        files_ = readSources(root_);
    }
    static std::string root_;
    static House house_;
    static std::vector<SourceFile> files_;
};

std::string Architecture::root_;
House Architecture::house_;
std::vector<SourceFile> Architecture::files_;

TEST_F(Architecture, Tree_HoldsTheFilesThatTheTestsJudge) {
    const auto has = [](const std::string& path) {
        for (const SourceFile& file : files_) {
            if (file.path == path) return !file.text.empty();
        }
        return false;
    };
    EXPECT_TRUE(has("platform/Controls.h"));
    EXPECT_TRUE(has("tests/house/ArchitectureTest.cpp"));
}

TEST_F(Architecture, SourceFile_IsInARoomOfTheTable) {
    EXPECT_EQ(lines(homelessFiles(house_, files_)), "");
}

TEST_F(Architecture, Room_IsThereOrMarkedAsComing) {
    EXPECT_EQ(lines(missingRooms(house_, files_)), "");
}

TEST_F(Architecture, Tests_MirrorTheRooms) {
    EXPECT_EQ(lines(unmirroredRooms(house_, files_)), "");
}

TEST_F(Architecture, Picture_ShowsTheTable) {
    EXPECT_EQ(lines(pictureBreaches(house_, readText(root_ + "/docs/images/house.svg"))), "")
        << "cmake --build --preset release --target house_picture draws it again";
}

TEST_F(Architecture, QuotedInclude_IsAPathFromTheRoot) {
    EXPECT_EQ(lines(unknownIncludes(files_)), "");
}

TEST_F(Architecture, Include_GoesOnlyWhereTheTableAllows) {
    EXPECT_EQ(lines(forbiddenArrows(house_, files_)), "");
}

TEST_F(Architecture, Exception_IsStillNeeded) {
    EXPECT_EQ(lines(idleExceptions(house_, files_)), "");
}

TEST_F(Architecture, Rooms_MakeNoCircle) {
    EXPECT_EQ(lines(circlesOfTable(house_)), "");
    EXPECT_EQ(lines(circlesOfIncludes(house_, files_)), "");
}

TEST_F(Architecture, RealTime_IsUsedInItsPlacesOnly) {
    EXPECT_EQ(lines(realTimeUses(house_, files_)), "");
}

TEST_F(Architecture, LanguageOfTheUser_IsAskedInItsPlacesOnly) {
    EXPECT_EQ(lines(localeUses(house_, files_)), "");
}

TEST_F(Architecture, Core_IncludesStandardHeadersOnly) {
    EXPECT_EQ(lines(foreignHeaders(house_, files_)), "");
}

TEST_F(Architecture, SourceFile_HasAtMost500Lines) { EXPECT_EQ(lines(longFiles(files_, 500)), ""); }

}  // namespace
}  // namespace zel::house
