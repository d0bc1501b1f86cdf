// The room of the graph, the folding panel, the tool bar, the empty screen and what is remembered.

#include <QDialog>
#include <QLabel>
#include <QMenu>
#include <QMenuBar>
#include <QTest>
#include <QToolButton>

#include "desktop/windows/FoldGroup.h"
#include "desktop/windows/MainMenus.h"
#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

QToolButton* toolOf(QWidget& window, const QString& name) {
    for (QToolButton* button : window.findChildren<QToolButton*>())
        if (button->accessibleName() == name) return button;
    return nullptr;
}

TEST_F(WindowTest, WindowOfAForm_IsBuiltWhenItIsShown) {
    MainWindow fresh(*program);
    EXPECT_EQ(fresh.findChild<QDialog*>("AboutForm"), nullptr);
    program->forms().about.Show();
    EXPECT_NE(fresh.findChild<QDialog*>("AboutForm"), nullptr);
    program->forms().about.Hide();
}

struct Room {
    QSize size;
    double share;
};

TEST_F(WindowTest, Graph_HasItsShareOfTheWidth) {
    connect();
    for (const Room& room : {Room{{1024, 600}, 0.65}, Room{{1920, 1080}, 0.75}}) {
        window->resize(room.size);
        show();
        EXPECT_GE(window->graph().width(), room.share * room.size.width()) << room.size.width();
        EXPECT_EQ(window->side().width(), PanelSide::kWidth);
    }
}

TEST_F(WindowTest, LowWindow_FoldsTheCommandLineAndTheModesFirst) {
    const auto open = [this] {
        QStringList names;
        for (const FoldGroup* group : window->side().groups())
            if (group->isOpen()) names << group->name();
        return names.join(" ").toStdString();
    };
    window->resize(1280, 1000);
    show();
    EXPECT_EQ(open(), "Markers Modes Command");
    window->resize(1280, 720);
    show();
    EXPECT_EQ(open().find("Command"), std::string::npos);
    window->resize(1280, 1000);
    show();
    EXPECT_EQ(open(), "Markers Modes Command");
}

TEST_F(WindowTest, GroupThatTheUserFolded_StaysFoldedInTheNextWindow) {
    window->resize(1280, 1000);
    window->useSettings(platform.settings);
    show();
    FoldGroup* modes = window->side().groups()[1];
    ASSERT_TRUE(modes->isOpen());
    QTest::mouseClick(&modes->heading(), Qt::LeftButton);
    EXPECT_FALSE(modes->isOpen());
    MainWindow next(*program);
    next.useSettings(platform.settings);
    next.resize(1280, 1000);
    next.show();
    EXPECT_FALSE(next.side().groups()[1]->isOpen());
    EXPECT_TRUE(next.side().groups()[0]->isOpen());
}

TEST_F(WindowTest, ShortcutOfAFoldedBox_OpensItsGroup) {
    window->resize(1280, 1000);
    show();
    FoldGroup* command = window->side().groups()[2];
    command->setChoice(FoldGroup::Choice::Shut);
    QTest::keyClick(window.get(), Qt::Key_F7);
    EXPECT_TRUE(command->isOpen());
    EXPECT_EQ(window->focusWidget(), widgetOf<QWidget>(panel().ManualCommandText));
}

TEST_F(WindowTest, ShortcutOfAFoldedBox_OpensItsGroupInALowWindowToo) {
    window->resize(1024, 600);
    show();
    FoldGroup* command = window->side().groups()[2];
    ASSERT_FALSE(command->isOpen());
    QTest::keyClick(window.get(), Qt::Key_F7);
    QApplication::processEvents();
    show();
    EXPECT_TRUE(command->isOpen());
    EXPECT_EQ(window->focusWidget(), widgetOf<QWidget>(panel().ManualCommandText));
    QWidget* box = window->focusWidget();
    const QWidget* view = window->side().viewport();
    EXPECT_TRUE(view->rect().contains(box->mapTo(view, box->rect().center())));
}

