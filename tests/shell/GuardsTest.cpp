#include <gtest/gtest.h>

#include "platform/virtual/VirtualPlatform.h"
#include "shell/Guards.h"
#include "shell/Program.h"

namespace zel {
namespace {

using Texts = std::vector<std::string>;

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

}  // namespace
}  // namespace zel
