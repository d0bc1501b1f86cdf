// Random sessions over a line with random faults, in virtual time: nothing that is shown, recorded
// or saved as a whole trace may differ from what the instrument sent.

#include <gtest/gtest.h>

#include <cstdlib>
#include <iostream>
#include <random>

#include "tests/shell/Truth.h"

namespace zel {
namespace {

constexpr int kActions = 40;           // of one session
constexpr long kFarthestFault = 4000;  // bytes: more than a sweep of pairs with its questions
constexpr int kLatestMs = 25'000;      // later than every time-out of a good instrument

struct Totals {
    long sessions = 0;
    long exchanges = 0;
    long faults = 0;
    long whole = 0;
    long incomplete = 0;
    long findings = 0;
};

class Soak {
  public:
    explicit Soak(std::uint64_t seed) : random_(seed), run_(static_cast<LineKind>(pick(3)), seed) {}

    void play() {
        for (int i = 0; i < kActions; ++i) {
            run_.platform.boxes.clear();
            if (pick(3) > 0) spoil();
            act();
            if (pick(2) == 0) run_.tap.heal();
            if (run_.panel.isConnected && run_.lineIsUp()) continue;
            run_.tap.heal();
            run_.disconnect();
        }
        run_.tap.heal();
        run_.disconnect();
    }
    const TruthRun& run() const { return run_; }

  private:
    long pick(long count) {
        return static_cast<long>(random_() % static_cast<std::uint64_t>(count));
    }
    void spoil() {
        const auto fault = kLineFaults[pick(std::size(kLineFaults))];
        // One after the other: in a call the compiler chooses the order, and the seed would mean
        // another session.
        const auto late = static_cast<int>(pick(kLatestMs));
        const long at = pick(kFarthestFault);
        run_.tap.arm(fault, at, late);
    }
    void act() {
        if (!run_.panel.isConnected) {
            settled_ = false;
            run_.connect();
            return;
        }
        constexpr int kSpansMHz[] = {0, 1, 20, 300};
        switch (pick(8)) {
            case 0:
                return change("FREQ," + std::to_string(500 + pick(2000)) + "000000");
            case 1:
                return change("SPAN," + std::to_string(kSpansMHz[pick(4)]) + "000000");
            case 2:
                return change("REFLVL," + std::to_string(-pick(40)));
            case 3:
                return change("TRACEDET," + std::to_string(pick(4)));
            case 4:
                settled_ = false;  // a recording reads its first sweep only with its settings
                return run_.record(1 + static_cast<int>(pick(3)));
            default:
                break;
        }
        const bool full = !settled_ || pick(3) == 0;
        const long before = run_.wholeTraces;
        run_.readTrace(full);
        if (full) settled_ = run_.wholeTraces > before;
    }
    void change(const std::string& text) {
        settled_ = false;
        run_.set(text);
    }

    std::mt19937_64 random_;
    TruthRun run_;
    bool settled_ = false;  ///< the last full cycle read what the instrument has
};

void add(Totals& all, const TruthRun& run, std::uint64_t seed) {
    ++all.sessions;
    all.exchanges += run.tap.exchanges();
    all.faults += run.tap.faults();
    all.whole += run.wholeTraces;
    all.incomplete += run.incompleteTraces;
    all.findings += static_cast<long>(run.findings.size());
    EXPECT_EQ(run.findings, std::vector<std::string>{}) << "seed " << seed;
}

long fromEnvironment(const char* name, long otherwise) {
    const char* text = std::getenv(name);
    return text == nullptr ? otherwise : std::strtol(text, nullptr, 10);
}

/// ZEL_SOAK_SESSIONS: how many; ZEL_SOAK_SEED: of the first, each next one has the next.
TEST(Soak, RandomFaults_WholeTracesAreWhatTheInstrumentSent) {
    constexpr long kSample = 40;
    const long sessions = fromEnvironment("ZEL_SOAK_SESSIONS", kSample);
    const auto first = static_cast<std::uint64_t>(fromEnvironment("ZEL_SOAK_SEED", 1));
    Totals all;
    while (all.sessions < sessions) {
        const std::uint64_t seed = first + static_cast<std::uint64_t>(all.sessions);
        Soak soak(seed);
        soak.play();
        add(all, soak.run(), seed);
    }
    std::cout << "soak: " << all.sessions << " sessions, " << all.exchanges << " exchanges, "
              << all.faults << " faults, " << all.whole << " whole, " << all.incomplete
              << " incomplete, " << all.findings << " findings\n";
    EXPECT_GT(all.whole, all.sessions);
    EXPECT_GT(all.incomplete, all.sessions / 2);
    EXPECT_GT(all.faults, all.sessions);
}

}  // namespace
}  // namespace zel
