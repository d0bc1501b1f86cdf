#pragma once
// One sweep as a value: what came, what it means, and the settings that it was read with.

#include <cmath>
#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include "model/CodeTables.h"
#include "model/ZEL3Variables.h"

namespace zel {

/// The x axis of a sweep, in `unit`.
struct SweepAxis {
    double start = 0;
    double stop = 0;
    double first = 0;      ///< x of the first value on the graph
    double increment = 0;  ///< from value to value on the graph; pairs take two
    double intervals = 300;
    std::string unit;  ///< "Hz", "s", "m"
};

/// A sweep runs from the transfer through the conversion to graph, waterfall and file. With the
/// auto peak detector the arrays hold pairs, 602 values, else a value a point, 301. A sample that
/// did not come is no number (NaN) in every array.
struct Sweep {
    std::vector<double> raw;       ///< whole numbers as the instrument sent them
    std::vector<double> physical;  ///< in the reference unit, not clipped to the display
    std::vector<double> shown;     ///< clipped, as the graph draws it: reference unit, dBm or %
    std::vector<double> colours;   ///< 0 to 100, for the waterfall
    std::size_t wanted = 0;        ///< samples asked for; 0 for a sweep that was never read
    std::size_t came = 0;          ///< samples that came, in the order of the wire
    SweepAxis axis;
    double rawScale = 1000;           ///< raw number a unit
    ZEL3Variables settings;           ///< that the sweep was read with
    bool settingsKept = false;        ///< a setting was sent since: they follow the mirror no more
    std::int16_t instrumentMode = 0;  ///< at that moment; 0 for a sweep that was never read
    std::int16_t levelMode = 0;       ///< in which the reference level was asked last; 0: never
    double time = 0;                  ///< date of the reading, days

    bool whole() const { return wanted > 0 && came == wanted; }
    /// A transfer was made, and samples are missing.
    bool incomplete() const { return came < wanted; }
    bool autoPeak() const { return settings.TraceDetector == DETAUTOPEAK; }
    /// Values that belong to one point: 2 with the auto peak detector, else 1.
    std::size_t perPoint() const { return autoPeak() ? 2 : 1; }
    double spanHz() const { return settings.Span; }
    /// All values of the point came.
    bool pointCame(std::size_t point) const {
        const std::size_t first = point * perPoint();
        for (std::size_t i = first; i < first + perPoint(); ++i)
            if (i >= physical.size() || std::isnan(physical[i])) return false;
        return true;
    }
};

/// Takes over what queries have learned about the instrument since the reading, as long as no
/// setting was sent. What the read cycle itself asks stays.
void followMirror(Sweep& sweep, const ZEL3Variables& mirror);
/// The same for the last time: a setting goes out.
void keepSettings(Sweep& sweep, const ZEL3Variables& mirror);
/// Spreads the values over the axis: one every interval, half of that for the pairs of the auto
/// peak detector; at zero span the sweep time spreads over two intervals less.
void placePoints(Sweep& sweep);
/// "INCOMPLETE 150/301" for a sweep of which samples are missing, else empty.
std::string incompleteMark(const Sweep& sweep);
/// "incomplete trace: 150 of 301 samples".
std::string incompleteText(const Sweep& sweep);

}  // namespace zel
