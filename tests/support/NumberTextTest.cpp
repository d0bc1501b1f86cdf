#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <string>

#include "support/NumberText.h"

namespace zel {
namespace {

struct NumberRow {
    double value;
    const char* text;
};

struct LeadingRow {
    const char* text;
    double value;
};

class LeadingNumber : public ::testing::TestWithParam<LeadingRow> {};

TEST_P(LeadingNumber, Text_ReadsUpToWhatCannotContinueIt) {
    EXPECT_EQ(leadingNumber(GetParam().text), GetParam().value);
}

INSTANTIATE_TEST_SUITE_P(Numbers, LeadingNumber,
                         ::testing::Values(LeadingRow{"12", 12}, LeadingRow{"-20.5dBm", -20.5},
                                           LeadingRow{"+7", 7}, LeadingRow{"  3", 3},
                                           LeadingRow{".5", 0.5}, LeadingRow{"-.5", -0.5},
                                           LeadingRow{"5.", 5}, LeadingRow{"1.5e9 Hz", 1.5e9},
                                           LeadingRow{"2E-3s", 0.002}, LeadingRow{"1e", 1},
                                           LeadingRow{"1e+", 1}, LeadingRow{"1.2.3", 1.2},
                                           LeadingRow{"1,5", 1}));
INSTANTIATE_TEST_SUITE_P(Junk, LeadingNumber,
                         ::testing::Values(LeadingRow{"", 0}, LeadingRow{"dBm", 0},
                                           LeadingRow{"-", 0}, LeadingRow{".", 0},
                                           LeadingRow{"e5", 0}, LeadingRow{"nan", 0},
                                           LeadingRow{"inf", 0}, LeadingRow{"+-1", 0},
                                           LeadingRow{"1e999", 0}));

class GeneralNumber : public ::testing::TestWithParam<NumberRow> {};

TEST_P(GeneralNumber, Value_HasThatText) {
    EXPECT_EQ(generalNumber(GetParam().value), GetParam().text);
}

INSTANTIATE_TEST_SUITE_P(Fixed, GeneralNumber,
                         ::testing::Values(NumberRow{0, "0"}, NumberRow{-0.0, "0"},
                                           NumberRow{1, "1"}, NumberRow{-20, "-20"},
                                           NumberRow{0.5, "0.5"}, NumberRow{1.5e9, "1500000000"},
                                           NumberRow{0.1 + 0.2, "0.3"},
                                           NumberRow{1.0 / 3, "0.333333333333333"},
                                           NumberRow{123456789012345.0, "123456789012345"},
                                           NumberRow{999999999999999.0, "999999999999999"},
                                           NumberRow{1e-15, "0.000000000000001"}));
INSTANTIATE_TEST_SUITE_P(Exponent, GeneralNumber,
                         ::testing::Values(NumberRow{1e15, "1E+15"}, NumberRow{-2.5e20, "-2.5E+20"},
                                           NumberRow{1.5e-16, "1.5E-16"},
                                           NumberRow{1e100, "1E+100"},
                                           NumberRow{1.0 / 30, "3.33333333333333E-02"},
                                           // Rounded to 15 digits it is 1E+15.
                                           NumberRow{999999999999999.9, "1E+15"},
                                           // Sixteen decimals would be needed.
                                           NumberRow{1.5e-15, "1.5E-15"}));

TEST(GeneralNumberTest, NoNumber_GivesZero) {
    EXPECT_EQ(generalNumber(std::nan("")), "0");
    EXPECT_EQ(generalNumber(std::numeric_limits<double>::infinity()), "0");
}

TEST(NumberTextTest, NonNegative_TakesABlankAhead) {
    EXPECT_EQ(numberText(0), " 0");
    EXPECT_EQ(numberText(4), " 4");
}

TEST(NumberTextTest, Negative_TakesNoBlank) { EXPECT_EQ(numberText(-4), "-4"); }

struct PatternRow {
    double value;
    const char* pattern;
    const char* text;
};

class FormatPattern : public ::testing::TestWithParam<PatternRow> {};

TEST_P(FormatPattern, Value_HasThatText) {
    EXPECT_EQ(formatPattern(GetParam().value, GetParam().pattern), GetParam().text);
}

INSTANTIATE_TEST_SUITE_P(
    Zeros, FormatPattern,
    ::testing::Values(PatternRow{0, "0.00", "0.00"}, PatternRow{1.5, "0.00", "1.50"},
                      PatternRow{1.5, "00.00", "01.50"}, PatternRow{123.456, "00.00", "123.46"},
                      PatternRow{-1.5, "00.00", "-01.50"}, PatternRow{-0.001, "0.00", "0.00"}));
INSTANTIATE_TEST_SUITE_P(
    Optional, FormatPattern,
    ::testing::Values(PatternRow{1.5, "#.0#", "1.5"}, PatternRow{1.25, "#.0#", "1.25"},
                      PatternRow{0.5, "#.0#", ".5"}, PatternRow{3, "#.0#", "3.0"},
                      PatternRow{3, "#.00#", "3.00"}, PatternRow{3.1416, "#.00#", "3.142"},
                      PatternRow{-0.25, "#.00#", "-.25"}, PatternRow{2, "#.000", "2.000"}));
INSTANTIATE_TEST_SUITE_P(Groups, FormatPattern,
                         ::testing::Values(PatternRow{-20, "00,0", "-020"},
                                           PatternRow{0, "00,0", "000"},
                                           PatternRow{1234, "00,0", "1,234"},
                                           PatternRow{1234567, "00,0", "1,234,567"}));
INSTANTIATE_TEST_SUITE_P(Ties, FormatPattern,
                         ::testing::Values(PatternRow{0.125, "0.00", "0.13"},
                                           PatternRow{-0.125, "0.00", "-0.13"},
                                           PatternRow{1.005, "0.00", "1.01"},
                                           PatternRow{2.5, "0", "3"}));

struct RoundRow {
    double value;
    int digits;
    double rounded;
};

class RoundHalfEven : public ::testing::TestWithParam<RoundRow> {};

TEST_P(RoundHalfEven, Value_GoesToTheNearestAndTiesToEven) {
    EXPECT_EQ(roundHalfEven(GetParam().value, GetParam().digits), GetParam().rounded);
}

INSTANTIATE_TEST_SUITE_P(Values, RoundHalfEven,
                         ::testing::Values(RoundRow{0.5, 0, 0}, RoundRow{1.5, 0, 2},
                                           RoundRow{2.5, 0, 2}, RoundRow{-2.5, 0, -2},
                                           RoundRow{-3.5, 0, -4}, RoundRow{0.125, 2, 0.12},
                                           RoundRow{0.375, 2, 0.38}, RoundRow{1.2345, 3, 1.234},
                                           RoundRow{-35.25, 3, -35.25}, RoundRow{1e300, 3, 1e300},
                                           RoundRow{1e-9, 20, 1e-9}));

TEST(RoundHalfEvenTest, NoNumber_StaysAsItIs) {
    EXPECT_TRUE(std::isnan(roundHalfEven(std::nan(""), 2)));
}

TEST(ParseNumberTest, WholeText_GivesItsNumber) {
    EXPECT_EQ(parseNumber(" 100000000"), 1e8);
    EXPECT_EQ(parseNumber(".5"), 0.5);
    EXPECT_EQ(parseNumber("-.5"), -0.5);
    EXPECT_EQ(parseNumber("1E+15"), 1e15);
    EXPECT_EQ(parseNumber("+3"), 3);
    EXPECT_EQ(parseNumber("0.001 "), 0.001);
}

TEST(ParseNumberTest, AnythingElse_IsNone) {
    for (const char* text :
         {"", " ", "+", "+-1", "5 s", "1,5", "--1", "inf", "nan", "1e999", "0x1"})
        EXPECT_FALSE(parseNumber(text)) << text;
}

TEST(ShortestNumberTest, Value_ReadsBackAsTheSameNumber) {
    for (const double value : {0.1, 1.0 / 3, 1e22, -123.456, 5e-324})
        EXPECT_EQ(leadingNumber(shortestNumber(value)), value) << value;
}

struct WholeRow {
    std::string text;
    std::optional<int> expected;
};
class WholeNumberTest : public ::testing::TestWithParam<WholeRow> {};

TEST_P(WholeNumberTest, Text_GivesItsNumberInsideTheBoundsOnly) {
    EXPECT_EQ(wholeNumber(GetParam().text, 1, 65535), GetParam().expected) << GetParam().text;
}

INSTANTIATE_TEST_SUITE_P(
    Texts, WholeNumberTest,
    ::testing::Values(WholeRow{"1", 1}, WholeRow{"65535", 65535}, WholeRow{"0", std::nullopt},
                      WholeRow{"65536", std::nullopt}, WholeRow{"", std::nullopt},
                      WholeRow{" 1", std::nullopt}, WholeRow{"1 ", std::nullopt},
                      WholeRow{"+1", std::nullopt}, WholeRow{"1.0", std::nullopt},
                      WholeRow{"99999999999", std::nullopt}));

TEST(ShortestNumberTest, ShortValue_HasNoSuperfluousDigits) {
    EXPECT_EQ(shortestNumber(0.1), "0.1");
    EXPECT_EQ(shortestNumber(-20), "-20");
    EXPECT_EQ(shortestNumber(0), "0");
}

}  // namespace
}  // namespace zel
