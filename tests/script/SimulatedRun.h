#pragma once
// The program with a simulated instrument and a script in its window.

#include <string>

#include "ZELSim/InProcessPort.h"
#include "script/Scripts.h"
#include "tests/files/FileSession.h"

namespace zel {

/// Presses Next wherever the step mode waits for it.
struct SimulatedRun {
    SimulatedRun() {
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
    /// Opened from a file in the folder, and run.
    void run(const std::string& text) {
        program.scripts().window.open(folder.write("script.txt", text));
        form.cmdExecute.Click();
    }

    /// No run goes on, and every key is as it is without one.
    void expectFree(const std::string& what) {
        const ControllerForm& panel = program.forms().controller;
        EXPECT_FALSE(program.variables().ScriptInProgress) << what;
        EXPECT_FALSE(program.link().ScanInProgress) << what;
        EXPECT_EQ(form.RunsActive, 0) << what;
        EXPECT_TRUE(panel.PlayContinuousButton.Enabled) << what;
        EXPECT_TRUE(panel.RecordData.Enabled) << what;
        EXPECT_EQ(panel.MousePointer, 0) << what;
    }

    VirtualPlatform platform;
    Folder folder{platform.files};
    zelsim::InProcessPort port{platform.clock, platform.events, {}, {.answering = 0.0001}};
    Program program{platform.bundle(port), ""};
    SpecialMeasForm& form = program.forms().specialMeas;
};

}  // namespace zel
