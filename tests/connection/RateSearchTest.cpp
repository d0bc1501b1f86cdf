// The search over the baud rates after an attempt that failed.

#include <gtest/gtest.h>

#include "platform/virtual/VirtualPlatform.h"
#include "shell/Program.h"
#include "support/Text.h"
#include "tests/connection/SwitchedPort.h"

namespace zel {
namespace {

constexpr const char* kPath = "/dev/ttyUSB0";

struct RateSearchTest : ::testing::Test {
    RateSearchTest() : port(platform.clock, platform.events, {}, {.baud = 38400}) {
        platform.ports.ports = {kPath};
        program.start();
    }
    void fail() {
        EXPECT_FALSE(program.connect({LinkAddress::Kind::Serial, kPath, 57600}, true));
        EXPECT_TRUE(form.SearchRatesButton.Visible);
    }

    VirtualPlatform platform;
    SwitchedPort port;
    Program program{platform.bundle(port), ""};
    MainForm& form = program.forms().main;
    ControllerForm& panel = program.forms().controller;
};

TEST_F(RateSearchTest, IsOfferedAfterAFailureAlone) {
    EXPECT_FALSE(form.SearchRatesButton.Visible);
    fail();
    EXPECT_TRUE(program.connect({LinkAddress::Kind::Serial, kPath, 38400}, true));
    EXPECT_FALSE(form.SearchRatesButton.Visible);
}

TEST_F(RateSearchTest, ConnectsAtTheRateThatAnswers) {
    fail();
    std::string step;
    platform.events.schedule(400, [&] { step = form.AdviceLabel.Caption; });
    form.SearchRatesButton.Click();
    EXPECT_TRUE(panel.isConnected);
    EXPECT_EQ(form.BaudList.Text(), "38400");
    EXPECT_EQ(step, "Searching the instrument at 115200 baud, rate 1 of 5");
    EXPECT_FALSE(form.Searching);
    EXPECT_FALSE(form.SearchRatesButton.Visible);
    EXPECT_FALSE(panel.CWGraph1.values().empty());
}

TEST_F(RateSearchTest, Cancel_LeavesTheSearch) {
    fail();
    platform.events.schedule(1000, [this] {
        EXPECT_EQ(form.CancelConnButton1.Caption.get(), "Cancel");
        form.CancelConnButton1.Click();
    });
    const std::int64_t began = platform.clock.micros();
    form.SearchRatesButton.Click();
    EXPECT_LT(platform.clock.micros() - began, 1'200'000);
    EXPECT_FALSE(panel.isConnected);
    EXPECT_FALSE(port.isOpen());
    EXPECT_EQ(form.CancelConnButton1.Caption.get(), "Close");
    EXPECT_EQ(form.MousePointer.get(), 0);
}

TEST_F(RateSearchTest, NoInstrument_NamesTheRatesTried) {
    fail();
    port.on = false;
    form.SearchRatesButton.Click();
    EXPECT_FALSE(panel.isConnected);
    EXPECT_TRUE(contains(form.AdviceLabel.Caption.get(),
                         "No instrument answers on /dev/ttyUSB0 at "
                         "115200, 38400, 19200, 9600, 57600 baud."))
        << form.AdviceLabel.Caption.get();
    EXPECT_TRUE(form.SearchRatesButton.Visible);
}

}  // namespace
}  // namespace zel
