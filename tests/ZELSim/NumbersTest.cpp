#include <gtest/gtest.h>

#include "ZELSim/Numbers.h"

namespace zelsim {
namespace {

TEST(Numbers, NumberText_HasNoNeedlessPlaces) {
    EXPECT_EQ(numberText(1.5e9, 0), "1500000000");
    EXPECT_EQ(numberText(-20, 3), "-20");
    EXPECT_EQ(numberText(0.0004700, 9), "0.00047");
    EXPECT_EQ(numberText(-0.0001, 2), "0");
    EXPECT_EQ(numberText(100, 2), "100");
}

}  // namespace
}  // namespace zelsim
