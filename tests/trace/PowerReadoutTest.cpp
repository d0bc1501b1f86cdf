// The power sensor's reading: single, continuous, in its dialog.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "tests/trace/SweepControl.h"

namespace zel {
namespace {

using Texts = std::vector<std::string>;

struct PowerReadoutTest : SweepControlTest {
    PowerReadoutTest() {
        panel.State = ControllerForm::POWER;
        panel.InstrumentMode = ControllerForm::POWERSENSOR;
    }
    /// Chooses in the dialog and closes it, once it stands.
    void choose(bool reflection) {
        platform.events.schedule(0, [this, reflection] {
            if (reflection) forms.powerAndRefl.PowerAndLeflOption.Click();
            forms.powerAndRefl.ClosePwrForm.Click();
            EXPECT_FALSE(forms.powerAndRefl.Visible);
            if (forms.powerAndRefl.Visible) forms.powerAndRefl.unload(1);  // else no end
        });
    }
    void stopAtReading(const std::string& text) {
        panel.SoftTextBox(0).Changed.connect([this, text] {
            if (panel.SoftTextBox(0).Text.get() == text) panel.StopButton.Click();
        });
    }
};

TEST_F(PowerReadoutTest, Single_ReadsThePowerIntoTheFirstBox) {
    panel.SoftTextBox(4).Text = "old";
    get("PWR", "-12.5");
    panel.PlaySingleButton.Click();
    expectPlayed();
    EXPECT_EQ(panel.SoftTextBox(0).Text.get(), "-12.5 dBm");
    EXPECT_EQ(panel.SoftTextBox(4).Text.get(), "old");
    EXPECT_EQ(panel.LastPowerText, "-12.5");
    EXPECT_EQ(panel.LastReadingText, "-12.5");
    EXPECT_EQ(panel.LastReflectionText, "");
}

TEST_F(PowerReadoutTest, Single_WithReflection_ReadsItIntoTheLastBox) {
    forms.powerAndRefl.ReadPowerAndRefl = true;
    get("PWR", "3");
    get("REFL", "0.5");
    panel.PlaySingleButton.Click();
    expectPlayed();
    EXPECT_EQ(panel.SoftTextBox(0).Text.get(), "3 dBm");
    EXPECT_EQ(panel.SoftTextBox(4).Text.get(), "500 mdBm");
    EXPECT_EQ(panel.LastReflectionText, "0.5");
    EXPECT_EQ(panel.LastReadingText, "0.5");
}

TEST_F(PowerReadoutTest, Reading_RunsWhatIsDueBeforeItAsks) {
    std::string sent = "nothing ran";
    platform.events.schedule(0, [&] { sent = port.written(); });
    get("PWR", "3");
    panel.PlaySingleButton.Click();
    expectPlayed();
    EXPECT_EQ(sent, "");
}

TEST_F(PowerReadoutTest, Single_InTheModeAlone_ReadsThePowerToo) {
    panel.State = ControllerForm::Freq;
    get("PWR", "3");
    panel.PlaySingleButton.Click();
    expectPlayed();
}

TEST_F(PowerReadoutTest, Single_InAPassOfTheContinuousView_TakesThePowerBranch) {
    panel.State = ControllerForm::Freq;
    panel.InstrumentMode = ControllerForm::ANALYZER;
    panel.ContinuosLoopActive = true;
    get("PWR", "3");
    panel.PlaySingleButton.Click();
    expectPlayed();
}

TEST_F(PowerReadoutTest, Single_Recording_SavesThePower) {
    panel.RecordDataFlag = true;
    Texts saved;
    panel.SaveView.connect([&](const std::string& kind) { saved.push_back(kind); });
    get("PWR", "3");
    panel.PlaySingleButton.Click();
    EXPECT_EQ(saved, Texts{"power"});
}

TEST_F(PowerReadoutTest, Single_RefusedReading_KeepsTheOldText) {
    panel.SoftTextBox(0).Text = "old";
    getRefused("PWR", "6");
    panel.PlaySingleButton.Click();
    expectPlayed();
    EXPECT_EQ(panel.SoftTextBox(0).Text.get(), "old");
}

TEST_F(PowerReadoutTest, Dialog_LoadsWithThePowerAlone) {
    forms.powerAndRefl.ReadPowerAndRefl = true;
    forms.powerAndRefl.load();
    EXPECT_TRUE(forms.powerAndRefl.ReadPowerOnly);
    EXPECT_FALSE(forms.powerAndRefl.ReadPowerAndRefl);
    EXPECT_TRUE(forms.powerAndRefl.PowerOnlyOption.Value());
}

TEST_F(PowerReadoutTest, Dialog_Options_SetTheTwoFlags) {
    forms.powerAndRefl.load();
    forms.powerAndRefl.PowerAndLeflOption.Click();
    EXPECT_FALSE(forms.powerAndRefl.ReadPowerOnly);
    EXPECT_TRUE(forms.powerAndRefl.ReadPowerAndRefl);
    forms.powerAndRefl.PowerOnlyOption.Click();
    EXPECT_TRUE(forms.powerAndRefl.ReadPowerOnly);
    EXPECT_FALSE(forms.powerAndRefl.ReadPowerAndRefl);
}

TEST_F(PowerReadoutTest, Dialog_Close_TakesItAway) {
    forms.powerAndRefl.Show();
    forms.powerAndRefl.ClosePwrForm.Click();
    EXPECT_FALSE(forms.powerAndRefl.Visible);
    EXPECT_FALSE(forms.powerAndRefl.loaded());
}

TEST_F(PowerReadoutTest, Continuous_AsksInTheDialogAndReadsUntilStop) {
    choose(false);
    get("PWR", "1");
    get("PWR", "2");
    get("PWR", "3");
    stopAtReading("3 dBm");
    panel.PlayContinuousButton.Click();
    expectPlayed();
    expectIdle();
    EXPECT_TRUE(panel.PlaySingleButton.Enabled);
    EXPECT_TRUE(panel.CWGraph1.values().empty());
}

TEST_F(PowerReadoutTest, Continuous_DuringAReading_TheSingleKeyIsDisabled) {
    choose(false);
    get("PWR", "1");
    bool enabled = true;
    panel.SoftTextBox(0).Changed.connect([&] {
        enabled = panel.PlaySingleButton.Enabled;
        if (panel.StopButton.Visible) panel.StopButton.Click();
    });
    panel.PlayContinuousButton.Click();
    expectPlayed();
    EXPECT_FALSE(enabled);
    EXPECT_TRUE(panel.PlaySingleButton.Enabled);
}

TEST_F(PowerReadoutTest, Continuous_WithReflection_ReadsBothInEachRound) {
    choose(true);
    get("PWR", "1");
    get("REFL", "20");
    get("PWR", "2");
    get("REFL", "21");
    stopAtReading("2 dBm");
    panel.PlayContinuousButton.Click();
    expectPlayed();
    EXPECT_EQ(panel.SoftTextBox(4).Text.get(), "21 dBm");
}

TEST_F(PowerReadoutTest, Continuous_InTheTdmaMenu_ReadsItsPowerWithoutADialog) {
    panel.State = ControllerForm::TDMA;
    panel.InstrumentMode = ControllerForm::TDMAPOWERMODE;
    get("TDMAPWR", "-40");
    get("TDMAPWR", "-41");
    stopAtReading("-41 dBm");
    panel.PlayContinuousButton.Click();
    expectPlayed();
    expectIdle();
    EXPECT_FALSE(forms.powerAndRefl.loaded());
    EXPECT_TRUE(panel.CWGraph1.values().empty());
    EXPECT_EQ(panel.LastReadingText, "-41");
    EXPECT_EQ(panel.LastPowerText, "");
}

TEST_F(PowerReadoutTest, Continuous_SilentReading_IsToldOnceAndEndsTheLoop) {
    choose(true);
    get("PWR", "1");
    get("REFL", "2");
    getSilent();
    panel.PlayContinuousButton.Click();
    expectPlayed();
    EXPECT_EQ(boxes.texts(), Texts{"No response received!"});
    EXPECT_FALSE(panel.ContinuosLoopActive);
    EXPECT_TRUE(panel.StopButton.Visible);  // the way back
    panel.StopButton.Click();
    EXPECT_FALSE(panel.StopButton.Visible);
    EXPECT_TRUE(panel.PlayContinuousButton.Visible);
}

TEST_F(PowerReadoutTest, Continuous_RefusedReading_EndsTheLoop) {
    panel.State = ControllerForm::TDMA;
    panel.InstrumentMode = ControllerForm::TDMAPOWERMODE;
    get("TDMAPWR", "-40");
    getRefused("TDMAPWR", "5");
    panel.PlayContinuousButton.Click();
    expectPlayed();
    EXPECT_EQ(boxes.texts().size(), 1U);
    EXPECT_FALSE(panel.ContinuosLoopActive);
}

TEST_F(PowerReadoutTest, Continuous_StopInsideTheBoxOfAReading_IsANormalStop) {
    choose(false);
    getRefused("PWR", "5");
    boxes.whileShown = [this](const Box&) { panel.StopButton.Click(); };
    panel.PlayContinuousButton.Click();
    expectPlayed();
    EXPECT_EQ(boxes.texts().size(), 1U);
    expectIdle();
}

TEST_F(PowerReadoutTest, Single_RefusedReadingOfARecording_SavesNothing) {
    panel.RecordDataFlag = true;
    Texts saved;
    panel.SaveView.connect([&](const std::string& kind) { saved.push_back(kind); });
    getRefused("PWR", "6");
    panel.PlaySingleButton.Click();
    expectPlayed();
    EXPECT_EQ(saved, Texts{});
}

}  // namespace
}  // namespace zel
