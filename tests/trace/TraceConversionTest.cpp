#include <gtest/gtest.h>

#include <cmath>
#include <vector>

#include "forms/Forms.h"
#include "model/CodeTables.h"
#include "trace/TraceConversion.h"

namespace zel {
namespace {

constexpr double kFiftyOhm = 16.9897000433602;  // 10 * log10(50)

struct TraceConversionTest : ::testing::Test {
    ControllerForm panel;
    ZEL3Variables mirror;
    WaterfallForm waterfall;
    TraceConversion conversion{panel, mirror, waterfall.Graph3D};

    TraceConversionTest() { mirror.TraceDetector = DETSAMPLE; }

    void view(double unit, double range, double level) {
        mirror.ReferenceUnit = unit;
        mirror.ReferenceRange = range;
        mirror.ReferenceLevel = level;
        conversion.SelectRawScale();
    }
    /// Converts one raw sample of a detector that gives one a point.
    void convert(double raw) {
        panel.TraceData = {raw};
        conversion.ConvertTrace();
    }
    void convertPeak(double raw) {
        mirror.TraceDetector = DETAUTOPEAK;
        panel.PeakTraceData = {raw};
        conversion.ConvertTrace();
    }
};

TEST_F(TraceConversionTest, SelectRawScale_FollowsTheUnit) {
    const double wanted[] = {1e3, 1e3, 1e3, 1e3, 1e3, 1e3, 1e6, 1e9, 1e3};
    for (int unit = 0; unit <= 8; ++unit) {
        mirror.ReferenceUnit = unit;
        conversion.SelectRawScale();
        EXPECT_EQ(panel.RawScale, wanted[unit]) << "unit " << unit;
    }
}

TEST_F(TraceConversionTest, ExampleOnALogarithmicRange_IsDrawnAndSavedAsMeasured) {
    view(UNITDBM, RANGE10DB, -20);
    convert(-35250);
    EXPECT_EQ(panel.TraceData[0], -35.25);
    EXPECT_EQ(panel.RawTraceData[0], -35.25);
}

TEST_F(TraceConversionTest, ExampleOnALinearRange_IsDrawnInPercentAndSavedAsMeasured) {
    view(UNITDBM, RANGELIN, -20);
    convert(-35250);
    EXPECT_NEAR(panel.TraceData[0], 17.2783, 1e-4);
    EXPECT_EQ(panel.RawTraceData[0], -35.25);
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
    convert(GetParam().raw);
    EXPECT_NEAR(panel.TraceData[0], GetParam().shown, 1e-9);
    EXPECT_NEAR(panel.RawTraceData[0], GetParam().saved, 1e-12);
}

TEST_P(UnitAndRange, Sample_OfAutoPeak_IsShownAndSaved) {
    view(GetParam().unit, GetParam().range, GetParam().level);
    convertPeak(GetParam().raw);
    EXPECT_NEAR(panel.PeakTraceData[0], GetParam().shownPeak, 1e-9);
    EXPECT_NEAR(panel.RawTraceData[0], GetParam().savedPeak, 1e-12);
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
    panel.RawScale = 4000;  // makes ties of a thousandth
    panel.TraceData = {-4002, -4006};
    conversion.ConvertTrace();
    EXPECT_DOUBLE_EQ(panel.RawTraceData[0], -1.0);
    EXPECT_DOUBLE_EQ(panel.RawTraceData[1], -1.002);
}

TEST_F(TraceConversionTest, Volts_RoundToTenDecimals) {
    view(UNITV, RANGELIN, 1);
    panel.RawScale = 3e6;
    convert(1e6);
    EXPECT_DOUBLE_EQ(panel.RawTraceData[0], 0.3333333333);
}

TEST_F(TraceConversionTest, Watts_KeepAllTheirDecimals) {
    view(UNITW, RANGELIN, 1);
    panel.RawScale = 3e9;
    convert(1);
    EXPECT_DOUBLE_EQ(panel.RawTraceData[0], 1 / 3e9);
}

TEST_F(TraceConversionTest, NegativeSampleOfALinearUnit_LiesAtTheBottom) {
    view(UNITV, RANGE10DB, 1);
    convert(-5);
    EXPECT_NEAR(panel.TraceData[0], 30 - kFiftyOhm - 100, 1e-9);
}

TEST_F(TraceConversionTest, ClipToReferenceLevel_LowersTheValueItself) {
    mirror.ReferenceLevel = -20;
    double value = -5;
    EXPECT_EQ(conversion.ClipToReferenceLevel(value), -20);
    EXPECT_EQ(value, -20);
}

TEST_F(TraceConversionTest, ClipToReferenceLevel_LeavesALowerValue) {
    mirror.ReferenceLevel = -20;
    double value = -30;
    EXPECT_EQ(conversion.ClipToReferenceLevel(value), -30);
    EXPECT_EQ(value, -30);
}

TEST_F(TraceConversionTest, ClipToBottom_WithRangeCode_CountsTenDivisions) {
    const double bottoms[] = {-120, -70, -40, -30, -120, -120, -120, -120, -120};
    for (int range = RANGE10DB; range <= RANGEVSWR11; ++range) {
        view(UNITDBM, range, -20);
        EXPECT_EQ(conversion.ClipToBottom(-500, true), bottoms[range]) << "range " << range;
    }
}

TEST_F(TraceConversionTest, ClipToBottom_WithoutRangeCode_TakesTheRangeAsDecibels) {
    view(UNITDBM, 5, -20);
    EXPECT_EQ(conversion.ClipToBottom(-500, false), -70);
}

TEST_F(TraceConversionTest, ClipToBottom_RangeThatIsNotWhole_IsRounded) {
    view(UNITDBM, 0.6, -20);
    EXPECT_EQ(conversion.ClipToBottom(-500, true), -70);
}

TEST_F(TraceConversionTest, ClipToBottom_InVoltsAndWatts_CountsFromTheLevelInDbm) {
    view(UNITV, RANGE10DB, 1);
    EXPECT_NEAR(conversion.ClipToBottom(-500, true), 30 - kFiftyOhm - 100, 1e-9);
    view(UNITW, RANGE10DB, 0.001);
    EXPECT_NEAR(conversion.ClipToBottom(-500, true), -100, 1e-9);
}

TEST_F(TraceConversionTest, Detectors_ChooseTheArray) {
    view(UNITDBM, RANGE10DB, 0);
    for (const int detector : {DETMINPEAK, DETMAXPEAK, DETSAMPLE, DETRMS}) {
        mirror.TraceDetector = static_cast<std::uint8_t>(detector);
        panel.TraceData = {-1000};
        panel.PeakTraceData = {-2000, -3000};
        conversion.ConvertTrace();
        EXPECT_EQ(panel.TraceData[0], -1) << "detector " << detector;
        EXPECT_EQ(panel.PeakTraceData[0], -2000) << "detector " << detector;
        EXPECT_EQ(panel.RawTraceData.size(), 1U);
    }
    mirror.TraceDetector = DETAUTOPEAK;
    conversion.ConvertTrace();
    EXPECT_EQ(panel.PeakTraceData[1], -3);
    EXPECT_EQ(panel.RawTraceData.size(), 2U);
}

TEST_F(TraceConversionTest, Extremes_StartAtTheFirstPointWhileThereIsOnePlot) {
    view(UNITDBM, RANGE10DB, 0);
    panel.TraceMinimum = -500;
    panel.TraceMaximum = 500;
    panel.TraceData = {-10000, -30000, -20000};
    conversion.ConvertTrace();
    EXPECT_EQ(panel.TraceMinimum, -30);
    EXPECT_EQ(panel.TraceMaximum, -10);
}

TEST_F(TraceConversionTest, Extremes_RunOnWhileTheWaterfallKeepsPlots) {
    view(UNITDBM, RANGE10DB, 0);
    waterfall.Graph3D.addPlot();
    panel.TraceMinimum = -50;
    panel.TraceMaximum = -5;
    panel.TraceData = {-60000, -30000};
    conversion.ConvertTrace();
    EXPECT_EQ(panel.TraceMinimum, -60);
    EXPECT_EQ(panel.TraceMaximum, -5);
}

TEST_F(TraceConversionTest, Extremes_AreLeftAloneByAutoPeak) {
    view(UNITDBM, RANGE10DB, 0);
    panel.TraceMinimum = 1;
    panel.TraceMaximum = 2;
    convertPeak(-50000);
    EXPECT_EQ(panel.TraceMinimum, 1);
    EXPECT_EQ(panel.TraceMaximum, 2);
}

TEST_F(TraceConversionTest, Colours_SpreadOverTheThirdAxis) {
    view(UNITDBM, RANGE10DB, 0);
    waterfall.Graph3D.setRange(3, -100, 0);
    panel.TraceData = {-10000, -25000, -80000, -10000};
    conversion.ConvertTrace();
    EXPECT_EQ(panel.TraceColours, (std::vector<double>{0, 75, 20, 100}));
}

TEST_F(TraceConversionTest, Colours_OfAutoPeak_ArePinnedAtBothEndsToo) {
    view(UNITDBM, RANGE10DB, 0);
    waterfall.Graph3D.setRange(3, -100, 0);
    mirror.TraceDetector = DETAUTOPEAK;
    panel.PeakTraceData = {-10000, -40000, -10000};
    conversion.ConvertTrace();
    EXPECT_EQ(panel.TraceColours, (std::vector<double>{0, 60, 100}));
}

TEST_F(TraceConversionTest, Colours_OnAnAxisOfNoHeight_AreFinite) {
    view(UNITDBM, RANGE10DB, 0);
    waterfall.Graph3D.setRange(3, -20, -20);
    panel.TraceData = {-10000, -10000, -10000};
    conversion.ConvertTrace();
    EXPECT_EQ(panel.TraceColours[1], 0);
}

TEST_F(TraceConversionTest, EmptyTrace_GivesEmptyArrays) {
    view(UNITDBM, RANGE10DB, 0);
    panel.TraceData.clear();
    conversion.ConvertTrace();
    EXPECT_TRUE(panel.RawTraceData.empty());
    EXPECT_TRUE(panel.TraceColours.empty());
}

}  // namespace
}  // namespace zel
