// The panel's window: every control bound, shown as its form says, reachable by keyboard.

#include <QAction>
#include <QClipboard>
#include <QMenu>
#include <QSet>
#include <QTest>
#include <QToolBar>
#include <algorithm>

#include "desktop/binders/ToolTips.h"
#include "desktop/windows/FoldGroup.h"
#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

bool needsNoWidget(const Control& control) {
    const bool separator = control.kind() == ControlKind::MenuItem &&
                           static_cast<const MenuItem&>(control).Caption.get() == "-";
    return control.kind() == ControlKind::Timer || separator;
}

TEST_F(WindowTest, Panel_EveryControl_HasItsWidget) {
    for (const Control* control : panel().controls()) {
        if (needsNoWidget(*control)) continue;
        EXPECT_NE(window->binder().widgetOf(*control), nullptr) << control->name();
    }
}

TEST_F(WindowTest, ConnectionDialog_EveryControl_HasItsWidget) {
    for (const Control* control : program->forms().main.controls())
        EXPECT_NE(window->binder().widgetOf(*control), nullptr) << control->name();
}

TEST_F(WindowTest, ManualScaleDialog_EveryControl_HasItsWidget) {
    for (const Control* control : program->forms().manualScale.controls())
        EXPECT_NE(window->binder().widgetOf(*control), nullptr) << control->name();
}

TEST_F(WindowTest, Widgets_AreVisibleWhereTheFormSaysSo) {
    connect();
    show();
    int looked = 0;
    for (const Control* control : panel().controls()) {
        auto* widget = widgetOf<QWidget>(*control);
        if (widget == nullptr || control->kind() == ControlKind::Picture ||
            control->kind() == ControlKind::Frame)
            continue;
        EXPECT_EQ(FoldGroup::offers(*widget), control->Visible.get()) << control->name();
        ++looked;
    }
    EXPECT_GT(looked, 50);
}

TEST_F(WindowTest, StopKey_IsHiddenUntilAViewRuns) {
    show();
    EXPECT_FALSE(widgetOf<QWidget>(panel().StopButton)->isVisible());
    panel().StopButton.Visible = true;
    EXPECT_TRUE(widgetOf<QWidget>(panel().StopButton)->isVisible());
}

TEST_F(WindowTest, ToolbarShownAgain_ChangesNothing) {
    connect();
    show();
    window->binder().flush();
    int changes = 0;
    for (QAction* action : window->findChild<QToolBar*>("Toolbar")->actions())
        QObject::connect(action, &QAction::changed, window.get(), [&changes] { ++changes; });
    window->binder().refreshAll();
    window->binder().flush();
    EXPECT_EQ(changes, 0);  // each one would lay the toolbar out again, with each sweep
}

TEST_F(WindowTest, SecondWayToAHiddenControl_IsDisabled) {
    connect();
    show();
    const QList<QAction*> actions = window->findChild<QToolBar*>("Toolbar")->actions();
    const auto record = std::find_if(actions.begin(), actions.end(),
                                     [](QAction* action) { return action->text() == "Record"; });
    ASSERT_NE(record, actions.end());
    panel().RecordData.Visible = true;
    window->binder().flush();
    EXPECT_TRUE((*record)->isEnabled());
    panel().RecordData.Visible = false;
    window->binder().flush();
    EXPECT_FALSE((*record)->isEnabled());
}

TEST_F(WindowTest, EntryWithoutAHandler_IsDisabled) {
    show();
    // The binder knows them to its end.
    static Form form("Form");
    static MenuItem item(form, "Entry", "Entry");
    static QAction action;
    window->binder().bind(item, &action);
    window->binder().flush();
    EXPECT_FALSE(action.isEnabled());
    EXPECT_TRUE(qobject_cast<QAction*>(window->binder().widgetOf(panel().LoadData))->isEnabled());
    EXPECT_TRUE(widgetOf<QWidget>(panel().FrequencyButton)->isEnabled());
}

