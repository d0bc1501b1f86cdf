#pragma once
// All settings of the simulated instrument, their preset, and the values that follow from them.

#include <cstddef>
#include <string>

namespace zelsim {

/// Samples of one sweep.
inline constexpr std::size_t kPoints = 301;
/// Hertz; the instrument's frequency range.
inline constexpr double kLowestHz = 100e3;
inline constexpr double kHighestHz = 3e9;

/// Measurement modes; the number is the code of "MEAS".
enum class Mode : int {
    Analyzer = 1,
    TrackingGenerator = 2,
    PowerSensor = 3,
    ChannelPower = 4,
    OccupiedBandwidth = 5,
    TdmaPower = 6,
    DistanceToFault = 7,
    Receiver = 8,
};

enum class Detector : int { AutoPeak = 0, MinPeak = 1, MaxPeak = 2, Sample = 3, Rms = 4 };
enum class TraceMode : int { ClearWrite = 0, Average = 1, MinHold = 2, MaxHold = 3, View = 4 };
enum class Trigger : int { FreeRun = 0, Video = 1, ExternalRise = 2, ExternalFall = 3 };
enum class Unit : int {
    DBm = 0,
    DBmV = 1,
    DBuV = 2,
    DBuVm = 3,
    DBuAm = 4,
    DB = 5,
    Volt = 6,
    Watt = 7,
    VoltPerMetre = 8,
};

/// One field per setting, in the units and codes of the wire. Codes are kept as doubles, so that
/// the table of words can hold one kind of pointer to member. A new object is the preset.
struct Settings {
    double mode = 1;
    double centre = 1.5e9;        ///< Hz at the input, without the offset
    double span = 3e9;            ///< Hz, 0 is zero span
    double frequencyOffset = 0;   ///< Hz, added to every shown frequency
    double referenceLevel = -20;  ///< dBm at the input (dB where `unit` is dB), without the offset
    double referenceOffset = 0;   ///< dB, added to every shown level
    double unit = 0;
    double range = 0;
    double rfInput = 0;    ///< 0: 50 Ohm, 1: 75 Ohm
    double lowNoise = 0;   ///< "DYNRANGE": 1 low noise, 0 low distortion
    double rbw = 0;        ///< code, 0 auto
    double vbw = 0;        ///< code, 0 auto
    double sweepTime = 0;  ///< s, 0 auto
    double continuous = 1;
    double triggerSource = 0;
    double triggerLevel = 50;  ///< % of the display's height
    double triggerDelay = 0;   ///< s
    double traceMode = 0;
    double detector = 0;
    double markerOn = 0;
    double deltaOn = 0;
    double markerMode = 0;
    double trackingLevel = 0;  ///< dBm
    double transmissionCal = 0;
    double reflectionCal = 0;
    double transmissionVectorCal = 0;
    double reflectionVectorCal = 0;
    double channelStandard = 1;
    double channelUnit = 0;
    double channelBandwidth = 3.84e6;  ///< Hz
    double occupiedStandard = 1;
    double occupiedBandwidth = 5e6;  ///< Hz, channel bandwidth of the measurement
    double tdmaStandard = 1;
    double tdmaTime = 470e-6;    ///< s
    double sensorTime = 1;       ///< code: 0 short, 1 normal, 2 long
    double sensorReference = 0;  ///< dBm, the stored reference of the power sensor
    double dtfMode = 0;
    double cableLength = 15;  ///< m
    double baud = 2;          ///< code: 19200, 38400, 57600, 115200
    std::string cableModel = "RG58C";
    std::string lengthUnit = "m";
    std::string transducer1 = "NONE";
    std::string transducer2 = "NONE";
    std::string lowerLimit = "NONE";
    std::string upperLimit = "NONE";

    Mode measurement() const { return static_cast<Mode>(static_cast<int>(mode)); }
    Detector traceDetector() const { return static_cast<Detector>(static_cast<int>(detector)); }
    TraceMode display() const { return static_cast<TraceMode>(static_cast<int>(traceMode)); }
    Trigger trigger() const { return static_cast<Trigger>(static_cast<int>(triggerSource)); }
    Unit levelUnit() const { return static_cast<Unit>(static_cast<int>(unit)); }
    /// True where x is metres of cable.
    bool isDistance() const { return measurement() == Mode::DistanceToFault && dtfMode == 0; }
    /// True where x is seconds.
    bool isZeroSpan() const { return !isDistance() && span == 0; }

    double impedance() const { return rfInput == 1 ? 75.0 : 50.0; }
    /// Hz, the bandwidth that the code or the coupling gives.
    double rbwHz() const;
    double vbwHz() const;
    /// s, the time of one sweep that the setting or the coupling gives.
    double sweepSeconds() const;
    /// x of the first point and the distance of two points: Hz (with the offset), s or m.
    double xFirst() const;
    double xStep() const;
    double xLast() const { return xFirst() + xStep() * static_cast<double>(kPoints - 1); }
    /// dB from the top of the display to its bottom.
    double displayHeight() const;
};

/// Baud of a "BAUD" code, 0 outside the table.
int baudOfCode(int code);

}  // namespace zelsim
