#include <gtest/gtest.h>

#include <cstddef>
#include <string>
#include <vector>

#include "model/CodeTables.h"

namespace zel {
namespace {

struct TableCase {
    const char* name;
    CodeTable table;
    std::vector<CodeRow> rows;
};

void PrintTo(const TableCase& table, std::ostream* out) { *out << table.name; }

class CodeTableRows : public ::testing::TestWithParam<TableCase> {};

TEST_P(CodeTableRows, Table_HasExactlyTheseRows) {
    const auto rows = codeTable(GetParam().table);
    ASSERT_EQ(rows.size(), GetParam().rows.size());
    for (std::size_t i = 0; i < rows.size(); ++i) {
        const CodeRow& wanted = GetParam().rows[i];
        EXPECT_EQ(rows[i].code, wanted.code);
        EXPECT_EQ(rows[i].caption, wanted.caption) << "code " << wanted.code;
        EXPECT_EQ(rows[i].choice, wanted.choice) << "code " << wanted.code;
        EXPECT_EQ(rows[i].text, wanted.text) << "code " << wanted.code;
        EXPECT_EQ(rows[i].number, wanted.number) << "code " << wanted.code;
    }
}

TEST_P(CodeTableRows, ChoiceList_HasItsCodesAsIndices) {
    // The entries that a list offers are the first ones of the table, without a gap.
    bool ended = false;
    int index = 0;
    for (const CodeRow& row : codeTable(GetParam().table)) {
        if (row.choice.empty()) {
            ended = true;
            continue;
        }
        EXPECT_FALSE(ended) << "code " << row.code << " stands after one that is not offered";
        EXPECT_EQ(row.code, index++);
    }
}

const TableCase kTables[] = {
    {"ReferenceUnit",
     CodeTable::ReferenceUnit,
     {{0, "dBm (", "dBm", "dBm"},
      {1, "dBmV (", "dBmV", "dBmV"},
      {2, "dBmuV (", "dBµV", "dBµV"},
      {3, "dBmuV/m (", "dBµV/m", "dBµV/m"},
      {4, "dBmuA/m (", "dBµA/m", "dBµA/m"},
      {5, "dB (", "dB", "dB"},
      {6, "Volt (", "Volt", "V"},
      {7, "Watt (", "Watt", "W"},
      {8, "V/m (", "", "dBm"}}},
    {"Range",
     CodeTable::Range,
     {{0, "10dB/DIV (", "10dB/DIV", "", 10},
      {1, "5dB/DIV (", "5dB/DIV", "", 5},
      {2, "2dB/DIV (", "2dB/DIV", "", 2},
      {3, "1dB/DIV (", "1dB/DIV", "", 1},
      {4, "LIN 0-100% (", "LIN 0-100%", "", 10},
      {5, "VSWR 1-6 (", "VSWR 1-6", "", 10},
      {6, "VSWR 1-2 (", "VSWR 1-2", "", 10},
      {7, "VSWR 1-1,5 (", "", "", 10},
      {8, "VSWR 1-1,1 (", "", "", 10}}},
    {"ResolutionBandwidth",
     CodeTable::ResolutionBandwidth,
     {{0, "Auto (", "Auto", "", 0},
      {1, "100 Hz (", "100 Hz", "", 100},
      {2, "300 Hz (", "300 Hz", "", 300},
      {3, "1 kHz (", "1 kHz", "", 1000},
      {4, "3 kHz (", "3 kHz", "", 3000},
      {5, "10 kHz (", "10 kHz", "", 10000},
      {6, "30 kHz (", "30 kHz", "", 30000},
      {7, "100 kHz (", "100 kHz", "", 100000},
      {8, "300 kHz (", "300 kHz", "", 300000},
      {9, "1 MHz (", "1 MHz", "", 1000000},
      {10, "200 kHz (", "", "", 200000}}},
    {"VideoBandwidth",
     CodeTable::VideoBandwidth,
     {{0, "Auto (", "Auto", "", 0},
      {1, "10 Hz (", "10 Hz", "", 10},
      {2, "30 Hz (", "30 Hz", "", 30},
      {3, "100 Hz (", "100 Hz", "", 100},
      {4, "300 Hz (", "300 Hz", "", 300},
      {5, "1 kHz (", "1 kHz", "", 1000},
      {6, "3 kHz (", "3 kHz", "", 3000},
      {7, "10 kHz (", "10 kHz", "", 10000},
      {8, "30 kHz (", "30 kHz", "", 30000},
      {9, "100 kHz (", "100 kHz", "", 100000},
      {10, "300 kHz (", "300 kHz", "", 300000},
      {11, "1 MHz (", "1 MHz", "", 1000000},
      {12, "3 MkHz (", "3 MHz", "", 3000000}}},
    {"Detector",
     CodeTable::Detector,
     {{0, "Auto Peak (", "Auto Peak"},
      {1, "Min Peak (", "Min Peak"},
      {2, "Max Peak (", "Max Peak"},
      {3, "Sample (", "Sample"},
      {4, "RMS (", "RMS"}}},
    {"TraceMode",
     CodeTable::TraceMode,
     {{0, "Clear Write (", "Clear Write"},
      {1, "Average (", "Average"},
      {2, "Max Hold (", "Max Hold"},
      {3, "Min Hold (", "Min Hold"},
      {4, "View (", "View"}}},
    {"TriggerSource",
     CodeTable::TriggerSource,
     {{0, "Free Run (", "Free Run", "TRIGGER\r\nDELAY"},
      {1, "Video (", "Video", "TRIGGER\r\nLEVEL"},
      {2, "Ext - Rise (", "Ext - Rise", "TRIGGER\r\nDELAY"},
      {3, "Ext - Fall (", "Ext - Fall", "TRIGGER\r\nDELAY"},
      {4, "", "Delay", "TRIGGER\r\nDELAY"}}},
    {"Standard",
     CodeTable::Standard,
     {{0, "User (", "User"},
      {1, "3GPP WCDMA (", "3GPP WCDMA"},
      {2, "cdmaOne (", "cmdaOne"},
      {3, "cdma2000 1x (", "cdma2000 1x"}}},
    {"TDMAStandard",
     CodeTable::TDMAStandard,
     {{0, "User (", "User"}, {1, "GSM/EDGE (", "GSM/EDGE"}}},
    {"ChannelPowerUnit",
     CodeTable::ChannelPowerUnit,
     {{0, "dBm (", "dBm", "dBm"}, {1, "dBmV (", "dBmV", "dBmV"}, {2, "dBmuV (", "dBµV", "dBuV"}}},
    {"DTFMode",
     CodeTable::DTFMode,
     {{0, "DTF (", "DTF"}, {1, "Reflection (", "Reflection"}, {2, "Spectrum (", "Spectrum"}}},
    {"MeasurementMode",
     CodeTable::MeasurementMode,
     {{0, "Off (", "Off"},
      {1, "Analyzer (", "Analyzer", "Analyzer"},
      {2, "Tracking Generator (", "Tracking Gen", "Tracking Generator"},
      {3, "Power Sensor (", "Pwr Sensor", "Power Sensor"},
      {4, "Channel Power (", "Chn Power", "Channel Power"},
      {5, "Occupied Bandwidth (", "Occ Bandwidth", "Occupied Bandwidth"},
      {6, "TDMA Power (", "TDMA Pwr", "TDMA Power"},
      {7, "Distance To Fault (", "Dist to Fault", "Distance To Fault"},
      {8, "VSWR 1-1,1 (", "Receiver", "Receiver"}}},
    {"RFInput", CodeTable::RFInput, {{0, "50 Ohm (", "50 Ohm"}, {1, "75 Ohm (", "75 Ohm"}}},
    {"SweepContinuous",
     CodeTable::SweepContinuous,
     {{0, "Single", "Single"}, {1, "Continuous", "Continuous"}}},
    {"MarkerMode",
     CodeTable::MarkerMode,
     {{0, "Normal (", "Normal"},
      {1, "Noise (", "Noise"},
      {2, "ControllerForm.FREQ Count (", "Freq Count"}}},
    {"LimitPass",
     CodeTable::LimitPass,
     {{0, "Unknown (", "Unknown"}, {1, "Failed (", "Failed"}, {2, "Passed (", "Passed"}}},
    {"Calibration", CodeTable::Calibration, {{0, "Not calibrated (", ""}, {1, "Calibrated (", ""}}},
    {"PowerMeasTime",
     CodeTable::PowerMeasTime,
     {{0, "Short (", "Short"}, {1, "Normal (", "Normal"}, {2, "Long (", "Long"}}},
    {"AutoSweepTime", CodeTable::AutoSweepTime, {{0, "On", "On"}, {1, "Off", "Off"}}},
};

INSTANTIATE_TEST_SUITE_P(All, CodeTableRows, ::testing::ValuesIn(kTables),
                         [](const auto& tested) { return std::string(tested.param.name); });

TEST(CodeConstantsTest, ReferenceUnits_AreTheirCodes) {
    EXPECT_EQ(
        (std::vector<int>{UNITDBM, UNITDBMV, UNITDBUV, UNITDBUVM, UNITDBUAM, UNITDB, UNITV, UNITW}),
        (std::vector<int>{0, 1, 2, 3, 4, 5, 6, 7}));
}

TEST(CodeConstantsTest, Ranges_AreTheirCodes) {
    EXPECT_EQ((std::vector<int>{RANGE10DB, RANGE5DB, RANGE2DB, RANGE1DB, RANGELIN, RANGEVSWR6,
                                RANGEVSWR2, RANGEVSWR15, RANGEVSWR11}),
              (std::vector<int>{0, 1, 2, 3, 4, 5, 6, 7, 8}));
}

TEST(CodeConstantsTest, DetectorsAndTraceModes_AreTheirCodes) {
    EXPECT_EQ((std::vector<int>{DETAUTOPEAK, DETMINPEAK, DETMAXPEAK, DETSAMPLE, DETRMS}),
              (std::vector<int>{0, 1, 2, 3, 4}));
    EXPECT_EQ(
        (std::vector<int>{TRACECLEARWRITE, TRACEAVERAGE, TRACEMINHOLD, TRACEMAXHOLD, TRACEVIEW}),
        (std::vector<int>{0, 1, 2, 3, 4}));
}

TEST(CodeConstantsTest, TriggersStandardsAndDtfModes_AreTheirCodes) {
    EXPECT_EQ((std::vector<int>{TRIGFREERUN, TRIGVIDEO, TRIGEXTRISE, TRIGEXTFALL}),
              (std::vector<int>{0, 1, 2, 3}));
    EXPECT_EQ((std::vector<int>{STDUSER, STDWCDMA, STDCDMAONE, STDCDMA2000, STDGSMEDGE}),
              (std::vector<int>{0, 1, 2, 3, 1}));
    EXPECT_EQ((std::vector<int>{DTFMODEDTF, DTFMODEREFLECTION, DTFMODESPECTRUM}),
              (std::vector<int>{0, 1, 2}));
}

TEST(FindCodeTest, CodeOutsideTheTable_GivesNull) {
    EXPECT_EQ(findCode(CodeTable::Range, 9), nullptr);
    EXPECT_EQ(findCode(CodeTable::Range, -1), nullptr);
    EXPECT_EQ(findCode(CodeTable::Range, 0.5), nullptr);
}

TEST(CodeCaptionTest, CodeTen_ShowsTheBandwidthThatNoListOffers) {
    EXPECT_EQ(codeCaption(CodeTable::ResolutionBandwidth, 10), "200 kHz (10)");
}

TEST(CodeCaptionTest, CaptionWithoutBracket_TakesNoCode) {
    EXPECT_EQ(codeCaption(CodeTable::SweepContinuous, 0), "Single");
    EXPECT_EQ(codeCaption(CodeTable::SweepContinuous, 1), "Continuous");
}

TEST(CodeCaptionTest, CodeWithoutCaption_GivesNothing) {
    EXPECT_EQ(codeCaption(CodeTable::TriggerSource, 4), "");
    EXPECT_EQ(codeCaption(CodeTable::Detector, 5), "");
}

TEST(CodeCaptionTest, CodeOne_MeansGsmEdgeForTdmaAndWcdmaForChannelPower) {
    EXPECT_EQ(codeCaption(CodeTable::TDMAStandard, 1), "GSM/EDGE (1)");
    EXPECT_EQ(codeCaption(CodeTable::Standard, 1), "3GPP WCDMA (1)");
}

TEST(LevelUnitTextTest, UnknownCode_FallsBackToDbm) {
    EXPECT_EQ(levelUnitText(9), "dBm");
    EXPECT_EQ(levelUnitText(-1), "dBm");
    EXPECT_EQ(levelUnitText(8), "dBm");
    EXPECT_EQ(levelUnitText(6), "V");
}

TEST(DecibelsPerDivisionTest, RangeCodes_GiveTenFiveTwoOneAndElseTen) {
    const double wanted[] = {10, 5, 2, 1, 10, 10, 10, 10, 10, 10};
    for (int code = 0; code < 10; ++code)
        EXPECT_EQ(decibelsPerDivision(code), wanted[code]) << "code " << code;
    EXPECT_EQ(decibelsPerDivision(-1), 10);
}

}  // namespace
}  // namespace zel
