#pragma once
// What single words do beyond reading and writing their setting.

#include <string>
#include <string_view>

#include "ZELSim/Device.h"
#include "ZELSim/Settings.h"

namespace zelsim {

/// Setters and actions return the status digit, getters the text of the answer.
struct WordActions {
    static int setFrequency(Device& device, double hz);
    static std::string frequency(Device& device);
    static int setSpan(Device& device, double hz);
    static int setReference(Device& device, double shown);
    static std::string reference(Device& device);
    static int setSweepTime(Device& device, double seconds);
    static std::string sweepTime(Device& device);
    static int setContinuous(Device& device, double code);
    static int setTraceMode(Device& device, double code);
    static int setDetector(Device& device, double code);
    static std::string detector(Device& device);
    static int setMode(Device& device, double code);
    static std::string identity(Device& device);
    static std::string level(Device& device);

    static int setMarkerOn(Device& device, double on);
    static int setDeltaOn(Device& device, double on);
    static int setMarker(Device& device, double x);
    static int setDelta(Device& device, double x);
    /// "x,level"; the delta marker's two numbers count from the marker.
    static std::string marker(Device& device);
    static std::string delta(Device& device);
    static int markerPeak(Device& device, std::string_view argument);
    static int markerNextPeak(Device& device, std::string_view argument);
    static int markerMinimum(Device& device, std::string_view argument);
    static int markerToCentre(Device& device, std::string_view argument);
    static int markerToReference(Device& device, std::string_view argument);

    static std::string limits(Device& device);
    static std::string sensorPower(Device& device);
    static std::string sensorReflection(Device& device);
    static int setMeasTime(Device& device, double value);
    static std::string measTime(Device& device);
    static std::string channelPower(Device& device);
    static int setChannelStd(Device& device, double code);
    static int setChannelHz(Device& device, double hz);
    static std::string occupiedBandwidth(Device& device);
    static int setOccupiedStd(Device& device, double code);
    static int setOccupiedHz(Device& device, double hz);
    static std::string tdmaPower(Device& device);
    static int setTdmaStandard(Device& device, double code);

    static int init(Device& device, std::string_view argument);
    static int remote(Device& device, std::string_view argument);
    static int local(Device& device, std::string_view argument);
    static int preset(Device& device, std::string_view argument);
    static int save(Device& device, std::string_view name);
    static int recall(Device& device, std::string_view name);
    static int levelAdjust(Device& device, std::string_view argument);
    static int powerToReference(Device& device, std::string_view argument);
    static int deleteLimits(Device& device, std::string_view which);
    /// Accepted; the simulated instrument has no part that it would change.
    static int nothing(Device& device, std::string_view argument);

    /// One calibration of the tracking generator takes the place of the others; the display then
    /// shows ratios.
    template <double Settings::*Which>
    static int calibrate(Device& device, std::string_view) {
        clearCalibrations(device);
        device.edit().*Which = 1;
        device.restart();
        return 0;
    }

  private:
    static void clearCalibrations(Device& device);
};

}  // namespace zelsim
