#include <gtest/gtest.h>

#include <algorithm>
#include <map>

#include "ZELSim/Words.h"
#include "model/InstrumentWords.h"
#include "support/NumberText.h"
#include "support/Text.h"

namespace zel {
namespace {

std::map<std::string, const InstrumentWord*> table() {
    std::map<std::string, const InstrumentWord*> rows;
    for (const InstrumentWord& word : instrumentWords())
        rows[replaceAll(word.word, "?", "")] = &word;
    return rows;
}

TEST(InstrumentWords, EachWordOfTheInstrument_IsInTheTableWithItsVerbs) {
    const auto rows = table();
    EXPECT_EQ(rows.size(), instrumentWords().size()) << "no word twice";
    EXPECT_EQ(rows.size(), zelsim::words().size());
    for (const zelsim::Word& word : zelsim::words()) {
        const auto found = rows.find(std::string(word.name));
        ASSERT_NE(found, rows.end()) << word.name;
        EXPECT_EQ(found->second->verbs, word.verbs) << word.name;
        EXPECT_FALSE(found->second->meaning.empty()) << word.name;
    }
}

TEST(InstrumentWords, CodesOfTheTable_AreThoseThatTheInstrumentTakes) {
    const auto rows = table();
    for (const zelsim::Word& word : zelsim::words()) {
        if (word.kind != zelsim::Kind::Code) continue;
        const InstrumentWord& row = *rows.at(std::string(word.name));
        const std::string values = wordValues(row);
        for (int code = static_cast<int>(word.low); code <= static_cast<int>(word.high); ++code)
            EXPECT_TRUE(contains(", " + values, ", " + std::to_string(code) + " "))
                << word.name << " " << code << ": " << values;
    }
}

TEST(InstrumentWords, Line_HasFourColumns) {
    for (const InstrumentWord& word : instrumentWords()) {
        const std::string line = wordLine(word);
        EXPECT_EQ(std::count(line.begin(), line.end(), '\t'), 3) << line;
        EXPECT_EQ(wordValues(word).empty(), word.verbs == kWordCmd) << line;
    }
}

TEST(InstrumentWords, Codes_AreNamedFromTheProgramsTables) {
    const auto rows = table();
    EXPECT_EQ(wordLine(*rows.at("TRACEDET")),
              "TRACEDET\tDetector\t\t0 Auto Peak, 1 Min Peak, 2 Max Peak, 3 Sample, 4 RMS");
    EXPECT_EQ(wordValues(*rows.at("SWPCONT")), "0 Single, 1 Continuous");
    EXPECT_EQ(wordLine(*rows.at("SPAN")), "SPAN\tSpan; 0 for zero span\tHz\t0 to 3000000000");
}

}  // namespace
}  // namespace zel
