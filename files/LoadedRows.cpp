#include "files/LoadedRows.h"

#include <charconv>
#include <cmath>
#include <cstddef>
#include <string>
#include <string_view>
#include <system_error>
#include <vector>

#include "files/FieldList.h"
#include "files/ViewFormat.h"
#include "model/CodeTables.h"
#include "model/LevelRange.h"
#include "model/Numeric.h"
#include "support/Text.h"
#include "trace/VerticalScale.h"

namespace zel {
namespace {

constexpr std::string_view kBlank = " ";
constexpr double kMostRange = 255;

}  // namespace

bool looksLikeNumber(std::string_view field) {
    while (!field.empty() && field.front() == ' ') field.remove_prefix(1);
    if (!field.empty() && (field.front() == '-' || field.front() == '+')) field.remove_prefix(1);
    if (!field.empty() && (field.front() == '.' || field.front() == ',')) field.remove_prefix(1);
    return !field.empty() && isDigit(field.front());
}

double fieldNumber(std::string_view field) {
    // What the program writes itself needs none of the tolerance.
    double value = 0;
    const char* const end = field.data() + field.size();
    const auto [stop, problem] = std::from_chars(field.data(), end, value);
    if (problem == std::errc() && stop == end && std::isfinite(value)) return value;
    return ParseNumberInvariant(std::string(field));
}

LoadedRows::Scale LoadedRows::scale() const {
    const double range = std::nearbyint(mirror_.ReferenceRange);
    int code = 0;
    MapRangeCode(range >= 0 && range <= kMostRange ? static_cast<int>(range) : 0, true, code);
    if (code < RANGELIN || mirror_.ReferenceUnit >= UNITV) {
        if (mirror_.ReferenceUnit == UNITV) return Scale::Volts;
        return mirror_.ReferenceUnit == UNITW ? Scale::Watts : Scale::AsTheyAre;
    }
    return range >= RANGELIN && range <= RANGEVSWR11 ? Scale::Percent : Scale::AsTheyAre;
}

double LoadedRows::converted(double value, Scale scale) const {
    const VerticalScale axis{mirror_.ReferenceUnit, mirror_.ReferenceLevel,
                             LevelRange::ofDecibels(mirror_.ReferenceRange)};
    axis.ClipToReferenceLevel(value);
    if (scale == Scale::Volts) value = VoltsToDbm(value);
    if (scale == Scale::Watts) value = WattsToDbm(value);
    if (scale == Scale::Percent) value = DbmToPercent(value, mirror_.ReferenceLevel);
    return axis.ClipToBottom(value);
}

double LoadedRows::ConvertLoadedValue(double value) const { return converted(value, scale()); }

int LoadedRows::ReadDataRows(const FieldList& lines, bool autoPeak, int startIndex,
                             int& nextIndex) {
    std::vector<double>& xs = panel_.DataXAxisArrayToLoad;
    std::vector<double>& values = panel_.DataValArrayToLoad;
    std::vector<double>& raw = panel_.RawTraceData;
    const std::size_t perRow = autoPeak ? 2 : 1;
    xs.assign(kRows, 0);
    values.assign(kRows * perRow, 0);
    raw.assign(values.size(), 0);
    const Scale how = scale();
    const int last = lines.last();
    std::size_t rows = 0;
    int i = startIndex;
    while (rows < kRows) {
        while (i <= last && lines[i] == kBlank) ++i;
        // The file ends in the middle of this row, or with the entry that a last line end makes.
        if (i + static_cast<int>(perRow) > last) {
            i = last + 1;
            break;
        }
        xs[rows] = fieldNumber(lines[i++]);
        for (std::size_t k = 0; k < perRow; ++k, ++i) {
            const std::size_t slot = rows * perRow + k;
            raw[slot] = fieldNumber(lines[i]);
            values[slot] = converted(raw[slot], how);
        }
        ++rows;
    }
    nextIndex = i > last ? -1 : i;
    xs.resize(rows);
    values.resize(rows * perRow);
    raw.resize(values.size());
    return static_cast<int>(rows);
}

}  // namespace zel
