#include "trace/VerticalScale.h"

#include "model/CodeTables.h"
#include "model/Numeric.h"

namespace zel {
namespace {

constexpr double kDivisions = 10;

}  // namespace

double VerticalScale::ClipToReferenceLevel(double& value) const {
    if (value > level) value = level;
    return value;
}

double VerticalScale::ClipToBottom(double value) const {
    double top = level;
    if (unit == UNITV) top = VoltsToDbm(top);
    if (unit == UNITW) top = WattsToDbm(top);
    const double bottom = top - kDivisions * range.perDivision();
    return value >= bottom ? value : bottom;
}

}  // namespace zel
