// How soon a click is served while the continuous view runs on a slow line, in virtual time: the
// time of the panel's own waits counts, that of the machine does not.

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdint>
#include <functional>
#include <memory>

#include "ZELSim/InProcessPort.h"
#include "platform/virtual/VirtualPlatform.h"
#include "shell/Program.h"

namespace zel {
namespace {

constexpr int kBaud = 19200;
constexpr std::int64_t kServedMicros = 100'000;
/// The later passes begin here, and one of them lasts no longer than this.
constexpr int kBeginMs = 3000;
constexpr int kPassMs = 1500;
constexpr int kStepMs = 7;  // no multiple of any wait of the exchange

class ViewLatency : public testing::Test {
  protected:
    void connect() {
        program.reset();
        port.reset();
        platform = std::make_unique<VirtualPlatform>();
        zelsim::WireSetup wire;
        wire.baud = kBaud;
        port = std::make_unique<zelsim::InProcessPort>(platform->clock, platform->events,
                                                       zelsim::DeviceSetup{}, wire);
        program = std::make_unique<Program>(platform->bundle(*port), "");
        program->start();
        ASSERT_TRUE(program->connect({LinkAddress::Kind::Serial, "/dev/zel3", kBaud}, true));
    }
    ControllerForm& panel() { return program->forms().controller; }
    std::int64_t now() const { return platform->clock.micros(); }
    /// The user clicks `ms` from now; gives the microseconds until the click is served.
    void clickAt(int ms, std::int64_t& latency, const std::function<void()>& click) {
        const std::int64_t due = now() + std::int64_t{ms} * 1000;
        platform->events.schedule(ms, [this, due, &latency, click] {
            latency = now() - due;
            click();
        });
    }
    /// The longest time, in microseconds, that any click waits which falls into one pass of the
    /// view.
    std::int64_t longestWait(const std::function<void(ControllerForm&)>& click) {
        std::int64_t longest = 0;
        for (int ms = kBeginMs; ms < kBeginMs + kPassMs; ms += kStepMs) {
            connect();
            std::int64_t latency = -1;
            std::int64_t stopped = -1;
            clickAt(ms, latency, [&] { click(panel()); });
            clickAt(kBeginMs + 2 * kPassMs, stopped, [this] { panel().StopButton.Click(); });
            panel().PlayContinuousButton.Click();
            EXPECT_GE(latency, 0) << "never served";
            longest = std::max(longest, latency);
        }
        return longest;
    }

    std::unique_ptr<VirtualPlatform> platform;
    std::unique_ptr<zelsim::InProcessPort> port;
    std::unique_ptr<Program> program;
};

TEST_F(ViewLatency, HardKey_IsServedWithinATenthOfASecond) {
    EXPECT_LE(longestWait([](ControllerForm& panel) {
                  panel.SpanButton.Click();
                  EXPECT_EQ(panel.State, ControllerForm::SPAN);
              }),
              kServedMicros);
}

TEST_F(ViewLatency, MarkerKey_IsToldItsRefusalWithinATenthOfASecond) {
    EXPECT_LE(longestWait([](ControllerForm& panel) { panel.MarkPkButton.Click(); }),
              kServedMicros);
    EXPECT_EQ(platform->boxes.texts().size(), 1U);
}

TEST_F(ViewLatency, Stop_IsServedWithinATenthOfASecondAndEndsTheViewWithItsPass) {
    std::int64_t longest = 0;
    std::int64_t longestEnd = 0;
    for (int ms = 10; ms < kBeginMs + kPassMs; ms += kStepMs) {
        connect();
        std::int64_t latency = -1;
        std::int64_t pressed = 0;
        clickAt(ms, latency, [&] {
            pressed = now();
            panel().StopButton.Click();
            EXPECT_TRUE(panel().PlayContinuousButton.Visible);
        });
        panel().PlayContinuousButton.Click();
        EXPECT_GE(latency, 0) << "never served";
        longest = std::max(longest, latency);
        longestEnd = std::max(longestEnd, now() - pressed);
    }
    EXPECT_LE(longest, kServedMicros);
    EXPECT_LE(longestEnd,
              2 * kPassMs * 1000);  // the first pass asks all settings before its trace
}

}  // namespace
}  // namespace zel
