#include <gtest/gtest.h>

#include "connection/Dialling.h"
#include "tests/connection/Bench.h"

namespace zel {
namespace {

using CF = ControllerForm;

constexpr const char* kNumber = "ATDT5551234\r";
constexpr const char* kConnected = "\r\nCONNECT 19200\r\n";

struct DiallingTest : Connection {
    DiallingTest() { choose(panel.Modem); }

    /// The menu entry, with its dialog closed at once, and a number.
    void choose(MenuItem& item) {
        later(1, [this] { dialog.Hide(); });
        item.Click();
        dialog.COMList.setText("COM3");
        dialog.BaudList.setText("57600");
        dialog.TelNumberBox.Text = " 5551234 ";
    }
    void modemCommands() {
        for (const char* command : {"AT&F\r", "AT&F0\r", "ATX3\r"})
            port.expect(command).answer("\r\nOK\r\n");
    }
    Dialogue& dialled() {
        modemCommands();
        return port.expect(kNumber);
    }
    void dial() { dialog.DialButton.Click(); }
    void expectRest() {
        expectPlayed();
        EXPECT_FALSE(port.isOpen());
        EXPECT_FALSE(panel.isConnected);
        EXPECT_FALSE(dialog.Dialling);
        EXPECT_TRUE(dialog.DialButton.Visible);
        EXPECT_FALSE(dialog.CancelButton.Visible);
        EXPECT_TRUE(dialog.DisconnectButton2.Enabled);
        EXPECT_EQ(dialog.MousePointer.get(), 0);
    }
};

TEST_F(DiallingTest, MenuEntries_ChooseTheirKinds) {
    const std::pair<MenuItem*, int> kinds[] = {{&panel.Modem, CF::MODEMCON},
                                               {&panel.GSM, CF::GSMCON},
                                               {&panel.ModemToGSM, CF::MODEMGSMCON},
                                               {&panel.GSMToModem, CF::GSMMODEMCON}};
    for (const auto& [item, kind] : kinds) {
        choose(*item);
        EXPECT_EQ(panel.ConnectionState, kind);
        EXPECT_TRUE(dialog.ModemConnectionFrame.Visible);
        EXPECT_TRUE(dialog.DialButton.Visible);
        EXPECT_TRUE(dialog.SaveSettingsButton.Visible);
        EXPECT_FALSE(dialog.ZELButton.Visible);
    }
}

TEST_F(DiallingTest, DialogShownAgainInASession_HidesCancelAndTheFrameOfTheOtherKind) {
    panel.isConnected = true;  // what the dialog holds stays
    dialog.CancelButton.Visible = true;
    choose(panel.Modem);
    EXPECT_FALSE(dialog.CancelButton.Visible);
    EXPECT_TRUE(dialog.ModemConnectionFrame.Visible);
    later(1, [this] {
        EXPECT_FALSE(dialog.ModemConnectionFrame.Visible);
        EXPECT_TRUE(dialog.DirectConnectionFrame.Visible);
        dialog.Hide();
    });
    panel.Direct.Click();
    EXPECT_FALSE(dialog.ModemConnectionFrame.Visible);
    panel.isConnected = false;
}

TEST_F(DiallingTest, Call_DialsTheTrimmedNumberAndOpensTheSession) {
    dialled().answer(kNumber).answer(kConnected).after(3000);
    page().whole();
    LinkAddress address{LinkAddress::Kind::TwoModems, "COM3", 57600};
    address.phone = " 5551234 ";
    bool answerSeen = false;
    panel.DebugTextBox.Changed.connect(
        [&] { answerSeen = answerSeen || status() == "----->" + std::string(kConnected); });
    EXPECT_TRUE(program.connect(address, false));
    EXPECT_TRUE(answerSeen);
    expectPlayed();
    EXPECT_TRUE(panel.isConnected);
    EXPECT_TRUE(dialog.ModemConnected);
    EXPECT_EQ(dialog.AirBaudRateText.Text.get(), " CONNECT 19200 ");
    EXPECT_TRUE(dialog.DisconnectButton2.Enabled);
    EXPECT_FALSE(dialog.Dialling);
}

TEST_F(DiallingTest, Call_ToAPhone_WakesItWithAtAlone) {
    choose(panel.GSM);
    port.expect("AT\r").answer("\r\nOK\r\n");
    port.expect(kNumber).answer("\r\nBUSY\r\n");
    dial();
    expectRest();
    EXPECT_EQ(shown(), Texts{"critical | ZELRemote | The line was busy!\r\nPlease try again"});
}

TEST_F(DiallingTest, Call_PhoneToModem_WakesAPhone) {
    choose(panel.GSMToModem);
    port.expect("AT\r").answer("OK\r");
    port.expect(kNumber).answer("BUSY\r");
    dial();
    expectRest();
}

TEST_F(DiallingTest, Call_ModemToPhone_WakesAModem) {
    choose(panel.ModemToGSM);
    dialled().answer("BUSY\r");
    dial();
    expectRest();
}

TEST_F(DiallingTest, Words_OfAFailedCall_AreTold) {
    const std::pair<const char*, const char*> words[] = {
        {"\r\nCONNECT 12000\r\n", "The speed of the connection was lower than 19200!"},
        {"\r\nNO DIALTONE\r\n", "No Dialtone!"},
        {"\r\nNO CARRIER\r\n", "The carrier did not respond!"}};
    for (const auto& [word, message] : words) {
        boxes.clear();
        dialled().answer(word).after(1500);
        dial();
        expectRest();
        EXPECT_EQ(shown(),
                  Texts{"critical | ZELRemote | " + std::string(message) + "\r\nPlease try again"});
    }
}

TEST(CallProblem, Words_AreLookedForInTheirOrder) {
    EXPECT_STREQ(callProblem("BUSY 12000"), "The speed of the connection was lower than 19200!");
    EXPECT_STREQ(callProblem("NO CARRIER NO DIALTONE"), "No Dialtone!");
    EXPECT_EQ(callProblem("CONNECT 19200"), nullptr);
}

TEST(CallAnswer, EchoAndLateOk_AreNoAnswer) {
    EXPECT_EQ(callAnswer("\r\nOK\r\nATDT1\r\r\nBUSY\r\n", "ATDT1\r"), "\r\nBUSY\r\n");
    EXPECT_EQ(callAnswer("\r\nOK\r\n", "ATDT1\r"), "");
    EXPECT_EQ(callAnswer("BUSY", "ATDT1\r"), "BUSY");
}

TEST_F(DiallingTest, FirstDial_LooksOnceForEachOk) {
    // A modem that answers late: each wait of a first dial ends after one reading.
    for (const char* command : {"AT&F\r", "AT&F0\r", "ATX3\r"})
        port.expect(command).answer("\r\nOK\r\n").after(150);
    port.expect(kNumber).answer("\r\nBUSY\r\n").after(1200);
    EXPECT_LT(time([this] { dial(); }), 5000);
    expectRest();
}

TEST_F(DiallingTest, LaterDialWithin7Seconds_WaitsInFull) {
    dialled().answer("\r\nBUSY\r\n");
    dial();
    boxes.clear();
    port.expect("AT&F\r").answer("\r\nOK\r\n").after(3000);
    port.expect("AT&F0\r").silence();
    port.expect("ATX3\r").silence();
    port.expect(kNumber).answer("\r\nBUSY\r\n");
    EXPECT_GE(time([this] { dial(); }), 3000);
    expectRest();
}

TEST_F(DiallingTest, QuietModem_IsToldToSpeak) {
    for (const char* command : {"AT&F\r", "AT&F0\r", "ATX3\r"}) port.expect(command).silence();
    port.expect("ATQ0\r").answer("\r\nOK\r\n");
    port.expect(kNumber).answer("\r\nBUSY\r\n");
    dial();
    expectRest();
    EXPECT_EQ(shown(), Texts{"critical | ZELRemote | The line was busy!\r\nPlease try again"});
}

TEST_F(DiallingTest, NoModem_IsToldAfter7Seconds) {
    for (const char* command : {"AT&F\r", "AT&F0\r", "ATX3\r", "ATQ0\r"})
        port.expect(command).silence();
    const std::int64_t ms = time([this] { dial(); });
    EXPECT_GE(ms, 7000);
    EXPECT_LE(ms, 8000);
    expectRest();
    EXPECT_EQ(shown(), Texts{"critical | ZELRemote | No modem found at this port!"});
}

TEST_F(DiallingTest, AnswerOfLessThanFiveCharacters_WaitsForTheFifth) {
    dialled().answer("BUSY").after(1500).answer("\r").after(4000);
    EXPECT_GE(time([this] { dial(); }), 5500);
    expectRest();
    EXPECT_EQ(shown(), Texts{"critical | ZELRemote | The line was busy!\r\nPlease try again"});
}

TEST_F(DiallingTest, BytesThatComeInAPause_DoNotLengthenIt) {
    dialled().answer(kNumber).answer("\r\nBUSY").after(1100).answer("\r\n").after(500);
    EXPECT_LE(time([this] { dial(); }), 3100);
    expectRest();
}

TEST_F(DiallingTest, SpeedThatComesBehindConnect_IsWaitedFor) {
    dialled().answer("\r\nCONNECT ").after(1200).answer("12000\r\n").after(1300);
    dial();
    expectRest();
    EXPECT_EQ(dialog.AirBaudRateText.Text.get(), " CONNECT 12000 ");
    EXPECT_EQ(shown(), Texts{"critical | ZELRemote | The speed of the connection was lower than "
                             "19200!\r\nPlease try again"});
}

TEST_F(DiallingTest, SilentFarEnd_EndsAfterTwoMinutes) {
    dialled().silence();
    const std::int64_t ms = time([this] { dial(); });
    EXPECT_GE(ms, 120'000);
    EXPECT_LE(ms, 123'000);
    expectRest();
    EXPECT_EQ(shown(),
              Texts{"critical | ZELRemote | The carrier did not respond!\r\nPlease try again"});
}

TEST_F(DiallingTest, OpenPort_IsToldOnce) {
    SerialSetup setup;
    port.open(setup);
    dial();
    dial();
    EXPECT_EQ(shown(), Texts{"critical | ZELRemote | Port already opened!"});
    EXPECT_TRUE(port.isOpen());
}

TEST_F(DiallingTest, PortThatCannotBeHad_IsToldOnce) {
    port.failOpen("held", 1);
    dial();
    EXPECT_EQ(shown(),
              Texts{"warning | ZELRemote | Could not connect to the specified port!\r\nheld"});
    EXPECT_EQ(dialog.MousePointer.get(), 0);
    EXPECT_TRUE(dialog.DialButton.Visible);
}

TEST_F(DiallingTest, PortThatGoesUnderTheDial_IsTold) {
    dialled().silence();
    later(5000, [this] { port.die(); });
    dial();
    expectRest();
    ASSERT_EQ(shown().size(), 1U);
    EXPECT_EQ(shown()[0].substr(0, 37), "critical | ZELRemote | Port not open!");
}

// In every loop: while the modem wakes, while it is confirmed, while the far end rings, while the
// rest of the line comes, while the carrier settles, and in the handshake.
TEST(DiallingCancel, AtAnyMoment_EndsTheDialWithoutABox) {
    for (int ms = 10; ms < 24'000; ms += 170) {
        Bench bench;
        bench.panel.ConnectionState = CF::MODEMCON;
        bench.dialog.load();
        bench.dialog.COMList.setText("COM3");
        bench.dialog.TelNumberBox.Text = "1";
        ScriptedPort& port = bench.port;
        for (const char* command : {"AT&F\r", "AT&F0\r", "ATX3\r"}) port.expect(command).silence();
        port.expect("ATQ0\r").answer("\r\nOK\r\n").after(3000);
        port.expect("ATDT1\r").answer("\r\nCONN").after(6000).answer("ECT 19200\r\n").after(300);
        port.expect("\r").silence();
        bench.later(ms, [&] {
            if (bench.dialog.CancelButton.Visible) bench.dialog.CancelButton.Click();
        });
        const std::int64_t lasted = bench.time([&] { bench.dialog.DialButton.Click(); });
        EXPECT_EQ(bench.shown(), Texts{}) << ms;
        EXPECT_FALSE(port.isOpen()) << ms;
        EXPECT_TRUE(bench.dialog.DialButton.Visible) << ms;
        EXPECT_TRUE(bench.dialog.DisconnectButton2.Enabled) << ms;
        EXPECT_EQ(bench.panel.TimeLabel.Caption.get(), "00:00:00") << ms;
        EXPECT_LE(lasted, ms + 600) << ms;
        EXPECT_EQ(port.failure(), "") << ms;
    }
}

TEST_F(DiallingTest, CancelledDial_LeavesLaterFailuresTold) {
    dialled().silence();
    later(3000, [this] { dialog.CancelButton.Click(); });
    dial();
    EXPECT_EQ(shown(), Texts{});
    port.expect("\r").silence();
    panel.ConnectionState = CF::DIRECTCON;
    dialog.ZELButton.Click();
    EXPECT_EQ(shown(), Texts{kAbsent});
}

TEST_F(DiallingTest, SilentInstrument_IsToldAndTheCallIsEnded) {
    dialled().answer(kConnected);
    port.expect("\r").silence();
    dial();
    expectRest();
    EXPECT_EQ(shown(), Texts{kAbsent});
    EXPECT_FALSE(dialog.ModemConnected);
}

}  // namespace
}  // namespace zel
