#include <gtest/gtest.h>
#include <unistd.h>

#include <array>
#include <sstream>
#include <string>
#include <vector>

#include "console/Address.h"
#include "console/ConsoleDialogs.h"
#include "console/ControlAccess.h"
#include "console/ControlActions.h"
#include "console/DebugWatch.h"
#include "console/GraphText.h"
#include "console/LineInput.h"
#include "console/LineOutput.h"
#include "console/Options.h"
#include "console/PanelSession.h"
#include "support/NumberText.h"

namespace zel {
namespace {

TEST(ParseAddress, Serial_WithAndWithoutBaud_IsTaken) {
    const auto plain = parseAddress("serial:/dev/ttyUSB0");
    ASSERT_TRUE(plain);
    EXPECT_EQ(plain->link.port, "/dev/ttyUSB0");
    EXPECT_EQ(plain->link.number, 57600);
    EXPECT_FALSE(plain->simulated);
    const auto slow = parseAddress("serial:COM3@19200");
    ASSERT_TRUE(slow);
    EXPECT_EQ(slow->link.port, "COM3");
    EXPECT_EQ(slow->link.number, 19200);
}

TEST(ParseAddress, Tcp_HostAndPort_IsTaken) {
    const auto address = parseAddress("tcp:analyser.example:2277");
    ASSERT_TRUE(address);
    EXPECT_EQ(address->link.kind, LinkAddress::Kind::Tcp);
    EXPECT_EQ(address->link.port, "analyser.example");
    EXPECT_EQ(address->link.number, 2277);
}

TEST(ParseAddress, Sim_IsTheSimulator) {
    const auto address = parseAddress("sim:");
    ASSERT_TRUE(address);
    EXPECT_TRUE(address->simulated);
}

class BadAddress : public ::testing::TestWithParam<const char*> {};
TEST_P(BadAddress, IsRefused) { EXPECT_FALSE(parseAddress(GetParam())); }
INSTANTIATE_TEST_SUITE_P(ParseAddress, BadAddress,
                         ::testing::Values("", "sim", "sim:x", "serial:", "serial:@9600",
                                           "serial:COM1@", "serial:COM1@fast", "serial:COM1@-1",
                                           "serial:COM1@99999999999", "tcp:", "tcp:host",
                                           "tcp:host:", "tcp::2277", "tcp:host:0", "tcp:host:65536",
                                           "usb:1"));

struct OptionsTest : ::testing::Test {
    Options options;
    std::ostringstream out;
    std::ostringstream errors;