TEST_F(WindowTest, PlaceOfAFoldedKey_HasNothingToPress) {
    connect();
    window->resize(1280, 1000);
    show();
    panel().MarkerCheckBox.Click();
    show();
    int clicks = 0;
    panel().MarkPkButton.Clicked.connect([&clicks] { ++clicks; });
    auto* key = widgetOf<QWidget>(panel().MarkPkButton);
    const QPoint place = key->mapTo(window.get(), key->rect().center());
    FoldGroup* markers = window->side().groups()[0];
    QTest::mouseClick(&markers->heading(), Qt::LeftButton);
    QApplication::processEvents();
    ASSERT_FALSE(markers->isOpen());
    EXPECT_FALSE(key->isVisible());
    QWidget* there = window->childAt(place);
    EXPECT_NE(there, key);
    if (there != nullptr) QTest::mouseClick(there, Qt::LeftButton);
    EXPECT_EQ(clicks, 0);
}

TEST_F(WindowTest, F12_TakesThePanelAway) {
    show();
    EXPECT_TRUE(window->side().isVisible());
    QTest::keyClick(window.get(), Qt::Key_F12);
    EXPECT_FALSE(window->side().isVisible());
    QTest::keyClick(window.get(), Qt::Key_F12);
    EXPECT_TRUE(window->side().isVisible());
}

TEST_F(WindowTest, ToolOfSingle_WorksTheSameControl) {
    connect();
    show();
    const auto before = panel().CWGraph1.plotSerial();
    QToolButton* single = toolOf(*window, "Single");
    ASSERT_NE(single, nullptr);
    QTest::mouseClick(single, Qt::LeftButton);
    EXPECT_EQ(panel().CWGraph1.plotSerial(), before + 1);
}

TEST_F(WindowTest, EnterWorksTheToolThatHasTheFocus) {
    connect();
    show();
    QToolButton* single = toolOf(*window, "Single");
    ASSERT_NE(single, nullptr);
    const unsigned long before = panel().CWGraph1.plotSerial();
    single->setFocus();
    QTest::keyClick(single, Qt::Key_Return);
    show();
    EXPECT_GT(panel().CWGraph1.plotSerial(), before);
}

TEST_F(WindowTest, ToolOfStop_CanBeUsedWhileTheKeyIsShown) {
    show();
    QToolButton* stop = toolOf(*window, "Stop");
    EXPECT_FALSE(stop->isEnabled());
    panel().StopButton.Visible = true;
    show();
    EXPECT_TRUE(stop->isEnabled());
}

TEST_F(WindowTest, ToolsOfTheConnection_TakeTurns) {
    show();
    EXPECT_TRUE(toolOf(*window, "Connect")->isVisible());
    EXPECT_FALSE(toolOf(*window, "Disconnect")->isVisible());
    connect();
    show();
    EXPECT_FALSE(toolOf(*window, "Connect")->isVisible());
    EXPECT_TRUE(toolOf(*window, "Disconnect")->isVisible());
}

TEST_F(WindowTest, EmptyScreen_GoesWithTheConnection) {
    show();
    auto* words = [this]() -> QLabel* {
        for (QLabel* label : window->graph().findChildren<QLabel*>())
            if (label->text() == "Nothing to show yet") return label;
        return nullptr;
    }();
    ASSERT_NE(words, nullptr);
    EXPECT_TRUE(words->isVisible());
    connect();
    show();
    EXPECT_FALSE(words->isVisible());
}

TEST_F(WindowTest, Connection_IsOfferedAtTheNextStart) {
    window->useSettings(platform.settings);
    connect();
    show();
    const RecentConnections recent(platform.settings);
    ASSERT_EQ(recent.addresses().size(), 1U);
    EXPECT_EQ(recent.names().front().toStdString(), "/dev/zel3, 57600 baud");
}

TEST(RecentConnections, FourthOne_TakesThePlaceOfTheOldest) {
    MemorySettings settings;
    RecentConnections recent(settings);
    for (const int port : {1, 2, 3, 4, 2})
        recent.add({LinkAddress::Kind::Tcp, "host", port, {}, {}});
    const RecentConnections read(settings);
    EXPECT_EQ(read.names().join(" ").toStdString(), "host:2 host:4 host:3");
}

