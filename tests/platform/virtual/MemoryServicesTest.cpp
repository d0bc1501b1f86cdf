#include <gtest/gtest.h>

#include "platform/virtual/VirtualPlatform.h"

namespace zel {
namespace {

TEST(RecordedBoxesTest, Show_NothingQueued_GivesTheAffirmativeButton) {
    RecordedBoxes boxes;
    EXPECT_EQ(boxes.show({BoxIcon::Question, "?", "T", BoxButtons::YesNo}), BoxAnswer::Yes);
    EXPECT_EQ(boxes.show({BoxIcon::Question, "?", "T", BoxButtons::OkCancel}), BoxAnswer::Ok);
    EXPECT_EQ(boxes.show({BoxIcon::Plain, "!"}), BoxAnswer::Ok);
}

TEST(RecordedBoxesTest, Show_AnswersQueued_GivesThemInOrderAndRecordsTheBoxes) {
    RecordedBoxes boxes;
    boxes.answer(BoxAnswer::Cancel);
    boxes.answer(BoxAnswer::No);
    EXPECT_EQ(boxes.show({BoxIcon::Question, "one", "T", BoxButtons::OkCancel}), BoxAnswer::Cancel);
    EXPECT_EQ(boxes.show({BoxIcon::Critical, "two", "T", BoxButtons::YesNo}), BoxAnswer::No);
    EXPECT_EQ(boxes.texts(), (std::vector<std::string>{"one", "two"}));
    EXPECT_EQ(boxes.boxes()[1].icon, BoxIcon::Critical);
}

TEST(RecordedBoxesTest, Prompt_QueuedLineCancelAndNothing_GivesEachInTurn) {
    RecordedBoxes boxes;
    boxes.answerPrompt("typed");
    boxes.answerPrompt(std::nullopt);
    EXPECT_EQ(boxes.prompt("text", "title", "preset"), "typed");
    EXPECT_EQ(boxes.prompt("text", "title", "preset"), std::nullopt);
    EXPECT_EQ(boxes.prompt("text", "title", "preset"), "preset");
    EXPECT_EQ(boxes.prompts().size(), 3U);
}

TEST(RecordedBoxesTest, WhileShown_RunsAheadOfTheAnswer) {
    RecordedBoxes boxes;
    boxes.whileShown = [&](const Box&) { boxes.answer(BoxAnswer::No); };
    EXPECT_EQ(boxes.show({BoxIcon::Question, "?", "T", BoxButtons::YesNo}), BoxAnswer::No);
}

TEST(MemoryServicesTest, Settings_AbsentKey_GivesTheFallback) {
    MemorySettings settings;
    settings.set("app", "section", "key", "value");
    EXPECT_EQ(settings.get("app", "section", "key", "fallback"), "value");
    EXPECT_EQ(settings.get("app", "other", "key", "fallback"), "fallback");
}

TEST(MemoryServicesTest, FileDialogs_NothingQueued_AreCancelled) {
    QueuedFileDialogs dialogs;
    dialogs.answer("a.txt");
    FileDialogRequest request;
    request.title = "Save";
    EXPECT_EQ(dialogs.save(request), "a.txt");
    EXPECT_EQ(dialogs.open(request), std::nullopt);
    EXPECT_EQ(dialogs.saves.at(0).title, "Save");
}

TEST(MemoryServicesTest, StartupFolder_LinkMadeAndRemoved_IsGone) {
    MemoryStartupFolder startup;
    EXPECT_TRUE(startup.createLink("name", "argument"));
    EXPECT_EQ(startup.links.at("name"), "argument");
    EXPECT_TRUE(startup.removeLink("name"));
    EXPECT_FALSE(startup.removeLink("name"));
}

TEST(VirtualPlatformTest, Bundle_WithAnotherPort_HandsThatOneOut) {
    VirtualPlatform platform;
    ScriptedPort other(platform.events);
    EXPECT_EQ(&platform.bundle().serialPort, &platform.port);
    EXPECT_EQ(&platform.bundle(other).serialPort, &other);
    EXPECT_EQ(&platform.bundle(other).clock, &platform.clock);
}

}  // namespace
}  // namespace zel
