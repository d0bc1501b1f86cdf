// Any bytes as a script: both roads into the list, the check of its lines, the way back to bytes.

#include <cstdint>
#include <cstdlib>
#include <string>

#include "script/Language.h"
#include "script/LineCheck.h"
#include "script/ScriptFile.h"
#include "support/CodePage.h"
#include "support/Text.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string bytes(reinterpret_cast<const char*>(data), size);
    const bool codePage = !zel::isValidUtf8(bytes);
    const std::string text = codePage ? zel::codePageToUtf8(bytes) : bytes;
    if (zel::scriptBytes({text, false, codePage}) != bytes) std::abort();
    const auto lines = zel::loadCommandsFromText(text);
    if (zel::scriptLines(text).size() != lines.size()) std::abort();
    std::size_t length = 0;
    for (const std::string& line : zel::loadCommandsRecursively(text, "", "", {}))
        length += line.size();
    if (length > text.size()) std::abort();
    for (const std::string& line : lines) {
        const std::string capitals = zel::statementText(line);
        if (const zel::Statement* statement = zel::findStatement(capitals))
            zel::argumentOf(*statement, capitals);
        zel::nearestStatement(capitals);
    }
    zel::checkScript(text);
    return 0;
}
