#include <gtest/gtest.h>

#include "desktop/graph/DivisionTicker.h"

namespace zel {
namespace {

/// The texts of an axis from `lower` to `upper`.
QStringList labels(double lower, double upper, const std::string& unit, int every = 1) {
    class Ticker : public DivisionTicker {
      public:
        using DivisionTicker::createLabelVector;
        using DivisionTicker::createTickVector;
        using DivisionTicker::DivisionTicker;
        using DivisionTicker::getTickStep;
    };
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
    EXPECT_EQ(divisionOf(5, 5), 0);
}

TEST(DivisionTickerTest, SmallStepsOfALargeNumber_KeepTheirPlaces) {
    EXPECT_EQ(labels(999.9995e6, 1000.0005e6, "Hz").at(0).toStdString(), "999.9995 MHz");
    EXPECT_EQ(labels(-1e-3, 1e-3, "s").at(5).toStdString(), "0 s");
}

}  // namespace
}  // namespace zel
