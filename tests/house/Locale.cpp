#include <regex>
#include <sstream>
#include <string>

#include "tests/house/House.h"

namespace zel::house {
namespace {

/// Calls and types whose result depends on the language of the user.
constexpr const char* kLocale =
    // texts of numbers
    "\\bv?(|f|s|sn|d|as|sw|fw|w)(printf|scanf)\\b"
    "|\\b(strto|wcsto)(f|d|ld|l|ll|ul|ull|imax|umax)\\b|\\bsto(f|d|ld|i|l|ll|ul|ull)\\b"
    "|\\bato(f|i|l|ll)\\b"
    // kinds and case of characters, order of texts
    "|\\bto(w?)(upper|lower)\\b"
    "|\\bisw?(space|digit|alpha|alnum|upper|lower|print|punct|cntrl|xdigit|graph|blank)\\b"
    "|\\bstrn?casecmp\\b|\\bstr(coll|xfrm)\\b|\\bwcs(coll|xfrm)\\b"
    // dates
    "|\\bstrftime\\b|\\bwcsftime\\b|\\b(put|get)_(time|money)\\b"
    // the locale itself
    "|\\bsetlocale\\b|\\blocaleconv\\b|\\blocale::global\\b|\\blocale\\s+\\w+\\s*[({]"
    "|\\blocale\\s*[({]"
    // the toolkit's
    "|\\bQLocale\\b|\\bQCollator\\b|\\blocaleAwareCompare\\b";

constexpr const char* kStream = "\\bstd::[io]?(f|string)stream\\b";
constexpr const char* kClassic = "imbue(std::locale::classic())";

}  // namespace

std::vector<std::string> localeUses(const House& house, const std::vector<SourceFile>& files) {
    const std::regex locale(kLocale);
    const std::regex stream(kStream);
    std::vector<std::string> breaches;
    for (const SourceFile& file : files) {
        if (house.isLocalePlace(file.path) || startsWith(file.path, "tests/")) continue;
        const std::string text = codeOnly(file.text);
        const bool classic = text.find(kClassic) != std::string::npos;
        std::istringstream code(text);
        int number = 0;
        for (std::string line; std::getline(code, line);) {
            ++number;
            if (line.find('#') == 0) continue;
            std::smatch match;
            if (std::regex_search(line, match, locale) ||
                (!classic && std::regex_search(line, match, stream)))
                breaches.push_back(file.path + ":" + std::to_string(number) + ": " + match.str());
        }
    }
    return breaches;
}

}  // namespace zel::house
