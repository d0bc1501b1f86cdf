#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

#include "tests/panel/Panel.h"

namespace zel {
namespace {

constexpr Color kBrightGreen = 65280;

struct MarkerTest : PanelSession, ::testing::Test {
    MarkerTest() {
        visited();
        mirror.Span = 1e6;
    }
    /// The marker menu, with marker and delta as they are in the mirror.
    void openMarkerMenu() {
        visited();
        panel.isConnected = false;
        panel.MarkerButton.Click();
        panel.isConnected = true;
    }
    double elapsedMs(const std::function<void()>& action) {
        const std::int64_t before = platform.clock.micros();
        action();
        return static_cast<double>(platform.clock.micros() - before) / 1000;
    }
};

struct KeyRow {
    const char* name;
    Button CF::*key;
    const char* command;
    const char* failure;
    std::vector<Button CF::*> plain;  // keys that take the normal face
};

void PrintTo(const KeyRow& row, std::ostream* out) { *out << row.name; }

const KeyRow kKeys[] = {
    {"Peak",
     &CF::MarkPkButton,
     "MARKPK",
     "Could not set marker to peak!",
     {&CF::NextPeakButton, &CF::MarkToCentButton, &CF::MarkToRefButton}},
    {"NextPeak",
     &CF::NextPeakButton,
     "MARKNXTPK",
     "Could not set marker to the next peak!",
     {&CF::MarkPkButton, &CF::MarkToCentButton, &CF::MarkToRefButton}},
    {"Minimum",
     &CF::MinPeakButton,
     "MARKMIN",
     "Could not set marker to minimum!",
     {&CF::NextPeakButton, &CF::MarkToCentButton, &CF::MarkToRefButton}},
    {"ToCentre",
     &CF::MarkToCentButton,
     "MARKTOCENT",
     "Could not set the current marker as center frequency!",
     {&CF::MarkPkButton, &CF::NextPeakButton, &CF::MarkToRefButton}},
    {"ToReference",
     &CF::MarkToRefButton,
     "MARKTOLVL",
     "Could not set the current marker to the Reference Level!",
     {&CF::MarkPkButton, &CF::NextPeakButton, &CF::MarkToCentButton}},
};

class MarkerKey : public PanelSession, public ::testing::TestWithParam<KeyRow> {
  public:
    MarkerKey() { mirror.Span = 1e6; }
    Button& key() { return panel.*GetParam().key; }
};

TEST_P(MarkerKey, Press_PaintsTheKeysOfItsRowOnly) {
    std::vector<Button*> all = {&panel.MarkPkButton, &panel.NextPeakButton, &panel.MinPeakButton,
                                &panel.MarkToCentButton, &panel.MarkToRefButton};
    for (Button* button : all) button->BackColor = 123;
    const bool moves =
        GetParam().key == &CF::MarkToCentButton || GetParam().key == &CF::MarkToRefButton;
    cmd(GetParam().command);
    get("MARK1", "1500000000,-30.5");
    if (moves) {
        get("MARK1", "1500000000,-30.5");
        sweep();
    }
    key().Click();
    expectPlayed();
    EXPECT_EQ(key().BackColor.get(), kRed);
    for (Button* button : all) {
        bool plain = false;
        for (Button CF::*other : GetParam().plain) plain = plain || &(panel.*other) == button;
        if (button != &key()) {
            EXPECT_EQ(button->BackColor.get(), plain ? kButtonFace : 123U) << button->name();
        }
    }
    EXPECT_EQ(panel.MarkerLabel.Caption.get(), "Marker: 1.5 GHz; -30.5 dBm");
    EXPECT_EQ(panel.MarkerValue, 1.5e9);
    EXPECT_EQ(panel.CWGraph1.cursor(1).X, 1.5e9);
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

TEST_P(MarkerKey, Refusal_IsToldAndLeavesLabelsAndColours) {
    panel.MarkerLabel.Caption = "as it was";
    cmd(GetParam().command, "4");
    key().Click();
    expectPlayed();
    EXPECT_EQ(boxes.texts(), Texts{GetParam().failure});
    EXPECT_EQ(boxes.boxes()[0].icon, BoxIcon::Exclamation);
    EXPECT_EQ(panel.MarkerLabel.Caption.get(), "as it was");
    EXPECT_NE(key().BackColor.get(), kRed);
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

TEST_P(MarkerKey, NotConnected_TellsIt) {
    panel.isConnected = false;
    key().Click();
    EXPECT_EQ(boxes.texts(), Texts{kNotConnected});
    EXPECT_EQ(port.written(), "");
}

TEST_P(MarkerKey, ContinuousView_Refuses) {
    panel.ContinuosLoopActive = true;
    key().Click();
    EXPECT_EQ(boxes.texts(), Texts{kContinuousView});
    EXPECT_EQ(port.written(), "");
}

INSTANTIATE_TEST_SUITE_P(Keys, MarkerKey, ::testing::ValuesIn(kKeys),
                         [](const auto& tested) { return std::string(tested.param.name); });

TEST_F(MarkerTest, Readout_WithDelta_ReadsItUnscaledAndGreen) {
    mirror.DeltaOn = true;
    cmd("MARKPK");
    get("MARK1", "1500000000,-30");
    get("DELTA1", "250000,0.5");
    panel.MarkPkButton.Click();
    expectPlayed();
    EXPECT_EQ(panel.DeltaLabel.Caption.get(), "Delta: 250 kHz; 0.5 dBm");
    EXPECT_EQ(panel.DeltaLabel.ForeColor.get(), kBrightGreen);
    EXPECT_EQ(panel.DeltaValue, 250000);
}

TEST_F(MarkerTest, Readout_ScalesTheMarkersLevel) {
    cmd("MARKPK");
    get("MARK1", "1500000000,0.5");
    panel.MarkPkButton.Click();
    EXPECT_EQ(panel.MarkerLabel.Caption.get(), "Marker: 1.5 GHz; 500 mdBm");
}

TEST_F(MarkerTest, Readout_LevelZero_ReadsZeroDbm) {
    cmd("MARKPK");
    get("MARK1", "1500000000,0");
    panel.MarkPkButton.Click();
    EXPECT_EQ(panel.MarkerLabel.Caption.get(), "Marker: 1.5 GHz; 0 dBm");
}

TEST_F(MarkerTest, Readout_AtZeroSpan_IsInSeconds) {
    mirror.Span = 0;
    cmd("MARKPK");
    get("MARK1", "0.005,-30");
    panel.MarkPkButton.Click();
    EXPECT_EQ(panel.MarkerLabel.Caption.get(), "Marker: 5 ms; -30 dBm");
}

TEST_F(MarkerTest, Readout_InDistanceToFault_IsInMetres) {
    panel.InstrumentMode = CF::DISTTOFAULTMEASURE;
    cmd("MARKPK");
    get("MARK1", "12.5,-30");
    panel.MarkPkButton.Click();
    EXPECT_EQ(panel.MarkerLabel.Caption.get(), "Marker: 12.5 m; -30 dBm");
}

TEST_F(MarkerTest, Readout_InTheMarkerMenu_FillsItsBoxes) {
    openMarkerMenu();
    mirror.DeltaOn = true;
    cmd("MARKPK");
    get("MARK1", "1500000000,-30");
    get("DELTA1", "250000,-2");
    panel.MarkPkButton.Click();
    EXPECT_EQ(panel.SoftTextBox(0).Text.get(), "1.5 GHz; -30 dBm");
    EXPECT_EQ(panel.SoftTextBox(1).Text.get(), "250 kHz; -2 dBm");
}

TEST_F(MarkerTest, ToCentre_TakesTheMarkerForTheCentre) {
    cmd("MARKTOCENT");
    get("MARK1", "900000000,-30");
    get("MARK1", "900000000,-31");
    sweep();
    const double ms = elapsedMs([this] { panel.MarkToCentButton.Click(); });
    expectPlayed();
    EXPECT_EQ(mirror.CenterFrequency, 9e8);
    EXPECT_EQ(panel.CFLabel.Caption.get(), "Center: 900 MHz");
    EXPECT_GE(ms, 700);
}

TEST_F(MarkerTest, ToCentre_WithoutTheMarkersAnswer_AsksForTheCentreBeforeTheSweep) {
    cmd("MARKTOCENT");
    getRefused("MARK1", "4");
    getRefused("MARK1", "4");
    get("FREQ", "900000000");
    sweep();
    panel.MarkToCentButton.Click();
    expectPlayed();
    EXPECT_EQ(mirror.CenterFrequency, 9e8);
    EXPECT_FALSE(mirror.Unsure.any());
}

TEST_F(MarkerTest, ToReference_TakesTheWholeLevelAndRewritesTheCentreLabel) {
    mirror.CenterFrequency = 1e9;
    cmd("MARKTOLVL");
    get("MARK1", "900000000,-30.6");
    get("MARK1", "900000000,-30.6");
    sweep();
    const double ms = elapsedMs([this] { panel.MarkToRefButton.Click(); });
    expectPlayed();
    EXPECT_EQ(mirror.ReferenceLevel, -31);
    EXPECT_EQ(mirror.CenterFrequency, 1e9);
    EXPECT_EQ(panel.CFLabel.Caption.get(), "Center: 900 MHz");
    EXPECT_GE(ms, 700);
}

TEST_F(MarkerTest, MarkerOn_ReadsATraceAndShowsTheCursor) {
    set("MARK1ON,1");
    sweep();
    get("MARK1", "1500000000,-30");
    const double ms = elapsedMs([this] { panel.MarkerCheckBox.Click(); });
    expectPlayed();
    EXPECT_TRUE(mirror.MarkerOn);
    EXPECT_TRUE(panel.CWGraph1.cursor(1).Visible);
    EXPECT_GE(ms, 1000);
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

TEST_F(MarkerTest, MarkerOn_WithoutATrace_ReadsNoMarker) {
    set("MARK1ON,1");
    cmd("WAIT");
    getRefused("TRACEBIN", "6");
    panel.MarkerCheckBox.Click();
    expectPlayed();
    EXPECT_TRUE(mirror.MarkerOn);
    EXPECT_FALSE(panel.CWGraph1.cursor(1).Visible);
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

TEST_F(MarkerTest, MarkerOff_HidesItsCursorAndEmptiesItsReadout) {
    set("MARK1ON,1");
    sweep();
    get("MARK1", "1500000000,-30");
    panel.MarkerCheckBox.Click();
    openMarkerMenu();
    set("MARK1ON,0");
    panel.MarkerCheckBox.Click();
    expectPlayed();
    EXPECT_FALSE(mirror.MarkerOn);
    EXPECT_FALSE(panel.CWGraph1.cursor(1).Visible);
    EXPECT_EQ(panel.MarkerLabel.Caption.get(), "");
    EXPECT_EQ(panel.SoftTextBox(0).Text.get(), "");
}

TEST_F(MarkerTest, MarkerOff_TakesTheDeltaAlongWithoutAWord) {
    set("MARK1ON,1");
    sweep();
    get("MARK1", "1500000000,-30");
    set("DELTA1ON,1");
    get("DELTA1", "250000,-2");
    set("MARK1ON,0");
    panel.MarkerCheckBox.Click();
    panel.DeltaCheckBox.Click();
    EXPECT_TRUE(panel.CWGraph1.cursor(2).Visible);
    panel.MarkerCheckBox.Click();
    expectPlayed();
    EXPECT_FALSE(mirror.DeltaOn);
    EXPECT_FALSE(panel.DeltaCheckBox.Value());
    EXPECT_EQ(panel.DeltaLabel.Caption.get(), "");
    EXPECT_FALSE(panel.CWGraph1.cursor(2).Visible);
}

TEST_F(MarkerTest, DeltaOn_ReadsOnlyTheDelta) {
    set("DELTA1ON,1");
    get("DELTA1", "250000,-2");
    const double ms = elapsedMs([this] { panel.DeltaCheckBox.Click(); });
    expectPlayed();
    EXPECT_TRUE(mirror.DeltaOn);
    EXPECT_EQ(panel.DeltaLabel.Caption.get(), "Delta: 250 kHz; -2 dBm");
    EXPECT_GE(ms, 1000);
}

TEST_F(MarkerTest, DeltaOff_SaysSoAndEmptiesItsLabel) {
    set("DELTA1ON,1");
    get("DELTA1", "250000,-2");
    set("DELTA1ON,0");
    panel.DeltaCheckBox.Click();
    panel.DeltaCheckBox.Click();
    expectPlayed();
    EXPECT_FALSE(mirror.DeltaOn);
    EXPECT_EQ(panel.DeltaLabel.Caption.get(), "");
    EXPECT_FALSE(panel.CWGraph1.cursor(2).Visible);
}

class MarkerBox : public PanelSession, public ::testing::TestWithParam<CheckBox CF::*> {};

TEST_P(MarkerBox, NotConnected_TellsItAndUnchecks) {
    panel.isConnected = false;
    (panel.*GetParam()).Click();
    EXPECT_EQ(boxes.texts(), Texts{"Please connect to the instrument first."});
    EXPECT_FALSE((panel.*GetParam()).Value());
    EXPECT_EQ(port.written(), "");
}

TEST_P(MarkerBox, PowerSensorMode_Refuses) {
    panel.InstrumentMode = CF::POWERSENSOR;
    (panel.*GetParam()).Click();
    EXPECT_EQ(boxes.texts(), Texts{"Please exit the Power Sensor Mode first."});
    EXPECT_EQ(port.written(), "");
}

TEST_P(MarkerBox, ContinuousView_Refuses) {
    panel.ContinuosLoopActive = true;
    (panel.*GetParam()).Click();
    EXPECT_EQ(boxes.texts(), Texts{kContinuousView});
    EXPECT_EQ(port.written(), "");
}

INSTANTIATE_TEST_SUITE_P(Boxes, MarkerBox,
                         ::testing::Values(&CF::MarkerCheckBox, &CF::DeltaCheckBox));

TEST_F(MarkerTest, MarkerKey_ReadsBothStatesAhead) {
    mirror.MenuVisitCount.fill(0);
    get("MARK1ON", "0");
    get("DELTA1ON", "0");
    get("MARKMODE", "1");
    get("MARK1ON", "0");
    panel.MarkerButton.Click();
    expectPlayed();
    EXPECT_EQ(panel.State, CF::Marker);
    EXPECT_EQ(panel.ChoiceBox(2).Text(), "Noise");
    EXPECT_EQ(panel.MarkerButton.Picture.get(), "marker_b");
}

TEST_F(MarkerTest, MarkerKey_MarkerThatIsOn_RunsItsHandler) {
    get("MARK1ON", "1");
    set("MARK1ON,1");
    sweep();
    get("MARK1", "1500000000,-30");
    get("DELTA1ON", "0");
    panel.MarkerButton.Click();
    expectPlayed();
    EXPECT_TRUE(panel.MarkerCheckBox.Value());
    EXPECT_EQ(panel.SoftTextBox(0).Text.get(), "1.5 GHz; -30 dBm");
}

TEST_F(MarkerTest, MarkerKey_InTheContinuousView_Refuses) {
    panel.ContinuosLoopActive = true;
    panel.MarkerButton.Click();
    EXPECT_EQ(boxes.texts(), Texts{kContinuousView});
    EXPECT_EQ(panel.State, 0);
}

TEST_F(MarkerTest, MarkerMenu_IsLaidOut) {
    openMarkerMenu();
    const char* captions[] = {"MARKER", "DELTA", "MARKER\r\nMODE"};
    const char* frames[] = {"Marker", "Delta", "Mark Mode"};
    for (int i = 0; i < 3; ++i) {
        EXPECT_EQ(panel.SoftKey(i).Caption.get(), captions[i]);
        EXPECT_EQ(panel.SoftFrame(i).Caption.get(), frames[i]);
        EXPECT_EQ(panel.ChoiceBox(i).Visible.get(), i == 2);
    }
    EXPECT_FALSE(panel.SoftKey(3).Visible || panel.SoftKey(4).Visible);
    EXPECT_EQ(panel.ChoiceBox(2).items(), (Texts{"Normal", "Noise", "Freq Count"}));
}

TEST_F(MarkerTest, SoftKeys_WithoutAMarker_AskForOne) {
    openMarkerMenu();
    for (const int key : {0, 1, 2}) panel.SoftKey(key).Click();
    EXPECT_EQ(boxes.texts(), Texts(3, "Please activate a marker first."));
    EXPECT_EQ(port.written(), "");
}

TEST_F(MarkerTest, SoftKeys_ReadMarkerDeltaAndMode) {
    openMarkerMenu();
    mirror.MarkerOn = mirror.DeltaOn = true;
    get("MARK1", "1500000000,-30");
    get("DELTA1", "250000,-2");
    get("MARKMODE", "2");
    for (const int key : {0, 1, 2}) panel.SoftKey(key).Click();
    expectPlayed();
    EXPECT_EQ(panel.SoftTextBox(0).Text.get(), "1.5 GHz; -30 dBm");
    EXPECT_EQ(panel.SoftTextBox(1).Text.get(), "250 kHz; -2 dBm");
    EXPECT_EQ(panel.SoftTextBox(2).Text.get(), "ControllerForm.FREQ Count (2)");
    EXPECT_EQ(panel.ChoiceBox(2).Text(), "Freq Count");
}

TEST_F(MarkerTest, Entries_SetMarkerDeltaAndMode) {
    openMarkerMenu();
    set("MARK1,1400000000");
    get("MARK1", "1400000000,-33");
    set("DELTA1,100000");
    get("DELTA1", "100000,-1");
    set("MARKMODE,1");
    type(0, "1.4G");
    enter(0);
    type(1, "100k");
    enter(1);
    panel.ChoiceBox(2).pick(1);
    expectPlayed();
    EXPECT_EQ(panel.MarkerLabel.Caption.get(), "Marker: 1.4 GHz; -33 dBm");
    EXPECT_EQ(panel.DeltaLabel.Caption.get(), "Delta: 100 kHz; -1 dBm");
}

TEST_F(MarkerTest, Entry_InDistanceToFault_IsALength) {
    openMarkerMenu();
    panel.InstrumentMode = CF::DISTTOFAULTMEASURE;
    set("MARK1,12");
    get("MARK1", "12,-33");
    set("MARK1,0");
    get("MARK1", "0,-33");
    type(0, "1200 cm");
    enter(0);
    type(0, "12 m");
    enter(0);
    expectPlayed();
}

}  // namespace
}  // namespace zel
