#include "ZELSim/Faults.h"
#include "tests/ZELSim/WireFixture.h"

namespace zelsim {
namespace {

WireSetup with(const std::vector<std::string>& texts) {
    WireSetup setup;
    for (const std::string& text : texts) {
        std::string problem;
        const auto rule = parseFault(text, problem);
        EXPECT_TRUE(rule) << problem;
        setup.faults.push_back(rule.value_or(FaultRule{}));
    }
    return setup;
}

TEST(Faults, TextThatIsNone_IsRefusedWithAReason) {
    for (const char* text : {"", "explode", "drop:byte=0", "drop:exchange=1", "delay:ms=-1",
                             "delay:byte=3", "refuse:status=0", "silence:p=2", "garble:nix=1",
                             "drop:byte", "refuse:step=3", "refuse:word="}) {
        std::string problem;
        EXPECT_FALSE(parseFault(text, problem)) << text;
        EXPECT_FALSE(problem.empty()) << text;
    }
}

TEST(Faults, Drop_LosesOneByte) {
    Host host({}, with({"drop:byte=4"}));
    EXPECT_EQ(host.say("GET"), "0\r");
    EXPECT_EQ(host.say("UNIT"), "00\r");  // the status line's CR is lost
    EXPECT_EQ(host.get("UNIT"), "0\r0\r");
}

TEST(Faults, Garble_ChangesOneByteToNoise) {
    Host host({}, with({"garble:byte=1"}));
    const std::string answer = host.say("GET");
    ASSERT_EQ(answer.size(), 2U);
    EXPECT_TRUE((answer[0] & 0x80) != 0);
    EXPECT_EQ(answer[1], '\r');
}

TEST(Faults, Delay_HoldsOneAnswerBack) {
    Host host({}, with({"delay:exchange=2,ms=300"}));
    EXPECT_EQ(host.get("UNIT"), "0\r0\r");
    EXPECT_EQ(host.get("UNIT"), "");
    EXPECT_NEAR(host.wire.nextDue().value_or(0), 0.3, 1e-6);
    host.wire.advance(0.3);
    EXPECT_EQ(host.wire.take(), "0\r0\r");
    EXPECT_EQ(host.get("UNIT"), "0\r0\r");
}

TEST(Faults, SilenceFromAnExchangeOn_LastsUnlessItIsCounted) {
    Host host({}, with({"silence:exchange=2"}));
    EXPECT_EQ(host.get("UNIT"), "0\r0\r");
    for (int i = 0; i < 5; ++i) {
        EXPECT_EQ(host.say("GET"), "");
        EXPECT_EQ(host.say("UNIT"), "");
    }
    Host counted({}, with({"silence:exchange=1,count=1"}));
    EXPECT_EQ(counted.say("GET"), "");
    EXPECT_EQ(counted.say("UNIT"), "");
    EXPECT_EQ(counted.get("UNIT"), "0\r0\r");
}

TEST(Faults, SilenceFromAByteOn_CutsATraceShort) {
    Host host({}, with({"silence:byte=1000"}));
    const std::string answer = host.get("TRACEBIN");
    EXPECT_EQ(answer.size(), 997U);  // two bytes answered the mode word
    EXPECT_EQ(host.say("GET"), "");
}

TEST(Faults, Refuse_AnswersAWordWithAStatus) {
    Host host({}, with({"refuse:word=TRACEBIN,status=1,count=2"}));
    EXPECT_EQ(host.get("UNIT"), "0\r0\r");
    EXPECT_EQ(host.get("TRACEBIN"), "1\r");
    EXPECT_EQ(host.get("TRACEBIN"), "1\r");
    EXPECT_EQ(host.get("TRACEBIN").size(), 2412U);
}

TEST(Faults, RefuseAtTheFirstStep_AnswersTheModeWord) {
    Host host({}, with({"refuse:exchange=1,status=2,step=1"}));
    EXPECT_EQ(host.say("GET"), "2\r");
    EXPECT_EQ(host.get("UNIT"), "0\r0\r");
}

TEST(Faults, RefusedSetting_ChangesNothing) {
    Host host({}, with({"refuse:word=FREQ,status=4,count=1"}));
    EXPECT_EQ(host.cmd("REMOTE"), "0\r");
    EXPECT_EQ(host.set("FREQ,1000000000"), "4\r");
    EXPECT_EQ(host.value("FREQ"), "1500000000");
}

TEST(Faults, Probability_StrikesAboutThatOftenAndTheSameWithTheSameSeed) {
    const auto bytes = [] {
        Host host({}, with({"drop:p=0.1"}));
        std::string all;
        for (int i = 0; i < 1000; ++i) {
            all += host.say("");
        }
        return all;
    };
    const std::string once = bytes();
    EXPECT_NEAR(static_cast<double>(once.size()), 1800, 60);
    EXPECT_EQ(bytes(), once);
}

}  // namespace
}  // namespace zelsim
