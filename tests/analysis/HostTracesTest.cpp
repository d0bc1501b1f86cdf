// The traces that the host keeps: what begins them, what ends them, what must always hold.

#include <gtest/gtest.h>

#include "analysis/HostTraces.h"
#include "analysis/TraceStatistics.h"
#include "tests/analysis/Traces.h"

namespace zel {
namespace {

TEST(HostTraces, HoldsThatAreOff_KeepNothing) {
    HostTraces traces;
    traces.take(levels({1, 2, 3}));
    EXPECT_TRUE(traces.held(HoldKind::Max).level.empty());
}

TEST(HostTraces, SwitchedOn_BeginsWithTheSweepOnTheScreen) {
    HostTraces traces;
    traces.take(levels({1, 2, 3}));
    traces.switchOn(HoldKind::Max, true);
    EXPECT_EQ(traces.held(HoldKind::Max).level, (std::vector<double>{1, 2, 3}));
    traces.take(levels({3, 1, 3}));
    EXPECT_EQ(traces.held(HoldKind::Max).level, (std::vector<double>{3, 2, 3}));
}

TEST(HostTraces, EachChangeOfTheAxes_EndsThemWithAWord) {
    struct Case {
        SpectrumTrace next;
        std::string word;
    };
    SpectrumTrace unit = levels({1, 2, 3});
    unit.unit = "dBuV";
    SpectrumTrace zero = levels({1, 2, 3});
    zero.xUnit = "s";
    const auto flat = [](double) { return 0.0; };
    const Case cases[] = {{unit, "unit"},
                          {zero, "span"},
                          {madeTrace(3, 5, 1, flat), "frequency"},
                          {madeTrace(3, 0, 2, flat), "span"}};
    for (const Case& row : cases) {
        HostTraces traces;
        traces.switchOn(HoldKind::Max, true);
        traces.take(levels({9, 9, 9}));
        traces.take(row.next);
        EXPECT_EQ(traces.ended(), "Held traces ended: " + row.word + " changed");
        EXPECT_EQ(traces.held(HoldKind::Max).level, row.next.level);
        EXPECT_EQ(traces.count(HoldKind::Max), 1U);
    }
}

TEST(HostTraces, ChangeWhileNothingIsHeld_SaysNothing) {
    HostTraces traces;
    traces.take(levels({9, 9, 9}));
    traces.take(levels({9, 9}));
    EXPECT_EQ(traces.ended(), "");
}

TEST(HostTraces, NormalisedByItself_IsZero) {
    HostTraces traces;
    const SpectrumTrace sweep = levels({-20, -30.5, -40});
    traces.remember(1, sweep);
    ASSERT_TRUE(traces.normalised(sweep, 1));
    EXPECT_EQ(traces.normalised(sweep, 1)->level, (std::vector<double>{0, 0, 0}));
    EXPECT_EQ(traces.normalised(sweep, 1)->unit, "dB");
    EXPECT_FALSE(traces.normalised(sweep, 0));
    EXPECT_FALSE(traces.normalised(levels({1, 2}), 1));
    traces.forget(1);
    EXPECT_FALSE(traces.normalised(sweep, 1));
}

TEST(HostTraces, MaxNeverFallsAndMinNeverRises) {
    HostTraces traces;
    traces.switchOn(HoldKind::Max, true);
    traces.switchOn(HoldKind::Min, true);
    std::vector<double> high(50, -1e9);
    std::vector<double> low(50, 1e9);
    unsigned seed = 1;
    for (int sweep = 0; sweep < 200; ++sweep) {
        traces.take(madeTrace(50, 0, 1, [&seed](double) {
            seed = seed * 1664525U + 1013904223U;
            return -100.0 + (seed >> 16) % 8000 / 100.0;
        }));
        const auto max = traces.held(HoldKind::Max).level;
        const auto min = traces.held(HoldKind::Min).level;
        for (std::size_t i = 0; i < 50; ++i) {
            EXPECT_GE(max[i], high[i]);
            EXPECT_LE(min[i], low[i]);
        }
        high = max;
        low = min;
    }
}

TEST(TraceStatistics, TableHoldsLowestMeanHighestAndShare) {
    TraceStatistics statistics(-50);
    ASSERT_TRUE(statistics.add(levels({-60, -40})));
    ASSERT_TRUE(statistics.add(levels({-40, -30})));
    EXPECT_FALSE(statistics.add(levels({-40, -30, -20})));
    EXPECT_EQ(statistics.count(), 2U);
    EXPECT_EQ(statistics.table(),
              "x;minimum;mean;maximum;occupancy\r\n0;-60;-50;-40;0.5\r\n1;-40;-35;-30;1\r\n");
}

}  // namespace
}  // namespace zel
