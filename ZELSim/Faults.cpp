#include "ZELSim/Faults.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "ZELSim/Noise.h"
#include "ZELSim/Numbers.h"

namespace zelsim {
namespace {

using Kind = FaultRule::Kind;

constexpr std::array<std::pair<std::string_view, Kind>, 5> kKinds{{{"DROP", Kind::Drop},
                                                                   {"DELAY", Kind::Delay},
                                                                   {"GARBLE", Kind::Garble},
                                                                   {"SILENCE", Kind::Silence},
                                                                   {"REFUSE", Kind::Refuse}}};

bool perByte(const FaultRule& rule) {
    return rule.kind == Kind::Drop || rule.kind == Kind::Garble || rule.byte > 0;
}

// Reads one NAME=VALUE into the rule; false for an unknown name or a value out of range.
bool readArgument(FaultRule& rule, const std::string& name, std::string_view text) {
    if (name == "WORD") {
        rule.word = upperCase(text);
        return !text.empty();
    }
    const double value = parseNumber(text).value_or(-1);
    const auto whole = static_cast<std::uint64_t>(std::clamp(value, 0.0, 1e15));
    const bool counts = value >= 1 && value == std::floor(value);
    if (name == "BYTE") {
        rule.byte = whole;
        return counts && rule.kind != Kind::Delay && rule.kind != Kind::Refuse;
    }
    if (name == "EXCHANGE") {
        rule.exchange = whole;
        return counts && rule.kind != Kind::Drop && rule.kind != Kind::Garble;
    }
    if (name == "COUNT") {
        rule.count = whole;
        return counts;
    }
    if (name == "P") {
        rule.probability = value;
        return value >= 0 && value <= 1;
    }
    if (name == "MS") {
        rule.seconds = value / 1000;
        return value >= 0 && value <= 1e7;
    }
    if (name == "STATUS") {
        rule.status = static_cast<int>(std::clamp(value, -1.0, 10.0));
        return counts && value <= 9;
    }
    if (name == "STEP") {
        rule.step = static_cast<int>(std::clamp(value, -1.0, 10.0));
        return value == 1 || value == 2;
    }
    return false;
}

}  // namespace

std::optional<FaultRule> parseFault(std::string_view text, std::string& problem) {
    const auto colon = text.find(':');
    const std::string kind = upperCase(text.substr(0, colon));
    const auto* row = std::find_if(kKinds.begin(), kKinds.end(),
                                   [&](const auto& entry) { return entry.first == kind; });
    if (row == kKinds.end()) {
        problem = "unknown fault \"" + std::string(text.substr(0, colon)) + "\"";
        return std::nullopt;
    }
    FaultRule rule;
    rule.kind = row->second;
    std::string_view rest = colon == std::string_view::npos ? "" : text.substr(colon + 1);
    while (!rest.empty()) {
        const auto comma = rest.find(',');
        const std::string_view argument = rest.substr(0, comma);
        rest = comma == std::string_view::npos ? "" : rest.substr(comma + 1);
        const auto equals = argument.find('=');
        if (equals == std::string_view::npos ||
            !readArgument(rule, upperCase(argument.substr(0, equals)),
                          argument.substr(equals + 1))) {
            problem = "\"" + std::string(argument) + "\" does not fit the fault \"" +
                      std::string(row->first) + "\"";
            return std::nullopt;
        }
    }
    const bool placed = rule.byte > 0 || rule.exchange > 0 || !rule.word.empty();
    if (!placed && rule.probability == 0) {
        rule.probability = 1;
    }
    if (rule.count == 0 && rule.kind != Kind::Silence && (rule.byte > 0 || rule.exchange > 0)) {
        rule.count = 1;
    }
    return rule;
}

std::string_view faultHelp() {
    return "Faults, as KIND[:NAME=VALUE,...]; the option can be given several times:\n"
           "  drop     bytes that the instrument sends are lost\n"
           "  garble   bytes that the instrument sends arrive with wrong bits\n"
           "  delay    an answer comes late (ms=M, default 1000)\n"
           "  silence  no answer comes, from the given place on\n"
           "  refuse   the answer is a refusal (status=S, default 4)\n"
           "Where they strike:\n"
           "  byte=N      byte N that is sent, from 1 (drop, garble, silence)\n"
           "  exchange=N  exchange N, from 1 (delay, silence, refuse); each first line begins "
           "one,\n"
           "              the bare CR that wakes the instrument too\n"
           "  word=W      exchanges whose second line has the word W (delay, silence, refuse)\n"
           "  p=P         each byte or exchange with the probability P (default, with P 1)\n"
           "  count=K     K bytes or exchanges at most (default: 1 with byte or exchange, without\n"
           "              end for silence, word and p)\n"
           "  step=1|2    delay, refuse: the answer to the mode word or to the second line (2)\n"
           "Example: --fault garble:p=0.001 --fault refuse:word=TRACEBIN,status=1,count=2\n";
}

FaultPlan::FaultPlan(const std::vector<FaultRule>& rules, std::uint64_t seed)
    : random_(mix(seed ^ 0xFA017ULL)) {
    for (const FaultRule& rule : rules) {
        rules_.push_back({rule});
    }
}

bool FaultPlan::spent(const Armed& armed) const {
    return armed.rule.count > 0 && armed.hits >= armed.rule.count;
}

FaultPlan::Verdict FaultPlan::verdict(int step) const {
    Verdict result;
    for (const Armed& armed : rules_) {
        if (!armed.applies) {
            continue;
        }
        if (armed.rule.kind == Kind::Silence) {
            result.silent = true;
        } else if (armed.rule.step == step && armed.rule.kind == Kind::Delay) {
            result.delay += armed.rule.seconds;
        } else if (armed.rule.step == step && armed.rule.kind == Kind::Refuse) {
            result.refusal = armed.rule.status;
        }
    }
    return result;
}

FaultPlan::Verdict FaultPlan::beginExchange() {
    ++exchange_;
    for (Armed& armed : rules_) {
        armed.applies = false;
        const FaultRule& rule = armed.rule;
        if (perByte(rule) || !rule.word.empty() || spent(armed)) {
            continue;
        }
        armed.applies =
            rule.exchange > 0 ? exchange_ >= rule.exchange : random_.uniform() < rule.probability;
        armed.hits += armed.applies ? 1 : 0;
    }
    return verdict(1);
}

FaultPlan::Verdict FaultPlan::secondLine(std::string_view word) {
    for (Armed& armed : rules_) {
        const FaultRule& rule = armed.rule;
        if (perByte(rule) || rule.word.empty() || spent(armed) || rule.word != upperCase(word)) {
            continue;
        }
        armed.applies = rule.probability == 0 || random_.uniform() < rule.probability;
        armed.hits += armed.applies ? 1 : 0;
    }
    return verdict(2);
}

void FaultPlan::mangle(std::string& bytes) {
    const bool any = std::any_of(rules_.begin(), rules_.end(),
                                 [](const Armed& armed) { return perByte(armed.rule); });
    if (!any) {
        return;
    }
    std::string kept;
    for (char c : bytes) {
        ++byte_;
        bool lost = false;
        for (Armed& armed : rules_) {
            const FaultRule& rule = armed.rule;
            if (!perByte(rule) || spent(armed)) {
                continue;
            }
            const bool hit =
                rule.byte > 0 ? byte_ >= rule.byte : random_.uniform() < rule.probability;
            if (!hit) {
                continue;
            }
            ++armed.hits;
            if (rule.kind == Kind::Garble) {
                const auto bits = static_cast<unsigned>(random_.uniform() * 127) | 0x80U;
                c = static_cast<char>(static_cast<unsigned char>(c) ^ bits);
            } else {
                lost = true;
            }
        }
        if (!lost) {
            kept.push_back(c);
        }
    }
    bytes = std::move(kept);
}

}  // namespace zelsim
