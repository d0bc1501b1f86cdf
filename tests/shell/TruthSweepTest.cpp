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

/// Every `stride`-th byte of the session from `first` on, at every fault, over one kind of link; a
/// stride of 1 is exhaustive.
void sweepSession(bool tcp, long first, long stride) {
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
        for (long byte = first; byte < bytes; byte += stride) {
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

long fromEnvironment(const char* name, long otherwise) {
    const char* text = std::getenv(name);
    return text == nullptr ? otherwise : std::strtol(text, nullptr, 10);
}

/// A prime that meets every part of a session; ZEL_TRUTH_STRIDE=1 takes every byte, ZEL_TRUTH_FIRST
/// begins later.
void sweepSession(bool tcp) {
    constexpr long kSample = 151;
    sweepSession(tcp, fromEnvironment("ZEL_TRUTH_FIRST", 0),
                 std::max(1L, fromEnvironment("ZEL_TRUTH_STRIDE", kSample)));
}

TEST(TruthSweep, Serial_WholeTracesAreWhatTheInstrumentSent) { sweepSession(false); }

TEST(TruthSweep, Tcp_WholeTracesAreWhatTheInstrumentSent) { sweepSession(true); }

}  // namespace
}  // namespace zel
