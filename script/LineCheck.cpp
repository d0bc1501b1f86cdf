#include "script/LineCheck.h"

#include <cmath>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "model/Numeric.h"
#include "script/Language.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr double kLowestWhole = -32768.5;
constexpr double kHighestWhole = 32767.5;

/// What has gone by, as far as it bears on a line.
struct Passed {
    bool inLoop = false;
    bool loopBegun = false;
    bool scanStep = false;
};

bool beginsAsNumber(const std::string& text) {
    const auto first = text.find_first_not_of(" +-.,");
    return first != std::string::npos && text[first] >= '0' && text[first] <= '9';
}

std::string quoted(std::string_view text) { return "\"" + std::string(text) + "\""; }

std::string numberFinding(const Statement& statement, const std::string& argument) {
    if (argument.empty()) return {};
    if (!beginsAsNumber(argument)) return quoted(argument) + " is no number and counts as 0.";
    const double value = ParseNumberInvariant(argument);
    const bool whole = statement.argument == Argument::Whole;
    if (whole && (value < kLowestWhole || value > kHighestWhole))
        return quoted(argument) + " is beyond 32767 and ends the run.";
    return {};
}

std::string fileFinding(const Statement& statement, const std::string& argument) {
    if (argument.size() > 1 && argument[1] == ':')
        return "A name with a drive letter cannot be opened on every system.";
    const bool screen = statement.word == "SAVESCREEN";
    if (screen && !argument.empty() && !contains(argument, "WMF"))
        return "The file you specified is not a WMF file.";
    if (!screen && argument.empty()) return "The name of the file is missing.";
    return {};
}

std::string flowFinding(const Statement& statement, const Passed& passed) {
    if (statement.word == "LOOP" && !passed.loopBegun)
        return "There is no DO before; the run returns to the second statement.";
    if (statement.word == "SCANSTOP" && !passed.scanStep)
        return "There is no SCANSTEP before; the run returns to the second statement.";
    if (statement.word == "AUTORECALL" && !passed.inLoop)
        return "The filenames can only be genarated automatically within a loop.";
    return {};
}

std::string argumentFinding(const Statement& statement, const std::string& argument) {
    switch (statement.argument) {
        case Argument::Number:
        case Argument::Whole:
            return numberFinding(statement, argument);
        case Argument::File:
            return fileFinding(statement, argument);
        case Argument::Setting:
            return contains(argument, ",") ? std::string()
                                           : "A setting is a word, a comma and a value.";
        default:
            return {};
    }
}

void pass(const Statement& statement, Passed& passed) {
    if (statement.word == "DO") passed.inLoop = passed.loopBegun = true;
    if (statement.word == "LOOP") passed.inLoop = false;
    if (statement.word == "SCANSTEP") passed.scanStep = true;
}

std::string ignoredText(const std::string& capitals) {
    std::string text = "This line is no statement and is ignored";
    if (const Statement* nearest = nearestStatement(capitals))
        text += "; did you mean " + trimmed(nearest->word) + "?";
    return text.back() == '?' ? text : text + ".";
}

}  // namespace

std::vector<ScriptLine> scriptLines(std::string_view text) {
    std::vector<ScriptLine> lines;
    for (int number = 1; !text.empty(); ++number) {
        const auto end = text.find_first_of("\r\n");
        const std::string_view piece = text.substr(0, end);
        if (piece.find_first_not_of(" \t") != std::string_view::npos)
            lines.push_back({number, std::string(piece)});
        if (end == std::string_view::npos) break;
        const bool pair = text[end] == '\r' && end + 1 < text.size() && text[end + 1] == '\n';
        text.remove_prefix(end + (pair ? 2 : 1));
    }
    return lines;
}

std::vector<LineFinding> checkScript(std::string_view text) {
    std::vector<LineFinding> findings;
    Passed passed;
    for (const ScriptLine& line : scriptLines(text)) {
        const std::string capitals = statementText(line.text);
        const Statement* statement = findStatement(capitals);
        if (statement == nullptr) {
            findings.push_back({line.line, true, ignoredText(capitals)});
            continue;
        }
        std::string finding = flowFinding(*statement, passed);
        if (finding.empty())
            finding = argumentFinding(*statement, trimmed(argumentOf(*statement, capitals)));
        pass(*statement, passed);
        if (!finding.empty()) findings.push_back({line.line, false, std::move(finding)});
    }
    return findings;
}

}  // namespace zel
