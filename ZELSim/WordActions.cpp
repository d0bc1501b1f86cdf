#include "ZELSim/WordActions.h"

#include <array>
#include <cmath>
#include <cstddef>
#include <string>
#include <string_view>

#include "ZELSim/AnswerTexts.h"
#include "ZELSim/Device.h"
#include "ZELSim/Levels.h"
#include "ZELSim/Markers.h"
#include "ZELSim/Measurements.h"
#include "ZELSim/Numbers.h"
#include "ZELSim/Settings.h"
#include "ZELSim/Words.h"

namespace zelsim {
namespace {

// Channel bandwidths of the standards 3GPP WCDMA, cdmaOne and cdma2000 1x; User keeps its own.
constexpr std::array<double, 4> kChannelHz{0, 3.84e6, 1.2288e6, 1.2288e6};
constexpr std::array<double, 4> kOccupiedHz{0, 5e6, 1.25e6, 1.25e6};
constexpr double kGsmSlot = 470e-6;  // s, the useful part of a burst

}  // namespace

int WordActions::setFrequency(Device& device, double hz) {
    return device.setCentre(hz) ? kAccepted : kOutOfRange;
}

std::string WordActions::frequency(Device& device) {
    return hertzText(device.settings().centre + device.settings().frequencyOffset);
}

int WordActions::setSpan(Device& device, double hz) {
    return device.setSpan(hz) ? kAccepted : kOutOfRange;
}

int WordActions::setReference(Device& device, double shown) {
    const bool linear = device.settings().unit >= static_cast<double>(Unit::Volt);
    if (linear && shown <= 0) {
        return kOutOfRange;
    }
    const double dbm = inputLevel(device.settings(), shown);
    const bool ratio = device.settings().levelUnit() == Unit::DB;
    const double lowest = ratio ? -200.0 : kLowestReference;
    const double highest = ratio ? 200.0 : kHighestReference;
    if (dbm < lowest - 1e-9 || dbm > highest + 1e-9) {
        return kOutOfRange;
    }
    device.edit().referenceLevel = dbm;
    device.restart();
    return kAccepted;
}

std::string WordActions::reference(Device& device) {
    return levelText(device.settings(), shownReference(device.settings()));
}

int WordActions::setSweepTime(Device& device, double seconds) {
    const bool zero = device.settings().isZeroSpan();
    const double least = zero ? 1e-3 : 0.02;
    const double most = zero ? 100.0 : 1000.0;
    if (seconds != 0 && (seconds < least || seconds > most)) {
        return kOutOfRange;
    }
    device.edit().sweepTime = seconds;
    device.restart();
    return kAccepted;
}

std::string WordActions::sweepTime(Device& device) {
    return numberText(device.settings().sweepSeconds(), 6);
}

int WordActions::setContinuous(Device& device, double code) {
    device.setContinuous(code != 0);
    return kAccepted;
}

int WordActions::setTraceMode(Device& device, double code) {
    device.trace();  // View keeps what is on the display now
    device.edit().traceMode = code;
    if (code != static_cast<double>(TraceMode::View)) {
        device.restart();
    }
    return kAccepted;
}

int WordActions::setDetector(Device& device, double code) {
    if (device.settings().measurement() == Mode::PowerSensor) {
        return kWrongMode;
    }
    device.edit().detector = code;
    device.restart();
    return kAccepted;
}

std::string WordActions::detector(Device& device) {
    const bool noTrace = device.settings().measurement() == Mode::PowerSensor;
    return noTrace ? "-2" : numberText(device.settings().detector, 0);
}

int WordActions::setMode(Device& device, double code) {
    device.enterMode(static_cast<Mode>(static_cast<int>(code)));
    return kAccepted;
}

std::string WordActions::identity(Device&) { return "Marlow&Tenby,9102,100234,V2.31"; }

std::string WordActions::level(Device& device) {
    const Settings& settings = device.settings();
    const double dbm = device.sweeper().levelAt(settings, settings.centre, device.now());
    return levelText(settings, shownLevel(settings, dbm, kPoints / 2));
}

std::string WordActions::limits(Device& device) {
    return numberText(limitCheck(device.settings(), device.trace()), 0);
}

std::string WordActions::sensorPower(Device& device) {
    return numberText(
        zelsim::sensorPower(device.settings(), device.scene(), device.seed(), device.now()), 2);
}

std::string WordActions::sensorReflection(Device& device) {
    return numberText(sensorReturnLoss(device.settings(), device.seed(), device.now()), 2);
}

int WordActions::setMeasTime(Device& device, double value) {
    if (device.settings().measurement() == Mode::PowerSensor) {
        if (value != 0 && value != 1 && value != 2) {
            return kOutOfRange;
        }
        device.edit().sensorTime = value;
        return kAccepted;
    }
    if (value < 100e-6 || value > 100) {
        return kOutOfRange;
    }
    device.edit().tdmaTime = value;
    device.restart();
    return kAccepted;
}

std::string WordActions::measTime(Device& device) {
    const bool sensor = device.settings().measurement() == Mode::PowerSensor;
    return sensor ? numberText(device.settings().sensorTime, 0)
                  : numberText(device.settings().tdmaTime, 9);
}

std::string WordActions::channelPower(Device& device) {
    return numberText(
        zelsim::channelPower(device.settings(), device.sweeper(), device.sweepStart()), 2);
}

int WordActions::setChannelStd(Device& device, double code) {
    device.edit().channelStandard = code;
    const double hz = kChannelHz[static_cast<std::size_t>(code)];
    return setChannelHz(device, hz > 0 ? hz : device.settings().channelBandwidth);
}

int WordActions::setChannelHz(Device& device, double hz) {
    device.edit().channelBandwidth = hz;
    device.setSpan(1.2 * hz);
    return kAccepted;
}

std::string WordActions::occupiedBandwidth(Device& device) {
    return hertzText(
        zelsim::occupiedBandwidth(device.settings(), device.sweeper(), device.sweepStart()));
}

int WordActions::setOccupiedStd(Device& device, double code) {
    device.edit().occupiedStandard = code;
    const double hz = kOccupiedHz[static_cast<std::size_t>(code)];
    return setOccupiedHz(device, hz > 0 ? hz : device.settings().occupiedBandwidth);
}

int WordActions::setOccupiedHz(Device& device, double hz) {
    device.edit().occupiedBandwidth = hz;
    device.setSpan(2 * hz);
    return kAccepted;
}

std::string WordActions::tdmaPower(Device& device) {
    return numberText(zelsim::tdmaPower(device.settings(), device.sweeper(), device.sweepStart()),
                      2);
}

int WordActions::setTdmaStandard(Device& device, double code) {
    device.edit().tdmaStandard = code;
    if (code == 1) {
        device.edit().tdmaTime = kGsmSlot;
    }
    device.restart();
    return kAccepted;
}

int WordActions::init(Device& device, std::string_view) {
    device.restart();
    return kAccepted;
}

int WordActions::remote(Device& device, std::string_view) {
    device.setRemote(true);
    return kAccepted;
}

int WordActions::local(Device& device, std::string_view) {
    device.setRemote(false);
    return kAccepted;
}

int WordActions::preset(Device& device, std::string_view) {
    device.preset();
    return kAccepted;
}

int WordActions::save(Device& device, std::string_view name) {
    constexpr std::size_t longest = 32;
    if (name.size() > longest) {
        return kOutOfRange;
    }
    return device.save(upperCase(name)) ? kAccepted : kStorageFull;
}

int WordActions::recall(Device& device, std::string_view name) {
    return device.recall(upperCase(name)) ? kAccepted : kOutOfRange;
}

int WordActions::levelAdjust(Device& device, std::string_view) {
    const auto& levels = device.trace().high;
    device.edit().referenceLevel = fittingReference(levels[highestPoint(levels)]);
    device.restart();
    return kAccepted;
}

int WordActions::powerToReference(Device& device, std::string_view) {
    device.edit().sensorReference =
        zelsim::sensorPower(device.settings(), device.scene(), device.seed(), device.now());
    return kAccepted;
}

int WordActions::deleteLimits(Device& device, std::string_view which) {
    const std::string name = upperCase(which);
    if (name != "UPP") {
        device.edit().lowerLimit = "NONE";
    }
    if (name != "LOW") {
        device.edit().upperLimit = "NONE";
    }
    return kAccepted;
}

int WordActions::nothing(Device&, std::string_view) { return kAccepted; }

void WordActions::clearCalibrations(Device& device) {
    Settings& settings = device.edit();
    settings.transmissionCal = settings.reflectionCal = 0;
    settings.transmissionVectorCal = settings.reflectionVectorCal = 0;
    settings.unit = static_cast<double>(Unit::DB);
    settings.referenceLevel = 0;
}

}  // namespace zelsim
