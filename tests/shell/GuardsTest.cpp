#include <gtest/gtest.h>

#include <new>
#include <stdexcept>

#include "platform/virtual/VirtualPlatform.h"
#include "shell/Guards.h"
#include "shell/Program.h"

namespace zel {
namespace {

using Texts = std::vector<std::string>;

Box boxOf(const std::function<void()>& action) {
    try {
        action();
    } catch (...) {
        return failureBox();
    }
    return {};
}

TEST(FailureBox, SaysWhatHappened) {
    EXPECT_EQ(boxOf([] { throw std::bad_alloc(); }).text,
              "There is not enough memory for this. It was not finished.");
    EXPECT_EQ(boxOf([] { throw std::runtime_error("no room"); }).text,
              "This could not be finished: no room");
    EXPECT_EQ(boxOf([] { throw 7; }).text, "This could not be finished, for an unknown reason.");
    EXPECT_EQ(boxOf([] { throw 7; }).icon, BoxIcon::Critical);
}

TEST(QuietBoxes, WhileQuiet_ShowOnlyWhatAsks) {
    RecordedBoxes shown;
    QuietBoxes boxes(shown);
    bool quiet = true;
    boxes.quiet = [&quiet] { return quiet; };
    EXPECT_EQ(boxes.show({BoxIcon::Warning, "No response received!"}), BoxAnswer::Ok);
    EXPECT_EQ(shown.texts(), Texts{});
    boxes.show({BoxIcon::Question, "End?", kProgramTitle, BoxButtons::YesNo});
    EXPECT_EQ(shown.texts(), Texts{"End?"});
    quiet = false;
    boxes.show({BoxIcon::Warning, "No response received!"});
    EXPECT_EQ(shown.texts(), (Texts{"End?", "No response received!"}));
}

TEST(ReportedSettings, SettingsThatCannotBeStored_AreReportedOnce) {
    VirtualPlatform platform;
    Program program(platform.bundle(), "");
    program.start();
    platform.settings.works = false;
    platform.files.put("/views/a.csv", "1.000;2; \r\n");
    platform.files.put("/views/b.csv", "1.000;2; \r\n");
    ControllerForm& panel = program.forms().controller;
    panel.OpenFile("/views/a.csv");
    panel.OpenFile("/views/b.csv");
    EXPECT_EQ(platform.boxes.texts(), Texts{"The settings cannot be stored.\r\n"
                                            "The program goes on and forgets them at its end."});
    EXPECT_EQ(panel.RecentFile(0).Caption.get(), "b.csv");
}

TEST(Program, FailureOfAHandler_EndsInABoxWithTheUsualPointer) {
    VirtualPlatform platform;
    Program program(platform.bundle(), "");
    program.start();
    ControllerForm& panel = program.forms().controller;
    panel.MousePointer = 11;
    try {
        throw std::bad_alloc();
    } catch (...) {
        program.showFailure();
    }
    EXPECT_EQ(platform.boxes.texts(),
              Texts{"There is not enough memory for this. It was not finished."});
    EXPECT_EQ(panel.MousePointer.get(), 0);
}

}  // namespace
}  // namespace zel
