// Looking closer and back, the pointer's readout and the delta's text, the entry boxes.

#include <QTest>
#include <QWheelEvent>

#include "desktop/graph/AxisText.h"
#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

class NavigationTest : public WindowTest {
  protected:
    void SetUp() override {
        connect();
        show();
    }
    QPointF at(double x, double y) {
        GraphWidget& graph = window->graph();
        return {graph.xAxis->coordToPixel(x), graph.yAxis->coordToPixel(y)};
    }
    void wheel(const QPointF& place, int notches, Qt::KeyboardModifiers keys = Qt::NoModifier) {
        GraphWidget& graph = window->graph();
        QWheelEvent event(place, graph.mapToGlobal(place), {}, {0, 120 * notches}, Qt::NoButton,
                          keys, Qt::NoScrollPhase, false);
        QApplication::sendEvent(&graph, &event);
        window->showNow();
    }
    const Graph& graph() { return panel().CWGraph1; }
};

TEST_F(NavigationTest, Wheel_LooksCloserAboutThePointer) {
    const QPointF place = at(1e9, -60);
    wheel(place, 2);
    EXPECT_NEAR(graph().xAxis().Maximum - graph().xAxis().Minimum, 3e9 / 1.25 / 1.25, 1e3);
    EXPECT_NEAR(at(1e9, -60).x(), place.x(), 1);
    EXPECT_TRUE(panel().GraphZoomed);
    EXPECT_EQ(panel().cmdZoom.Caption.get(), "Out");
    EXPECT_EQ(graph().yAxis().Maximum, -20);
}

TEST_F(NavigationTest, ShiftAndWheel_ChangeTheLevelAxisAndItsWrittenScale) {
    wheel(at(1e9, -60), 8, Qt::ShiftModifier);
    EXPECT_EQ(graph().xAxis().Maximum, 3e9);
    EXPECT_NEAR(graph().yAxis().Maximum - graph().yAxis().Minimum, 100 / std::pow(1.25, 8), 1e-6);
    EXPECT_FALSE(panel().GraphZoomed);
}

TEST_F(NavigationTest, History_GoesBackAndForth) {
    wheel(at(1e9, -60), 2);
    const double closer = graph().xAxis().Maximum;
    QTest::keyClick(&window->graph(), Qt::Key_Left, Qt::AltModifier);
    EXPECT_EQ(graph().xAxis().Maximum, 3e9);
    QTest::keyClick(&window->graph(), Qt::Key_Right, Qt::AltModifier);
    EXPECT_EQ(graph().xAxis().Maximum, closer);
}

TEST_F(NavigationTest, Home_ShowsTheWholeView) {
    wheel(at(1e9, -60), 3);
    wheel(at(1e9, -60), 3, Qt::ShiftModifier);
    QTest::keyClick(&window->graph(), Qt::Key_Home);
    EXPECT_EQ(graph().xAxis().Minimum, 0);
    EXPECT_EQ(graph().xAxis().Maximum, 3e9);
    EXPECT_EQ(graph().yAxis().Minimum, -120);
    EXPECT_EQ(graph().yAxis().Maximum, -20);
    EXPECT_FALSE(panel().GraphZoomed);
    EXPECT_EQ(panel().cmdZoom.Caption.get(), "Zoom");
}

TEST_F(NavigationTest, WholeView_IsAStepOfTheHistory) {
    wheel(at(1e9, -60), 3);
    wheel(at(1e9, -60), 3, Qt::ShiftModifier);
    const double left = graph().xAxis().Minimum;
    const double top = graph().yAxis().Maximum;
    QTest::keyClick(&window->graph(), Qt::Key_Home);
    window->showNow();
    QTest::keyClick(&window->graph(), Qt::Key_Left, Qt::AltModifier);
    window->showNow();
    EXPECT_EQ(graph().xAxis().Minimum, left);
    EXPECT_EQ(graph().yAxis().Maximum, top);
    EXPECT_TRUE(panel().GraphZoomed);
    QTest::keyClick(&window->graph(), Qt::Key_Right, Qt::AltModifier);
    EXPECT_EQ(graph().xAxis().Minimum, 0);
    EXPECT_EQ(graph().yAxis().Maximum, -20);
    QTest::keyClick(&window->graph(), Qt::Key_Home);
    panel().PlaySingleButton.Click();
    window->showNow();
    EXPECT_EQ(graph().xAxis().Maximum, 3e9) << "the next sweep lays out the whole";
}

TEST_F(NavigationTest, TurnOfTheWheel_TakesTheFocusForTheKeysOfTheView) {
    EXPECT_EQ(window->graph().focusPolicy(), Qt::WheelFocus);
}

TEST_F(NavigationTest, MiddleButton_PansBothAxes) {
    GraphWidget& widget = window->graph();
    const QPoint start = at(1e9, -60).toPoint();
    QTest::mousePress(&widget, Qt::MiddleButton, {}, start);
    QTest::mouseMove(&widget, start + QPoint(50, 20));
    QTest::mouseRelease(&widget, Qt::MiddleButton, {}, start + QPoint(50, 20));
    EXPECT_LT(graph().xAxis().Minimum, 0);
    EXPECT_GT(graph().yAxis().Maximum, -20);
    EXPECT_NEAR(graph().xAxis().Maximum - graph().xAxis().Minimum, 3e9, 1);
}

TEST_F(NavigationTest, WheelWithoutATrace_ChangesNothing) {
    panel().CWGraph1.clearPlot();
    window->showNow();
    wheel(at(1e9, -60), 3);
    EXPECT_EQ(graph().xAxis().Maximum, 3e9);
}