TEST_F(WindowTest, EnabledKeysAndBoxes_AreReachedByTab) {
    connect();
    show();
    QSet<const QWidget*> chain;
    const QWidget* at = window->focusWidget() != nullptr ? window->focusWidget() : window.get();
    for (int i = 0; i < 1000; ++i) {
        at = at->nextInFocusChain();
        if ((at->focusPolicy() & Qt::TabFocus) != 0) chain.insert(at);
    }
    for (const Control* control : panel().controls()) {
        const bool works = control->kind() == ControlKind::Button ||
                           control->kind() == ControlKind::TextBox ||
                           control->kind() == ControlKind::DropDownList ||
                           control->kind() == ControlKind::CheckBox;
        const auto* widget = widgetOf<QWidget>(*control);
        if (!works || control == &panel().DebugTextBox || !widget->isEnabled()) continue;
        EXPECT_TRUE(chain.contains(widget)) << control->name();
    }
}

TEST_F(WindowTest, ClickOnSingle_ReadsASweep) {
    connect();
    show();
    const auto before = panel().CWGraph1.plotSerial();
    QTest::mouseClick(widgetOf<QPushButton>(panel().PlaySingleButton), Qt::LeftButton);
    EXPECT_EQ(panel().CWGraph1.plotSerial(), before + 1);
}

TEST_F(WindowTest, TypingInASoftBox_ReplacesTheValueAndEnterSendsIt) {
    connect();
    show();
    auto* box = widgetOf<QLineEdit>(panel().SoftTextBox(0));
    ASSERT_EQ(box->text(), "1.5 GHz");
    QTest::keyClicks(box, "900M");
    EXPECT_EQ(panel().SoftTextBox(0).Text.get(), "900M");
    QTest::keyClick(box, Qt::Key_Return);
    EXPECT_EQ(program->variables().CenterFrequency, 900e6);
    window->binder().flush();
    EXPECT_EQ(widgetOf<QLabel>(panel().CFLabel)->text(), "Center: 900 MHz");
}

TEST_F(WindowTest, ArrowAheadOfTyping_KeepsTheText) {
    connect();
    show();
    auto* box = widgetOf<QLineEdit>(panel().SoftTextBox(0));
    box->setCursorPosition(0);
    QTest::keyClick(box, Qt::Key_Right);
    QTest::keyClicks(box, "2");
    EXPECT_EQ(panel().SoftTextBox(0).Text.get(), "12.5 GHz");
}

TEST_F(WindowTest, LockedBox_TakesNoKeys) {
    show();
    auto* line = widgetOf<QLineEdit>(panel().DebugTextBox);
    const QString before = line->text();
    QTest::keyClicks(line, "abc");
    EXPECT_EQ(line->text(), before);
    EXPECT_TRUE(line->isReadOnly());
}

TEST_F(WindowTest, PickInAList_SendsTheChoice) {
    connect();
    panel().AmplitudeButton.Click();
    show();
    auto* list = widgetOf<QComboBox>(panel().ChoiceBox(1));
    emit list->activated(2);
    EXPECT_EQ(program->variables().ReferenceRange, 2);
    window->binder().flush();
    EXPECT_EQ(list->currentText(), "2dB/DIV");
}

TEST_F(WindowTest, ClickWhileWorkIsUnderWay_IsDropped) {
    connect();
    show();
    auto* key = widgetOf<QPushButton>(panel().SpanButton);
    panel().MousePointer = 11;
    QTest::mouseClick(key, Qt::LeftButton);
    EXPECT_EQ(panel().State, ControllerForm::Freq);
    panel().MousePointer = 0;
    QTest::mouseClick(key, Qt::LeftButton);
    EXPECT_EQ(panel().State, ControllerForm::SPAN);
}

