// Each example that is installed, stopped at each of its statements.

#include <filesystem>
#include <fstream>
#include <map>
#include <sstream>

#include "ZELSim/InProcessPort.h"
#include "platform/virtual/VirtualPlatform.h"
#include "rehearsal/Rehearsal.h"
#include "script/Scripts.h"
#include "tests/files/FileSession.h"

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

struct ExampleRun {
    ExampleRun() {
        platform.ports.ports = {"SIM"};
        program.start();
        program.connect({LinkAddress::Kind::Serial, "SIM", 57600}, false);
        program.forms().controller.cmdSpecial.Click();
        press();
    }
    void press() {
        platform.events.schedule(10, [this] {
            if (form.WaitsForNext) form.cmdNext.Click();
            press();
        });
    }
    void run(const std::string& text) {
        program.scripts().window.open(folder.write("script.txt", text));
        form.cmdExecute.Click();
    }

    VirtualPlatform platform;
    Folder folder{platform.files};
    zelsim::InProcessPort port{platform.clock, platform.events, {}, {.answering = 0.0001}};
    Program program{platform.bundle(port), ""};
    SpecialMeasForm& form = program.forms().specialMeas;
};

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
            ExampleRun example;
            bool reached = false;
            example.program.scripts().executor.StatementBegins.connect([&](int index) {
                if (index == at && !reached) {
                    reached = true;
                    example.form.cmdStop.Click();
                }
            });
            example.run(text);
            const ControllerForm& panel = example.program.forms().controller;
            EXPECT_EQ(example.form.ReachedEnd, !reached) << script << " " << at;
            EXPECT_FALSE(example.program.variables().ScriptInProgress);
            EXPECT_FALSE(example.program.link().ScanInProgress);
            EXPECT_EQ(example.form.RunsActive, 0);
            EXPECT_TRUE(panel.PlayContinuousButton.Enabled);
            EXPECT_TRUE(panel.RecordData.Enabled);
            EXPECT_TRUE(example.form.cmdExecute.Enabled);
            EXPECT_FALSE(example.form.cmdStop.Visible);
            EXPECT_EQ(panel.MousePointer, 0);
            const auto& items = example.form.lstCommands.Items.get();
            if (at >= static_cast<int>(items.size())) break;
        }
    }
}

}  // namespace
}  // namespace zel
