#include <gtest/gtest.h>

#include "tests/connection/Bench.h"

namespace zel {
namespace {

const std::string kBaudHead = "information | Incorrect baud rate | ";
const char* const kSilence = "warning | ZELRemote | No response received!";

/// What a failed attempt leaves on a direct link.
void expectFreeAgain(const Bench& bench) {
    EXPECT_FALSE(bench.forms.controller.isConnected);
    EXPECT_FALSE(bench.forms.main.IsConnectedToPort);
    EXPECT_FALSE(bench.platform.port.isOpen());
    EXPECT_FALSE(bench.forms.main.OnPic.Visible);
    EXPECT_FALSE(bench.forms.controller.Picture3.Visible);
    EXPECT_FALSE(bench.forms.controller.ErrorFlag);
    EXPECT_EQ(bench.forms.main.MousePointer.get(), 0);
    EXPECT_TRUE(bench.forms.main.DialButton.Visible);
    EXPECT_FALSE(bench.forms.main.CancelButton.Visible);
}

TEST_F(Connection, SilenceAtTheStart_IsOneBox) {
    port.expect("\r").silence();
    const std::int64_t ms = time([this] { EXPECT_FALSE(connect()); });
    expectPlayed();
    EXPECT_GE(ms, 9500);
    EXPECT_LE(ms, 9700);
    EXPECT_EQ(shown(), Texts{kAbsent});
    expectFreeAgain(*this);
}

TEST_F(Connection, SilenceAtTheStart_TheNextAttemptWorks) {
    port.expect("\r").silence();
    page().whole();
    EXPECT_FALSE(connect());
    EXPECT_TRUE(connect());
    expectPlayed();
    EXPECT_EQ(shown(), Texts{kAbsent});
}

TEST_F(Connection, EmptyFirstAnswer_IsNoInstrument) {
    port.expect("\r").answer("\r");
    EXPECT_FALSE(connect());
    EXPECT_EQ(shown(), Texts{kAbsent});
    expectFreeAgain(*this);
}

TEST_F(Connection, NoiseThenSilenceAtTheStart_IsTheBaudBoxAndTheAbsence) {
    port.expect("\r").answer("\xFF\xF8");
    EXPECT_FALSE(connect());
    ASSERT_EQ(shown().size(), 2U);
    EXPECT_EQ(shown()[0], kBaudHead + "Incorrect baud rate for the connection!\r\nReceived: " +
                              "\xC3\xBF\xC3\xB8");
    EXPECT_EQ(shown()[1], kAbsent);
    expectFreeAgain(*this);
}

TEST_F(Connection, NoiseAtTheModeWord_IsTheBaudBoxAndTheAbsence) {
    page().wake();
    port.expect("cmd\r").answer("\xFF\xF8");
    EXPECT_FALSE(connect());
    ASSERT_EQ(shown().size(), 2U);
    EXPECT_EQ(shown()[0].rfind(kBaudHead, 0), 0U);
    EXPECT_EQ(shown()[1], kAbsent);
    EXPECT_FALSE(port.isOpen());
}

struct Said {
    const char* request;
    const char* answer;
};
constexpr Said kBeginning[] = {{"\r", "0\r"},
                               {"cmd\r", "0\r"},
                               {"REMOTE\r", "0\r"},
                               {"GET\r", "0\r"},
                               {"IDN?\r", "0\rMarlow & Tenby,9102,12345,1.2\r"},
                               {"GET\r", "0\r"},
                               {"TRACEDET\r", "0\r3\r"},
                               {"GET\r", "0\r"},
                               {"MEAS\r", "0\r1\r"},
                               {"GET\r", "0\r"},
                               {"FREQ\r", "0\r1500\r"},
                               {"GET\r", "0\r"},
                               {"SPAN\r", "0\r10\r"}};
constexpr std::size_t kBeginnings = sizeof kBeginning / sizeof kBeginning[0];

/// The beginning of the handshake, with silence after the request of that index.
template <class Far>
void fallSilent(Far& far, std::size_t silent) {
    for (std::size_t i = 0; i < silent; ++i)
        far.expect(kBeginning[i].request).answer(kBeginning[i].answer);
    far.expect(kBeginning[silent].request).silence();
}

TEST_F(Connection, SilenceAtEachLineOfTheHandshake_IsOneBoxAndTheNextAttemptWorks) {
    for (std::size_t silent = 0; silent < kBeginnings; ++silent) {
        Bench bench;
        fallSilent(bench.port, silent);
        bench.page().whole();
        EXPECT_LE(bench.time([&] { EXPECT_FALSE(bench.connect()); }), 9800) << silent;
        EXPECT_EQ(bench.shown(), Texts{kAbsent}) << silent;
        EXPECT_FALSE(bench.port.isOpen()) << silent;
        bench.platform.boxes.clear();
        EXPECT_TRUE(bench.connect()) << silent;
        bench.expectPlayed();
        EXPECT_EQ(bench.shown(), Texts{}) << silent;
    }
}

TEST_F(Connection, SilenceAtEachLineOverTcp_IsOneBoxAfterOneTimeOut) {
    for (std::size_t silent = 0; silent < kBeginnings; ++silent) {
        Bench bench;
        bench.socket.expect("\r").answer("0\r");  // the probe
        fallSilent(bench.socket, silent);
        EXPECT_LE(bench.time([&] { EXPECT_FALSE(bench.connectTcp()); }), 17000) << silent;
        EXPECT_EQ(bench.shown(), Texts{kAbsent}) << silent;
        EXPECT_EQ(bench.socket.failure(), "") << silent;
        EXPECT_EQ(bench.socket.leftOver(), "") << silent;
    }
}

TEST_F(Connection, IdentityOfAnotherMaker_IsNoInstrument) {
    page({{"IDN?", "Someone Else,9102,12345,1.2"}}).wake().cmd("REMOTE").identity();
    EXPECT_FALSE(connect());
    expectPlayed();
    EXPECT_EQ(shown(), Texts{kAbsent});
    expectFreeAgain(*this);
}

TEST_F(Connection, IdentityName_CountsInItsFirst13CharactersAndItsOwnCase) {
    for (const char* identity : {"12345678Marlow,1,2", "marlow,1,2", "MARLOW,1,2", "", ","}) {
        Bench bench;
        bench.page({{"IDN?", identity}}).wake().cmd("REMOTE").identity();
        EXPECT_FALSE(bench.connect()) << identity;
        EXPECT_EQ(bench.shown(), Texts{kAbsent}) << identity;
    }
    Bench bench;
    bench.page({{"IDN?", "1234567Marlow,1,2"}}).whole();
    EXPECT_TRUE(bench.connect());
}

TEST_F(Connection, WrongIdentity_AfterAFailureThatWasTold_IsNotToldAgain) {
    // Noise that ends in an identity: the baud rate box has raised the flag.
    port.expect("\r").answer("\xFF\r");
    page({{"IDN?", "Someone"}}).cmd("REMOTE").identity();
    EXPECT_FALSE(connect());
    ASSERT_EQ(shown().size(), 1U);
    EXPECT_EQ(shown()[0].rfind(kBaudHead, 0), 0U);
    EXPECT_TRUE(panel.ErrorFlag);
}

TEST_F(Connection, IdentityRefused_EndsTheHandshakeThere) {
    page().wake().cmd("REMOTE").line("GET", "IDN?", "1");
    EXPECT_FALSE(connect());
    expectPlayed();
    EXPECT_EQ(shown(), Texts{"information | ZEL3 Error | Syntax error!  for command <IDN?>\r\n"
                             "Please refer to the ZEL3 Z9 Manual for further instructions."});
}

TEST_F(Connection, QueryRefusedInTheSequence_EndsItWithThePortOpen) {
    const Texts words = {"FREQ",     "SPAN",    "UNIT",    "REFLVL", "RANGE",
                         "DYNRANGE", "SWPTIME", "SWPCONT", "RBW",    "VBW"};
    for (const std::string& refused : words) {
        Bench bench;
        Page page = bench.page().wake().cmd("REMOTE").identity();
        page.get("TRACEDET", "3").get("MEAS", "1");
        for (const std::string& word : words) {
            if (word == refused) {
                page.line("GET", word, "5");
                break;
            }
            page.get(word, "1");
            if (word == "SWPCONT") page.cmd("INIT");
        }
        EXPECT_FALSE(bench.connect()) << refused;
        bench.expectPlayed();
        EXPECT_EQ(bench.shown(),
                  Texts{"information | ZEL3 Error | Out of Range  for command <" + refused +
                        ">\r\nThe parameter value is out of range and cannot be programmed.\r\n"
                        "Please refer to the ZEL3 Z9 Manual for further instructions."})
            << refused;
        EXPECT_TRUE(bench.port.isOpen()) << refused;
        EXPECT_TRUE(bench.dialog.IsConnecting) << refused;
    }
}

TEST_F(Connection, DetectorRefused_EndsTheHandshake) {
    page().wake().cmd("REMOTE").identity().line("GET", "TRACEDET", "2");
    EXPECT_FALSE(connect());
    expectPlayed();
    EXPECT_EQ(shown().size(), 1U);
}

TEST_F(Connection, ModeChangeBehindDetectorRefused_EndsTheHandshake) {
    page().wake().cmd("REMOTE").identity().get("TRACEDET", "-2").set("MEAS,1", "2");
    EXPECT_FALSE(connect());
    expectPlayed();
}

TEST_F(Connection, SweepStartRefused_EndsTheHandshake) {
    Page page = this->page().wake().cmd("REMOTE").identity().detectorModeAndFrequency();
    page.get("SPAN", "1").get("UNIT", "0").get("REFLVL", "0").get("RANGE", "1");
    page.get("DYNRANGE", "1").get("SWPTIME", "1").get("SWPCONT", "1").cmd("INIT", "2");
    EXPECT_FALSE(connect());
    expectPlayed();
    EXPECT_EQ(shown().size(), 1U);
}

TEST_F(Connection, RefusalAfterAFailedHandshake_ThePortIsStillOpenAndSaysSo) {
    page().wake().cmd("REMOTE").identity().line("GET", "TRACEDET", "2");
    connect();
    platform.boxes.clear();
    EXPECT_FALSE(connect());
    EXPECT_EQ(shown().front(), "plain | ZELRemote | Port is already open!");
}

TEST_F(Connection, SilenceOfTheFrequencyMenu_LeavesTheSessionUp) {
    page().wake().cmd("REMOTE").identity().detectorModeAndFrequency().state();
    port.expect("GET\r").silence();
    EXPECT_TRUE(connect());
    expectPlayed();
    EXPECT_EQ(shown(), Texts{kSilence});
}

TEST_F(Connection, PortDiesDuringTheHandshake_IsToldAndEndsAtOnce) {
    page().wake();
    port.expect("cmd\r").answer("0\r").dies();
    EXPECT_LE(time([this] { EXPECT_FALSE(connect()); }), 12000);
    ASSERT_FALSE(shown().empty());
    EXPECT_EQ(shown()[0].rfind("critical | ZELRemote | ", 0), 0U);
    EXPECT_FALSE(panel.isConnected);
}

TEST_F(Connection, PortThatCannotBeHad_IsToldAndNothingIsSent) {
    port.failOpen("No rights on COM3.", 1);
    page().whole();
    EXPECT_FALSE(connect());
    EXPECT_EQ(port.written(), "");
    EXPECT_EQ(shown(), Texts{"warning | ZELRemote | Could not connect to the specified port!\r\n"
                             "No rights on COM3."});
    EXPECT_TRUE(connect());
}

}  // namespace
}  // namespace zel
