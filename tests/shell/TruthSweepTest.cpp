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
// The server looks once a second whether its line still stands.
constexpr int kNoticedMs = 1100;

constexpr const char* kKinds[] = {"serial", "TCP", "served"};

/// Every `stride`-th byte of the session from `first` on, at every fault, over one kind of link; a
/// stride of 1 is exhaustive.
void sweepSession(LineKind kind, long first, long stride) {
    TruthRun good(kind);
    good.wholeSession();
    ASSERT_EQ(good.findings, std::vector<std::string>{});
    ASSERT_EQ(good.wholeTraces, 6);
    ASSERT_EQ(good.incompleteTraces, 0);
    const long bytes = good.tap.passed();
    if (good.served) {
        EXPECT_EQ(good.served->bridge().relay().bytesToClient(), static_cast<std::uint64_t>(bytes));
    }
    long runs = 0;
    long incomplete = 0;
    long whole = 0;
    for (const LineFault fault : kLineFaults) {
        for (long byte = first; byte < bytes; byte += stride) {
            TruthRun run(kind);
            run.tap.arm(fault, byte, kind == LineKind::Serial ? kLateMs : kLateOverTcpMs);
            run.wholeSession();
            ++runs;
            incomplete += run.incompleteTraces;
            whole += run.wholeTraces;
            EXPECT_EQ(run.findings, std::vector<std::string>{})
                << nameOf(fault) << " at byte " << byte;
            if (run.served) {
                run.platform.events.runFor(kNoticedMs);
                // The line of the instrument is never blocked, and serves on where it did not end.
                EXPECT_EQ(run.served->bridge().relay().waiting(), 0U);
                EXPECT_EQ(run.served->bridge().bridging(), run.lineIsUp());
            }
        }
    }
    std::cout << kKinds[static_cast<int>(kind)] << ": " << runs << " sessions over " << bytes
              << " bytes, " << whole << " traces whole, " << incomplete
              << " incomplete or failed\n";
    EXPECT_GT(incomplete, runs / 10);
    EXPECT_GT(whole, runs);
}

long fromEnvironment(const char* name, long otherwise) {
    const char* text = std::getenv(name);
    return text == nullptr ? otherwise : std::strtol(text, nullptr, 10);
}

/// A prime that meets every part of a session; ZEL_TRUTH_STRIDE=1 takes every byte, ZEL_TRUTH_FIRST
/// begins later.
void sweepSession(LineKind kind) {
    constexpr long kSample = 151;
    sweepSession(kind, fromEnvironment("ZEL_TRUTH_FIRST", 0),
                 std::max(1L, fromEnvironment("ZEL_TRUTH_STRIDE", kSample)));
}

TEST(TruthSweep, Serial_WholeTracesAreWhatTheInstrumentSent) { sweepSession(LineKind::Serial); }

TEST(TruthSweep, Tcp_WholeTracesAreWhatTheInstrumentSent) { sweepSession(LineKind::Tcp); }

TEST(TruthSweep, Served_WholeTracesAreWhatTheInstrumentSent) { sweepSession(LineKind::Served); }

// Longer than the quiet time of the server, so that a reply goes on in two pieces.
TEST(TruthSweep, Served_SplitLine_LosesNothing) {
    constexpr int kSplitMs = 60;
    constexpr long kSample = 97;
    TruthRun good(LineKind::Served);
    good.wholeSession();
    const long stride = std::max(1L, fromEnvironment("ZEL_TRUTH_STRIDE", kSample));
    for (long byte = fromEnvironment("ZEL_TRUTH_FIRST", 0); byte < good.tap.passed();
         byte += stride) {
        TruthRun run(LineKind::Served);
        run.tap.arm(LineFault::Pause, byte, kSplitMs);
        run.wholeSession();
        EXPECT_EQ(run.findings, std::vector<std::string>{}) << "split at byte " << byte;
        EXPECT_EQ(run.wholeTraces, 6) << "split at byte " << byte;
        EXPECT_EQ(run.incompleteTraces, 0) << "split at byte " << byte;
    }
}

}  // namespace
}  // namespace zel
