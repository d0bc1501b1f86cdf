#include "script/Language.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "script/ScriptFailure.h"
#include "support/CodePage.h"
#include "support/Text.h"

namespace zel {
namespace {

using R = StatementRoutines;
using T = LineTest;
using A = Argument;

// word, test, argument, needs the instrument, routine, shape, help
constexpr auto kStatements = std::to_array<Statement>({
    {"#", T::FirstCharacter, A::Text, false, &R::comment, "# text",
     "A comment; it does nothing and costs no press in step mode."},
    {"NOSAVE", T::Exact, A::None, false, &R::noSave, "NOSAVE",
     "Results of this run are not saved, and nobody is asked for a file."},
    {"SAVERESULTS", T::Prefix, A::File, false, &R::saveResults, "SAVERESULTS file",
     "Sets the file of the results; repeat it after a loop, as a \"*\" in the name stands for the "
     "running index only up to the loop's end."},
    {"STEPMODE", T::Exact, A::None, false, &R::stepMode, "STEPMODE",
     "From here on each statement waits for the Next button."},
    {"CMD ", T::Prefix, A::Command, true, &R::command, "CMD command",
     "Sends a command to the instrument, such as CMD INIT."},
    {"SET ", T::Prefix, A::Setting, true, &R::setting, "SET word,value",
     "Sends a setting to the instrument, such as SET FREQ,100000000."},
    {"GET ", T::Query, A::Word, true, &R::query, "GET word",
     "Asks the instrument and writes the answer into the result file."},
    {"CTRACE", T::Anywhere, A::None, true, &R::complexTrace, "GET CTRACE",
     "Measures complex traces with mean, deviation and phase; any line that holds CTRACE does."},
    {"GETSWEEP", T::Prefix, A::Number, true, &R::getTrace, "GETSWEEP [seconds]",
     "Takes a sweep with all settings read again; the number is the time-out of a trigger."},
    {"GET TRACE", T::Prefix, A::Number, true, &R::getTrace, "GET TRACE [seconds]",
     "Takes a sweep with all settings read again; the number is the time-out of a trigger."},
    {"QUICKSWEEP", T::Prefix, A::Number, true, &R::quickTrace, "QUICKSWEEP [seconds]",
     "Takes a sweep without reading the settings; the number is the time-out of a trigger."},
    {"QUICK TRACE", T::Prefix, A::Number, true, &R::quickTrace, "QUICK TRACE",
     "Takes a sweep without reading the settings; a trigger has the time-out of the statement "
     "before."},
    {"SAVESWEEP", T::Exact, A::None, false, &R::saveSweep, "SAVESWEEP",
     "Appends the trace on the graph to the result file, as a saved view."},
    {"SHOWDIALOG", T::Prefix, A::Text, false, &R::showDialog, "SHOWDIALOG text",
     "Shows a message and waits for OK; CRLF in the text breaks the line."},
    {"WATERFALL ON", T::Exact, A::None, false, &R::waterfallOn, "WATERFALL ON",
     "Shows the waterfall; each further sweep becomes a row of it."},
    {"WATERFALL OFF", T::Exact, A::None, false, &R::waterfallOff, "WATERFALL OFF",
     "Hides the waterfall."},
    {"AUTORECALL", T::Prefix, A::Text, true, &R::autoRecall, "AUTORECALL name",
     "Recalls a dataset of the instrument whose number is the pass of the loop."},
    {"COMMENT", T::Prefix, A::Text, false, &R::writeComment, "COMMENT text",
     "Writes a line into the result file; a lone I in the text puts the pass of the loop first."},
    {"PAUSE", T::Prefix, A::Number, false, &R::pause, "PAUSE seconds",
     "Waits that long; 0 or nothing waits for OK."},
    {"DO", T::Exact, A::None, false, &R::beginLoop, "DO", "The start of the loop."},
    {"LOOP", T::Prefix, A::Whole, false, &R::endLoop, "LOOP passes",
     "The end of the loop; a negative number goes on until Stop."},
    {"SCANLVLUPPL", T::Prefix, A::Number, false, &R::upperLimit, "SCANLVLUPPL level",
     "A scan writes down each frequency with a level above this limit."},
    {"AVGCOUNT", T::Prefix, A::Whole, false, &R::averageCount, "AVGCOUNT traces",
     "How many complex traces a measurement takes."},
    {"SCANLVLLOWL", T::Prefix, A::Number, false, &R::lowerLimit, "SCANLVLLOWL level",
     "A scan writes down each frequency with a level below this limit."},
    {"SCANSTART", T::Prefix, A::Number, true, &R::scanStart, "SCANSTART hertz",
     "Goes to the first frequency of a scan."},
    {"SCANSTEP", T::Prefix, A::Number, true, &R::scanStep, "SCANSTEP hertz",
     "The step of a scan; it returns to the statement after this one."},
    {"SCANSTOP", T::Prefix, A::Number, true, &R::scanStop, "SCANSTOP hertz",
     "Reads the level, tests the limits, and steps on up to this frequency."},
    {"LOADTRACE", T::Prefix, A::File, false, &R::loadTrace, "LOADTRACE file",
     "Shows a saved view; a \"*\" in the name is the pass of the loop."},
    {"SAVESCREEN", T::Prefix, A::File, false, &R::saveScreen, "SAVESCREEN file.wmf",
     "Saves the picture of the graph; a \"*\" in the name is the pass of the loop."},
});

bool holds(const Statement& statement, std::string_view capitals) {
    switch (statement.test) {
        case T::FirstCharacter:
        case T::Prefix:
            return startsWith(capitals, statement.word);
        case T::Exact:
            return capitals == statement.word;
        case T::Query:
            return startsWith(capitals, statement.word) && !contains(capitals, "TRACE");
        case T::Anywhere:
            return contains(capitals, statement.word);
    }
    return false;
}

/// Single insertions, deletions, changes and swaps that lead from one text to the other.
std::size_t editDistance(std::string_view a, std::string_view b) {
    std::vector<std::size_t> before(b.size() + 1);
    std::vector<std::size_t> above(b.size() + 1);
    std::vector<std::size_t> row(b.size() + 1);
    for (std::size_t j = 0; j <= b.size(); ++j) above[j] = j;
    for (std::size_t i = 1; i <= a.size(); ++i) {
        row[0] = i;
        for (std::size_t j = 1; j <= b.size(); ++j) {
            const std::size_t change = above[j - 1] + (a[i - 1] == b[j - 1] ? 0 : 1);
            row[j] = std::min({above[j] + 1, row[j - 1] + 1, change});
            const bool swap = i > 1 && j > 1 && a[i - 1] == b[j - 2] && a[i - 2] == b[j - 1];
            if (swap) row[j] = std::min(row[j], before[j - 2] + 1);
        }
        before.swap(above);
        above.swap(row);
    }
    return above[b.size()];
}

/// What of a line is held against a word: as many words as it has, or as many characters.
std::string_view headOf(std::string_view line, const std::string& word, bool whole) {
    if (!whole) return line.substr(0, word.size());
    std::size_t end = line.find(' ');
    if (word.find(' ') != std::string::npos && end != std::string_view::npos)
        end = line.find(' ', end + 1);
    return line.substr(0, end);
}

}  // namespace

std::span<const Statement> statements() { return kStatements; }

std::string statementText(std::string_view line) {
    std::string text = trimmed(line);
    const auto isEnd = [](char c) { return c == '\r' || c == '\n'; };
    const bool ended = !text.empty() && (isEnd(text.front()) || isEnd(text.back()));
    if (ended) {
        std::string_view inner = text;
        while (!inner.empty() && isEnd(inner.front())) inner.remove_prefix(1);
        while (!inner.empty() && isEnd(inner.back())) inner.remove_suffix(1);
        text = trimmed(inner);
    }
    return upperCaseText(text);
}

const Statement* findStatement(std::string_view capitals) {
    for (const Statement& statement : kStatements)
        if (holds(statement, capitals)) return &statement;
    return nullptr;
}

bool isCommandValid(std::string_view) { return true; }

std::string argumentOf(const Statement& statement, std::string_view capitals) {
    const bool wordEndsInBlank = statement.word.back() == ' ';
    const std::string_view word =
        wordEndsInBlank ? statement.word.substr(0, statement.word.size() - 1) : statement.word;
    return replaceAll(capitals, word, "");
}

const Statement* nearestStatement(std::string_view capitals) {
    constexpr std::size_t kLongestWord = 24;
    const std::string_view line = capitals.substr(0, kLongestWord);
    // GETSWEP is nearer to GETSWEEP than to GET: whole words count before their beginnings.
    for (const bool whole : {true, false}) {
        const Statement* nearest = nullptr;
        std::size_t least = 0;
        for (const Statement& statement : kStatements) {
            const std::string word = trimmed(statement.word);
            if (word.size() < 2) continue;
            const std::size_t distance = editDistance(headOf(line, word, whole), word);
            if (distance > std::max<std::size_t>(1, word.size() / 3)) continue;
            if (nearest != nullptr && distance >= least) continue;
            nearest = &statement;
            least = distance;
        }
        if (nearest != nullptr) return nearest;
    }
    return nullptr;
}

std::int16_t wholeNumber(double value) {
    const double rounded = std::nearbyint(value);
    if (!(rounded >= -32768 && rounded <= 32767)) throw ScriptFailure(kOverflow);
    return static_cast<std::int16_t>(rounded);
}

}  // namespace zel
