#include <gtest/gtest.h>

#include <sstream>

#include "ZELSim/Device.h"
#include "ZELSim/Modem.h"
#include "ZELSim/Wire.h"

namespace zelsim {
namespace {

struct ModemTest : ::testing::Test {
    Device device{{}};
    Wire wire{device, {}};
    Modem modem{wire, Phonebook::standard()};

    /// Sends, lets the time pass in small steps, and gives what came.
    std::string say(const std::string& bytes, double seconds = 0.1) {
        modem.receive(bytes);
        return listen(seconds);
    }
    std::string listen(double seconds) {
        std::string out = modem.take();
        for (int step = 0; step < static_cast<int>(seconds * 100 + 0.5); ++step) {
            modem.advance(0.01);
            out += modem.take();
        }
        return out;
    }
    void quiet() { say("ATE0\r"); }
    void call(const std::string& number = "5551234") {
        quiet();
        ASSERT_EQ(say("ATDT" + number + "\r", 3), "\r\nCONNECT 19200\r\n");
    }
};

TEST_F(ModemTest, Command_IsEchoedAndAnswered) { EXPECT_EQ(say("AT\r"), "AT\r\r\nOK\r\n"); }

TEST_F(ModemTest, EchoOff_LeavesTheAnswer) {
    quiet();
    EXPECT_EQ(say("AT&F\r"), "\r\nOK\r\n");
    EXPECT_EQ(say("AT\r"), "AT\r\r\nOK\r\n");  // &F has switched the echo on again
}

TEST_F(ModemTest, SeveralCommandsInOneLine_AreAllObeyed) {
    EXPECT_EQ(say("ATE0Q0V1X3\r"), "ATE0Q0V1X3\r\r\nOK\r\n");
    EXPECT_EQ(say("AT&W\r"), "\r\nOK\r\n");
}

TEST_F(ModemTest, QuietModem_SaysNothing) {
    quiet();
    EXPECT_EQ(say("ATQ1\r"), "");
    EXPECT_EQ(say("AT\r"), "");
    EXPECT_EQ(say("ATQ0\r"), "\r\nOK\r\n");
}

TEST_F(ModemTest, UnknownCommand_IsAnError) {
    quiet();
    EXPECT_EQ(say("ATY\r"), "\r\nERROR\r\n");
    EXPECT_EQ(say("ATX9\r"), "\r\nERROR\r\n");
}

TEST_F(ModemTest, NumberOfAFailure_GivesItsWord) {
    quiet();
    EXPECT_EQ(say("ATDT100\r", 10), "\r\nBUSY\r\n");
    EXPECT_EQ(say("ATDT101\r", 10), "\r\nNO CARRIER\r\n");
    EXPECT_EQ(say("ATDT102\r", 10), "\r\nNO DIALTONE\r\n");
    EXPECT_EQ(say("ATDT103\r", 10), "\r\nNO ANSWER\r\n");
    EXPECT_EQ(say("ATDT104\r", 10), "\r\nCONNECT 12000\r\n");
    modem.reset();
    EXPECT_EQ(say("ATDT106\r", 100), "");
}

TEST_F(ModemTest, ResultInPieces_ComesPieceByPiece) {
    quiet();
    EXPECT_EQ(say("ATDT105\r", 2.05), "\r\nC");
    EXPECT_EQ(listen(0.2), "ONN");
    EXPECT_EQ(listen(2), "ECT 19200\r\n");
}

TEST_F(ModemTest, LowestLevel_TellsNoSpeedAndNoTones) {
    quiet();
    say("ATX0\r");
    EXPECT_EQ(say("ATDT1\r", 3), "\r\nCONNECT\r\n");
    modem.reset();
    EXPECT_EQ(say("ATDT100\r", 3), "\r\nNO CARRIER\r\n");
}

TEST_F(ModemTest, Call_ReachesTheInstrument) {
    call();
    EXPECT_TRUE(modem.called());
    EXPECT_EQ(say("GET\r"), "0\r");
    EXPECT_EQ(say("UNIT\r"), "0\r0\r");
}

TEST_F(ModemTest, PlusesWithSilenceAroundThem_GoBackToCommands) {
    call();
    listen(1.1);
    EXPECT_EQ(say("+++", 0.5), "");
    EXPECT_EQ(listen(1), "\r\nOK\r\n");
    EXPECT_EQ(say("ATH0\r"), "\r\nOK\r\n");
    EXPECT_FALSE(modem.called());
}

TEST_F(ModemTest, PlusesWithoutSilence_AreData) {
    call();
    listen(1.1);
    say("\r", 0.2);
    EXPECT_EQ(say("+++", 2), "");
    EXPECT_TRUE(modem.called());
    listen(1);
    say("+++", 0.5);
    EXPECT_EQ(say("x", 2), "");  // no silence after them
}

TEST_F(ModemTest, ReturnToTheCall_GoesOn) {
    call();
    listen(1.1);
    say("+++", 1.5);
    EXPECT_EQ(say("ATO\r"), "\r\nCONNECT 19200\r\n");
    EXPECT_TRUE(modem.called());
}

TEST_F(ModemTest, CharacterWhileDialling_EndsTheDial) {
    quiet();
    say("ATDT101\r", 1);
    EXPECT_EQ(say("AT\r"), "\r\nNO CARRIER\r\n\r\nOK\r\n");
    EXPECT_EQ(listen(20), "");
}

TEST_F(ModemTest, HostThatGoes_HangsUp) {
    call();
    modem.reset();
    EXPECT_FALSE(modem.called());
    EXPECT_EQ(say("AT\r"), "\r\nOK\r\n");
}

TEST(Phonebook, Line_IsReadWithItsOptions) {
    std::istringstream text(
        "# far away\n+49 089 CONNECT\n(030)555 no answer after=30 # nobody\r\n"
        "* BUSY chunk=2 gap=0.5 speed=9600\n");
    Phonebook book;
    std::string problem;
    ASSERT_FALSE(book.read(text, problem));
    EXPECT_EQ(problem, "line 2: there is no result \"089\"");
    text.clear();
    ASSERT_TRUE(book.read(text, problem)) << problem;
    const PhoneEntry nobody = book.find("030-555");
    EXPECT_EQ(nobody.result, CallResult::NoAnswer);
    EXPECT_EQ(nobody.after, 30);
    const PhoneEntry any = book.find("7");
    EXPECT_EQ(any.result, CallResult::Busy);
    EXPECT_EQ(any.chunk, 2U);
    EXPECT_EQ(any.gap, 0.5);
    EXPECT_EQ(any.speed, 9600);
}

TEST(Phonebook, UnknownOption_IsToldWithItsLine) {
    std::istringstream text("\n1 BUSY late=3\n");
    Phonebook book;
    std::string problem;
    EXPECT_FALSE(book.read(text, problem));
    EXPECT_EQ(problem, "line 2: there is no option \"late=3\"");
}

TEST(StrictWire, HostAtAnotherRate_GetsNoiseUntilBaudIsChanged) {
    Device device{{}};
    WireSetup setup;
    setup.strictBaud = true;
    Wire wire(device, setup);
    const auto say = [&](const std::string& bytes) {
        wire.receive(bytes);
        return wire.take();
    };
    EXPECT_EQ(wire.baud(), 57600);
    wire.setHostBaud(9600);
    EXPECT_GE(static_cast<unsigned char>(say("\r").at(0)), 0x80);
    wire.setHostBaud(57600);
    EXPECT_EQ(say("\r"), "0\r");
    EXPECT_EQ(say("set\r"), "0\r");
    EXPECT_EQ(say("BAUD,0\r"), "0\r");
    EXPECT_EQ(wire.baud(), 19200);
    EXPECT_NE(say("\r"), "0\r");
}

}  // namespace
}  // namespace zelsim
