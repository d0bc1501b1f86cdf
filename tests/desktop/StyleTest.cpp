// What the style draws, pixel by pixel, and the sizes that it gives.

#include <QAction>
#include <QComboBox>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QMessageBox>
#include <QPainter>
#include <QPushButton>
#include <QRadioButton>
#include <QScrollArea>
#include <QScrollBar>
#include <QStyle>
#include <QStyleOptionSlider>
#include <QToolBar>
#include <QToolTip>

#include "desktop/binders/Binder.h"
#include "desktop/style/FontsAhead.h"
#include "desktop/style/StyleTables.h"
#include "desktop/windows/ThemeIcons.h"
#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

class Style : public testing::TestWithParam<bool> {
  protected:
    void SetUp() override {
        applyTheme(testApplication(), GetParam() ? ThemeChoice::Dark : ThemeChoice::Light);
    }
    void TearDown() override { applyTheme(testApplication(), ThemeChoice::Dark); }

    const ThemeColors& colors() const { return GetParam() ? kDark : kLight; }
    /// The ground of a control, beside its edge.
    template <class Widget>
    QColor groundOf(Widget& widget) {
        widget.resize(80, 30);
        return widget.grab().toImage().pixelColor(15, 4);
    }
    template <class Widget>
    QColor edgeOf(Widget& widget, int depth = 0) {
        widget.resize(80, 30);
        return widget.grab().toImage().pixelColor(40, depth);
    }
};

TEST_P(Style, EachFaceOfAKey_HasItsGround) {
    const std::pair<const char*, const char*> faces[] = {
        {"plain", colors().button},  {"red", colors().red},     {"green", colors().green},
        {"yellow", colors().yellow}, {"blue", colors().accent}, {"terminator", colors().base}};
    for (const auto& [face, ground] : faces) {
        QPushButton key;
        setFace(&key, face);
        EXPECT_EQ(groundOf(key), QColor(ground)) << face;
        key.setEnabled(false);
        EXPECT_EQ(groundOf(key), QColor(colors().window)) << face;
    }
}

TEST_P(Style, IconOfAChosenKey_HasTheInkOfItsFace) {
    QToolBar bar;
    QAction* action = bar.addAction(themeIcon("stop"), "Stop");
    action->setCheckable(true);
    QWidget& tool = *bar.widgetForAction(action);
    tool.resize(40, 40);
    const auto middle = [](QWidget& key) {
        return key.grab().toImage().pixelColor(key.rect().center());
    };
    EXPECT_EQ(middle(tool), QColor(colors().text));
    action->setChecked(true);
    EXPECT_EQ(middle(tool), QColor(colors().accentText));
    QPushButton key;
    key.setIcon(themeIcon("stop"));
    setFace(&key, "green");
    key.resize(40, 40);
    EXPECT_EQ(middle(key), QColor(colors().accentText));
}

TEST_P(Style, ListWithTheFocus_ShowsIt) {
    const QListWidget list;
    const QScrollArea area;
    const auto edge = [](const QWidget& widget, QStyle::State state) {
        QImage image(20, 20, QImage::Format_RGB32);
        image.fill(Qt::black);
        QPainter painter(&image);
        QStyleOptionFrame option;
        option.rect = image.rect();
        option.lineWidth = 1;
        option.state = state;
        testApplication().style()->drawPrimitive(QStyle::PE_Frame, &option, &painter, &widget);
        painter.end();
        return image.pixelColor(10, 0);
    };
    EXPECT_EQ(edge(list, QStyle::State_Enabled), QColor(colors().border));
    EXPECT_EQ(edge(list, QStyle::State_HasFocus), QColor(colors().focus));
    EXPECT_NE(edge(area, QStyle::State_HasFocus), QColor(colors().focus));
}

TEST_P(Style, KeysOfADialog_HaveNoPicturesOfAnotherSet) {
    QMessageBox box(QMessageBox::Question, "Disconnect", "?", QMessageBox::Ok);
    EXPECT_TRUE(box.button(QMessageBox::Ok)->icon().isNull());
}

TEST_P(Style, DisabledTextOfAMenu_IsDrawnOnce) {
    EXPECT_EQ(testApplication().style()->styleHint(QStyle::SH_EtchDisabledText), 0);
}

