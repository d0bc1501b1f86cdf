// The large reading of the power sensor and its history.

#include "desktop/windows/PowerDisplay.h"
#include "link/CommandExchange.h"
#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

struct PowerDisplayTest : WindowTest {
    PowerDisplayTest() {
        connect();
        show();
        for (QWidget* child : window->findChildren<QWidget*>())
            if (auto* found = dynamic_cast<PowerDisplay*>(child)) display = found;
    }
    void read(int times) {
        for (int i = 0; i < times; ++i) panel().PlaySingleButton.Click();
        show();
    }
    PowerDisplay* display = nullptr;
};

TEST_F(PowerDisplayTest, EachReadingCounts_AlsoAnEqualOne) {
    panel().PwrButton.Click();
    show();
    ASSERT_NE(display, nullptr);
    const std::size_t first = display->history().size();
    read(5);
    EXPECT_EQ(display->history().size(), first + 5);
}

TEST_F(PowerDisplayTest, ReadingByTheSoftKeyCounts) {
    panel().PwrButton.Click();
    read(1);
    const std::size_t before = display->history().size();
    std::string value;
    ASSERT_TRUE(program->exchange().GetInstrument("PWR", value));
    EXPECT_EQ(display->history().size(), before + 1);
}

TEST_F(PowerDisplayTest, ChangeOfTheBoxIsNoReading) {
    panel().PwrButton.Click();
    read(3);
    const std::deque<double> before = display->history();
    panel().SoftTextBox(0).Text = "17 dBm";
    panel().SoftTextBox(0).Text = "";
    show();
    EXPECT_EQ(display->history(), before);
}

TEST_F(PowerDisplayTest, AnotherModeForgetsTheReadings) {
    panel().PwrButton.Click();
    read(3);
    ASSERT_GE(display->history().size(), 3U);
    panel().FrequencyButton.Click();
    panel().InstrumentMode = ControllerForm::ANALYZER;
    panel().CWGraph1.noteChange();
    show();
    EXPECT_TRUE(display->history().empty());
    std::string value;
    ASSERT_TRUE(program->exchange().GetInstrument("PWR", value));
    EXPECT_TRUE(display->history().empty());
}

TEST_F(PowerDisplayTest, FewReadingsUseTheWidth) {
    ASSERT_NE(display, nullptr);
    display->clear();
    const std::pair<int, std::size_t> spans[] = {{2, 10},   {10, 10},   {11, 20},   {50, 50},
                                                 {51, 100}, {201, 300}, {300, 300}, {450, 300}};
    int taken = 0;
    for (const auto& [readings, span] : spans) {
        for (; taken < readings; ++taken) display->take("-30");
        EXPECT_EQ(display->span(), span) << readings;
    }
    EXPECT_EQ(display->history().size(), 300U);
}

TEST_F(PowerDisplayTest, AnswerThatIsNoNumber_IsNoReading) {
    panel().PwrButton.Click();
    read(1);
    const std::deque<double> before = display->history();
    display->take("");
    display->take("OVL");
    EXPECT_EQ(display->history(), before);
}

}  // namespace
}  // namespace zel
