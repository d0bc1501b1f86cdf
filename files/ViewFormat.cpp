#include "files/ViewFormat.h"

#include "model/CodeTables.h"

namespace zel {

void MapRangeCode(int value, bool toCode, int& out) {
    out = value;
    if (!toCode) {
        out = static_cast<int>(decibelsPerDivision(value));
        return;
    }
    for (const CodeRow& row : codeTable(CodeTable::Range))
        if (row.code <= RANGE1DB && row.number == value) out = row.code;
}

}  // namespace zel
