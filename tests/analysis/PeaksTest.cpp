#include <gtest/gtest.h>

#include "analysis/Peaks.h"
#include "tests/analysis/Traces.h"

namespace zel {
namespace {

std::vector<double> places(const std::vector<Peak>& peaks) {
    std::vector<double> x;
    for (const Peak& peak : peaks) x.push_back(peak.x);
    return x;
}

TEST(FindPeaks, GaussianBetweenTwoSamples_IsFoundWhereItStands) {
    const double center = 1'000'000'340.0;
    const SpectrumTrace trace = madeTrace(
        301, 999'985'000, 100, [center](double x) { return gaussian(x, center, 3000, -20); });
    const std::vector<Peak> peaks = findPeaks(trace, {});
    ASSERT_EQ(peaks.size(), 1u);
    // In dB the filter is a parabola, so that the refinement is exact but for rounding.
    EXPECT_NEAR(peaks[0].x, center, 0.01);
    EXPECT_NEAR(peaks[0].level, -20, 1e-9);
    EXPECT_EQ(peaks[0].index, 153u);
}

TEST(FindPeaks, TwoTones_StrongestFirst) {
    const SpectrumTrace trace = madeTrace(301, 0, 10, [](double x) {
        const double both = powerOfLevel(gaussian(x, 1000, 100, -40)) +
                            powerOfLevel(gaussian(x, 2000, 100, -30)) + powerOfLevel(-100);
        return levelOfPower(both);
    });
    const std::vector<Peak> peaks = findPeaks(trace, {.threshold = -90});
    ASSERT_EQ(peaks.size(), 2u);
    EXPECT_NEAR(peaks[0].x, 2000, 0.1);
    EXPECT_NEAR(peaks[1].x, 1000, 0.1);
}

TEST(FindPeaks, EqualPeaks_ByX) {
    EXPECT_EQ(places(findPeaks(levels({-50, -10, -50, -10, -50}), {})),
              (std::vector<double>{1, 3}));
}

TEST(FindPeaks, DipSmallerThanTheExcursion_HidesTheLowerPeak) {
    const SpectrumTrace trace = levels({-50, -10, -13, -12, -50});
    EXPECT_EQ(findPeaks(trace, {.excursion = 6}).size(), 1u);
    EXPECT_EQ(findPeaks(trace, {.excursion = 1}).size(), 2u);
    EXPECT_EQ(findPeaks(trace, {.excursion = 1.01}).size(), 1u);
}

TEST(FindPeaks, EqualPeaksWithASmallDip_EachCount) {
    EXPECT_EQ(findPeaks(levels({-50, -10, -11, -10, -50}), {.excursion = 6}).size(), 2u);
}

TEST(FindPeaks, FlatTop_CountsOnceByItsMiddle) {
    const std::vector<Peak> odd = findPeaks(levels({-50, -10, -10, -10, -50}), {});
    ASSERT_EQ(odd.size(), 1u);
    EXPECT_EQ(odd[0].x, 2);
    EXPECT_EQ(odd[0].level, -10);
    const std::vector<Peak> four = findPeaks(levels({-50, -10, -10, -10, -10, -50}), {});
    ASSERT_EQ(four.size(), 1u);
    EXPECT_EQ(four[0].index, 2u);
    EXPECT_EQ(four[0].x, 2);
}

TEST(FindPeaks, FlatTopOfTwo_LiesBetweenThem) {
    const std::vector<Peak> peaks = findPeaks(levels({-50, -10, -10, -50}), {});
    ASSERT_EQ(peaks.size(), 1u);
    EXPECT_EQ(peaks[0].index, 1u);
    EXPECT_DOUBLE_EQ(peaks[0].x, 1.5);
    EXPECT_DOUBLE_EQ(peaks[0].level, -5);
}

TEST(FindPeaks, Border_CountsAsAFallAndIsNotRefined) {
    const std::vector<Peak> left = findPeaks(levels({-10, -11, -50}), {});
    ASSERT_EQ(left.size(), 1u);
    EXPECT_EQ(left[0].x, 0);
    EXPECT_EQ(left[0].level, -10);
    const std::vector<Peak> right = findPeaks(levels({-50, -12, -10}), {});
    ASSERT_EQ(right.size(), 1u);
    EXPECT_EQ(right[0].x, 2);
}

TEST(FindPeaks, FlatTrace_IsOnePeakInTheMiddle) {
    EXPECT_EQ(places(findPeaks(levels({-60, -60, -60, -60, -60}), {})), (std::vector<double>{2}));
}

TEST(FindPeaks, Threshold_IsIncluded) {
    const SpectrumTrace trace = levels({-50, -10, -50});
    EXPECT_EQ(findPeaks(trace, {.threshold = -10}).size(), 1u);
    EXPECT_EQ(findPeaks(trace, {.threshold = -9.99}).size(), 0u);
}

TEST(FindPeaks, EmptyTraceAndOneSample) {
    EXPECT_TRUE(findPeaks(levels({}), {}).empty());
    EXPECT_EQ(places(findPeaks(levels({-30}), {})), (std::vector<double>{0}));
}

TEST(WidthAtLevel, Gaussian_IsItsBandwidth) {
    const SpectrumTrace trace =
        madeTrace(601, 0, 10, [](double x) { return gaussian(x, 3000, 1000, -20); });
    const Peak peak = findPeaks(trace, {}).front();
    const PeakWidth width = widthAtLevel(trace, peak, 10 * std::log10(2.0));
    ASSERT_TRUE(width.width());
    EXPECT_NEAR(*width.low, 2500, 0.2);
    EXPECT_NEAR(*width.high, 3500, 0.2);
    EXPECT_NEAR(*width.width(), 1000, 0.4);
}

TEST(WidthAtLevel, Edge_IsLinearInDecibelsBetweenTheSamples) {
    const SpectrumTrace trace = levels({-30, -20, -30});
    const PeakWidth width = widthAtLevel(trace, {1, -20, 1}, 4);
    EXPECT_DOUBLE_EQ(width.low.value(), 0.6);
    EXPECT_DOUBLE_EQ(width.high.value(), 1.4);
    EXPECT_DOUBLE_EQ(width.width().value(), 0.8);
}

TEST(WidthAtLevel, LevelIsThatOfTheRefinedPeak) {
    const SpectrumTrace trace = levels({-30, -20, -30});
    EXPECT_DOUBLE_EQ(widthAtLevel(trace, {1, -19, 1}, 4).low.value(), 0.7);
}

TEST(WidthAtLevel, BorderFirst_HasNoEdge) {
    const PeakWidth width = widthAtLevel(levels({-12, -10, -30}), {1, -10, 1}, 6);
    EXPECT_FALSE(width.low);
    EXPECT_TRUE(width.high);
    EXPECT_FALSE(width.width());
}

TEST(WidthAtLevel, SampleAtTheLevel_IsTheEdge) {
    EXPECT_DOUBLE_EQ(widthAtLevel(levels({-40, -16, -10, -16, -40}), {2, -10, 2}, 6).low.value(),
                     1);
}

TEST(WidthAtLevel, NothingEnclosesTheLevel_HasNoEdge) {
    const PeakWidth width = widthAtLevel(levels({-30, -20, -30}), {1.2, -19, 1}, 0.5);
    EXPECT_FALSE(width.low);
    EXPECT_FALSE(width.high);
}

}  // namespace
}  // namespace zel