TEST_F(WindowTest, SoftKeyShortcut_PressesTheKey) {
    connect();
    panel().AmplitudeButton.Click();
    show();
    window->activateWindow();
    QApplication::processEvents();
    QTest::keyClick(window.get(), Qt::Key_F3);
    EXPECT_EQ(panel().SoftTextBox(1).Text.get(), "10dB/DIV (0)");
}

TEST_F(WindowTest, ModalForm_ShowsAWindowThatClosesWithTheForm) {
    show();
    MainForm& form = program->forms().main;
    form.Modal = true;
    form.Show();
    window->binder().flush();
    auto* dialog = window->findChild<QDialog*>("MainForm");
    ASSERT_NE(dialog, nullptr);
    EXPECT_TRUE(dialog->isVisible());
    EXPECT_TRUE(dialog->isModal());
    form.Hide();
    window->binder().flush();
    EXPECT_FALSE(dialog->isVisible());
}

TEST_F(WindowTest, DialogClosedByTheUser_UnloadsItsForm) {
    show();
    ManualScaleForm& form = program->forms().manualScale;
    panel().UtilityGraphSettings.Click();
    window->binder().flush();
    auto* dialog = window->findChild<QDialog*>("ManualScaleForm");
    ASSERT_TRUE(dialog->isVisible());
    dialog->close();
    EXPECT_FALSE(form.Visible);
    EXPECT_FALSE(form.loaded());
}

TEST_F(WindowTest, ClosingTheWindow_AsksAndStaysOnNo) {
    show();
    platform.boxes.answer(BoxAnswer::No);
    EXPECT_FALSE(window->close());
    platform.boxes.answer(BoxAnswer::Yes);
    EXPECT_TRUE(window->close());
    EXPECT_TRUE(program->ended());
}

TEST_F(WindowTest, ConnectionDialog_ShowsTheDirectLinkAlone) {
    show();
    platform.ports.ports = {"/dev/ttyUSB0", "/dev/ttyS0"};
    platform.events.schedule(10, [this] {
        window->binder().flush();
        auto* dialog = window->findChild<QDialog*>("MainForm");
        EXPECT_TRUE(dialog->isVisible());
        MainForm& form = program->forms().main;
        EXPECT_EQ(widgetOf<QComboBox>(form.COMList)->currentText(), "/dev/ttyUSB0");
        EXPECT_TRUE(widgetOf<QWidget>(form.ZELButton)->isVisible());
        EXPECT_FALSE(widgetOf<QWidget>(form.TelNumberBox)->isVisible());
        EXPECT_TRUE(savePicture(*dialog, "connection"));
        form.CancelConnButton1.Click();
    });
    panel().Direct.Click();
    EXPECT_FALSE(program->forms().main.Visible);
}

TEST_F(WindowTest, ToolTipOfTheForm_TakesTheWidgetsPlace) {
    auto* key = widgetOf<QPushButton>(panel().SpanButton);
    EXPECT_EQ(key->toolTip(), "Span menu (Ctrl+Shift+F)");
    EXPECT_EQ(key->accessibleName(), "SPAN, Span menu");
    panel().SpanButton.ToolTip = "not now";
    window->binder().flush();
    EXPECT_EQ(key->toolTip(), "not now (Ctrl+Shift+F)");
    EXPECT_EQ(key->accessibleName(), "not now");
}

TEST_F(WindowTest, EveryBoundWidget_HasAnAccessibleName) {
    int looked = 0;
    for (const Control* control : panel().controls()) {
        const auto* widget = widgetOf<QWidget>(*control);
        if (widget == nullptr || control->kind() == ControlKind::Picture ||
            control->kind() == ControlKind::Frame)
            continue;
        EXPECT_FALSE(widget->accessibleName().isEmpty()) << control->name();
        ++looked;
    }
    EXPECT_GT(looked, 50);
}

