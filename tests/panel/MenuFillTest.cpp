// What a menu shows when it opens, beside the answers to its own queries.

#include <gtest/gtest.h>

#include <array>
#include <ostream>
#include <string>

#include "panel/TriggerKey.h"
#include "tests/panel/Panel.h"

namespace zel {
namespace {

struct MenuFillTest : PanelSession, ::testing::Test {};

struct Shown {
    const char* name;
    Menu menu;
    std::array<const char*, 5> texts;  // of the box, or of the list where one is shown
};

void PrintTo(const Shown& row, std::ostream* out) { *out << row.name; }

class SecondVisit : public PanelSession, public ::testing::TestWithParam<Shown> {};

TEST_P(SecondVisit, Menu_ShowsTheMirror) {
    mirror.ReferenceLevel = -25;
    mirror.ReferenceOffset = 2;
    mirror.RFInputImpedance = 1;
    mirror.ResolutionBandwidth = 5;
    mirror.VideoBandwidth = 4;
    mirror.SweepTime = 0.5;
    mirror.SweepContinuous = 1;
    mirror.TriggerSource = 2;
    mirror.TraceMode = 1;
    mirror.TraceDetector = 4;
    mirror.MeasModeText = "6";
    mirror.ChannelPowerValue = -31;
    mirror.ChannelPowerStandard = 2;
    mirror.ChannelPowerUnit = 1;
    mirror.ChannelPowerBandwidth = 2e6;
    mirror.OccBWValue = 3e5;
    mirror.OccBWStandard = 3;
    mirror.OccBWChannelBandwidth = 4e6;
    mirror.TDMAPowerValue = -33;
    mirror.TDMAStandard = 1;
    mirror.TDMAMeasTime = 2;
    mirror.CableLength = 25;
    mirror.DTFMode = 1;
    mirror.LengthUnit = "FEET";
    if (GetParam().menu.state == CF::SWEEP) get("SWPTIME", "0.5");
    visited();
    panel.InstrumentMode = GetParam().menu.mode;
    if (GetParam().menu.state == CF::AMPT) {
        mirror.ReferenceRange = 1;
        mirror.ReferenceUnit = 2;
    }
    (panel.*GetParam().menu.key).Click();
    expectPlayed();
    for (int i = 0; i < 5; ++i) {
        const char* text = GetParam().texts[static_cast<std::size_t>(i)];
        if (text == nullptr) continue;
        const bool box = panel.SoftTextBox(i).Visible;
        EXPECT_EQ(box ? panel.SoftTextBox(i).Text.get() : panel.ChoiceBox(i).Text(), text) << i;
    }
}

const Shown kShown[] = {
    {"Amplitude", kAmpt, {"-25 dBm", "5dB/DIV", "dBµV", "2 dB", "75 Ohm"}},
    {"Bandwidth", kBW, {"10 kHz", "", "300 Hz", ""}},
    {"Sweep", kSweep, {"500 ms", nullptr, "Continuous", "Ext - Rise"}},
    {"Trace", kTrace, {"Average", "RMS"}},
    {"Measurement", kMeas, {"TDMA Pwr", "", ""}},
    {"ChannelPower", kChnPower, {"-31 dBmV", "cmdaOne", "dBmV", "2 MHz"}},
    {"OccupiedBandwidth", kOccBW, {"300 kHz", "cdma2000 1x", "4 MHz"}},
    {"Tdma", kTdma, {"-33 dBm", "GSM/EDGE", "2 s"}},
    {"DistanceToFault", kDtf, {"0", "25 m", "Reflection", "FEET"}},
};

INSTANTIATE_TEST_SUITE_P(Menus, SecondVisit, ::testing::ValuesIn(kShown),
                         [](const auto& tested) { return std::string(tested.param.name); });

TEST_F(MenuFillTest, NewMenu_PaintsItsFirstKeyAndEmptiesTheBoxes) {
    open(kAmpt);
    panel.SoftKey(2).BackColor = kRed;
    panel.isConnected = false;
    for (TextBox& box : panel.SoftTextBox) box.Text = "old";
    panel.TraceButton.Click();
    for (int i = 0; i < 5; ++i) {
        EXPECT_EQ(panel.SoftKey(i).BackColor.get(), i == 0 ? kRed : kButtonFace) << i;
        EXPECT_EQ(panel.SoftTextBox(i).Text.get(), "") << i;
    }
}

TEST_F(MenuFillTest, QuestionWithoutAnAnswer_IsTheLastOfItsMenu) {
    mirror.ReferenceOffset = 2;
    mirror.RFInputImpedance = 1;
    getSilent();
    panel.AmplitudeButton.Click();
    expectPlayed();
    EXPECT_EQ(boxes.texts(), Texts{"No response received!"});
    EXPECT_EQ(panel.SoftTextBox(3).Text.get(), "2 dB");
    EXPECT_EQ(panel.ChoiceBox(4).Text(), "75 Ohm");
}

TEST_F(MenuFillTest, RefusedQuestion_IsTheLastOfItsMenuToo) {
    getRefused("RBW", "6");
    panel.BWButton.Click();
    expectPlayed();
}

TEST_F(MenuFillTest, MarkerMenu_OnASilentLine_AsksOnce) {
    getSilent();
    Stopwatch waited(platform.clock);
    panel.MarkerButton.Click();
    expectPlayed();
    EXPECT_EQ(boxes.texts(), Texts{"No response received!"});
    EXPECT_LT(waited.Elapsed(), 20000);
}

TEST_F(MenuFillTest, SweepMenu_OnASilentLine_AsksOnce) {
    getSilent();
    panel.SweepButton.Click();
    expectPlayed();
    EXPECT_EQ(boxes.texts(), Texts{"No response received!"});
}

TEST_F(MenuFillTest, MarkerMenu_SecondMarkerRefused_AsksNoMore) {
    get("MARK1ON", "0");
    getRefused("DELTA1ON", "6");
    panel.MarkerButton.Click();
    expectPlayed();
}

TEST_F(MenuFillTest, TransducerMenu_BeginsWithAnEmptyName) {
    open(kMeas);
    get("MEAS", "1");
    get("TRD2", "0");
    panel.SoftKey(0).Click();
    EXPECT_EQ(panel.SoftTextBox(0).Text.get(), "Analyzer (1)");
    panel.SoftKey(1).Click();
    expectPlayed();
    EXPECT_EQ(panel.SoftTextBox(0).Text.get(), "");
    EXPECT_FALSE(panel.SoftTextBox(1).Locked);
}

TEST_F(MenuFillTest, OccupiedBandwidth_FirstVisit_KeepsACopyOfTheValue) {
    panel.InstrumentMode = CF::OCCBANDWIDTH;
    get("OBWSTD", "1");
    get("OBW", "250000");
    get("OBWCHBW", "5000000");
    panel.OccBWButton.Click();
    expectPlayed();
    EXPECT_EQ(field("OccBWValueCopy"), 250000);
}

TEST_F(MenuFillTest, OccupiedBandwidth_WithoutItsValue_KeepsTheOlderCopy) {
    mirror.OccBWValue = 1000;
    panel.InstrumentMode = CF::OCCBANDWIDTH;
    get("OBWSTD", "1");
    getRefused("OBW", "6");
    panel.OccBWButton.Click();
    expectPlayed();
    EXPECT_EQ(field("OccBWValueCopy"), 0);
}

TEST_F(MenuFillTest, Marker_FirstVisit_TakesTheStateOfTheInstrument) {
    get("MARK1ON", "0");
    get("DELTA1ON", "0");
    get("MARKMODE", "1");
    get("MARK1ON", "1");
    panel.MarkerButton.Click();
    expectPlayed();
    EXPECT_TRUE(mirror.MarkerOn);
    EXPECT_EQ(panel.ChoiceBox(2).Text(), "Noise");
}

TEST_F(MenuFillTest, Marker_ModeThatIsNotKnown_ShowsNone) {
    visited();
    mirror.MarkerModeText = "";
    get("MARK1ON", "0");
    get("DELTA1ON", "0");
    panel.MarkerButton.Click();
    expectPlayed();
    EXPECT_EQ(panel.ChoiceBox(2).Text(), "");
}

TEST_F(MenuFillTest, Marker_BoxesTakeTheLabelsWithoutTheirHeads) {
    visited();
    panel.MarkerLabel.Caption = "Marker: 1 GHz; -30 dBm";
    panel.DeltaLabel.Caption = "Delta: 1 MHz; -2 dBm";
    get("MARK1ON", "0");
    get("DELTA1ON", "0");
    panel.MarkerButton.Click();
    expectPlayed();
    EXPECT_EQ(panel.SoftTextBox(0).Text.get(), "1 GHz; -30 dBm");
    EXPECT_EQ(panel.SoftTextBox(1).Text.get(), "1 MHz; -2 dBm");
}

TEST_F(MenuFillTest, DistanceToFault_ShowsTheNumberOfTheLastPower) {
    open(kPower);
    get("PWR", "-12.5");
    panel.SoftKey(0).Click();
    expectPlayed();
    set("MEAS,7");
    panel.DistFaultButton.Click();
    expectPlayed();
    EXPECT_EQ(panel.SoftTextBox(0).Text.get(), "-12.5");
}

TEST_F(MenuFillTest, ChannelPower_IsAskedInTheUnitOfTheMirror) {
    open(kChnPower);
    mirror.ChannelPowerUnit = 1;
    get("CHPWR", "17");
    panel.SoftKey(0).Click();
    expectPlayed();
    EXPECT_EQ(panel.SoftTextBox(0).Text.get(), "17 dBmV");
}

TEST_F(MenuFillTest, TriggerLevel_IsReadAsAWholeNumber) {
    open(kSweep);
    mirror.ReferenceRange = 4;
    showTriggerKey(panel, true);
    get("TRIGLVL", "30.6");
    panel.SoftKey(4).Click();
    expectPlayed();
    EXPECT_EQ(panel.CWGraph1.trigger().Height, -31);
}

}  // namespace
}  // namespace zel