TEST_P(Style, SliderWithTheFocus_ShowsIt) {
    const auto drawn = [](QStyle::State state) {
        QStyleOptionSlider option;
        option.rect = QRect(0, 0, 120, 24);
        option.maximum = 10;
        option.sliderPosition = 5;
        option.sliderValue = 5;
        option.subControls = QStyle::SC_SliderGroove | QStyle::SC_SliderHandle;
        option.state = state | QStyle::State_Enabled | QStyle::State_Horizontal |
                       QStyle::State_KeyboardFocusChange;
        QImage image(option.rect.size(), QImage::Format_RGB32);
        image.fill(Qt::black);
        QPainter painter(&image);
        testApplication().style()->drawComplexControl(QStyle::CC_Slider, &option, &painter);
        return image;
    };
    EXPECT_NE(drawn(QStyle::State_HasFocus), drawn(QStyle::State_None));
}

TEST_P(Style, FaceOfAKeyThatIsShown_ChangesAtOnce) {
    QPushButton key("KEY");
    EXPECT_EQ(groundOf(key), QColor(colors().button));
    EXPECT_FALSE(key.font().bold());
    setFace(&key, "red");
    EXPECT_EQ(groundOf(key), QColor(colors().red));
    EXPECT_TRUE(key.font().bold());
    setFace(&key, "plain");
    EXPECT_EQ(groundOf(key), QColor(colors().button));
    EXPECT_FALSE(key.font().bold());
}

TEST_P(Style, KeyThatDrawsItsTextItself_FindsTheInkInItsPalette) {
    QPushButton key;
    setFace(&key, "blue");
    key.ensurePolished();
    EXPECT_EQ(key.palette().color(QPalette::ButtonText), QColor(colors().accentText));
    setFace(&key, "yellow");
    EXPECT_EQ(key.palette().color(QPalette::ButtonText), QColor(colors().yellowText));
    setFace(&key, "plain");
    EXPECT_EQ(key.palette().color(QPalette::ButtonText), QColor(colors().text));
}

TEST_P(Style, DefaultKeyOfADialog_HasTheAccent) {
    QDialog dialog;
    QPushButton key(&dialog);
    key.setDefault(true);
    EXPECT_EQ(groundOf(key), QColor(colors().accent));
}

TEST_P(Style, Entries_ShowWhatTheyAre) {
    QLineEdit box;
    EXPECT_EQ(groundOf(box), QColor(colors().base));
    EXPECT_EQ(edgeOf(box), QColor(colors().border));
    setMark(&box, "refused", true);
    EXPECT_EQ(edgeOf(box), QColor(colors().problem));
    EXPECT_EQ(edgeOf(box, 1), QColor(colors().problem));
    EXPECT_EQ(box.palette().color(QPalette::Text), QColor(colors().problem));
    setMark(&box, "refused", false);
    EXPECT_EQ(edgeOf(box), QColor(colors().border));
    EXPECT_EQ(box.palette().color(QPalette::Text), QColor(colors().text));
    setMark(&box, "struck", true);
    EXPECT_TRUE(box.font().strikeOut());
    EXPECT_EQ(box.palette().color(QPalette::Text), QColor(colors().problem));
    box.setEnabled(false);
    EXPECT_EQ(groundOf(box), QColor(colors().window));
    EXPECT_EQ(box.palette().color(QPalette::Disabled, QPalette::Text), QColor(colors().dim));
}

TEST_P(Style, LockedList_HasNoArrow) {
    QComboBox list;
    list.addItem("Auto");
    list.resize(80, 22);
    const auto arrow = [&list] { return list.grab().toImage().copy(list.width() - 18, 2, 16, 18); };
    const QImage open = arrow();
    setFace(&list, "locked");
    EXPECT_NE(arrow(), open);
    const QImage shut = arrow();
    for (int y = 0; y < shut.height(); ++y)
        for (int x = 0; x < shut.width(); ++x)
            ASSERT_EQ(shut.pixelColor(x, y), shut.pixelColor(0, 0)) << x << " " << y;
}

