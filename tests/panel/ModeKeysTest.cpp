#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "tests/panel/Panel.h"

namespace zel {
namespace {

struct ModeRow {
    const char* name;
    Menu menu;
    OptionButton CF::*option;
    const char* failure;
    int waitMs;
    std::vector<const char*> words;
};

void PrintTo(const ModeRow& row, std::ostream* out) { *out << row.name; }

const ModeRow kModes[] = {
    {"Tracking", kTracking, &CF::TrackingGenCheck, "Tracking Generator Mode unsuccessful", 0, {}},
    {"Power", kPower, &CF::PowerSensorCheck, "Power Sensor Mode unsuccessful", 2500, {}},
    {"ChannelPower",
     kChnPower,
     &CF::ChannelPowerCheck,
     "Channer Power Mode unsuccessful",
     0,
     {"CHPWRSTD", "CHPWR", "CHPWRUNIT", "CHPWRBW"}},
    {"OccupiedBandwidth",
     kOccBW,
     &CF::OccBWCheck,
     "Occupied Bandwidth Mode unsuccessful",
     2000,
     {"OBWSTD", "OBW", "OBWCHBW"}},
    {"Tdma",
     kTdma,
     &CF::TDMAPowerCheck,
     "TDMA Power unsuccessful",
     0,
     {"TDMASTD", "MEASTIME", "TDMAPWR"}},
    {"DistanceToFault",
     kDtf,
     &CF::DistFaultCheck,
     "Distance to Fault Mode unsuccessful",
     0,
     {"DTFMODE"}},
};

class ModeKey : public PanelSession, public ::testing::TestWithParam<ModeRow> {
  public:
    std::string command() const { return "MEAS," + std::to_string(GetParam().menu.mode); }
    Button& key() { return panel.*GetParam().menu.key; }
    void expectEntry() {
        set(command());
        for (const char* word : GetParam().words) get(word, "1");
    }
};

TEST_P(ModeKey, Press_SetsTheModeAndFillsItsMenu) {
    mirror.ReferenceRange = 3;
    mirror.ReferenceUnit = 6;
    expectEntry();
    key().Click();
    expectPlayed();
    EXPECT_EQ(panel.InstrumentMode, GetParam().menu.mode);
    EXPECT_EQ(panel.State, GetParam().menu.state);
    EXPECT_EQ(mirror.ReferenceRange, 0);
    EXPECT_EQ(mirror.ReferenceUnit, 0);
    EXPECT_TRUE((panel.*GetParam().option).Value());
    EXPECT_EQ(panel.MousePointer.get(), 0);
    EXPECT_EQ(boxes.texts(), Texts{});
}

TEST_P(ModeKey, Press_WaitsForTheInstrument) {
    expectEntry();
    const std::int64_t before = platform.clock.micros();
    key().Click();
    const auto ms = static_cast<double>(platform.clock.micros() - before) / 1000;
    EXPECT_GE(ms, GetParam().waitMs);
    EXPECT_LT(ms, GetParam().waitMs + 100);
}

TEST_P(ModeKey, PressedTwice_SendsItsCommandOnce) {
    expectEntry();
    key().Click();
    key().Click();
    expectPlayed();
}

TEST_P(ModeKey, Option_EntersTheModeToo) {
    expectEntry();
    (panel.*GetParam().option).Click();
    expectPlayed();
    EXPECT_EQ(panel.InstrumentMode, GetParam().menu.mode);
}

TEST_P(ModeKey, Refusal_IsToldAndLeavesTheMenuOnView) {
    set(command(), "6");
    key().Click();
    expectPlayed();
    EXPECT_EQ(boxes.texts(), Texts{GetParam().failure});
    EXPECT_EQ(boxes.boxes()[0].icon, BoxIcon::Exclamation);
    EXPECT_EQ(panel.InstrumentMode, CF::ANALYZER);
    EXPECT_EQ(panel.State, GetParam().menu.state);
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

TEST_P(ModeKey, NotConnected_LaysOutItsMenuAndTellsIt) {
    panel.isConnected = false;
    key().Click();
    EXPECT_EQ(boxes.texts(), Texts{kNotConnected});
    EXPECT_EQ(panel.State, GetParam().menu.state);
    EXPECT_EQ(port.written(), "");
}

TEST_P(ModeKey, ContinuousView_RefusesAheadOfTheMenu) {
    panel.ContinuosLoopActive = true;
    const std::int16_t state = panel.State;
    key().Click();
    EXPECT_EQ(boxes.texts(), Texts{kContinuousView});
    EXPECT_EQ(boxes.boxes()[0].icon, BoxIcon::Exclamation);
    EXPECT_EQ(panel.State, state);
    EXPECT_EQ(port.written(), "");
}

INSTANTIATE_TEST_SUITE_P(Modes, ModeKey, ::testing::ValuesIn(kModes),
                         [](const auto& tested) { return std::string(tested.param.name); });

struct AnalyzerKeyTest : PanelSession, ::testing::Test {
    AnalyzerKeyTest() { visited(); }
};

TEST_F(AnalyzerKeyTest, InAnalyzerMode_DoesNothing) {
    panel.AnalyzerButton.Click();
    EXPECT_EQ(panel.State, 0);
    EXPECT_EQ(port.written(), "");
    EXPECT_EQ(boxes.texts(), Texts{});
}

TEST_F(AnalyzerKeyTest, OutOfPowerSensorMode_LandsInTheFrequencyMenu) {
    panel.InstrumentMode = CF::POWERSENSOR;
    set("MEAS,1");
    panel.AnalyzerButton.Click();
    expectPlayed();
    EXPECT_EQ(panel.InstrumentMode, CF::ANALYZER);
    EXPECT_EQ(panel.State, CF::Freq);
    EXPECT_TRUE(panel.AnalyzerCheck.Value());
    EXPECT_FALSE(mirror.PowerSensorExitRequested);
    EXPECT_EQ(boxes.texts(), Texts{});
}

TEST_F(AnalyzerKeyTest, Refusal_IsTold) {
    panel.InstrumentMode = CF::TDMAPOWERMODE;
    set("MEAS,1", "6");
    panel.AnalyzerButton.Click();
    EXPECT_EQ(boxes.texts(), Texts{"Analyzer Mode unsuccessful"});
    EXPECT_EQ(boxes.boxes()[0].icon, BoxIcon::Exclamation);
    EXPECT_EQ(panel.InstrumentMode, CF::TDMAPOWERMODE);
}

TEST_F(AnalyzerKeyTest, NotConnected_ClearsTheState) {
    panel.InstrumentMode = CF::TDMAPOWERMODE;
    panel.isConnected = false;
    panel.AnalyzerButton.Click();
    EXPECT_EQ(boxes.texts(), Texts{kNotConnected});
    EXPECT_EQ(panel.State, 0);
}

TEST_F(AnalyzerKeyTest, ContinuousView_Refuses) {
    panel.InstrumentMode = CF::TDMAPOWERMODE;
    panel.ContinuosLoopActive = true;
    panel.AnalyzerButton.Click();
    EXPECT_EQ(boxes.texts(), Texts{kContinuousView});
}

struct PresetTest : PanelSession, ::testing::Test {
    PresetTest() { visited(); }
};

TEST_F(PresetTest, Mirror_TakesThePresetByHand) {
    for (const Variable& variable : variablesOf(mirror))
        if (const auto* real = std::get_if<const double*>(&variable.value))
            *const_cast<double*>(*real) = 77;
    mirror.TraceMode = mirror.TriggerSource = 3;
    mirror.TraceDetector = 4;
    panel.SingleSweepModeActive = true;
    cmd("PRESET");
    panel.ResetButton.Click();
    expectPlayed();
    const struct {
        const char* name;
        double value;
    } wanted[] = {{"CenterFrequency", 1.5e9}, {"Span", 3e9},           {"FrequencyOffset", 0.1},
                  {"ReferenceOffset", 0},     {"RFInputImpedance", 0}, {"ResolutionBandwidth", 0},
                  {"VideoBandwidth", 0},      {"SweepContinuous", 1},  {"TraceMode", 0},
                  {"TriggerSource", 0},       {"TraceDetector", 0},    {"ReferenceLevel", -20},
                  {"ReferenceRange", 0},      {"ReferenceUnit", 0},    {"SweepTime", 77},
                  {"CableLength", 77}};
    for (const auto& row : wanted) EXPECT_EQ(field(row.name), row.value) << row.name;
    EXPECT_EQ(mirror.MarkerModeText, "0");
    EXPECT_EQ(mirror.MeasModeText, "0");
    EXPECT_FALSE(panel.SingleSweepModeActive);
}

TEST_F(PresetTest, Boxes_ShowThePresetAndNoOffset) {
    cmd("PRESET");
    panel.ResetButton.Click();
    const char* texts[] = {"1.5 GHz", "3 GHz", "0 Hz", "3 GHz", "0 Hz"};
    for (int i = 0; i < 5; ++i) EXPECT_EQ(panel.SoftTextBox(i).Text.get(), texts[i]);
    EXPECT_EQ(panel.CFLabel.Caption.get(), "Center: 1.5 GHz");
    EXPECT_EQ(panel.SpanLabel.Caption.get(), "Span: 3 GHz");
    EXPECT_EQ(panel.State, CF::Freq);
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

TEST_F(PresetTest, PowerSensorMode_GoesBackToTheAnalyzer) {
    panel.InstrumentMode = CF::POWERSENSOR;
    cmd("PRESET");
    set("MEAS,1");
    panel.ResetButton.Click();
    expectPlayed();
    EXPECT_EQ(panel.InstrumentMode, CF::ANALYZER);
    EXPECT_EQ(panel.State, CF::Freq);
}

TEST_F(PresetTest, TriggerLine_GoesOff) {
    panel.CWGraph1.setTrigger({"T", -30, true});
    cmd("PRESET");
    panel.ResetButton.Click();
    EXPECT_FALSE(panel.CWGraph1.trigger().Visible);
}

TEST_F(PresetTest, InstrumentGone_StillRewritesTheMirror) {
    port.expect("cmd\r").silence();
    panel.ResetButton.Click();
    EXPECT_EQ(mirror.Span, 3e9);
    EXPECT_EQ(panel.CFLabel.Caption.get(), "Center: 1.5 GHz");
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

TEST_F(PresetTest, ContinuousView_Refuses) {
    panel.ContinuosLoopActive = true;
    panel.ResetButton.Click();
    EXPECT_EQ(boxes.texts(), Texts{kContinuousView});
    EXPECT_EQ(mirror.Span, 0);
}

class GuardedKey : public PanelSession, public ::testing::TestWithParam<Button CF::*> {};

TEST_P(GuardedKey, PowerSensorMode_RefusesTheHardKey) {
    panel.InstrumentMode = CF::POWERSENSOR;
    (panel.*GetParam()).Click();
    EXPECT_EQ(boxes.texts(), Texts{"Please exit the Power Sensor Mode first."});
    EXPECT_EQ(boxes.boxes()[0].icon, BoxIcon::Information);
    EXPECT_EQ(panel.State, 0);
    EXPECT_EQ(port.written(), "");
}

INSTANTIATE_TEST_SUITE_P(HardKeys, GuardedKey,
                         ::testing::Values(&CF::FrequencyButton, &CF::SpanButton,
                                           &CF::AmplitudeButton, &CF::BWButton, &CF::SweepButton,
                                           &CF::TraceButton, &CF::MeasButton, &CF::MarkerButton));

class ViewedKey : public PanelSession, public ::testing::TestWithParam<Menu> {};

TEST_P(ViewedKey, ContinuousView_LaysOutTheMenuAndSendsNothing) {
    panel.ContinuosLoopActive = true;
    (panel.*GetParam().key).Click();
    EXPECT_EQ(panel.State, GetParam().state);
    EXPECT_EQ(port.written(), "");
    EXPECT_EQ(boxes.texts(), Texts{});
}

INSTANTIATE_TEST_SUITE_P(HardKeys, ViewedKey,
                         ::testing::Values(kFreq, kSpan, kAmpt, kBW, kSweep, kTrace, kMeas));

}  // namespace
}  // namespace zel
