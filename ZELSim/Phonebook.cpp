#include "ZELSim/Phonebook.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <istream>
#include <string>
#include <string_view>
#include <utility>

#include "ZELSim/Numbers.h"

namespace zelsim {
namespace {

constexpr std::size_t kMostEntries = 1000;
constexpr std::size_t kLongestLine = 1000;
constexpr double kLongestCall = 3600;  // s

constexpr std::array<std::pair<std::string_view, CallResult>, 6> kResults{
    {{"CONNECT", CallResult::Connect},
     {"BUSY", CallResult::Busy},
     {"NO CARRIER", CallResult::NoCarrier},
     {"NO DIALTONE", CallResult::NoDialtone},
     {"NO ANSWER", CallResult::NoAnswer},
     {"SILENCE", CallResult::Silence}}};

std::string plainNumber(std::string_view text) {
    std::string number;
    for (const char c : text) {
        if (c != ' ' && c != '-' && c != '(' && c != ')' && c != '/' && c != '.' && c != ',') {
            number.push_back(c);
        }
    }
    return upperCase(number);
}

std::string_view nextWord(std::string_view& rest) {
    rest = trimmed(rest);
    const auto end = std::min(rest.find_first_of(" \t"), rest.size());
    const std::string_view word = rest.substr(0, end);
    rest.remove_prefix(end);
    return word;
}

bool takeOption(std::string_view word, PhoneEntry& entry) {
    const auto sign = word.find('=');
    if (sign == std::string_view::npos) {
        return false;
    }
    const std::string_view name = word.substr(0, sign);
    const auto value = parseNumber(word.substr(sign + 1));
    if (!value || *value < 0 || *value > 1e7) {
        return false;
    }
    if (name == "speed") {
        entry.speed = static_cast<int>(*value);
    } else if (name == "after") {
        entry.after = std::min(*value, kLongestCall);
    } else if (name == "chunk") {
        entry.chunk = static_cast<std::size_t>(*value);
    } else if (name == "gap") {
        entry.gap = std::min(*value, kLongestCall);
    } else {
        return false;
    }
    return true;
}

/// Empty when the line is an entry.
std::string readEntry(std::string_view line, PhoneEntry& entry) {
    entry.number = plainNumber(nextWord(line));
    std::string result = upperCase(nextWord(line));
    if (result == "NO") {
        result += " " + upperCase(nextWord(line));
    }
    const auto* row = std::find_if(kResults.begin(), kResults.end(),
                                   [&](const auto& known) { return known.first == result; });
    if (row == kResults.end()) {
        return "there is no result \"" + result + "\"";
    }
    entry.result = row->second;
    while (!trimmed(line).empty()) {
        const std::string_view word = nextWord(line);
        if (!takeOption(word, entry)) {
            return "there is no option \"" + std::string(word) + "\"";
        }
    }
    return {};
}

}  // namespace

Phonebook Phonebook::standard() {
    Phonebook book;
    book.add({"100", CallResult::Busy, 0, 2});
    book.add({"101", CallResult::NoCarrier, 0, 5});
    book.add({"102", CallResult::NoDialtone, 0, 1});
    book.add({"103", CallResult::NoAnswer, 0, 5});
    book.add({"104", CallResult::Connect, 12000, 2});
    book.add({"105", CallResult::Connect, 19200, 2, 3, 0.2});
    book.add({"106", CallResult::Silence});
    return book;
}

bool Phonebook::read(std::istream& text, std::string& problem) {
    std::string line;
    for (int number = 1; std::getline(text, line); ++number) {
        std::string_view rest = line;
        rest = trimmed(rest.substr(0, rest.find('#')));
        if (!rest.empty() && rest.back() == '\r') {
            rest.remove_suffix(1);
        }
        if (rest.empty()) {
            continue;
        }
        PhoneEntry entry;
        problem = rest.size() > kLongestLine || entries_.size() >= kMostEntries
                      ? "too much for a phonebook"
                      : readEntry(rest, entry);
        if (!problem.empty()) {
            problem = "line " + std::to_string(number) + ": " + problem;
            return false;
        }
        entries_.push_back(std::move(entry));
    }
    return true;
}

PhoneEntry Phonebook::find(std::string_view number) const {
    const std::string wanted = plainNumber(number);
    for (const PhoneEntry& entry : entries_) {
        if (entry.number == wanted || entry.number == "*") {
            return entry;
        }
    }
    return {wanted};
}

std::string_view phonebookHelp() {
    return "Telephony (--modem): a modem with AT commands stands before the instrument. Without\n"
           "--phonebook 100 is busy, 101 ends in NO CARRIER, 102 in NO DIALTONE, 103 in NO "
           "ANSWER,\n"
           "104 connects at 12000 bits a second, 105 connects in pieces, 106 never answers; any\n"
           "other number connects at 19200. A line of the phonebook: NUMBER RESULT, and any of\n"
           "speed=BITS after=SECONDS chunk=CHARACTERS gap=SECONDS; the number * is any number,\n"
           "the result SILENCE never answers, # begins a comment.\n";
}

}  // namespace zelsim
