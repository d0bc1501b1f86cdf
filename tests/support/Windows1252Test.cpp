#include <gtest/gtest.h>

#include <string>

#include "support/Windows1252.h"

namespace zel {
namespace {

TEST(Windows1252, EachByteThatStandsForACharacter_ComesBack) {
    int known = 0;
    for (int i = 0; i < 256; ++i) {
        const std::string byte(1, static_cast<char>(i));
        const std::string text = fromWindows1252(byte);
        if (text == "\uFFFD") continue;
        ++known;
        EXPECT_EQ(toWindows1252(text), byte) << i;
    }
    EXPECT_EQ(known, 256 - 5);
}

TEST(Windows1252, BytesWithNumbersOfTheirOwn_AreWhatTheTableSays) {
    EXPECT_EQ(fromWindows1252("\x80 \x9F \xB5 \xFF"), "\u20AC \u0178 \u00B5 \u00FF");
    EXPECT_EQ(toWindows1252("\u20AC\u0178\u00B5\u00FFA"),
              "\x80\x9F\xB5\xFF"
              "A");
}

TEST(Windows1252, ByteThatStandsForNothing_BecomesTheReplacementCharacter) {
    EXPECT_EQ(fromWindows1252("\x81\x8D\x8F\x90\x9D"), "\uFFFD\uFFFD\uFFFD\uFFFD\uFFFD");
}

TEST(Windows1252, CharacterWithoutAByte_IsNamed) {
    for (const char* const text : {"a\u03A9b", "\u0081", "\u4E2D", "\U0001F600", "\xE4", "\xC3"})
        EXPECT_FALSE(toWindows1252(text)) << text;
    EXPECT_EQ(withoutWindows1252("5 \u03A9 \u4E2D"), "\u03A9");
    EXPECT_EQ(withoutWindows1252("\U0001F600"), "\U0001F600");
    EXPECT_EQ(withoutWindows1252("5 \u00B5s"), "");
    EXPECT_EQ(toWindows1252(""), "");
}

}  // namespace
}  // namespace zel