    std::optional<int> parse(std::vector<const char*> words) {
        words.insert(words.begin(), "zelctl");
        return parseOptions(static_cast<int>(words.size()), words.data(), options, out, errors);
    }
};

TEST_F(OptionsTest, AllGlobalOptions_AreTaken) {
    EXPECT_FALSE(parse({"--connect", "sim:", "--home", "dir", "--words", "BUTTON x", "--verbose",
                        "sweep", "--count", "3", "--image", "a.SVG"}));
    EXPECT_TRUE(options.address->simulated);
    EXPECT_EQ(options.home, "dir");
    EXPECT_EQ(options.words, "BUTTON x");
    EXPECT_TRUE(options.verbose);
    EXPECT_EQ(options.verb, Verb::Sweep);
    EXPECT_EQ(options.count, 3);
    EXPECT_EQ(options.image, "a.SVG");
}

TEST_F(OptionsTest, PanelWithoutAnInstrument_IsAllowed) {
    EXPECT_FALSE(parse({"panel", "file.txt"}));
    EXPECT_EQ(options.verb, Verb::Panel);
    EXPECT_EQ(options.argument, "file.txt");
}

TEST_F(OptionsTest, Help_GoesToTheOutputWithStatus0) {
    EXPECT_EQ(parse({"--help"}), kDone);
    EXPECT_NE(out.str().find("sweep"), std::string::npos);
    EXPECT_EQ(errors.str(), "");
}

class WrongUse : public OptionsTest,
                 public ::testing::WithParamInterface<std::vector<const char*>> {};
TEST_P(WrongUse, GivesStatus2AndAReason) {
    EXPECT_EQ(parse(GetParam()), kWrongUse);
    EXPECT_EQ(out.str(), "");
    EXPECT_NE(errors.str(), "");
}
INSTANTIATE_TEST_SUITE_P(
    Options, WrongUse,
    ::testing::Values(std::vector<const char*>{}, std::vector<const char*>{"fly"},
                      std::vector<const char*>{"info"},
                      std::vector<const char*>{"--connect", "nowhere", "info"},
                      std::vector<const char*>{"--connect", "sim:", "get"},
                      std::vector<const char*>{"--connect", "sim:", "get", ""},
                      std::vector<const char*>{"--connect", "sim:", "get", "FREQ\rcmd"},
                      std::vector<const char*>{"--connect", "sim:", "set", "FREQ"},
                      std::vector<const char*>{"--connect", "sim:", "set", ",1"},
                      std::vector<const char*>{"--connect", "sim:", "sweep", "--count", "0"},
                      std::vector<const char*>{"--connect", "sim:", "sweep", "--count", "many"},
                      std::vector<const char*>{"--connect", "sim:", "sweep", "--image", "a.bmp"},
                      std::vector<const char*>{"--connect", "sim:", "sweep", "--image", ".png"},
                      std::vector<const char*>{"--connect", "sim:", "--words", "server", "info"}));

TEST(VisibleTextTest, ControlCharactersAndBytesThatAreNoText_AreShownAsNumbers) {
    EXPECT_EQ(visibleText("1.5 GHz \u00B5"), "1.5 GHz \u00B5");
    EXPECT_EQ(visibleText("\x1B[2Ja\tb\x7F\n"), "\\x1B[2Ja\\x09b\\x7F\\x0A");
    EXPECT_EQ(visibleText(std::string("a\0b", 3)), "a\\x00b");
    EXPECT_EQ(visibleText("\u009B2J \x9B \xE4x"), "\\x9B2J \\x9B \\xE4x");
}

TEST(LineOutputTest, ControlCharacters_AreShownOnATerminalAndKeptElsewhere) {
    std::ostringstream stream;
    LineOutput(stream).line("a\x1B[2J");
    LineOutput(stream, true).lines({"b\x1B[2J"});
    EXPECT_EQ(stream.str(), "a\x1B[2J\nb\\x1B[2J\n");
}

TEST(LineOutputTest, StreamThatFails_IsAProblemThatStays) {
    std::ostringstream stream;
    LineOutput output(stream);
    output.line("a");
    EXPECT_EQ(output.problem(), "");
    stream.setstate(std::ios::badbit);
    output.line("b");
    EXPECT_NE(output.problem(), "");
    stream.clear();
    output.line("c");
    output.lines({"d"});
    EXPECT_NE(output.problem(), "");
    EXPECT_EQ(stream.str(), "a\n");
}

TEST(LineOutputTest, Repeatable_SameTextAgain_IsCountedUntilAnotherLine) {
    std::ostringstream stream;
    LineOutput output(stream);
    output.repeatable("a");
    output.repeatable("a");
    EXPECT_EQ(stream.str(), "");
    output.repeatable("b");
    output.line("c");
    output.repeatable("c");
    output.settle();
    output.settle();
    EXPECT_EQ(stream.str(), "a (2 times)\nb\nc\nc\n");
}

TEST(BoxLine, TextOfSeveralLines_IsJoinedInOneLine) {
    EXPECT_EQ(boxLine(BoxIcon::Critical, "T", "one\r\ntwo\nthree"),
              "box[critical] T | one / two / three");
    EXPECT_EQ(boxLine(BoxIcon::Plain, "T", ""), "box[plain] T | ");
    EXPECT_EQ(boxLine(BoxIcon::Exclamation, "T", "x"), "box[exclamation] T | x");
}

struct DialogsTest : ::testing::Test {
    std::ostringstream stream;
    LineOutput output{stream};
    AnswerQueue answers;
    ConsoleBoxes boxes{output, answers};
    ConsoleFileDialogs dialogs{output, answers};
    const Box yesNo{BoxIcon::Question, "?", "T", BoxButtons::YesNo};
    const Box okCancel{BoxIcon::Question, "?", "T", BoxButtons::OkCancel};
};

TEST_F(DialogsTest, Question_WithoutAnAnswer_GetsTheAffirmativeButton) {
    EXPECT_EQ(boxes.show(yesNo), BoxAnswer::Yes);
    EXPECT_EQ(boxes.show(okCancel), BoxAnswer::Ok);
}

TEST_F(DialogsTest, Question_QueuedWords_GiveTheirButtonsInOrder) {
    for (const char* word : {"NO", " cancel ", "yes", "ok"}) answers.add(word);
    EXPECT_EQ(boxes.show(yesNo), BoxAnswer::No);
    EXPECT_EQ(boxes.show(okCancel), BoxAnswer::Cancel);
    EXPECT_EQ(boxes.show(okCancel), BoxAnswer::Ok);
    EXPECT_EQ(boxes.show(yesNo), BoxAnswer::Yes);
}

TEST_F(DialogsTest, BoxWithOneButton_TakesNoAnswer) {
    answers.add("no");
    EXPECT_EQ(boxes.show({BoxIcon::Information, "x"}), BoxAnswer::Ok);
    EXPECT_EQ(boxes.show(yesNo), BoxAnswer::No);
}

TEST_F(DialogsTest, Question_AnswerThatFitsNone_IsToldOf) {
    std::string told;
    boxes.misfit = [&](const std::string& answer) { told = answer; };
    answers.add("perhaps");
    EXPECT_EQ(boxes.show(yesNo), BoxAnswer::Yes);
    EXPECT_EQ(told, "perhaps");
}

TEST_F(DialogsTest, Prompt_TakesTheTextCancelOrThePreset) {
    answers.add("12");
    answers.add("cancel");
    EXPECT_EQ(boxes.prompt("text", "title", "preset"), "12");
    EXPECT_EQ(boxes.prompt("text", "title", "preset"), std::nullopt);
    EXPECT_EQ(boxes.prompt("text", "title", "preset"), "preset");
}

TEST_F(DialogsTest, FileDialog_TakesThePathElseIsCancelled) {
    answers.add("a/b.csv");
    answers.add("cancel");
    EXPECT_EQ(dialogs.save({}), "a/b.csv");
    EXPECT_EQ(dialogs.open({}), std::nullopt);
    EXPECT_EQ(dialogs.save({}), std::nullopt);
}

TEST(PropertyText, KindsOfValues_AreWrittenAsTold) {
    Forms forms;
    ZEL3Variables mirror;
    forms.main.BaudList.setItems({"19200", "38400"});
    forms.main.BaudList.setListIndex(1);
    mirror.Span = 2.5;
    forms.controller.TraceData = {1, -2.25};
    const auto text = [&](const char* path) { return textOf(forms, mirror, path); };
    EXPECT_EQ(text("MainForm.BaudList.ListIndex"), "1");
    EXPECT_EQ(text("MainForm.BaudList.ListCount"), "2");
    EXPECT_EQ(text("MainForm.BaudList.List(0)"), "19200");
    EXPECT_EQ(text("MainForm.BaudList.List(7)"), "");
    EXPECT_EQ(text("MainForm.BaudList.List(x)"), std::nullopt);
    EXPECT_EQ(text("MainForm.BaudList.Text"), "38400");
    EXPECT_EQ(text("MainForm.BaudList.Caption"), std::nullopt);
    EXPECT_EQ(text("SoftKey(4).Visible"), "true");
    EXPECT_EQ(text("SoftKey(5).Visible"), std::nullopt);
    EXPECT_EQ(text("SoftKey(0).BackColor"), "2147483663");
    EXPECT_EQ(text("ControllerForm.Visible"), "false");
    EXPECT_EQ(text("MainForm.IsConnecting"), "false");
    EXPECT_EQ(text("Span"), "2.5");
    EXPECT_EQ(text("TraceData"), "1,-2.25");
    EXPECT_EQ(text("InstrumentMode"), "1");
    EXPECT_EQ(text("isConnected"), "false");
    EXPECT_EQ(text("Nothing"), std::nullopt);
}

TEST(ControlActionsTest, MenuItem_BelowADisabledOrHiddenMenu_IsRefused) {
    Forms forms;
    int clicks = 0;
    forms.controller.Direct.Clicked.connect([&] { ++clicks; });
    EXPECT_EQ(clickControl(forms.controller.Direct), Done::Yes);
    forms.controller.Connection.Enabled = false;
    EXPECT_EQ(clickControl(forms.controller.Direct), Done::Disabled);
    forms.controller.Connection.Visible = false;
    EXPECT_EQ(clickControl(forms.controller.Direct), Done::Hidden);
    EXPECT_EQ(clicks, 1);
}

TEST(ControlActionsTest, CheckBoxAndOption_ClickTogglesAndSelects) {
    Forms forms;
    EXPECT_EQ(clickControl(forms.controller.MarkerCheckBox), Done::Yes);
    EXPECT_TRUE(forms.controller.MarkerCheckBox.Value());
    EXPECT_EQ(clickControl(forms.controller.SetOption), Done::Yes);
    EXPECT_TRUE(forms.controller.SetOption.Value());
    EXPECT_EQ(clickControl(forms.controller.CFLabel), Done::Unfit);
}

TEST(ControlActionsTest, PutText_FiresNothingAndTypingDoes) {
    Forms forms;
    TextBox& box = forms.controller.SoftTextBox(0);
    int keys = 0;
    box.KeyPress.connect([&](int&) { ++keys; });
    EXPECT_EQ(putText(box, "abc"), Done::Yes);
    EXPECT_EQ(keys, 0);
    EXPECT_EQ(typeInto(box, "de"), Done::Yes);
    EXPECT_EQ(keys, 2);
    EXPECT_EQ(box.Text.get(), "abcde");
}

TEST(ControlActionsTest, EditableList_TakesTextThatItDoesNotHold) {
    Forms forms;
    EXPECT_EQ(putText(forms.main.COMList, "/dev/tty"), Done::Yes);
    EXPECT_EQ(typeInto(forms.main.COMList, "X"), Done::Yes);
    EXPECT_EQ(forms.main.COMList.Text(), "/dev/ttyX");
    EXPECT_EQ(putText(forms.controller.ChoiceBox(0), "x"), Done::Unfit);
}

TEST(ControlActionsTest, Keys_ReachTheBoxByName) {
    Forms forms;
    TextBox& box = forms.controller.SoftTextBox(0);
    std::vector<int> codes;
    box.KeyDown.connect([&](int code, int) { codes.push_back(code); });
    for (const char* name : {"enter", "left", "right", "backspace", "clear", "f1"})
        EXPECT_EQ(pressNamedKey(box, name), Done::Yes);
    EXPECT_EQ(codes, (std::vector<int>{13, 37, 39, 8, 12, 112}));
    EXPECT_EQ(pressNamedKey(box, "f2"), Done::NoKey);
}

Sweep sweepOf(std::vector<double> values, int detector, double first, double increment) {
    Sweep sweep;
    sweep.physical = std::move(values);
    sweep.settings.TraceDetector = static_cast<std::uint8_t>(detector);
    sweep.axis.first = first;
    sweep.axis.increment = increment;
    return sweep;
}

TEST(SweepRows, AutoPeak_GivesPairsAtTheFirstValuesPlace) {
    Sweep sweep = sweepOf(std::vector<double>(602, -50), DETAUTOPEAK, 1000, 5);
    sweep.physical[2] = -70.5;
    sweep.physical[3] = -60.25;
    const auto rows = sweepRows(sweep);
    ASSERT_EQ(rows.size(), 301U);
    EXPECT_EQ(rows[0], "1000,-50,-50");
    EXPECT_EQ(rows[1], "1010,-70.5,-60.25");
    EXPECT_EQ(rows[300], "4000,-50,-50");
}

TEST(SweepRows, OtherDetector_GivesOneValueARowAndReadsBackExactly) {
    const auto rows =
        sweepRows(sweepOf(std::vector<double>(301, 0.1 + 0.2), DETSAMPLE, 0, 1.0 / 3));
    ASSERT_EQ(rows.size(), 301U);
    const auto comma = rows[1].find(',');
    EXPECT_EQ(leadingNumber(rows[1].substr(0, comma)), 1.0 / 3);
    EXPECT_EQ(leadingNumber(rows[1].substr(comma + 1)), 0.1 + 0.2);
}

TEST(SweepRows, PointThatDidNotComeWhole_HasNoRow) {
    const double none = std::numeric_limits<double>::quiet_NaN();
    EXPECT_EQ(sweepRows(sweepOf({-1, -2, none}, DETSAMPLE, 10, 5)),
              (std::vector<std::string>{"10,-1", "15,-2"}));
    EXPECT_EQ(sweepRows(sweepOf({-1, -2, -3, none}, DETAUTOPEAK, 10, 5)),
              std::vector<std::string>{"10,-1,-2"});
}

TEST(SweepRows, NoTrace_GivesNoRows) { EXPECT_TRUE(sweepRows(Sweep{}).empty()); }

TEST(GraphLines, PlotAndCursor_AreTold) {
    ControllerForm panel;
    panel.CWGraph1.plotY({-1, -2}, 10, 5);
    panel.CWGraph1.addCursor({1, 2, 255, true});
    panel.CWGraph1.setTrigger({"T", -40, true});
    EXPECT_EQ(graphLines(panel.CWGraph1),
              (std::vector<std::string>{"x axis: 0 to 1", "y axis: -120 to -20, labels shown",
                                        "track mode: 1", "points: 2", "first point: 10, -1",
                                        "last point: 15, -2", "cursor 1: 1, 2, colour 255, shown",
                                        "annotation Trigger: \"T\" at -40, shown"}));
}

TEST(DebugWatchTest, LineThatBegins_TellsOfANewExchange) {
    ControllerForm panel;
    DebugWatch watch(panel);
    int exchanges = 0;
    std::string lines;
    watch.onExchange = [&] { ++exchanges; };
    watch.onLine = [&](const std::string& text) { lines += text + ";"; };
    panel.DebugTextBox.Text = "CMD <INIT> starting";
    panel.DebugTextBox.Text = "<INIT> response: 0";
    panel.DebugTextBox.Locked = true;
    EXPECT_EQ(exchanges, 1);
    EXPECT_EQ(lines, "CMD <INIT> starting;<INIT> response: 0;");
}

/// The two ends of a pipe.
struct DescriptorLinesTest : ::testing::Test {
    std::array<int, 2> ends{};
    DescriptorLinesTest() { EXPECT_EQ(::pipe(ends.data()), 0); }
    ~DescriptorLinesTest() override {
        ::close(ends[0]);
        closeWriter();
    }
    void closeWriter() {
        if (ends[1] >= 0) ::close(ends[1]);
        ends[1] = -1;
    }
    void write(const std::string& text) {
        EXPECT_EQ(::write(ends[1], text.data(), text.size()), static_cast<ssize_t>(text.size()));
    }
};

TEST_F(DescriptorLinesTest, PartOfALine_IsNothingYet) {
    DescriptorLines lines(ends[0]);
    std::string line;
    EXPECT_EQ(lines.next(line, false), LineInput::Got::Nothing);
    write("ab");
    EXPECT_EQ(lines.next(line, false), LineInput::Got::Nothing);
    write("c\nd");
    EXPECT_EQ(lines.next(line, false), LineInput::Got::Line);
    EXPECT_EQ(line, "abc");
    closeWriter();
    EXPECT_EQ(lines.next(line, true), LineInput::Got::Line);
    EXPECT_EQ(line, "d");
    EXPECT_EQ(lines.next(line, true), LineInput::Got::End);
}

TEST_F(DescriptorLinesTest, LineAboveTheLimit_IsPassedOverToItsEnd) {
    DescriptorLines lines(ends[0]);
    std::string line;
    const std::string much(30000, 'x');
    LineInput::Got got = LineInput::Got::Nothing;
    for (int i = 0; i < 5; ++i) {
        write(much);
        EXPECT_EQ(lines.next(line, false), LineInput::Got::Nothing);
    }
    write("\nnext\n");
    got = lines.next(line, true);
    EXPECT_EQ(got, LineInput::Got::TooLong);
    EXPECT_EQ(lines.next(line, true), LineInput::Got::Line);
    EXPECT_EQ(line, "next");
}

}  // namespace
}  // namespace zel
