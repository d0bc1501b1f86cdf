#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <iostream>

#include "tests/shell/Truth.h"

namespace zel {
namespace {

// Later than the time-out of an answer.
constexpr int kLateMs = 12'000;
constexpr int kLateOverTcpMs = 20'000;

/// Every `stride`-th byte of the session, at every fault, over one kind of link; 1 is exhaustive.
void sweepSession(bool tcp, long stride) {
    TruthRun good(tcp);
    good.wholeSession();
    ASSERT_EQ(good.findings, std::vector<std::string>{});
    ASSERT_EQ(good.wholeTraces, 6);
    ASSERT_EQ(good.incompleteTraces, 0);
    const long bytes = good.tap.passed();
    long runs = 0;
    long incomplete = 0;
    long whole = 0;
    for (const LineFault fault : kLineFaults) {
        for (long byte = 0; byte < bytes; byte += stride) {
            TruthRun run(tcp);
            run.tap.arm(fault, byte, tcp ? kLateOverTcpMs : kLateMs);
            run.wholeSession();
            ++runs;
            incomplete += run.incompleteTraces;
            whole += run.wholeTraces;
            EXPECT_EQ(run.findings, std::vector<std::string>{})
                << nameOf(fault) << " at byte " << byte;
        }
    }
    std::cout << (tcp ? "TCP: " : "serial: ") << runs << " sessions over " << bytes << " bytes, "
              << whole << " traces whole, " << incomplete << " incomplete or failed\n";
    EXPECT_GT(incomplete, runs / 10);
    EXPECT_GT(whole, runs);
}

/// A prime that meets every part of a session; ZEL_TRUTH_STRIDE=1 takes every byte.
long stride() {
    constexpr long kSample = 151;
    const char* text = std::getenv("ZEL_TRUTH_STRIDE");
    return text == nullptr ? kSample : std::max(1L, std::strtol(text, nullptr, 10));
}

TEST(TruthSweep, Serial_WholeTracesAreWhatTheInstrumentSent) { sweepSession(false, stride()); }

TEST(TruthSweep, Tcp_WholeTracesAreWhatTheInstrumentSent) { sweepSession(true, stride()); }

}  // namespace
}  // namespace zel
