// A view bears the settings that its trace was read with, whatever was entered since.

#include <gtest/gtest.h>

#include "tests/files/FileSession.h"
#include "tests/panel/DeadLine.h"
#include "trace/TraceReader.h"

namespace zel {
namespace {

struct Change {
    Menu menu;
    int box;
    const char* text;  ///< of a box; null for a list
    int code = 0;      ///< of a list
};
constexpr Change kChanges[] = {{kFreq, 0, "1.7G"},      {kSpan, 0, "40M"},      {kAmpt, 0, "-45"},
                               {kAmpt, 1, nullptr, 2},  {kAmpt, 2, nullptr, 1}, {kAmpt, 3, "7"},
                               {kBW, 0, nullptr, 4},    {kBW, 2, nullptr, 5},   {kSweep, 0, "3"},
                               {kTrace, 0, nullptr, 2}, {kTrace, 1, nullptr, 1}};

struct SettingsOfTheTrace : DeadLineSetup, ::testing::Test {
    Folder folder{platform.files};
    ZEL3Variables& mirror = program.variables();

    SettingsOfTheTrace() {
        for (const Change& change : kChanges) (panel.*change.menu.key).Click();
        program.exchange().SetInstrument("RBW,6");
        program.exchange().SetInstrument("VBW,6");
        mirror.ResolutionBandwidth = mirror.VideoBandwidth = 6;
        read();
        boxes.clear();
    }
    void read() {
        bool success = false;
        program.traces().ReadSingleTrace(success);
        ASSERT_TRUE(success) << ::testing::PrintToString(boxes.texts());
    }
    /// The view's lines but for the time of the saving.
    Texts saved(const std::string& name) {
        platform.fileDialogs.answer(folder.file(name));
        panel.SaveCurrentView.Click();
        Texts lines = linesOf(folder.read(name));
        std::erase_if(lines, [](const std::string& text) {
            return text.starts_with("Date;") || text.starts_with("Time;");
        });
        return lines;
    }
    void enterAll() {
        for (const Change& change : kChanges) {
            (panel.*change.menu.key).Click();
            if (change.text == nullptr) {
                panel.ChoiceBox(change.box).pick(change.code);
                continue;
            }
            panel.SoftBoxFirstKey = 2;
            panel.SoftTextBox(change.box).Text = change.text;
            int key = kKeyEnter;
            panel.SoftTextBox(change.box).KeyPress(key);
        }
    }
    void expectOwnSettings(End end) {
        const Texts before = saved("before.csv");
        ASSERT_GT(before.size(), 301U);
        line.failAt(1, end);
        enterAll();
        // The mirror took what was entered, so that the view could have got it.
        EXPECT_NE(mirror.TraceDetector, program.sweep().settings.TraceDetector);
        EXPECT_NE(mirror.ResolutionBandwidth, program.sweep().settings.ResolutionBandwidth);
        EXPECT_NE(mirror.VideoBandwidth, program.sweep().settings.VideoBandwidth);
        EXPECT_NE(mirror.CenterFrequency, program.sweep().settings.CenterFrequency);
        EXPECT_EQ(saved("after.csv"), before);
    }
};

TEST_F(SettingsOfTheTrace, EntriesBehindASilentLine_AreNotInTheView) {
    expectOwnSettings(End::Silent);
}

TEST_F(SettingsOfTheTrace, EntriesBehindADeadLine_AreNotInTheView) { expectOwnSettings(End::Dead); }

TEST_F(SettingsOfTheTrace, BandwidthAskedAfterASetting_IsNotTheTraces) {
    mirror.ResolutionBandwidth = mirror.VideoBandwidth = 0;  // automatic: asked while saving
    read();
    program.exchange().SetInstrument("RBW,3");
    for (const char* name : {"first.csv", "second.csv"})
        for (const std::string& text : saved(name))
            EXPECT_EQ(text.find("Bandwidth;"), std::string::npos) << name << ": " << text;
}

}  // namespace
}  // namespace zel
