// What becomes of a value that the instrument refused and the mirror took.

#include <gtest/gtest.h>

#include "tests/panel/Panel.h"
#include "trace/TraceReader.h"

namespace zel {
namespace {

struct UnsureTest : PanelSession, ::testing::Test {
    UnsureTest() {
        mirror.CenterFrequency = 1e9;
        mirror.Span = 2e8;
    }
    bool readAgain(const ReadAgain& again = {}) {
        bool success = false;
        program.traces().ReadSingleTrace2(again, success);
        return success;
    }
    /// One cycle that asks this word and no other.
    void expectAskedOnce(const char* word, const char* answer) {
        get(word, answer);
        sweep();
        sweep();
        EXPECT_TRUE(readAgain());
        EXPECT_FALSE(mirror.Unsure.any());
        EXPECT_TRUE(readAgain());
        expectPlayed();
    }
    void refuseLevel() {
        open(kAmpt);
        type(0, "-35");
        set("REFLVL,-35", "5");
        enter(0);
    }
};

TEST_F(UnsureTest, RefusedLevel_IsAskedByTheNextCycleAndNoLater) {
    refuseLevel();
    EXPECT_EQ(mirror.ReferenceLevel, -35);
    EXPECT_TRUE(mirror.Unsure.has(AxisSetting::ReferenceLevel));
    expectAskedOnce("REFLVL", "-20");
    EXPECT_EQ(mirror.ReferenceLevel, -20);
}

TEST_F(UnsureTest, RefusedRange_IsAskedByTheNextCycleAndNoLater) {
    open(kAmpt);
    set("RANGE,3", "5");
    panel.ChoiceBox(1).pick(3);
    expectAskedOnce("RANGE", "1");
    EXPECT_EQ(mirror.ReferenceRange, 1);
}

TEST_F(UnsureTest, RefusedDetector_IsAskedByTheNextCycleAndNoLater) {
    open(kTrace);
    set("TRACEDET,0", "5");
    panel.ChoiceBox(1).pick(0);
    EXPECT_EQ(mirror.TraceDetector, 0);
    expectAskedOnce("TRACEDET", "3");
    EXPECT_EQ(mirror.TraceDetector, 3);
}

TEST_F(UnsureTest, LevelWithoutAnAnswer_IsUnsureToo) {
    open(kAmpt);
    type(0, "-35");
    port.expect("set\r").silence();
    enter(0);
    EXPECT_TRUE(mirror.Unsure.has(AxisSetting::ReferenceLevel));
    program.link().ExchangeFailed = false;  // the line is good again
    expectAskedOnce("REFLVL", "-20");
}

TEST_F(UnsureTest, RefusedSpan_IsAskedByTheCycleOfItsOwnEntry) {
    for (const Menu& menu : {kFreq, kSpan}) {
        visited();
        (panel.*menu.key).Click();
        const int box = menu.state == CF::Freq ? 1 : 0;
        type(box, "50M");
        set("SPAN,50000000", "5");
        get("SPAN", "200000000");
        sweep();
        enter(box);
        expectPlayed();
        EXPECT_EQ(mirror.Span, 2e8);
        EXPECT_EQ(panel.SpanLabel.Caption.get(), "Span: 200 MHz");
        EXPECT_EQ(panel.CWGraph1.xAxis().Minimum, 9e8);
        EXPECT_FALSE(panel.SpanLabel.Struck);
    }
}

TEST_F(UnsureTest, RefusedCentre_IsAskedByTheCycleOfItsOwnEntry) {
    open(kFreq);
    type(0, "9G");
    set("FREQ,9000000000", "5");
    get("SPAN", "200000000");
    get("FREQ", "1000000000");
    sweep();
    enter(0);
    expectPlayed();
    EXPECT_EQ(panel.CFLabel.Caption.get(), "Center: 1 GHz");
    EXPECT_EQ(panel.CWGraph1.xAxis().Maximum, 1.1e9);
}

TEST_F(UnsureTest, RefusedStartFrequency_AsksTheWordThatWasRefused) {
    open(kFreq);
    type(2, "1G");
    set("SPAN,100000000");
    set("FREQ,1050000000", "5");
    get("FREQ", "1000000000");
    sweep();
    enter(2);
    expectPlayed();
    EXPECT_EQ(mirror.CenterFrequency, 1e9);
    EXPECT_EQ(mirror.Span, 1e8);
}

TEST_F(UnsureTest, RefusedSpanKeys_AskWhatTheMirrorTook) {
    open(kSpan);
    set("SPAN,3000000000", "5");
    get("FREQ", "1000000000");
    get("SPAN", "200000000");
    sweep();
    panel.SoftKey(1).Click();
    set("SPAN,0", "5");
    get("SPAN", "200000000");
    sweep();
    panel.SoftKey(2).Click();
    panel.LastSpan = 1e6;
    set("SPAN,1000000", "5");
    get("SPAN", "200000000");
    sweep();
    panel.SoftKey(3).Click();
    // Enter in the zero span's box rewrites the centre as well.
    type(2, "0");
    set("SPAN,0", "5");
    get("FREQ", "1000000000");
    get("SPAN", "200000000");
    sweep();
    enter(2);
    expectPlayed();
    EXPECT_EQ(mirror.CenterFrequency, 1e9);
    EXPECT_EQ(mirror.Span, 2e8);
}

TEST_F(UnsureTest, RefusalWhoseValueTheMirrorDoesNotTake_DoesNotCount) {
    open(kPower);
    type(1, "900M");
    set("FREQ,900000000", "5");
    enter(1);
    expectPlayed();
    EXPECT_FALSE(mirror.Unsure.any());
}

TEST_F(UnsureTest, AcceptedValue_ClearsTheMark) {
    refuseLevel();
    type(0, "-30");
    set("REFLVL,-30");
    enter(0);
    sweep();
    EXPECT_TRUE(readAgain());
    expectPlayed();
}

TEST_F(UnsureTest, Key_ClearsTheMarkWhereTheMirrorTakesItsAnswer) {
    open(kAmpt);
    set("RANGE,3", "5");
    panel.ChoiceBox(1).pick(3);
    get("RANGE", "1");
    panel.SoftKey(1).Click();
    EXPECT_FALSE(mirror.Unsure.any());
    // "-20 dBm" reads back as 0.
    type(0, "-35");
    set("REFLVL,-35", "5");
    enter(0);
    get("REFLVL", "-20");
    panel.SoftKey(0).Click();
    EXPECT_EQ(mirror.ReferenceLevel, 0);
    EXPECT_TRUE(mirror.Unsure.has(AxisSetting::ReferenceLevel));
    expectPlayed();
}

TEST_F(UnsureTest, Flag_AsksTheWordOnceAllTheSame) {
    refuseLevel();
    get("REFLVL", "-20");
    sweep();
    EXPECT_TRUE(readAgain({false, false, true, false, false}));
    expectPlayed();
}

TEST_F(UnsureTest, FullCycle_AsksNothingTwice) {
    refuseLevel();
    for (const char* word : {"FREQ", "SPAN", "REFLVL", "UNIT", "RANGE", "DYNRANGE"}) get(word, "0");
    get("TRACEDET", "3");
    get("SWPTIME", "1");
    sweep();
    panel.PlaySingleButton.Click();
    expectPlayed();
    EXPECT_FALSE(mirror.Unsure.any());
}

TEST_F(UnsureTest, RefusedQuery_KeepsTheMark) {
    refuseLevel();
    getRefused("REFLVL", "6");
    EXPECT_FALSE(readAgain());
    EXPECT_TRUE(mirror.Unsure.has(AxisSetting::ReferenceLevel));
}

TEST_F(UnsureTest, Preset_ClearsAllMarks) {
    refuseLevel();
    cmd("PRESET");
    panel.ResetButton.Click();
    EXPECT_FALSE(mirror.Unsure.any());
}

}  // namespace
}  // namespace zel
