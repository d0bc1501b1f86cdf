#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "platform/Controls.h"
#include "platform/Event.h"
#include "platform/KeyInput.h"
#include "platform/ModalForm.h"
#include "platform/TimerDriver.h"
#include "platform/virtual/VirtualTime.h"

namespace zel {
namespace {

struct TestForm : Form {
    TestForm() : Form("TestForm") {}
    Button button{*this, "button", "Push"};
    TextBox box{*this, "box"};
    CheckBox check{*this, "check"};
    OptionButton red{*this, "red", "colour"};
    OptionButton green{*this, "green", "colour"};
    OptionButton large{*this, "large", "size"};
    DropDownList list{*this, "list"};
    DropDownList free{*this, "free", true};
    ControlArray<Label, 3> labels{*this, "labels", "caption"};
    Timer timer{*this, "timer", 10};
};

TEST(EventTest, Call_SeveralHandlers_RunInTheOrderOfConnection) {
    Event<int> event;
    std::string log;
    event.connect([&](int n) { log += "a" + std::to_string(n); });
    event.connect([&](int n) { log += "b" + std::to_string(n); });
    event(7);
    EXPECT_EQ(log, "a7b7");
}

TEST(EventTest, Connect_WithinAHandler_RunsFromTheNextCallOn) {
    Event<> event;
    int late = 0;
    event.connect([&] { event.connect([&] { ++late; }); });
    event();
    EXPECT_EQ(late, 0);
    event();
    EXPECT_EQ(late, 1);
}

TEST(EventTest, Connected_OnlyWithAHandler_IsTrue) {
    Event<> event;
    EXPECT_FALSE(event.connected());
    event.connect([] {});
    EXPECT_TRUE(event.connected());
}

TEST(PropertyTest, Assign_SameValue_NotesNoChange) {
    TestForm form;
    int changes = 0;
    form.button.Changed.connect([&] { ++changes; });
    form.button.Caption = "Push";
    EXPECT_EQ(changes, 0);
    form.button.Caption = "Pull";
    form.button.Enabled = false;
    EXPECT_EQ(changes, 2);
    EXPECT_EQ(form.button.Caption.get(), "Pull");
}

TEST(FormTest, Control_ByName_IsFoundWithItsCase) {
    TestForm form;
    EXPECT_EQ(form.control("button"), &form.button);
    EXPECT_EQ(form.control("labels(2)"), &form.labels(2));
    EXPECT_EQ(form.control("Button"), nullptr);
    EXPECT_EQ(form.control("labels(3)"), nullptr);
}

TEST(FormTest, Show_Twice_LoadsOnceUntilUnload) {
    TestForm form;
    int loads = 0;
    form.Load.connect([&] { ++loads; });
    form.Show();
    form.Hide();
    form.Show();
    EXPECT_EQ(loads, 1);
    form.unload(1);
    EXPECT_FALSE(form.Visible);
    form.Show();
    EXPECT_EQ(loads, 2);
}

TEST(ModalFormTest, ShowModalForm_FormIsHiddenByATask_ComesBack) {
    VirtualClock clock;
    VirtualEvents events(clock);
    TestForm form;
    bool wasModal = false;
    events.schedule(450, [&] {
        wasModal = form.Modal && form.Visible;
        form.Hide();
    });
    showModalForm(form, events);
    EXPECT_TRUE(wasModal);
    EXPECT_FALSE(form.Modal);
    EXPECT_EQ(clock.micros(), 450000);
}

TEST(CheckBoxTest, SetValue_OnlyAChange_RunsTheHandler) {
    TestForm form;
    int clicks = 0;
    form.check.Clicked.connect([&] { ++clicks; });
    form.check.setValue(false);
    EXPECT_EQ(clicks, 0);
    form.check.setValue(true);
    form.check.setValue(true);
    EXPECT_EQ(clicks, 1);
}

TEST(CheckBoxTest, Click_TogglesAheadOfTheHandler) {
    TestForm form;
    bool seen = false;
    form.check.Clicked.connect([&] { seen = form.check.Value(); });
    form.check.Click();
    EXPECT_TRUE(seen);
    form.check.Click();
    EXPECT_FALSE(seen);
}

TEST(OptionButtonTest, Click_DeselectsItsGroupWithoutTheirHandlers) {
    TestForm form;
    form.large.setValue(true);
    form.red.setValue(true);
    int redClicks = 0;
    form.red.Clicked.connect([&] { ++redClicks; });
    form.green.Click();
    EXPECT_TRUE(form.green.Value());
    EXPECT_FALSE(form.red.Value());
    EXPECT_TRUE(form.large.Value());
    EXPECT_EQ(redClicks, 0);
}

TEST(OptionButtonTest, Click_OnTheSelectedOne_RunsNoHandler) {
    TestForm form;
    form.red.setValue(true);
    int clicks = 0;
    form.red.Clicked.connect([&] { ++clicks; });
    form.red.Click();
    EXPECT_EQ(clicks, 0);
    EXPECT_TRUE(form.red.Value());
}

TEST(DropDownListTest, SetText_KnownEntry_MovesTheIndexAndFiresNothing) {
    TestForm form;
    int clicks = 0;
    form.list.Clicked.connect([&] { ++clicks; });
    form.list.setItems({"one", "two"});
    form.list.setText("two");
    EXPECT_EQ(form.list.ListIndex(), 1);
    EXPECT_EQ(form.list.Text(), "two");
    EXPECT_EQ(clicks, 0);
}

TEST(DropDownListTest, SetText_UnknownEntry_IsKeptByAnEditableListOnly) {
    TestForm form;
    form.list.setItems({"one"});
    form.free.setItems({"one"});
    form.list.setText("three");
    form.free.setText("three");
    EXPECT_EQ(form.list.Text(), "");
    EXPECT_EQ(form.free.Text(), "three");
    EXPECT_EQ(form.free.ListIndex(), -1);
}

TEST(DropDownListTest, SetListIndex_OutsideTheList_SelectsNothing) {
    TestForm form;
    form.list.setItems({"one", "two"});
    form.list.setListIndex(1);
    form.list.setListIndex(2);
    EXPECT_EQ(form.list.ListIndex(), -1);
    EXPECT_EQ(form.list.Text(), "");
    EXPECT_EQ(form.list.List(7), "");
}

TEST(DropDownListTest, Pick_AnEntry_SelectsThenFires) {
    TestForm form;
    std::string seen;
    form.list.setItems({"one", "two"});
    form.list.Clicked.connect([&] { seen = form.list.Text(); });
    form.list.pick(1);
    EXPECT_EQ(seen, "two");
}

TEST(ControlArrayTest, Elements_AreNamedByTheirIndex) {
    TestForm form;
    EXPECT_EQ(form.labels(0).name(), "labels(0)");
    EXPECT_EQ(form.labels(2).Caption.get(), "caption");
    EXPECT_EQ(form.labels.count(), 3);
    EXPECT_THROW(form.labels(3), std::out_of_range);
}

TEST(KeyInputTest, TypeText_HandlerSwallowsLetters_KeepsTheDigits) {
    TestForm form;
    form.box.KeyPress.connect([](int& key) {
        if (key < '0' || key > '9') key = 0;
    });
    typeText(form.box, "1a2\xC3\xA9");
    EXPECT_EQ(form.box.Text.get(), "12");
}

TEST(KeyInputTest, TypeText_NonAscii_GoesThroughAsOneCharacterEach) {
    TestForm form;
    std::vector<int> keys;
    form.box.KeyPress.connect([&](int& key) { keys.push_back(key); });
    typeText(form.box, "\xC3\xA9\xE2\x82\xAC");
    EXPECT_EQ(keys, (std::vector<int>{0xE9, 0x20AC}));
    EXPECT_EQ(form.box.Text.get(), "\xC3\xA9\xE2\x82\xAC");
}

TEST(KeyInputTest, TypeKey_Backspace_TakesAWholeCharacterAway) {
    TestForm form;
    form.box.Text = "a\xC3\xA9";
    typeKey(form.box, kKeyBackspace);
    EXPECT_EQ(form.box.Text.get(), "a");
}

TEST(KeyInputTest, TypeKey_KeyDownComesAheadOfKeyPress) {
    TestForm form;
    std::string log;
    form.box.KeyDown.connect([&](int key, int) { log += "d" + std::to_string(key); });
    form.box.KeyPress.connect([&](int& key) { log += "p" + std::to_string(key); });
    typeKey(form.box, kKeyEnter);
    EXPECT_EQ(log, "d13p13");
    EXPECT_EQ(form.box.Text.get(), "");
}

TEST(KeyInputTest, PressKey_Arrow_GivesKeyDownOnly) {
    TestForm form;
    int down = 0;
    int pressed = 0;
    form.box.KeyDown.connect([&](int key, int) { down = key; });
    form.box.KeyPress.connect([&](int&) { ++pressed; });
    pressKey(form.box, kKeyLeft);
    EXPECT_EQ(down, kKeyLeft);
    EXPECT_EQ(pressed, 0);
}

struct TimerDriverTest : ::testing::Test {
    VirtualClock clock;
    VirtualEvents events{clock};
    TestForm form;
    TimerDriver driver{events};
    int ticks = 0;