TEST_F(WindowTest, PlaceWithoutABox_HasNoCaptionOfAnotherMenu) {
    connect();
    panel().SweepButton.Click();
    show();
    const auto captions = [this] {
        QStringList texts;
        for (const QLabel* label : window->side().findChildren<QLabel*>("caption"))
            if (label->isVisible()) texts << label->text();
        return texts;
    };
    EXPECT_TRUE(captions().contains("Lev/Del"));
    panel().TraceButton.Click();
    show();
    EXPECT_TRUE(captions().contains("Detector"));
    EXPECT_FALSE(captions().contains("Lev/Del"));
}

TEST_F(WindowTest, KeysOfTheInstrument_AreGreyWithoutOne) {
    ControllerForm& p = panel();
    const std::vector<const Control*> keys = {&p.ResetButton,     &p.AnalyzerButton, &p.PwrButton,
                                              &p.DistFaultButton, &p.TDMAPowerCheck, &p.OccBWCheck,
                                              &p.MarkerCheckBox};
    const auto usable = [&] {
        show();
        return std::count_if(keys.begin(), keys.end(), [this](const Control* key) {
            return widgetOf<QWidget>(*key)->isEnabled();
        });
    };
    EXPECT_EQ(usable(), 0);
    EXPECT_TRUE(p.ResetButton.Enabled);
    EXPECT_TRUE(widgetOf<QWidget>(p.ResetButton)->toolTip().contains("Connect to an instrument"));
    EXPECT_TRUE(widgetOf<QWidget>(p.SpanButton)->isEnabled()) << "it lays out its menu";
    connect();
    EXPECT_EQ(usable(), static_cast<long>(keys.size()));
}

TEST_F(WindowTest, KeyThatWouldOnlyRefuse_IsGreyWithTheReason) {
    show();
    const auto* key = widgetOf<QPushButton>(panel().MarkPkButton);
    EXPECT_FALSE(key->isEnabled());
    EXPECT_TRUE(key->toolTip().contains("Please connect to the intrument first."));
    connect();
    show();
    EXPECT_TRUE(key->isEnabled());
    EXPECT_FALSE(key->toolTip().contains("Please"));
    panel().ContinuosLoopActive = true;
    panel().StopButton.Visible = true;
    show();
    for (const Button* button :
         {&panel().MarkPkButton, &panel().MarkerButton, &panel().ResetButton, &panel().SendButton})
        EXPECT_FALSE(widgetOf<QPushButton>(*button)->isEnabled()) << button->name();
    EXPECT_TRUE(widgetOf<QPushButton>(panel().SpanButton)->isEnabled());
    panel().ContinuosLoopActive = false;
}

TEST_F(WindowTest, Title_SaysFirstWhatIsOnTheScreen) {
    show();
    const QString caption = QString::fromStdString(panel().Caption);
    EXPECT_EQ(window->windowTitle(), caption);
    connect();
    show();
    EXPECT_TRUE(window->windowTitle().endsWith(caption));
    EXPECT_TRUE(window->windowTitle().contains("Analyzer")) << window->windowTitle().toStdString();
}

TEST_F(WindowTest, EntriesOfAMenu_HaveLettersOfTheirOwn) {
    show();
    for (const MenuItem* item : {&panel().FileMenu, &panel().Connection, &panel().ViewMenu}) {
        QMenu* menu = menuOf(*item, window->binder());
        giveLetters(*menu);
        QSet<QChar> letters;
        for (const QAction* action : menu->actions()) {
            if (action->isSeparator() || !action->isVisible()) continue;
            const qsizetype at = action->text().indexOf('&');
            ASSERT_GE(at, 0) << action->text().toStdString();
            const QChar letter = action->text().at(at + 1).toLower();
            EXPECT_FALSE(letters.contains(letter)) << action->text().toStdString();
            letters << letter;
        }
    }
}

}  // namespace
}  // namespace zel
