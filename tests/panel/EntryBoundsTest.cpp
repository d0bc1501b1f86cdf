// The numbers that a word of the instrument can hold, and those that it cannot.

#include <gtest/gtest.h>

#include <string>

#include "tests/panel/Panel.h"

namespace zel {
namespace {

struct EntryBoundsTest : PanelSession, ::testing::Test {};

TEST_F(EntryBoundsTest, NumberThatItsWordCannotHold_IsRefusedInABoxAndNotSent) {
    const struct {
        Menu menu;
        int box;
        const char* text;
    } rows[] = {{kChnPower, 3, "32768"},    {kChnPower, 3, "-32769"}, {kOccBW, 2, "2147483648"},
                {kOccBW, 2, "-2147483649"}, {kTdma, 2, "2147483648"}, {kTracking, 4, "3G"}};
    for (const auto& row : rows) {
        boxes.clear();
        open(row.menu);
        mirror.OccBWChannelBandwidth = 5;
        type(row.box, row.text);
        enter(row.box);
        EXPECT_EQ(port.written(), "");
        ASSERT_EQ(boxes.boxes().size(), 1U) << row.text;
        EXPECT_EQ(boxes.boxes()[0].text, "Out of Range!");
        EXPECT_EQ(boxes.boxes()[0].icon, BoxIcon::Plain);
        EXPECT_EQ(mirror.OccBWChannelBandwidth, 5);
        EXPECT_TRUE(panel.GetOption.Value());
        EXPECT_EQ(panel.MousePointer.get(), 0);
    }
}

TEST_F(EntryBoundsTest, LargestNumbersOfTheirWords_AreSent) {
    open(kChnPower);
    for (const char* value : {"32767", "-32768"}) {
        type(3, value);
        set(std::string("CHPWRUNIT,") + value);
        enter(3);
    }
    expectPlayed();
    visited();
    panel.InstrumentMode = CF::OCCBANDWIDTH;
    panel.OccBWButton.Click();
    type(2, "2147483647.9");  // its fraction is cut first
    set("OBWCHBW,2147483647");
    enter(2);
    type(2, "-2147483648");
    set("OBWCHBW,-2147483648");
    enter(2);
    expectPlayed();
    EXPECT_EQ(boxes.texts(), Texts{});
}

}  // namespace
}  // namespace zel
