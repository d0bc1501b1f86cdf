// The line beside the graph: age of the trace, sweeps a second, and what sets the pace.

#include <gtest/gtest.h>

#include "ZELSim/InProcessPort.h"
#include "platform/virtual/VirtualPlatform.h"
#include "shell/Program.h"
#include "trace/PaceMonitor.h"

namespace zel {
namespace {

class Pace : public testing::Test {
  protected:
    void connectTo(int baud) {
        zelsim::WireSetup wire;
        wire.baud = baud;
        port = std::make_unique<zelsim::InProcessPort>(platform.clock, platform.events,
                                                       zelsim::DeviceSetup{}, wire);
        program = std::make_unique<Program>(platform.bundle(*port), "");
        program->start();
        ASSERT_TRUE(program->connect(
            {LinkAddress::Kind::Serial, "/dev/zel3", baud == 0 ? 57600 : baud}, true));
    }
    ControllerForm& panel() { return program->forms().controller; }
    std::string line() { return panel().PaceLabel.Caption; }
    /// The continuous view for so long; `look` runs just before its stop.
    void view(double ms, const std::function<void()>& look) {
        platform.events.schedule(ms, [this, look] {
            look();
            panel().StopButton.Click();
        });
        panel().PlayContinuousButton.Click();
    }

    VirtualPlatform platform;
    std::unique_ptr<zelsim::InProcessPort> port;
    std::unique_ptr<Program> program;
};

TEST_F(Pace, SingleTrace_TellsItsAgeAndIsNotMarkedOld) {
    connectTo(0);
    platform.events.runFor(4000);
    EXPECT_EQ(line(), "4 s old");
    EXPECT_FALSE(panel().CWGraph1.Old);
    platform.events.runFor(61000);
    EXPECT_EQ(line(), "1 min old");
}

TEST_F(Pace, AtRest_TheLineIsWrittenWithEachWholeSecondOfTheAge) {
    connectTo(0);
    EXPECT_EQ(panel().PaceTimer.Interval.get(), 250);
    platform.events.runFor(400);
    EXPECT_NEAR(panel().PaceTimer.Interval.get(), 750, 2);
    platform.events.runFor(5000);
    EXPECT_NEAR(panel().PaceTimer.Interval.get(), 1000, 2);
    view(2010, [this] { EXPECT_EQ(panel().PaceTimer.Interval.get(), 250); });
    platform.events.runFor(1500);
    EXPECT_EQ(line(), "1 s old") << "and no pace";
}

TEST(PaceMonitor, PauseAboveFiveSeconds_IsNoPace) {
    VirtualPlatform platform;
    Forms forms;
    PaceMonitor monitor(forms.controller, platform.clock);
    monitor.drawn();
    EXPECT_EQ(monitor.sweepsPerSecond(), 0);
    platform.clock.advance(5000);
    monitor.drawn();
    EXPECT_DOUBLE_EQ(monitor.sweepsPerSecond(), 0.2);
    platform.clock.advance(5000.001);
    monitor.drawn();
    EXPECT_EQ(monitor.sweepsPerSecond(), 0);
    for (int i = 0; i < 20; ++i) {
        platform.clock.advance(i < 10 ? 400 : 100);
        monitor.drawn();
    }
    EXPECT_DOUBLE_EQ(monitor.sweepsPerSecond(), 10) << "of the last eight";
}

TEST(PaceMonitor, AgeAboveTwoCycles_IsOldInAViewThatRuns) {
    VirtualPlatform platform;
    Forms forms;
    PaceMonitor monitor(forms.controller, platform.clock);
    const auto oldAfter = [&](double cycleMs, double ageMs) {
        monitor.cycleBegins();
        platform.clock.advance(cycleMs);
        forms.controller.CWGraph1.Old = false;
        monitor.drawn();
        platform.clock.advance(ageMs);
        monitor.show();
        return forms.controller.CWGraph1.Old.get();
    };
    forms.controller.AcquisitionRunning = forms.controller.STOPFlag = true;
    EXPECT_FALSE(oldAfter(300, 600));
    EXPECT_TRUE(oldAfter(300, 600.001));
    EXPECT_FALSE(oldAfter(1, 100)) << "no cycle counts as shorter than 50 ms";
    EXPECT_TRUE(oldAfter(1, 100.001));
    forms.controller.STOPFlag = false;
    EXPECT_FALSE(oldAfter(1, 60000));
}

TEST_F(Pace, TraceOfAnotherMode_StaysMarkedWhileItAges) {
    connectTo(0);
    panel().ChnPwrButton.Click();
    platform.events.runFor(4000);
    EXPECT_TRUE(panel().CWGraph1.Old);
    panel().PlaySingleButton.Click();
    platform.events.runFor(4000);
    EXPECT_FALSE(panel().CWGraph1.Old);
}

TEST_F(Pace, ViewThatReadsAPower_HasNoPaceOfSweeps) {
    connectTo(57600);  // on a line that takes no time none would pass
    view(2000, [] {});
    panel().TDMAButton.Click();
    view(8000, [this] {
        EXPECT_EQ(line().find("sweeps/s"), std::string::npos) << line();
        EXPECT_NE(line().find(" s old"), std::string::npos) << line();
    });
}

TEST_F(Pace, FastLine_SaysThatTheSweepSetsThePace) {
    connectTo(0);
    view(2010, [this] {
        EXPECT_NE(line().find("50.0 sweeps/s   the sweep sets the pace"), std::string::npos)
            << line();
    });
}

TEST_F(Pace, SlowLine_SaysThatTheLineSetsThePace) {
    connectTo(19200);
    view(20000, [this] {
        EXPECT_NE(line().find("sweeps/s   the line sets the pace"), std::string::npos) << line();
        EXPECT_EQ(line().find("50.0 sweeps/s"), std::string::npos) << line();
    });
}

TEST_F(Pace, TraceOlderThanTwoSweeps_IsMarkedUntilTheNextOne) {
    connectTo(0);
    bool marked = false;
    bool healed = false;
    platform.events.schedule(1000, [this] {
        port->device().edit().sweepTime = 5;
        port->device().restart();
    });
    platform.events.schedule(4000, [&] { marked = panel().CWGraph1.Old; });
    panel().CWGraph1.Changed.connect([&] { healed = marked && !panel().CWGraph1.Old; });
    view(12000, [] {});
    EXPECT_TRUE(marked);
    EXPECT_TRUE(healed);
}

}  // namespace
}  // namespace zel
