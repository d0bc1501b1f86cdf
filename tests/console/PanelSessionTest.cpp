#include <gtest/gtest.h>
#include <sys/ioctl.h>
#include <unistd.h>

#include <functional>
#include <new>
#include <sstream>
#include <stdexcept>
#include <string>

#include "ZELSim/InProcessPort.h"
#include "console/Address.h"
#include "console/ConsoleDialogs.h"
#include "console/PanelSession.h"
#include "platform/virtual/VirtualPlatform.h"

namespace zel {
namespace {

/// A session over a simulated instrument; each `play` is one run of the tool.
struct PanelSessionTest : ::testing::Test {
    VirtualPlatform platform;
    zelsim::InProcessPort port{platform.clock, platform.events};
    std::ostringstream out;
    std::ostringstream errors;
    int status = -1;

    PanelSessionTest() { platform.ports.ports = {kSimulatorPort}; }

    std::function<void(Program&)> prepare;  ///< called before the session starts

    std::string play(const std::string& lines, const std::string& words = "") {
        out.str("");
        errors.str("");
        std::istringstream text(lines);
        StreamLines input(text);
        LineOutput output(out);
        LineOutput errorOutput(errors);
        AnswerQueue answers;
        ConsoleBoxes boxes(output, answers);
        ConsoleFileDialogs dialogs(output, answers);
        ServingEvents events(platform.events);
        Program program(
            {platform.clock, events, boxes, port, platform.ports, platform.tcpSocket,
             platform.serverPort, platform.serverSocket, platform.settings, platform.debug,
             platform.clipboard, platform.launcher, platform.startup, platform.folder, dialogs,
             platform.files, platform.endSignals, platform.machine, platform.portProbe},
            words);
        if (prepare) prepare(program);
        PanelSession session(program,
                             {platform.clock, events, input, output, errorOutput, answers, true},
                             LinkAddress{LinkAddress::Kind::Serial, kSimulatorPort, 57600});
        boxes.misfit = [&](const std::string& answer) { session.complain(answer); };
        status = session.run();
        return out.str();
    }
};

TEST_F(PanelSessionTest, OutputThatCannotBeWritten_EndsTheSession) {
    out.setstate(std::ios::badbit);
    play("show State\nshow State\nfly\n");
    EXPECT_EQ(errors.str(), "");  // the third line was not read any more
}

TEST_F(PanelSessionTest, Logs_WrongNamesAndValues_AreTold) {
    play(
        "show RootDebug.Wings\nset RootDebug.LogPushPop maybe\nset RootDebug.CallStackTop 5\n"
        "call RootDebug.LogMessage high \"a\" \"b\"\ncall RootDebug.Pop 1\n"
        "call RootDebug.PushInfo \"a\ncall Fly\nshow RootDebug.CallStackTop\n");
    EXPECT_EQ(out.str(), "-1\n");
    EXPECT_EQ(status, kWrongUse);
    EXPECT_EQ(errors.str(),
              "zelctl: line 1: there is nothing to show as \"RootDebug.Wings\"\n"
              "zelctl: line 2: \"RootDebug.LogPushPop\" cannot be set to \"maybe\"\n"
              "zelctl: line 3: \"RootDebug.CallStackTop\" cannot be set to \"5\"\n"
              "zelctl: line 4: there is no routine \"RootDebug.LogMessage\" of these arguments\n"
              "zelctl: line 5: there is no routine \"RootDebug.Pop\" of these arguments\n"
              "zelctl: line 6: there is no routine \"RootDebug.PushInfo\" of these arguments\n"
              "zelctl: line 7: there is no routine \"Fly\" of these arguments\n");
}

TEST_F(PanelSessionTest, StructuredLog_IsMadeReadyByEitherName) {
    for (const char* name : {"Activate", "MarkReady"})
        EXPECT_EQ(play("set RootDebug.Initialized false\ncall RootDebug." + std::string(name) +
                       "\nshow RootDebug.Initialized\n"),
                  "true\n");
}

TEST_F(PanelSessionTest, Logs_LinesForTheDebugger_GoToTheErrors) {
    EXPECT_EQ(play("set RootDebug.DebuggerLogEnabled true\n"
                   "call RootDebug.LogMessage 3 \"Listen\" \"say \"\"hello\"\"\"\n"),
              "");
    EXPECT_EQ(errors.str(),
              "...    Warning\n          SOURCE      : Listen\n"
              "          DESCRIPTION : say \"hello\"\n");
}

TEST_F(PanelSessionTest, CommentsAndBlankLines_PrintNothing) {
    EXPECT_EQ(play("# words\n\n   \n  # more\r\n"), "");
    EXPECT_EQ(status, kDone);
}

TEST_F(PanelSessionTest, ShowProperty_TwoLineCaption_IsOneLine) {
    EXPECT_EQ(play("show SoftKey(0).Caption\n"), "CENTER\\r\\nFREQ\n");
}

TEST_F(PanelSessionTest, UnknownCommandAndName_AreToldAndTheSessionGoesOn) {
    EXPECT_EQ(play("fly\nclick NoButton\nshow No.Caption\nshow CFLabel.Wings\nshow State\n"),
              "0\n");
    EXPECT_EQ(status, kWrongUse);
    EXPECT_EQ(errors.str(),
              "zelctl: line 1: there is no command \"fly\"\n"
              "zelctl: line 2: there is no control \"NoButton\"\n"
              "zelctl: line 3: there is nothing to show as \"No.Caption\"\n"
              "zelctl: line 4: there is nothing to show as \"CFLabel.Wings\"\n");
}

TEST_F(PanelSessionTest, HiddenDisabledAndLockedControls_AreRefused) {
    EXPECT_EQ(play("click StopButton\nclick Disconnect\ntype DebugTextBox x\nset DebugTextBox x\n"
                   "key DebugTextBox f1\nshow DebugTextBox.Text\n"),
              "refused: StopButton is hidden\nrefused: Disconnect is disabled\n"
              "refused: DebugTextBox is locked\nrefused: DebugTextBox is locked\n"
              "refused: DebugTextBox is locked\n\n");
    EXPECT_EQ(status, kDone);
}

TEST_F(PanelSessionTest, HandlerThatThrows_OpensTheReportAndEndsTheSession) {
    prepare = [](Program& program) {
        program.forms().controller.FrequencyButton.Clicked.connect([] { throw std::bad_alloc(); });
    };
    EXPECT_EQ(play("click FrequencyButton\nshow ErrorForm.Info(2).Text\n"),
              "DESCRIPTION : There is not enough memory for this.\n");
    EXPECT_EQ(status, kLinkFailed);
}

TEST_F(PanelSessionTest, TimerThatThrows_OpensTheReportAndEndsTheSession) {
    platform.events.schedule(50, [] { throw std::runtime_error("no room"); });
    EXPECT_EQ(play("pump 100\nshow ErrorForm.Info(2).Text\nclick ErrorForm.ButtonOK\nshow State\n"),
              "DESCRIPTION : no room\n");
    EXPECT_EQ(status, kLinkFailed);
}

TEST_F(PanelSessionTest, BoxOfTheSameText_WithinOneLine_PrintsOnceWithItsCount) {
    EXPECT_EQ(play("type SoftTextBox(0) 12\n"),
              "box[information] ZELRemote | Please connect to the intrument first. (2 times)\n");
}

TEST_F(PanelSessionTest, ModalForm_ServesLinesUntilItIsClosed) {
    EXPECT_EQ(play("click Direct\nshow MainForm.Visible\nshow MainForm.Modal\n"
                   "click MainForm.CancelConnButton1\nshow MainForm.Visible\n"),
              "true\ntrue\nfalse\n");
}

TEST_F(PanelSessionTest, ModalForm_PumpLetsTimePass) {
    EXPECT_EQ(play("click Direct\nshow TimeLabel.Caption\npump 2500\nshow TimeLabel.Caption\n"),
              "12:00:00\n12:00:02\n");
}

TEST_F(PanelSessionTest, EndOfInput_InAModalForm_EndsTheSession) {
    EXPECT_EQ(play("click Direct\n"), "");
    EXPECT_EQ(status, kDone);
}

TEST_F(PanelSessionTest, EndOfInput_InAContinuousView_StopsAndDisconnects) {
    play("connect\nclick PlayContinuousButton\n");
    EXPECT_EQ(status, kDone);
    EXPECT_FALSE(port.isOpen());
}

TEST_F(PanelSessionTest, Quit_InAModalForm_ReadsNoMore) {
    EXPECT_EQ(play("click Direct\nquit\nshow State\n"), "");
}

TEST_F(PanelSessionTest, ContinuousView_LinesAreServedAndPumpLetsItRun) {
    EXPECT_EQ(play("connect\nclick PlayContinuousButton\nshow StopButton.Visible\npump 200\n"
                   "show ContinuosLoopActive\nclick StopButton\nshow StopButton.Visible\n"
                   "show State\n"),
              "true\ntrue\nfalse\n3\n");
    EXPECT_EQ(status, kDone);
}

TEST_F(PanelSessionTest, OrdinaryExchange_IsNotDisturbedByTheNextLine) {
    EXPECT_EQ(play("connect\nclick PlaySingleButton\nshow MousePointer\n"
                   "show ControllerForm.MousePointer\n"),
              "0\n");
    EXPECT_EQ(errors.str(), "zelctl: line 3: there is nothing to show as \"MousePointer\"\n");
}

TEST_F(PanelSessionTest, Connect_Twice_IsRefusedTheSecondTime) {
    EXPECT_EQ(play("connect\nconnect\nshow isConnected\n"), "refused: Direct is disabled\ntrue\n");
}

TEST_F(PanelSessionTest, Answers_QueueUpAndWithoutOneTheButtonIsAffirmative) {
    EXPECT_EQ(play("connect\nanswer cancel\ndisconnect\nshow isConnected\ndisconnect\n"
                   "show isConnected\n"),
              "box[question] Disconnect | Are you sure you want to close the connection?\ntrue\n"
              "box[question] Disconnect | Are you sure you want to close the connection?\nfalse\n");
}

TEST_F(PanelSessionTest, AnswerThatFitsNoQuestion_IsWrongUse) {
    play("connect\nanswer perhaps\ndisconnect\n");
    EXPECT_EQ(status, kWrongUse);
}

TEST_F(PanelSessionTest, EndOfTheProgram_EndsTheSession) {
    play("click ExitObject\nshow State\n");
    EXPECT_EQ(out.str().find("0\n"), std::string::npos);
    EXPECT_EQ(status, kDone);
}

TEST_F(PanelSessionTest, ServerWord_ServesLinesInTheServersWindow) {
    EXPECT_EQ(play("show ServerForm.Visible\nquit\n", "server"), "true\n");
}

TEST_F(PanelSessionTest, Choose_IndexOutsideOfTheList_IsWrongUse) {
    play(
        "click Direct\nchoose MainForm.BaudList 4\nchoose MainForm.BaudList x\n"
        "choose MainForm.BaudList 3\nshow MainForm.BaudList.Text\n");
    EXPECT_EQ(out.str(), "115200\n");
    EXPECT_EQ(errors.str(),
              "zelctl: line 2: \"MainForm.BaudList\" has no such entry\n"
              "zelctl: line 3: \"MainForm.BaudList\" has no such entry\n");
}

TEST_F(PanelSessionTest, LineThatIsTooLong_IsToldAndPassedOver) {
    EXPECT_EQ(play("set MainForm.TelNumberBox " + std::string(70000, '1') +
                   "\nshow MainForm.TelNumberBox.Text\n"),
              "\n");
    EXPECT_EQ(errors.str(), "zelctl: line 1: the line is too long\n");
}

TEST_F(PanelSessionTest, BytesThatAreNoUtf8_AreTakenAsWestern) {
    EXPECT_EQ(play("set MainForm.TelNumberBox \xE9\nshow MainForm.TelNumberBox.Text\n"),
              "\xC3\xA9\n");
}

TEST_F(PanelSessionTest, LineInATickOfTheRecording_WaitsForItsEnd) {
    // 4 s a sweep: the lines come in the middle of the first tick.
    platform.files.putFolder("/views");
    const std::string printed = play(
        "connect\n"
        "click SweepButton\n"
        "key SoftTextBox(0) right\n"
        "set SoftTextBox(0) 4\n"
        "key SoftTextBox(0) enter\n"
        "click RecordData\n"
        "set TimeForm.TimeIntervalBox 5\n"
        "answer /views/trace.csv\n"
        "click TimeForm.SubmitTimeButton\n"
        "pump 5500\n"
        "show PlaySingleButton.Enabled\n"
        "click MarkerCheckBox\n"
        "show TimeForm.RecordedCount\n"
        "show MarkerOn\n"
        "click StopButton\n");
    // The tick was under way, the click came after it, and the line after waited as well.
    EXPECT_EQ(printed, "false\n1\ntrue\n");
}

TEST(LineInputTest, StandardInput_IsReadAheadByAThousandLinesAtMost) {
    int ends[2];
    ASSERT_EQ(::pipe(ends), 0);
    const std::string lines(5000, '\n');
    ASSERT_EQ(::write(ends[1], lines.data(), lines.size()), static_cast<ssize_t>(lines.size()));
    DescriptorLines input(ends[0]);
    std::string line;
    ASSERT_EQ(input.next(line, false), LineInput::Got::Line);
    int left = 0;
    ASSERT_EQ(::ioctl(ends[0], FIONREAD, &left), 0);
    EXPECT_GE(left, 4000);
    ::close(ends[0]);
    ::close(ends[1]);
}

TEST(LineInputTest, WaitForALine_EndsWithTheOtherDescriptor) {
    int lines[2];
    int wake[2];
    ASSERT_EQ(::pipe(lines), 0);
    ASSERT_EQ(::pipe(wake), 0);
    ASSERT_EQ(::write(wake[1], "!", 1), 1);
    DescriptorLines input(lines[0], wake[0]);
    std::string line;
    EXPECT_EQ(input.next(line, true), LineInput::Got::Nothing);
    for (const int end : {lines[0], lines[1], wake[0], wake[1]}) ::close(end);
}

}  // namespace
}  // namespace zel
