#include "waterfall/AxisTicks.h"

#include <algorithm>
#include <cmath>
#include <string>
#include <vector>

#include "model/Numeric.h"
#include "platform/Graph.h"
#include "platform/Graph3D.h"
#include "support/NumberText.h"
#include "support/Text.h"

namespace zel {

double tickStep(double first, double last, int most) {
    const double range = std::fabs(last - first);
    if (!std::isfinite(range) || range == 0 || most < 1) return 0;
    const double rough = range / most;
    const double unit = std::pow(10.0, std::floor(std::log10(rough)));
    if (!std::isfinite(unit) || unit == 0) return 0;
    for (const double step : {1.0, 2.0, 5.0})
        if (unit * step >= rough * (1 - 1e-9)) return unit * step;
    return unit * 10;
}

std::vector<double> axisTicks(double first, double last, int most) {
    const double step = tickStep(first, last, most);
    std::vector<double> ticks;
    if (step == 0) return ticks;
    const double low = std::min(first, last);
    const double high = std::max(first, last);
    const double begin = std::ceil(low / step - 1e-6);
    const double end = std::floor(high / step + 1e-6);
    // A range far from zero and narrower than its numbers has no ticks of its own.
    if (!(end - begin <= most + 1)) return ticks;
    for (int i = 0; i <= static_cast<int>(end - begin); ++i) ticks.push_back((begin + i) * step);
    return ticks;
}

std::string axisUnit(const std::string& format) {
    const auto open = format.find('"');
    const auto close = format.rfind('"');
    return open == close ? format : format.substr(open + 1, close - open - 1);
}

std::string axisNumber(double value, const std::string& format, double step) {
    if (std::fabs(value) < std::fabs(step) * 1e-6) value = 0;
    if (step > 0) {
        const double unit = std::pow(10.0, std::floor(std::log10(step)) - 1);
        if (unit > 0) value = std::nearbyint(value / unit) * unit;
    }
    const std::string unit = axisUnit(format);
    const bool scaled = startsWith(format, "k") && !startsWith(unit, "dB");
    if (scaled) return FormatValue(value, unit);
    const std::string number = generalNumber(roundHalfEven(value, 6));
    return unit.empty() ? number : number + " " + unit;
}

std::string levelFormat(const Graph3D& graph) {
    const GraphAxis& axis = graph.axis(3);
    const bool hidden = axis.LabelColor == graph.BackColor;
    return hidden && axis.Format == "%" ? "k\"dBm\"" : axis.Format;
}

}  // namespace zel
