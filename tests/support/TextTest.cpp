#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "support/ByteCast.h"
#include "support/StringOp.h"
#include "support/Text.h"
#include "support/TimeText.h"

namespace zel {
namespace {

using namespace std::string_literals;

TEST(CaseTest, LettersOutsideAscii_Stay) {
    EXPECT_EQ(upperCase("server=µx"), "SERVER=µX");
    EXPECT_EQ(lowerCase("FREQ,1 Ä"), "freq,1 Ä");
}

TEST(TrimmedTest, BlanksAtBothEnds_Go) {
    EXPECT_EQ(trimmed("  a b "), "a b");
    EXPECT_EQ(trimmed("   "), "");
    EXPECT_EQ(trimmed("\ta"), "\ta");
}

TEST(SplitTest, Separators_DivideAndKeepEmptyPieces) {
    EXPECT_EQ(split("a;;b", ';'), (std::vector<std::string>{"a", "", "b"}));
    EXPECT_EQ(split("", ';'), (std::vector<std::string>{""}));
    EXPECT_EQ(split("a;", ';'), (std::vector<std::string>{"a", ""}));
}

TEST(ReplaceAllTest, EveryOccurrence_IsReplacedOnce) {
    EXPECT_EQ(replaceAll("1,234,5", ",", ""), "12345");
    EXPECT_EQ(replaceAll("aaa", "a", "aa"), "aaaaaa");
    EXPECT_EQ(replaceAll("abc", "", "x"), "abc");
}

TEST(StartsWithTest, Head_IsFoundOnlyAtTheBeginning) {
    EXPECT_TRUE(startsWith("SPAN,0", "SPAN"));
    EXPECT_FALSE(startsWith("SP", "SPAN"));
    EXPECT_FALSE(startsWith(" SPAN", "SPAN"));
}

TEST(ContainsTest, Piece_IsFoundAnywhere) {
    EXPECT_TRUE(contains("5 ms", "ms"));
    EXPECT_FALSE(contains("5 m", "ms"));
}

struct Utf8Row {
    std::string bytes;
    bool valid;
};

class IsValidUtf8 : public ::testing::TestWithParam<Utf8Row> {};

TEST_P(IsValidUtf8, Bytes_AreJudged) { EXPECT_EQ(isValidUtf8(GetParam().bytes), GetParam().valid); }

INSTANTIATE_TEST_SUITE_P(Valid, IsValidUtf8,
                         ::testing::Values(Utf8Row{"", true}, Utf8Row{"abc", true},
                                           Utf8Row{"\xC2\xB5", true}, Utf8Row{"\xE2\x82\xAC", true},
                                           Utf8Row{"\xF0\x9F\x98\x80", true}));
INSTANTIATE_TEST_SUITE_P(
    Broken, IsValidUtf8,
    ::testing::Values(Utf8Row{"\xB5", false}, Utf8Row{"\xC2", false}, Utf8Row{"\xC0\x80", false},
                      Utf8Row{"\xE0\x80\x80", false}, Utf8Row{"\xED\xA0\x80", false},
                      Utf8Row{"\xF0\x80\x80\x80", false}, Utf8Row{"\xF4\x90\x80\x80", false},
                      Utf8Row{"\xF8\x88\x80\x80\x80", false}, Utf8Row{"a\xC2\x41", false}));

TEST(BytesToUtf8Test, Utf8_StaysAsItIs) { EXPECT_EQ(bytesToUtf8("dB\xC2\xB5V"), "dBµV"); }

TEST(BytesToUtf8Test, OtherBytes_AreReadAsWindows1252) {
    EXPECT_EQ(bytesToUtf8("dB\xB5V"), "dBµV");
    EXPECT_EQ(bytesToUtf8("\x80 5"), "€ 5");
}

TEST(BytesToUtf8Test, UnassignedByte_BecomesTheReplacementSign) {
    EXPECT_EQ(bytesToUtf8("\x81"), "\xEF\xBF\xBD");
}

TEST(ByteCastTest, FourBytes_AreLeastSignificantFirst) {
    const unsigned char plus[] = {0x01, 0x02, 0x03, 0x04};
    const unsigned char minus[] = {0x4E, 0x76, 0xFF, 0xFF};
    EXPECT_EQ(int32FromLittleEndian(plus), 0x04030201);
    EXPECT_EQ(int32FromLittleEndian(minus), -35250);
}

struct TrimRow {
    std::string text;
    std::string result;
};

class TrimControls : public ::testing::TestWithParam<TrimRow> {};

TEST_P(TrimControls, BothEnds_AreCleared) {
    EXPECT_EQ(TrimControlChars(GetParam().text), GetParam().result);
}

INSTANTIATE_TEST_SUITE_P(Texts, TrimControls,
                         ::testing::Values(TrimRow{"", ""}, TrimRow{"   ", ""},
                                           TrimRow{" 12 ", "12"}, TrimRow{"12\r\n", "12"},
                                           TrimRow{"\r\n12", "12"}, TrimRow{"\0"s + "1\0"s, "1"},
                                           TrimRow{"\r\n\r\n", ""}, TrimRow{"1\r2", "1\r2"},
                                           // Blanks go first and once: after a CR they stay.
                                           TrimRow{"12 \r", "12 "}, TrimRow{"\r 12", " 12"}));

struct NumericRow {
    const char* text;
    bool numeric;
};

class IsNumeric : public ::testing::TestWithParam<NumericRow> {};

TEST_P(IsNumeric, Text_IsJudged) { EXPECT_EQ(IsNumericText(GetParam().text), GetParam().numeric); }

INSTANTIATE_TEST_SUITE_P(Numbers, IsNumeric,
                         ::testing::Values(NumericRow{"12", true}, NumericRow{" 12 ", true},
                                           NumericRow{"-3.5E2", true}, NumericRow{"+4", true},
                                           NumericRow{"1e3", true}, NumericRow{"1,234.5", true},
                                           NumericRow{".5", true}, NumericRow{"-.5", true},
                                           NumericRow{"5.", true}));
INSTANTIATE_TEST_SUITE_P(LettersAndSigns, IsNumeric,
                         ::testing::Values(NumericRow{"5 s", true}, NumericRow{"s5s", true},
                                           NumericRow{"50%", true}, NumericRow{"%", false},
                                           NumericRow{"s", false}, NumericRow{"5s%", true},
                                           NumericRow{"5 ms", false}));
// A point before a number passes, whatever the number looks like.
INSTANTIATE_TEST_SUITE_P(PointAhead, IsNumeric,
                         ::testing::Values(NumericRow{".1.5", true}, NumericRow{". 5", true},
                                           NumericRow{"-..5", true}, NumericRow{".", false},
                                           NumericRow{"-.", false}, NumericRow{"+..5", false}));
INSTANTIATE_TEST_SUITE_P(Others, IsNumeric,
                         ::testing::Values(NumericRow{"", false}, NumericRow{" ", false},
                                           NumericRow{"Hz", false}, NumericRow{"100 Hz", false},
                                           NumericRow{"1e", false}, NumericRow{"1.2.3", false},
                                           NumericRow{"--1", false}, NumericRow{"1e999", false},
                                           NumericRow{",", false}, NumericRow{",5", false},
                                           NumericRow{"-", false}));

TEST(ParseLocaleNumberTest, Number_IsReadWithItsGroups) {
    double value = 0;
    EXPECT_TRUE(parsePlainNumber(" 1,234.5 ", value));
    EXPECT_EQ(value, 1234.5);
    EXPECT_TRUE(parsePlainNumber("2E+3", value));
    EXPECT_EQ(value, 2000);
}

TEST(ParseLocaleNumberTest, OtherText_LeavesTheValue) {
    double value = 7;
    EXPECT_FALSE(parsePlainNumber("5 s", value));
    EXPECT_FALSE(parsePlainNumber("", value));
    EXPECT_EQ(value, 7);
}

struct TimeRow {
    double date;
    const char* text;
};

class TimeOfDay : public ::testing::TestWithParam<TimeRow> {};

TEST_P(TimeOfDay, Date_ShowsHoursMinutesSeconds) {
    EXPECT_EQ(timeOfDayText(GetParam().date), GetParam().text);
}

INSTANTIATE_TEST_SUITE_P(Dates, TimeOfDay,
                         ::testing::Values(TimeRow{0, "00:00:00"}, TimeRow{0.5, "12:00:00"},
                                           TimeRow{45000.75, "18:00:00"},
                                           TimeRow{1.0 / 86400, "00:00:01"},
                                           TimeRow{3661.0 / 86400, "01:01:01"},
                                           TimeRow{86399.0 / 86400, "23:59:59"},
                                           TimeRow{1 - 1e-9, "00:00:00"}));

}  // namespace
}  // namespace zel
