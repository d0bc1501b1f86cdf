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

TEST(DivisionTickerTest, Frequencies_HavePrefixAndUnitAtEachSecondDivision) {
    EXPECT_EQ(labels(0, 3e9, "Hz", 2).join("|").toStdString(),
              "0 Hz||600 MHz||1.2 GHz||1.8 GHz||2.4 GHz||3 GHz");
}

TEST(DivisionTickerTest, SmallStepsOfALargeNumber_KeepTheirPlaces) {
    EXPECT_EQ(labels(999.9995e6, 1000.0005e6, "Hz").at(0).toStdString(), "999.9995 MHz");
    EXPECT_EQ(labels(-1e-3, 1e-3, "s").at(5).toStdString(), "0 s");
}

}  // namespace
}  // namespace zel
