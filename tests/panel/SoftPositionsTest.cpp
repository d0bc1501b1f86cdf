#include <gtest/gtest.h>

#include <set>
#include <string>

#include "panel/SoftPositions.h"

namespace zel {
namespace {

using CF = ControllerForm;

TEST(SoftPositionsTest, EachMenu_HasItsFiveKeysInOrder) {
    std::set<std::int16_t> states;
    int key = 0;
    for (const SoftPosition& position : softPositions()) {
        EXPECT_EQ(position.key, key);
        if (key == 0) {
            EXPECT_TRUE(states.insert(position.state).second) << position.state;
        }
        EXPECT_TRUE(states.count(position.state) == 1) << position.state;
        key = (key + 1) % 5;
    }
    EXPECT_EQ(key, 0);
    EXPECT_EQ(states.size(), 16U);
}

TEST(SoftPositionsTest, Row_IsFoundByMenuAndKey) {
    const SoftPosition* position = softPosition(CF::AMPT, 3);
    ASSERT_NE(position, nullptr);
    EXPECT_EQ(std::string(position->word), "REFLVLOFFS");
    EXPECT_EQ(position->entryUnit, EntryUnit::Decibels);
    EXPECT_EQ(softPosition(CF::AMPT, 5), nullptr);
    EXPECT_EQ(softPosition(0, 0), nullptr);
    EXPECT_TRUE(softPositions(0).empty());
    EXPECT_EQ(softPositions(CF::DISTFAULT).size(), 5U);
}

TEST(SoftPositionsTest, MenuWords_LeadBackToTheirMenus) {
    for (std::int16_t state = CF::AMPT; state <= CF::DISTFAULT; ++state) {
        const bool filled = state != CF::TRACKINGGEN && state != CF::POWER;
        EXPECT_EQ(!menuWord(state).empty(), filled) << state;
        if (filled) {
            EXPECT_EQ(menuOf(menuWord(state)), state);
        }
    }
    EXPECT_EQ(menuOf("TRACKINGGEN"), 0);
    EXPECT_EQ(menuWord(CF::MEAS_TRD), "");
}

TEST(SoftPositionsTest, ChannelEntries_GoOutUnderOtherWordsThanTheirQueries) {
    EXPECT_EQ(std::string(softPosition(CF::CHNPOWER, 0)->wordToSet()), "CHPWRSTD");
    EXPECT_EQ(std::string(softPosition(CF::CHNPOWER, 3)->wordToSet()), "CHPWRUNIT");
    EXPECT_EQ(softPosition(CF::CHNPOWER, 3)->fieldToSet().index(), 0U);
    EXPECT_EQ(std::string(softPosition(CF::CHNPOWER, 3)->word), "CHPWRBW");
}

}  // namespace
}  // namespace zel
