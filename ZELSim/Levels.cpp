#include "ZELSim/Levels.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <limits>
#include <string>

#include "ZELSim/Network.h"
#include "ZELSim/Numbers.h"
#include "ZELSim/Settings.h"

namespace zelsim {
namespace {

double transducers(const Settings& settings, std::size_t point) {
    if (settings.transducer1 == "NONE" && settings.transducer2 == "NONE") {
        return 0;
    }
    const bool sweptHz = !settings.isDistance() && settings.span != 0;
    const double hz = sweptHz ? settings.xFirst() - settings.frequencyOffset +
                                    settings.xStep() * static_cast<double>(point)
                              : settings.centre;
    return transducerFactor(settings.transducer1, hz) + transducerFactor(settings.transducer2, hz);
}

void store(std::string& out, double value) {
    const double bounded = std::clamp(
        std::nearbyint(value), static_cast<double>(std::numeric_limits<std::int32_t>::min()),
        static_cast<double>(std::numeric_limits<std::int32_t>::max()));
    const auto bits = static_cast<std::uint32_t>(static_cast<std::int32_t>(bounded));
    for (unsigned shift = 0; shift < 32; shift += 8) {
        out.push_back(static_cast<char>((bits >> shift) & 0xFFU));
    }
}

}  // namespace

double shownLevel(const Settings& settings, double dbm, std::size_t point) {
    const double level = dbm + settings.referenceOffset + transducers(settings, point);
    const double ohms = settings.impedance();
    const double toMillivolts = 30 + powerToDb(ohms);
    switch (settings.levelUnit()) {
        case Unit::DBm:
        case Unit::DB:
            return level;
        case Unit::DBmV:
            return level + toMillivolts;
        case Unit::DBuV:
        case Unit::DBuVm:
            return level + toMillivolts + 60;
        case Unit::DBuAm:
            return level + toMillivolts + 60 - 51.5;
        case Unit::Volt:
        case Unit::VoltPerMetre:
            return std::sqrt(dbToPower(level) * 1e-3 * ohms);
        case Unit::Watt:
            return dbToPower(level) * 1e-3;
    }
    return level;
}

double inputLevel(const Settings& settings, double shown) {
    const double ohms = settings.impedance();
    switch (settings.levelUnit()) {
        case Unit::Volt:
        case Unit::VoltPerMetre:
            return powerToDb(shown * shown / ohms * 1e3) - settings.referenceOffset;
        case Unit::Watt:
            return powerToDb(shown * 1e3) - settings.referenceOffset;
        default: {
            Settings plain;
            plain.unit = settings.unit;
            plain.rfInput = settings.rfInput;
            return shown - shownLevel(plain, 0, 0) - settings.referenceOffset;
        }
    }
}

double shownReference(const Settings& settings) {
    Settings plain;
    plain.unit = settings.unit;
    plain.rfInput = settings.rfInput;
    plain.referenceOffset = settings.referenceOffset;
    return shownLevel(plain, settings.referenceLevel, 0);
}

std::string encodeLevels(const Settings& settings, const std::array<double, kPoints>& levels) {
    double scale = 1e3;
    if (settings.levelUnit() == Unit::Volt) {
        scale = 1e6;
    } else if (settings.levelUnit() == Unit::Watt) {
        scale = 1e9;
    }
    std::string block;
    block.reserve(kPoints * 4);
    for (std::size_t i = 0; i < kPoints; ++i) {
        store(block, shownLevel(settings, levels[i], i) * scale);
    }
    return block;
}

std::string encodePhases(const std::array<double, kPoints>& radians) {
    std::string block;
    block.reserve(kPoints * 4);
    for (const double phase : radians) {
        store(block, phase * 1e6);
    }
    return block;
}

}  // namespace zelsim
