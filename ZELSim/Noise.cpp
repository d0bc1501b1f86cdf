#include "ZELSim/Noise.h"

#include <algorithm>
#include <cmath>

namespace zelsim {
namespace {

// The normal deviate that is exceeded with the probability `tail` (closed approximation, good to
// a few hundredths, which no trace shows).
double deviate(double tail) {
    constexpr double scale = 5.5556;
    constexpr double power = 0.1186;
    if (tail > 0.5) {
        return -deviate(1 - tail);
    }
    return scale * (1 - std::pow(tail / (1 - tail), power));
}

// The value of a mean of `terms` exponential values that is exceeded with the probability `tail`.
double powerAbove(double tail, double terms) {
    if (terms <= 1.01) {
        return -std::log(tail);
    }
    const double root = 1 - 1 / (9 * terms) + deviate(tail) / (3 * std::sqrt(terms));
    return root > 0 ? root * root * root : 0.0;
}

}  // namespace

double NoiseShape::sample(const NoiseDraw& draw) const {
    return powerAbove(draw.sample, smoothing);
}

double NoiseShape::highest(const NoiseDraw& draw) const {
    const double one = sample(draw);
    if (count <= 1) {
        return one;
    }
    const double tail = -std::expm1(std::log(draw.high) / count);
    return std::max(one, powerAbove(tail, smoothing));
}

double NoiseShape::lowest(const NoiseDraw& draw) const {
    const double one = sample(draw);
    if (count <= 1) {
        return one;
    }
    if (smoothing <= 1.01) {
        return std::min(one, -std::log(draw.low) / count);
    }
    const double tail = std::exp(std::log(draw.low) / count);
    return std::min(one, powerAbove(tail, smoothing));
}

double NoiseShape::mean(const NoiseDraw& draw) const {
    return powerAbove(draw.sample, std::max(1.0, count) * smoothing);
}

}  // namespace zelsim
