#include <gtest/gtest.h>

#include <string>

#include "ZELSim/InProcessPort.h"
#include "platform/virtual/VirtualTime.h"

namespace zelsim {
namespace {

struct Bench {
    zel::VirtualClock clock;
    zel::VirtualEvents events{clock};
    InProcessPort port;
    int received = 0;

    explicit Bench(const WireSetup& wire = {}) : port(clock, events, {}, wire) {
        port.OnComm.connect([this](int event) { received += event == 2 ? 1 : 0; });
    }
    bool open(const std::string& settings = "57600,N,8,1") {
        zel::SerialSetup setup;
        setup.CommPort = "sim";
        setup.Settings = settings;
        return port.open(setup);
    }
    /// Waits as a polling reader does until so many bytes are there.
    std::string read(std::size_t bytes, int patienceMs = 10000) {
        std::string all = port.input();
        const std::int64_t end = clock.micros() + patienceMs * 1000LL;
        while (all.size() < bytes && clock.micros() < end) {
            events.wait(10);
            all += port.input();
        }
        return all;
    }
};

TEST(InProcessPort, ClosedPort_GivesNothing) {
    Bench bench;
    bench.port.output("GET\r");
    EXPECT_FALSE(bench.port.isOpen());
    EXPECT_EQ(bench.port.input(), "");
}

TEST(InProcessPort, UnpacedAnswer_IsThereAtOnce) {
    Bench bench;
    ASSERT_TRUE(bench.open());
    bench.port.output("GET\r");
    EXPECT_EQ(bench.port.input(), "0\r");
    bench.port.output("UNIT\r");
    EXPECT_EQ(bench.port.input(), "0\r0\r");
    EXPECT_EQ(bench.clock.micros(), 0);
}

TEST(InProcessPort, InstrumentThatTakesItsTime_LetsTimePassOnAnUnpacedLine) {
    WireSetup setup;
    setup.answering = 0.002;
    Bench bench(setup);
    ASSERT_TRUE(bench.open());
    bench.port.output("GET\r");
    EXPECT_EQ(bench.port.input(), "");
    EXPECT_EQ(bench.read(2), "0\r");
    EXPECT_NEAR(static_cast<double>(bench.clock.micros()), 2000, 5);
}

TEST(InProcessPort, Answer_FiresTheDataEventInsideThePump) {
    Bench bench;
    ASSERT_TRUE(bench.open());
    bench.port.output("\r");
    EXPECT_EQ(bench.received, 0);
    bench.events.wait(100);
    EXPECT_EQ(bench.received, 1);
    EXPECT_LT(bench.clock.micros(), 1000);
    EXPECT_EQ(bench.port.input(), "0\r");
}

TEST(InProcessPort, AnswerThatWasTaken_FiresNoEvent) {
    Bench bench;
    ASSERT_TRUE(bench.open());
    bench.port.output("\r");
    EXPECT_EQ(bench.port.input(), "0\r");
    bench.events.wait(100);
    EXPECT_EQ(bench.received, 0);
}

TEST(InProcessPort, Wait_WakesTheReaderWhenTheSweepEnds) {
    Bench bench;
    ASSERT_TRUE(bench.open());
    bench.port.output("cmd\r");
    EXPECT_EQ(bench.port.input(), "0\r");
    bench.port.output("WAIT\r");
    EXPECT_EQ(bench.port.input(), "");
    bench.events.wait(1000);
    EXPECT_EQ(bench.port.input(), "0\r");
    EXPECT_NEAR(static_cast<double>(bench.clock.micros()), 20000, 5);
}

TEST(InProcessPort, PacedTrace_ArrivesAtTheLinesRate) {
    WireSetup paced;
    paced.baud = 57600;
    Bench bench(paced);
    ASSERT_TRUE(bench.open());
    bench.port.output("GET\rTRACEBIN\r");
    EXPECT_EQ(bench.read(2414).size(), 2414U);
    const double bytes = 13 + 2412;  // the mode word's status runs beside the second line
    EXPECT_NEAR(static_cast<double>(bench.clock.micros()), bytes * 1e7 / 57600, 500);
}

TEST(InProcessPort, WrongBaudRateOnAPacedLine_GivesNoise) {
    WireSetup paced;
    paced.baud = 57600;
    Bench bench(paced);
    ASSERT_TRUE(bench.open("19200,N,8,1"));
    bench.port.output("\r");
    const std::string noise = bench.read(1, 100);
    ASSERT_FALSE(noise.empty());
    EXPECT_TRUE((noise[0] & 0x80) != 0);
}

TEST(InProcessPort, Reopened_KnowsNothingOfTheLastSession) {
    Bench bench;
    ASSERT_TRUE(bench.open());
    bench.port.output("GET\r");
    bench.port.close();
    ASSERT_TRUE(bench.open());
    EXPECT_EQ(bench.port.input(), "");
    bench.port.output("\r");
    EXPECT_EQ(bench.port.input(), "0\r");
}

TEST(InProcessPort, PortThatIsGone_LeavesNoTaskBehind) {
    zel::VirtualClock clock;
    zel::VirtualEvents events{clock};
    {
        InProcessPort port(clock, events);
        port.open({});
        port.output("cmd\rWAIT\r");
        EXPECT_GT(events.pending(), 0U);
    }
    EXPECT_EQ(events.pending(), 0U);
}

}  // namespace
}  // namespace zelsim
