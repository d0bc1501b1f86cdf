#include <algorithm>
#include <cstddef>
#include <string>
#include <string_view>

#include "ZELSim/AnswerTexts.h"
#include "ZELSim/Device.h"
#include "ZELSim/Levels.h"
#include "ZELSim/Markers.h"
#include "ZELSim/Numbers.h"
#include "ZELSim/Settings.h"
#include "ZELSim/WordActions.h"
#include "ZELSim/Words.h"

namespace zelsim {

int WordActions::setMarkerOn(Device& device, double on) {
    if (on != 0 && device.settings().markerOn == 0) {
        device.markers().placeMarker(highestPoint(device.trace().high));
    }
    device.edit().markerOn = on;
    if (on == 0) {
        device.edit().deltaOn = 0;
    }
    return kAccepted;
}

int WordActions::setDeltaOn(Device& device, double on) {
    if (on != 0 && device.settings().deltaOn == 0) {
        if (device.settings().markerOn == 0) {
            setMarkerOn(device, 1);
        }
        const std::size_t from = device.markers().marker();
        device.markers().placeDelta(nextPeak(device.trace().high, from));
    }
    device.edit().deltaOn = on;
    return kAccepted;
}

namespace {

bool onDisplay(const Settings& settings, double x) {
    const double slack = settings.xStep() / 2;
    return x >= settings.xFirst() - slack && x <= settings.xLast() + slack;
}

double markedLevel(Device& device, std::size_t point) {
    const Settings& settings = device.settings();
    constexpr double noiseMode = 1;
    double level = device.trace().high[point];
    if (settings.markerMode == noiseMode) {
        constexpr double noiseBandwidth = 1.064467;
        level -= powerToDb(settings.rbwHz() * noiseBandwidth);  // into one hertz
    }
    return shownLevel(settings, level, point);
}

double markedX(Device& device, std::size_t point) {
    const Settings& settings = device.settings();
    const double x = xAt(settings, point);
    constexpr double countMode = 2;
    if (settings.markerMode != countMode || settings.isZeroSpan() || settings.isDistance()) {
        return x;
    }
    const double reach = settings.xStep() + settings.rbwHz();
    return device.sweeper().countedFrequency(x - settings.frequencyOffset, reach,
                                             device.sweepStart()) +
           settings.frequencyOffset;
}

}  // namespace

int WordActions::setMarker(Device& device, double x) {
    if (device.settings().markerOn == 0) {
        return kNotAllowed;
    }
    if (!onDisplay(device.settings(), x)) {
        return kOutOfRange;
    }
    device.markers().placeMarker(pointAt(device.settings(), x));
    return kAccepted;
}

int WordActions::setDelta(Device& device, double x) {
    if (device.settings().deltaOn == 0) {
        return kNotAllowed;
    }
    const double at = xAt(device.settings(), device.markers().marker()) + x;
    if (!onDisplay(device.settings(), at)) {
        return kOutOfRange;
    }
    device.markers().placeDelta(pointAt(device.settings(), at));
    return kAccepted;
}

std::string WordActions::marker(Device& device) {
    const std::size_t point = device.markers().marker();
    return xText(device.settings(), markedX(device, point)) + "," +
           levelText(device.settings(), markedLevel(device, point));
}

std::string WordActions::delta(Device& device) {
    const std::size_t from = device.markers().marker();
    const std::size_t to = device.markers().delta();
    const auto& levels = device.trace().high;
    return xText(device.settings(), markedX(device, to) - markedX(device, from)) + "," +
           numberText(levels[to] - levels[from], 2);
}

int WordActions::markerPeak(Device& device, std::string_view) {
    if (device.settings().markerOn == 0) {
        return kNotAllowed;
    }
    device.markers().placeMarker(highestPoint(device.trace().high));
    return kAccepted;
}

int WordActions::markerNextPeak(Device& device, std::string_view) {
    if (device.settings().markerOn == 0) {
        return kNotAllowed;
    }
    device.markers().placeMarker(nextPeak(device.trace().high, device.markers().marker()));
    return kAccepted;
}

int WordActions::markerMinimum(Device& device, std::string_view) {
    if (device.settings().markerOn == 0) {
        return kNotAllowed;
    }
    device.markers().placeMarker(lowestPoint(device.trace().high));
    return kAccepted;
}

int WordActions::markerToCentre(Device& device, std::string_view) {
    const Settings& settings = device.settings();
    if (settings.markerOn == 0 || settings.isZeroSpan() || settings.isDistance()) {
        return kNotAllowed;
    }
    const double x = xAt(settings, device.markers().marker());
    if (!device.setCentre(x)) {
        return kOutOfRange;
    }
    // The marker stays on its frequency, which is the centre now.
    device.markers().placeMarker(kPoints / 2);
    return kAccepted;
}

int WordActions::markerToReference(Device& device, std::string_view) {
    if (device.settings().markerOn == 0) {
        return kNotAllowed;
    }
    const double level = device.trace().high[device.markers().marker()];
    device.edit().referenceLevel = std::clamp(level, kLowestReference, kHighestReference);
    device.restart();
    return kAccepted;
}

}  // namespace zelsim
