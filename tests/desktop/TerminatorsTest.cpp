// Numeric entry: terminator keys, digits without a focus, pastes.

#include <QClipboard>
#include <QTest>

#include "desktop/windows/Terminators.h"
#include "panel/TriggerKey.h"
#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

class EntryTest : public WindowTest {
  protected:
    void SetUp() override {
        connect();
        show();
    }
    TerminatorRow& row() {
        return *static_cast<TerminatorRow*>(window->findChild<QWidget*>("TerminatorRow"));
    }
    QLineEdit* box(int position) { return widgetOf<QLineEdit>(panel().SoftTextBox(position)); }
    QStringList captions() {
        row().refresh();
        QStringList texts;
        for (const QPushButton* key : row().keys())
            if (key->isVisible()) texts << key->text();
        return texts;
    }
    void press(const char* keys) { QTest::keySequence(window.get(), QKeySequence(keys)); }
};

TEST_F(EntryTest, NumberAndAltM_SendMegahertz) {
    box(0)->setFocus();
    QTest::keyClicks(box(0), "900");
    press("Alt+M");
    EXPECT_EQ(program->variables().CenterFrequency, 900e6);
    window->binder().flush();
    EXPECT_EQ(widgetOf<QLabel>(panel().CFLabel)->text(), "Center: 900 MHz");
}

TEST_F(EntryTest, EachTerminator_HasItsFactor) {
    const struct {
        const char* number;
        const char* keys;
        double value;  // within the instrument's range: it would be asked again otherwise
    } cases[] = {{"2", "Alt+G", 2e9}, {"2", "Alt+M", 2e6}, {"900", "Alt+K", 900e3}};
    for (const auto& row : cases) {
        box(0)->setFocus();
        QTest::keyClicks(box(0), row.number);
        press(row.keys);
        EXPECT_EQ(program->variables().CenterFrequency, row.value) << row.keys;
    }
}

TEST_F(EntryTest, ClickedTerminator_SendsAndLeavesTheFocusInTheBox) {
    box(0)->setFocus();
    QTest::keyClicks(box(0), "1.25");
    QTest::mouseClick(row().keys()[0], Qt::LeftButton);
    EXPECT_EQ(program->variables().CenterFrequency, 1.25e9);
    EXPECT_EQ(window->focusWidget(), box(0));
}

TEST_F(EntryTest, TerminatorWithoutANumber_SendsNothing) {
    const double before = program->variables().CenterFrequency;
    panel().SpanButton.Click();
    show();
    press("Alt+M");
    EXPECT_EQ(program->variables().Span, 3e9);
    EXPECT_EQ(program->variables().CenterFrequency, before);
    EXPECT_EQ(panel().SoftTextBox(0).Text.get(), "3 GHz");
    EXPECT_EQ(window->focusWidget(), box(0));
}

TEST_F(EntryTest, TerminatorBehindANumberWithAUnit_SendsNothing) {
    box(0)->setFocus();
    QTest::keyClicks(box(0), "900M");
    press("Alt+G");
    EXPECT_EQ(program->variables().CenterFrequency, 1.5e9);
    EXPECT_EQ(panel().SoftTextBox(0).Text.get(), "900M");
}

TEST_F(EntryTest, TimesLevelsAndTexts_HaveTerminatorsOfTheirOwn) {
    EXPECT_EQ(captions(), QStringList({"GHz", "MHz", "kHz", "Hz"}));
    panel().SweepButton.Click();
    show();
    EXPECT_EQ(captions(), QStringList({"s", "ms", "µs"}));
    panel().AmplitudeButton.Click();
    show();
    EXPECT_EQ(captions(), QStringList({"dBm"}));
    box(3)->setFocus();
    EXPECT_EQ(captions(), QStringList({"dB"}));
    panel().DistFaultButton.Click();
    show();
    box(0)->setFocus();
    EXPECT_EQ(captions(), QStringList({"Enter"}));
    panel().TrackButton1.Click();
    show();
    EXPECT_EQ(captions(), QStringList());
}

TEST_F(EntryTest, AltMInATime_SendsMilliseconds) {
    panel().SweepButton.Click();
    show();
    box(0)->setFocus();
    QTest::keyClicks(box(0), "50");
    press("Alt+M");
    EXPECT_NEAR(program->variables().SweepTime, 0.05, 1e-12);
}

