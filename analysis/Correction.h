#pragma once
// Corrections of the level over frequency: antenna factors, cable losses, amplifier gains.

#include <optional>
#include <string>
#include <vector>

#include "analysis/SpectrumTrace.h"

namespace zel {

enum class CorrectionKind {
    Antenna,    ///< antenna factor, dB/m: added, the level becomes a field strength
    Cable,      ///< loss, dB: added
    Amplifier,  ///< gain, dB: taken away
};

/// A table of dB over frequency, linear between its rows, none outside.
struct Correction {
    CorrectionKind kind = CorrectionKind::Cable;
    std::string name;
    std::vector<double> x;   ///< Hz, rising
    std::vector<double> db;  ///< as the maker gives it, without the sign of its kind

    /// dB at x; nothing outside of the table.
    std::optional<double> at(double frequency) const;
};

/// Reads a table "x;db" with that header. Throws std::runtime_error with the line's number and what
/// is wrong with it.
Correction readCorrection(const std::string& text, CorrectionKind kind, const std::string& name);

/// The trace with all corrections added. With an antenna the unit becomes dBuV/m: at 50 ohm the
/// voltage in dBuV is the level in dBm + 107 (20 log10(sqrt(50 * 1 mW) / 1 uV) = 106.99), in dBmV +
/// 60. Throws std::runtime_error, with a text for the user, where a table does not cover the trace,
/// at another axis than Hz, for two antennas, and for an antenna at a unit that is no voltage.
/// Error: that of the tables, and of the line between their rows.
SpectrumTrace corrected(const SpectrumTrace& trace, const std::vector<Correction>& corrections);

/// "cable RG58, antenna LP-2"; empty without one.
std::string correctionNames(const std::vector<Correction>& corrections);

/// A cable's dielectric and the speed of a wave in it, as a part of the speed of light.
struct VelocityFactor {
    const char* dielectric;
    double factor;
};
/// Usual cables, slowest first.
const std::vector<VelocityFactor>& velocityFactors();
/// The true place of a fault that an instrument set to `assumed` shows at `shown` metres, in a
/// cable of `factor`: shown * factor / assumed.
double faultDistance(double shown, double assumed, double factor);

}  // namespace zel
