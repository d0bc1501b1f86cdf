#include "analysis/MaskWatch.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "analysis/LiveTrace.h"
#include "analysis/Mask.h"
#include "files/SweepFile.h"
#include "support/NumberText.h"
#include "trace/Sweep.h"

namespace zel {
namespace {

/// Every place of `mark` in a word becomes `text`; what was put in is not looked at again.
std::string filled(const std::string& word,
                   const std::vector<std::pair<std::string, std::string>>& values) {
    std::string result;
    for (std::size_t at = 0; at < word.size();) {
        const auto found = std::find_if(values.begin(), values.end(), [&](const auto& value) {
            return word.compare(at, value.first.size(), value.first) == 0;
        });
        if (found == values.end()) {
            result += word[at++];
        } else {
            result += found->second;
            at += found->first.size();
        }
    }
    return result;
}

std::string counted(std::uint64_t number, const std::string& what) {
    return std::to_string(number) + " " + what + (number == 1 ? "" : "s");
}

}  // namespace

std::optional<std::vector<std::string>> commandWords(const std::string& line) {
    std::vector<std::string> words;
    std::string word;
    bool begun = false;
    bool quoted = false;
    for (std::size_t i = 0; i < line.size(); ++i) {
        const char sign = line[i];
        const bool blank = sign == ' ' || sign == '\t';
        if (quoted && sign == '"' && i + 1 < line.size() && line[i + 1] == '"') {
            word += line[++i];
        } else if (sign == '"') {
            quoted = !quoted;
            begun = true;
        } else if (blank && !quoted) {
            if (begun) words.push_back(word);
            word.clear();
            begun = false;
        } else {
            word += sign;
            begun = true;
        }
    }
    if (quoted) return std::nullopt;
    if (begun) words.push_back(word);
    return words;
}

void MaskWatch::set(WatchSettings settings) {
    settings_ = std::move(settings);
    due_ = 0;
    saved_ = started_ = passedOver_ = 0;
    problem_.clear();
    fileProblem_.clear();
    commandProblem_.clear();
}

void MaskWatch::report(std::string& last, const std::string& problem) {
    const bool news = !problem.empty() && problem != last;
    last = problem;
    problem_ = fileProblem_.empty() ? commandProblem_ : fileProblem_;
    if (news && Problem) Problem(problem);
}

void MaskWatch::follow() {
    const std::optional<int> status = runner_.ended();
    if (!status) return;
    report(commandProblem_, *status == 0 ? std::string()
                                         : "The command " + running_ + " ended with status " +
                                               std::to_string(*status));
}

void MaskWatch::save(const Sweep& sweep) {
    const std::string problem = appendSweep(files_, settings_.file, sweep, clock_);
    if (problem.empty()) ++saved_;
    report(fileProblem_, problem);
}

void MaskWatch::run(const Sweep& sweep, const MaskVerdict& verdict) {
    if (runner_.running()) {
        ++passedOver_;
        return;
    }
    std::vector<std::string> words;
    for (const std::string& word : settings_.command)
        words.push_back(filled(word, {{"{x}", shortestNumber(verdict.x)},
                                      {"{margin}", shortestNumber(verdict.margin.value_or(0))},
                                      {"{time}", isoTimeOf(sweep.time)},
                                      {"{file}", settings_.file}}));
    const std::string problem = runner_.start(words);
    if (problem.empty()) {
        ++started_;
        running_ = words.front();
    } else {
        report(commandProblem_, problem);
    }
}

void MaskWatch::take(const Sweep& sweep, const MaskVerdict& verdict) {
    if (!settings_.any() || !sweep.whole()) return;
    if (!settings_.command.empty()) follow();
    if (!verdict.pass) due_ = settings_.after + 1;
    if (due_ > 0) {
        --due_;
        if (!settings_.file.empty()) save(sweep);
    }
    if (!verdict.pass && !settings_.command.empty()) run(sweep, verdict);
}

std::string MaskWatch::text() const {
    std::string text;
    const auto add = [&text](const std::string& part) {
        text += (text.empty() ? "" : ", ") + part;
    };
    if (saved_ > 0) add(counted(saved_, "sweep") + " saved");
    if (started_ > 0) add(counted(started_, "command") + " started");
    if (passedOver_ > 0) add(std::to_string(passedOver_) + " passed over while one ran");
    return text;
}

}  // namespace zel
