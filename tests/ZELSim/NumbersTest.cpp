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

TEST(Numbers, ParseNumber_TakesTheFormsOfTheHost) {
    EXPECT_EQ(parseNumber(" 100000000"), 1e8);
    EXPECT_EQ(parseNumber(".5"), 0.5);
    EXPECT_EQ(parseNumber("-.5"), -0.5);
    EXPECT_EQ(parseNumber("1E+15"), 1e15);
    EXPECT_EQ(parseNumber("+3"), 3);
}

TEST(Numbers, ParseNumber_RefusesEverythingElse) {
    for (const char* text : {"", " ", "5 s", "1,5", "--1", "inf", "nan", "1e999", "0x1"}) {
        EXPECT_FALSE(parseNumber(text)) << text;
    }
}

}  // namespace
}  // namespace zelsim
