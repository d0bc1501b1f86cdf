// What a key, a box or a list shows of its state: pictures and their forms, locked, disabled.

#include <QTest>

#include "desktop/windows/KeyPictures.h"
#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

using CF = ControllerForm;
Button CF::*const kHardKeys[] = {&CF::FrequencyButton, &CF::SpanButton,   &CF::AmplitudeButton,
                                 &CF::BWButton,        &CF::SweepButton,  &CF::TraceButton,
                                 &CF::MeasButton,      &CF::TrackButton1, &CF::MarkerButton};

int pixelsOf(const QImage& image, const QColor& ink) {
    int count = 0;
    for (int y = 0; y < image.height(); ++y)
        for (int x = 0; x < image.width(); ++x)
            if (image.pixelColor(x, y) == ink) ++count;
    return count;
}

TEST_F(WindowTest, EveryHardKey_HasAPictureInBothForms) {
    panel().FrequencyButton.Click();
    for (Button CF::*key : kHardKeys)
        EXPECT_TRUE(hasKeyPicture(QString::fromStdString((panel().*key).Picture)))
            << (panel().*key).name();
    EXPECT_TRUE(hasKeyPicture("freq_b"));
    EXPECT_FALSE(hasKeyPicture(""));
    EXPECT_FALSE(hasKeyPicture("nothing_y"));
}

TEST(KeyPicture, Symbols_AreDrawnInTheirInkAndAllDiffer) {
    testApplication();
    std::vector<QImage> drawn;
    for (const char* name : {"freq_y", "span_y", "ampl_y", "band_y", "sweep_y", "trace_y", "meas_y",
                             "track_y", "marker_y"}) {
        QImage image(64, 64, QImage::Format_RGB32);
        image.fill(Qt::black);
        QPainter painter(&image);
        drawKeyPicture(painter, name, image.rect(), Qt::yellow);
        painter.end();
        EXPECT_GT(pixelsOf(image, Qt::yellow), 60) << name;
        for (const QImage& other : drawn) EXPECT_NE(image, other) << name;
        drawn.push_back(image);
    }
}

TEST_F(WindowTest, KeyOfTheMenu_IsBlueAndTheOthersYellow) {
    connect();
    panel().SweepButton.Click();
    show();
    for (Button CF::*key : kHardKeys) {
        const bool current = key == &CF::SweepButton;
        EXPECT_EQ(widgetOf<QWidget>(panel().*key)->property("face").toString(),
                  current ? "blue" : "yellow")
            << (panel().*key).name();
    }
}

TEST_F(WindowTest, FormOfAPicture_ChangesWhatIsDrawn) {
    connect();
    show();
    auto* key = widgetOf<QPushButton>(panel().SpanButton);
    const QImage yellow = key->grab().toImage();
    panel().SpanButton.Click();
    show();
    const QImage blue = key->grab().toImage();
    EXPECT_NE(yellow, blue);
    EXPECT_GT(pixelsOf(blue, Qt::white), 20);
}

TEST_F(WindowTest, KeyWithoutAPicture_ShowsItsCaptionAlone) {
    show();
    auto* key = widgetOf<QPushButton>(panel().SpanButton);
    panel().SpanButton.Picture = "span_y";
    show();
    const QImage with = key->grab().toImage();
    panel().SpanButton.Picture = "";
    show();
    EXPECT_EQ(key->text(), "SPAN");
    EXPECT_NE(key->grab().toImage(), with);
}

TEST_F(WindowTest, PressedMarkerKey_IsRedUntilAnotherOneIs) {
    connect();
    show();
    panel().MarkerCheckBox.Click();
    panel().MarkPkButton.Click();
    EXPECT_EQ(widgetOf<QWidget>(panel().MarkPkButton)->property("face").toString(), "red");
    panel().NextPeakButton.Click();
    EXPECT_EQ(widgetOf<QWidget>(panel().MarkPkButton)->property("face").toString(), "plain");
    EXPECT_EQ(widgetOf<QWidget>(panel().NextPeakButton)->property("face").toString(), "red");
}

TEST_F(WindowTest, LockedBox_LooksUnlikeAnEntryBox) {
    connect();
    show();
    auto* box = widgetOf<QLineEdit>(panel().SoftTextBox(1));
    EXPECT_EQ(box->property("face").toString(), "entry");
    const QImage open = box->grab().toImage();
    panel().SoftTextBox(1).Locked = true;
    show();
    EXPECT_EQ(box->property("face").toString(), "locked");
    EXPECT_NE(box->grab().toImage(), open);
    EXPECT_TRUE(box->isReadOnly());
}

TEST_F(WindowTest, LockedList_ShowsItsChoiceAndTakesNone) {
    connect();
    panel().SweepButton.Click();
    show();
    ASSERT_TRUE(panel().ChoiceBox(1).Locked);
    panel().ChoiceBox(1).setListIndex(1);
    auto* list = widgetOf<QComboBox>(panel().ChoiceBox(1));
    window->binder().refreshAll();
    window->binder().flush();
    EXPECT_TRUE(list->isEnabled());
    EXPECT_EQ(list->property("face").toString(), "locked");
    EXPECT_EQ(list->currentText(), "Off");
    list->setFocus();
    QTest::keyClick(list, Qt::Key_Up);
    QTest::mouseClick(list, Qt::LeftButton);
    EXPECT_EQ(list->currentText(), "Off");
    EXPECT_FALSE(list->view()->isVisible());
    EXPECT_EQ(panel().ChoiceBox(1).ListIndex(), 1);
}

TEST_F(WindowTest, WheelOverAListWithoutTheFocus_ChangesNothing) {
    connect();
    panel().AmplitudeButton.Click();
    show();
    auto* list = widgetOf<QComboBox>(panel().ChoiceBox(1));
    window->graph().setFocus();
    const int before = list->currentIndex();
    const QPointF middle(list->rect().center());
    QWheelEvent wheel(middle, list->mapToGlobal(middle), {}, {0, -120}, Qt::NoButton,
                      Qt::NoModifier, Qt::NoScrollPhase, false);
    QApplication::sendEvent(list, &wheel);
    EXPECT_EQ(list->currentIndex(), before);
    EXPECT_EQ(program->variables().ReferenceRange, before);
}

TEST_F(WindowTest, FocusOfAKey_CanBeSeen) {
    connect();
    show();
    auto* key = widgetOf<QPushButton>(panel().AnalyzerButton);
    window->activateWindow();
    const QImage before = key->grab().toImage();
    key->setFocus(Qt::TabFocusReason);
    if (!key->hasFocus()) GTEST_SKIP() << "the window got no focus here";
    EXPECT_NE(key->grab().toImage(), before);
}

TEST_F(WindowTest, ManualAnswers_AlternateInColour) {
    connect();
    show();
    auto* answer = widgetOf<QLineEdit>(panel().ManualCommandTextAnsw);
    panel().ManualCommandText.Text = "CMD";
    panel().SendButton.Click();
    window->binder().flush();
    const QColor first = answer->palette().color(QPalette::Text);
    panel().ManualCommandText.Text = "CMD";
    panel().SendButton.Click();
    window->binder().flush();
    EXPECT_NE(first, QApplication::palette().color(QPalette::Text));
    EXPECT_NE(answer->palette().color(QPalette::Text), first);
    EXPECT_NE(answer->palette().color(QPalette::Text),
              QApplication::palette().color(QPalette::Text));
    EXPECT_FALSE(answer->text().isEmpty());
}

}  // namespace
}  // namespace zel
