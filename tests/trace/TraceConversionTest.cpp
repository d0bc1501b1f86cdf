#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <utility>
#include <vector>

#include "forms/Forms.h"
#include "model/CodeTables.h"
#include "trace/TraceConversion.h"

namespace zel {
namespace {

constexpr double kFiftyOhm = 16.9897000433602;  // 10 * log10(50)

struct TraceConversionTest : ::testing::Test {
    ControllerForm panel;
    WaterfallForm waterfall;
    Sweep sweep;
    ZEL3Variables& settings = sweep.settings;
    TraceConversion conversion{panel, waterfall.Graph3D};

    TraceConversionTest() { settings.TraceDetector = DETSAMPLE; }

    void view(double unit, double range, double level) {
        settings.ReferenceUnit = unit;
        settings.ReferenceRange = range;
        settings.ReferenceLevel = level;
        TraceConversion::SelectRawScale(sweep);
    }
    /// Converts raw samples of a detector that gives one a point.
    void convert(std::vector<double> raw) {
        sweep.raw = std::move(raw);
        conversion.ConvertTrace(sweep);
    }
    void convertPeak(std::vector<double> raw) {
        settings.TraceDetector = DETAUTOPEAK;
        convert(std::move(raw));
    }
    double bottom(double unit, LevelRange range, double level) const {
        return VerticalScale{unit, level, range}.ClipToBottom(-500);
    }
};

TEST_F(TraceConversionTest, SelectRawScale_FollowsTheUnit) {
    const double wanted[] = {1e3, 1e3, 1e3, 1e3, 1e3, 1e3, 1e6, 1e9, 1e3};
    for (int unit = 0; unit <= 8; ++unit) {
        settings.ReferenceUnit = unit;
        TraceConversion::SelectRawScale(sweep);
        EXPECT_EQ(sweep.rawScale, wanted[unit]) << "unit " << unit;
    }
}

TEST_F(TraceConversionTest, ExampleOnALogarithmicRange_IsDrawnAndSavedAsMeasured) {
    view(UNITDBM, RANGE10DB, -20);
    convert({-35250});
    EXPECT_EQ(sweep.shown[0], -35.25);
    EXPECT_EQ(sweep.physical[0], -35.25);
}

TEST_F(TraceConversionTest, ExampleOnALinearRange_IsDrawnInPercentAndSavedAsMeasured) {
    view(UNITDBM, RANGELIN, -20);
    convert({-35250});
    EXPECT_NEAR(sweep.shown[0], 17.2783, 1e-4);
    EXPECT_EQ(sweep.physical[0], -35.25);
}

/// What one raw sample becomes, for a detector that gives one a point and for auto peak.
struct Case {
    const char* name;
    double unit;
    double range;
    double level;
    double raw;
    double shown;
    double saved;
    double shownPeak;
    double savedPeak;
};

void PrintTo(const Case& one, std::ostream* out) { *out << one.name; }

class UnitAndRange : public TraceConversionTest, public ::testing::WithParamInterface<Case> {};

TEST_P(UnitAndRange, Sample_OfOneAPoint_IsShownAndSaved) {
    view(GetParam().unit, GetParam().range, GetParam().level);
    convert({GetParam().raw});
    EXPECT_NEAR(sweep.shown[0], GetParam().shown, 1e-9);
    EXPECT_NEAR(sweep.physical[0], GetParam().saved, 1e-12);
}

TEST_P(UnitAndRange, Sample_OfAutoPeak_IsShownAndSaved) {
    view(GetParam().unit, GetParam().range, GetParam().level);
    convertPeak({GetParam().raw});
    EXPECT_NEAR(sweep.shown[0], GetParam().shownPeak, 1e-9);
    EXPECT_NEAR(sweep.physical[0], GetParam().savedPeak, 1e-12);
}

std::vector<Case> decibelCases() {
    std::vector<Case> cases;
    const double perDivision[] = {10, 5, 2, 1};
    for (double unit = UNITDBM; unit <= UNITDB; ++unit) {
        for (int range = RANGE10DB; range <= RANGE1DB; ++range) {
            const double bottom = -20 - 10 * perDivision[range];
            cases.push_back(
                {"inside", unit, double(range), -20, -25123, -25.123, -25.123, -25.123, -25.123});
            cases.push_back({"above", unit, double(range), -20, -10000, -20, -10, -20, -10});
            cases.push_back(
                {"below", unit, double(range), -20, -300000, bottom, -300, bottom, -300});
        }
        // On a linear range the bottom is that of 10 dB a division, whatever the percentage.
        for (int range = RANGELIN; range <= RANGEVSWR11; ++range) {
            cases.push_back({"percent", unit, double(range), -20, -40000, 10, -40, 10, -40});
            cases.push_back({"full", unit, double(range), -20, -5000, 100, -5, 100, -5});
            // Ten divisions below 150 lie above a small percentage.
            cases.push_back({"lifted", unit, double(range), 150, 110000, 50, 110, 50, 110});
        }
    }
    return cases;
}

INSTANTIATE_TEST_SUITE_P(Decibels, UnitAndRange, ::testing::ValuesIn(decibelCases()));

std::vector<Case> linearCases() {
    const double halfVolt = 20 * std::log10(0.5) - kFiftyOhm + 30;
    const double oneVolt = 30 - kFiftyOhm;
    return {
        // 0.5 V of 1 V.
        {"volts", UNITV, RANGE10DB, 1, 500000, halfVolt, 0.5, halfVolt, 0.5},
        {"zero volts", UNITV, RANGE10DB, 1, 0, oneVolt - 100, 0, oneVolt - 100, 0},
        {"zero volts at 1 dB", UNITV, RANGE1DB, 1, 0, oneVolt - 10, 0, oneVolt - 10, 0},
        // Above the level: shown at it; saved as it is by auto peak only.
        {"volts above", UNITV, RANGE5DB, 1, 2000000, oneVolt, 1, oneVolt, 2},
        {"volts in percent", UNITV, RANGELIN, 1, 250000, 25, 0.25, 25, 0.25},
        {"volts above in percent", UNITV, RANGEVSWR6, 1, 2000000, 100, 1, 100, 2},
        // 1 mW of 10 mW.
        {"watts", UNITW, RANGE10DB, 0.01, 1e6, 0, 0.001, 0, 0.001},
        {"zero watts", UNITW, RANGE2DB, 0.01, 0, -10, 0, -10, 0},
        {"watts above", UNITW, RANGE10DB, 0.01, 1e8, 10, 0.01, 10, 0.1},
        {"watts in percent", UNITW, RANGEVSWR11, 0.01, 1e6, 10, 0.001, 10, 0.001},
        // Another linear unit on a logarithmic range: 0, or with auto peak the clipped value.
        {"volts a metre", 8, RANGE10DB, 50, 30000, 0, 30, 30, 30},
        {"volts a metre at the bottom", 8, RANGE1DB, 50, 30000, 40, 30, 40, 30},
        {"volts a metre above", 8, RANGE10DB, 50, 80000, 0, 50, 50, 80},
        {"volts a metre in percent", 8, RANGELIN, 50, 30000, 60, 30, 60, 30},
    };
}

INSTANTIATE_TEST_SUITE_P(Linear, UnitAndRange, ::testing::ValuesIn(linearCases()));

TEST_F(TraceConversionTest, DecibelUnit_RoundsToThreeDecimalsHalfToEven) {
    view(UNITDBM, RANGE10DB, 0);
    sweep.rawScale = 4000;  // makes ties of a thousandth
    convert({-4002, -4006});
    EXPECT_DOUBLE_EQ(sweep.physical[0], -1.0);
    EXPECT_DOUBLE_EQ(sweep.physical[1], -1.002);
}

TEST_F(TraceConversionTest, Volts_RoundToTenDecimals) {
    view(UNITV, RANGELIN, 1);
    sweep.rawScale = 3e6;
    convert({1e6});
    EXPECT_DOUBLE_EQ(sweep.physical[0], 0.3333333333);
}

TEST_F(TraceConversionTest, Watts_KeepAllTheirDecimals) {
    view(UNITW, RANGELIN, 1);
    sweep.rawScale = 3e9;
    convert({1});
    EXPECT_DOUBLE_EQ(sweep.physical[0], 1 / 3e9);
}

TEST_F(TraceConversionTest, NegativeSampleOfALinearUnit_LiesAtTheBottom) {
    view(UNITV, RANGE10DB, 1);
    convert({-5});
    EXPECT_NEAR(sweep.shown[0], 30 - kFiftyOhm - 100, 1e-9);
}

TEST_F(TraceConversionTest, ClipToReferenceLevel_LowersTheValueItself) {
    double value = -5;
    EXPECT_EQ((VerticalScale{UNITDBM, -20, LevelRange::ofCode(0)}.ClipToReferenceLevel(value)),
              -20);
    EXPECT_EQ(value, -20);
}

TEST_F(TraceConversionTest, ClipToReferenceLevel_LeavesALowerValue) {
    double value = -30;
    EXPECT_EQ((VerticalScale{UNITDBM, -20, LevelRange::ofCode(0)}.ClipToReferenceLevel(value)),
              -30);
    EXPECT_EQ(value, -30);
}

TEST_F(TraceConversionTest, ClipToBottom_WithRangeCode_CountsTenDivisions) {
    const double bottoms[] = {-120, -70, -40, -30, -120, -120, -120, -120, -120};
    for (int range = RANGE10DB; range <= RANGEVSWR11; ++range)
        EXPECT_EQ(bottom(UNITDBM, LevelRange::ofCode(range), -20), bottoms[range]) << range;
}

TEST_F(TraceConversionTest, ClipToBottom_WithoutRangeCode_TakesTheRangeAsDecibels) {
    EXPECT_EQ(bottom(UNITDBM, LevelRange::ofDecibels(5), -20), -70);
}

TEST_F(TraceConversionTest, ClipToBottom_RangeThatIsNotWhole_IsRounded) {
    EXPECT_EQ(bottom(UNITDBM, LevelRange::ofCode(0.6), -20), -70);
}

TEST_F(TraceConversionTest, ClipToBottom_InVoltsAndWatts_CountsFromTheLevelInDbm) {
    const LevelRange range = LevelRange::ofCode(RANGE10DB);
    EXPECT_NEAR(bottom(UNITV, range, 1), 30 - kFiftyOhm - 100, 1e-9);
    EXPECT_NEAR(bottom(UNITW, range, 0.001), -100, 1e-9);
}

TEST(LevelRange, Code_IsThatOfTheDecibels) {
    EXPECT_EQ(LevelRange::ofDecibels(5).code(), RANGE5DB);
    EXPECT_EQ(LevelRange::ofDecibels(RANGELIN).code(), RANGELIN);
    EXPECT_EQ(LevelRange::ofCode(RANGE2DB).code(), RANGE2DB);
    EXPECT_EQ(LevelRange::ofCode(RANGE2DB).perDivision(), 2);
    EXPECT_EQ(LevelRange::ofDecibels(2).perDivision(), 2);
}

TEST_F(TraceConversionTest, SamplesThatDidNotCome_AreNoNumbersAndNoExtremes) {
    const double none = std::numeric_limits<double>::quiet_NaN();
    view(UNITDBM, RANGE10DB, 0);
    convert({-10000, none, none});
    EXPECT_EQ(sweep.shown[0], -10);
    EXPECT_TRUE(std::isnan(sweep.shown[1]));
    EXPECT_TRUE(std::isnan(sweep.physical[2]));
    EXPECT_EQ(panel.TraceMinimum, -10);
    EXPECT_EQ(panel.TraceMaximum, -10);
    convertPeak({-10000, none});
    EXPECT_EQ(sweep.physical[0], -10);
    EXPECT_TRUE(std::isnan(sweep.shown[1]));
}

TEST_F(TraceConversionTest, Extremes_StartAtTheFirstPointWhileThereIsOnePlot) {
    view(UNITDBM, RANGE10DB, 0);
    panel.TraceMinimum = -500;
    panel.TraceMaximum = 500;
    convert({-10000, -30000, -20000});
    EXPECT_EQ(panel.TraceMinimum, -30);
    EXPECT_EQ(panel.TraceMaximum, -10);
}

TEST_F(TraceConversionTest, Extremes_RunOnWhileTheWaterfallKeepsPlots) {
    view(UNITDBM, RANGE10DB, 0);
    waterfall.Graph3D.addPlot();
    panel.TraceMinimum = -50;
    panel.TraceMaximum = -5;
    convert({-60000, -30000});
    EXPECT_EQ(panel.TraceMinimum, -60);
    EXPECT_EQ(panel.TraceMaximum, -5);
}

TEST_F(TraceConversionTest, Extremes_AreLeftAloneByAutoPeak) {
    view(UNITDBM, RANGE10DB, 0);
    panel.TraceMinimum = 1;
    panel.TraceMaximum = 2;
    convertPeak({-50000});
    EXPECT_EQ(panel.TraceMinimum, 1);
    EXPECT_EQ(panel.TraceMaximum, 2);
}

TEST_F(TraceConversionTest, Colours_SpreadOverTheThirdAxis) {
    view(UNITDBM, RANGE10DB, 0);
    waterfall.Graph3D.setRange(3, -100, 0);
    convert({-10000, -25000, -80000, -10000});
    EXPECT_EQ(sweep.colours, (std::vector<double>{0, 75, 20, 100}));
}

TEST_F(TraceConversionTest, Colours_OfAutoPeak_ArePinnedAtBothEndsToo) {
    view(UNITDBM, RANGE10DB, 0);
    waterfall.Graph3D.setRange(3, -100, 0);
    convertPeak({-10000, -40000, -10000});
    EXPECT_EQ(sweep.colours, (std::vector<double>{0, 60, 100}));
}

TEST_F(TraceConversionTest, Colours_OnAnAxisOfNoHeight_AreFinite) {
    view(UNITDBM, RANGE10DB, 0);
    waterfall.Graph3D.setRange(3, -20, -20);
    convert({-10000, -10000, -10000});
    EXPECT_EQ(sweep.colours[1], 0);
}

TEST_F(TraceConversionTest, EmptyTrace_GivesEmptyArrays) {
    view(UNITDBM, RANGE10DB, 0);
    convert({});
    EXPECT_TRUE(sweep.physical.empty());
    EXPECT_TRUE(sweep.colours.empty());
}

}  // namespace
}  // namespace zel
