#include "files/ViewFormat.h"

#include "model/CodeTables.h"

namespace zel {

void MapRangeCode(int value, bool toCode, int& out) {
    out = value;
    if (!toCode) {
        out = static_cast<int>(decibelsPerDivision(value));
        return;
    }
    for (int code = RANGE10DB; code <= RANGE1DB; ++code)
        if (decibelsPerDivision(code) == value) out = code;
}

}  // namespace zel
