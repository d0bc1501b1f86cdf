#include "bench/SweepRate.h"

#include <algorithm>
#include <cstddef>
#include <stdexcept>
#include <string>
#include <vector>

#include "bench/BareLine.h"
#include "bench/CoreSession.h"
#include "bench/Figures.h"
#include "bench/Process.h"

namespace zelbench {
namespace {

constexpr int kRounds = 41;
constexpr int kWarmUp = 20;          // sweeps
constexpr double kRoundTime = 0.15;  // seconds
constexpr int kBaud = 57600;
constexpr int kPacedSweeps = 12;
constexpr double kSpeedUp = 1e6;  // the sweep's own time then counts for nothing

struct Round {
    double seconds;  // a sweep
    double bytes;    // a sweep, both ways
};

template <typename Line>
Round runSweeps(Line& line, int sweeps) {
    const std::size_t before = line.bytes();
    const double seconds = timeOf([&] {
        for (int i = 0; i < sweeps; ++i) line.sweep();
    });
    return {seconds / sweeps, static_cast<double>(line.bytes() - before) / sweeps};
}

}  // namespace

Figure unpacedSweeps(const std::string& simulator) {
    const Simulator instrument(simulator, {"--speed", "1000000"});
    std::vector<double> core;
    std::vector<double> bare;
    std::vector<double> ratios;
    int sweeps = kWarmUp;
    for (int round = 0; round < kRounds; ++round) {
        Round least{};
        {
            BareLine line(instrument.device(), kBaud);
            const Round warm = runSweeps(line, kWarmUp);
            if (round == 0) sweeps = std::max(kWarmUp, static_cast<int>(kRoundTime / warm.seconds));
            least = runSweeps(line, sweeps);
        }
        CoreSession session(instrument.device(), kBaud);
        runSweeps(session, kWarmUp);
        const Round full = runSweeps(session, sweeps);
        if (full.bytes != least.bytes) throw std::runtime_error("the two loops differ in bytes");
        bare.push_back(1 / least.seconds);
        core.push_back(1 / full.seconds);
        ratios.push_back(least.seconds / full.seconds);
    }
    return {"(a) full sweeps through the core, unpaced pty",
            numberText(median(core)) + " sweeps/s",
            "bare loop, " + numberText(median(bare)) + " sweeps/s",
            median(ratios),
            0.8,
            true,
            ""};
}

Figure pacedSweeps(const std::string& simulator, bool realSweeps) {
    const double speed = realSweeps ? 1 : kSpeedUp;
    const Simulator instrument(
        simulator, {"--baud", std::to_string(kBaud), "--speed", realSweeps ? "1" : "1000000"});
    CoreSession session(instrument.device(), kBaud);
    session.sweep();
    const Round round = runSweeps(session, kPacedSweeps);
    const double possible = round.bytes * 10 / kBaud + session.sweepTime() / speed;
    return {std::string("(b) sweep at 57,600 baud, ") +
                (realSweeps ? "sweeps in their own time" : "sweeps in no time"),
            timeText(round.seconds),
            numberText(round.bytes) + " bytes and the sweep, " + timeText(possible),
            possible / round.seconds,
            0.97,
            true,
            ""};
}

}  // namespace zelbench
