// The keyboard's ways to the panel: a shortcut for each key, shown by tool tip and document.

#include <QFile>
#include <QMenuBar>
#include <QSet>
#include <QTest>

#include "desktop/binders/ShortcutTable.h"
#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

/// What the first column of the document's tables names.
QSet<QString> documentedKeys() {
    QFile file(QString(ZEL_SOURCE_DIR) + "/docs/keyboard.md");
    EXPECT_TRUE(file.open(QIODevice::ReadOnly));
    QSet<QString> keys;
    for (const QString& line : QString::fromUtf8(file.readAll()).split('\n')) {
        if (!line.startsWith("| ")) continue;
        for (const QString& part : line.section('|', 1, 1).split(',')) keys.insert(part.trimmed());
    }
    return keys;
}

TEST(ShortcutTable, EachRow_NamesAControlAndReadableKeys) {
    ControllerForm panel;
    for (const ShortcutRow& row : shortcutTable()) {
        EXPECT_NE(panel.control(row.control), nullptr) << row.control;
        EXPECT_EQ(QKeySequence(row.keys).toString(QKeySequence::PortableText), row.keys);
    }
}

TEST(ShortcutTable, EachRow_IsDocumented) {
    const QSet<QString> keys = documentedKeys();
    for (const ShortcutRow& row : shortcutTable())
        EXPECT_TRUE(keys.contains(row.keys)) << row.control << " " << row.keys;
    for (const char* letter = kTerminatorLetters; *letter != 0; ++letter)
        EXPECT_TRUE(keys.contains(QString("Alt+") + *letter)) << *letter;
}

TEST(ShortcutTable, TwoControls_ShareKeysOnlyAtOnePlace) {
    std::map<QString, std::vector<std::string>> users;
    for (const ShortcutRow& row : shortcutTable()) users[row.keys].emplace_back(row.control);
    for (const auto& [keys, controls] : users) {
        EXPECT_LE(controls.size(), 2U) << keys.toStdString();
        if (controls.size() < 2) continue;
        const bool place = controls[0].rfind("SoftTextBox", 0) == 0;
        const bool mode = controls[1].find("Check") != std::string::npos;
        EXPECT_TRUE(place || mode) << keys.toStdString();
    }
    for (const char* letter = kTerminatorLetters; *letter != 0; ++letter)
        EXPECT_EQ(users.count(QString("Alt+") + *letter), 0U) << *letter;
}

TEST_F(WindowTest, EveryKeyOfThePanel_HasAShortcutInItsToolTip) {
    for (const Control* control : panel().controls()) {
        const bool key = control->kind() == ControlKind::Button ||
                         control->kind() == ControlKind::CheckBox ||
                         control->kind() == ControlKind::OptionButton ||
                         control->kind() == ControlKind::DropDownList;
        if (!key) continue;
        const QString keys = shortcutOf(*control);
        EXPECT_FALSE(keys.isEmpty()) << control->name();
        EXPECT_TRUE(widgetOf<QWidget>(*control)->toolTip().contains("(" + keys + ")"))
            << control->name();
    }
}

struct Press {
    const char* keys;
    Button ControllerForm::*button;
};

TEST_F(WindowTest, ShortcutsOfTheKeys_PressThem) {
    connect();
    using CF = ControllerForm;
    const Press presses[] = {
        {"Ctrl+F", &CF::FrequencyButton},
        {"Ctrl+Shift+F", &CF::SpanButton},
        {"Ctrl+A", &CF::AmplitudeButton},
        {"Ctrl+B", &CF::BWButton},
        {"Ctrl+W", &CF::SweepButton},
        {"Ctrl+T", &CF::TraceButton},
        {"Ctrl+M", &CF::MeasButton},
        {"Ctrl+G", &CF::TrackButton1},
        {"Ctrl+K", &CF::MarkerButton},
        {"Ctrl+1", &CF::AnalyzerButton},
        {"Ctrl+2", &CF::TrackButton},
        {"Ctrl+3", &CF::PwrButton},
        {"Ctrl+4", &CF::ChnPwrButton},
        {"Ctrl+5", &CF::OccBWButton},
        {"Ctrl+6", &CF::TDMAButton},
        {"Ctrl+7", &CF::DistFaultButton},
        {"Ctrl+P", &CF::MarkPkButton},
        {"Ctrl+N", &CF::NextPeakButton},
        {"Ctrl+Shift+N", &CF::MinPeakButton},
        {"Ctrl+Shift+C", &CF::MarkToCentButton},
        {"Ctrl+Shift+R", &CF::MarkToRefButton},
        {"Ctrl+Shift+P", &CF::ResetButton},
        {"Ctrl+L", &CF::LocalButton},
        {"Ctrl+Shift+L", &CF::OnOffButton},
        {"Ctrl+Return", &CF::SendButton},
        {"F9", &CF::PlaySingleButton},
        {"Ctrl+Z", &CF::cmdZoom},
    };
    show();
    for (const Press& press : presses) {
        int clicks = 0;
        (panel().*press.button).Clicked.connect([&clicks] { ++clicks; });
        window->setFocus();
        QTest::keySequence(window.get(), QKeySequence(press.keys));
        EXPECT_GE(clicks, 1) << press.keys;
        (panel().*press.button).Clicked.connect([] {});
        if (panel().InstrumentMode == CF::POWERSENSOR) panel().AnalyzerButton.Click();
    }
}

