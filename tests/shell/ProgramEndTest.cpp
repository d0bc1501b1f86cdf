#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "shell/ProgramEnd.h"
#include "tests/Session.h"

namespace zel {
namespace {

using Texts = std::vector<std::string>;

struct ProgramEndTest : TestSession, ::testing::Test {
    Texts unloaded;

    ProgramEndTest() {
        for (Form* form : forms.all()) {
            form->Unload.connect([this, form](int argument) {
                unloaded.push_back(form->name() + " " + std::to_string(argument));
            });
        }
    }
};

const char* const kQuestion = "Are you sure you want to close ZELRemote?";

TEST_F(ProgramEndTest, Exit_AsksInTheFormsTitle) {
    program.start();
    panel.ExitObject.Click();
    ASSERT_EQ(boxes.boxes().size(), 1U);
    EXPECT_EQ(boxes.boxes()[0].text, kQuestion);
    EXPECT_EQ(boxes.boxes()[0].title, "Marlow & Tenby ZELRemote v1.0");
    EXPECT_EQ(boxes.boxes()[0].icon, BoxIcon::Question);
    EXPECT_EQ(boxes.boxes()[0].buttons, BoxButtons::YesNo);
    EXPECT_TRUE(program.ended());
}

TEST_F(ProgramEndTest, Exit_AnsweredNo_DoesNothingMore) {
    program.start();
    boxes.answer(BoxAnswer::No);
    panel.ExitObject.Click();
    EXPECT_FALSE(program.ended());
    EXPECT_EQ(unloaded, Texts{});
    EXPECT_TRUE(panel.Visible);
}

TEST_F(ProgramEndTest, Exit_UnloadsTheFormsInTheirOrder) {
    program.start();
    panel.ExitObject.Click();
    // The panel unloads the waterfall, and the menu entry once more.
    EXPECT_EQ(unloaded,
              (Texts{"MainForm 1", "AboutForm 1", "DevicesChoiceForm 1", "TimeForm 1",
                     "ScriptEditor 1", "WaterfallForm 1", "ControllerForm 1", "WaterfallForm 1"}));
}

TEST_F(ProgramEndTest, Close_UnloadsTheFormsInTheirOrder) {
    program.start();
    EXPECT_TRUE(program.requestClose());
    EXPECT_EQ(unloaded, (Texts{"MainForm 1", "AboutForm 1", "DevicesChoiceForm 1", "TimeForm 1",
                               "ScriptEditor 1", "WaterfallForm 1", "ControllerForm 1"}));
    EXPECT_TRUE(program.ended());
}

TEST_F(ProgramEndTest, Close_AnsweredNo_KeepsTheWindow) {
    program.start();
    boxes.answer(BoxAnswer::No);
    int cancel = 0;
    panel.QueryUnload(cancel);
    EXPECT_EQ(cancel, -1);
    EXPECT_FALSE(program.ended());
    EXPECT_EQ(unloaded, Texts{});
}

TEST_F(ProgramEndTest, Close_AnsweredOtherwise_DoesNotCancel) {
    program.start();
    boxes.answer(BoxAnswer::Cancel);
    int cancel = 0;
    panel.QueryUnload(cancel);
    EXPECT_EQ(cancel, 0);
    EXPECT_TRUE(program.ended());
}

TEST_F(ProgramEndTest, Close_WhileConnected_AsksTwiceAndSaysLocal) {
    startConnected();
    cmd("LOCAL");
    EXPECT_TRUE(program.requestClose());
    expectPlayed();
    EXPECT_EQ(boxes.texts(), (Texts{kQuestion, "Are you sure you want to close the connection?"}));
    EXPECT_TRUE(program.ended());
    EXPECT_FALSE(port.isOpen());
    EXPECT_FALSE(panel.isConnected);
}

TEST_F(ProgramEndTest, Close_SecondQuestionCancelled_EndsAllTheSame) {
    startConnected();
    boxes.answer(BoxAnswer::Yes);
    boxes.answer(BoxAnswer::Cancel);
    cmd("REMOTE");
    EXPECT_TRUE(program.requestClose());
    expectPlayed();
    EXPECT_TRUE(program.ended());
    EXPECT_TRUE(panel.isConnected);
}

TEST_F(ProgramEndTest, Exit_SecondQuestionCancelled_ClearsTheConnectedFlag) {
    startConnected();
    boxes.answer(BoxAnswer::Yes);
    boxes.answer(BoxAnswer::Cancel);
    cmd("REMOTE");
    panel.ExitObject.Click();
    EXPECT_TRUE(program.ended());
    EXPECT_FALSE(panel.isConnected);
}

TEST_F(ProgramEndTest, Exit_AnsweredNoWhileConnected_LeavesTheConnection) {
    startConnected();
    boxes.answer(BoxAnswer::No);
    panel.ExitObject.Click();
    EXPECT_EQ(boxes.texts(), Texts{kQuestion});
    EXPECT_TRUE(panel.isConnected);
    EXPECT_EQ(port.written(), "");
}

TEST_F(ProgramEndTest, End_IsToldOnce) {
    int ends = 0;
    program.Ended.connect([&] { ++ends; });
    program.start();
    panel.ExitObject.Click();
    panel.ExitObject.Click();
    EXPECT_EQ(ends, 1);
}

}  // namespace
}  // namespace zel
