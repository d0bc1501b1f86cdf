#include "files/ViewFormat.h"

#include <filesystem>
#include <string>

#include "model/CodeTables.h"
#include "support/Text.h"

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

bool isNameOfOldLog(const std::string& path) {
    return contains(upperCase(std::filesystem::path(path).filename().string()), "DAT");
}

std::string oldLogWarning(const std::string& path) {
    if (!isNameOfOldLog(path)) return {};
    return "The name " + std::filesystem::path(path).filename().string() +
           " holds \"dat\": when it is loaded, the file is read as a log of the older format." +
           kCrLf + "Choose another name to load it as a view.";
}

}  // namespace zel
