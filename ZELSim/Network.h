#pragma once
// What hangs at the tracking generator: a band filter under test, and a cable with faults.

#include <complex>
#include <string_view>

namespace zelsim {

/// Transmission and reflection of the filter under test at a frequency in Hz.
std::complex<double> filterTransmission(double hz);
std::complex<double> filterReflection(double hz);
/// dB, the error of the uncalibrated set-up.
double setupRipple(double hz);

/// A cable type: share of the speed of light and loss in dB a metre at 1 GHz.
struct CableType {
    std::string_view name;
    double velocity;
    double loss;
};
/// The type of that name; an unknown name is an ordinary polyethylene cable.
const CableType& cableType(std::string_view name);
/// Reflection of the cable at a frequency, seen at its near end.
std::complex<double> cableReflection(double hz, const CableType& type);
/// Return loss in dB (negative) seen at `metres`, at best between `metres` - `half` and
/// `metres` + `half`, when the span that is swept resolves `resolution` metres.
double cableEcho(double metres, double half, double resolution, const CableType& type);

/// dB that a transducer of that name adds at a frequency; 0 for "NONE". Each name has a smooth
/// curve of its own.
double transducerFactor(std::string_view name, double hz);
/// A limit line of that name at `share` (0 to 1) of the x axis, in the shown unit. A name that is
/// a number is a line of that height; any other name has a mask of its own around `reference`.
double limitLine(std::string_view name, double share, double reference, bool upper);

}  // namespace zelsim
