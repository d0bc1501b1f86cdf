// Entries that the instrument did not take, in the window.

#include <QComboBox>
#include <QTest>

#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

class EntryMarksTest : public WindowTest {
  protected:
    void SetUp() override {
        connect();
        show();
        panel().SetOption.Click();
    }
    QLineEdit* box(int position) { return widgetOf<QLineEdit>(panel().SoftTextBox(position)); }
    bool struck(int position) { return box(position)->property("struck").toBool(); }
    std::string beside(int position) {
        return window->side()
            .refusals()
            .at(static_cast<std::size_t>(position))
            ->text()
            .toStdString();
    }
    void sendLine(const char* setting) {
        for (const char* line : {"SET", setting}) {
            panel().ManualCommandText.Text = line;
            panel().SendButton.Click();
        }
    }
    void enter(int position, const char* text) {
        QLineEdit* line = box(position);
        line->setFocus();
        line->selectAll();
        QTest::keyClicks(line, text);
        QTest::keyClick(line, Qt::Key_Return);
        show();
    }
};

TEST_F(EntryMarksTest, RefusedTime_IsStruckUntilTheNextText) {
    panel().SweepButton.Click();
    show();
    enter(0, "100000 s");
    EXPECT_TRUE(struck(0));
    EXPECT_EQ(beside(0), "refused: out of range");
    EXPECT_FALSE(struck(1));
    enter(0, "1 s");
    EXPECT_FALSE(struck(0));
    EXPECT_EQ(beside(0), "");
}

TEST_F(EntryMarksTest, RefusedChoice_IsStruckUntilTheInstrumentIsAsked) {
    panel().ChnPwrButton.Click();
    show();
    auto* list = widgetOf<QComboBox>(panel().ChoiceBox(1));
    const auto struckList = [list] { return list->property("struck").toBool(); };
    emit list->activated(1);
    show();
    EXPECT_FALSE(struckList());
    // By the line, so that the panel does not know of the other mode.
    sendLine("MEAS,1");
    emit list->activated(2);
    show();
    EXPECT_TRUE(struckList());
    EXPECT_EQ(beside(1), "refused: not in this mode");
    sendLine("MEAS,4");
    panel().GetOption.Click();
    panel().SoftKey(1).Click();
    show();
    EXPECT_FALSE(struckList());
    EXPECT_EQ(beside(1), "");
}

TEST_F(EntryMarksTest, AnotherMenu_HasNoMarks) {
    panel().SweepButton.Click();
    show();
    enter(0, "100000 s");
    ASSERT_TRUE(struck(0));
    panel().FrequencyButton.Click();
    show();
    EXPECT_FALSE(struck(0));
    EXPECT_EQ(beside(0), "");
}

TEST_F(EntryMarksTest, RefusedCentre_IsWhatTheInstrumentHasAfterItsSweep) {
    enter(1, "100 MHz");
    enter(0, "9 GHz");
    EXPECT_EQ(panel().CFLabel.Caption.get(), "Center: 1.5 GHz");
    EXPECT_EQ(box(0)->text().toStdString(), "1.5 GHz");
    EXPECT_EQ(box(2)->text().toStdString(), "1.45 GHz");
    EXPECT_EQ(box(3)->text().toStdString(), "1.55 GHz");
    for (int position = 0; position < 4; ++position) {
        EXPECT_FALSE(struck(position)) << position;
        EXPECT_EQ(beside(position), "") << position;
    }
}

TEST_F(EntryMarksTest, UnsureCentre_StrikesWhatRestsOnIt) {
    program->variables().Unsure.sent("FREQ", false);
    show();
    for (const int position : {0, 2, 3}) {
        EXPECT_TRUE(struck(position)) << position;
        EXPECT_EQ(beside(position), "unsure") << position;
    }
    EXPECT_FALSE(struck(1));
    program->variables().Unsure.known("FREQ");
    show();
    EXPECT_FALSE(struck(0));
}

TEST_F(EntryMarksTest, CentreNearTheEdge_ShowsTheSpanThatIsLeftEverywhere) {
    enter(0, "2.4 GHz");
    EXPECT_EQ(box(1)->text().toStdString(), "1.2 GHz");
    EXPECT_EQ(widgetOf<QLabel>(panel().SpanLabel)->text().toStdString(), "Span: 1.2 GHz");
}

}  // namespace
}  // namespace zel
