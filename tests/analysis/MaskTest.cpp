#include <gtest/gtest.h>

#include <stdexcept>

#include "analysis/Mask.h"
#include "tests/analysis/Traces.h"

namespace zel {
namespace {

std::string complaint(const std::string& text) {
    try {
        readMask(text);
    } catch (const std::runtime_error& problem) {
        return problem.what();
    }
    return "no complaint";
}

TEST(ReadMask, EmptyLevel_IsLeftOutOfItsLimit) {
    const Mask mask = readMask("x;upper;lower\r\n0;-10;\r\n1;;-80\r\n2;-20;-90\r\n");
    EXPECT_EQ(mask.upper.x, (std::vector<double>{0, 2}));
    EXPECT_EQ(mask.upper.level, (std::vector<double>{-10, -20}));
    EXPECT_EQ(mask.lower.x, (std::vector<double>{1, 2}));
    EXPECT_EQ(mask.lower.level, (std::vector<double>{-80, -90}));
}

TEST(ReadMask, ShortRowsAndBlanks_AreTaken) {
    const Mask mask = readMask("\xEF\xBB\xBF X ; Upper ; Lower \n\n 1e6 ; +3.5\n2e6\n");
    EXPECT_EQ(mask.upper.x, (std::vector<double>{1e6}));
    EXPECT_EQ(mask.upper.level, (std::vector<double>{3.5}));
    EXPECT_TRUE(mask.lower.x.empty());
}

TEST(ReadMask, WrongTables_AreRefusedWithTheLine) {
    EXPECT_EQ(complaint(""), "line 1: the header x;upper;lower is missing");
    EXPECT_EQ(complaint("0;1;2\n"), "line 1: the header x;upper;lower is missing");
    EXPECT_EQ(complaint("x;upper;lower\n1;2,5;\n"),
              "line 2: \"2,5\" in the column upper is no number");
    EXPECT_EQ(complaint("x;upper;lower\n1;;nan\n"),
              "line 2: \"nan\" in the column lower is no number");
    EXPECT_EQ(complaint("x;upper;lower\n;1;\n"), "line 2: \"\" in the column x is no number");
    EXPECT_EQ(complaint("x;upper;lower\n2;1;\n1;1;\n"),
              "line 3: x is below that of the row before");
    EXPECT_EQ(complaint("x;upper;lower\n0;-25;1e9;-25;\n"),
              "line 2: the row has more fields than the header");
    EXPECT_EQ(readMask("x;upper;lower\n0;-25;;\n").upper.x.size(), 1U) << "empty ones at the end";
    EXPECT_EQ(readMask("x;upper;lower;why\n0;-25;;a note\n").upper.x.size(), 1U);
}

TEST(CheckMask, Margin_IsTheSmallestDistanceWithItsX) {
    const Mask mask = readMask("x;upper;lower\n0;-10;-60\n4;-30;-60\n");
    const MaskVerdict verdict = checkMask(levels({-50, -50, -27, -50, -50}), mask);
    EXPECT_TRUE(verdict.pass);
    EXPECT_DOUBLE_EQ(verdict.margin.value(), 7);  // the upper limit is -20 at x = 2
    EXPECT_EQ(verdict.x, 2);
}

TEST(CheckMask, PassedLimit_FailsWithANegativeMargin) {
    const Mask mask = readMask("x;upper;lower\n0;-10;-60\n4;-10;-60\n");
    const MaskVerdict above = checkMask(levels({-50, -8, -50}), mask);
    EXPECT_FALSE(above.pass);
    EXPECT_DOUBLE_EQ(above.margin.value(), -2);
    const MaskVerdict below = checkMask(levels({-50, -50, -61}), mask);
    EXPECT_FALSE(below.pass);
    EXPECT_DOUBLE_EQ(below.margin.value(), -1);
    EXPECT_EQ(below.x, 2);
}

TEST(CheckMask, OnTheLimit_Passes) {
    const Mask mask = readMask("x;upper;lower\n0;-10;\n4;-10;\n");
    const MaskVerdict verdict = checkMask(levels({-10, -50}), mask);
    EXPECT_TRUE(verdict.pass);
    EXPECT_EQ(verdict.margin.value(), 0);
}

TEST(CheckMask, OutsideOfTheMask_NothingIsJudged) {
    const Mask mask = readMask("x;upper;lower\n2;-10;\n3;-10;\n");
    EXPECT_TRUE(checkMask(levels({0, 0, -20, -20, 0}), mask).pass);
    const MaskVerdict none = checkMask(levels({0, 0}), mask);
    EXPECT_TRUE(none.pass);
    EXPECT_FALSE(none.margin);
}

TEST(CheckMask, Step_TakesTheStricterLevelAtItsX) {
    const Mask mask = readMask("x;upper;lower\n0;-10;\n2;-10;\n2;-40;\n4;-40;\n");
    EXPECT_TRUE(checkMask(levels({-20, -20}), mask).pass);
    EXPECT_FALSE(checkMask(levels({-20, -20, -20}), mask).pass);
    EXPECT_TRUE(checkMask(levels({-20, -20, -41, -41}), mask).pass);
}

}  // namespace
}  // namespace zel
