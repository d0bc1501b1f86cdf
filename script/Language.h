#pragma once
// The language of the measurement scripts: one table of statements, which the run, the check, the
// editor and the help read.

#include <cstdint>
#include <span>
#include <string>
#include <string_view>

namespace zel {

/// What carries statements out, a routine a row of the table. `line` is in capitals, without
/// blanks at its ends; `argument` is the line without the statement's word.
class StatementRoutines {
  public:
    struct Line {
        const std::string& text;
        std::string argument;
    };
    virtual ~StatementRoutines() = default;
    virtual void comment(const Line& line) = 0;
    virtual void noSave(const Line& line) = 0;
    virtual void saveResults(const Line& line) = 0;
    virtual void stepMode(const Line& line) = 0;
    virtual void command(const Line& line) = 0;
    virtual void setting(const Line& line) = 0;
    virtual void query(const Line& line) = 0;
    virtual void complexTrace(const Line& line) = 0;
    virtual void getTrace(const Line& line) = 0;
    virtual void quickTrace(const Line& line) = 0;
    virtual void saveSweep(const Line& line) = 0;
    virtual void showDialog(const Line& line) = 0;
    virtual void waterfallOn(const Line& line) = 0;
    virtual void waterfallOff(const Line& line) = 0;
    virtual void autoRecall(const Line& line) = 0;
    virtual void writeComment(const Line& line) = 0;
    virtual void pause(const Line& line) = 0;
    virtual void beginLoop(const Line& line) = 0;
    virtual void endLoop(const Line& line) = 0;
    virtual void upperLimit(const Line& line) = 0;
    virtual void averageCount(const Line& line) = 0;
    virtual void lowerLimit(const Line& line) = 0;
    virtual void scanStart(const Line& line) = 0;
    virtual void scanStep(const Line& line) = 0;
    virtual void scanStop(const Line& line) = 0;
    virtual void loadTrace(const Line& line) = 0;
    virtual void saveScreen(const Line& line) = 0;
};

enum class LineTest : std::uint8_t {
    FirstCharacter,
    Exact,
    Prefix,
    Query,     ///< begins with the word and holds no "TRACE"
    Anywhere,  ///< the word stands anywhere in the line
};

enum class Argument : std::uint8_t {
    None,
    Text,
    File,
    Command,  ///< a word of the instrument
    Setting,  ///< word, comma, value
    Word,     ///< a word that the instrument answers
    Number,
    Whole,  ///< a number that is rounded; at most 16 bits
};

struct Statement {
    std::string_view word;
    LineTest test;
    Argument argument;
    bool needsInstrument;
    void (StatementRoutines::*routine)(const StatementRoutines::Line& line);
    std::string_view shape;  ///< as it is written, "PAUSE seconds"
    std::string_view help;   ///< one sentence
};

/// All statements, in the order in which a line is tested.
std::span<const Statement> statements();
/// The capitals of a line without blanks and line ends around it.
std::string statementText(std::string_view line);
/// The first statement whose test holds for the capitals; null for a line that does nothing.
const Statement* findStatement(std::string_view capitals);
/// The line without the statement's word, wherever that occurs.
std::string argumentOf(const Statement& statement, std::string_view capitals);
/// The place for a check of a command's syntax; every command passes.
bool isCommandValid(std::string_view command);
/// The statement that an ignored line was most likely meant for; null where none is near.
const Statement* nearestStatement(std::string_view capitals);

/// Rounded half to even. Throws `ScriptFailure` beyond 16 bits.
std::int16_t wholeNumber(double value);

}  // namespace zel