TEST_F(WindowTest, KeyOnAButton_IsToldToItsControl) {
    show();
    std::vector<int> codes;
    panel().SpanButton.KeyDown.connect([&codes](int code, int) { codes.push_back(code); });
    QTest::keyClick(widgetOf<QPushButton>(panel().SpanButton), Qt::Key_F1);
    EXPECT_EQ(codes, std::vector<int>{kKeyF1});
}

TEST_F(WindowTest, PasteWhileWorkIsUnderWay_IsDropped) {
    connect();
    show();
    auto* box = widgetOf<QLineEdit>(panel().SoftTextBox(0));
    const QString before = box->text();
    panel().MousePointer = 11;
    QApplication::clipboard()->setText("900M");
    box->paste();
    window->binder().flush();
    EXPECT_EQ(panel().SoftTextBox(0).Text.get(), before.toStdString());
    EXPECT_EQ(box->text(), before);
    panel().MousePointer = 0;
}

TEST_F(WindowTest, MenusOfAllKinds_LeaveTheKeysWhereTheyAre) {
    connect();
    window->resize(1024, 600);
    show();
    const auto* key = widgetOf<QWidget>(panel().MarkerButton);
    const QPoint place = key->mapTo(window.get(), QPoint());
    panel().StopButton.Visible = true;
    for (Button* menu : {&panel().AmplitudeButton, &panel().BWButton, &panel().SweepButton}) {
        menu->Click();
        show();
        EXPECT_EQ(key->mapTo(window.get(), QPoint()), place) << menu->name();
    }
}

TEST_F(WindowTest, EnterInTheConnectionDialog_PressesConnect) {
    show();
    MainForm& form = program->forms().main;
    form.Show();
    window->binder().flush();
    int clicks = 0;
    form.ZELButton.Clicked.connect([&clicks] { ++clicks; });
    port.close();
    auto* dialog = window->findChild<QDialog*>("MainForm");
    dialog->setFocus();
    QTest::keyClick(dialog, Qt::Key_Return);
    EXPECT_EQ(clicks, 1);
    form.Hide();
    window->binder().flush();
}

TEST_F(WindowTest, HourglassOfTheDialog_ShowsThatWorkGoesOn) {
    show();
    MainForm& form = program->forms().main;
    form.Show();
    window->binder().flush();
    auto* dialog = window->findChild<QDialog*>("MainForm");
    const auto* bar = dialog->findChild<QProgressBar*>();
    ASSERT_NE(bar, nullptr);
    EXPECT_FALSE(bar->isVisible());
    form.MousePointer = 11;
    window->binder().flush();
    EXPECT_TRUE(bar->isVisible());
    form.MousePointer = 0;
    form.Hide();
    window->binder().flush();
}

TEST_F(WindowTest, ThemeMenu_DrawsColouredTextsAnew) {
    std::vector<ThemeChoice> chosen;
    window->addThemeMenu(ThemeChoice::Dark, [&chosen](ThemeChoice theme) {
        chosen.push_back(theme);
        applyTheme(testApplication(), theme);
    });
    panel().DeltaLabel.ForeColor = 65280;
    panel().DeltaLabel.Caption = "+2.4 dB";
    show();
    auto* label = widgetOf<QLabel>(panel().DeltaLabel);
    const QColor dark = label->palette().color(QPalette::WindowText);
    EXPECT_EQ(dark, inkOf(65280));
    const QImage before = label->grab().toImage();
    for (QAction* action : window->findChildren<QAction*>())
        if (action->text() == "Light Theme") action->trigger();
    window->binder().flush();
    EXPECT_EQ(chosen, std::vector<ThemeChoice>{ThemeChoice::Light});
    EXPECT_EQ(label->palette().color(QPalette::WindowText), inkOf(65280));
    EXPECT_NE(label->palette().color(QPalette::WindowText), dark);
    EXPECT_NE(label->grab().toImage(), before);
}

}  // namespace
}  // namespace zel
