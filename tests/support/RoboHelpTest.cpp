#include <gtest/gtest.h>

#include "platform/virtual/VirtualPlatform.h"
#include "support/RoboHelp_CSH.h"

namespace zel {
namespace {

struct RoboHelpTest : ::testing::Test {
    RoboHelpTest() {
        platform.folder.folder = "/home";
        platform.folder.programFolder = "/program";
        const auto note = [this](const char* call) {
            return [this, call](const std::string& file, int command, int context) {
                shown = std::string(call) + " " + file + " " + std::to_string(command) + " " +
                        std::to_string(context);
                return works;
            };
        };
        help.HtmlHelpA = note("html");
        help.WinHelpA = note("win");
    }
    bool ask(const std::string& file, int command = RoboHelp_CSH::kContextHelp) {
        return help.RH_ShowHelp(0, file, command, 2111);
    }
    VirtualPlatform platform;
    RoboHelp_CSH help{platform.folder, platform.files, platform.launcher, platform.boxes};
    std::string shown;
    bool works = true;
};

TEST_F(RoboHelpTest, Source_DecidesTheCall) {
    platform.files.put("/a.chm", "");
    platform.files.put("/b.HLP", "");
    platform.files.put("/c.txt", "");
    EXPECT_TRUE(ask("/a.chm"));
    EXPECT_EQ(shown, "html /a.chm 15 2111");
    EXPECT_TRUE(ask("/b.HLP"));
    EXPECT_EQ(shown, "win /b.HLP 15 2111");
    shown.clear();
    EXPECT_FALSE(ask("/c.txt"));
    EXPECT_FALSE(ask("/missing.chm"));
    EXPECT_EQ(shown, "");
}

TEST_F(RoboHelpTest, TopicOfAForm_ComesFromTheProgramsOwnBook) {
    platform.files.put("/program/help/zelremote.qch", "");
    help.showTopic(1112);
    EXPECT_EQ(shown, "html /program/help/zelremote.qch 15 1112");
    EXPECT_EQ(help.book(), "/program/help/zelremote.qch");
    EXPECT_TRUE(platform.boxes.texts().empty());
}

TEST_F(RoboHelpTest, MissingBook_IsSaid) {
    help.showTopic(1112);
    EXPECT_EQ(platform.boxes.texts(),
              std::vector<std::string>{"The help file /home/ZELRemoteHelp.chm cannot be opened."});
}

TEST_F(RoboHelpTest, WebHelp_GetsItsArguments) {
    const auto address = [](const char* source, int command) {
        return RoboHelp_CSH::webAddress(source, command, 2111);
    };
    EXPECT_EQ(address("http://x/start.htm", RoboHelp_CSH::kContextHelp),
              "http://x/start.htm#<id=2111");
    EXPECT_EQ(address("http://x/start.htm", RoboHelp_CSH::kIndex), "http://x/start.htm#<cmd=idx");
    EXPECT_EQ(address("http://x/start.htm", RoboHelp_CSH::kSearch), "http://x/start.htm#<cmd=fts");
    EXPECT_EQ(address("http://x/start.htm", RoboHelp_CSH::kTableOfContents),
              "http://x/start.htm#<cmd=toc");
    EXPECT_EQ(address("http://x/server", RoboHelp_CSH::kContextHelp),
              "http://x/server?ctxid=2111&cmd=newwnd&rtype=iefrm");
    EXPECT_EQ(address("http://x/server?p=1", RoboHelp_CSH::kContextHelp),
              "http://x/server?p=1&ctxid=2111&cmd=newwnd&rtype=iefrm");
    EXPECT_TRUE(ask("http://x/start.htm"));
    ASSERT_EQ(platform.launcher.starts.size(), 1U);
    EXPECT_EQ(platform.launcher.starts[0].path, "http://x/start.htm#<id=2111");
}

}  // namespace
}  // namespace zel
