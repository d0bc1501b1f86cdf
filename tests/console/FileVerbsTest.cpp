// The verbs that write and read files, over the simulator in virtual time.

#include <gtest/gtest.h>

#include "console/PanelSession.h"
#include "tests/console/ToolRun.h"

namespace zel {
namespace {

using FileVerbsTest = ToolRun;

TEST_F(FileVerbsTest, Sweep_SavesTheViewBesideTheRows) {
    EXPECT_EQ(runConnected({"sweep", "--output", folder.file("view.csv")}), kDone);
    EXPECT_EQ(printed().size(), 302U);
    const Texts lines = linesOf(folder.read("view.csv"));
    ASSERT_GT(lines.size(), 301U);
    EXPECT_EQ(lines[0], "Trace Name;Analyzer");
    EXPECT_EQ(errors.str(), "");
}

TEST_F(FileVerbsTest, Show_PrintsWhatSweepSaved) {
    ASSERT_EQ(runConnected({"sweep", "--output", folder.file("view.csv")}), kDone);
    const Texts swept = printed();
    EXPECT_EQ(run({"show", folder.file("view.csv")}), kDone);
    const Texts shown = printed();
    ASSERT_EQ(shown.size(), swept.size());
    EXPECT_EQ(shown[0], "x,value1,value2");
    EXPECT_EQ(shown[1], swept[1]);
    EXPECT_EQ(shown[301], swept[301]);
}

TEST_F(FileVerbsTest, Show_ClipsAsTheGraphDoes) {
    folder.write("view.csv",
                 "Reference Unit;dBm\r\nReference Range;10 dB/div\r\nReference Level;-20\r\n"
                 "Trace Write Pointer;301\r\n\r\n1.000;5; \r\n2.000;-300; \r\n");
    EXPECT_EQ(run({"show", folder.file("view.csv")}), kDone);
    EXPECT_EQ(printed(), (Texts{"x,value", "1,-20", "2,-120"}));
}

TEST_F(FileVerbsTest, Record_WritesTracesAndShowPrintsEach) {
    EXPECT_EQ(runConnected({"record", "--interval", "0.5", "--count", "3", "--output",
                            folder.file("trace.csv")}),
              kDone);
    EXPECT_EQ(out.str(), "");
    EXPECT_EQ(run({"show", folder.file("trace.csv")}), kDone);
    const Texts shown = printed();
    ASSERT_EQ(shown.size(), 1U + 3 * 301 + 2);
    EXPECT_EQ(shown[302], "");
    EXPECT_NE(shown[303], "");
}

TEST_F(FileVerbsTest, WhatCannotBeWritten_IsAFailure) {
    EXPECT_EQ(runConnected({"sweep", "--output", folder.file("gone/view.csv")}), kLinkFailed);
    EXPECT_NE(errors.str().find("box[critical] ZELRemote | The file "), std::string::npos);
    EXPECT_EQ(runConnected({"record", "--interval", "1", "--count", "2", "--output",
                            folder.file("gone/view.csv")}),
              kLinkFailed);
}

TEST_F(FileVerbsTest, WhatCannotBeRead_IsAFailure) {
    EXPECT_EQ(run({"show", folder.file("gone.csv")}), kLinkFailed);
    EXPECT_NE(errors.str().find("No such file or directory"), std::string::npos);
    folder.write("empty.csv", "");
    EXPECT_EQ(run({"show", folder.file("empty.csv")}), kLinkFailed);
    EXPECT_NE(errors.str().find("holds no rows"), std::string::npos);
}

TEST_F(FileVerbsTest, Set_TextWithACharacterThatTheInstrumentDoesNotKnow_IsWrongUse) {
    EXPECT_EQ(runConnected({"set", "NAME,5 \u03A9"}), kWrongUse);
    EXPECT_NE(errors.str().find("The instrument has no character for \"\u03A9\"."),
              std::string::npos);
    EXPECT_EQ(runConnected({"set", "NAME,a\rcmd"}), kWrongUse);
    EXPECT_EQ(runConnected({"set", "N\u00C4ME,1"}), kWrongUse);
}

TEST_F(FileVerbsTest, Show_SweepsThatCannotBePrinted_EndWithStatus1AndAWord) {
    struct Full : std::streambuf {
        int_type overflow(int_type) override { return traits_type::eof(); }
    } full;
    std::ostream nowhere(&full);
    folder.write("view.csv", "Trace Write Pointer;301\r\n\r\n1.000;5; \r\n2.000;-30; \r\n");
    Options options;
    options.verb = Verb::Show;
    options.argument = folder.file("view.csv");
    const auto front = makePortFront(folder.file("home"));
    EXPECT_EQ(runTool(options, *front, {nowhere, errors}), kLinkFailed);
    EXPECT_EQ(errors.str(), "zelctl: the output cannot be written: nothing can be written to it\n");
}

TEST_F(FileVerbsTest, WrongUse_IsTold) {
    EXPECT_EQ(run({"show"}), kWrongUse);
    EXPECT_EQ(runConnected({"record", "--interval", "1", "--count", "2"}), kWrongUse);
    EXPECT_EQ(runConnected({"record", "--interval", "0", "--count", "2", "--output", "x"}),
              kWrongUse);
    EXPECT_EQ(runConnected({"record", "--interval", "1", "--count", "0", "--output", "x"}),
              kWrongUse);
    EXPECT_EQ(run({"record", "--interval", "1", "--count", "1", "--output", "x"}), kWrongUse);
    EXPECT_EQ(run({"show", "x", "--image", "x.gif"}), kWrongUse);
}

struct RowsPictureTest : FileVerbsTest {
    // One application in a process, left standing: its own statics end first.
    static void SetUpTestSuite() {
        static int count = 1;
        static char name[] = "test_console";
        static char* arguments[] = {name, nullptr};
        // The programs of this build come first.
        const char* path = getenv("PATH");
        setenv("PATH", (std::string(ZEL_PROGRAMS ":") + (path ? path : "")).c_str(), 1);
        static const auto* toolkit = new ToolkitSession(count, arguments);
        EXPECT_NE(toolkit, nullptr);
    }
};

TEST_F(RowsPictureTest, Sweep_DrawsItsRowsInEachKind) {
    for (const char* ending : {"png", "svg", "pdf"}) {
        const std::string depth = folder.file(std::string("w.") + ending);
        const std::string above = folder.file(std::string("s.") + ending);
        EXPECT_EQ(
            runConnected({"sweep", "--count", "3", "--waterfall", depth, "--spectrogram", above}),
            kDone);
        EXPECT_EQ(printed().size(), 1U + 3 * 301 + 2);
        EXPECT_EQ(errors.str(), "");
        EXPECT_GT(folder.read(std::string("w.") + ending).size(), 5000U) << ending;
        EXPECT_GT(folder.read(std::string("s.") + ending).size(), 5000U) << ending;
    }
    EXPECT_NE(folder.read("w.svg").find("3 sweeps"), std::string::npos);
    EXPECT_NE(folder.read("s.svg").find("3 sweeps"), std::string::npos);
}

TEST_F(RowsPictureTest, Show_DrawsTheRowsOfASeries) {
    ASSERT_EQ(runConnected({"record", "--interval", "1", "--count", "4", "--output",
                            folder.file("series.csv")}),
              kDone);
    EXPECT_EQ(run({"show", folder.file("series.csv"), "--waterfall", folder.file("w.svg")}), kDone);
    EXPECT_NE(folder.read("w.svg").find("4 sweeps"), std::string::npos);
}

TEST_F(RowsPictureTest, AFileThatCannotBeWritten_IsToldAndStatusOne) {
    EXPECT_EQ(runConnected({"sweep", "--waterfall", folder.file("none/w.png")}), kLinkFailed);
    EXPECT_NE(errors.str().find("the image could not be written"), std::string::npos);
    EXPECT_EQ(run({"show", "x", "--spectrogram", "x.wmf"}), kWrongUse);
}

}  // namespace
}  // namespace zel