    TimerDriverTest() {
        form.timer.Tick.connect([this] { ++ticks; });
        driver.attach(form.timer);
    }
};

TEST_F(TimerDriverTest, Timer_NotEnabled_NeverTicks) {
    events.runFor(100);
    EXPECT_EQ(ticks, 0);
}

TEST_F(TimerDriverTest, Timer_Enabled_TicksEachInterval) {
    form.timer.Enabled = true;
    events.runFor(35);
    EXPECT_EQ(ticks, 3);
}

TEST_F(TimerDriverTest, Timer_DisabledAgain_Stops) {
    form.timer.Enabled = true;
    events.runFor(15);
    form.timer.Enabled = false;
    events.runFor(100);
    EXPECT_EQ(ticks, 1);
}

TEST_F(TimerDriverTest, Timer_IntervalZero_NeverTicks) {
    form.timer.Interval = 0;
    form.timer.Enabled = true;
    events.runFor(100);
    EXPECT_EQ(ticks, 0);
}

TEST_F(TimerDriverTest, Timer_TickThatWaits_IsNotEnteredAgain) {
    int depth = 0;
    int deepest = 0;
    form.timer.Tick.connect([&] {
        deepest = std::max(deepest, ++depth);
        events.runFor(35);
        --depth;
    });
    form.timer.Enabled = true;
    events.runFor(100);
    EXPECT_EQ(deepest, 1);
    EXPECT_GT(ticks, 1);
}

}  // namespace
}  // namespace zel
