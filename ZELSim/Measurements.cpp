#include "ZELSim/Measurements.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdint>
#include <cstring>

#include "ZELSim/Levels.h"
#include "ZELSim/Network.h"
#include "ZELSim/Noise.h"
#include "ZELSim/Numbers.h"
#include "ZELSim/Settings.h"
#include "ZELSim/Signals.h"
#include "ZELSim/Sweep.h"

namespace zelsim {
namespace {

constexpr double kNoiseBandwidth = 1.064467;

// mW in each point's share of the span.
std::array<double, kPoints> pointPowers(const Settings& settings, const Sweeper& sweeper,
                                        double start) {
    const Trace trace = sweeper.run(settings, start, Detector::Rms);
    const double step = settings.span / static_cast<double>(kPoints - 1);
    const double share = step > 0 ? step / (settings.rbwHz() * kNoiseBandwidth) : 1.0;
    std::array<double, kPoints> powers{};
    std::transform(trace.high.begin(), trace.high.end(), powers.begin(), [&](double level) {
        return dbToPower(level + settings.referenceOffset) * share;
    });
    return powers;
}

double timeDraw(std::uint64_t seed, double now) {
    std::uint64_t bits = 0;
    std::memcpy(&bits, &now, sizeof bits);
    Random random(mix(seed ^ bits));
    return random.uniform() + random.uniform() - 1.0;
}

}  // namespace

double channelPower(const Settings& settings, const Sweeper& sweeper, double start) {
    const auto powers = pointPowers(settings, sweeper, start);
    const double middle = static_cast<double>(kPoints - 1) / 2;
    const double half = settings.span > 0 ? settings.channelBandwidth / settings.span *
                                                static_cast<double>(kPoints - 1) / 2
                                          : middle;
    double sum = 0;
    for (std::size_t i = 0; i < kPoints; ++i) {
        // A point at the edge counts with the part of it that lies inside.
        const double inside = half + 0.5 - std::abs(static_cast<double>(i) - middle);
        sum += powers[i] * std::clamp(inside, 0.0, 1.0);
    }
    constexpr double toMillivolts = 30;
    const double volts = toMillivolts + powerToDb(settings.impedance());
    const std::array<double, 3> shift{0, volts, volts + 60};
    return powerToDb(sum) + shift[static_cast<std::size_t>(settings.channelUnit)];
}

double occupiedBandwidth(const Settings& settings, const Sweeper& sweeper, double start) {
    const auto powers = pointPowers(settings, sweeper, start);
    double total = 0;
    for (const double power : powers) {
        total += power;
    }
    constexpr double outside = 0.005;
    // The place at which the running sum passes `share` of the total, between the points too.
    const auto place = [&](double share) {
        double sum = 0;
        for (std::size_t i = 0; i < kPoints; ++i) {
            if (sum + powers[i] >= share * total) {
                return static_cast<double>(i) - 0.5 + (share * total - sum) / powers[i];
            }
            sum += powers[i];
        }
        return static_cast<double>(kPoints - 1);
    };
    const double step = settings.span / static_cast<double>(kPoints - 1);
    return (place(1 - outside) - place(outside)) * step;
}

double tdmaPower(const Settings& settings, const Sweeper& sweeper, double start) {
    // The measurement synchronises itself on the frame and leaves the burst's ramp out.
    constexpr double guard = 30e-6;
    const double begin = settings.tdmaStandard == 1
                             ? std::ceil(start / kFrameSeconds) * kFrameSeconds + guard
                             : start;
    const Trace trace = sweeper.run(settings, begin, Detector::Rms);
    const double step = settings.sweepSeconds() / static_cast<double>(kPoints - 1);
    const auto points = std::clamp<std::size_t>(
        static_cast<std::size_t>(std::lround(settings.tdmaTime / step)), 1, kPoints);
    double sum = 0;
    for (std::size_t i = 0; i < points; ++i) {
        sum += dbToPower(trace.high[i] + settings.referenceOffset);
    }
    return powerToDb(sum / static_cast<double>(points));
}

double sensorPower(const Settings& settings, const Scene& scene, std::uint64_t seed, double now) {
    constexpr std::array<double, 3> spread{0.15, 0.05, 0.015};  // dB, by measuring time
    // The sensor's efficiency falls a little with the frequency that it is given.
    const double efficiency = -0.3 * settings.centre / 3e9;
    return powerToDb(scene.totalPower(now)) + efficiency +
           spread[static_cast<std::size_t>(settings.sensorTime)] * timeDraw(seed, now);
}

double sensorReturnLoss(const Settings& settings, std::uint64_t seed, double now) {
    const double ghz = settings.centre / 1e9;
    return 21 - 2.5 * ghz + std::sin(5 * ghz) + 0.1 * timeDraw(seed + 1, now);
}

int limitCheck(const Settings& settings, const Trace& trace) {
    const bool low = settings.lowerLimit != "NONE";
    const bool high = settings.upperLimit != "NONE";
    if (!low && !high) {
        return 0;
    }
    const double reference = shownReference(settings);
    for (std::size_t i = 0; i < kPoints; ++i) {
        const double share = static_cast<double>(i) / static_cast<double>(kPoints - 1);
        const bool above = high && shownLevel(settings, trace.high[i], i) >
                                       limitLine(settings.upperLimit, share, reference, true);
        const bool below = low && shownLevel(settings, trace.low[i], i) <
                                      limitLine(settings.lowerLimit, share, reference, false);
        if (above || below) {
            return 1;
        }
    }
    return 2;
}

double fittingReference(double strongest) {
    return std::clamp(10 * std::ceil((strongest + 2) / 10), -80.0, 20.0);
}

}  // namespace zelsim
