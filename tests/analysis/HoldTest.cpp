#include <gtest/gtest.h>

#include "analysis/Hold.h"
#include "tests/analysis/Traces.h"

namespace zel {
namespace {

SpectrumTrace noisy(unsigned seed) {
    unsigned state = seed * 2654435761u + 1;
    return madeTrace(50, 0, 1, [&state](double) {
        state = state * 1664525u + 1013904223u;
        return -100 + static_cast<double>(state >> 8) / (1 << 24) * 80;
    });
}

std::vector<double> held(HoldKind kind, const std::vector<SpectrumTrace>& traces) {
    Hold hold(kind);
    for (const SpectrumTrace& trace : traces) EXPECT_TRUE(hold.add(trace));
    return hold.result().level;
}

TEST(Hold, MaxAndMin_AreTheExtremesOfEachSample) {
    const std::vector<SpectrumTrace> traces = {levels({-10, -50}), levels({-20, -40})};
    EXPECT_EQ(held(HoldKind::Max, traces), (std::vector<double>{-10, -40}));
    EXPECT_EQ(held(HoldKind::Min, traces), (std::vector<double>{-20, -50}));
}

TEST(Hold, Averages_AreOfLevelsOrOfPowers) {
    const std::vector<SpectrumTrace> traces = {levels({0}), levels({-10})};
    EXPECT_DOUBLE_EQ(held(HoldKind::Average, traces)[0], -5);
    EXPECT_NEAR(held(HoldKind::PowerAverage, traces)[0], levelOfPower(0.55), 1e-12);
}

TEST(Hold, MaxHold_NeverFalls) {
    Hold hold(HoldKind::Max);
    std::vector<double> before;
    for (unsigned seed = 1; seed <= 50; ++seed) {
        ASSERT_TRUE(hold.add(noisy(seed)));
        const std::vector<double> now = hold.result().level;
        for (std::size_t i = 0; i < before.size(); ++i) EXPECT_GE(now[i], before[i]);
        before = now;
    }
}

TEST(Hold, AverageOfEqualTraces_EqualsThem) {
    const SpectrumTrace trace = noisy(7);
    const std::vector<SpectrumTrace> traces(1000, trace);
    const std::vector<double> average = held(HoldKind::Average, traces);
    const std::vector<double> power = held(HoldKind::PowerAverage, traces);
    for (std::size_t i = 0; i < trace.level.size(); ++i) {
        EXPECT_NEAR(average[i], trace.level[i], 1e-12);
        EXPECT_NEAR(power[i], trace.level[i], 1e-9);
    }
}

TEST(Hold, OtherAxisOrUnit_IsRefusedAndChangesNothing) {
    Hold hold(HoldKind::Max);
    ASSERT_TRUE(hold.add(levels({-10, -20})));
    SpectrumTrace unit = levels({0, 0});
    unit.unit = "dBuV";
    SpectrumTrace axis = levels({0, 0});
    axis.x[1] = 2;
    EXPECT_FALSE(hold.add(unit));
    EXPECT_FALSE(hold.add(axis));
    EXPECT_FALSE(hold.add(levels({0, 0, 0})));
    EXPECT_EQ(hold.count(), 1u);
    EXPECT_EQ(hold.result().level, (std::vector<double>{-10, -20}));
}

TEST(Hold, Cleared_BeginsWithTheNextTrace) {
    Hold hold(HoldKind::Max);
    hold.add(levels({-10, -20}));
    hold.clear();
    EXPECT_EQ(hold.count(), 0u);
    EXPECT_TRUE(hold.result().level.empty());
    EXPECT_TRUE(hold.add(levels({-30, -30, -30})));
    EXPECT_EQ(hold.result().level, (std::vector<double>{-30, -30, -30}));
}

TEST(Occupancy, Share_CountsTracesAtOrOverTheLevel) {
    Occupancy occupancy(-50);
    EXPECT_TRUE(occupancy.share().empty());
    occupancy.add(levels({-50, -50.1, -10}));
    occupancy.add(levels({-60, -50.1, -10}));
    occupancy.add(levels({-60, -50.1, -10}));
    occupancy.add(levels({-40, -50.1, -10}));
    EXPECT_EQ(occupancy.share(), (std::vector<double>{0.5, 0, 1}));
    EXPECT_FALSE(occupancy.add(levels({-10})));
    EXPECT_EQ(occupancy.count(), 4u);
}

}  // namespace
}  // namespace zel
