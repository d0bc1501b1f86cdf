#include <gtest/gtest.h>

#include "script/Language.h"
#include "script/ScriptFailure.h"

namespace zel {
namespace {

std::string wordOf(const std::string& line) {
    const Statement* statement = findStatement(statementText(line));
    return statement == nullptr ? "-" : std::string(statement->word);
}

struct Case {
    const char* line;
    const char* word;
};

TEST(Language, EachLine_IsTakenByTheFirstTestThatHolds) {
    const Case cases[] = {
        {"# CTRACE", "#"},
        {"nosave", "NOSAVE"},
        {"NOSAVE X", "-"},
        {"SaveResults out.txt", "SAVERESULTS"},
        {"SAVERESULTS CTRACE.TXT", "SAVERESULTS"},
        {"STEPMODE", "STEPMODE"},
        {"CMD INIT", "CMD "},
        {"CMD", "-"},
        {"SET FREQ,1", "SET "},
        {"SET", "-"},
        {"GET LEVEL", "GET "},
        {"GET", "-"},
        {"GET CTRACE", "CTRACE"},
        {"GETCTRACE", "CTRACE"},
        {"LOADTRACE CTRACE1.TXT", "CTRACE"},
        {"CMD CTRACE", "CMD "},
        {"GET TRACE", "GET TRACE"},
        {"GET TRACEMODE", "GET TRACE"},
        {"GETSWEEP 5", "GETSWEEP"},
        {"QUICK TRACE", "QUICK TRACE"},
        {"QUICKSWEEP 3", "QUICKSWEEP"},
        {"SAVESWEEP", "SAVESWEEP"},
        {"SAVESWEEP X", "-"},
        {"SHOWDIALOG HELLO", "SHOWDIALOG"},
        {"WATERFALL ON", "WATERFALL ON"},
        {"WATERFALL  ON", "-"},
        {"WATERFALL OFF", "WATERFALL OFF"},
        {"AUTORECALL DATA", "AUTORECALL"},
        {"COMMENT GET TRACE", "COMMENT"},
        {"PAUSE 1", "PAUSE"},
        {"DO", "DO"},
        {"DO IT", "-"},
        {"LOOP 3", "LOOP"},
        {"SCANLVLUPPL -20", "SCANLVLUPPL"},
        {"AVGCOUNT 3", "AVGCOUNT"},
        {"SCANLVLLOWL -90", "SCANLVLLOWL"},
        {"SCANSTART 1E8", "SCANSTART"},
        {"SCANSTEP 1E6", "SCANSTEP"},
        {"SCANSTOP 2E8", "SCANSTOP"},
        {"LOADTRACE A.CSV", "LOADTRACE"},
        {"SAVESCREEN A.WMF", "SAVESCREEN"},
        {"  do  ", "DO"},
        {"\tDO", "-"},
        {"\n", "-"},
        {"", "-"},
    };
    for (const Case& row : cases) EXPECT_EQ(wordOf(row.line), row.word) << row.line;
}

TEST(Language, EveryStatement_CutAtEveryCharacter_NeverMatchesAWordThatIsNotThere) {
    for (const Statement& statement : statements()) {
        const std::string shape(statement.shape);
        for (std::size_t length = 0; length <= shape.size(); ++length) {
            const std::string text = statementText(shape.substr(0, length));
            const Statement* found = findStatement(text);
            if (found == nullptr) continue;
            EXPECT_NE(text.find(found->word), std::string::npos) << text;
        }
    }
}

TEST(Language, Argument_LosesTheWordWhereverItStands) {
    const Statement* loop = findStatement("LOOP 3 LOOP");
    EXPECT_EQ(argumentOf(*loop, "LOOP 3 LOOP"), " 3 ");
    const Statement* cmd = findStatement("CMD SAVE,CMDX");
    EXPECT_EQ(argumentOf(*cmd, "CMD SAVE,CMDX"), " SAVE,X");
}

TEST(Language, NearestStatement_FindsWhatWasMeant) {
    const auto nearest = [](const char* line) {
        const Statement* statement = nearestStatement(line);
        return statement == nullptr ? "-" : std::string(statement->word);
    };
    EXPECT_EQ(nearest("SAVERESULT OUT.TXT"), "SAVERESULTS");
    EXPECT_EQ(nearest("PUASE 3"), "PAUSE");
    EXPECT_EQ(nearest("WATERFAL ON"), "WATERFALL ON");
    EXPECT_EQ(nearest("SCANSTRT 100"), "SCANSTART");
    EXPECT_EQ(nearest("QUICK TRCE"), "QUICK TRACE");
    EXPECT_EQ(nearest("GETSWEP"), "GETSWEEP");  // not GET, which it begins with
    EXPECT_EQ(nearest("GETLEVEL"), "GET ");
    EXPECT_EQ(nearest("SETFREQ,1E9"), "SET ");
    EXPECT_EQ(nearest("XYZ"), "-");
    EXPECT_EQ(nearest(""), "-");
}

TEST(Language, WholeNumber_RoundsHalfToEvenAndHasSixteenBits) {
    EXPECT_EQ(wholeNumber(0.5), 0);
    EXPECT_EQ(wholeNumber(1.5), 2);
    EXPECT_EQ(wholeNumber(-2.5), -2);
    EXPECT_EQ(wholeNumber(32767.4), 32767);
    EXPECT_EQ(wholeNumber(-32768), -32768);
    EXPECT_THROW(wholeNumber(32767.5), ScriptFailure);
    EXPECT_THROW(wholeNumber(-32769), ScriptFailure);
    EXPECT_THROW(wholeNumber(1e300), ScriptFailure);
}

TEST(Language, EveryStatement_HasAShapeAndASentence) {
    for (const Statement& statement : statements()) {
        EXPECT_NE(statement.routine, nullptr);
        EXPECT_NE(findStatement(statementText(statement.shape)), nullptr) << statement.shape;
        EXPECT_EQ(statement.help.back(), '.') << statement.word;
    }
}

}  // namespace
}  // namespace zel
