#include <gtest/gtest.h>

#include <string>

#include "connection/KeptSettings.h"
#include "model/CodeTables.h"

namespace zel {
namespace {

/// The text of one of the settings; "absent" when it is not among them.
std::string textOf(const KeptSettings& settings, const std::string& name) {
    for (const auto& [key, text] : settings) {
        if (key == name) return text;
    }
    return "absent";
}

std::string level(double unit, double value) {
    ControllerForm panel;
    ZEL3Variables mirror;
    panel.InstrumentMode = ControllerForm::ANALYZER;
    mirror.ReferenceUnit = unit;
    mirror.ReferenceLevel = value;
    return textOf(keepSettingsOf(panel, mirror), "Ref");
}

TEST(KeptSettingsTest, Level_HasAPrefixInVoltAndWattOnly) {
    EXPECT_EQ(level(UNITDBM, 0.5), "0.5 dBm");
    EXPECT_EQ(level(UNITDB, 0.5), "0.5 dB");
    EXPECT_EQ(level(UNITV, 0.5), "500 mV");
    EXPECT_EQ(level(UNITW, 0.5), "500 mW");
}

TEST(KeptSettingsTest, EachSetting_HasItsWords) {
    ControllerForm panel;
    ZEL3Variables mirror;
    panel.InstrumentMode = ControllerForm::ANALYZER;
    mirror.InstrumentModel = 9102;
    mirror.InstrumentSerial = 12345;
    mirror.CenterFrequency = 1.5e9;
    mirror.Span = 1e6;
    mirror.SweepTime = 0.02;
    mirror.SweepContinuous = 1;
    KeptSettings kept = keepSettingsOf(panel, mirror);
    EXPECT_EQ(textOf(kept, "Instrument"), "9102 #12345");
    EXPECT_EQ(textOf(kept, "Center"), "1.5 GHz");
    EXPECT_EQ(textOf(kept, "Span"), "1 MHz");
    EXPECT_EQ(textOf(kept, "Sweep time"), "20 ms");
    EXPECT_EQ(textOf(kept, "Sweep"), "continuous");
    EXPECT_EQ(textOf(kept, "Dynamic range"), "low distortion");
    mirror.SweepContinuous = 0;
    mirror.DynamicRangeMode = 1;
    kept = keepSettingsOf(panel, mirror);
    EXPECT_EQ(textOf(kept, "Sweep"), "single");
    EXPECT_EQ(textOf(kept, "Dynamic range"), "low noise");
}

TEST(KeptSettingsTest, PowerSensor_HasNoSettingsOfATrace) {
    ControllerForm panel;
    const ZEL3Variables mirror;
    panel.InstrumentMode = ControllerForm::POWERSENSOR;
    const KeptSettings kept = keepSettingsOf(panel, mirror);
    EXPECT_EQ(kept.size(), 3U);
    EXPECT_EQ(textOf(kept, "Span"), "absent");
}

TEST(KeptSettingsTest, Difference_NamesWhatBothSidesHaveAndDiffersIn) {
    const KeptSettings before = {{"Center", "1 GHz"}, {"Span", "1 MHz"}, {"Ref", "-20 dBm"}};
    const KeptSettings now = {{"Center", "1 GHz"}, {"Span", "2 MHz"}, {"RBW", "Auto"}};
    EXPECT_EQ(differenceOf(before, now), "Span 2 MHz (before: 1 MHz)");
    EXPECT_EQ(differenceOf(before, {{"Center", "2 GHz"}, {"Ref", "0 dBm"}}),
              "Center 2 GHz (before: 1 GHz); Ref 0 dBm (before: -20 dBm)");
    EXPECT_EQ(differenceOf(before, before), "");
}

}  // namespace
}  // namespace zel
