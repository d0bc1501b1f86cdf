#include <gtest/gtest.h>

#include "link/LinkDelays.h"
#include "tests/Session.h"
#include "tests/link/Line.h"

namespace zel {
namespace {

using CF = ControllerForm;

/// Runs on every serial kind and gives the milliseconds that each takes, in the kinds' order.
template <class Prepare, class Work>
std::vector<std::int64_t> timesByKind(const Prepare& prepare, const Work& work) {
    std::vector<std::int64_t> times;
    for (const std::int16_t kind : kSerialKinds) {
        LineSetup rig;
        rig.panel.ConnectionState = kind;
        prepare(rig);
        times.push_back(rig.time([&] { work(rig); }));
        rig.expectPlayed();
    }
    return times;
}

/// In the order direct, two modems, two phones, modem to phone, phone to modem.
using Times = std::vector<std::int64_t>;

TEST(Delays, Cmd_OnlyTwoModemsNeedThem) {
    const Times times = timesByKind([](LineSetup& rig) { rig.exchangeOf("cmd", "INIT", "0\r"); },
                                    [](LineSetup& rig) { rig.exchange.CmdInstrument("INIT"); });
    EXPECT_EQ(times, (Times{0, 300, 0, 0, 0}));
}

TEST(Delays, TriggeredCmd_AreThoseOfCmd) {
    const Times times =
        timesByKind([](LineSetup& rig) { rig.exchangeOf("cmd", "WAIT", "0\r"); },
                    [](LineSetup& rig) { rig.exchange.CmdInstrumentTriggered("WAIT", 5); });
    EXPECT_EQ(times, (Times{0, 300, 0, 0, 0}));
}

TEST(Delays, Set_OnlyTwoModemsNeedThem) {
    const Times times = timesByKind([](LineSetup& rig) { rig.exchangeOf("set", "RBW,1", "0\r"); },
                                    [](LineSetup& rig) { rig.exchange.SetInstrument("RBW,1"); });
    EXPECT_EQ(times, (Times{0, 300, 0, 0, 0}));
}

TEST(Delays, Get_OnlyTwoModemsNeedThem) {
    std::string value;
    const Times times =
        timesByKind([](LineSetup& rig) { rig.exchangeOf("GET", "RBW", "0\r1\r"); },
                    [&](LineSetup& rig) { rig.exchange.GetInstrument("RBW", value); });
    EXPECT_EQ(times, (Times{0, 500, 0, 0, 0}));
}

struct ModemDelays : Line {
    ModemDelays() { panel.ConnectionState = CF::MODEMCON; }
};

TEST_F(ModemDelays, Cmd_100BehindTheModeWordAnd200BehindTheKeyword) {
    exchangeOf("cmd", "INIT", "0\r");
    exchange.CmdInstrument("INIT");
    EXPECT_EQ(debug.momentOf("-> cmd\r"), 0);
    EXPECT_EQ(debug.momentOf("-> INIT\r"), 100);
    EXPECT_EQ(now(), 300);
}

TEST_F(ModemDelays, Set_100BehindTheModeWordAnd200BehindTheKeyword) {
    exchangeOf("set", "RBW,1", "0\r");
    exchange.SetInstrument("RBW,1");
    EXPECT_EQ(debug.momentOf("-> RBW,1\r"), 100);
    EXPECT_EQ(now(), 300);
}

TEST_F(ModemDelays, Get_300BehindTheKeywordAnd100AheadOfTheValue) {
    exchangeOf("GET", "RBW", "0\r1\r");
    std::string value;
    exchange.GetInstrument("RBW", value);
    EXPECT_EQ(debug.momentOf("-> RBW\r"), 100);
    EXPECT_EQ(debug.momentOf("<-0\r1\r"), 400);
    EXPECT_EQ(now(), 500);
}

TEST(Delays, Tcp_HasNone) {
    LineSetup rig;
    rig.overTcp();
    rig.socket.expect("set\r").answer("0\r");
    rig.socket.expect("RBW,1\r").answer("0\r");
    EXPECT_EQ(rig.time([&] { rig.exchange.SetInstrument("RBW,1"); }), 0);
}

void scriptTrace(LineSetup& rig) {
    rig.port.expect("GET\r").answer("0\r");
    rig.port.expect("TRACEBIN\r").answer("0\r" + levelBlock(1));
}

void scriptComplexTrace(LineSetup& rig) {
    rig.port.expect("GET\r").answer("0\r");
    rig.port.expect("CTRACEBIN\r").answer("0\r" + levelBlock(1) + levelBlock(2));
}

TEST(Delays, Trace_ByKind) {
    RawTrace trace;
    const Times times =
        timesByKind(scriptTrace, [&](LineSetup& rig) { rig.binary.GetTraceBinary(trace, false); });
    EXPECT_EQ(times, (Times{0, 200, 500, 0, 500}));
}

TEST_F(ModemDelays, Trace_100BehindGetAnd100BehindTheKeyword) {
    scriptTrace(*this);
    RawTrace trace;
    binary.GetTraceBinary(trace, false);
    EXPECT_EQ(debug.momentOf("-> TRACEBIN\r"), 100);
    EXPECT_EQ(now(), 200);
}

TEST(Delays, ComplexTrace_ByKind) {
    std::vector<double> values;
    const Times times = timesByKind(scriptComplexTrace,
                                    [&](LineSetup& rig) { rig.binary.GetCTraceBinary(values); });
    EXPECT_EQ(times, (Times{0, 400, 0, 0, 0}));
}

TEST_F(ModemDelays, ComplexTrace_200BehindGetAnd200BehindTheKeyword) {
    scriptComplexTrace(*this);
    std::vector<double> values;
    binary.GetCTraceBinary(values);
    EXPECT_EQ(debug.momentOf("-> CTRACEBIN\r"), 200);
    EXPECT_EQ(now(), 400);
}

/// Moments of the re-requests of a complex trace on a line that fell silent.
Times reRequests(std::int16_t kind) {
    LineSetup rig;
    rig.panel.ConnectionState = kind;
    rig.state.ComplexTraceActive = true;
    rig.events.schedule(30'000, [&] { rig.port.close(); });
    rig.binary.ReadLiteralBytes(2410);
    Times moments;
    for (const StampedDebug::Entry& entry : rig.debug.entries) moments.push_back(entry.ms);
    return moments;
}

TEST(Delays, ReRequest_TwoModems_100BehindGetAnd1900BehindTheKeyword) {
    const Times moments = reRequests(CF::MODEMCON);
    ASSERT_GE(moments.size(), 4U);
    EXPECT_EQ(moments[1] - moments[0], 100);
    // 1.9 s after the keyword, then 10 s of polling.
    EXPECT_GE(moments[2] - moments[1], 11'900);
    EXPECT_LE(moments[2] - moments[1], 11'950);
}

TEST(Delays, ReRequest_AnyOtherKind_1500BehindTheKeyword) {
    for (const std::int16_t kind : kSerialKinds) {
        if (kind == CF::MODEMCON) continue;
        const Times moments = reRequests(kind);
        ASSERT_GE(moments.size(), 4U) << kind;
        EXPECT_EQ(moments[1] - moments[0], 0) << kind;
        EXPECT_GE(moments[2] - moments[1], 11'500) << kind;
        EXPECT_LE(moments[2] - moments[1], 11'550) << kind;
    }
}

}  // namespace
}  // namespace zel
