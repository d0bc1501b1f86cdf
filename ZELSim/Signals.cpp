#include "ZELSim/Signals.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <vector>

#include "ZELSim/Noise.h"
#include "ZELSim/Numbers.h"

namespace zelsim {
namespace {

constexpr double kTwoPi = 6.283185307179586;

constexpr std::size_t kSlots = 8;
constexpr double kRampSeconds = 20e-6;
constexpr double kOffDb = -65.0;
constexpr double kSymbolRate = 1625e3 / 6;
// dB below the emitter's level, slot by slot.
constexpr std::array<double, kSlots> kSlotDb{0, kOffDb, kOffDb, -6, kOffDb, kOffDb, -12, kOffDb};
constexpr int kLooks = 8;

std::vector<Emitter> standardScene() {
    using Kind = Emitter::Kind;
    return {
        {Kind::Carrier, 0, -28},
        {Kind::Fm, 91.2e6, -54, 60e3, 400},
        {Kind::Fm, 98.5e6, -38, 75e3, 1000},
        {Kind::Fm, 102.1e6, -47, 50e3, 700},
        {Kind::Band, 225.648e6, -53, 1.536e6},
        {Kind::Carrier, 433.92e6, -48},
        {Kind::Band, 578e6, -41, 7.61e6},
        {Kind::Band, 690e6, -50, 7.61e6},
        {Kind::Fm, 935.2e6, -44, 67.7e3, 9000},
        {Kind::Burst, 947.4e6, -35, 40e3},
        {Kind::Carrier, 1.2e9, -60},
        {Kind::Carrier, 1.5e9, -30},
        {Kind::Drifting, 1.8e9, -45, 4e6, 1.0 / 40},
        {Kind::Band, 1.96e9, -47, 1.2288e6},
        {Kind::Band, 2.14e9, -40, 3.84e6},
        {Kind::Band, 2.442e9, -52, 18e6},
        {Kind::Carrier, 2.7e9, -64},
    };
}

double fraction(double value) { return value - std::floor(value); }

}  // namespace

Scene::Scene(std::uint64_t seed)
    : emitters_(standardScene()), phase_(Random(seed).uniform()), seed_(seed) {}

double Scene::burstGain(double seconds) const {
    const double inFrame = fraction(seconds / kFrameSeconds) * kFrameSeconds;
    const auto slot = std::min(static_cast<std::size_t>(inFrame / kSlotSeconds), kSlots - 1);
    const double inSlot = inFrame - static_cast<double>(slot) * kSlotSeconds;
    const double level = kSlotDb[slot];
    if (inSlot >= kRampSeconds) {
        return level;
    }
    const double before = kSlotDb[(slot + kSlots - 1) % kSlots];
    return before + (level - before) * inSlot / kRampSeconds;
}

double Scene::burstBit(double seconds) const {
    const auto symbol = static_cast<std::uint64_t>(std::max(0.0, seconds * kSymbolRate));
    return (mix(seed_ ^ symbol) & 1) != 0 ? 1.0 : -1.0;
}

Activity Scene::at(const Emitter& emitter, double seconds, double length) const {
    const double mw = dbToPower(emitter.dbm);
    Activity now{emitter.hz, emitter.hz, emitter.hz, mw, mw, mw, mw};
    switch (emitter.kind) {
        case Emitter::Kind::Carrier:
        case Emitter::Kind::Band:
            return now;
        case Emitter::Kind::Drifting:
        case Emitter::Kind::Fm: {
            const auto frequency = [&](double t) {
                return emitter.hz + emitter.width * std::sin(kTwoPi * (emitter.rate * t + phase_));
            };
            now.hz = frequency(seconds);
            if (length * emitter.rate > 0.5) {
                now.hzLow = emitter.hz - emitter.width;
                now.hzHigh = emitter.hz + emitter.width;
            } else {
                const double then = frequency(seconds + length);
                now.hzLow = std::min(now.hz, then);
                now.hzHigh = std::max(now.hz, then);
            }
            return now;
        }
        case Emitter::Kind::Burst: {
            now.hz = emitter.hz + emitter.width * burstBit(seconds);
            const bool manyBits = length * kSymbolRate > 2;
            now.hzLow = manyBits ? emitter.hz - emitter.width : now.hz;
            now.hzHigh = manyBits ? emitter.hz + emitter.width : now.hz;
            now.mw = mw * dbToPower(burstGain(seconds));
            // Longer than a frame: every slot is met.
            const double reach = std::min(length, kFrameSeconds);
            now.mwLow = now.mwHigh = now.mw;
            double sum = 0;
            for (int look = 0; look < kLooks; ++look) {
                const double gain = burstGain(seconds + reach * look / kLooks);
                const double power = mw * dbToPower(gain);
                now.mwLow = std::min(now.mwLow, power);
                now.mwHigh = std::max(now.mwHigh, power);
                sum += power;
            }
            now.mwMean = sum / kLooks;
            return now;
        }
    }
    return now;
}

double Scene::totalPower(double seconds) const {
    double sum = 0;
    for (const Emitter& emitter : emitters_) {
        // The feed-through at 0 Hz is the instrument's own.
        sum += emitter.hz > 0 ? at(emitter, seconds, kFrameSeconds).mwMean : 0.0;
    }
    return sum;
}

}  // namespace zelsim
