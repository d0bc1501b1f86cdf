// The text form of ini files, without files.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "support/IniFile.h"

namespace zel {
namespace {

struct ValueRow {
    const char* text;
    const char* value;  // of key x in section A; null where there is none
};

class IniValueOf : public ::testing::TestWithParam<ValueRow> {};

TEST_P(IniValueOf, Text_GivesTheValueOfItsKey) {
    const std::optional<std::string> value = IniFile::parse(GetParam().text).value("A", "x");
    ASSERT_EQ(value.has_value(), GetParam().value != nullptr);
    if (value.has_value()) {
        EXPECT_EQ(*value, GetParam().value);
    }
}

INSTANTIATE_TEST_SUITE_P(Blanks, IniValueOf,
                         ::testing::Values(ValueRow{"[A]\nx=1", "1"}, ValueRow{"[A]\n x = 1 ", "1"},
                                           ValueRow{"[A]\n\tx\t=\t1\t\n", "1"},
                                           ValueRow{" [ A ] \r\nx=a b\r\n", "a b"},
                                           ValueRow{"[A]\nx=", ""}, ValueRow{"[A]\nx", nullptr}));
INSTANTIATE_TEST_SUITE_P(Quotes, IniValueOf,
                         ::testing::Values(ValueRow{"[A]\nx=\" 1 \"", " 1 "},
                                           ValueRow{"[A]\nx=' 1 '", " 1 "},
                                           ValueRow{"[A]\nx=\"\"1\"\"", "\"1\""},
                                           ValueRow{"[A]\nx=\"1'", "\"1'"},
                                           ValueRow{"[A]\nx=\"", "\""}));
INSTANTIATE_TEST_SUITE_P(Comments, IniValueOf,
                         ::testing::Values(ValueRow{"[A]\n;x=1", nullptr},
                                           ValueRow{"[A]\n ; x=1\nx=2", "2"},
                                           ValueRow{"[A]\nx=1;2", "1;2"}));
INSTANTIATE_TEST_SUITE_P(Sections, IniValueOf,
                         ::testing::Values(ValueRow{"x=1\n", nullptr},
                                           ValueRow{"[B]\nx=1\n[A]\nx=2\n", "2"},
                                           ValueRow{"[A] ; a\nx=1\n", "1"},
                                           ValueRow{"[A\nx=1\n", nullptr}));
INSTANTIATE_TEST_SUITE_P(SameNames, IniValueOf,
                         ::testing::Values(ValueRow{"[A]\nx=1\nX=2\n", "1"},
                                           ValueRow{"[a]\nx=1\n[A]\nx=2\n", "1"}));
INSTANTIATE_TEST_SUITE_P(Signs, IniValueOf,
                         ::testing::Values(ValueRow{"\xEF\xBB\xBF[A]\nx=1\n", "1"},
                                           ValueRow{"[A]\nx=a=b\n", "a=b"},
                                           ValueRow{"[A]\n=1\nx=2", "2"}));

class IniTextKept : public ::testing::TestWithParam<const char*> {};

TEST_P(IniTextKept, Text_StaysToTheByte) {
    EXPECT_EQ(IniFile::parse(GetParam()).text(), GetParam());
}

INSTANTIATE_TEST_SUITE_P(Texts, IniTextKept,
                         ::testing::Values("", "\n", "[A]", "[A]\nx=1", "[A]\r\nx = 1\r\n\r\n",
                                           "[A]\r\nx=1\ny=2\r\n", "junk\n[A]\n;x\n\n\n[A]\nx=1\n",
                                           "\xEF\xBB\xBF[A]\r\nx=1\r\n", "[A\nx=\"1\" \n"));

struct SetRow {
    const char* before;
    const char* after;  // with x=9 in section A
};

class IniTextSet : public ::testing::TestWithParam<SetRow> {};

TEST_P(IniTextSet, Value_ChangesItsLineAlone) {
    IniFile file = IniFile::parse(GetParam().before);
    EXPECT_TRUE(file.setValue("A", "x", "9"));
    EXPECT_EQ(file.text(), GetParam().after);
}

INSTANTIATE_TEST_SUITE_P(
    Texts, IniTextSet,
    ::testing::Values(SetRow{"", "[A]\r\nx=9\r\n"}, SetRow{"[A]\nx=1", "[A]\nx=9"},
                      SetRow{"[A]\ny=1", "[A]\ny=1\nx=9\n"},
                      SetRow{"[B]\ny=1", "[B]\ny=1\n[A]\nx=9\n"},
                      SetRow{"[A]\ny=1\n\t\n[B]\n", "[A]\ny=1\nx=9\n\t\n[B]\n"},
                      SetRow{"[A]\r\nx=1\r\ny=2\n", "[A]\r\nx=9\r\ny=2\n"},
                      SetRow{"[A]\n;x=1\n", "[A]\n;x=1\nx=9\n"},
                      SetRow{"[A]\nx=1\nx=2\n", "[A]\nx=9\nx=2\n"}));

TEST(IniFileTest, SectionNameWithABracket_ReadsBack) {
    IniFile file;
    ASSERT_TRUE(file.setValue("a]b", "x", "1"));
    EXPECT_EQ(IniFile::parse(file.text()).value("a]b", "x"), "1");
}

TEST(IniFileTest, SectionsAndKeys_AreNamedInTheirOrder) {
    const IniFile file = IniFile::parse("z=0\n[B]\nb=1\n;c=2\na=3\n[A]\n");
    EXPECT_EQ(file.sections(), (std::vector<std::string>{"B", "A"}));
    EXPECT_EQ(file.keys("b"), (std::vector<std::string>{"b", "a"}));
    EXPECT_TRUE(file.keys("C").empty());
    EXPECT_TRUE(file.hasSection("a"));
    EXPECT_FALSE(file.hasSection("C"));
}

TEST(IniFileTest, Removed_LeavesTheRestAsItStands) {
    IniFile file = IniFile::parse("[A]\nx=1\n;x\ny=2\n[B]\nz=3\n");
    EXPECT_TRUE(file.removeKey("a", "X"));
    EXPECT_FALSE(file.removeKey("a", "X"));
    EXPECT_EQ(file.text(), "[A]\n;x\ny=2\n[B]\nz=3\n");
    EXPECT_TRUE(file.removeSection("a"));
    EXPECT_FALSE(file.removeSection("a"));
    EXPECT_EQ(file.text(), "[B]\nz=3\n");
}

}  // namespace
}  // namespace zel