TEST_P(Style, Labels_HaveFontAndInkOfTheirPart) {
    QLabel caption("Span");
    caption.setObjectName("caption");
    caption.ensurePolished();
    EXPECT_EQ(caption.font().pixelSize(), 11);
    EXPECT_EQ(caption.palette().color(QPalette::WindowText), QColor(colors().caption));
    QLabel readout("1.5 GHz");
    readout.setProperty("readout", true);
    readout.ensurePolished();
    EXPECT_EQ(readout.font().pixelSize(), 13);
    EXPECT_EQ(readout.font().weight(), QFont::DemiBold);
    setMark(&readout, "file", true);
    EXPECT_EQ(readout.palette().color(QPalette::WindowText), QColor(colors().file));
    setMark(&readout, "file", false);
    EXPECT_EQ(readout.palette().color(QPalette::WindowText), QColor(colors().text));
}

TEST_P(Style, KeyOfABarWithoutRoom_IsDrawnInTheInkOfTheKeys) {
    for (const auto icon :
         {QStyle::SP_ToolBarHorizontalExtensionButton, QStyle::SP_ToolBarVerticalExtensionButton}) {
        const QImage picture =
            testApplication().style()->standardIcon(icon).pixmap(QSize(48, 48)).toImage();
        int inked = 0;
        for (int x = 0; x < picture.width(); ++x)
            for (int y = 0; y < picture.height(); ++y)
                inked += picture.pixelColor(x, y) == QColor(colors().text);
        EXPECT_GT(inked, 10);
        EXPECT_EQ(picture.pixelColor(0, 0).alpha(), 0);
    }
}

TEST_P(Style, ThemeThatChanges_ReachesAWidgetThatIsShown) {
    QLabel caption("Span");
    caption.setObjectName("caption");
    QPushButton key;
    caption.ensurePolished();
    EXPECT_EQ(groundOf(key), QColor(colors().button));
    applyTheme(testApplication(), GetParam() ? ThemeChoice::Light : ThemeChoice::Dark);
    const ThemeColors& other = GetParam() ? kLight : kDark;
    EXPECT_EQ(groundOf(key), QColor(other.button));
    EXPECT_EQ(caption.palette().color(QPalette::WindowText), QColor(other.caption));
    EXPECT_EQ(QToolTip::palette().color(QPalette::ToolTipBase), QColor(other.base));
}

TEST_P(Style, Controls_KeepTheirHeights) {
    QPushButton key("KEY");
    EXPECT_EQ(key.sizeHint().height(), 26);
    QPushButton soft("KEY");
    soft.setProperty("soft", true);
    EXPECT_EQ(soft.sizeHint().height(), 34);
    EXPECT_EQ(QLineEdit().sizeHint().height(), 22);
    QComboBox list;
    list.addItem("Auto");
    EXPECT_EQ(list.sizeHint().height(), 22);
    QRadioButton option("Get");
    EXPECT_GE(option.sizeHint().width(), 14 + option.fontMetrics().horizontalAdvance("Get"));
}

TEST_P(Style, HandleOfASlimBar_GoesFromEndToEnd) {
    QScrollBar bar(Qt::Vertical);
    bar.setRange(0, 900);
    bar.setPageStep(100);
    bar.resize(bar.sizeHint().width(), 200);
    EXPECT_EQ(bar.width(), 8);
    const auto isHandle = [&](int y) {
        return bar.grab().toImage().pixelColor(4, y) == QColor(colors().border);
    };
    EXPECT_TRUE(isHandle(4) && isHandle(20));
    EXPECT_FALSE(isHandle(30));
    bar.setValue(900);
    EXPECT_TRUE(isHandle(195) && isHandle(180));
    EXPECT_FALSE(isHandle(170));
}

TEST(FontsAhead, EndsWithoutHavingBeenWaitedFor) {
    testApplication();
    { const FontsAhead fonts; }
    FontsAhead fonts;
    fonts.wait();
    fonts.wait();
}

INSTANTIATE_TEST_SUITE_P(Themes, Style, testing::Bool(),
                         [](const auto& theme) { return theme.param ? "Dark" : "Light"; });

}  // namespace
}  // namespace zel
