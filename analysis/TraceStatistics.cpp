#include "analysis/TraceStatistics.h"

#include <cstddef>
#include <string>
#include <vector>

#include "analysis/SpectrumTrace.h"
#include "support/NumberText.h"

namespace zel {

bool TraceStatistics::add(const SpectrumTrace& trace) {
    return occupancy_.add(trace) && min_.add(trace) && mean_.add(trace) && max_.add(trace);
}

std::string TraceStatistics::table() const {
    std::string text = "x;minimum;mean;maximum;occupancy\r\n";
    if (count() == 0) return text;
    const SpectrumTrace low = minimum();
    const SpectrumTrace middle = mean();
    const SpectrumTrace high = maximum();
    const std::vector<double> share = occupancy();
    for (std::size_t i = 0; i < share.size(); ++i)
        text += shortestNumber(low.x[i]) + ";" + shortestNumber(low.level[i]) + ";" +
                shortestNumber(middle.level[i]) + ";" + shortestNumber(high.level[i]) + ";" +
                shortestNumber(share[i]) + "\r\n";
    return text;
}

}  // namespace zel
