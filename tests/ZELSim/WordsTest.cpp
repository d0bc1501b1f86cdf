#include <filesystem>
#include <fstream>
#include <iterator>
#include <regex>
#include <set>
#include <string>

#include "ZELSim/Words.h"
#include "panel/SoftPositions.h"
#include "tests/ZELSim/WireFixture.h"

namespace zelsim {
namespace {

unsigned bit(Verb verb) { return static_cast<unsigned>(verb); }

int firstMode(const Word& word) {
    for (int mode = 1; mode <= 8; ++mode) {
        if ((word.modes >> static_cast<unsigned>(mode) & 1U) != 0) {
            return mode;
        }
    }
    return 0;
}

TEST(Words, EachName_StandsOnceAndIsFound) {
    std::set<std::string_view> names;
    for (const Word& word : words()) {
        EXPECT_TRUE(names.insert(word.name).second) << word.name;
        EXPECT_EQ(findWord(word.name), &word);
    }
}

TEST(Words, EachWordThatTheProgramSends_IsInTheTable) {
    // As the sources name them where they speak to the instrument, and the soft positions' table.
    const std::regex call(
        "\\b(CmdInstrument|CmdInstrumentTriggered|SetInstrument|GetInstrument|QueryToSoftBox|"
        "ReadPowerValue|queryCode|query|command|answered)\\(\\s*\"([A-Z][A-Z0-9_]+)");
    std::set<std::string> names;
    for (const char* room : {"link", "trace", "files", "panel", "connection", "script", "shell"}) {
        const std::filesystem::path folder = std::filesystem::path(ZEL_SOURCE_DIR) / room;
        if (!std::filesystem::exists(folder)) continue;
        for (const auto& entry : std::filesystem::directory_iterator(folder)) {
            if (entry.path().extension() != ".cpp") continue;
            std::ifstream stream(entry.path());
            const std::string text{std::istreambuf_iterator<char>(stream), {}};
            for (std::sregex_iterator at(text.begin(), text.end(), call), end; at != end; ++at)
                names.insert((*at)[2]);
        }
    }
    for (const zel::SoftPosition& position : zel::softPositions()) {
        for (const char* word : {position.word, position.wordToSet()})
            if (*word != 0) names.insert(word);
    }
    EXPECT_GT(names.size(), 50U);
    for (const std::string& name : names) {
        EXPECT_NE(findWord(name), nullptr) << name;
    }
}

TEST(Words, EachQuery_IsAnsweredInEachModeThatItBelongsTo) {
    for (const Word& word : words()) {
        for (int mode = 1; mode <= 8; ++mode) {
            if ((word.verbs & bit(Verb::Get)) == 0) {
                continue;
            }
            Host host;
            host.setUp({"MARK1ON,1", "DELTA1ON,1", "MEAS," + std::to_string(mode)});
            const std::string answer = host.get(word.name);
            const bool allowed = (word.modes >> static_cast<unsigned>(mode) & 1U) != 0;
            EXPECT_EQ(answer.substr(0, 2), allowed ? "0\r" : "2\r") << word.name << mode;
            EXPECT_EQ(answer.size() > 2, allowed) << word.name << mode;
        }
    }
}

TEST(Words, EachSettableWord_TakesItsOwnAnswerBack) {
    for (const Word& word : words()) {
        if ((word.verbs & bit(Verb::Set)) == 0) {
            continue;
        }
        Host host;
        host.setUp({"MARK1ON,1", "DELTA1ON,1", "MEAS," + std::to_string(firstMode(word))});
        std::string value = host.value(word.name);
        value = value.substr(0, value.find(','));  // of a marker's two numbers the x
        EXPECT_EQ(host.set(std::string(word.name) + "," + value), "0\r") << word.name << value;
        const std::string after = host.value(word.name);
        EXPECT_EQ(after.substr(0, after.find(',')), value) << word.name;
    }
}

TEST(Words, EachCode_IsTakenFromFirstToLastAndReadBack) {
    for (const Word& word : words()) {
        if (word.kind != Kind::Code || (word.verbs & bit(Verb::Set)) == 0) {
            continue;
        }
        for (double code = word.low; code <= word.high; ++code) {
            Host host;
            host.setUp({"MEAS," + std::to_string(firstMode(word))});
            const std::string text = numberText(code, 0);
            EXPECT_EQ(host.set(std::string(word.name) + "," + text), "0\r") << word.name << text;
            EXPECT_EQ(host.value(word.name), text) << word.name;
        }
    }
}

TEST(Words, EachCommand_IsAccepted) {
    for (const Word& word : words()) {
        if ((word.verbs & bit(Verb::Cmd)) == 0 || word.name == "WAIT") {
            continue;
        }
        Host host;
        host.setUp({"MARK1ON,1", "MARK1,1000000000", "MEAS," + std::to_string(firstMode(word))});
        EXPECT_EQ(host.cmd("SAVE"), "0\r");
        EXPECT_EQ(host.cmd(word.name), "0\r") << word.name;
    }
}

TEST(Words, Frequency_NarrowsTheSpanAtTheEdgeOfTheRange) {
    Host host;
    host.setUp({"FREQ,100000000"});
    EXPECT_EQ(host.value("SPAN"), "200000000");
}

TEST(Words, FullSpan_MovesTheCentre) {
    Host host;
    host.setUp({"FREQ,100000000", "SPAN,3000000000"});
    EXPECT_EQ(host.value("FREQ"), "1500000000");
}

TEST(Words, FrequencyOffset_IsPartOfTheShownFrequency) {
    Host host;
    host.setUp({"FREQ,1000000000", "FREQOFFS,5000000"});
    EXPECT_EQ(host.value("FREQ"), "1005000000");
    EXPECT_EQ(host.set("FREQ,1000000000"), "0\r");
    EXPECT_EQ(host.value("FREQ"), "1000000000");
}

TEST(Words, ReferenceLevel_FollowsTheUnit) {
    Host host;
    host.setUp({"UNIT,1"});
    EXPECT_NEAR(host.number("REFLVL"), 26.99, 0.005);
    EXPECT_EQ(host.set("UNIT,6"), "0\r");
    EXPECT_NEAR(host.number("REFLVL"), 0.02236, 1e-5);
    EXPECT_EQ(host.set("REFLVL,0.1"), "0\r");
    EXPECT_EQ(host.set("UNIT,7"), "0\r");
    EXPECT_NEAR(host.number("REFLVL"), 0.1 * 0.1 / 50, 1e-9);
    EXPECT_EQ(host.set("REFLVL,0"), "5\r");
}

TEST(Words, SweepTimeZero_CouplesIt) {
    Host host;
    host.setUp({"SWPTIME,3"});
    EXPECT_EQ(host.value("SWPTIME"), "3");
    EXPECT_EQ(host.set("SWPTIME,0"), "0\r");
    EXPECT_EQ(host.value("SWPTIME"), "0.02");
}

TEST(Words, CoupledSweepTime_GrowsWithNarrowFilters) {
    Host host;
    host.setUp({"SPAN,10000000", "RBW,5"});  // 10 MHz through 10 kHz
    EXPECT_NEAR(host.number("SWPTIME"), 0.25, 1e-9);
}

TEST(Words, PowerSensorAndTdma_HaveDifferentMeasurementTimes) {
    Host host;
    host.setUp({"MEAS,3"});
    EXPECT_EQ(host.value("MEASTIME"), "1");
    EXPECT_EQ(host.set("MEASTIME,3"), "5\r");
    EXPECT_EQ(host.set("MEAS,6"), "0\r");
    EXPECT_NEAR(host.number("MEASTIME"), 470e-6, 1e-12);
    EXPECT_EQ(host.set("MEASTIME,1"), "0\r");
    EXPECT_EQ(host.value("MEASTIME"), "1");
}

TEST(Words, Texts_AreBoundedAndPrintable) {
    Host host;
    host.setUp({"TRD1,Antenna 1"});
    EXPECT_EQ(host.value("TRD1"), "Antenna 1");
    EXPECT_EQ(host.set("TRD1,"), "1\r");
    EXPECT_EQ(host.set("TRD1,\xE9t\xE9"), "1\r");
    EXPECT_EQ(host.set("TRD1," + std::string(33, 'x')), "5\r");
    EXPECT_EQ(host.set("TRD1,none"), "0\r");
    EXPECT_EQ(host.value("TRD1"), "NONE");
}

}  // namespace
}  // namespace zelsim
