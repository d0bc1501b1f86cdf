#include <gtest/gtest.h>

#include "model/UnsureSettings.h"

namespace zel {
namespace {

struct WordRow {
    const char* word;
    AxisSetting setting;
};

constexpr WordRow kWords[] = {{"FREQ", AxisSetting::Frequency},
                              {"SPAN", AxisSetting::Span},
                              {"REFLVL", AxisSetting::ReferenceLevel},
                              {"RANGE", AxisSetting::Range},
                              {"TRACEDET", AxisSetting::Detector}};

TEST(UnsureSettingsTest, Refusal_MarksItsSettingAlone) {
    for (const WordRow& row : kWords) {
        UnsureSettings unsure;
        unsure.sent(row.word, false);
        EXPECT_TRUE(unsure.any());
        for (const WordRow& other : kWords)
            EXPECT_EQ(unsure.has(other.setting), other.setting == row.setting) << other.word;
    }
}

TEST(UnsureSettingsTest, LaterAcceptedValueOrAnswer_ClearsItsSettingAlone) {
    UnsureSettings unsure;
    for (const WordRow& row : kWords) unsure.sent(row.word, false);
    unsure.sent("SPAN", true);
    unsure.known("RANGE");
    EXPECT_TRUE(unsure.has(AxisSetting::Frequency));
    EXPECT_FALSE(unsure.has(AxisSetting::Span));
    EXPECT_TRUE(unsure.has(AxisSetting::ReferenceLevel));
    EXPECT_FALSE(unsure.has(AxisSetting::Range));
    unsure.clear();
    EXPECT_FALSE(unsure.any());
}

TEST(UnsureSettingsTest, OtherWord_IsPassedOver) {
    UnsureSettings unsure;
    for (const char* word : {"UNIT", "REFLVLOFFS", "freq", "FREQ,", ""}) unsure.sent(word, false);
    EXPECT_FALSE(unsure.any());
}

TEST(UnsureSettingsTest, Changed_IsCalledWhenAMarkComesOrGoes) {
    UnsureSettings unsure;
    int changes = 0;
    unsure.Changed.connect([&] { ++changes; });
    unsure.sent("SPAN", true);
    unsure.clear();
    EXPECT_EQ(changes, 0);
    unsure.sent("SPAN", false);
    unsure.sent("SPAN", false);
    EXPECT_EQ(changes, 1);
    unsure.known("SPAN");
    EXPECT_EQ(changes, 2);
    unsure.sent("FREQ", false);
    unsure.clear();
    EXPECT_EQ(changes, 4);
}

}  // namespace
}  // namespace zel
