// Each example that is installed, stopped at each of its statements.

#include <filesystem>
#include <fstream>
#include <map>
#include <sstream>

#include "rehearsal/Rehearsal.h"
#include "tests/script/SimulatedRun.h"

namespace zel {
namespace {

/// The names of the examples with their texts.
std::map<std::string, std::string> examples() {
    std::map<std::string, std::string> texts;
    const std::string folder = std::string(ZEL_SOURCE_DIR) + "/defaults/specialMeas";
    for (const auto& entry : std::filesystem::directory_iterator(folder)) {
        std::ifstream in(entry.path(), std::ios::binary);
        std::ostringstream text;
        text << in.rdbuf();
        texts[entry.path().filename().string()] = text.str();
    }
    return texts;
}

TEST(Examples, EachOne_PassesTheCheck) {
    ASSERT_GE(examples().size(), 6U);
    for (const auto& [script, text] : examples()) {
        VirtualPlatform platform;
        const Folder folder{platform.files};
        const RehearsalReport report =
            rehearse({folder.write(script, text), "/views", "", 57600}, platform.files);
        EXPECT_FALSE(report.wrong()) << script << ": " << reportLines(report).front();
    }
}

TEST(Examples, StopAtEveryStatement_LeavesThePanelFree) {
    for (const auto& [script, text] : examples()) {
        for (int at = 0; at < 40; ++at) {
            SimulatedRun example;
            bool reached = false;
            example.program.scripts().executor.StatementBegins.connect([&](int index) {
                if (index == at && !reached) {
                    reached = true;
                    example.form.cmdStop.Click();
                }
            });
            example.run(text);
            EXPECT_EQ(example.form.ReachedEnd, !reached) << script << " " << at;
            example.expectFree(script + " " + std::to_string(at));
            EXPECT_TRUE(example.form.cmdExecute.Enabled);
            EXPECT_FALSE(example.form.cmdStop.Visible);
            const auto& items = example.form.lstCommands.Items.get();
            if (at >= static_cast<int>(items.size())) break;
        }
    }
}

}  // namespace
}  // namespace zel
