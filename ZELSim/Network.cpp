#include "ZELSim/Network.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <complex>
#include <cstdint>
#include <string>
#include <string_view>

#include "ZELSim/Noise.h"
#include "ZELSim/Numbers.h"

namespace zelsim {
namespace {

using Complex = std::complex<double>;
constexpr double kPi = 3.141592653589793;
constexpr double kLight = 299792458.0;  // m/s

// Third order Butterworth band filter.
constexpr double kFilterHz = 1.5e9;
constexpr double kFilterWidth = 400e6;
constexpr double kInsertionLoss = 1.2;  // dB

double filterVariable(double hz) {
    const double f = std::max(hz, 1.0);
    return (f / kFilterHz - kFilterHz / f) * kFilterHz / kFilterWidth;
}

struct Fault {
    double metres;
    double returnLoss;  // dB
};
// A connector at the near end, a loose one, a kink, and a poorly matched antenna at the far end.
constexpr std::array<Fault, 4> kFaults{{{0.0, -34}, {3.7, -24}, {8.15, -29}, {12.6, -13}}};
constexpr double kEchoFloor = -58;  // dB

constexpr std::array<CableType, 4> kCables{{{"RG58C", 0.66, 0.58},
                                            {"RG213U", 0.66, 0.28},
                                            {"RG142", 0.70, 0.46},
                                            {"LDF4-50A", 0.88, 0.07}}};

double oneWayLoss(const CableType& type, double metres, double hz) {
    return type.loss * metres * std::sqrt(std::max(hz, 0.0) / 1e9);
}

std::uint64_t nameSeed(std::string_view name) {
    std::uint64_t seed = 7;
    for (const char c : name) {
        seed = mix(seed ^ static_cast<unsigned char>(c));
    }
    return seed;
}

}  // namespace

Complex filterTransmission(double hz) {
    const Complex s(0, filterVariable(hz));
    const double gain = std::sqrt(dbToPower(-kInsertionLoss));
    return gain / ((s + 1.0) * (s * s + s + 1.0));
}

Complex filterReflection(double hz) {
    const double w = filterVariable(hz);
    const double w3 = w * w * w;
    const double size = std::sqrt((w3 * w3 + 0.002) / (w3 * w3 + 1.0));
    return std::polar(size, -2 * std::atan(w));
}

double setupRipple(double hz) {
    return 0.8 * std::sin(2 * kPi * hz / 410e6) + 0.3 * std::sin(2 * kPi * hz / 97e6) - hz / 3e9;
}

const CableType& cableType(std::string_view name) {
    const std::string wanted = upperCase(name);
    for (const CableType& type : kCables) {
        if (type.name == wanted) {
            return type;
        }
    }
    return kCables.front();
}

Complex cableReflection(double hz, const CableType& type) {
    Complex sum = 0;
    for (const Fault& fault : kFaults) {
        const double db = fault.returnLoss - 2 * oneWayLoss(type, fault.metres, hz);
        const double turn = -4 * kPi * hz * fault.metres / (kLight * type.velocity);
        sum += std::polar(std::sqrt(dbToPower(db)), turn);
    }
    return sum;
}

double cableEcho(double metres, double half, double resolution, const CableType& type) {
    double power = dbToPower(kEchoFloor);
    for (const Fault& fault : kFaults) {
        const double away = std::max(0.0, std::abs(metres - fault.metres) - half) / resolution;
        if (away < 4) {
            const double db = fault.returnLoss - 2 * oneWayLoss(type, fault.metres, 1e9);
            power += dbToPower(db) * std::exp2(-4 * away * away);
        }
    }
    return powerToDb(power);
}

double transducerFactor(std::string_view name, double hz) {
    if (name.empty() || name == "NONE") {
        return 0;
    }
    Random random(nameSeed(name));
    const double base = 10 + 20 * random.uniform();
    const double slope = 4 + 8 * random.uniform();
    const double wave = 3 * random.uniform();
    const double ghz = hz / 1e9;
    return base + slope * ghz / 3 + wave * std::sin(4 * ghz + 6 * random.uniform());
}

double limitLine(std::string_view name, double share, double reference, bool upper) {
    if (const auto height = parseNumber(name)) {
        return *height;
    }
    Random random(nameSeed(name));
    const double step = 10 + 20 * random.uniform();
    if (!upper) {
        return reference - 105 + step / 4;
    }
    return share > 0.3 && share < 0.7 ? reference : reference - step;
}

}  // namespace zelsim
