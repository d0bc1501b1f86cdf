// What the handlers leave behind on the panel beside the value that was set.

#include <gtest/gtest.h>

#include "tests/panel/DeadLine.h"

namespace zel {
namespace {

struct SideEffectTest : PanelSession, ::testing::Test {};

struct Painted {
    Menu menu;
    int box;
    const char* text;
};

TEST(EntryColours, Entry_PaintsItsOwnKeyRedAndNoOther) {
    const Painted rows[] = {
        {kFreq, 0, "1G"},   {kFreq, 1, "100M"}, {kFreq, 2, "1G"},  {kFreq, 3, "2G"},
        {kFreq, 4, "1k"},   {kSpan, 0, "100M"}, {kSpan, 2, "0"},   {kAmpt, 0, "-30"},
        {kSweep, 0, "50m"}, {kSweep, 4, "1m"},  {kOccBW, 2, "2M"}, {kDtf, 1, "20"},
    };
    for (const Painted& row : rows) {
        DeadLineSetup rig;
        (rig.panel.*row.menu.key).Click();
        for (Button& key : rig.panel.SoftKey) key.BackColor = kGreen;
        rig.panel.SoftBoxFirstKey = 2;
        rig.panel.SoftTextBox(row.box).Text = row.text;
        int enter = kKeyEnter;
        rig.panel.SoftTextBox(row.box).KeyPress(enter);
        for (int i = 0; i < 5; ++i)
            EXPECT_EQ(rig.panel.SoftKey(i).BackColor.get(), i == row.box ? kRed : kButtonFace)
                << row.menu.state << " box " << row.box << " key " << i;
    }
}

TEST_F(SideEffectTest, ModePick_PaintsItsKey) {
    open(kMeas);
    panel.SoftKey(0).BackColor = kButtonFace;
    set("MEAS,8");
    panel.ChoiceBox(0).pick(8);
    EXPECT_EQ(panel.SoftKey(0).BackColor.get(), kRed);
}

TEST_F(SideEffectTest, NewStart_IsInTheMirrorAheadOfTheExchange) {
    mirror.CenterFrequency = 1e9;
    mirror.Span = 2e8;
    open(kFreq);
    double seen = 0;
    boxes.whileShown = [&](const Box&) { seen = mirror.Span; };
    set("SPAN,150000000", "5");
    set("FREQ,1025000000");
    get("SPAN", "200000000");  // the refused value
    sweep();
    type(2, "950M");
    enter(2);
    expectPlayed();
    EXPECT_EQ(seen, 1.5e8);
}

TEST_F(SideEffectTest, MarkerLengthThatIsNoNumber_SendsNothing) {
    visited();
    panel.isConnected = false;
    panel.MarkerButton.Click();
    panel.isConnected = true;
    panel.InstrumentMode = CF::DISTTOFAULTMEASURE;
    type(0, "5 s");
    enter(0);
    EXPECT_EQ(port.written(), "");
    EXPECT_EQ(boxes.texts(), Texts{});
    EXPECT_TRUE(panel.GetOption.Value());
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

TEST_F(SideEffectTest, AutoBandwidth_WithSetSelected_ShowsAutoInTheList) {
    mirror.ResolutionBandwidth = 5;
    open(kBW);
    ASSERT_EQ(panel.ChoiceBox(0).Text(), "10 kHz");
    panel.SetOption.setValue(true);
    set("RBW,0");
    panel.SoftKey(1).Click();
    expectPlayed();
    EXPECT_EQ(panel.ChoiceBox(0).Text(), "Auto");
}

TEST_F(SideEffectTest, AutoSweepTime_ShowsOnInItsList) {
    open(kSweep);
    set("SWPTIME,0");
    get("SWPTIME", "0");
    get("SWPTIME", "0");
    panel.SoftKey(1).Click();
    expectPlayed();
    EXPECT_EQ(panel.ChoiceBox(1).Text(), "On");
}

TEST_F(SideEffectTest, CentreInThePowerSensorMode_ReadsNoTrace) {
    open(kFreq);
    panel.InstrumentMode = CF::POWERSENSOR;
    type(0, "1G");
    set("FREQ,1000000000");
    get("SPAN", "100000000");
    enter(0);
    expectPlayed();
}

TEST_F(SideEffectTest, ReceiverPick_DeselectsTheOptions) {
    open(kChnPower);
    ASSERT_TRUE(panel.ChannelPowerCheck.Value());
    panel.InstrumentMode = CF::ANALYZER;
    open(kMeas);
    set("MEAS,8");
    panel.ChoiceBox(0).pick(8);
    expectPlayed();
    EXPECT_FALSE(panel.ChannelPowerCheck.Value());
}

TEST_F(SideEffectTest, VideoBandwidthPick_LeavesTheAutoKeyPlain) {
    open(kBW);
    set("VBW,4");
    panel.ChoiceBox(2).pick(4);
    EXPECT_EQ(panel.SoftKey(2).BackColor.get(), kRed);
    EXPECT_EQ(panel.SoftKey(3).BackColor.get(), kButtonFace);
}

TEST_F(SideEffectTest, LengthUnitEntry_IsKeptAsText) {
    open(kDtf);
    set("LENUNIT,FEET");
    type(3, "FEET");
    enter(3);
    expectPlayed();
    EXPECT_EQ(mirror.LengthUnit, "FEET");
}

TEST_F(SideEffectTest, DeltaEntry_PaintsItsKeyBesideTheFirst) {
    visited();
    panel.isConnected = false;
    panel.MarkerButton.Click();
    panel.isConnected = true;
    set("DELTA1,1000");
    get("DELTA1", "1000,-1");
    type(1, "1k");
    enter(1);
    expectPlayed();
    EXPECT_EQ(panel.SoftKey(0).BackColor.get(), kRed);
    EXPECT_EQ(panel.SoftKey(1).BackColor.get(), kRed);
}

TEST_F(SideEffectTest, ModeKeyWhileConnecting_SendsItsCommandAndFillsNothing) {
    panel.isConnected = false;
    forms.main.IsConnecting = true;
    set("MEAS,4");
    panel.ChnPwrButton.Click();
    expectPlayed();
    EXPECT_EQ(panel.InstrumentMode, CF::CHANNELPOWER);
    EXPECT_EQ(boxes.texts(), Texts{});
    panel.TrackButton.Click();  // this one and the power sensor's look at the connection alone
    EXPECT_EQ(boxes.texts(), Texts{kNotConnected});
}

TEST_F(SideEffectTest, ModeThatIsOn_ResetsTheScaleInMeasurementsOnly) {
    for (const Menu& menu : {kTracking, kPower, kChnPower, kOccBW, kTdma, kDtf}) {
        panel.InstrumentMode = menu.mode;
        mirror.ReferenceRange = 3;
        mirror.ReferenceUnit = 2;
        open(menu);
        const bool keeps = menu.state == CF::TRACKINGGEN || menu.state == CF::POWER;
        EXPECT_EQ(mirror.ReferenceRange, keeps ? 3 : 0) << menu.state;
        EXPECT_EQ(mirror.ReferenceUnit, keeps ? 2 : 0) << menu.state;
    }
}

TEST_F(SideEffectTest, PresetWithoutAWayOut_StillDeselectsThePowerSensor) {
    set("MEAS,3");
    panel.PwrButton.Click();
    ASSERT_TRUE(panel.PowerSensorCheck.Value());
    visited();
    cmd("PRESET");
    set("MEAS,1", "4");
    panel.ResetButton.Click();
    expectPlayed();
    EXPECT_EQ(panel.InstrumentMode, CF::POWERSENSOR);
    EXPECT_FALSE(panel.PowerSensorCheck.Value());
}

TEST_F(SideEffectTest, MarkerToReference_KeepsItsValueWhereTheReadoutIsRefused) {
    mirror.Span = 1e6;
    cmd("MARKTOLVL");
    get("MARK1", "900000000,-30.4");
    getRefused("MARK1", "4");
    sweep();
    panel.MarkToRefButton.Click();
    expectPlayed();
    EXPECT_EQ(panel.MarkerValue, 9e8);
    EXPECT_EQ(mirror.ReferenceLevel, -30);
}

TEST_F(SideEffectTest, Marker_LetsCursorsBeDraggedAndEmptiesItsBoxesWhenItGoes) {
    visited();
    mirror.Span = 1e6;
    panel.isConnected = false;
    panel.MarkerButton.Click();
    panel.isConnected = true;
    set("MARK1ON,1");
    sweep();
    get("MARK1", "1500000000,-30");
    panel.MarkerCheckBox.Click();
    EXPECT_EQ(panel.CWGraph1.TrackMode.get(), static_cast<int>(TrackMode::DragCursors));
    EXPECT_EQ(panel.SoftTextBox(0).Text.get(), "1.5 GHz; -30 dBm");
    set("DELTA1ON,1");
    get("DELTA1", "1000,-1");
    panel.DeltaCheckBox.Click();
    EXPECT_EQ(panel.SoftTextBox(1).Text.get(), "1 kHz; -1 dBm");
    set("MARK1ON,0");
    panel.MarkerCheckBox.Click();
    expectPlayed();
    EXPECT_EQ(panel.CWGraph1.TrackMode.get(), static_cast<int>(TrackMode::Plain));
    EXPECT_EQ(panel.SoftTextBox(0).Text.get(), "");
    EXPECT_EQ(panel.SoftTextBox(1).Text.get(), "");
}

}  // namespace
}  // namespace zel
