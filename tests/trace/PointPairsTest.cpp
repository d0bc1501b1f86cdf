// Which values of the array of pairs belong to one point.

#include <gtest/gtest.h>

#include "trace/PointPairs.h"

namespace zel {
namespace {

constexpr double kNothing = std::numeric_limits<double>::quiet_NaN();

TEST(LevelsOfPoint, HighestLevelStandsInThePairAfter) {
    const std::vector<double> pairs = {-90, -1, -91, -20, -92, -30};
    EXPECT_EQ(levelsOfPoint(pairs, 0).low, -90);
    EXPECT_EQ(levelsOfPoint(pairs, 0).high, -20);
    EXPECT_EQ(levelsOfPoint(pairs, 1).high, -30);
}

TEST(LevelsOfPoint, LastPoint_HasItsLowestLevelOnly) {
    const std::vector<double> pairs = {-90, -1, -91, -20};
    EXPECT_EQ(levelsOfPoint(pairs, 1).low, -91);
    EXPECT_EQ(levelsOfPoint(pairs, 1).high, -91);
}

TEST(LevelsOfPoint, MissingValue_IsPassedOver) {
    const std::vector<double> pairs = {kNothing, -1, -91, -20, kNothing, kNothing};
    EXPECT_EQ(levelsOfPoint(pairs, 0).low, -20);
    EXPECT_EQ(levelsOfPoint(pairs, 1).high, -91);
    EXPECT_TRUE(std::isnan(levelsOfPoint(pairs, 2).high));
}

}  // namespace
}  // namespace zel
