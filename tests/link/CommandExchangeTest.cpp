#include <gtest/gtest.h>

#include <algorithm>
#include <functional>
#include <string>

#include "platform/virtual/VirtualTime.h"
#include "tests/link/Line.h"

namespace zel {
namespace {

const char* const kSilence = "warning | ZELRemote | No response received!";
const std::string kManual = "\r\nPlease refer to the ZEL3 Z9 Manual for further instructions.";

TEST_F(Line, Cmd_Dialogue_IsModeWordThenKeyword) {
    exchangeOf("cmd", "REMOTE", "0\r");
    EXPECT_TRUE(exchange.CmdInstrument("REMOTE"));
    expectPlayed();
    EXPECT_EQ(port.written(), "cmd\rREMOTE\r");
    EXPECT_EQ(shown(), Texts{});
    EXPECT_EQ(status(), "CMD <REMOTE> finished (0.00 s)");
}

TEST_F(Line, Cmd_FinishedLine_NamesTheSeconds) {
    port.expect("cmd\r").answer("0\r").after(20);
    port.expect("INIT\r").answer("0\r").after(1230);
    EXPECT_TRUE(exchange.CmdInstrument("INIT"));
    EXPECT_EQ(status(), "CMD <INIT> finished (1.25 s)");
}

TEST_F(Line, Exchange_CharacterThatTheInstrumentDoesNotKnow_IsRefusedAndNothingIsSent) {
    const std::string refused =
        "plain | ZELRemote | The instrument has no character for \"\u03A9\".\r\nNothing was sent.";
    std::string value = "old";
    EXPECT_FALSE(exchange.SetInstrument("NAME,5 \u03A9"));
    EXPECT_FALSE(exchange.GetInstrument("\u03A9", value));
    EXPECT_FALSE(exchange.CmdInstrument("\u03A9"));
    EXPECT_EQ(port.written(), "");
    EXPECT_EQ(shown(), (Texts{refused, refused, refused}));
    EXPECT_EQ(value, "old");
    EXPECT_FALSE(state.ExchangeFailed);
}

TEST_F(Line, Exchange_TextThatGoesOutAndComesBack_IsTheSame) {
    exchangeOf("set", "NAME,\xE4 \xC3\xA4", "0\r");
    port.expect("GET\r").answer("0\r");
    port.expect("NAME\r").answer("0\r\xE4 \xC3\xA4\r");
    std::string value;
    EXPECT_TRUE(exchange.SetInstrument("NAME,\u00E4 \u00C3\u00A4"));
    EXPECT_TRUE(exchange.GetInstrument("NAME", value));
    expectPlayed();
    EXPECT_EQ(value, "\u00E4 \u00C3\u00A4");
}

TEST_F(Line, Cmd_LinesOfTheDialogue_FollowOneAnother) {
    exchangeOf("cmd", "INIT", "0\r");
    Texts lines;
    panel.DebugTextBox.Changed.connect([&] { lines.push_back(status()); });
    exchange.CmdInstrument("INIT");
    EXPECT_EQ(lines,
              (Texts{"CMD <INIT> starting", "<INIT> response: 0", "CMD <INIT> finished (0.00 s)"}));
}

TEST_F(Line, Cmd_LeftOvers_AreDrainedAheadOfTheModeWord) {
    state.InputBuffer = "5\r";
    port.arrive("7\r");
    exchangeOf("cmd", "INIT", "0\r");
    EXPECT_TRUE(exchange.CmdInstrument("INIT"));
}

TEST_F(Line, Exchange_LineThatNeverFallsSilent_IsReadFiveTimesBeforeTheModeWord) {
    const std::function<void()> exchanges[] = {
        [this] { exchange.CmdInstrument("INIT"); },
        [this] { exchange.SetInstrument("RBW,1"); },
        [this] {
            std::string value;
            exchange.GetInstrument("FREQ", value);
        },
    };
    debug.whenSpoken = [this](const std::string& text) {
        if (text == "<-x") port.arrive("x");
    };
    for (const auto& run : exchanges) {
        port.arrive("x");
        debug.entries.clear();
        const auto isModeWord = [](const auto& entry) { return entry.text.rfind("->", 0) == 0; };
        run();
        const auto word = std::find_if(debug.entries.begin(), debug.entries.end(), isModeWord);
        ASSERT_NE(word, debug.entries.end());
        EXPECT_EQ(word - debug.entries.begin(), 5);
        link.takeBytes();
    }
}

TEST_F(Line, Cmd_ModeWordRefused_EndsWithTheBox) {
    port.expect("cmd\r").answer("1\r");
    EXPECT_FALSE(exchange.CmdInstrument("INIT"));
    expectPlayed();
    EXPECT_EQ(shown(),
              Texts{"information | ZEL3 Error | Syntax error!  for command <INIT>" + kManual});
    EXPECT_EQ(status(), "CMD <INIT> finished (0.00 s)");
}

TEST_F(Line, Cmd_KeywordStatus2_IsTold) {
    exchangeOf("cmd", "INIT", "2\r");
    EXPECT_FALSE(exchange.CmdInstrument("INIT"));
    EXPECT_EQ(shown(), Texts{"information | ZEL3 Error | Execution error  for command <INIT>\r\n"
                             "Command is not allowed in the current measurement mode" +
                             kManual});
}

TEST_F(Line, Cmd_AnyOtherKeywordStatus_IsShownInTheLineOnly) {
    for (const char* answer : {"1", "3", "4", "5", "6", "7", "42"}) {
        LineSetup rig;
        rig.exchangeOf("cmd", "INIT", std::string(answer) + "\r");
        Texts lines;
        rig.panel.DebugTextBox.Changed.connect([&] { lines.push_back(rig.status()); });
        EXPECT_FALSE(rig.exchange.CmdInstrument("INIT")) << answer;
        EXPECT_EQ(rig.shown(), Texts{}) << answer;
        ASSERT_EQ(lines.size(), 4U);
        EXPECT_EQ(lines[2],
                  "CMD error " + std::string(answer) + " for command <INIT> (while executing)");
    }
}

TEST_F(Line, Cmd_JunkStatus_CountsAs0) {
    port.expect("cmd\r").answer("junk\r");
    port.expect("INIT\r").answer("?!?\r");
    EXPECT_TRUE(exchange.CmdInstrument("INIT"));
}

TEST_F(Line, Cmd_EmptyFirstAnswer_IsReadAgain) {
    port.expect("cmd\r").answer("\r").answer("0\r").after(400);
    port.expect("INIT\r").answer("0\r");
    EXPECT_TRUE(exchange.CmdInstrument("INIT"));
    expectPlayed();
}

TEST_F(Line, Cmd_SilenceOnTheModeWord_IsOneBoxAndFalse) {
    port.expect("cmd\r").silence();
    const std::int64_t ms = time([&] { EXPECT_FALSE(exchange.CmdInstrument("INIT")); });
    EXPECT_GE(ms, 9000);
    EXPECT_LE(ms, 9200);
    EXPECT_EQ(shown(), Texts{kSilence});
    EXPECT_EQ(status(), "CMD <INIT> starting");
    EXPECT_TRUE(panel.isConnected);
}

TEST_F(Line, Cmd_SilenceOnTheKeyword_IsOneBoxAndFalse) {
    port.expect("cmd\r").answer("0\r");
    port.expect("INIT\r").silence();
    const std::int64_t ms = time([&] { EXPECT_FALSE(exchange.CmdInstrument("INIT")); });
    EXPECT_LE(ms, 9200);
    EXPECT_EQ(shown(), Texts{kSilence});
    EXPECT_TRUE(exchange.ExchangeFailed());
}

TEST_F(Line, Cmd_ClosedPort_RepeatsTheBoxForFiveSeconds) {
    port.close();
    panel.ErrorFlag = true;
    const std::int64_t ms = time([&] { EXPECT_FALSE(exchange.CmdInstrument("INIT")); });
    EXPECT_GT(ms, 5000);
    EXPECT_LE(ms, 5100);
    EXPECT_GT(shown().size(), 1U);
    EXPECT_EQ(shown().back(), "critical | ZELRemote | Port not open!");
    EXPECT_EQ(port.written(), "");
}

TEST_F(Line, Cmd_Wait_LengthensEveryLaterReadUntilTheNextCommand) {
    state.SweepTimeTold = 2;
    exchangeOf("cmd", "WAIT", "0\r");
    port.expect("set\r").silence();
    port.expect("cmd\r").answer("0\r");
    port.expect("INIT\r").silence();
    ASSERT_TRUE(exchange.CmdInstrument("WAIT"));
    EXPECT_GE(time([&] { exchange.SetInstrument("RBW,1"); }), 13000);
    EXPECT_LE(time([&] { exchange.CmdInstrument("INIT"); }), 9500);
    expectPlayed();
}

TEST_F(Line, Cmd_WaitItself_MayLastTwoSweepsLonger) {
    state.SweepTimeTold = 2;
    port.expect("cmd\r").answer("0\r");
    port.expect("WAIT\r").answer("0\r").after(12900);
    EXPECT_TRUE(exchange.CmdInstrument("WAIT"));
}

TEST_F(Line, Cmd_WaitInOtherWords_IsNotRecognised) {
    for (const char* word : {"wait", "WAIT,1", "WAIT ", "Wait"}) {
        exchangeOf("cmd", word, "0\r");
        EXPECT_TRUE(exchange.CmdInstrument(word));
        EXPECT_FALSE(state.WaitCommandActive) << word;
    }
}

TEST_F(Line, Cmd_RefusedModeWord_LeavesTheWaitStateAsItWas) {
    exchangeOf("cmd", "WAIT", "0\r");
    port.expect("cmd\r").answer("1\r");
    exchange.CmdInstrument("WAIT");
    exchange.CmdInstrument("INIT");
    EXPECT_TRUE(state.WaitCommandActive);
}

TEST_F(Line, Cmd_Tcp_DialogueIsTheSame) {
    overTcp();
    socket.expect("cmd\r").answer("0\r");
    socket.expect("INIT\r").answer("0\r");
    EXPECT_TRUE(exchange.CmdInstrument("INIT"));
    expectPlayed();
}

TEST_F(Line, Midnight_DuringAnExchange_GivesANegativeTime) {
    platform.clock.setDate(dateOf(2026, 1, 1, 23, 59, 59.5));
    port.expect("cmd\r").answer("0\r").after(1000);
    port.expect("INIT\r").answer("0\r");
    EXPECT_TRUE(exchange.CmdInstrument("INIT"));
    EXPECT_EQ(status(), "CMD <INIT> finished (-86399.00 s)");
}

TEST_F(Line, LateAnswer_DoesNotUpsetTheNextExchange) {
    port.expect("set\r").answer("5\r").after(9500);
    exchangeOf("set", "RBW,1", "0\r");
    EXPECT_FALSE(exchange.SetInstrument("RBW,1"));
    events.runFor(1000);
    EXPECT_TRUE(exchange.SetInstrument("RBW,1"));
    expectPlayed();
    EXPECT_EQ(shown(), Texts{kSilence});
}

TEST_F(Line, Set_Dialogue_IsModeWordThenKeywordAndValue) {
    exchangeOf("set", "FREQ,1500000000", "0\r");
    EXPECT_TRUE(exchange.SetInstrument("FREQ,1500000000"));
    expectPlayed();
    EXPECT_EQ(port.written(), "set\rFREQ,1500000000\r");
    EXPECT_EQ(status(), "SET <FREQ,1500000000> finished (0.00 s)");
}

TEST_F(Line, Set_LinesOfTheDialogue_FollowOneAnother) {
    exchangeOf("set", "RBW,1", "0\r");
    Texts lines;
    panel.DebugTextBox.Changed.connect([&] { lines.push_back(status()); });
    exchange.SetInstrument("RBW,1");
    EXPECT_EQ(lines, (Texts{"SET <RBW,1> starting", "<RBW,1> response:  0",
                            "SET <RBW,1> finished (0.00 s)"}));
}

TEST_F(Line, Set_LeftOvers_AreDrained) {
    state.InputBuffer = "5\r";
    port.arrive("7\r");
    exchangeOf("set", "RBW,1", "0\r");
    EXPECT_TRUE(exchange.SetInstrument("RBW,1"));
}

TEST_F(Line, Set_ModeWordRefused_EndsWithTheBoxOfTheWholeLine) {
    port.expect("set\r").answer("4\r");
    EXPECT_FALSE(exchange.SetInstrument("RBW,1"));
    expectPlayed();
    EXPECT_EQ(shown(),
              Texts{"information | ZEL3 Error | Not Allowed  for command <RBW,1>\r\n"
                    "In the current state of the instrument setting this parameter or value is "
                    "not allowed." +
                    kManual});
    EXPECT_EQ(status(), "SET <RBW,1> finished (0.00 s)");
}

TEST_F(Line, Set_ValueOutOfRange_IsToldWithKeywordAndValue) {
    exchangeOf("set", "FREQ,-1", "5\r");
    EXPECT_FALSE(exchange.SetInstrument("FREQ,-1"));
    EXPECT_EQ(shown(), Texts{"information | ZEL3 Error | Out of Range  for command <FREQ,-1>\r\n"
                             "The parameter value is out of range and cannot be programmed." +
                             kManual});
}

TEST_F(Line, Set_SilenceOnEitherLine_IsOneBoxAndFalse) {
    port.expect("set\r").silence();
    EXPECT_LE(time([&] { EXPECT_FALSE(exchange.SetInstrument("RBW,1")); }), 9200);
    EXPECT_EQ(shown(), Texts{kSilence});
    LineSetup second;
    second.port.expect("set\r").answer("0\r");
    second.port.expect("RBW,1\r").silence();
    EXPECT_LE(second.time([&] { EXPECT_FALSE(second.exchange.SetInstrument("RBW,1")); }), 9200);
    EXPECT_EQ(second.shown(), Texts{kSilence});
}

TEST_F(Line, Set_EmptyAnswer_IsNotReadAgain) {
    port.expect("set\r").answer("\r");
    port.expect("RBW,1\r").answer("0\r");
    EXPECT_EQ(time([&] { EXPECT_TRUE(exchange.SetInstrument("RBW,1")); }), 0);
}

struct Triggered : Line {
    bool run(int seconds = 2) { return exchange.CmdInstrumentTriggered("WAIT", seconds); }
};

TEST_F(Triggered, Dialogue_SucceedsAndLeavesTheWaitStateAlone) {
    exchangeOf("cmd", "WAIT", "0\r");
    EXPECT_TRUE(run());
    expectPlayed();
    EXPECT_FALSE(state.WaitCommandActive);
}

TEST_F(Triggered, Pointer_IsTheHourglassMeanwhile) {
    port.expect("cmd\r").answer("0\r").after(100);
    port.expect("WAIT\r").answer("0\r");
    int pointer = 0;
    events.schedule(50, [&] { pointer = panel.MousePointer; });
    run();
    EXPECT_EQ(pointer, 11);
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

TEST_F(Triggered, LeftOvers_AreNotDrained) {
    port.arrive("1\r");
    port.expect("cmd\r").silence();
    EXPECT_FALSE(run());
    EXPECT_EQ(port.written(), "cmd\r");
}

TEST_F(Triggered, EmptyFirstAnswer_IsAFailureWithoutABox) {
    port.expect("cmd\r").answer("\r");
    EXPECT_FALSE(run());
    EXPECT_EQ(shown(), Texts{});
    EXPECT_EQ(port.written(), "cmd\r");
}

TEST_F(Triggered, NoTrigger_EndsAtTheCallersTimeOut) {
    port.expect("cmd\r").answer("0\r");
    port.expect("WAIT\r").silence();
    const std::int64_t ms = time([&] { EXPECT_FALSE(run(4)); });
    EXPECT_GE(ms, 4000);
    EXPECT_LE(ms, 4100);
    EXPECT_EQ(shown(), Texts{"warning | ZELRemote | External trigger timed out!"});
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

TEST_F(Triggered, SilentFirstAnswer_SendsNoKeyword) {
    port.expect("cmd\r").silence();
    EXPECT_FALSE(run(1));
    EXPECT_EQ(port.written(), "cmd\r");
}

}  // namespace
}  // namespace zel
