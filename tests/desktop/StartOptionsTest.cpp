#include <gtest/gtest.h>

#include <cstdio>
#include <fstream>
#include <sstream>
#include <vector>

#include "desktop/StartOptions.h"

namespace zel {
namespace {

struct StartOptionsTest : ::testing::Test {
    StartOptions options;
    std::ostringstream out;
    std::ostringstream errors;

    std::optional<int> parse(std::vector<const char*> words) {
        words.insert(words.begin(), "zelremote");
        return parseStartOptions(static_cast<int>(words.size()), words.data(), options, out,
                                 errors);
    }
};

TEST_F(StartOptionsTest, AllOptions_AreTaken) {
    EXPECT_FALSE(
        parse({"--connect", "serial:/dev/ttyS0@19200", "--home", "dir", "--words", "NOHEADER",
               "--theme", "dark", "--size", "1024x600", "--screenshot", "a.png", "BUTTON", "x"}));
    ASSERT_TRUE(options.address);
    EXPECT_EQ(options.address->port, "/dev/ttyS0");
    EXPECT_EQ(options.address->number, 19200);
    EXPECT_EQ(options.home, "dir");
    EXPECT_EQ(options.words, "NOHEADER BUTTON x");
    EXPECT_EQ(options.theme, ThemeChoice::Dark);
    EXPECT_EQ(options.size, QSize(1024, 600));
    EXPECT_EQ(options.screenshot, "a.png");
}

TEST_F(StartOptionsTest, Language_IsOneThatThereIs) {
    EXPECT_FALSE(parse({"--language", "de"}));
    EXPECT_EQ(options.language, "de");
    EXPECT_EQ(parse({"--language", "xx"}), 2);
}

TEST_F(StartOptionsTest, NoOptions_LeaveEverythingOpen) {
    EXPECT_FALSE(parse({}));
    EXPECT_FALSE(options.address);
    EXPECT_FALSE(options.theme);
    EXPECT_FALSE(options.size.isValid());
    EXPECT_EQ(options.words, "");
}

TEST_F(StartOptionsTest, HelpAndVersion_GoToTheOutputWithStatus0) {
    EXPECT_EQ(parse({"--version"}), 0);
    EXPECT_EQ(out.str(), "zelremote 1.0\n");
    EXPECT_EQ(parse({"--help"}), 0);
    EXPECT_NE(out.str().find("--screenshot"), std::string::npos);
    EXPECT_EQ(errors.str(), "");
    const char* const help[] = {"zelremote", "-platform", "xcb", "--help"};
    EXPECT_TRUE(asksForHelp(4, help));
    EXPECT_FALSE(asksForHelp(3, help));
}

class WrongStart : public StartOptionsTest,
                   public ::testing::WithParamInterface<std::vector<const char*>> {};
TEST_P(WrongStart, GivesStatus2AndAReason) {
    EXPECT_EQ(parse(GetParam()), 2);
    EXPECT_EQ(out.str(), "");
    EXPECT_NE(errors.str(), "");
}
INSTANTIATE_TEST_SUITE_P(Options, WrongStart,
                         ::testing::Values(std::vector<const char*>{"--connect", "sim:"},
                                           std::vector<const char*>{"--connect", "serial:"},
                                           std::vector<const char*>{"--theme", "blue"},
                                           std::vector<const char*>{"--size", "1024"},
                                           std::vector<const char*>{"--size", "0x600"},
                                           std::vector<const char*>{"--size", "1e3x600"},
                                           std::vector<const char*>{"--fly"}));

TEST_F(StartOptionsTest, AWordThatIsAFile_IsShownAndNoWordOfTheProgram) {
    const std::string file = testing::TempDir() + "start options view.csv";
    std::ofstream(file) << "Trace Name;Analyzer\n";
    EXPECT_FALSE(parse({"BUTTON", file.c_str(), "/no/such/file.csv"}));
    EXPECT_EQ(options.file, file);
    EXPECT_EQ(options.words, "BUTTON /no/such/file.csv");
    std::remove(file.c_str());
}

}  // namespace
}  // namespace zel
