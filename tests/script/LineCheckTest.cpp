#include <gtest/gtest.h>

#include "script/LineCheck.h"
#include "script/ScriptFile.h"

namespace zel {
namespace {

struct Expected {
    const char* line;
    const char* text;  ///< empty for a line in order
    bool ignored = false;
};

TEST(LineCheck, EachLine_IsJudgedByItself) {
    const Expected rows[] = {
        {"# anything", ""},
        {"SET FREQ,1.5E9", ""},
        {"SET FREQ", "A setting is a word, a comma and a value."},
        {"PAUSE", ""},
        {"PAUSE 2,5", ""},
        {"PAUSE soon", "\"SOON\" is no number and counts as 0."},
        {"AVGCOUNT 32768", "\"32768\" is beyond 32767 and ends the run."},
        {"AVGCOUNT 32767", ""},
        {"LOOP 3", "There is no DO before; the run returns to the second statement."},
        {"SCANSTOP 1", "There is no SCANSTEP before; the run returns to the second statement."},
        {"AUTORECALL X", "The filenames can only be genarated automatically within a loop."},
        {"SAVESCREEN A.PNG", "The file you specified is not a WMF file."},
        {"SAVESCREEN A.WMF", ""},
        {"SAVESCREEN", ""},
        {"LOADTRACE", "The name of the file is missing."},
        {"SAVERESULTS C:\\X.TXT", "A name with a drive letter cannot be opened on every system."},
        {"SAVERESULTS SUB\\X.TXT", ""},
        {"SAVERESULT X", "This line is no statement and is ignored; did you mean SAVERESULTS?",
         true},
        {"hello", "This line is no statement and is ignored.", true},
    };
    for (const Expected& row : rows) {
        const auto findings = checkScript(row.line);
        if (*row.text == 0) {
            EXPECT_TRUE(findings.empty()) << row.line;
            continue;
        }
        ASSERT_EQ(findings.size(), 1U) << row.line;
        EXPECT_EQ(findings[0].text, row.text);
        EXPECT_EQ(findings[0].ignored, row.ignored) << row.line;
    }
}

TEST(LineCheck, WhatStandsBefore_Counts) {
    EXPECT_TRUE(checkScript("DO\nAUTORECALL X\nLOOP 3\nSCANSTEP 1\nSCANSTOP 2").empty());
    const auto after = checkScript("DO\nLOOP 3\nAUTORECALL X");
    ASSERT_EQ(after.size(), 1U);
    EXPECT_EQ(after[0].line, 3);
}

TEST(LineCheck, Lines_AreCountedAsAnEditorDoes) {
    for (const char* text : {"\r\n\r\nX\r\n", "\n\nX\n", "\r\rX\r", "\n \t\nX"}) {
        const auto findings = checkScript(text);
        ASSERT_EQ(findings.size(), 1U);
        EXPECT_EQ(findings[0].line, 3);
        EXPECT_EQ(scriptLines(text).size(), loadCommandsFromText(text).size());
    }
}

}  // namespace
}  // namespace zel
