// A wait for the instrument says how long it may last and can be left, and the line works again.

#include <string>
#include <utility>

#include "link/WaitNotice.h"
#include "tests/link/Line.h"

namespace zel {
namespace {

struct LeftWait : Line {
    /// The user leaves so many milliseconds from now.
    void leaveAfter(int ms, int graceMs = 0) {
        events.schedule(ms, [this, graceMs] { exchange.leaveWait(graceMs); });
    }
    /// "WAIT" is accepted, and its end does not come.
    void endlessSweep() {
        port.expect("cmd\r").answer("0\r");
        port.expect("WAIT\r").silence();
    }
};

TEST_F(LeftWait, Exchange_EndsAtOnceWithoutABox) {
    endlessSweep();
    leaveAfter(2000);
    bool success = true;
    const std::int64_t ms = time([&] { success = exchange.CmdInstrument("WAIT"); });
    EXPECT_FALSE(success);
    EXPECT_GE(ms, 2000);
    EXPECT_LE(ms, 2050);
    EXPECT_EQ(shown(), Texts{});
    EXPECT_FALSE(state.ExchangeFailed);
    expectPlayed();
}

TEST_F(LeftWait, NextExchange_SendsABareCrFirst) {
    endlessSweep();
    leaveAfter(2000);
    exchange.CmdInstrument("WAIT");
    port.expect("\r").answer("0\r");
    exchangeOf("GET", "FREQ", "0\r1500000000\r");
    exchangeOf("GET", "SPAN", "0\r1000000\r");
    std::string value;
    EXPECT_TRUE(exchange.GetInstrument("FREQ", value));
    EXPECT_EQ(value, "1500000000");
    EXPECT_TRUE(exchange.GetInstrument("SPAN", value));
    EXPECT_EQ(value, "1000000");
    expectPlayed();
}

TEST_F(LeftWait, AnswerWithinTheGrace_StillCounts) {
    port.expect("cmd\r").answer("0\r");
    port.expect("WAIT\r").answer("0\r").after(1500);
    leaveAfter(1000, 1000);
    EXPECT_TRUE(exchange.CmdInstrument("WAIT"));
    EXPECT_FALSE(state.BareCrFirst);
    expectPlayed();
}

TEST_F(LeftWait, StepOfTheDialog_NamesTheSecondsRoundedUp) {
    whileConnecting();
    WaitNotice notice(forms);
    const std::pair<int, const char*> rows[] = {
        {1000, "1 s"}, {1001, "2 s"}, {119'000, "119 s"}, {119'001, "2 min"}, {120'001, "3 min"}};
    for (const auto& [timeoutMs, length] : rows) {
        notice.tell(999, timeoutMs);
        EXPECT_EQ(dialog.AdviceLabel.Caption.get(),
                  "Waiting for the instrument, 0 of " + std::string(length));
    }
    notice.clear();
    EXPECT_EQ(dialog.AdviceLabel.Caption.get(), "");
}

TEST_F(LeftWait, WithNothingUnderWay_LeavesNothing) {
    exchange.leaveWait(0);
    exchangeOf("cmd", "INIT", "0\r");
    EXPECT_TRUE(exchange.CmdInstrument("INIT"));
    expectPlayed();
}

TEST_F(LeftWait, WhileConnecting_TheAttemptIsOverAndNothingIsTold) {
    whileConnecting();
    int abandoned = 0;
    reader.AttemptAbandoned.connect([&] { ++abandoned; });
    port.expect("\r").silence();
    link.WriteToLink("\r");
    showConnectingStep(forms, "Port open");
    std::string step;
    events.schedule(2500, [&] { step = dialog.AdviceLabel.Caption; });
    leaveAfter(3000);
    const std::int64_t ms = time([&] {
        const DialogueScope scope(state);
        reader.ReadAnswer();
    });
    EXPECT_LE(ms, 3050);
    EXPECT_EQ(abandoned, 1);
    EXPECT_EQ(step, "Port open, 2 of 9 s");
    EXPECT_EQ(dialog.AdviceLabel.Caption.get(), "Port open");
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(LeftWait, ProgramThatEnds_WaitsForNothing) {
    endlessSweep();
    events.schedule(500, [this] { state.Ending = true; });
    EXPECT_LE(time([&] { exchange.CmdInstrument("WAIT"); }), 550);
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(LeftWait, LastWord_InTheMiddleOfAnExchange_BeginsWithABareCr) {
    endlessSweep();
    port.expect("\r").answer("0\r");
    port.expect("cmd\r").answer("0\r");
    port.expect("LOCAL\r").answer("0\r");
    events.schedule(500, [this] {
        state.Ending = true;
        exchange.sayLocal();
    });
    EXPECT_LE(time([&] { exchange.CmdInstrument("WAIT"); }), 1000);
    expectPlayed();
}

TEST_F(LeftWait, LastWord_ToASilentInstrument_TakesLessThanTwoSeconds) {
    endlessSweep();
    port.expect("\r").silence();
    port.expect("cmd\r").silence();
    port.expect("LOCAL\r").silence();
    std::int64_t ms = 0;
    events.schedule(500, [&] {
        state.Ending = true;
        ms = time([this] { exchange.sayLocal(); });
    });
    exchange.CmdInstrument("WAIT");
    EXPECT_LE(ms, 1700);
    expectPlayed();
}

TEST_F(LeftWait, LongWait_IsShownWithTheTimeThatItMayStillTake) {
    state.SweepTimeTold = 100;
    endlessSweep();
    Texts texts;
    for (const int ms : {500, 1500, 100010})
        events.schedule(ms, [&] { texts.push_back(panel.WaitLabel.Caption); });
    bool stopSeen = false;
    panel.StopButton.Visible = false;
    events.schedule(1500, [&] { stopSeen = panel.StopButton.Visible; });
    leaveAfter(150000);
    exchange.CmdInstrument("WAIT");
    ASSERT_EQ(texts.size(), 3U);
    EXPECT_EQ(texts[0], "");
    EXPECT_EQ(texts[1], "Waiting for the instrument, at most 4 min more");
    EXPECT_EQ(texts[2], "Waiting for the instrument, at most 109 s more");
    EXPECT_TRUE(stopSeen);
    EXPECT_FALSE(panel.StopButton.Visible);
    EXPECT_EQ(panel.WaitLabel.Caption.get(), "");
}

TEST_F(LeftWait, StopKeyThatWasOnShow_Stays) {
    endlessSweep();
    panel.StopButton.Visible = true;
    leaveAfter(5000);
    exchange.CmdInstrument("WAIT");
    EXPECT_TRUE(panel.StopButton.Visible);
}

TEST_F(Line, SweepTimeThatTheInstrumentTells_BoundsTheWait) {
    exchangeOf("GET", "SWPTIME", "0\r20\r");
    std::string value;
    ASSERT_TRUE(exchange.GetInstrument("SWPTIME", value));
    port.expect("cmd\r").answer("0\r");
    port.expect("WAIT\r").silence();
    const std::int64_t ms = time([&] { exchange.CmdInstrument("WAIT"); });
    EXPECT_GE(ms, 49000);
    EXPECT_LE(ms, 49100);
}

TEST_F(Line, SweepTimeThatWasAccepted_BoundsTheWait_ARefusedOneDoesNot) {
    exchangeOf("set", "SWPTIME,30", "0\r");
    ASSERT_TRUE(exchange.SetInstrument("SWPTIME,30"));
    EXPECT_EQ(state.SweepTimeTold, 30);
    exchangeOf("set", "SWPTIME,5000", "5\r");
    EXPECT_FALSE(exchange.SetInstrument("SWPTIME,5000"));
    EXPECT_EQ(state.SweepTimeTold, 30);
}

TEST_F(Line, SweepTimeOfAYear_EndsAfterADay) {
    state.SweepTimeTold = 365.0 * 86400;
    port.expect("cmd\r").answer("0\r");
    port.expect("WAIT\r").silence();
    const std::int64_t ms = time([&] { exchange.CmdInstrument("WAIT"); });
    EXPECT_GE(ms, 86400000);
    EXPECT_LE(ms, 86400100);
}

TEST(Advice, NamesPortAndBaudRateAndThreeThingsToCheck) {
    Forms forms;
    forms.controller.ConnectionState = ControllerForm::DIRECTCON;
    forms.main.COMList.setText("COM3");
    forms.main.BaudList.setText("57600");
    EXPECT_EQ(connectionAdvice(forms),
              "COM3 at 57600 baud: check that the instrument is on, that its cable is at this "
              "port, and that it is set to 57600 baud");
    forms.controller.ConnectionState = ControllerForm::TCPCON;
    forms.tcpConnection.IPAdressTextBox.Text = "lab";
    forms.tcpConnection.RemotePortTextBox.Text = "2277";
    EXPECT_EQ(connectionAdvice(forms),
              "lab:2277: check that the server runs there, that its instrument is on and "
              "connected, and that no firewall is between");
}

}  // namespace
}  // namespace zel
