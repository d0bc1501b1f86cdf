#include <gtest/gtest.h>

#include "tests/files/FileSession.h"

namespace zel {
namespace {

using CF = ControllerForm;

struct ViewHeaderTest : FileSession, ::testing::Test {
    ViewHeaderTest() { narrowSpan(); }
};

TEST_F(ViewHeaderTest, Analyzer_WritesAllLinesInTheirOrder) {
    mirror.InstrumentModel = 9102;
    mirror.InstrumentSerial = 100234;
    mirror.FrequencyOffset = 1.25;
    mirror.TriggerDelay = 0.001;
    mirror.TriggerLevelValue = -30.5;
    mirror.TraceDetector = 3;
    mirror.ReferenceOffset = 2;
    const Texts wanted = {"Trace Name;Analyzer",
                          "Date;2026-01-01",
                          "Time;12:00:00",
                          "Instrument Model Number;9102",
                          "Instrument Serial Number;100234",
                          "Measurement Type;Analyzer",
                          "Dynamic Range;Low Distortion",
                          "Center Frequency;1500000000",
                          "Span;1000000",
                          "Frequency Offset;1.25",
                          "Sweeptime;0.02",
                          "Trigger Mode;Free Run",
                          "Trigger Delay;0.001",
                          "Trigger Level;-30.5",
                          "Resolution Bandwidth;100000",
                          "Video Bandwidth;100000",
                          "Reference Unit;dBm",
                          "Reference Range;10 dB/div",
                          "Reference Level;-20",
                          "Reference Offset;2",
                          "Input Value (Ohm);50",
                          "Trace Mode;Clear / Write",
                          "Trace Detector;Sample",
                          "RF Attenuator Setting;0",
                          "Transducer;- - -",
                          "Transducer (dB);- - -",
                          "Transducer Offset;0",
                          "Trace Unit Offset;2147483647",
                          "Trace Write Pointer;301"};
    EXPECT_EQ(header(), wanted);
}

TEST_F(ViewHeaderTest, Header_EndsWithAnEmptyLineAheadOfTheRows) {
    mirror.TraceDetector = 3;
    sweepOf(ramp(-35250, -10));
    const Texts lines = linesOf(save("view.csv"));
    ASSERT_EQ(lines.size(), 29U + 1 + 301);
    EXPECT_EQ(lines[28], "Trace Write Pointer;301");
    EXPECT_EQ(lines[29], "");
    EXPECT_EQ(lines[30], "1499500000.000;-35.25; ");
}

struct ModeLines {
    int mode;
    int standard;
    const char* traceName;
    const char* type;
    const char* measurement;
};

struct ModeHeaderTest : FileSession, ::testing::TestWithParam<ModeLines> {};

TEST_P(ModeHeaderTest, NamesTheModeAndItsMeasurement) {
    const ModeLines& row = GetParam();
    panel.InstrumentMode = static_cast<std::int16_t>(row.mode);
    mirror.ChannelPowerStandard = mirror.OccBWStandard = mirror.TDMAStandard = mirror.DTFMode =
        static_cast<std::int16_t>(row.standard);
    EXPECT_EQ(entry("Trace Name"), row.traceName);
    EXPECT_EQ(entry("Measurement Type"), row.type);
    EXPECT_EQ(entry("Measurement"), row.measurement);
}

// "-" stands for a line that is not written.
INSTANTIATE_TEST_SUITE_P(
    Modes, ModeHeaderTest,
    ::testing::Values(
        ModeLines{CF::ANALYZER, 0, "Analyzer", "Analyzer", "-"},
        ModeLines{CF::TRACKINGGENERATOR, 0, "Tracking Gen", "Tracking Gen", "-"},
        ModeLines{CF::CHANNELPOWER, 0, "CHAN PWR USER", "Channel Power", "CHAN PWR USER"},
        ModeLines{CF::CHANNELPOWER, 1, "3GPP WCDMA", "Channel Power", "3GPP WCDMA"},
        ModeLines{CF::CHANNELPOWER, 2, "cdmaOne", "Channel Power", "cdmaOne"},
        ModeLines{CF::CHANNELPOWER, 3, "cdma2000 1x", "Channel Power", "cdma2000 1x"},
        ModeLines{CF::CHANNELPOWER, 4, "-", "-", "-"},
        ModeLines{CF::OCCBANDWIDTH, 0, "OBW USER", "Occupied Bandwidth", "OBW USER"},
        ModeLines{CF::OCCBANDWIDTH, 1, "3GPP WCDMA", "Occupied Bandwidth", "3GPP WCDMA"},
        ModeLines{CF::OCCBANDWIDTH, 2, "cdmaOne", "Occupied Bandwidth", "cdmaOne"},
        ModeLines{CF::OCCBANDWIDTH, 3, "cdma2000 1x", "Occupied Bandwidth", "cdma2000 1x"},
        ModeLines{CF::OCCBANDWIDTH, 9, "-", "-", "-"},
        ModeLines{CF::TDMAPOWERMODE, 0, "TDMA PWR USER", "TDMA Power", "TDMA PWR USER"},
        ModeLines{CF::TDMAPOWERMODE, 1, "GSM EDGE", "TDMA Power", "GSM EDGE"},
        ModeLines{CF::DISTTOFAULTMEASURE, 0, "DTF", "Fault Location", "DTF"},
        ModeLines{CF::DISTTOFAULTMEASURE, 1, "DTF Reflection", "Fault Location", "DTF Reflection"},
        ModeLines{CF::DISTTOFAULTMEASURE, 2, "DTF Spectrum", "Fault Location", "DTF Spectrum"},
        ModeLines{CF::RECEIVER, 0, "Receiver", "Receiver", "-"}));

TEST_F(ViewHeaderTest, PowerSensor_HasALineOfItsOwn) {
    // The menu writes the power log in that mode; a recording's request saves the trace.
    panel.InstrumentMode = CF::POWERSENSOR;
    panel.CommonDialog1FileName = folder.file("view.csv");
    panel.SaveView("trace");
    const Texts lines = linesOf(folder.read("view.csv"));
    ASSERT_GT(lines.size(), 5U);
    EXPECT_EQ(lines[0], "Trace Name;Power Sensor");
    EXPECT_EQ(lines[5], "Measurement Type;Power Sensor");
}

TEST_F(ViewHeaderTest, DistanceToFault_WritesTheCableInsteadOfTriggerAndTransducer) {
    panel.InstrumentMode = CF::DISTTOFAULTMEASURE;
    mirror.CableLength = 33.5;
    EXPECT_EQ(entry("Cable"), "<none>");
    EXPECT_EQ(entry("Cable Length"), "33.5 m");
    for (const char* name : {"Frequency Offset", "Trigger Mode", "Trigger Delay", "Trigger Level",
                             "Transducer", "Transducer (dB)", "Transducer Offset"})
        EXPECT_EQ(entry(name), "-") << name;
}

TEST_F(ViewHeaderTest, ChannelPower_EndsWithPositionsAndValue) {
    panel.InstrumentMode = CF::CHANNELPOWER;
    mirror.ChannelPowerBandwidth = 3840000;
    mirror.ChannelPowerValue = -33.25;
    const char* const units[] = {"dBm", "dBmV", "dBuV"};
    for (std::int16_t unit = 0; unit < 3; ++unit) {
        mirror.ChannelPowerUnit = unit;
        const Texts lines = header();
        const Texts tail(lines.end() - 4, lines.end());
        EXPECT_EQ(tail, (Texts{"Trace Write Pointer;301", "Start Position;25", "Stop Position;275",
                               std::string("Measured Value;-33.25 ") + units[unit]}));
    }
    EXPECT_EQ(entry("Channel Bandwidth"), "3840000");
}

TEST_F(ViewHeaderTest, OccupiedBandwidth_EndsWithPositionsAndValue) {
    panel.InstrumentMode = CF::OCCBANDWIDTH;
    mirror.OccBWChannelBandwidth = 5e6;
    mirror.OccBWValue = 4123456;
    EXPECT_EQ(entry("Channel Bandwidth"), "5000000");
    EXPECT_EQ(entry("Start Position"), "1");
    EXPECT_EQ(entry("Stop Position"), "299");
    EXPECT_EQ(entry("Measured Value"), "4123456 Hz");
}

TEST_F(ViewHeaderTest, TdmaPower_EndsWithTimeAndValue) {
    panel.InstrumentMode = CF::TDMAPOWERMODE;
    mirror.TDMAMeasTime = 0.000577;
    mirror.TDMAPowerValue = 12.5;
    EXPECT_EQ(entry("TDMA Time"), "0.000577");
    EXPECT_EQ(entry("Start Position"), "1");
    EXPECT_EQ(entry("Stop Position"), "299");
    EXPECT_EQ(entry("Measured Value"), "12.5 dBm");
}

TEST_F(ViewHeaderTest, Analyzer_HasNeitherPositionsNorValue) {
    for (const char* name : {"Start Position", "Stop Position", "Measured Value", "TDMA Time",
                             "Channel Bandwidth", "Cable"})
        EXPECT_EQ(entry(name), "-") << name;
}

TEST_F(ViewHeaderTest, ZeroSpan_IsWrittenAsAWord) {
    mirror.Span = 0;
    EXPECT_EQ(entry("Span"), "ZERO SPAN");
}

TEST_F(ViewHeaderTest, DynamicRangeOtherThanZero_IsLowNoise) {
    mirror.DynamicRangeMode = 2;
    EXPECT_EQ(entry("Dynamic Range"), "Low Noise");
}

TEST_F(ViewHeaderTest, CodedLines_FollowTheirTables) {
    const auto check = [this](const char* name, auto& field, const Texts& words) {
        for (std::size_t code = 0; code < words.size(); ++code) {
            field = static_cast<std::remove_reference_t<decltype(field)>>(code);
            EXPECT_EQ(entry(name), words[code]) << name << " " << code;
        }
        field = {};
    };
    check("Reference Unit", mirror.ReferenceUnit,
          {"dBm", "dBmV", "dBuV", "dBuV/m", "dBuA/m", "dB", "V", "W", "-"});
    check("Reference Range", mirror.ReferenceRange,
          {"10 dB/div", "5 dB/div", "2 dB/div", "1 dB/div", "lin 0 - 100%", "TODO", "TODO", "TODO",
           "TODO"});
    check("Trace Mode", mirror.TraceMode,
          {"Clear / Write", "Average", "Min Hold", "Max Hold", "View"});
    check("Trace Detector", mirror.TraceDetector,
          {"Auto Peak (Auto)", "Min Peak", "Max Peak", "Sample", "RMS"});
    check("Trigger Mode", mirror.TriggerSource, {"Free Run", "Video", "Ext Rise", "Ext Fall", "-"});
}

TEST_F(ViewHeaderTest, BandwidthCodes_AreWrittenInHertz) {
    const Texts rbw = {"100",    "300",    "1000",    "3000",   "10000", "30000",
                       "100000", "300000", "1000000", "200000", "-"};
    const Texts vbw = {"10",    "30",     "100",    "300",     "1000",    "3000", "10000",
                       "30000", "100000", "300000", "1000000", "3000000", "-"};
    for (std::size_t i = 0; i < rbw.size(); ++i) {
        mirror.ResolutionBandwidth = static_cast<double>(i + 1);
        EXPECT_EQ(entry("Resolution Bandwidth"), rbw[i]) << "code " << i + 1;
    }
    for (std::size_t i = 0; i < vbw.size(); ++i) {
        mirror.VideoBandwidth = static_cast<double>(i + 1);
        EXPECT_EQ(entry("Video Bandwidth"), vbw[i]) << "code " << i + 1;
    }
}

TEST_F(ViewHeaderTest, AutomaticBandwidth_IsAskedForTheNextFile) {
    startConnected();
    mirror.ResolutionBandwidth = 0;
    mirror.VideoBandwidth = 0;
    get("RBW", "6");
    get("VBW", "4");
    const Texts first = header("first.csv");
    expectPlayed();
    for (const std::string& line : first) EXPECT_EQ(line.find("Bandwidth"), std::string::npos);
    EXPECT_EQ(entry("Resolution Bandwidth"), "30000");
    EXPECT_EQ(entry("Video Bandwidth"), "300");
    EXPECT_EQ(boxes.texts(), Texts{});
}

TEST_F(ViewHeaderTest, AutomaticBandwidthWithoutConnection_IsToldAndTheFileWritten) {
    mirror.ResolutionBandwidth = 0;
    mirror.VideoBandwidth = 0;
    EXPECT_EQ(header().size(), 27U);
    EXPECT_EQ(boxes.texts(), (Texts{"No value for the Resolution Bandwidth was saved. Please "
                                    "enter it manually in the .csv file.",
                                    "No value for the Video Bandwidth was saved. Please enter it "
                                    "manually in the .csv file."}));
    EXPECT_EQ(mirror.ResolutionBandwidth, 1000000);
    EXPECT_EQ(mirror.VideoBandwidth, 1000000);
}

}  // namespace
}  // namespace zel
