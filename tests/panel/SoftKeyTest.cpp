#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "panel/TriggerKey.h"
#include "tests/panel/Panel.h"

namespace zel {
namespace {

struct QueryRow {
    const char* name;
    Menu menu;
    int key;
    const char* word;
    const char* answer;
    const char* shown;
    const char* field = nullptr;  // null: none is stored
    double value = 0;
    const char* choice = nullptr;
};

void PrintTo(const QueryRow& row, std::ostream* out) { *out << row.name; }

class SoftKeyQuery : public PanelSession, public ::testing::TestWithParam<QueryRow> {};

TEST_P(SoftKeyQuery, Press_AsksItsWordAndShowsTheAnswer) {
    open(GetParam().menu);
    get(GetParam().word, GetParam().answer);
    panel.SoftKey(GetParam().key).Click();
    expectPlayed();
    EXPECT_EQ(panel.SoftTextBox(GetParam().key).Text.get(), GetParam().shown);
    EXPECT_EQ(panel.SoftKey(GetParam().key).BackColor.get(), kRed);
    EXPECT_EQ(panel.MousePointer.get(), 0);
    if (GetParam().field != nullptr) {
        EXPECT_EQ(field(GetParam().field), GetParam().value);
    }
    if (GetParam().choice != nullptr) {
        EXPECT_EQ(panel.ChoiceBox(GetParam().key).Text(), GetParam().choice);
    }
}

TEST_P(SoftKeyQuery, Press_RefusedByTheInstrument_LeavesThePanelUsable) {
    open(GetParam().menu);
    getRefused(GetParam().word, "6");
    panel.SoftKey(GetParam().key).Click();
    expectPlayed();
    EXPECT_EQ(panel.MousePointer.get(), 0);
    EXPECT_EQ(boxes.texts(), Texts{});
}

const QueryRow kQueries[] = {
    {"Freq0", kFreq, 0, "FREQ", "1500000000", "1.5 GHz", "CenterFrequency", 1.5e9},
    {"Freq1", kFreq, 1, "SPAN", "2000000", "2 MHz", "Span", 2e6},
    {"Freq4", kFreq, 4, "FREQOFFS", "5000", "5 kHz", "FrequencyOffset", 5000},
    // A unit without a prefix does not read back.
    {"Freq4Small", kFreq, 4, "FREQOFFS", "100", "100 Hz", "FrequencyOffset", 0},
    {"Span0", kSpan, 0, "SPAN", "2000000", "2 MHz", "Span", 2e6},
    {"Ampt0", kAmpt, 0, "REFLVL", "-20", "-20 dBm", "ReferenceLevel", 0},
    {"Ampt1", kAmpt, 1, "RANGE", "1", "5dB/DIV (1)", "ReferenceRange", 1, "5dB/DIV"},
    {"Ampt2", kAmpt, 2, "UNIT", "2", "dBmuV (2)", "ReferenceUnit", 2, "dBµV"},
    {"Ampt3", kAmpt, 3, "REFLVLOFFS", "0", "0 dB", "ReferenceOffset", 0},
    {"Ampt4", kAmpt, 4, "RFINPUT", "1", "75 Ohm (1)", "RFInputImpedance", 1, "75 Ohm"},
    {"BW0", kBW, 0, "RBW", "9", "1 MHz (9)", "ResolutionBandwidth", 9, "1 MHz"},
    {"BW0NotOffered", kBW, 0, "RBW", "10", "200 kHz (10)", "ResolutionBandwidth", 10, ""},
    {"BW2", kBW, 2, "VBW", "12", "3 MkHz (12)", "VideoBandwidth", 12, "3 MHz"},
    {"Sweep0", kSweep, 0, "SWPTIME", "0.5", "500 ms", "SweepTime", 0.5},
    {"Sweep2", kSweep, 2, "SWPCONT", "1", "Continuous", "SweepContinuous", 1, "Continuous"},
    {"Sweep3", kSweep, 3, "TRIGSRC", "2", "Ext - Rise (2)", "TriggerSource", 2, "Ext - Rise"},
    {"Sweep4", kSweep, 4, "TRIGDEL", "0.002", "2 ms", "TriggerDelay", 0.002},
    {"Trace0", kTrace, 0, "TRACEMODE", "2", "Max Hold (2)", "TraceMode", 2, "Max Hold"},
    {"Trace1", kTrace, 1, "TRACEDET", "4", "RMS (4)", "TraceDetector", 4, "RMS"},
    {"Meas0", kMeas, 0, "MEAS", "4", "Channel Power (4)", nullptr, 0, "Chn Power"},
    {"Meas0Receiver", kMeas, 0, "MEAS", "8", "VSWR 1-1,1 (8)", nullptr, 0, "Receiver"},
    {"Tracking0", kTracking, 0, "TRANSCAL", "0", "Not calibrated (0)"},
    {"Tracking1", kTracking, 1, "REFLCAL", "1", "Calibrated (1)"},
    {"Tracking2", kTracking, 2, "TRANSVECTCAL", "1", "Calibrated (1)"},
    {"Tracking3", kTracking, 3, "REFLVECTCAL", "0", "Not calibrated (0)"},
    {"Tracking4", kTracking, 4, "TGLVL", "-10", "-10"},
    {"Power0", kPower, 0, "PWR", "-12.5", "-12.5 dBm"},
    {"Power1", kPower, 1, "FREQ", "1000000", "1 MHz"},
    {"Power3", kPower, 3, "MEASTIME", "2", "Long (2)", nullptr, 0, "Long"},
    {"Power4", kPower, 4, "REFL", "3", "3"},
    {"ChnPower0", kChnPower, 0, "CHPWR", "-30", "-30 dBm", "ChannelPowerValue", 0},
    {"ChnPower1", kChnPower, 1, "CHPWRSTD", "2", "cdmaOne (2)", "ChannelPowerStandard", 2,
     "cmdaOne"},
    {"ChnPower2", kChnPower, 2, "CHPWRUNIT", "2", "dBmuV (2)", "ChannelPowerUnit", 2, "dBµV"},
    {"ChnPower3", kChnPower, 3, "CHPWRBW", "200000", "200 kHz", "ChannelPowerBandwidth", 2e5},
    // The answer's own number, where the box reads back as 0.
    {"OccBW0", kOccBW, 0, "OBW", "250", "250 Hz", "OccBWValue", 250},
    {"OccBW1", kOccBW, 1, "OBWSTD", "3", "cdma2000 1x (3)", "OccBWStandard", 3, "cdma2000 1x"},
    {"OccBW2", kOccBW, 2, "OBWCHBW", "300000", "300 kHz", "ChannelPowerBandwidth", 3e5},
    {"Tdma0", kTdma, 0, "TDMAPWR", "-0.5", "-500 mdBm", "TDMAPowerValue", -0.5},
    {"Tdma1", kTdma, 1, "TDMASTD", "1", "GSM/EDGE (1)", "TDMAStandard", 1, "GSM/EDGE"},
    {"Tdma2", kTdma, 2, "MEASTIME", "0.5", "500 ms", "TDMAMeasTime", 0.5},
    // A name reads as 0.
    {"Dtf0", kDtf, 0, "CABLEMOD", "RG58", "0"},
    {"Dtf1", kDtf, 1, "CABLELEN", "12.5", "12.5", "CableLength", 12.5},
    {"Dtf2", kDtf, 2, "DTFMODE", "1", "Reflection (1)", "DTFMode", 1, "Reflection"},
    {"Dtf3", kDtf, 3, "LENUNIT", "FEET", "FEET"},
};

INSTANTIATE_TEST_SUITE_P(Rows, SoftKeyQuery, ::testing::ValuesIn(kQueries),
                         [](const auto& tested) { return std::string(tested.param.name); });

struct SoftKeyTest : PanelSession, ::testing::Test {};

TEST_F(SoftKeyTest, NotConnected_TellsItAndPaintsNothing) {
    open(kFreq);
    panel.isConnected = false;
    panel.SoftKey(2).Click();
    EXPECT_EQ(boxes.texts(), Texts{kNotConnected});
    EXPECT_EQ(boxes.boxes()[0].icon, BoxIcon::Information);
    EXPECT_EQ(panel.SoftKey(0).BackColor.get(), kRed);
    EXPECT_EQ(panel.SoftKey(2).BackColor.get(), kButtonFace);
}

TEST_F(SoftKeyTest, ContinuousView_RefusesWithItsBox) {
    open(kFreq);
    panel.ContinuosLoopActive = true;
    panel.SoftKey(2).Click();
    EXPECT_EQ(boxes.texts(), Texts{kContinuousView});
    EXPECT_EQ(boxes.boxes()[0].icon, BoxIcon::Exclamation);
    EXPECT_EQ(panel.SoftKey(2).BackColor.get(), kButtonFace);
}

TEST_F(SoftKeyTest, StartAndStopKeys_AreComputedFromCentreAndSpan) {
    open(kFreq);
    get("FREQ", "1500000000");
    get("SPAN", "200000000");
    panel.SoftKey(2).Click();
    EXPECT_EQ(panel.SoftTextBox(2).Text.get(), "1.4 GHz");
    get("FREQ", "1500000000");
    get("SPAN", "200000000");
    panel.SoftKey(3).Click();
    EXPECT_EQ(panel.SoftTextBox(3).Text.get(), "1.6 GHz");
    expectPlayed();
}

TEST_F(SoftKeyTest, FullSpan_SetsTheNumbersOfTheFamilyAndReadsATrace) {
    open(kSpan);
    set("SPAN,3000000000");
    sweep();
    panel.SoftKey(1).Click();
    expectPlayed();
    EXPECT_EQ(mirror.CenterFrequency, 1.5e9);
    EXPECT_EQ(mirror.Span, 3e9);
    EXPECT_EQ(panel.CFLabel.Caption.get(), "Center: 1.5 GHz");
    EXPECT_EQ(panel.SpanLabel.Caption.get(), "Span: 3 GHz");
    EXPECT_EQ(panel.SoftKey(1).BackColor.get(), kRed);
}

TEST_F(SoftKeyTest, ZeroSpan_LeavesTheCentreAlone) {
    mirror.CenterFrequency = 9e8;
    open(kSpan);
    set("SPAN,0");
    sweep();
    panel.SoftKey(2).Click();
    expectPlayed();
    EXPECT_EQ(mirror.Span, 0);
    EXPECT_EQ(mirror.CenterFrequency, 9e8);
    EXPECT_EQ(panel.SpanLabel.Caption.get(), "Span: 0 Hz");
}

TEST_F(SoftKeyTest, LastSpan_IsZeroUntilAManualSpan) {
    open(kSpan);
    set("SPAN,0");
    sweep();
    panel.SoftKey(3).Click();
    expectPlayed();
}

TEST_F(SoftKeyTest, LastSpan_RestoresTheSpanBeforeTheManualOne) {
    panel.LastSpan = 5e6;
    open(kSpan);
    set("SPAN,5000000");
    sweep();
    panel.SoftKey(3).Click();
    expectPlayed();
    EXPECT_EQ(mirror.Span, 5e6);
    EXPECT_EQ(panel.SpanLabel.Caption.get(), "Span: 5 MHz");
}

class LevelUnit : public PanelSession, public ::testing::TestWithParam<int> {};

TEST_P(LevelUnit, ReferenceLevel_IsShownInItsUnit) {
    const char* units[] = {"dBm", "dBmV", "dBµV", "dBµV/m", "dBµA/m", "dB", "V", "W", "dBm"};
    open(kAmpt);
    mirror.ReferenceUnit = GetParam();
    get("REFLVL", "2");
    panel.SoftKey(0).Click();
    expectPlayed();
    EXPECT_EQ(panel.SoftTextBox(0).Text.get(), std::string("2 ") + units[GetParam()]);
}

INSTANTIATE_TEST_SUITE_P(Codes, LevelUnit, ::testing::Range(0, 9));

TEST_F(SoftKeyTest, AutoBandwidth_SetsCodeZeroAndAsksBack) {
    open(kBW);
    set("RBW,0");
    get("RBW", "5");
    panel.SoftKey(1).Click();
    expectPlayed();
    EXPECT_EQ(panel.SoftTextBox(0).Text.get(), "10 kHz (5)");
    EXPECT_EQ(panel.ChoiceBox(0).Text(), "10 kHz");
    EXPECT_EQ(mirror.ResolutionBandwidth, 5);
}

TEST_F(SoftKeyTest, AutoBandwidth_WithSetSelected_OnlySets) {
    open(kBW);
    panel.SetOption.setValue(true);
    set("VBW,0");
    panel.SoftKey(3).Click();
    expectPlayed();
    EXPECT_EQ(panel.SoftTextBox(2).Text.get(), "Auto Set");
    EXPECT_EQ(panel.ChoiceBox(2).Text(), "Auto");
}

TEST_F(SoftKeyTest, AutoVideoBandwidth_Refused_SpeaksOfTheResolutionBandwidth) {
    open(kBW);
    panel.SetOption.setValue(true);
    set("VBW,0", "6");
    panel.SoftKey(3).Click();
    EXPECT_EQ(boxes.texts(), Texts{"Could not set Resolution Bandwidth to Auto"});
}

TEST_F(SoftKeyTest, AutoResolutionBandwidth_Refused_TellsNothing) {
    open(kBW);
    panel.SetOption.setValue(true);
    set("RBW,0", "6");
    panel.SoftKey(1).Click();
    EXPECT_EQ(boxes.texts(), Texts{});
}

TEST_F(SoftKeyTest, BandwidthPrompt_SendsTheLowerCaseWord) {
    open(kBW);
    panel.SetOption.setValue(true);
    boxes.answerPrompt("7");
    boxes.answerPrompt("11");
    set("rbw,7");
    set("vbw,11");
    panel.SoftKey(0).Click();
    EXPECT_EQ(panel.SoftKey(3).BackColor.get(), kGreen);
    panel.SoftKey(2).Click();
    expectPlayed();
    EXPECT_EQ(mirror.ResolutionBandwidth, 7);
    EXPECT_EQ(mirror.VideoBandwidth, 11);
    ASSERT_EQ(boxes.prompts().size(), 2U);
    EXPECT_EQ(boxes.prompts()[0].title, "Enter Value");
    EXPECT_EQ(boxes.prompts()[0].text, "Set the Resolution Bandwidth (0-9):");
    EXPECT_EQ(boxes.prompts()[1].text, "Set the Video Bandwidth (0-12):");
}

TEST_F(SoftKeyTest, BandwidthPrompt_Letters_SendAndStoreNothing) {
    open(kBW);
    mirror.ResolutionBandwidth = 3;
    panel.SetOption.setValue(true);
    boxes.answerPrompt("auto");
    panel.SoftKey(0).Click();
    EXPECT_EQ(port.written(), "");
    EXPECT_EQ(mirror.ResolutionBandwidth, 3);
}

TEST_F(SoftKeyTest, BandwidthPrompt_CancelledOrEmpty_SendsAndStoresNothing) {
    open(kBW);
    mirror.ResolutionBandwidth = 3;
    panel.SetOption.setValue(true);
    boxes.answerPrompt(std::nullopt);
    boxes.answerPrompt("");
    panel.SoftKey(0).Click();
    panel.SoftKey(0).Click();
    EXPECT_EQ(port.written(), "");
    EXPECT_EQ(mirror.ResolutionBandwidth, 3);
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

struct AutoSweepRow {
    const char* answer;
    const char* shown;
};

class AutoSweep : public PanelSession, public ::testing::TestWithParam<AutoSweepRow> {};

TEST_P(AutoSweep, Press_SetsZeroAndShowsOnOrOff) {
    open(kSweep);
    panel.SoftTextBox(1).Text = "as it was";
    set("SWPTIME,0");
    get("SWPTIME", GetParam().answer);
    get("SWPTIME", "0.5");
    panel.SoftKey(1).Click();
    expectPlayed();
    EXPECT_EQ(panel.SoftTextBox(1).Text.get(), GetParam().shown);
    EXPECT_EQ(panel.SoftTextBox(0).Text.get(), "500 ms");
    EXPECT_EQ(panel.SoftKey(0).BackColor.get(), kButtonFace);
    EXPECT_EQ(panel.SoftKey(1).BackColor.get(), kGreen);
}

INSTANTIATE_TEST_SUITE_P(Answers, AutoSweep,
                         ::testing::Values(AutoSweepRow{"0", "On"}, AutoSweepRow{"1", "Off"},
                                           AutoSweepRow{"2", "as it was"}));

struct TriggerRow {
    const char* code;
    const char* caption;
};

class TriggerSourceKey : public PanelSession, public ::testing::TestWithParam<TriggerRow> {};

TEST_P(TriggerSourceKey, Press_SetsTheCaptionOfTheValueKey) {
    open(kSweep);
    panel.SoftKey(4).Caption = "";
    get("TRIGSRC", GetParam().code);
    panel.SoftKey(3).Click();
    expectPlayed();
    EXPECT_EQ(panel.SoftKey(4).Caption.get(), GetParam().caption);
}

INSTANTIATE_TEST_SUITE_P(Codes, TriggerSourceKey,
                         ::testing::Values(TriggerRow{"0", "TRIGGER\r\nDELAY"},
                                           TriggerRow{"1", "TRIGGER\r\nLEVEL"},
                                           TriggerRow{"2", "TRIGGER\r\nDELAY"},
                                           TriggerRow{"3", "TRIGGER\r\nDELAY"}));

TEST_F(SoftKeyTest, TriggerLevel_MovesTheLineOfTheGraph) {
    open(kSweep);
    mirror.ReferenceRange = 4;
    showTriggerKey(panel, true);
    get("TRIGLVL", "30");
    panel.SoftKey(4).Click();
    expectPlayed();
    EXPECT_EQ(panel.SoftTextBox(4).Text.get(), "30 %");
    EXPECT_EQ(panel.CWGraph1.trigger().Height, -30);
    EXPECT_EQ(mirror.TriggerDelay, 0);
}

TEST_F(SoftKeyTest, HiddenTraceKey_RunsOneSweep) {
    open(kTrace);
    for (const char* word :
         {"FREQ", "SPAN", "REFLVL", "UNIT", "RANGE", "DYNRANGE", "TRACEDET", "SWPTIME"})
        get(word, "3");
    sweep();
    panel.SoftKey(2).Click();
    expectPlayed();
}

TEST_F(SoftKeyTest, LevelAdjust_IsACommandOfThreeMenus) {
    const struct {
        Menu menu;
        int key;
    } keys[] = {{kChnPower, 4}, {kOccBW, 3}, {kTdma, 3}};
    for (const auto& row : keys) {
        visited();
        panel.InstrumentMode = row.menu.mode;
        (panel.*row.menu.key).Click();
        cmd("LVLADJUST");
        panel.SoftKey(row.key).Click();
    }
    expectPlayed();
}

TEST_F(SoftKeyTest, LevelAdjust_WithSetSelected_IsSentButForTheChannelPower) {
    open(kChnPower);
    panel.SetOption.setValue(true);
    panel.SoftKey(4).Click();
    EXPECT_EQ(port.written(), "");
    for (const Menu& menu : {kOccBW, kTdma}) {
        visited();
        panel.InstrumentMode = menu.mode;
        (panel.*menu.key).Click();
        panel.SetOption.setValue(true);
        cmd("LVLADJUST");
        panel.SoftKey(3).Click();
    }
    expectPlayed();
}

TEST_F(SoftKeyTest, ChannelPower_IsShownInItsUnit) {
    open(kChnPower);
    get("CHPWRUNIT", "2");
    get("CHPWR", "77");
    panel.SoftKey(2).Click();
    panel.SoftKey(0).Click();
    expectPlayed();
    EXPECT_EQ(panel.SoftTextBox(0).Text.get(), "77 dBuV");
}

TEST_F(SoftKeyTest, LengthUnit_IsKeptAsText) {
    open(kDtf);
    get("LENUNIT", "FEET");
    panel.SoftKey(3).Click();
    EXPECT_EQ(mirror.LengthUnit, "FEET");
}

TEST_F(SoftKeyTest, TransducerKeys_AskAndSwitchOff) {
    open(kMeas);
    get("TRD2", "0");
    panel.SoftKey(1).Click();
    get("TRD1", "ANT1");
    get("TRD2", "ANT2");
    set("TRD1,NONE");
    set("TRD2,NONE");
    for (const int key : {0, 1, 2, 3}) panel.SoftKey(key).Click();
    expectPlayed();
    EXPECT_EQ(panel.SoftTextBox(0).Text.get(), "0");
}

TEST_F(SoftKeyTest, TransducerOff_WithSetSelected_SendsNothing) {
    open(kMeas);
    get("TRD2", "0");
    panel.SoftKey(1).Click();
    panel.SetOption.setValue(true);
    panel.SoftKey(2).Click();
    panel.SoftKey(3).Click();
    expectPlayed();
}

TEST_F(SoftKeyTest, LimitKeys_AskTheirLines) {
    open(kMeas);
    get("LIMPASS", "1");
    panel.SoftKey(2).Click();
    get("LIMLOW", "NONE");
    get("LIMUPP", "NONE");
    panel.SoftKey(0).Click();
    panel.SoftKey(1).Click();
    expectPlayed();
    EXPECT_EQ(panel.ChoiceBox(2).Text(), "Failed");
}

TEST_F(SoftKeyTest, ValueKey_WithSetSelected_AsksAndStoresNothing) {
    open(kFreq);
    mirror.CenterFrequency = 1e9;
    panel.SetOption.setValue(true);
    panel.SoftKey(0).Click();
    EXPECT_EQ(port.written(), "");
    EXPECT_EQ(mirror.CenterFrequency, 1e9);
}

TEST_F(SoftKeyTest, CodedKey_WithSetSelected_ReadsItsCaptionAsZero) {
    open(kAmpt);
    panel.SoftTextBox(1).Text = "5dB/DIV (1)";
    panel.SetOption.setValue(true);
    panel.SoftKey(1).Click();
    EXPECT_EQ(port.written(), "");
    EXPECT_EQ(panel.SoftTextBox(1).Text.get(), "10dB/DIV (0)");
}

TEST_F(SoftKeyTest, CodeThatIsNone_LeavesTheList) {
    open(kTrace);
    panel.ChoiceBox(1).setListIndex(2);
    get("TRACEDET", "9");
    panel.SoftKey(1).Click();
    expectPlayed();
    EXPECT_EQ(panel.ChoiceBox(1).Text(), "Max Peak");
    EXPECT_EQ(panel.SoftTextBox(1).Text.get(), "9");
}

TEST_F(SoftKeyTest, InstrumentThatDies_LeavesThePanelUsable) {
    open(kFreq);
    getSilent();
    panel.SoftKey(0).Click();
    EXPECT_EQ(boxes.texts(), Texts{"No response received!"});
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

}  // namespace
}  // namespace zel
