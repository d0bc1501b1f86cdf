#include "tests/ZELSim/WireFixture.h"

namespace zelsim {
namespace {

TEST(Wire, BareCarriageReturn_IsAnsweredWithAStatusLine) {
    Host host;
    EXPECT_EQ(host.say(""), "0\r");
}

TEST(Wire, ModeWord_IsTakenInEitherCase) {
    for (const char* word : {"GET", "get", "Get"}) {
        Host host;
        EXPECT_EQ(host.say(word), "0\r") << word;
        EXPECT_EQ(host.say("FREQ"), "0\r1500000000\r") << word;
    }
}

TEST(Wire, Word_IsTakenInEitherCaseAndWithBlanks) {
    Host host;
    host.setUp({"freq, 100000000"});
    EXPECT_EQ(host.value("freq"), "100000000");
}

TEST(Wire, LineFeed_IsPassedOver) {
    Host host;
    host.wire.receive("\r\nGET\r\nIDN?\r\n");
    EXPECT_EQ(host.wire.take(), "0\r0\r0\rMarlow&Tenby,9102,100234,V2.31\r");
}

TEST(Wire, UnknownModeWord_IsASyntaxErrorAndBeginsNoExchange) {
    Host host;
    EXPECT_EQ(host.say("PUT"), "1\r");
    EXPECT_EQ(host.get("UNIT"), "0\r0\r");
}

TEST(Wire, BareCarriageReturnInPlaceOfTheSecondLine_EndsTheExchange) {
    Host host;
    EXPECT_EQ(host.say("GET"), "0\r");
    EXPECT_EQ(host.say(""), "1\r");
    EXPECT_EQ(host.get("UNIT"), "0\r0\r");
}

TEST(Wire, UnknownWord_IsASyntaxError) {
    Host host;
    EXPECT_EQ(host.get("NIX"), "1\r");
}

TEST(Wire, WordOfAnotherVerb_IsASyntaxError) {
    Host host;
    EXPECT_EQ(host.cmd("REMOTE"), "0\r");
    EXPECT_EQ(host.cmd("FREQ"), "1\r");
    EXPECT_EQ(host.set("IDN,1"), "1\r");
    EXPECT_EQ(host.get("INIT"), "1\r");
    EXPECT_EQ(host.set("FREQ"), "1\r");
    EXPECT_EQ(host.get("FREQ,1"), "1\r");
}

TEST(Wire, ValueThatIsNoNumber_IsASyntaxError) {
    Host host;
    host.setUp({});
    for (const char* value : {"", "abc", "1.5 GHz", "nan", "inf", "1,5", "0x10"}) {
        EXPECT_EQ(host.set(std::string("FREQ,") + value), "1\r") << value;
    }
}

TEST(Wire, ValueOutOfRange_IsRefusedWithFiveAndKept) {
    Host host;
    host.setUp({});
    for (const char* setting : {"FREQ,0", "FREQ,4000000000", "SPAN,-1", "RBW,11", "RBW,1.5",
                                "REFLVL,100", "MEAS,0", "MEAS,9", "TRIGSRC,4", "SWPTIME,1e9"}) {
        EXPECT_EQ(host.set(setting), "5\r") << setting;
    }
    EXPECT_EQ(host.value("FREQ"), "1500000000");
    EXPECT_EQ(host.value("MEAS"), "1");
}

TEST(Wire, WordOfAnotherMode_IsRefusedWithTwo) {
    Host host;
    host.setUp({});
    for (const char* word : {"CHPWR", "OBW", "TDMAPWR", "PWR", "REFL", "CABLELEN", "TGLVL"}) {
        EXPECT_EQ(host.get(word), "2\r") << word;
    }
    EXPECT_EQ(host.cmd("LVLADJUST"), "2\r");
    EXPECT_EQ(host.cmd("ZERO"), "2\r");
}

TEST(Wire, Local_RefusesSettingsButNotQueries) {
    Host host;
    EXPECT_EQ(host.set("FREQ,1e9"), "4\r");
    EXPECT_EQ(host.value("FREQ"), "1500000000");
    EXPECT_EQ(host.cmd("REMOTE"), "0\r");
    EXPECT_EQ(host.set("FREQ,1e9"), "0\r");
    EXPECT_EQ(host.cmd("LOCAL"), "0\r");
    EXPECT_EQ(host.set("FREQ,2e9"), "4\r");
}

TEST(Wire, Local_AcceptsModeAndBaudRate) {
    Host host;
    EXPECT_EQ(host.set("MEAS,1"), "0\r");
    EXPECT_EQ(host.set("BAUD,2"), "0\r");
}

TEST(Wire, StorageFull_IsAnsweredWithThree) {
    Host host;
    for (int i = 0; i < 256; ++i) {
        ASSERT_EQ(host.cmd("SAVE,D" + std::to_string(i)), "0\r");
    }
    EXPECT_EQ(host.cmd("SAVE,ONEMORE"), "3\r");
    EXPECT_EQ(host.cmd("SAVE,D7"), "0\r");
}

TEST(Wire, Recall_BringsTheSettingsBackAndRefusesAnUnknownDataset) {
    Host host;
    host.setUp({"FREQ,123000000"});
    EXPECT_EQ(host.cmd("SAVE,DATA.001"), "0\r");
    EXPECT_EQ(host.cmd("PRESET"), "0\r");
    EXPECT_EQ(host.cmd("recall,data.001"), "0\r");
    EXPECT_EQ(host.value("FREQ"), "123000000");
    EXPECT_EQ(host.cmd("RECALL,NIX"), "5\r");
}

TEST(Wire, LongLine_IsRefusedAndDropped) {
    Host host;
    host.wire.receive(std::string(1000000, 'A'));
    EXPECT_EQ(host.wire.take(), "");
    EXPECT_EQ(host.say(""), "1\r");
    EXPECT_EQ(host.get("UNIT"), "0\r0\r");
}

TEST(Wire, ManyLinesThatNobodyReadsTheAnswersOf_AreBounded) {
    Host host;
    std::string flood;
    for (int i = 0; i < 10000; ++i) {
        flood += "GET\rTRACEBIN\r";
    }
    host.wire.receive(flood);
    EXPECT_TRUE(host.wire.congested());
    std::size_t bytes = 0;
    for (std::string out = host.wire.take(); !out.empty(); out = host.wire.take()) {
        bytes += out.size();
    }
    EXPECT_LT(bytes, 64U * 2 * 2412);
    EXPECT_FALSE(host.wire.congested());
}

TEST(Wire, Reset_ForgetsHalfAnExchange) {
    Host host;
    host.say("GET");
    host.wire.receive("FRE");
    host.wire.reset();
    EXPECT_EQ(host.get("UNIT"), "0\r0\r");
}

TEST(Wire, Identity_HoldsMakerModelAndSerialNumber) {
    Host host;
    const std::string id = host.value("IDN?");
    EXPECT_NE(id.substr(0, 13).find("Marlow"), std::string::npos);
    const auto first = id.find(',');
    const auto second = id.find(',', first + 1);
    const auto third = id.find(',', second + 1);
    ASSERT_NE(third, std::string::npos);
    const auto model = parseNumber(id.substr(first + 1, second - first - 1));
    EXPECT_TRUE(model && *model > 0 && *model <= 32767);
    EXPECT_TRUE(parseNumber(id.substr(second + 1, third - second - 1)));
}

TEST(Wire, PowerSensor_HasNoTrace) {
    Host host;
    host.setUp({"MEAS,3"});
    EXPECT_EQ(host.value("TRACEDET"), "-2");
    EXPECT_EQ(host.get("TRACEBIN"), "2\r");
    EXPECT_EQ(host.get("CTRACEBIN"), "2\r");
    EXPECT_EQ(host.get("SPAN"), "2\r");
    EXPECT_EQ(host.cmd("WAIT"), "2\r");
    EXPECT_EQ(host.set("TRACEDET,1"), "2\r");
}

TEST(Wire, TraceBlock_HasOneBlockOrTwoByTheDetector) {
    Host host;
    EXPECT_EQ(host.get("TRACEBIN").size(), 2U + 2410U);
    host.setUp({"TRACEDET,4"});
    EXPECT_EQ(host.get("TRACEBIN").size(), 2U + 1205U);
    EXPECT_EQ(host.get("CTRACEBIN").size(), 2U + 2410U);
}

TEST(Wire, ComplexTrace_HasLevelsAndPhasesWithinATurn) {
    Host host;
    host.setUp({"MEAS,2"});
    const std::string answer = host.get("CTRACEBIN");
    ASSERT_EQ(answer.size(), 2412U);
    EXPECT_EQ(host.cmd("CAL_TGVECTRN"), "0\r");
    const std::string block = host.get("CTRACEBIN").substr(2);
    const auto levels = decodeBlock(block, 0);
    EXPECT_NEAR(levels[kPoints / 2], -1200, 100);  // the filter's middle
    for (const double phase : decodeBlock(block, 1205)) {
        EXPECT_LE(std::abs(phase), 3141593);
    }
}

TEST(Wire, Wait_IsAnsweredWhenTheSweepEnds) {
    Host host;
    host.setUp({"SWPTIME,0.5", "SWPCONT,0"});
    EXPECT_EQ(host.cmd("INIT"), "0\r");
    EXPECT_EQ(host.cmd("WAIT"), "");
    ASSERT_TRUE(host.wire.nextDue());
    EXPECT_NEAR(*host.wire.nextDue(), 0.5, 1e-6);
    host.wire.advance(0.499);
    EXPECT_EQ(host.wire.take(), "");
    host.wire.advance(0.001);
    EXPECT_EQ(host.wire.take(), "0\r");
}

TEST(Wire, WaitWithoutASweep_IsAnsweredAtOnce) {
    Host host;
    host.setUp({"SWPCONT,0"});
    host.wire.advance(10);
    EXPECT_EQ(host.cmd("WAIT"), "0\r");
}

TEST(Wire, Wait_TakesTheSweepTimeDividedByTheSpeed) {
    DeviceSetup fast;
    fast.speed = 100;
    Host host(fast);
    host.setUp({"SWPTIME,1"});
    EXPECT_EQ(host.cmd("WAIT"), "");
    EXPECT_NEAR(host.wire.nextDue().value_or(0), 0.01, 1e-6);
    EXPECT_EQ(host.wire.take(), "");
}

TEST(Wire, BareCrInAWait_EndsItAndIsAnswered) {
    Host host;
    EXPECT_EQ(host.cmd("REMOTE"), "0\r");
    EXPECT_EQ(host.set("SWPTIME,100"), "0\r");
    EXPECT_EQ(host.cmd("WAIT"), "");
    host.wire.advance(2);
    EXPECT_EQ(host.say(""), "0\r");
    EXPECT_EQ(host.value("SWPTIME"), "100");
    host.wire.advance(300);
    EXPECT_EQ(host.wire.take(), "");  // the wait is not answered any more
}

TEST(Wire, LinesBehindWait_AreServedAfterIt) {
    Host host;
    host.setUp({"SWPTIME,0.1"});
    EXPECT_EQ(host.cmd("WAIT"), "");
    EXPECT_EQ(host.say("GET"), "");
    host.wire.advance(0.2);
    EXPECT_EQ(host.wire.take(), "0\r0\r");
}

TEST(Wire, PacedLine_TakesTenBitsAByteBothWays) {
    WireSetup paced;
    paced.baud = 9600;
    Host host({}, paced);
    host.wire.receive("GET\r");
    const double there = 4 * 10.0 / 9600;
    const double back = 2 * 10.0 / 9600;
    host.wire.advance(there + back - 1e-5);
    EXPECT_EQ(host.wire.take(), "");
    host.wire.advance(1e-5);
    EXPECT_EQ(host.wire.take(), "0\r");
}

TEST(Wire, PacedTrace_TakesAsLongAsItsBytes) {
    WireSetup paced;
    paced.baud = 57600;
    Host host({}, paced);
    host.wire.receive("GET\r");
    host.wire.advance(1);
    EXPECT_EQ(host.wire.take(), "0\r");
    host.wire.receive("TRACEBIN\r");
    double passed = 0;
    std::size_t bytes = 0;
    while (const auto due = host.wire.nextDue()) {
        host.wire.advance(*due);
        passed += *due;
        bytes += host.wire.take().size();
        const double line = std::max(0.0, passed - 9 * 10.0 / 57600) * 5760;
        EXPECT_LE(static_cast<double>(bytes), line + 0.01);
        EXPECT_GE(static_cast<double>(bytes), line - 17);
    }
    EXPECT_EQ(bytes, 2412U);
    EXPECT_NEAR(passed, (9 + 2412) * 10.0 / 57600, 1e-5);
}

TEST(Wire, WholeAnswers_LeaveInOnePieceOnAPacedLineToo) {
    WireSetup paced;
    paced.baud = 1200;
    paced.wholeAnswers = true;
    Host host({}, paced);
    host.wire.receive("GET\r");
    host.wire.advance(1);
    EXPECT_EQ(host.wire.take(), "0\r");
    host.wire.receive("FREQ\r");
    std::string first;
    while (first.empty() && host.wire.nextDue()) {
        host.wire.advance(*host.wire.nextDue());
        first = host.wire.take();
    }
    EXPECT_EQ(first, "0\r1500000000\r");
}

TEST(Wire, Baud_ChangesThePaceAfterItsAnswer) {
    WireSetup paced;
    paced.baud = 19200;
    Host host({}, paced);
    host.wire.receive("SET\rBAUD,3\r");
    host.wire.advance(1);
    EXPECT_EQ(host.wire.take(), "0\r0\r");
    EXPECT_EQ(host.wire.baud(), 115200);
}

TEST(Wire, HostAtAnotherBaudRate_GetsNoise) {
    WireSetup paced;
    paced.baud = 57600;
    Host host({}, paced);
    host.wire.setHostBaud(19200);
    host.wire.receive("\r");
    host.wire.advance(1);
    const std::string noise = host.wire.take();
    ASSERT_FALSE(noise.empty());
    EXPECT_TRUE((noise[0] & 0x80) != 0);
    host.wire.setHostBaud(57600);
    host.wire.receive("\r");
    host.wire.advance(1);
    EXPECT_EQ(host.wire.take(), "0\r");
}

TEST(Wire, Preset_BringsTheStartValuesBack) {
    Host host;
    host.setUp({"FREQ,1e8", "SPAN,1e6", "REFLVL,0", "RBW,3", "TRACEDET,2", "MEAS,5"});
    EXPECT_EQ(host.cmd("PRESET"), "0\r");
    const std::vector<std::pair<std::string, std::string>> preset{
        {"FREQ", "1500000000"}, {"SPAN", "3000000000"}, {"REFLVL", "-20"}, {"REFLVLOFFS", "0"},
        {"RANGE", "0"},         {"UNIT", "0"},          {"RBW", "0"},      {"VBW", "0"},
        {"TRACEDET", "0"},      {"TRACEMODE", "0"},     {"SWPCONT", "1"},  {"TRIGSRC", "0"},
        {"MEAS", "1"},          {"RFINPUT", "0"},       {"MARK1ON", "0"},  {"FREQOFFS", "0"}};
    for (const auto& [word, value] : preset) {
        EXPECT_EQ(host.value(word), value) << word;
    }
}

}  // namespace
}  // namespace zelsim
