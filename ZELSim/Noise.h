#pragma once
// Random numbers that depend on nothing but their seed, and what a detector sees of noise.

#include <cstdint>

namespace zelsim {

/// One well-mixed number from another.
constexpr std::uint64_t mix(std::uint64_t x) {
    x += 0x9E3779B97F4A7C15ULL;
    x = (x ^ (x >> 30)) * 0xBF58476D1CE4E5B9ULL;
    x = (x ^ (x >> 27)) * 0x94D049BB133111EBULL;
    return x ^ (x >> 31);
}

class Random {
  public:
    explicit Random(std::uint64_t seed) : state_(seed) {}
    /// Evenly spread between 0 and 1, neither of them included.
    double uniform() {
        state_ += 0x9E3779B97F4A7C15ULL;
        return (static_cast<double>(mix(state_) >> 11) + 0.5) * 0x1p-53;
    }

  private:
    std::uint64_t state_;
};

/// The three draws that one trace point uses, whatever the detector, so that all detectors look
/// at the same noise.
struct NoiseDraw {
    double sample;
    double high;
    double low;
    static NoiseDraw of(Random& random) {
        return {random.uniform(), random.uniform(), random.uniform()};
    }
};

/// How the noise power (mean 1) of one trace point is spread: `count` independent values are seen
/// while the sweep is at the point, each the mean of `smoothing` values by the video filter.
struct NoiseShape {
    double count = 1;
    double smoothing = 1;

    double sample(const NoiseDraw& draw) const;
    /// The greatest and the least of the values; never below or above `sample`.
    double highest(const NoiseDraw& draw) const;
    double lowest(const NoiseDraw& draw) const;
    /// The mean power over the point.
    double mean(const NoiseDraw& draw) const;
};

}  // namespace zelsim
