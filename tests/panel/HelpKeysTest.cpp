#include <gtest/gtest.h>

#include <map>
#include <string_view>

#include "panel/HelpKeys.h"
#include "platform/KeyInput.h"
#include "tests/files/FileSession.h"

namespace zel {
namespace {

struct HelpKeysTest : TestSession, ::testing::Test {
    HelpKeysTest() {
        program.start();
        platform.folder.folder = "/views";
        book = own.write("ZELRemoteHelp.chm", "book");
    }
    /// The topics that were opened, and nothing more.
    std::vector<std::string> opened() {
        std::vector<std::string> topics;
        for (const auto& start : platform.launcher.starts) {
            EXPECT_NE(start.path.find("ZELRemoteHelp.chm"), std::string::npos);
            topics.push_back(start.arguments.at(0));
        }
        return topics;
    }
    Folder own{platform.files};
    std::string book;
};

TEST_F(HelpKeysTest, F1_OnEveryKeyOfThePanel_OpensItsTopic) {
    std::size_t wanted = 0;
    for (Button* key :
         {&panel.FrequencyButton, &panel.SpanButton, &panel.AmplitudeButton, &panel.BWButton,
          &panel.SweepButton, &panel.TraceButton, &panel.MeasButton, &panel.TrackButton1,
          &panel.MarkerButton, &panel.SendButton, &panel.SoftKey(0), &panel.SoftKey(4)}) {
        key->KeyDown(kKeyF1, 0);
        EXPECT_EQ(opened(), std::vector<std::string>(++wanted, "2111")) << key->name();
    }
    pressKey(panel.SoftTextBox(3), kKeyF1);
    panel.CWGraph1.KeyDown(kKeyF1, 0);
    EXPECT_EQ(opened(), std::vector<std::string>(wanted + 2, "2111"));
}

TEST_F(HelpKeysTest, F1_InEachForm_OpensTheTopicOfTheForm) {
    for (const auto& [form, topic] : std::map<std::string_view, int>{{"ControllerForm", 2111},
                                                                     {"DevicesChoiceForm", 1112},
                                                                     {"TCPConnectionForm", 1113},
                                                                     {"MainForm", 1113},
                                                                     {"TimeForm", 1114},
                                                                     {"ServerForm", 3113},
                                                                     {"SpecialMeasForm", 4111},
                                                                     {"WaterfallForm", 5111},
                                                                     {"no form", 1110}})
        EXPECT_EQ(helpTopicOf(form), topic) << form;
    pressKey(forms.tcpConnection.IPAdressTextBox, kKeyF1);
    forms.main.ZELButton.KeyDown(kKeyF1, 0);
    forms.waterfall.KeyDown(kKeyF1, 0);
    EXPECT_EQ(opened(), (std::vector<std::string>{"1113", "1113", "5111"}));
}

TEST_F(HelpKeysTest, OtherKeys_OpenNothing) {
    panel.SpanButton.KeyDown(kKeyEnter, 0);
    pressKey(panel.SoftTextBox(3), kKeyLeft);
    panel.CWGraph1.KeyDown(kKeyRight, 0);
    EXPECT_TRUE(opened().empty());
}

TEST_F(HelpKeysTest, F1_InTheIntervalOfARecording_OpensItsTopic) {
    pressKey(forms.time.TimeIntervalBox, kKeyF1);
    pressKey(forms.time.TimeIntervalBox, kKeyLeft);
    EXPECT_EQ(opened(), std::vector<std::string>{"1114"});
}

TEST_F(HelpKeysTest, HelpMenu_OpensTheContents) {
    panel.HelpHelp.Click();
    EXPECT_EQ(opened(), std::vector<std::string>{"1110"});
}

TEST_F(HelpKeysTest, MissingBook_IsTold) {
    platform.files.remove(book);
    panel.HelpHelp.Click();
    ASSERT_EQ(boxes.texts().size(), 1U);
    EXPECT_NE(boxes.texts()[0].find("ZELRemoteHelp.chm cannot be opened."), std::string::npos);
    EXPECT_TRUE(opened().empty());
}

}  // namespace
}  // namespace zel
