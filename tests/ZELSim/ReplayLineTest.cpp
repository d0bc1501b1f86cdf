#include <gtest/gtest.h>

#include "ZELSim/ReplayLine.h"

namespace zelsim {
namespace {

const char* const kLog =
    "0.000000 start panel\n"
    "0.000000 open sim:\n"
    "0.100000 > 47 45 54 0D |GET.|\n"
    "0.150000 < 30 0D |0.|\n"
    "0.200000 > 49 44 0D |ID.|\n"
    "0.250000 < 41 |A|\n"
    "0.400000 < 42 0D |B.|\n"
    "0.500000 closed\n";

struct ReplayLineTest : ::testing::Test {
    zel::SessionRecord record = zel::parseSession(kLog);
    std::vector<std::string> told;
    void listen(ReplayLine& line) {
        line.differs = [this](const std::string& text) { told.push_back(text); };
    }
};

TEST_F(ReplayLineTest, SameBytes_GetTheRecordedAnswersAtOnce) {
    ReplayLine line(record, false);
    listen(line);
    line.receive("G");
    EXPECT_EQ(line.take(), "");
    line.receive("ET\r");
    EXPECT_EQ(line.take(), "0\r");
    line.receive("ID\r");
    EXPECT_EQ(line.take(), "AB\r");
    EXPECT_TRUE(line.compare().complete());
    EXPECT_TRUE(told.empty());
}

TEST_F(ReplayLineTest, PacedAnswers_ComeAsLateAsTheyDid) {
    ReplayLine line(record, true);
    line.receive("GET\r");
    EXPECT_EQ(line.take(), "");
    EXPECT_DOUBLE_EQ(line.nextDue().value_or(0), 0.05);
    line.advance(0.05);
    EXPECT_EQ(line.take(), "0\r");
    EXPECT_FALSE(line.nextDue());
    line.advance(7);
    line.receive("ID\r");
    line.advance(0.05);
    EXPECT_EQ(line.take(), "A");
    line.advance(0.149999);
    EXPECT_EQ(line.take(), "");
    line.advance(0.000001);
    EXPECT_EQ(line.take(), "B\r");
}

TEST_F(ReplayLineTest, FirstByteThatDiffers_IsNamedOnceAndThenThereIsSilence) {
    ReplayLine line(record, false);
    listen(line);
    line.receive("GET\rIX\rGET\r");
    EXPECT_EQ(told, std::vector<std::string>{"byte 5 differs: 58 instead of 44"});
    EXPECT_EQ(line.take(), "0\r");
    line.receive("ID\r");
    EXPECT_EQ(line.take(), "");
    EXPECT_EQ(told.size(), 1U);
    EXPECT_EQ(line.compare().difference()->event, 4U);
}

TEST_F(ReplayLineTest, BytesBeyondTheRecord_Differ) {
    ReplayLine line(record, false);
    listen(line);
    line.receive("GET\rID\rX");
    EXPECT_EQ(told, std::vector<std::string>{"byte 7 differs: 58 instead of nothing"});
}

TEST_F(ReplayLineTest, DigitsOfAPin_FitTheStarsOfTheRecord) {
    const zel::SessionRecord pin =
        zel::parseSession("0.000000 start\n0.000000 > 3D 2A 2A |=**|\n0.000000 closed\n");
    zel::SessionCompare compare(pin);
    EXPECT_TRUE(compare.sent("=42"));
    zel::SessionCompare other(pin);
    EXPECT_FALSE(other.sent("=4x"));
}

}  // namespace
}  // namespace zelsim