TEST_F(WindowTest, ShortcutOfAHiddenSoftKey_DoesNothing) {
    connect();
    panel().SpanButton.Click();
    show();
    int clicks = 0;
    panel().SoftKey(4).Clicked.connect([&clicks] { ++clicks; });
    QTest::keyClick(window.get(), Qt::Key_F6);
    EXPECT_EQ(clicks, 0);
}

TEST_F(WindowTest, ShortcutWhileWorkIsUnderWay_DoesNothing) {
    connect();
    show();
    panel().MousePointer = 11;
    QTest::keySequence(window.get(), QKeySequence("Ctrl+Shift+F"));
    EXPECT_EQ(panel().State, ControllerForm::Freq);
    panel().MousePointer = 0;
    QTest::keySequence(window.get(), QKeySequence("Ctrl+Shift+F"));
    EXPECT_EQ(panel().State, ControllerForm::SPAN);
}

TEST_F(WindowTest, ShiftWithASoftKeysKey_GoesToWhatStandsAtItsPlace) {
    connect();
    panel().AmplitudeButton.Click();
    show();
    window->activateWindow();
    QTest::keySequence(window.get(), QKeySequence("Shift+F2"));
    EXPECT_EQ(window->focusWidget(), widgetOf<QWidget>(panel().SoftTextBox(0)));
    QTest::keySequence(window.get(), QKeySequence("Shift+F3"));
    EXPECT_EQ(window->focusWidget(), widgetOf<QWidget>(panel().ChoiceBox(1)));
}

TEST_F(WindowTest, MarkerShortcut_SwitchesTheMarker) {
    connect();
    show();
    QTest::keySequence(window.get(), QKeySequence("Ctrl+Shift+M"));
    EXPECT_TRUE(panel().MarkerCheckBox.Value());
    QTest::keySequence(window.get(), QKeySequence("Ctrl+Shift+M"));
    EXPECT_FALSE(panel().MarkerCheckBox.Value());
}

TEST_F(WindowTest, CommandAndGraphShortcuts_GoThere) {
    show();
    QTest::keyClick(window.get(), Qt::Key_F7);
    EXPECT_EQ(window->focusWidget(), widgetOf<QWidget>(panel().ManualCommandText));
    QTest::keyClick(window.get(), Qt::Key_F8);
    EXPECT_EQ(window->focusWidget(), &window->graph());
}

TEST_F(WindowTest, MenusOfTheMenuBar_OpenByTheirLetters) {
    show();
    QStringList letters;
    for (const QAction* action : window->menuBar()->actions()) {
        const qsizetype at = action->text().indexOf('&');
        ASSERT_GE(at, 0) << action->text().toStdString();
        letters << action->text().mid(at + 1, 1).toUpper();
    }
    EXPECT_EQ(letters, QStringList({"F", "N", "V", "T", "I", "H"}));
}

TEST_F(WindowTest, MenuEntryWithAShortcut_ShowsIt) {
    window->binder().flush();
    const auto* action = qobject_cast<QAction*>(window->binder().widgetOf(panel().LoadData));
    EXPECT_EQ(action->shortcut(), QKeySequence("Ctrl+O"));
}

}  // namespace
}  // namespace zel
