#include <gtest/gtest.h>

#include <limits>

#include "desktop/graph/DivisionTicker.h"

namespace zel {
namespace {

/// Open to the tests what the plot calls.
class Ticker : public DivisionTicker {
  public:
    using DivisionTicker::createLabelVector;
    using DivisionTicker::createTickVector;
    using DivisionTicker::DivisionTicker;
    using DivisionTicker::getTickStep;
};

/// The texts of an axis from `lower` to `upper`.
QStringList labels(double lower, double upper, const std::string& unit, int every = 1) {
    Ticker ticker(every);
    ticker.setUnit(unit);
    const QCPRange range(lower, upper);
    const QVector<double> ticks = ticker.createTickVector(ticker.getTickStep(range), range);
    return ticker.createLabelVector(ticks, QLocale(QLocale::German), 'g', 2).toList();
}

TEST(DivisionTickerTest, Levels_ArePlainNumbersWithAPoint) {
    EXPECT_EQ(labels(-40, -20, "").join(" ").toStdString(),
              "-40 -38 -36 -34 -32 -30 -28 -26 -24 -22 -20");
    EXPECT_EQ(labels(-1, 0, "").at(5).toStdString(), "-0.5");
}

TEST(DivisionTickerTest, Frequencies_StandAtRoundPlacesWithPrefixAndUnit) {
    EXPECT_EQ(labels(0, 3e9, "Hz", 2).join("|").toStdString(),
              "0 Hz|500 MHz|1 GHz|1.5 GHz|2 GHz|2.5 GHz|3 GHz");
    EXPECT_EQ(labels(2.35e9, 2.45e9, "Hz", 2).join("|").toStdString(),
              "|2.36 GHz||2.38 GHz||2.4 GHz||2.42 GHz||2.44 GHz|");
    EXPECT_EQ(labels(2.351e9, 2.379e9, "Hz").join("|").toStdString(),
              "2.355 GHz|2.36 GHz|2.365 GHz|2.37 GHz|2.375 GHz");
}

TEST(DivisionTickerTest, Division_IsTheNextRoundStep) {
    EXPECT_EQ(divisionOf(-120, -20), 10);
    EXPECT_EQ(divisionOf(-100, -37), 10);
    EXPECT_EQ(divisionOf(-60, -56.5), 0.5);
    EXPECT_EQ(divisionOf(0, 19), 2);
    EXPECT_EQ(divisionOf(0, 21), 5);
    EXPECT_EQ(divisionOf(5, 5), 0);
}

TEST(DivisionTickerTest, SmallStepsOfALargeNumber_KeepTheirPlaces) {
    EXPECT_EQ(labels(999.9995e6, 1000.0005e6, "Hz").at(0).toStdString(), "999.9995 MHz");
    EXPECT_EQ(labels(-1e-3, 1e-3, "s").at(5).toStdString(), "0 s");
}

TEST(DivisionTickerTest, TinySteps_ShowTheirOwnDigits) {
    EXPECT_EQ(labels(0, 1e-6, "").join("|").toStdString(),
              "0|0.0000001|0.0000002|0.0000003|0.0000004|0.0000005|0.0000006|0.0000007|0.0000008|"
              "0.0000009|0.000001");
    EXPECT_EQ(labels(2.4e9, 2.4e9 + 50, "Hz").at(1).toStdString(), "2.400000005 GHz");
    EXPECT_EQ(labels(0, 1, "s").at(3).toStdString(), "300 ms");
}

TEST(DivisionTickerTest, RangeThatBeginsBelowZero_ShowsZeroWithoutASign) {
    EXPECT_EQ(labels(-0.4, 9.4, "").at(0).toStdString(), "0");
    EXPECT_EQ(labels(-0.4, 9.4, "Hz").at(0).toStdString(), "0 Hz");
}

TEST(DivisionTickerTest, EverySecondText_IsLeftOutFromEightTicksOn) {
    EXPECT_EQ(labels(0, 6, "", 2).join("|").toStdString(), "0|1|2|3|4|5|6");
    EXPECT_EQ(labels(0, 7, "", 2).join("|").toStdString(), "0||2||4||6|");
    EXPECT_EQ(labels(-30, -23, "", 2).join("|").toStdString(), "-30||-28||-26||-24|");
}

TEST(DivisionTickerTest, RangeWithoutAStep_HasNoTicks) {
    constexpr double kInfinite = std::numeric_limits<double>::infinity();
    EXPECT_TRUE(labels(5, 5, "").isEmpty());
    EXPECT_TRUE(labels(0, kInfinite, "").isEmpty());
    EXPECT_EQ(divisionOf(0, kInfinite), 0);
    // Nor one whose steps are too small to be drawn.
    EXPECT_TRUE(Ticker(1).createTickVector(1e-9, QCPRange(0, 1)).isEmpty());
    EXPECT_EQ(Ticker(1).createTickVector(1e-3, QCPRange(0, 1)).size(), 1001);
}

}  // namespace
}  // namespace zel
