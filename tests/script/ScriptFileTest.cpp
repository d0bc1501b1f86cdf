#include <gtest/gtest.h>

#include "script/ScriptFile.h"
#include "tests/files/FileSession.h"

namespace zel {
namespace {

Texts slowRoad(const std::string& text) { return loadCommandsRecursively(text, "", "", {}); }

/// The same, as the rule says it: a call a character.
void ruleOf(std::string_view rest, const std::string& current, const std::string& last,
            Texts& lines) {
    if (rest.empty()) {
        lines.push_back(current);
        return;
    }
    const std::string next(rest.substr(0, 1));
    const bool ended = last == "\n" || last == "\r" || last == "\r\n";
    if (!ended) return ruleOf(rest.substr(1), current + next, next, lines);
    const std::string line = current.substr(0, current.size() - 1);
    if (!line.empty()) lines.push_back(line);
    ruleOf(rest.substr(1), next, next, lines);
}

TEST(ScriptFile, FastRoad_DropsBlankLinesAndKeepsTheOthersAsTheyStand) {
    EXPECT_EQ(loadCommandsFromText("A\r\n\r\n  \r\n\t\r\n  B \r\nC"), (Texts{"A", "  B ", "C"}));
    EXPECT_EQ(loadCommandsFromText("A\nB\rC\r\nD"), (Texts{"A", "B", "C", "D"}));
    EXPECT_EQ(loadCommandsFromText(""), Texts{});
}

TEST(ScriptFile, SlowRoad_KeepsLinesOfBlanksAndALoneLineFeed) {
    EXPECT_EQ(slowRoad("AB\r\nCD\r\n"), (Texts{"AB", "CD", "\n"}));
    EXPECT_EQ(slowRoad("AB\r\n\r\nCD"), (Texts{"AB", "CD"}));
    EXPECT_EQ(slowRoad("AB\r\n  \r\nCD"), (Texts{"AB", "  ", "CD"}));
    EXPECT_EQ(slowRoad(""), Texts{""});
}

TEST(ScriptFile, SlowRoad_DoesWhatTheRuleOfOneCallACharacterDoes) {
    const std::string letters = "a \r\n";
    for (unsigned code = 0; code < 4096; ++code) {
        std::string text;
        for (unsigned rest = code; text.size() < 6; rest /= 4) text += letters[rest % 4];
        Texts wanted;
        ruleOf(text, "", "", wanted);
        ASSERT_EQ(slowRoad(text), wanted) << code;
    }
}

TEST(ScriptFile, SlowRoad_GoesOnWithWhatWasGathered) {
    EXPECT_EQ(loadCommandsRecursively("B\r\n", "A\r", "\r", {}), (Texts{"A", "B", "\n"}));
}

TEST(ScriptFile, SlowRoad_YieldsAtIntervals) {
    int yields = 0;
    loadCommandsRecursively(std::string(200000, 'x'), "", "", [&] { ++yields; });
    EXPECT_GT(yields, 10);
}

TEST(ScriptFile, Encodings_ComeBackByteForByte) {
    VirtualPlatform platform;
    const Folder folder{platform.files};
    const std::string all = [] {
        std::string bytes;
        for (int i = 1; i < 256; ++i) bytes += static_cast<char>(i);
        return bytes;
    }();
    for (const std::string& bytes :
         {std::string("COMMENT \xE4\r\n"), std::string("COMMENT \xC3\xA4\n"),
          std::string("\xEF\xBB\xBF"
                      "DO\rLOOP 3"),
          std::string("A\0B", 3), all, std::string()}) {
        const auto script = readScript(platform.files, folder.write("s.txt", bytes));
        ASSERT_TRUE(script);
        EXPECT_EQ(scriptBytes(*script), bytes);
    }
    EXPECT_EQ(readScript(platform.files, folder.write("s.txt", "\xE4"))->text, "\xC3\xA4");
    EXPECT_EQ(readScript(platform.files, folder.write("s.txt",
                                                      "\xEF\xBB\xBF"
                                                      "DO"))
                  ->text,
              "DO");
}

TEST(ScriptFile, ACharacterOutsideOfTheCodePage_MakesTheFileUtf8) {
    EXPECT_EQ(scriptBytes({"\xCE\xA9 \xC3\xA4", false, true}), "\xCE\xA9 \xC3\xA4");
}

TEST(ScriptFile, WhatCannotBeRead_GivesNothing) {
    VirtualPlatform platform;
    const Folder folder{platform.files};
    EXPECT_FALSE(readScript(platform.files, folder.file("none.txt")));
    EXPECT_FALSE(readScript(platform.files, folder.file("")));
    EXPECT_FALSE(readScript(platform.files, ""));
}

}  // namespace
}  // namespace zel