TEST_F(EntryTest, MarkerInDistanceToFault_IsALength) {
    panel().State = ControllerForm::Marker;
    panel().InstrumentMode = ControllerForm::DISTTOFAULTMEASURE;
    QStringList texts;
    for (const Terminator& key : terminatorsOf(panel(), program->variables(), 0))
        texts << key.caption;
    EXPECT_EQ(texts, QStringList({"m", "cm", "mm"}));
}

TEST_F(EntryTest, TriggerLevel_IsAPercentageAndTriggerDelayATime) {
    panel().SweepButton.Click();
    showTriggerKey(panel(), true);
    EXPECT_STREQ(terminatorsOf(panel(), program->variables(), 4)[0].caption, "%");
    showTriggerKey(panel(), false);
    EXPECT_STREQ(terminatorsOf(panel(), program->variables(), 4)[0].caption, "s");
}

TEST_F(EntryTest, DigitsTypedAnywhere_GoToTheBoxOfTheRedKey) {
    panel().SoftKey(1).Click();
    show();
    widgetOf<QWidget>(panel().SpanButton)->setFocus();
    QTest::keyClick(widgetOf<QWidget>(panel().SpanButton), Qt::Key_5);
    EXPECT_EQ(window->focusWidget(), box(1));
    EXPECT_EQ(panel().SoftTextBox(1).Text.get(), "5");
    QTest::keyClick(box(1), Qt::Key_0);
    press("Alt+M");
    EXPECT_EQ(program->variables().Span, 50e6);
}

TEST_F(EntryTest, LettersTypedAnywhere_BeginNoEntry) {
    const std::string before = panel().SoftTextBox(0).Text;
    QTest::keyClick(&window->graph(), Qt::Key_X);
    EXPECT_EQ(panel().SoftTextBox(0).Text.get(), before);
    EXPECT_EQ(window->focusWidget(), &window->graph());
}

TEST_F(EntryTest, DigitWithoutAnyBox_IsDropped) {
    panel().TrackButton1.Click();
    show();
    window->graph().setFocus();
    QTest::keyClick(&window->graph(), Qt::Key_5);
    EXPECT_EQ(window->focusWidget(), &window->graph());
}

TEST_F(EntryTest, DigitInAContinuousView_IsDroppedByTheGreyBox) {
    const QString shown = box(0)->text();
    bool typed = false;
    platform.events.schedule(300, [&] {
        window->showNow();
        EXPECT_FALSE(box(0)->isEnabled());
        QTest::keyClicks(&window->graph(), "9");
        press("Alt+M");
        EXPECT_EQ(box(0)->text(), shown);
        typed = true;
        panel().StopButton.Click();
    });
    panel().PlayContinuousButton.Click();
    EXPECT_TRUE(typed);
    EXPECT_EQ(program->variables().CenterFrequency, 1.5e9);
}

TEST_F(EntryTest, PastedValue_StaysForItsEnter) {
    box(0)->setFocus();
    box(0)->selectAll();
    QApplication::clipboard()->setText("850M");
    QTest::keySequence(box(0), QKeySequence::Paste);
    EXPECT_EQ(panel().SoftTextBox(0).Text.get(), "850M");
    QTest::keyClick(box(0), Qt::Key_Return);
    EXPECT_EQ(program->variables().CenterFrequency, 850e6);
}

TEST(BareNumber, IsANumberWithoutAUnit) {
    for (const char* text : {"900", " 1.5", "15. ", "-35", "+2", ".5", "1e3"})
        EXPECT_TRUE(isBareNumber(text)) << text;
    for (const char* text : {"", "-", ".", "900M", "1.5 GHz", "1 2", "abc", "1.2.3", "1,5"})
        EXPECT_FALSE(isBareNumber(text)) << text;
}

TEST_F(WindowTest, TerminatorsOfAGreyBox_AreGrey) {
    const auto usable = [this] {
        show();
        platform.events.runFor(100);
        QApplication::processEvents();
        auto* row = window->findChild<TerminatorRow*>("TerminatorRow");
        return row->keys()[0]->isVisible() && row->keys()[0]->isEnabled();
    };
    EXPECT_FALSE(usable()) << "not connected";
    connect();
    EXPECT_TRUE(usable());
    platform.events.schedule(500, [&] {
        EXPECT_FALSE(usable()) << "a continuous view";
        panel().StopButton.Click();
    });
    panel().PlayContinuousButton.Click();
    EXPECT_TRUE(usable());
}

}  // namespace
}  // namespace zel
