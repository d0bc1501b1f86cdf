#include "ZELSim/Sweep.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <complex>
#include <cstdint>
#include <cstring>
#include <utility>

#include "ZELSim/Network.h"
#include "ZELSim/Noise.h"
#include "ZELSim/Numbers.h"
#include "ZELSim/Settings.h"
#include "ZELSim/Signals.h"

namespace zelsim {
namespace {

constexpr double kPi = 3.141592653589793;
constexpr double kNoiseBandwidth = 1.064467;  // of a Gaussian filter, against its 3 dB width
constexpr double kReach = 3.2;                // bandwidths to where the filter is followed
constexpr double kSkirt = 3.2e-10;            // phase noise, 1/Hz, close to the carrier
constexpr double kSkirtHz = 100e3;            // from here it falls

// Power gain of the resolution filter, `away` bandwidths off its centre.
double filterGain(double away) { return away > kReach ? 0.0 : std::exp2(-4 * away * away); }

double filterIntegral(double away) {
    constexpr double slope = 1.6651092223153954;  // 2 sqrt(ln 2)
    return 0.5 * std::erf(slope * away);
}

// The gain's mean while the filter's centre moves `width` bandwidths around `away`.
double meanGain(double away, double width) {
    if (width < 0.05) {
        return filterGain(std::abs(away));
    }
    const double area = filterIntegral(away + width / 2) - filterIntegral(away - width / 2);
    return std::max(0.0, area) * kNoiseBandwidth / width;
}

// The part of a flat band from -half to half that the filter at `away` takes, against its middle.
double bandShare(double away, double half) {
    return std::max(0.0, filterIntegral(away + half) - filterIntegral(away - half));
}

// What one point sees of everything at the input, mW.
struct Power {
    double sample = 0, low = 0, high = 0, mean = 0;
    void add(double s, double l, double h, double m) {
        sample += s;
        low += l;
        high += h;
        mean += m;
    }
};

struct Grid {
    double rbw;      // Hz
    double first;    // Hz at the input
    double step;     // Hz a point
    double seconds;  // s a point
};

using Powers = std::array<Power, kPoints>;

// Indices of the points that a signal around `hz`, `reach` Hz to both sides, can touch.
std::pair<std::size_t, std::size_t> touched(const Grid& grid, double hz, double reach) {
    if (grid.step == 0) {
        return std::abs(hz - grid.first) <= reach ? std::pair<std::size_t, std::size_t>{0, kPoints}
                                                  : std::pair<std::size_t, std::size_t>{0, 0};
    }
    const double last = static_cast<double>(kPoints);
    const double from = std::floor((hz - reach - grid.first) / grid.step);
    const double to = std::ceil((hz + reach - grid.first) / grid.step) + 1;
    return {static_cast<std::size_t>(std::clamp(from, 0.0, last)),
            static_cast<std::size_t>(std::clamp(to, 0.0, last))};
}

void addBand(const Grid& grid, const Emitter& band, Powers& noise) {
    const double half = band.width / 2;
    const double inMiddle = dbToPower(band.dbm) / band.width * grid.rbw * kNoiseBandwidth;
    const auto [from, to] = touched(grid, band.hz, half + kReach * grid.rbw + grid.step);
    const auto share = [&](double away) { return bandShare(away / grid.rbw, half / grid.rbw); };
    for (std::size_t i = from; i < to; ++i) {
        const double away = std::abs(grid.first + grid.step * static_cast<double>(i) - band.hz);
        const double near = std::max(0.0, away - grid.step / 2);
        const double far = away + grid.step / 2;
        const double here = share(away);
        const double best = share(near);
        const double worst = share(far);
        noise[i].add(inMiddle * here, inMiddle * worst, inMiddle * best,
                     inMiddle * (here + best + worst) / 3);
    }
}

void addTone(const Grid& grid, const Scene& scene, const Emitter& tone, double start,
             Powers& powers, Powers& noise) {
    const double mw = dbToPower(tone.dbm);
    const double skirt = mw * kSkirt * grid.rbw;
    const double corner = 1 / (kSkirtHz * kSkirtHz);
    // The skirt passes for noise; far below the floor it is left out.
    const double floor = 1e-16 * grid.rbw / 100;
    const double skirtReach = std::sqrt(std::max(0.0, skirt / floor)) * kSkirtHz;
    const double skirtHz =
        tone.kind == Emitter::Kind::Drifting ? scene.at(tone, start, 0).hz : tone.hz;
    const auto [skirtFrom, skirtTo] = touched(grid, skirtHz, skirtReach);
    for (std::size_t i = skirtFrom; i < skirtTo; ++i) {
        const double away = grid.first + grid.step * static_cast<double>(i) - skirtHz;
        const double here = skirt / (1 + away * away * corner);
        noise[i].add(here, here, here, here);
    }

    const auto [from, to] = touched(grid, tone.hz, tone.width + kReach * grid.rbw + grid.step);
    const double half = grid.step / 2;
    for (std::size_t i = from; i < to; ++i) {
        const double hz = grid.first + grid.step * static_cast<double>(i);
        const double time = start + grid.seconds * static_cast<double>(i);
        const Activity now = scene.at(tone, time, grid.seconds);
        const double near = std::max({0.0, now.hzLow - (hz + half), (hz - half) - now.hzHigh});
        const double far =
            std::max(std::abs(hz + half - now.hzLow), std::abs(now.hzHigh - (hz - half)));
        const double sample = std::abs(hz - now.hz);
        const double middle = (now.hzLow + now.hzHigh) / 2;
        const double width = grid.step + now.hzHigh - now.hzLow;
        powers[i].add(now.mw * filterGain(sample / grid.rbw),
                      now.mwLow * filterGain(far / grid.rbw),
                      now.mwHigh * filterGain(near / grid.rbw),
                      now.mwMean * meanGain((hz - middle) / grid.rbw, width / grid.rbw));
    }
}

// Whole nanoseconds, so that the last bits of summed durations have no say in the noise.
double onGrid(double seconds) { return std::round(seconds * 1e9) * 1e-9; }

std::uint64_t sweepSeed(std::uint64_t seed, double start) {
    std::uint64_t bits = 0;
    std::memcpy(&bits, &start, sizeof bits);
    return mix(seed ^ mix(bits));
}

}  // namespace

double noiseFloor(const Settings& settings, double hz) {
    constexpr double perHertz = -148;
    constexpr double preamplifier = 8;
    // The attenuator opens in steps of 10 dB as the reference level falls.
    const double attenuation = 10 * std::max(0.0, std::ceil((settings.referenceLevel + 20) / 10));
    return perHertz + powerToDb(settings.rbwHz() * kNoiseBandwidth) + 3 * hz / 3e9 + attenuation -
           (settings.lowNoise != 0 ? preamplifier : 0.0);
}

Trace Sweeper::run(const Settings& settings, double moment, Detector detector) const {
    const double start = onGrid(moment);
    if (settings.measurement() == Mode::TrackingGenerator) {
        return runNetwork(settings, start);
    }
    if (settings.isDistance()) {
        return runDistance(settings, start);
    }
    if (settings.measurement() == Mode::DistanceToFault && settings.dtfMode == 1) {
        return runNetwork(settings, start);
    }
    return runSpectrum(settings, start, detector);
}

Trace Sweeper::runSpectrum(const Settings& settings, double start, Detector detector) const {
    const double rbw = settings.rbwHz();
    const double step = settings.span / static_cast<double>(kPoints - 1);
    const Grid grid{rbw, settings.centre - settings.span / 2, step,
                    settings.sweepSeconds() / static_cast<double>(kPoints - 1)};
    Powers tones{};
    Powers noise{};
    for (const Emitter& emitter : scene_.emitters()) {
        if (emitter.kind == Emitter::Kind::Band) {
            addBand(grid, emitter, noise);
        } else {
            addTone(grid, scene_, emitter, start, tones, noise);
        }
    }
    const double video = std::min(rbw, settings.vbwHz());
    const NoiseShape shape{std::max(1.0, grid.seconds * video), std::max(1.0, rbw / video)};
    const double floorLeft = dbToPower(noiseFloor(settings, grid.first));
    const double floorRight = dbToPower(noiseFloor(settings, grid.first + settings.span));
    Random random(sweepSeed(seed_, start));
    Trace trace;
    for (std::size_t i = 0; i < kPoints; ++i) {
        const double share = static_cast<double>(i) / static_cast<double>(kPoints - 1);
        const double floor = floorLeft + (floorRight - floorLeft) * share;
        const NoiseDraw draw = NoiseDraw::of(random);
        const Power& tone = tones[i];
        const Power& hiss = noise[i];
        const auto lowest = [&] {
            return powerToDb(tone.low + (hiss.low + floor) * shape.lowest(draw));
        };
        const auto highest = [&] {
            return powerToDb(tone.high + (hiss.high + floor) * shape.highest(draw));
        };
        switch (detector) {
            case Detector::AutoPeak:
                trace.low[i] = lowest();
                trace.high[i] = highest();
                continue;
            case Detector::MinPeak:
                trace.high[i] = lowest();
                break;
            case Detector::MaxPeak:
                trace.high[i] = highest();
                break;
            case Detector::Sample:
                trace.high[i] = powerToDb(tone.sample + (hiss.sample + floor) * shape.sample(draw));
                break;
            case Detector::Rms:
                trace.high[i] = powerToDb(tone.mean + (hiss.mean + floor) * shape.mean(draw));
                break;
        }
        trace.low[i] = trace.high[i];
    }
    return trace;
}

Trace Sweeper::runNetwork(const Settings& settings, double start) const {
    const bool cable = settings.measurement() == Mode::DistanceToFault;
    const bool reflection =
        cable || settings.reflectionCal != 0 || settings.reflectionVectorCal != 0;
    const bool calibrated =
        cable || reflection || settings.transmissionCal != 0 || settings.transmissionVectorCal != 0;
    const CableType& type = cableType(settings.cableModel);
    const double first = settings.centre - settings.span / 2;
    const double step = settings.span / static_cast<double>(kPoints - 1);
    const double floorDb =
        noiseFloor(settings, settings.centre) - (calibrated ? settings.trackingLevel : 0.0);
    Random random(sweepSeed(seed_, start));
    Trace trace;
    for (std::size_t i = 0; i < kPoints; ++i) {
        const double hz = first + step * static_cast<double>(i);
        double power = 0;
        if (cable) {
            power = std::norm(cableReflection(hz, type));
        } else {
            power = std::norm(reflection ? filterReflection(hz) : filterTransmission(hz));
        }
        if (!calibrated) {
            power *= dbToPower(settings.trackingLevel + setupRipple(hz));
        }
        const double floor = dbToPower(floorDb);
        const double one = floor * -std::log(random.uniform());
        const double other = floor * -std::log(random.uniform());
        trace.low[i] = powerToDb(power + std::min(one, other));
        trace.high[i] = powerToDb(power + std::max(one, other));
        if (settings.traceDetector() != Detector::AutoPeak) {
            const bool least = settings.traceDetector() == Detector::MinPeak;
            (least ? trace.high[i] : trace.low[i]) = least ? trace.low[i] : trace.high[i];
        }
    }
    return trace;
}

Trace Sweeper::runDistance(const Settings& settings, double start) const {
    constexpr double light = 299792458.0;
    const CableType& type = cableType(settings.cableModel);
    const double span = std::max(settings.span, 10e6);
    const double resolution = 0.6 * light * type.velocity / span;
    const double step = settings.xStep();
    Random random(sweepSeed(seed_, start));
    Trace trace;
    for (std::size_t i = 0; i < kPoints; ++i) {
        const double echo = cableEcho(step * static_cast<double>(i), step / 2, resolution, type);
        const double one = 0.6 * random.uniform();
        const double other = 0.6 * random.uniform();
        trace.low[i] = echo + std::min(one, other) - 0.3;
        trace.high[i] = echo + std::max(one, other) - 0.3;
        if (settings.traceDetector() != Detector::AutoPeak) {
            trace.low[i] = trace.high[i];
        }
    }
    return trace;
}

double Sweeper::levelAt(const Settings& settings, double hz, double start) const {
    Settings fixed = settings;
    fixed.span = 0;
    fixed.centre = hz;
    fixed.mode = static_cast<double>(Mode::Analyzer);
    fixed.rbw = settings.rbw;
    const Trace trace = runSpectrum(fixed, start, Detector::Rms);
    double sum = 0;
    for (const double level : trace.high) {
        sum += dbToPower(level);
    }
    return powerToDb(sum / static_cast<double>(kPoints));
}

std::array<double, kPoints> Sweeper::phases(const Settings& settings, double start) const {
    const bool reflection = settings.reflectionVectorCal != 0 || settings.reflectionCal != 0;
    const bool vector = settings.reflectionVectorCal != 0 || settings.transmissionVectorCal != 0;
    const double first = settings.centre - settings.span / 2;
    const double step = settings.span / static_cast<double>(kPoints - 1);
    const CableType& type = cableType(settings.cableModel);
    constexpr double setupDelay = 2.1e-9;  // s, taken out by the vector calibration
    constexpr double jitter = 0.002;
    Random random(mix(sweepSeed(seed_, onGrid(start))));
    std::array<double, kPoints> out{};
    for (std::size_t i = 0; i < kPoints; ++i) {
        const double hz = first + step * static_cast<double>(i);
        double phase = 0;
        if (settings.measurement() == Mode::DistanceToFault) {
            phase = std::arg(cableReflection(hz, type));
        } else {
            phase = std::arg(reflection ? filterReflection(hz) : filterTransmission(hz));
        }
        phase -= vector ? 0.0 : 2 * kPi * hz * setupDelay;
        phase += jitter * (random.uniform() - random.uniform());
        out[i] = std::remainder(phase, 2 * kPi);
    }
    return out;
}

double Sweeper::countedFrequency(double hz, double reach, double start) const {
    double best = hz;
    double strongest = -1;
    for (const Emitter& emitter : scene_.emitters()) {
        if (emitter.kind == Emitter::Kind::Band) {
            continue;
        }
        const Activity now = scene_.at(emitter, start, 0);
        if (std::abs(now.hz - hz) <= reach && now.mw > strongest) {
            strongest = now.mw;
            best = now.hz;
        }
    }
    return best;
}

}  // namespace zelsim
