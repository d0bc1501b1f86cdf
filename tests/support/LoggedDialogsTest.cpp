// The answers of the user go into the session log.

#include <gtest/gtest.h>

#include "platform/virtual/VirtualPlatform.h"
#include "support/LoggedDialogs.h"

namespace zel {
namespace {

struct Answers : testing::Test {
    Answers() {
        log.Noted.connect([this](const SessionEvent& event) {
            if (event.kind == SessionEvent::Kind::Input) lines.push_back(event.text);
        });
        boxes.log = dialogs.log = &log;
    }
    VirtualPlatform platform;
    SessionLog log{platform.clock, platform.files};
    LoggedBoxes boxes{platform.boxes};
    LoggedFileDialogs dialogs{platform.fileDialogs};
    std::vector<std::string> lines;
};

TEST_F(Answers, AnswersOfQuestions_AreLinesAndABoxWithOneButtonIsNone) {
    platform.boxes.answer(BoxAnswer::No);
    EXPECT_EQ(boxes.show({BoxIcon::Question, "Sure?", "T", BoxButtons::YesNo}), BoxAnswer::No);
    platform.boxes.answer(BoxAnswer::Cancel);
    EXPECT_EQ(boxes.show({BoxIcon::Question, "Go?", "T", BoxButtons::OkCancel}), BoxAnswer::Cancel);
    boxes.show({BoxIcon::Critical, "Gone"});
    EXPECT_EQ(lines, (std::vector<std::string>{"answer no", "answer cancel"}));
}

TEST_F(Answers, PathsAndTexts_AreLinesAndSoIsACancel) {
    platform.fileDialogs.answer("/tmp/a view.csv");
    EXPECT_EQ(dialogs.save({}), "/tmp/a view.csv");
    platform.fileDialogs.answer("/b.csv");
    EXPECT_EQ(dialogs.open({}), "/b.csv");
    EXPECT_EQ(dialogs.open({}), std::nullopt);
    const auto typed = boxes.prompt("Name", "T", "preset");
    EXPECT_EQ(lines,
              (std::vector<std::string>{"answer /tmp/a view.csv", "answer /b.csv", "answer cancel",
                                        "answer " + typed.value_or("cancel")}));
}

TEST_F(Answers, WithoutALog_AnswersGoOn) {
    boxes.log = nullptr;
    dialogs.log = nullptr;
    platform.boxes.answer(BoxAnswer::Yes);
    EXPECT_EQ(boxes.show({BoxIcon::Question, "Sure?", "T", BoxButtons::YesNo}), BoxAnswer::Yes);
    EXPECT_EQ(dialogs.open({}), std::nullopt);
    EXPECT_TRUE(lines.empty());
}

}  // namespace
}  // namespace zel
