#include <gtest/gtest.h>

#include <string>

#include "platform/virtual/VirtualTime.h"

namespace zel {
namespace {

struct VirtualTimeTest : ::testing::Test {
    VirtualClock clock;
    VirtualEvents events{clock};
    std::string log;

    std::function<void()> note(const std::string& name) {
        return [this, name] { log += name; };
    }
};

TEST_F(VirtualTimeTest, DateOf_KnownDays_CountsFromTheEndOf1899) {
    EXPECT_EQ(dateOf(1899, 12, 30), 0);
    EXPECT_EQ(dateOf(1900, 1, 1), 2);
    EXPECT_EQ(dateOf(2026, 1, 1, 12), 46023.5);
}

TEST_F(VirtualTimeTest, Clock_Advanced_MovesMicrosAndDateTogether) {
    const double start = clock.date();
    clock.advance(86400.0 * 1000.0 / 2);
    EXPECT_EQ(clock.micros(), 43200000000);
    EXPECT_DOUBLE_EQ(clock.date() - start, 0.5);
}

TEST_F(VirtualTimeTest, SetDate_AfterSomeTime_LeavesMicrosAlone) {
    clock.advance(5);
    clock.setDate(100.25);
    EXPECT_DOUBLE_EQ(clock.date(), 100.25);
    EXPECT_EQ(clock.micros(), 5000);
    EXPECT_DOUBLE_EQ(clock.secondsOfDay(), 21600);
}

TEST_F(VirtualTimeTest, Pump_TaskNotDue_RunsNothing) {
    events.schedule(1, note("a"));
    events.pump();
    EXPECT_EQ(log, "");
    EXPECT_EQ(clock.micros(), 0);
}

TEST_F(VirtualTimeTest, Pump_TasksDue_RunByDueTimeThenInsertion) {
    events.schedule(2, note("c"));
    events.schedule(1, note("a"));
    events.schedule(1, note("b"));
    clock.advance(2);
    events.pump();
    EXPECT_EQ(log, "abc");
}

TEST_F(VirtualTimeTest, Pump_TaskThatSchedulesItselfAtOnce_EndsAfterOneRun) {
    int runs = 0;
    std::function<void()> again = [&] {
        ++runs;
        events.schedule(0, again);
    };
    events.schedule(0, again);
    events.pump();
    EXPECT_EQ(runs, 1);
}

TEST_F(VirtualTimeTest, Wait_TaskThatSchedulesItselfAtOnce_LetsTimeGoOn) {
    std::function<void()> again = [&] { events.schedule(0, again); };
    events.schedule(0, again);
    while (clock.micros() < 1000) events.wait(10);
    EXPECT_EQ(clock.micros(), 1000);
}

TEST_F(VirtualTimeTest, Wait_SomethingDue_RunsItWithoutTime) {
    events.schedule(0, note("a"));
    events.schedule(5, note("b"));
    events.wait(10);
    EXPECT_EQ(log, "a");
    EXPECT_EQ(clock.micros(), 0);
}

TEST_F(VirtualTimeTest, Wait_TaskWithinTheTime_WakesAtItsMoment) {
    events.schedule(3.5, note("a"));
    events.schedule(3.5, note("b"));
    events.schedule(4, note("c"));
    events.wait(10);
    EXPECT_EQ(log, "ab");
    EXPECT_EQ(clock.micros(), 3500);
}

TEST_F(VirtualTimeTest, Wait_TaskBeyondTheTime_LetsTheTimePass) {
    events.schedule(11, note("a"));
    events.wait(10);
    EXPECT_EQ(log, "");
    EXPECT_EQ(clock.micros(), 10000);
}

TEST_F(VirtualTimeTest, Sleep_TaskFallsDue_RunsInTheNextPump) {
    events.schedule(1, note("a"));
    events.sleep(5);
    EXPECT_EQ(log, "");
    EXPECT_EQ(clock.micros(), 5000);
    events.pump();
    EXPECT_EQ(log, "a");
}

TEST_F(VirtualTimeTest, Cancel_ByATaskOfTheSamePump_StopsTheOther) {
    TaskId second = 0;
    events.schedule(0, [&] { events.cancel(second); });
    second = events.schedule(0, note("b"));
    events.pump();
    EXPECT_EQ(log, "");
    EXPECT_EQ(events.pending(), 0U);
}

TEST_F(VirtualTimeTest, Pump_NestedInATask_RunsTheOthersOnce) {
    events.schedule(0, [&] {
        log += "a";
        events.pump();
        log += "c";
    });
    events.schedule(0, note("b"));
    events.pump();
    EXPECT_EQ(log, "abc");
}

TEST_F(VirtualTimeTest, RunFor_SeveralTasks_RunsThemAtTheirMomentsToTheEnd) {
    std::int64_t at = 0;
    events.schedule(2, [&] {
        at = clock.micros();
        events.schedule(3, note("b"));
    });
    events.schedule(10, note("end"));
    events.schedule(10.5, note("late"));
    events.runFor(10);
    EXPECT_EQ(at, 2000);
    EXPECT_EQ(log, "bend");
    EXPECT_EQ(clock.micros(), 10000);
}

}  // namespace
}  // namespace zel
