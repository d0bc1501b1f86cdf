// The verb run, over the simulator in virtual time, with its boxes on standard error.

#include <gtest/gtest.h>
#include <unistd.h>

#include <filesystem>
#include <sstream>

#include "console/Fronts.h"
#include "console/LineInput.h"
#include "console/PanelSession.h"
#include "console/RunScript.h"
#include "console/Tool.h"
#include "desktop/platform/QtSignals.h"
#include "desktop/platform/SystemFiles.h"
#include "tests/files/DiskFolder.h"
#include "tests/files/FileSession.h"

namespace zel {
namespace {

struct RunScriptTest : ::testing::Test {
    /// Runs the lines with the input as standard input; the exit status.
    int run(const Texts& lines, const std::string& input, std::vector<std::string> more = {}) {
        std::string text;
        for (const std::string& line : lines) text += line + "\r\n";
        std::vector<std::string> words{"zelctl", "--home", folder.file("home"), "run",
                                       folder.write("s.txt", text)};
        words.insert(words.end(), more.begin(), more.end());
        std::vector<const char*> list;
        for (const std::string& word : words) list.push_back(word.c_str());
        Options options;
        std::ostringstream out;
        errors.str("");
        const auto status =
            parseOptions(static_cast<int>(list.size()), list.data(), options, out, errors);
        if (status) return *status;
        const auto front = makeSimulatorFront(options.home);
        std::istringstream in(input);
        StreamLines source(in);
        LineOutput errorLines(errors);
        AnswerQueue answers;
        ConsoleBoxes boxes(errorLines, answers);
        ConsoleFileDialogs dialogs(errorLines, answers);
        ServingEvents events(front->events());
        Program program(front->platform(events, boxes, dialogs), "");
        program.start();
        if (connected && !program.connect({LinkAddress::Kind::Serial, "SIM", 57600}, false))
            return -1;
        const auto before = std::filesystem::current_path();
        std::filesystem::current_path(folder.file(""));
        if (!interruptedBy.empty())
            front->events().schedule(
                1000, [this, &front] { front->endSignals().request(interruptedBy); });
        const int result = runScript(options, {program,
                                               files,
                                               events,
                                               source,
                                               true,
                                               boxes,
                                               dialogs,
                                               answers,
                                               errorLines,
                                               front->endSignals(),
                                               {}});
        EXPECT_EQ(std::filesystem::current_path(),
                  std::filesystem::path(folder.file("")).parent_path());
        std::filesystem::current_path(before);
        EXPECT_FALSE(front->endSignals().takes);
        errorLines.settle();
        return result;
    }

    DiskFolder folder;
    SystemFiles files;
    std::ostringstream errors;
    bool connected = true;
    std::string interruptedBy;  ///< a signal that comes after a second
};

TEST_F(RunScriptTest, Run_WritesBesideTheCommandAndEndsWithZero) {
    EXPECT_EQ(run({"SAVERESULTS OUT.TXT", "GET LEVEL", "PAUSE 3600"}, ""), 0);
    EXPECT_EQ(linesOf(folder.read("OUT.TXT")).size(), 1U);
    EXPECT_EQ(errors.str(), "");
}

TEST_F(RunScriptTest, Output_TicksTheBoxAndKeepsItsCase) {
    EXPECT_EQ(run({"COMMENT X"}, "", {"--output", "My Out.txt"}), 0);
    EXPECT_EQ(linesOf(folder.read("My Out.txt")).size(), 1U);
}

TEST_F(RunScriptTest, Boxes_WaitForALineEach) {
    EXPECT_EQ(
        run({"SHOWDIALOG ONECRLFTWO", "PAUSE 0", "COMMENT X", "COMMENT Y"}, "\nok\nyes\nout.txt\n"),
        0);
    EXPECT_EQ(errors.str(),
              "box[plain] ZELRemote | ONE / TWO\n"
              "box[information] ZELRemote | Press OK to continue\n"
              "box[question] No output file specified | There are instructions to save data in "
              "the script, but no file has been selected. / Do you want to select a file now?\n"
              "file[save] Save As\n");
    EXPECT_EQ(linesOf(folder.read("out.txt")).size(), 2U);
}

TEST_F(RunScriptTest, CancelInABox_EndsWithOne) {
    EXPECT_EQ(run({"COMMENT X", "COMMENT Y"}, "cancel\n"), 1);
    EXPECT_EQ(run({"COMMENT X", "COMMENT Y"}, "no\n"), 0);
}

TEST_F(RunScriptTest, EndOfInput_AgreesToBoxesAndCancelsDialogs) {
    EXPECT_EQ(run({"SHOWDIALOG A", "COMMENT X"}, ""), 0);
    EXPECT_NE(errors.str().find("file[save]"), std::string::npos);
}

TEST_F(RunScriptTest, StepMode_TakesALineAPressAndGoesOnAtTheEnd) {
    EXPECT_EQ(run({"STEPMODE", "SAVERESULTS OUT.TXT", "# x", "COMMENT A", "COMMENT B"}, "\n"), 0);
    EXPECT_EQ(linesOf(folder.read("OUT.TXT")).size(), 2U);
    EXPECT_EQ(errors.str(), "");
}

TEST_F(RunScriptTest, Signals_EndTheRunAtOnce) {
    for (const char* signal : {"SIGINT", "SIGTERM", "SIGHUP"}) {
        interruptedBy = signal;
        const std::string name = signal + std::string(".TXT");
        EXPECT_EQ(run({"SAVERESULTS " + name, "COMMENT A", "PAUSE 3600", "COMMENT B"}, ""), 1);
        EXPECT_EQ(linesOf(folder.read(name)).size(), 1U) << signal;
    }
}

TEST_F(RunScriptTest, Failures_EndWithOne) {
    EXPECT_EQ(run({"LOADTRACE NONE.CSV"}, ""), 1);
    EXPECT_EQ(run({"NOSAVE", "GET CTRACE"}, ""), 1);
    EXPECT_NE(errors.str().find("box[plain] ZELRemote | Overflow"), std::string::npos);
}

TEST_F(RunScriptTest, Unconnected_RunsWhatNeedsNoInstrument) {
    connected = false;
    EXPECT_EQ(run({"SAVERESULTS OUT.TXT", "COMMENT A"}, ""), 0);
    EXPECT_EQ(run({"GET LEVEL"}, ""), 1);
    EXPECT_EQ(errors.str(),
              "box[information] ZELRemote | Please connect to the instrument first\n");
}

TEST_F(RunScriptTest, MissingScript_IsWrongUse) {
    Options options;
    options.verb = Verb::Run;
    options.argument = folder.file("none.txt");
    LineOutput out(errors);
    EXPECT_EQ(rehearseScript(options, files, out, out), kWrongUse);
}

TEST_F(RunScriptTest, Rehearsal_PrintsTheReport) {
    Options options;
    options.verb = Verb::Run;
    options.argument = folder.write("s.txt", "NOSAVE\nPUASE 1\nPAUSE 2\n");
    std::ostringstream stream;
    LineOutput out(stream);
    LineOutput errorLines(errors);
    EXPECT_EQ(rehearseScript(options, files, out, errorLines), 3);
    EXPECT_EQ(stream.str(),
              "line 2: This line is no statement and is ignored; did you mean PAUSE?\n"
              "duration: 2 s\nline load: 0 bytes, 0 %\n");
}

}  // namespace
}  // namespace zel
