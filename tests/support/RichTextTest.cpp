#include <gtest/gtest.h>

#include "support/CodePage.h"
#include "support/ColorsEX.h"
#include "support/RTFBoxManager.h"
#include "support/RTFGen.h"

namespace zel {
namespace {

constexpr Color kOrange = 0x0080FF;

struct RichTextTest : testing::Test {
    Form form{"form"};
    RichText box{form, "box"};
};

TEST_F(RichTextTest, ColorIndex_KnowsTheTableAndFallsBackToBlack) {
    const std::pair<Color, int> rows[] = {{0x0000FF, 2}, {0x00FF00, 3}, {0xFF0000, 4},
                                          {0xC0C0C0, 5}, {0x00C000, 6}, {kOrange, 7},
                                          {0xFFFFFF, 8}, {0, 1},        {0x123456, 1}};
    for (const auto& [color, index] : rows) EXPECT_EQ(colorIndex(color), index);
}

TEST_F(RichTextTest, FormatRun_PutsTheWordsInTheirOrder) {
    EXPECT_EQ(formatRun("a", 0, true, true, true, kOrange, 0x0000FF, RtfAlignment::Center),
              "{\\b\\i\\ul\\cf7\\highlight2\\qc a}");
    EXPECT_EQ(formatRun("a", 0, false, false, false, 0, 0, RtfAlignment::Left), "{\\cf1\\ql a}");
    EXPECT_EQ(formatRun("a", 20, false, false, false, 0, 0, RtfAlignment::Right),
              "{\\plain\\fs20{\\cf1\\qr a}}");
}

TEST_F(RichTextTest, FormatRun_DoublesBackslashesAndEndsParagraphs) {
    EXPECT_EQ(formatRun("C:\\x\r\n(y)", 0, false, false, false, 0, 0, RtfAlignment::Left),
              "{\\cf1\\ql C:\\\\x\\par(y)}");
    EXPECT_EQ(formatRun("a\nb", 0, false, false, false, 0, 0, RtfAlignment::Left),
              "{\\cf1\\ql a\\par b}");  // the blank ends the word and is not shown
}

TEST_F(RichTextTest, Append_AddsRunsAndNewLines) {
    appendRichText(box, "Level: ", false, false, 0, false);
    appendRichText(box, "-30", false, false, 0, true);
    appendRichText(box, "!", true, false, 0x0000FF, false);
    EXPECT_EQ(box.Text(), "Level: -30\r\n!");
    ASSERT_EQ(box.runs().size(), 2U);
    EXPECT_TRUE(box.runs()[1].bold);
    EXPECT_EQ(box.runs()[1].color, 0x0000FFU);
}

TEST_F(RichTextTest, CarriageReturnMarks_AreShownInBoldInsteadOfANewLine) {
    appendRichText(box, "a-CR-b-CR-", false, false, 0, true);
    EXPECT_EQ(box.Text(), "a<CR> b<CR> ");
    ASSERT_EQ(box.runs().size(), 4U);
    EXPECT_FALSE(box.runs()[0].bold);
    EXPECT_TRUE(box.runs()[1].bold);
    EXPECT_FALSE(box.runs()[2].bold);
    std::string text = "x-CR-y-CR-";
    markCarriageReturns(box, text);
    EXPECT_EQ(text, "x<CR>y<CR>");
}

bool isWord(char c) {
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9');
}

/// The text that a reader of the code shows.
std::string plainText(const std::string& code) {
    std::string text;
    int depth = 0;
    int hidden = 0;  // the depth of a table
    for (std::size_t i = 0; i < code.size(); ++i) {
        const char c = code[i];
        if (c == '{') {
            ++depth;
            const bool table =
                code.compare(i, 10, "{\\fonttbl{") == 0 || code.compare(i, 10, "{\\colortbl") == 0;
            if (table && hidden == 0) hidden = depth;
        } else if (c == '}') {
            if (hidden == depth) hidden = 0;
            --depth;
        } else if (c == '\\') {
            std::string word;
            const char next = code[i + 1];
            if (next == '\\' || next == '{' || next == '}') {
                ++i;
                if (hidden == 0) text += next;
                continue;
            }
            while (i + 1 < code.size() && (isWord(code[i + 1]) || code[i + 1] == '-'))
                word += code[++i];
            if (i + 1 < code.size() && code[i + 1] == ' ') ++i;
            if (word == "par") text += "\r\n";
            if (word == "tab") text += "\t";
            if (word.size() > 1 && word[0] == 'u' && word[1] >= '0' && word[1] <= '9') {
                EXPECT_EQ(code[++i], '?');
                text +=
                    codePageToUtf8(std::string(1, static_cast<char>(std::stoi(word.substr(1)))));
            }
        } else if (c != '\r' && c != '\n' && hidden == 0) {
            text += c;
        }
    }
    EXPECT_EQ(depth, 0);
    return text;
}

TEST_F(RichTextTest, Document_HoldsTheTableAndTheSameText) {
    appendRichText(box, "Phase:\t\t{1\\2} \xC2\xB0", false, false, 0, true);
    appendRichText(box, "next", true, true, 0x0000FF, true);
    const std::string code = rtfDocument(box.runs());
    EXPECT_EQ(code.compare(0, 6, "{\\rtf1"), 0);
    EXPECT_NE(
        code.find("{\\colortbl ;\\red0\\green0\\blue0;\\red255\\green0\\blue0;\\red0\\green255"
                  "\\blue0;\\red0\\green0\\blue255;\\red127\\green127\\blue127;\\red0\\green127"
                  "\\blue0;\\red255\\green128\\blue0;\\red255\\green255\\blue255;}"),
        std::string::npos);
    EXPECT_EQ(plainText(code), box.Text());
}

TEST(CodePage, EveryByte_ComesBack) {
    std::string bytes;
    for (int i = 0; i < 256; ++i) bytes += static_cast<char>(i);
    const std::string text = codePageToUtf8(bytes);
    EXPECT_EQ(characterCount(text), 256U);
    EXPECT_EQ(codePageBytes(text), bytes);
    EXPECT_TRUE(fitsCodePage(text));
    EXPECT_FALSE(fitsCodePage("\xCE\xA9"));
    EXPECT_FALSE(fitsCodePage("\xF0\x9F\x98\x80"));
    EXPECT_EQ(codePageBytes("\xF0\x9F\x98\x80!"), "?!");
}

TEST(CodePage, Case_NeverLeavesTheCodePage) {
    EXPECT_EQ(upperCaseText("a\xC3\xA4\xC3\xB6\xC3\xBC\xC3\x9F\xC2\xB5\xC3\xBF\xC5\xA1"),
              "A\xC3\x84\xC3\x96\xC3\x9C\xC3\x9F\xC2\xB5\xC5\xB8\xC5\xA0");
    EXPECT_EQ(upperCaseText("\xC3\xB7"), "\xC3\xB7");
    EXPECT_EQ(lowerCaseText("\xC3\x97\xC3\x84Z\xC5\xB8"), "\xC3\x97\xC3\xA4z\xC3\xBF");
    std::string bytes;
    for (int i = 0; i < 256; ++i) bytes += static_cast<char>(i);
    EXPECT_TRUE(fitsCodePage(upperCaseText(codePageToUtf8(bytes))));
    EXPECT_TRUE(fitsCodePage(lowerCaseText(codePageToUtf8(bytes))));
    EXPECT_EQ(upperCaseText(lowerCaseText(upperCaseText("\xE4\xFF"))), "\xE4\xFF");  // no UTF-8
}

}  // namespace
}  // namespace zel
