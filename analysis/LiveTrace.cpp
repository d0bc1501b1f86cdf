#include "analysis/LiveTrace.h"

#include <chrono>
#include <cmath>
#include <cstddef>
#include <stdexcept>
#include <string>

#include "analysis/SpectrumTrace.h"
#include "model/CodeTables.h"
#include "model/Numeric.h"
#include "trace/PointPairs.h"
#include "trace/Sweep.h"

namespace zel {
namespace {

constexpr double kMostDays = 2958465;  // the last day of the year 9999
constexpr double kDaySeconds = 86400;

std::string twoDigits(long number) { return (number < 10 ? "0" : "") + std::to_string(number); }

}  // namespace

std::string isoTimeOf(double date) {
    using namespace std::chrono;
    if (!(date > 0) || date > kMostDays) return {};
    const auto second = static_cast<long long>(std::llround(date * kDaySeconds));
    const long long day = second / 86400;
    const long ofDay = static_cast<long>(second % 86400);
    const year_month_day when = sys_days(year(1899) / 12 / 30) + days(day);
    return std::to_string(static_cast<int>(when.year())) + "-" +
           twoDigits(static_cast<long>(static_cast<unsigned>(when.month()))) + "-" +
           twoDigits(static_cast<long>(static_cast<unsigned>(when.day()))) + "T" +
           twoDigits(ofDay / 3600) + ":" + twoDigits(ofDay / 60 % 60) + ":" + twoDigits(ofDay % 60);
}

SpectrumTrace spectrumOf(const Sweep& sweep) {
    if (!sweep.whole()) throw std::runtime_error(incompleteText(sweep));
    const int unit = static_cast<int>(sweep.settings.ReferenceUnit);
    const CodeRow* named = findCode(CodeTable::ReferenceUnit, sweep.settings.ReferenceUnit);
    if (named == nullptr || named->saved.empty())
        throw std::runtime_error("levels in " + levelUnitText(sweep.settings.ReferenceUnit) +
                                 " have no value in dB");
    const bool linear = unit == UNITV || unit == UNITW;
    SpectrumTrace trace;
    trace.xUnit = sweep.axis.unit;
    trace.unit = linear ? "dBm" : std::string(named->saved);
    if (const CodeRow* rbw =
            findCode(CodeTable::ResolutionBandwidth, sweep.settings.ResolutionBandwidth))
        trace.rbw = rbw->number;
    trace.time = isoTimeOf(sweep.time);
    const std::size_t each = sweep.perPoint();
    const std::size_t points = sweep.physical.size() / each;
    const double step =
        points < 2 ? 0 : (sweep.axis.stop - sweep.axis.start) / static_cast<double>(points - 1);
    trace.x.reserve(points);
    trace.level.reserve(points);
    for (std::size_t i = 0; i < points; ++i) {
        trace.x.push_back(sweep.axis.start + static_cast<double>(i) * step);
        const double value = each == 2 ? levelsOfPoint(sweep.physical, i).high : sweep.physical[i];
        if (linear && value <= 0)
            throw std::runtime_error("a level of 0 " + std::string(named->saved) +
                                     " or below has no value in dBm");
        trace.level.push_back(!linear         ? value
                              : unit == UNITV ? VoltsToDbm(value)
                                              : WattsToDbm(value));
    }
    return trace;
}

}  // namespace zel
