#include <gtest/gtest.h>

#include <cctype>
#include <string>

#include "panel/ManualCommand.h"
#include "platform/KeyInput.h"
#include "tests/ShownBoxes.h"
#include "tests/panel/Panel.h"

namespace zel {
namespace {

class StatusWord : public ::testing::TestWithParam<const char*> {};

TEST_P(StatusWord, Line_AnswersAStatusInEitherCase) {
    std::string line = GetParam();
    EXPECT_TRUE(IsStatusCommand(line));
    std::string lower = GetParam();
    for (char& c : lower) c = static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
    EXPECT_TRUE(IsStatusCommand(lower));
    EXPECT_EQ(lower, GetParam());
}

INSTANTIATE_TEST_SUITE_P(Words, StatusWord,
                         ::testing::Values("GET", "SET", "CMD", "INIT", "LOCAL", "LVLADJUST",
                                           "MARKNXTPK", "MARKPK", "MARKMIN", "MARKTOCENT",
                                           "MARKTOLVL", "PRESET", "PWRTOREF", "RECALL", "REMOTE",
                                           "SAVE", "WAIT", "ZERO"));
INSTANTIATE_TEST_SUITE_P(Heads, StatusWord,
                         ::testing::Values("RECALL,1", "LVLADJUST 2", "MARKNXTPKX", "MARKPK1",
                                           "MARKMIN ", "MARKTOCENT,", "LIMDEL,A", "LIMDEL",
                                           "MARKTOLVL1", "PRESET,2", "PWRTOREFX", "REMOTE1",
                                           "RESTART", "SAVE,A", "THROFF", "TRACETOMEM,1", "WAIT 1",
                                           "ZERO,1", "CAL_DTF", "CAL_TGSCLRFL", "CAL_TGSCLTRN,1",
                                           "CAL_TGVECRFL", "CAL_TGVECTRN"));

class DataWord : public ::testing::TestWithParam<const char*> {};

TEST_P(DataWord, Line_AnswersData) {
    std::string line = GetParam();
    EXPECT_FALSE(IsStatusCommand(line));
}

INSTANTIATE_TEST_SUITE_P(Words, DataWord,
                         ::testing::Values("", "FREQ", "GETX", "SET1", "CMDS", "INIT1", "LOCALS",
                                           " WAIT", "IDN?"));

struct ManualCommandTest : PanelSession, ::testing::Test {
    void send(const std::string& line) {
        panel.ManualCommandText.Text = line;
        panel.SendButton.Click();
    }
    std::string shown() const { return panel.ManualCommandTextAnsw.Text; }
};

struct AnswerRow {
    const char* line;
    const char* answer;
    const char* shown;
};

class StatusAnswer : public ManualCommandTest, public ::testing::WithParamInterface<AnswerRow> {};

TEST_P(StatusAnswer, StatusLine_IsTranslated) {
    port.expect(std::string(GetParam().line) + "\r").answer(std::string(GetParam().answer) + "\r");
    send(GetParam().line);
    expectPlayed();
    EXPECT_EQ(shown(), GetParam().shown);
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

INSTANTIATE_TEST_SUITE_P(Answers, StatusAnswer,
                         ::testing::Values(AnswerRow{"GET", "0", "<Ack>: 0"},
                                           AnswerRow{"set", "0", "<Ack>: 0"},
                                           AnswerRow{"cmd", "1", "<Rejected>: 1"},
                                           AnswerRow{"Set", "2", "<Wrong Modus>: 2"},
                                           AnswerRow{"WAIT", "5", "5"}));

TEST_F(ManualCommandTest, CharacterThatTheInstrumentDoesNotKnow_IsRefused) {
    send("NAME,5 \u03A9");
    EXPECT_EQ(port.written(), "");
    EXPECT_EQ(
        shownBoxes(platform.boxes),
        Texts{"plain | ZELRemote | The instrument has no character for \"\u03A9\".\r\nNothing "
              "was sent."});
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

TEST_F(ManualCommandTest, DataLine_ReadsTwoAnswersAndDropsTheStatus) {
    port.expect("FREQ\r").answer("0\r1500000000\r");
    send("FREQ");
    expectPlayed();
    EXPECT_EQ(shown(), "1500000000");
}

TEST_F(ManualCommandTest, DataLine_WhoseAnswerIsASingleZero_IsShownAsAnAcknowledgement) {
    port.expect("FREQ\r").answer("0\r");  // no value comes after the status
    send("FREQ");
    EXPECT_EQ(shown(), "Ack>: 0");  // the first character goes, as of any data
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

TEST_F(ManualCommandTest, DataLineOnTcp_TakesTheRestOfTheBuffer) {
    panel.ConnectionState = CF::TCPCON;
    port.close();
    platform.tcpSocket.connectTo("host", 2277);
    platform.events.pump();
    platform.tcpSocket.expect("FREQ\r").answer("0\r1500000000\r");
    platform.tcpSocket.expect("GET\r").answer("0\r");
    send("FREQ");
    EXPECT_EQ(shown(), "1500000000");
    send("GET");
    EXPECT_EQ(shown(), "<Ack>: 0");
    EXPECT_EQ(platform.tcpSocket.failure(), "");
    EXPECT_EQ(platform.tcpSocket.leftOver(), "");
}

TEST_F(ManualCommandTest, ConnectionThatGoesWhileEventsRun_IsToldInItsOwnWords) {
    platform.events.schedule(0, [this] { panel.isConnected = false; });
    send("WAIT");
    EXPECT_EQ(boxes.texts(), Texts{"Please Connect to the Instrument first."});
    EXPECT_EQ(port.written(), "");
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

TEST_F(ManualCommandTest, FirstKeyStates_BeginAtOne) {
    EXPECT_EQ(panel.ManualFirstKey, 1);
    EXPECT_EQ(panel.SoftBoxFirstKey, 1);
}

TEST_F(ManualCommandTest, LineBehindSet_IsReadAsAStatus) {
    port.expect("SET\r").answer("0\r");
    port.expect("FREQ,1\r").answer("0\r");
    port.expect("FREQ\r").answer("0\r77\r");
    send("SET");
    send("FREQ,1");
    EXPECT_EQ(shown(), "<Ack>: 0");
    send("FREQ");
    EXPECT_EQ(shown(), "77");
    expectPlayed();
}

TEST_F(ManualCommandTest, SetInMixedCase_IsAStatusLineAndLeavesTheNextOneAlone) {
    port.expect("Set\r").answer("0\r");
    port.expect("FREQ\r").answer("0\r77\r");
    send("Set");
    EXPECT_EQ(shown(), "<Ack>: 0");
    send("FREQ");
    EXPECT_EQ(shown(), "77");
    expectPlayed();
}

TEST_F(ManualCommandTest, SetBehindSet_StaysPending) {
    port.expect("set\r").answer("0\r").repeat(1);
    port.expect("FREQ,1\r").answer("0\r");
    send("set");
    send("set");
    send("FREQ,1");
    expectPlayed();
    EXPECT_EQ(shown(), "<Ack>: 0");
}

TEST_F(ManualCommandTest, EachAnswer_ChangesItsColour) {
    port.expect("WAIT\r").answer("0\r").repeat(2);
    panel.ManualCommandTextAnsw.ForeColor = 0;
    send("WAIT");
    EXPECT_EQ(panel.ManualCommandTextAnsw.ForeColor.get(), 255U);
    send("WAIT");
    EXPECT_EQ(panel.ManualCommandTextAnsw.ForeColor.get(), 32896U);
    send("WAIT");
    EXPECT_EQ(panel.ManualCommandTextAnsw.ForeColor.get(), 255U);
}

struct WaitRow {
    MenuItem CF::*kind;
    int ms;
};

class DialledLine : public ManualCommandTest, public ::testing::WithParamInterface<WaitRow> {};

TEST_P(DialledLine, Line_WaitsAheadOfTheAnswer) {
    (panel.*GetParam().kind).Checked = true;
    port.expect("WAIT\r").answer("0\r");
    const std::int64_t before = platform.clock.micros();
    send("WAIT");
    expectPlayed();
    const auto ms = static_cast<double>(platform.clock.micros() - before) / 1000;
    EXPECT_GE(ms, GetParam().ms);
    EXPECT_LT(ms, GetParam().ms + 50);
}

INSTANTIATE_TEST_SUITE_P(Kinds, DialledLine,
                         ::testing::Values(WaitRow{&CF::Modem, 100}, WaitRow{&CF::GSM, 500},
                                           WaitRow{&CF::Direct, 0}));

TEST_F(ManualCommandTest, NotConnected_TellsIt) {
    panel.isConnected = false;
    send("WAIT");
    EXPECT_EQ(boxes.texts(), Texts{"Please connect to the instrument first."});
    EXPECT_EQ(port.written(), "");
}

TEST_F(ManualCommandTest, ContinuousView_Refuses) {
    panel.ContinuosLoopActive = true;
    send("WAIT");
    EXPECT_EQ(boxes.texts(), Texts{kContinuousView});
    EXPECT_EQ(port.written(), "");
}

TEST_F(ManualCommandTest, Silence_LeavesThePanelUsable) {
    port.expect("WAIT\r").silence();
    send("WAIT");
    EXPECT_EQ(boxes.texts(), Texts{"No response received!"});
    EXPECT_EQ(panel.MousePointer.get(), 0);
    EXPECT_EQ(shown(), "");
}

TEST_F(ManualCommandTest, Typing_ReplacesTheDefaultTextAndEnterSends) {
    EXPECT_EQ(panel.ManualCommandText.Text.get(), "Enter a Command");
    port.expect("WAIT\r").answer("0\r");
    typeText(panel.ManualCommandText, "WAIT\r");
    expectPlayed();
    EXPECT_EQ(shown(), "<Ack>: 0");
}

TEST_F(ManualCommandTest, AnyKeyDown_TakesTheDefaultTextAway) {
    pressKey(panel.ManualCommandText, kKeyRight);
    EXPECT_EQ(panel.ManualCommandText.Text.get(), "");
}

TEST_F(ManualCommandTest, EditKey_KeepsTheText) {
    panel.ManualCommandText.Text = "FRE";
    pressKey(panel.ManualCommandText, kKeyRight);
    typeText(panel.ManualCommandText, "Q");
    EXPECT_EQ(panel.ManualCommandText.Text.get(), "FREQ");
}

TEST_F(ManualCommandTest, TypingUnconnected_IsToldOnce) {
    panel.isConnected = false;
    typeText(panel.ManualCommandText, "WAIT\r");
    EXPECT_EQ(boxes.texts(), Texts{kNotConnected});
    EXPECT_TRUE(panel.ErrorFlag);
}

TEST_F(ManualCommandTest, RemoteToggle_SendsRemoteAndLocalInTurn) {
    panel.OnOffButton.Caption = "R";
    cmd("REMOTE");
    cmd("LOCAL");
    panel.OnOffButton.Click();
    EXPECT_EQ(panel.OnOffButton.Caption.get(), "L");
    panel.OnOffButton.Click();
    EXPECT_EQ(panel.OnOffButton.Caption.get(), "R");
    expectPlayed();
}

TEST_F(ManualCommandTest, LocalKey_SendsLocal) {
    cmd("LOCAL");
    panel.LocalButton.Click();
    expectPlayed();
}

}  // namespace
}  // namespace zel
