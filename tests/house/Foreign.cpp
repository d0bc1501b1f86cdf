#include <algorithm>
#include <regex>
#include <sstream>
#include <string_view>

#include "tests/house/House.h"

namespace zel::house {
namespace {

/// Words that read a clock of the machine or wait on it.
constexpr const char* kRealTime =
    "\\b(steady_clock|system_clock|high_resolution_clock|utc_clock|file_clock|sleep_for|"
    "sleep_until|wait_for|wait_until|usleep|nanosleep|clock_nanosleep|clock_gettime|gettimeofday|"
    "timespec_get|QElapsedTimer|QDeadlineTimer)\\b"
    "|\\bQThread\\s*::\\s*(sleep|msleep|usleep)\\b"
    "|\\b(QTime::currentTime|QDate::currentDate|QDateTime::current\\w+)\\b"
    "|\\bstd::(time|clock)\\s*\\(|(^|[^\\w:>])::(time|clock|sleep)\\s*\\("
    "|(^|[^\\w:.>])time\\s*\\(\\s*(nullptr|NULL|0|&\\w+)\\s*\\)";

constexpr std::string_view kStandardHeaders[] = {
    "algorithm",
    "any",
    "array",
    "atomic",
    "barrier",
    "bit",
    "bitset",
    "cassert",
    "cctype",
    "cerrno",
    "cfenv",
    "cfloat",
    "charconv",
    "chrono",
    "cinttypes",
    "climits",
    "clocale",
    "cmath",
    "compare",
    "complex",
    "concepts",
    "condition_variable",
    "coroutine",
    "csetjmp",
    "cstdarg",
    "cstddef",
    "cstdint",
    "cstdio",
    "cstdlib",
    "cstring",
    "ctime",
    "deque",
    "exception",
    "execution",
    "filesystem",
    "forward_list",
    "fstream",
    "functional",
    "future",
    "initializer_list",
    "iomanip",
    "ios",
    "iosfwd",
    "iostream",
    "istream",
    "iterator",
    "latch",
    "limits",
    "list",
    "locale",
    "map",
    "memory",
    "memory_resource",
    "mutex",
    "new",
    "numbers",
    "numeric",
    "optional",
    "ostream",
    "queue",
    "random",
    "ranges",
    "ratio",
    "regex",
    "scoped_allocator",
    "semaphore",
    "set",
    "shared_mutex",
    "source_location",
    "span",
    "sstream",
    "stack",
    "stdexcept",
    "stop_token",
    "streambuf",
    "string",
    "string_view",
    "system_error",
    "thread",
    "tuple",
    "type_traits",
    "typeindex",
    "typeinfo",
    "unordered_map",
    "unordered_set",
    "utility",
    "valarray",
    "variant",
    "vector",
    "version",
};

bool isStandard(std::string_view header) {
    return std::find(std::begin(kStandardHeaders), std::end(kStandardHeaders), header) !=
           std::end(kStandardHeaders);
}

}  // namespace

std::vector<std::string> realTimeUses(const House& house, const std::vector<SourceFile>& files) {
    const std::regex realTime(kRealTime);
    std::vector<std::string> breaches;
    for (const SourceFile& file : files) {
        if (house.isSystemPlace(file.path)) continue;
        std::istringstream code(codeOnly(file.text));
        int number = 0;
        for (std::string line; std::getline(code, line);) {
            ++number;
            std::smatch match;
            if (std::regex_search(line, match, realTime)) {
                breaches.push_back(file.path + ":" + std::to_string(number) + ": " + match.str());
            }
        }
    }
    return breaches;
}

std::vector<std::string> foreignHeaders(const House& house, const std::vector<SourceFile>& files) {
    std::vector<std::string> breaches;
    for (const SourceFile& file : files) {
        const Room* room = house.roomOf(file.path);
        if (room == nullptr || !room->standardOnly || house.isSystemPlace(file.path)) continue;
        for (const std::string& header : includes(file, IncludeKind::Angled)) {
            if (!isStandard(header)) breaches.push_back(file.path + " includes <" + header + ">");
        }
    }
    return breaches;
}

}  // namespace zel::house