TEST_F(NavigationTest, PointerThatLeaves_GivesTheDeltaItsTextBack) {
    panel().DeltaLabel.Caption = "Delta: 1 MHz; -3 dBm";
    panel().DeltaLabel.ForeColor = 65280;
    QTest::mouseMove(&window->graph(), at(1.5e9, -70).toPoint());
    QTest::mouseMove(&window->graph(), at(1.6e9, -70).toPoint());
    EXPECT_EQ(panel().DeltaLabel.Caption.get().rfind("Cursor:", 0), 0U);
    QEvent leave(QEvent::Leave);
    QApplication::sendEvent(&window->graph(), &leave);
    EXPECT_EQ(panel().DeltaLabel.Caption.get(), "Delta: 1 MHz; -3 dBm");
    EXPECT_EQ(panel().DeltaLabel.ForeColor.get(), 65280U);
}

TEST_F(NavigationTest, ReadingThatComesUnderThePointer_IsWhatComesBack) {
    panel().DeltaLabel.Caption = "Delta: 1 MHz; -3 dBm";
    QTest::mouseMove(&window->graph(), at(1.5e9, -70).toPoint());
    panel().DeltaLabel.Caption = "Delta: 2 MHz; -4 dBm";
    QTest::mouseMove(&window->graph(), at(1.6e9, -70).toPoint());
    QEvent leave(QEvent::Leave);
    QApplication::sendEvent(&window->graph(), &leave);
    EXPECT_EQ(panel().DeltaLabel.Caption.get(), "Delta: 2 MHz; -4 dBm");
}

TEST_F(NavigationTest, PairsOfTheAutoPeakDetector_AreABand) {
    ASSERT_EQ(graph().values().size(), 602U);
    window->showNow();
    const std::size_t pair = 150;
    const double x = graph().firstX() + 2 * pair * graph().increment();
    const auto [low, high] = window->graph().picture().levelsAt(x);
    // The maximum of a point stands in the next pair.
    EXPECT_EQ(low, std::min(graph().values()[2 * pair], graph().values()[2 * pair + 3]));
    EXPECT_EQ(high, std::max(graph().values()[2 * pair], graph().values()[2 * pair + 3]));
    EXPECT_LT(low, high);
}

TEST_F(NavigationTest, PeakOfTheBand_StandsWhereTheInstrumentHasIt) {
    panel().MarkerCheckBox.Click();
    panel().MarkPkButton.Click();
    window->showNow();
    const double x = panel().CWGraph1.cursor(1).X;
    EXPECT_NEAR(window->graph().picture().levelsAt(x).second, panel().MarkerLevel, 3);
}

TEST(AxisText, Digits_TellNeighboursApart) {
    EXPECT_EQ(axisText(2.41234e9, 1e4, "Hz"), "2.41234 GHz");
    EXPECT_EQ(axisText(2.4e9, 1e7, "Hz"), "2.40 GHz");
    EXPECT_EQ(axisText(0, 1e7, "Hz"), "0 Hz");
    EXPECT_EQ(axisText(-4.9e6, 1e7, "Hz"), "0 Hz");
    EXPECT_EQ(axisText(1e7, 1e7, "Hz"), "10 MHz");
    EXPECT_EQ(axisText(0, 7e-5, "s"), "0 s");
    EXPECT_EQ(axisText(0.00014, 7e-5, "s"), "140 µs");
    EXPECT_EQ(axisText(0, 0.05, "m"), "0 m");
    EXPECT_EQ(axisText(7.5, 0.05, "m"), "7.50 m");
    EXPECT_EQ(axisText(0.0123, 1e-4, "s"), "12.3 ms");
    EXPECT_EQ(levelText(-0.001, "dBm"), "0.00 dBm");
    EXPECT_EQ(levelText(std::nan(""), "dBm"), "");
}

TEST_F(NavigationTest, EntryThatCannotBeRead_IsMarkedAndNotSent) {
    auto* box = widgetOf<QLineEdit>(panel().SoftTextBox(0));
    QTest::keyClicks(box, "5 dBm");
    QTest::keyClick(box, Qt::Key_Return);
    EXPECT_EQ(program->variables().CenterFrequency, 1.5e9);
    EXPECT_TRUE(box->property("refused").toBool());
    EXPECT_TRUE(box->toolTip().contains("no unit of a frequency")) << box->toolTip().toStdString();
    EXPECT_EQ(box->text(), "5 dBm");
    QTest::keyClick(box, Qt::Key_Backspace);
    EXPECT_FALSE(box->property("refused").toBool());
}

TEST_F(NavigationTest, EntryWithACommaAndASmallPrefix_IsSentAsItIsMeant) {
    auto* box = widgetOf<QLineEdit>(panel().SoftTextBox(0));
    QTest::keyClicks(box, "2,4g");
    QTest::keyClick(box, Qt::Key_Return);
    EXPECT_EQ(program->variables().CenterFrequency, 2.4e9);
    window->binder().flush();
    EXPECT_EQ(box->text(), "2.4 GHz");
}

TEST_F(NavigationTest, LetterInTheManualScale_KeepsItFromBeingTaken) {
    panel().UtilityGraphSettings.Click();
    window->binder().flush();
    ManualScaleForm& form = program->forms().manualScale;
    auto* line = widgetOf<QLineEdit>(form.manualSizeMin);
    auto* accept = widgetOf<QPushButton>(form.cmdAccept);
    EXPECT_TRUE(accept->isEnabled());
    line->setFocus();
    line->selectAll();
    QTest::keyClicks(line, "-10x");
    window->binder().flush();
    EXPECT_FALSE(accept->isEnabled());
    EXPECT_TRUE(line->property("refused").toBool());
    QTest::keyClick(line, Qt::Key_Backspace);
    window->binder().flush();
    EXPECT_TRUE(accept->isEnabled());
}

}  // namespace
}  // namespace zel
