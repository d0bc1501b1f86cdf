#include <gtest/gtest.h>

#include <vector>

#include "platform/TimerDriver.h"
#include "platform/virtual/VirtualTime.h"

namespace zel {
namespace {

struct TimerPaceTest : ::testing::Test {
    TimerPaceTest() {
        driver.attach(timer);
        timer.Tick.connect([this] { ticks.push_back(clock.micros() / 1000); });
    }
    void start(int interval) {
        timer.Interval = interval;
        timer.Enabled = true;
    }
    VirtualClock clock;
    VirtualEvents events{clock};
    Form form{"Form"};
    Timer timer{form, "Timer", 0};
    TimerDriver driver{events};
    std::vector<std::int64_t> ticks;
};

TEST_F(TimerPaceTest, Enabled_TicksEveryInterval) {
    start(100);
    events.runFor(350);
    EXPECT_EQ(ticks, (std::vector<std::int64_t>{100, 200, 300}));
}

TEST_F(TimerPaceTest, IntervalOfZero_NeverTicks) {
    start(0);
    events.runFor(10000);
    EXPECT_TRUE(ticks.empty());
}

TEST_F(TimerPaceTest, Disabled_TicksNoMore) {
    start(100);
    events.runFor(150);
    timer.Enabled = false;
    events.runFor(1000);
    EXPECT_EQ(ticks.size(), 1U);
}

TEST_F(TimerPaceTest, TickLongerThanTheInterval_DelaysTheNextAndIsNotEntered) {
    int inside = 0;
    timer.Tick.connect([&] {
        EXPECT_EQ(++inside, 1);
        if (ticks.size() == 1) events.runFor(250);
        --inside;
    });
    start(100);
    events.runFor(1000);
    ASSERT_GE(ticks.size(), 3U);
    EXPECT_EQ(ticks[0], 100);
    EXPECT_EQ(ticks[1], 350);  // late by the long one, and not left out
    EXPECT_EQ(ticks[2], 450);
}

TEST_F(TimerPaceTest, DisabledInALongTick_TicksNoMore) {
    timer.Tick.connect([&] {
        events.runFor(250);
        timer.Enabled = false;
    });
    start(100);
    events.runFor(2000);
    EXPECT_EQ(ticks.size(), 1U);
}

TEST(ClockTexts, DateAndTime_OfADate) {
    const VirtualClock clock;
    EXPECT_EQ(clock.dateTimeText(dateOf(2026, 2, 28, 7, 5, 9)), "2026-02-28 07:05:09");
    EXPECT_EQ(clock.dateText(dateOf(1999, 12, 31)), "1999-12-31");
    EXPECT_EQ(clock.timeText(dateOf(2026, 2, 28, 23, 59, 59)), "23:59:59");
}

TEST(ClockTexts, LastHalfSecond_BelongsToTheNextDay) {
    const VirtualClock clock;
    EXPECT_EQ(clock.dateTimeText(dateOf(2026, 2, 28, 23, 59, 59.7)), "2026-03-01 00:00:00");
}

TEST(ClockTexts, DatesThatAreNone_GiveAText) {
    const VirtualClock clock;
    EXPECT_EQ(clock.dateText(-5), "1899-12-30");
    EXPECT_EQ(clock.dateText(1e30), "9999-12-31");
}

}  // namespace
}  // namespace zel
