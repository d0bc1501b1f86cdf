#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "panel/TriggerKey.h"
#include "platform/KeyInput.h"
#include "tests/panel/Panel.h"

namespace zel {
namespace {

struct SettingRow {
    const char* name;
    Menu menu;
    int box;
    const char* text;  // typed; null: the choice is picked
    int choice;
    const char* sent;
    const char* field = nullptr;
    double value = 0;
};

void PrintTo(const SettingRow& row, std::ostream* out) { *out << row.name; }

class Entry : public PanelSession, public ::testing::TestWithParam<SettingRow> {
  public:
    void put() {
        if (GetParam().text == nullptr) {
            panel.ChoiceBox(GetParam().box).pick(GetParam().choice);
        } else {
            type(GetParam().box, GetParam().text);
            enter(GetParam().box);
        }
    }
};

TEST_P(Entry, Value_IsSentAndStored) {
    open(GetParam().menu);
    set(GetParam().sent);
    put();
    expectPlayed();
    if (GetParam().field != nullptr) {
        EXPECT_EQ(field(GetParam().field), GetParam().value);
    }
    EXPECT_TRUE(panel.GetOption.Value());
    EXPECT_FALSE(panel.SetOption.Value());
    EXPECT_FALSE(panel.ChoiceBoxActivated);
    EXPECT_EQ(panel.SoftBoxFirstKey, 1);
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

TEST_P(Entry, Value_RefusedByTheInstrument_IsStoredAllTheSame) {
    open(GetParam().menu);
    set(GetParam().sent, "5");
    put();
    expectPlayed();
    ASSERT_EQ(boxes.boxes().size(), 1U);
    EXPECT_EQ(boxes.boxes()[0].title, "ZEL3 Error");
    if (GetParam().field != nullptr) {
        EXPECT_EQ(field(GetParam().field), GetParam().value);
    }
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

const SettingRow kSettings[] = {
    {"Ampt0", kAmpt, 0, "-35", 0, "REFLVL,-35", "ReferenceLevel", -35},
    {"Ampt0WithUnit", kAmpt, 0, "-35 dBm", 0, "REFLVL,0", "ReferenceLevel", 0},
    {"Ampt0Letters", kAmpt, 0, "abc", 0, "REFLVL,0", "ReferenceLevel", 0},
    {"Ampt1", kAmpt, 1, nullptr, 3, "RANGE,3", "ReferenceRange", 3},
    {"Ampt2", kAmpt, 2, nullptr, 7, "UNIT,7", "ReferenceUnit", 7},
    {"Ampt3", kAmpt, 3, "0.5", 0, "REFLVLOFFS,.5", "ReferenceOffset", 0.5},
    {"Ampt4", kAmpt, 4, nullptr, 1, "RFINPUT,1", "RFInputImpedance", 1},
    {"BW0", kBW, 0, nullptr, 9, "RBW,9", "ResolutionBandwidth", 9},
    {"BW2", kBW, 2, nullptr, 12, "VBW,12", "VideoBandwidth", 12},
    {"Sweep0", kSweep, 0, "20m", 0, "SWPTIME,.02", "SweepTime", 0.02},
    {"Sweep2Continuous", kSweep, 2, nullptr, 1, "SWPCONT,1", "SweepContinuous", 1},
    {"Sweep2Single", kSweep, 2, nullptr, 0, "SWPCONT,0", "SweepContinuous", 0},
    {"Sweep3", kSweep, 3, nullptr, 3, "TRIGSRC,3", "TriggerSource", 3},
    {"Sweep4", kSweep, 4, "2m", 0, "TRIGDEL,.002"},
    {"Trace0", kTrace, 0, nullptr, 2, "TRACEMODE,2", "TraceMode", 2},
    {"Trace1", kTrace, 1, nullptr, 4, "TRACEDET,4", "TraceDetector", 4},
    {"Tracking4", kTracking, 4, "-10.9", 0, "TGLVL,-10"},
    {"Power1", kPower, 1, "900M", 0, "FREQ,900000000"},
    {"Power3", kPower, 3, nullptr, 2, "MEASTIME,2"},
    {"ChnPower0", kChnPower, 0, "2", 0, "CHPWRSTD,2"},
    {"ChnPower1", kChnPower, 1, nullptr, 3, "CHPWRSTD,3", "ChannelPowerStandard", 3},
    {"ChnPower2", kChnPower, 2, nullptr, 1, "CHPWRUNIT,1", "ChannelPowerUnit", 1},
    // The bandwidth goes out under the unit's word, as a 16-bit number.
    {"ChnPower3", kChnPower, 3, "30k", 0, "CHPWRUNIT,30000"},
    {"OccBW1", kOccBW, 1, nullptr, 2, "OBWSTD,2", "OccBWStandard", 2},
    {"OccBW2", kOccBW, 2, "200.9k", 0, "OBWCHBW,200900", "OccBWChannelBandwidth", 200900},
    {"Tdma1", kTdma, 1, nullptr, 1, "TDMASTD,1", "TDMAStandard", 1},
    {"Tdma2", kTdma, 2, "3.9", 0, "MEASTIME,3", "TDMAMeasTime", 3},
    {"Dtf0", kDtf, 0, " RG58 ", 0, "CABLEMOD,RG58"},
    {"Dtf1", kDtf, 1, "12.5", 0, "CABLELEN,12.5", "CableLength", 12.5},
    // The text form of the locale, with its zero before the point.
    {"Dtf1Small", kDtf, 1, "0.5", 0, "CABLELEN,0.5", "CableLength", 0.5},
    {"Dtf2", kDtf, 2, nullptr, 2, "DTFMODE,2", "DTFMode", 2},
    {"Dtf3", kDtf, 3, " METER ", 0, "LENUNIT,METER"},
};

INSTANTIATE_TEST_SUITE_P(Rows, Entry, ::testing::ValuesIn(kSettings),
                         [](const auto& tested) { return std::string(tested.param.name); });

struct SettingTest : PanelSession, ::testing::Test {
    SettingTest() {
        mirror.CenterFrequency = 1e9;
        mirror.Span = 2e8;
    }
};

TEST_F(SettingTest, Centre_AsksTheSpanAndReadsATrace) {
    open(kFreq);
    type(0, "1.5G");
    set("FREQ,1500000000");
    get("SPAN", "100000000");
    sweep();
    enter(0);
    expectPlayed();
    EXPECT_EQ(mirror.CenterFrequency, 1.5e9);
    EXPECT_EQ(mirror.Span, 1e8);
    EXPECT_EQ(panel.CFLabel.Caption.get(), "Center: 1.5 GHz");
    EXPECT_EQ(panel.SoftTextBox(1).Text.get(), "100 MHz");
    EXPECT_EQ(panel.SoftTextBox(2).Text.get(), "1.45 GHz");
    EXPECT_EQ(panel.SoftTextBox(3).Text.get(), "1.55 GHz");
}

TEST_F(SettingTest, ManualSpan_InItsOwnMenu_FillsTheHiddenEdgesToo) {
    open(kSpan);
    panel.SoftTextBox(2).Text = "old";
    panel.SoftTextBox(3).Text = "old";
    type(0, "50M");
    set("SPAN,50000000");
    sweep();
    enter(0);
    expectPlayed();
    EXPECT_FALSE(panel.SoftTextBox(2).Visible);
    EXPECT_FALSE(panel.SoftTextBox(3).Visible);
    EXPECT_EQ(panel.SoftTextBox(2).Text.get(), "975 MHz");
    EXPECT_EQ(panel.SoftTextBox(3).Text.get(), "1.025 GHz");
    // The frequency menu shows them as its own filling has them.
    visited();
    panel.FrequencyButton.Click();
    EXPECT_TRUE(panel.SoftTextBox(2).Visible);
    EXPECT_EQ(panel.SoftTextBox(2).Text.get(), "975 MHz");
    EXPECT_EQ(panel.SoftTextBox(3).Text.get(), "1.025 GHz");
}

TEST_F(SettingTest, ManualSpan_RemembersTheLastOne) {
    for (const Menu& menu : {kFreq, kSpan}) {
        visited();
        (panel.*menu.key).Click();
        mirror.Span = 2e8;
        const int box = menu.state == CF::Freq ? 1 : 0;
        type(box, "50M");
        set("SPAN,50000000");
        sweep();
        enter(box);
        EXPECT_EQ(panel.LastSpan, 2e8);
        EXPECT_EQ(mirror.Span, 5e7);
        EXPECT_EQ(panel.SpanLabel.Caption.get(), "Span: 50 MHz");
        EXPECT_EQ(panel.SoftTextBox(2).Text.get(), "975 MHz");
        EXPECT_EQ(panel.SoftTextBox(3).Text.get(), "1.025 GHz");
    }
    expectPlayed();
}

TEST_F(SettingTest, NewStart_SendsSpanThenCentre) {
    open(kFreq);
    type(2, "950M");  // the stop stays at 1.1 GHz
    set("SPAN,150000000");
    set("FREQ,1025000000");
    sweep();
    enter(2);
    expectPlayed();
    EXPECT_EQ(mirror.Span, 1.5e8);
    EXPECT_EQ(mirror.CenterFrequency, 1.025e9);
    EXPECT_EQ(panel.CFLabel.Caption.get(), "Center: 1.025 GHz");
    EXPECT_EQ(panel.SpanLabel.Caption.get(), "Span: 150 MHz");
    EXPECT_EQ(panel.LastSpan, 0);
}

TEST_F(SettingTest, NewStop_SendsSpanThenCentre) {
    open(kFreq);
    type(3, "1G");  // the start stays at 0.9 GHz
    set("SPAN,100000000");
    set("FREQ,950000000");
    sweep();
    enter(3);
    expectPlayed();
}

TEST_F(SettingTest, StartAboveStop_SendsNothingAndKeepsTheEntry) {
    open(kFreq);
    type(2, "1.2G");
    enter(2);
    EXPECT_EQ(port.written(), "");
    EXPECT_EQ(panel.SoftTextBox(2).Text.get(), "1.2G");
    EXPECT_EQ(mirror.Span, 2e8);
    EXPECT_EQ(panel.MousePointer.get(), 11);
    EXPECT_EQ(boxes.texts(), Texts{});
}

TEST_F(SettingTest, StartEqualToStop_IsAZeroSpan) {
    open(kFreq);
    type(2, "1.1G");
    set("SPAN,0");
    set("FREQ,1100000000");
    sweep();
    enter(2);
    expectPlayed();
    EXPECT_EQ(mirror.Span, 0);
}

TEST_F(SettingTest, Offset_RefreshesTheFrequencyLabel) {
    open(kFreq);
    type(4, "1k");
    set("FREQOFFS,1000");
    get("FREQ", "1000001000");
    enter(4);
    expectPlayed();
    EXPECT_EQ(mirror.FrequencyOffset, 1000);
    EXPECT_EQ(panel.CFLabel.Caption.get(), "Center: 1.000001 GHz");
}

TEST_F(SettingTest, ZeroSpanEntry_RewritesTheCentreOfTheMirror) {
    open(kSpan);
    type(2, "x");
    set("SPAN,0");
    sweep();
    enter(2);
    expectPlayed();
    EXPECT_EQ(mirror.CenterFrequency, 1.5e9);
    EXPECT_EQ(panel.CFLabel.Caption.get(), "Center: 1.5 GHz");
    EXPECT_EQ(panel.SpanLabel.Caption.get(), "Span: 0 Hz");
}

TEST_F(SettingTest, BandwidthPick_TellsAutoOrManual) {
    open(kBW);
    set("RBW,0");
    set("VBW,4");
    panel.ChoiceBox(0).pick(0);
    EXPECT_EQ(panel.SoftTextBox(1).Text.get(), "Auto");
    EXPECT_EQ(panel.SoftKey(3).BackColor.get(), kGreen);
    panel.ChoiceBox(2).pick(4);
    EXPECT_EQ(panel.SoftTextBox(3).Text.get(), "Manual");
    expectPlayed();
}

TEST_F(SettingTest, ManualSweepTime_EndsTheAutoTime) {
    open(kSweep);
    type(0, "1");
    set("SWPTIME,1");
    enter(0);
    EXPECT_EQ(panel.ChoiceBox(1).Text(), "Off");
}

TEST_F(SettingTest, SweepMode_KeepsTheSingleSweepFlag) {
    open(kSweep);
    set("SWPCONT,0");
    set("SWPCONT,1");
    panel.ChoiceBox(2).pick(0);
    EXPECT_TRUE(panel.SingleSweepModeActive);
    EXPECT_EQ(panel.SoftKey(2).BackColor.get(), kGreen);
    EXPECT_EQ(panel.SoftKey(3).BackColor.get(), kButtonFace);
    panel.ChoiceBox(2).pick(1);
    EXPECT_FALSE(panel.SingleSweepModeActive);
    expectPlayed();
}

TEST_F(SettingTest, AutoSweepPick_AsksTheTime) {
    open(kSweep);
    get("SWPTIME", "0.5");
    panel.ChoiceBox(1).pick(0);
    expectPlayed();
    EXPECT_EQ(panel.SoftKey(1).BackColor.get(), kGreen);
}

struct TriggerPick {
    int choice;
    bool external;
    const char* caption;
    bool line;
    bool sends;
};

class TriggerChoice : public PanelSession, public ::testing::TestWithParam<TriggerPick> {};

TEST_P(TriggerChoice, Pick_SetsCaptionLineAndFlag) {
    open(kSweep);
    mirror.ExternalTriggerActive = !GetParam().external;
    panel.SoftKey(4).Caption = "";
    panel.CWGraph1.setTrigger({"T", -30, !GetParam().line});
    if (GetParam().external) panel.CWGraph1.setTrigger({"T", -30, GetParam().line});
    if (GetParam().sends) set("TRIGSRC," + std::to_string(GetParam().choice));
    panel.ChoiceBox(3).pick(GetParam().choice);
    expectPlayed();
    EXPECT_EQ(mirror.ExternalTriggerActive, GetParam().external);
    EXPECT_EQ(panel.SoftKey(4).Caption.get(), GetParam().caption);
    EXPECT_EQ(panel.CWGraph1.trigger().Visible, GetParam().line);
    EXPECT_EQ(panel.SoftKey(3).BackColor.get(), kRed);
    if (!GetParam().sends) {
        EXPECT_EQ(port.written(), "");
    }
}

INSTANTIATE_TEST_SUITE_P(Picks, TriggerChoice,
                         ::testing::Values(TriggerPick{0, false, "TRIGGER\r\nDELAY", false, true},
                                           TriggerPick{1, false, "TRIGGER\r\nLEVEL", true, true},
                                           TriggerPick{2, true, "TRIGGER\r\nDELAY", false, true},
                                           TriggerPick{3, true, "TRIGGER\r\nDELAY", true, true},
                                           TriggerPick{4, false, "TRIGGER\r\nDELAY", true, false}));

TEST_F(SettingTest, TriggerLevel_GoesOutUnderItsWordAndMovesTheLine) {
    open(kSweep);
    mirror.ReferenceRange = 4;
    showTriggerKey(panel, true);
    type(4, "40");
    set("TRIGLVL,40");
    enter(4);
    expectPlayed();
    EXPECT_EQ(panel.CWGraph1.trigger().Height, -40);
}

TEST_F(SettingTest, NamesOfTransducersAndLimits_GoOutAsTyped) {
    open(kMeas);
    get("TRD2", "0");
    panel.SoftKey(1).Click();
    set("TRD1,ANT 1");
    set("TRD2,CABLE");
    type(0, " ANT 1 ");
    enter(0);
    type(1, "CABLE");
    enter(1);
    panel.SoftKey(4).Click();
    get("LIMPASS", "0");
    panel.SoftKey(2).Click();
    set("LIMLOW,LOW");
    set("LIMUPP,HIGH");
    type(0, "LOW");
    enter(0);
    type(1, "HIGH");
    enter(1);
    expectPlayed();
}

struct ModePick {
    int choice;
    const char* sent;
    std::int16_t mode;
    std::int16_t state;
    const char* behind;  // what the new menu's own entry sends in the same run
};

class ModeChoice : public PanelSession, public ::testing::TestWithParam<ModePick> {};

TEST_P(ModeChoice, Pick_EntersTheMode) {
    open(kMeas);
    panel.InstrumentMode = CF::RECEIVER;
    panel.SoftTextBox(0).Text = "";
    set(GetParam().sent);
    if (GetParam().behind != nullptr) set(GetParam().behind);
    panel.ChoiceBox(0).pick(GetParam().choice);
    expectPlayed();
    EXPECT_EQ(panel.InstrumentMode, GetParam().mode);
    EXPECT_EQ(panel.State, GetParam().state);
    EXPECT_EQ(mirror.MeasModeText, std::to_string(GetParam().choice));
}

INSTANTIATE_TEST_SUITE_P(
    Picks, ModeChoice,
    ::testing::Values(ModePick{0, "MEAS,1", CF::ANALYZER, CF::Freq, nullptr},
                      ModePick{1, "MEAS,1", CF::ANALYZER, CF::Freq, nullptr},
                      ModePick{2, "MEAS,2", CF::TRACKINGGENERATOR, CF::TRACKINGGEN, nullptr},
                      ModePick{3, "MEAS,3", CF::POWERSENSOR, CF::POWER, nullptr},
                      ModePick{4, "MEAS,4", CF::CHANNELPOWER, CF::CHNPOWER, "CHPWRSTD,0"},
                      ModePick{5, "MEAS,5", CF::OCCBANDWIDTH, CF::OCCBW, nullptr},
                      ModePick{6, "MEAS,6", CF::TDMAPOWERMODE, CF::TDMA, nullptr},
                      ModePick{7, "MEAS,7", CF::DISTTOFAULTMEASURE, CF::DISTFAULT, "CABLEMOD,0"},
                      ModePick{8, "MEAS,8", CF::RECEIVER, CF::MEAS, nullptr}));

TEST_F(SettingTest, ReceiverRefused_KeepsTheMode) {
    open(kMeas);
    set("MEAS,8", "6");
    panel.ChoiceBox(0).pick(8);
    EXPECT_EQ(panel.InstrumentMode, CF::ANALYZER);
}

TEST_F(SettingTest, FirstCharacterBehindAnEntry_ReplacesTheText) {
    open(kAmpt);
    panel.SoftBoxFirstKey = 1;
    panel.SoftTextBox(0).Text = "-20 dBm";
    typeText(panel.SoftTextBox(0), "-3");
    EXPECT_EQ(panel.SoftTextBox(0).Text.get(), "-3");
    set("REFLVL,-30");
    typeText(panel.SoftTextBox(0), "0\r");
    expectPlayed();
}

class EditKey : public PanelSession, public ::testing::TestWithParam<int> {};

TEST_P(EditKey, Press_KeepsTheTextForEditing) {
    open(kAmpt);
    panel.SoftBoxFirstKey = 1;
    panel.SoftTextBox(0).Text = "-20";
    pressKey(panel.SoftTextBox(0), GetParam());
    typeText(panel.SoftTextBox(0), "5");
    EXPECT_EQ(panel.SoftTextBox(0).Text.get(), "-205");
}

INSTANTIATE_TEST_SUITE_P(Keys, EditKey, ::testing::Values(8, 12, 37, 39));

TEST_F(SettingTest, EnterInAnEmptyBox_DoesNothing) {
    open(kAmpt);
    type(0, "");
    enter(0);
    EXPECT_EQ(port.written(), "");
    EXPECT_EQ(boxes.texts(), Texts{});
}

TEST_F(SettingTest, SamePickAgain_SendsItAgain) {
    open(kAmpt);
    set("RANGE,2");
    set("RANGE,2");
    panel.ChoiceBox(1).pick(2);
    panel.ChoiceBox(1).pick(2);
    expectPlayed();
}

TEST_F(SettingTest, NotConnected_TellsItAndSendsNothing) {
    open(kAmpt);
    panel.isConnected = false;
    type(0, "5");
    enter(0);
    EXPECT_EQ(boxes.texts(), Texts{kNotConnected});
    EXPECT_EQ(port.written(), "");
}

TEST_F(SettingTest, ContinuousView_RefusesWithItsBox) {
    open(kAmpt);
    panel.ContinuosLoopActive = true;
    panel.ChoiceBox(1).pick(2);
    EXPECT_EQ(boxes.texts(), Texts{kContinuousView});
    EXPECT_EQ(port.written(), "");
    EXPECT_FALSE(panel.ChoiceBoxActivated);
}

TEST_F(SettingTest, InstrumentThatDies_LeavesThePanelUsable) {
    open(kAmpt);
    type(0, "5");
    port.expect("set\r").silence();
    enter(0);
    EXPECT_EQ(boxes.texts(), Texts{"No response received!"});
    EXPECT_EQ(panel.MousePointer.get(), 0);
    EXPECT_TRUE(panel.GetOption.Value());
    EXPECT_EQ(mirror.ReferenceLevel, 5);
}

}  // namespace
}  // namespace zel
