#include <gtest/gtest.h>

#include <array>
#include <memory>
#include <new>
#include <set>
#include <string>

#include "model/ZEL3Variables.h"

namespace zel {
namespace {

class LazyQuery : public ::testing::TestWithParam<const char*> {};

TEST_P(LazyQuery, FirstVisit_AsksAndLaterOnesDoNot) {
    ZEL3Variables mirror;
    EXPECT_FALSE(mirror.GetLazyQuery(GetParam()));
    EXPECT_TRUE(mirror.GetLazyQuery(GetParam()));
    EXPECT_TRUE(mirror.GetLazyQuery(GetParam()));
}

INSTANTIATE_TEST_SUITE_P(MenuWords, LazyQuery,
                         ::testing::Values("FREQ", "SPAN", "AMPT", "BW", "SWEEP", "TRACE", "MEAS",
                                           "MARKER", "TRACKINGGEN", "POWER", "CHANNELPOWER",
                                           "OCCBANDWIDTH", "TDMAPOWER", "DTF"));

TEST(GetLazyQueryTest, EachMenuWord_HasACounterOfItsOwn) {
    ZEL3Variables mirror;
    mirror.GetLazyQuery("FREQ");
    mirror.GetLazyQuery("FREQ");
    EXPECT_FALSE(mirror.GetLazyQuery("SPAN"));
    EXPECT_FALSE(mirror.GetLazyQuery("DTF"));
}

TEST(GetLazyQueryTest, Counters_StandInTheOrderOfTheWords) {
    ZEL3Variables mirror;
    mirror.GetLazyQuery("FREQ");
    mirror.GetLazyQuery("DTF");
    EXPECT_EQ(mirror.MenuVisitCount.front(), 1);
    EXPECT_EQ(mirror.MenuVisitCount.back(), 1);
    EXPECT_EQ(mirror.MenuVisitCount.at(1), 0);
}

TEST(GetLazyQueryTest, OtherWord_IsNeverLazy) {
    ZEL3Variables mirror;
    for (int i = 0; i < 3; ++i) {
        EXPECT_FALSE(mirror.GetLazyQuery("freq"));
        EXPECT_FALSE(mirror.GetLazyQuery(""));
    }
}

TEST(GetLazyQueryTest, LongSession_DoesNotWrapTheCounter) {
    ZEL3Variables mirror;
    mirror.GetLazyQuery("BW");
    for (int i = 0; i < 70000; ++i) ASSERT_TRUE(mirror.GetLazyQuery("BW")) << i;
    EXPECT_EQ(mirror.MenuVisitCount.at(3), 2);
}

TEST(ChannelPowerUnitTextTest, Codes_GiveTheirUnits) {
    EXPECT_EQ(ChannelPowerUnitText(0, "CHNPWR"), "dBm");
    EXPECT_EQ(ChannelPowerUnitText(1, "CHNPWR"), "dBmV");
    EXPECT_EQ(ChannelPowerUnitText(2, "CHNPWR"), "dBuV");
}

TEST(ChannelPowerUnitTextTest, OtherCodeOrKind_GivesNothing) {
    EXPECT_EQ(ChannelPowerUnitText(3, "CHNPWR"), "");
    EXPECT_EQ(ChannelPowerUnitText(-1, "CHNPWR"), "");
    EXPECT_EQ(ChannelPowerUnitText(0, "OBW"), "");
}

TEST(MirrorTest, Fields_StartAtZeroOrEmpty) {
    // On memory that holds other bytes: a field without a start value would keep them.
    alignas(ZEL3Variables) std::array<unsigned char, sizeof(ZEL3Variables)> memory;
    memory.fill(0xA5);
    auto* made = new (memory.data()) ZEL3Variables;
    const std::unique_ptr<ZEL3Variables, void (*)(ZEL3Variables*)> owner(
        made, [](ZEL3Variables* mirror) { mirror->~ZEL3Variables(); });
    for (const Variable& field : variablesOf(*made)) {
        std::visit(
            [&](const auto* value) {
                EXPECT_EQ(*value, std::remove_cvref_t<decltype(*value)>{}) << field.name;
            },
            field.value);
    }
}

TEST(MirrorTest, Fields_AreListedOnceEach) {
    const ZEL3Variables mirror;
    std::set<std::string> names;
    for (const Variable& field : variablesOf(mirror))
        EXPECT_TRUE(names.insert(field.name).second) << field.name;
    EXPECT_EQ(names.size(), 44U);
}

}  // namespace
}  // namespace zel
