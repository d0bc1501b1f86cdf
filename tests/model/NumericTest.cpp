#include <gtest/gtest.h>

#include <cmath>
#include <stdexcept>
#include <string>

#include "model/Numeric.h"

namespace zel {
namespace {

struct ScaleCase {
    double value;
    const char* unit;
    const char* text;
};

class ScaledValue : public ::testing::TestWithParam<ScaleCase> {};

TEST_P(ScaledValue, FormatValue_ShowsThePrefixOfItsMagnitude) {
    EXPECT_EQ(FormatValue(GetParam().value, GetParam().unit), GetParam().text);
}

TEST_P(ScaledValue, FormatValue_NegativeValue_ShowsTheSameMagnitude) {
    if (GetParam().value == 0) {
        EXPECT_EQ(FormatValue(-0.0, GetParam().unit), GetParam().text);
        return;
    }
    EXPECT_EQ(FormatValue(-GetParam().value, GetParam().unit), std::string("-") + GetParam().text);
}

INSTANTIATE_TEST_SUITE_P(
    LowerBounds, ScaledValue,
    ::testing::Values(ScaleCase{0, "dB", "0 dB"}, ScaleCase{1, "Hz", "1 Hz"},
                      ScaleCase{1000, "Hz", "1 kHz"}, ScaleCase{1e6, "Hz", "1 MHz"},
                      ScaleCase{1e9, "Hz", "1 GHz"}, ScaleCase{0.001, "s", "1 ms"},
                      ScaleCase{1e-6, "s", "1 µs"}, ScaleCase{1e-9, "s", "1 ns"},
                      ScaleCase{1e-12, "s", "1 ns"}));
INSTANTIATE_TEST_SUITE_P(
    BelowUpperBounds, ScaledValue,
    ::testing::Values(ScaleCase{999.5, "Hz", "999.5 Hz"}, ScaleCase{999999, "Hz", "999.999 kHz"},
                      ScaleCase{999999999, "Hz", "999.999999 MHz"},
                      ScaleCase{999999999999, "Hz", "999.999999999 GHz"},
                      ScaleCase{0.999, "s", "999 ms"}, ScaleCase{0.000999, "s", "999 µs"},
                      ScaleCase{999e-9, "s", "999 ns"}, ScaleCase{999e-12, "s", "999 ns"}));
INSTANTIATE_TEST_SUITE_P(Pico, ScaledValue,
                         ::testing::Values(ScaleCase{5e-12, "W", "5 nW"},
                                           ScaleCase{2.5e-12, "W", "2.5 nW"}));
INSTANTIATE_TEST_SUITE_P(Unscaled, ScaledValue,
                         ::testing::Values(ScaleCase{2e12, "Hz", "2000000000000 Hz"},
                                           ScaleCase{1e12, "Hz", "1000000000000 Hz"},
                                           ScaleCase{5e-13, "W", "0.0000000000005 W"}));
INSTANTIATE_TEST_SUITE_P(EmptyUnit, ScaledValue,
                         ::testing::Values(ScaleCase{12, "", "12"}, ScaleCase{1500, "", "1.5 k"},
                                           ScaleCase{0, "", "0"}, ScaleCase{0.5, "", "500 m"}));
INSTANTIATE_TEST_SUITE_P(Frequencies, ScaledValue,
                         ::testing::Values(ScaleCase{1.5e9, "Hz", "1.5 GHz"}));

TEST(FormatValueTest, ScaleOff_KeepsTheNumber) {
    EXPECT_EQ(FormatValue(1.5e9, "Hz", "", false), "1500000000 Hz");
    EXPECT_EQ(FormatValue(0.0, "Hz", "", false), "0 Hz");
}

TEST(FormatValueTest, Format_AppliesToTheScaledNumber) {
    EXPECT_EQ(FormatValue(1234567.0, "Hz", "00.00"), "01.23 MHz");
    EXPECT_EQ(FormatValue(-20.0, "dBm", "00.00"), "-20.00 dBm");
}

TEST(FormatValueTest, Format_WithoutScale_AppliesToTheNumber) {
    EXPECT_EQ(FormatValue(1234.5, "dB", "#.0#", false), "1234.5 dB");
    EXPECT_EQ(FormatValue(0.25, "", "#.000", false), ".250");
}

TEST(FormatValueTest, Zero_IsLiteralWhateverTheFormat) {
    EXPECT_EQ(FormatValue(0.0, "dBm", "00.00"), "0 dBm");
}

TEST(FormatValueTest, Text_ReadsItsLeadingNumberWithAComma) {
    EXPECT_EQ(FormatValue(std::string("1,5e9"), "Hz"), "1.5 GHz");
    EXPECT_EQ(FormatValue(std::string("20 dBm"), "dBm"), "20 dBm");
}

TEST(FormatValueTest, TextThatIsAName_ShowsZero) {
    EXPECT_EQ(FormatValue(std::string("RG58"), ""), "0");
}

TEST(FormatValueTest, Round_RoundsTheScaledNumberHalfToEven) {
    EXPECT_EQ(FormatValue(1.23456e9, "Hz", "", true, true, 2), "1.23 GHz");
    EXPECT_EQ(FormatValue(0.125, "dBm", "", false, true, 2), "0.12 dBm");
    EXPECT_EQ(FormatValue(0.375, "dBm", "", false, true, 2), "0.38 dBm");
}

TEST(FormatValueTest, Round_WithEmptyUnit_KeepsABlankBehindTheNumber) {
    EXPECT_EQ(FormatValue(12.345, "", "", true, true, 2), "12.34 ");
}

TEST(RoundValueTextTest, NumberAndUnit_KeepsTheUnit) {
    EXPECT_EQ(RoundValueText("12.346 MHz", 2), "12.35 MHz");
    EXPECT_EQ(RoundValueText("1,234.5 dB", 0), "1234 dB");
    EXPECT_EQ(RoundValueText("12 dB", 2), "12 dB");
}

struct ParseCase {
    const char* text;
    double value;
    const char* prefix;
};

class ParsedValue : public ::testing::TestWithParam<ParseCase> {};

TEST_P(ParsedValue, ParseValue_GivesValueAndPrefix) {
    std::string prefix = "unset";
    EXPECT_DOUBLE_EQ(ParseValue(GetParam().text, prefix), GetParam().value);
    EXPECT_EQ(prefix, GetParam().prefix);
}

INSTANTIATE_TEST_SUITE_P(Prefixes, ParsedValue,
                         ::testing::Values(ParseCase{"2k", 2000, "k"}, ParseCase{"2K", 2000, "k"},
                                           ParseCase{"2M", 2e6, "M"}, ParseCase{"2g", 2e9, "G"},
                                           ParseCase{"2G", 2e9, "G"}, ParseCase{"2m", 0.002, "m"},
                                           ParseCase{"2µ", 2e-6, "µ"},
                                           ParseCase{"2\xCE\xBC", 2e-6, "µ"},
                                           ParseCase{"2u", 2e-6, "µ"}, ParseCase{"2U", 2e-6, "µ"},
                                           ParseCase{"2n", 2e-9, "n"}, ParseCase{"2N", 2e-9, "n"},
                                           ParseCase{"2p", 2e-12, "p"}));
INSTANTIATE_TEST_SUITE_P(
    WithUnits, ParsedValue,
    ::testing::Values(ParseCase{"1.5 GHz", 1.5e9, "G"}, ParseCase{"10 ms", 0.01, "m"},
                      ParseCase{"10 Ms", 1e7, "M"}, ParseCase{"-3.5E2 kHz", -350000, "k"},
                      ParseCase{"1.5 G", 1.5e9, "G"}, ParseCase{"1e3 kHz", 1e6, "k"},
                      // A comma groups, wherever it stands.
                      ParseCase{"1,5 G", 15e9, "G"}, ParseCase{"1,5 GHz", 15e9, "G"},
                      ParseCase{"1,000 kHz", 1e6, "k"}));
INSTANTIATE_TEST_SUITE_P(Plain, ParsedValue,
                         ::testing::Values(ParseCase{"12", 12, ""}, ParseCase{"-3.5E2", -350, ""},
                                           ParseCase{"1e3", 1000, ""}, ParseCase{" 12 ", 12, ""},
                                           ParseCase{"12\r\n", 12, ""}, ParseCase{".5", 0.5, ""},
                                           ParseCase{"-.5", -0.5, ""},
                                           ParseCase{"1,234", 1234, ""}));
INSTANTIATE_TEST_SUITE_P(UnitWithoutPrefix, ParsedValue,
                         ::testing::Values(ParseCase{"100 Hz", 0, ""}, ParseCase{"-20 dBm", 0, ""},
                                           ParseCase{"5 s", 0, ""}, ParseCase{"50%", 0, ""},
                                           ParseCase{"2P", 0, ""}, ParseCase{".1.5", 0, ""},
                                           ParseCase{"5dB/DIV (1)", 0, ""}));
INSTANTIATE_TEST_SUITE_P(Junk, ParsedValue,
                         ::testing::Values(ParseCase{"", 0, ""}, ParseCase{"   ", 0, ""},
                                           ParseCase{"abc", 0, ""}, ParseCase{"k", 0, "k"},
                                           ParseCase{"1 2 k", 0, "k"}, ParseCase{"--2k", 0, "k"},
                                           ParseCase{"1e999", 0, ""}, ParseCase{"é", 0, ""}));

class ParsedLength : public ::testing::TestWithParam<ParseCase> {};

TEST_P(ParsedLength, ParseLength_GivesMetresAndUnit) {
    std::string unit = "unset";
    EXPECT_DOUBLE_EQ(ParseLength(GetParam().text, unit), GetParam().value);
    EXPECT_EQ(unit, GetParam().prefix);
}

INSTANTIATE_TEST_SUITE_P(
    Units, ParsedLength,
    ::testing::Values(ParseCase{"12", 12, ""}, ParseCase{"1200 cm", 12, "cm"},
                      ParseCase{"1200 mm", 1.2, "mm"}, ParseCase{"3u", 3e-6, "µ"},
                      ParseCase{"3U", 3e-6, "µ"}, ParseCase{"3 µm", 3e-6, "µ"},
                      // A metre cuts nothing off, and so the text is no number.
                      ParseCase{"12 m", 0, "m"}, ParseCase{"12 M", 0, "M"},
                      ParseCase{"12 k", 0, ""}, ParseCase{"", 0, ""}));

TEST(ParseLengthTest, TextThatPassesAsNumericAndIsNoNumber_Fails) {
    std::string unit;
    EXPECT_THROW(ParseLength("5 s", unit), std::invalid_argument);
    EXPECT_THROW(ParseLength(".1.5", unit), std::invalid_argument);
}

struct ReadCase {
    const char* text;
    double value;
};

class NumericText : public ::testing::TestWithParam<ReadCase> {};

TEST_P(NumericText, GetNumeric_ReadsTheLeadingNumber) {
    EXPECT_EQ(GetNumeric(GetParam().text), GetParam().value);
}

INSTANTIATE_TEST_SUITE_P(Texts, NumericText,
                         ::testing::Values(ReadCase{"1,5", 1.5}, ReadCase{"1.5", 1.5},
                                           ReadCase{"-20 dBm", -20}, ReadCase{"dBm", 0},
                                           ReadCase{"", 0}, ReadCase{"1,234.5", 1.234}));

class InvariantNumber : public ::testing::TestWithParam<ReadCase> {};

TEST_P(InvariantNumber, ParseNumberInvariant_TakesTheFirstMarkForThousands) {
    EXPECT_EQ(ParseNumberInvariant(GetParam().text), GetParam().value);
}

INSTANTIATE_TEST_SUITE_P(Texts, InvariantNumber,
                         ::testing::Values(ReadCase{"1,234.5", 1234.5}, ReadCase{"1.234,5", 1234.5},
                                           ReadCase{"1,5", 1.5}, ReadCase{"1.5", 1.5},
                                           ReadCase{"1,234,567.5", 1234567.5},
                                           ReadCase{"-1.234.567,5", -1234567.5}, ReadCase{"12", 12},
                                           ReadCase{"abc", 0}, ReadCase{"", 0}));

struct WireCase {
    double value;
    const char* text;
};

class WireText : public ::testing::TestWithParam<WireCase> {};

TEST_P(WireText, WireNumber_HasTheCanonicalForm) {
    EXPECT_EQ(WireNumber(GetParam().value), GetParam().text);
}

INSTANTIATE_TEST_SUITE_P(Values, WireText,
                         ::testing::Values(WireCase{1.5e9, "1500000000"}, WireCase{0.5, ".5"},
                                           WireCase{-0.5, "-.5"}, WireCase{-20, "-20"},
                                           WireCase{0, "0"}, WireCase{1e15, "1E+15"},
                                           WireCase{10.5, "10.5"},
                                           WireCase{123456789012345, "123456789012345"},
                                           WireCase{0.02, ".02"}, WireCase{-1e15, "-1E+15"}));

TEST(WireNumberTest, NoNumber_GivesZero) {
    EXPECT_EQ(WireNumber(std::nan("")), "0");
    EXPECT_EQ(WireNumber(-HUGE_VAL), "0");
    EXPECT_EQ(WireNumber(-0.0), "0");
}

TEST(WireNumberTest, SmallNumber_TakesAnExponentPastFifteenDecimals) {
    EXPECT_EQ(WireNumber(1e-15), ".000000000000001");
    EXPECT_EQ(WireNumber(1.5e-16), "1.5E-16");
}

TEST(FormatValueTest, MagnitudeBelowTheRows_KeepsThePlainNumber) {
    EXPECT_EQ(FormatValue(-5e-13, "W", "0.00"), "0.00 W");
    EXPECT_EQ(FormatValue(1e300, "W"), "1E+300 W");
}

TEST(LevelArithmeticTest, Log10Safe_OfZero_GivesMinus400) {
    EXPECT_EQ(Log10Safe(0), -400);
    EXPECT_DOUBLE_EQ(Log10Safe(1000), 3);
}

TEST(LevelArithmeticTest, WattsToDbm_OfZero_GivesMinus3970) {
    EXPECT_EQ(WattsToDbm(0), -3970);
    EXPECT_NEAR(WattsToDbm(0.001), 0, 1e-12);
}

TEST(LevelArithmeticTest, VoltsToDbm_IsReferredToFiftyOhm) {
    EXPECT_NEAR(VoltsToDbm(std::sqrt(0.05)), 0, 1e-9);  // 1 mW in 50 Ohm
    EXPECT_NEAR(VoltsToDbm(1), 13.0103, 1e-4);
    EXPECT_NEAR(VoltsToDbm(0), -7986.9897, 1e-4);
}

TEST(LevelArithmeticTest, DbmToPercent_IsTheRatioOfVoltages) {
    EXPECT_DOUBLE_EQ(DbmToPercent(-20, -20), 100);
    EXPECT_NEAR(DbmToPercent(-40, -20), 10, 1e-12);
    EXPECT_NEAR(DbmToPercent(-35.25, -20), 17.2783, 1e-4);
}

TEST(LevelArithmeticTest, LinearToPercent_IsThePlainRatio) {
    EXPECT_DOUBLE_EQ(LinearToPercent(0.25, 0.5), 50);
    EXPECT_DOUBLE_EQ(LinearToPercent(0, 2), 0);
}

TEST(LevelArithmeticTest, DbToLinear_IsTheRatioOfPowers) {
    EXPECT_DOUBLE_EQ(DbToLinear(0), 1);
    EXPECT_DOUBLE_EQ(DbToLinear(20), 100);
    EXPECT_NEAR(DbToLinear(-3), 0.501187, 1e-6);
}

}  // namespace
}  // namespace zel
