// Connecting without a dialog: the step and the seconds, Cancel, the search over the baud rates;
// a port that has gone and is back.

#include <QCheckBox>
#include <QProgressBar>
#include <QTest>
#include <algorithm>

#include "desktop/windows/ConnectCard.h"
#include "desktop/windows/ReconnectBar.h"
#include "support/SessionLog.h"
#include "support/Text.h"
#include "tests/connection/SwitchedPort.h"
#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

constexpr const char* kPath = "/dev/ttyUSB0";

/// The window over an instrument that can be switched off, at 38400 baud.
struct Connecting : testing::Test {
    Connecting() {
        applyTheme(testApplication(), ThemeChoice::Dark);
        platform.ports.ports = {kPath};
        platform.portProbe.rights[kPath] = {
            .exists = true, .terminal = true, .usable = true, .group = {}};
        program = std::make_unique<Program>(platform.bundle(port), "");
        program->start();
        window = std::make_unique<MainWindow>(*program);
        window->show();
        window->showNow();
        QApplication::processEvents();
    }
    ~Connecting() override { window.reset(); }
    bool connect(int baud) {
        return program->connect({LinkAddress::Kind::Serial, kPath, baud}, true);
    }
    QFrame* card() const {
        for (QFrame* frame : window->findChildren<QFrame*>("card"))
            if (frame->accessibleName() == "Connecting") return frame;
        return nullptr;
    }
    QPushButton* key(const QString& text) const {
        for (QPushButton* button : card()->findChildren<QPushButton*>())
            if (button->text() == text && button->isVisible()) return button;
        return nullptr;
    }
    bool says(const QString& text) const {
        for (const QLabel* label : card()->findChildren<QLabel*>())
            if (label->isVisible() && label->text().contains(text)) return true;
        return false;
    }

    VirtualPlatform platform;
    SwitchedPort port{platform.clock, platform.events, {}, {.baud = 38400}};
    std::unique_ptr<Program> program;
    std::unique_ptr<MainWindow> window;
};

TEST_F(Connecting, ShowsTheStepAndTheSeconds) {
    port.on = false;
    bool looked = false;
    platform.events.schedule(4700, [&] {
        window->showNow();
        ASSERT_TRUE(card()->isVisible());
        EXPECT_TRUE(says("Connecting to /dev/ttyUSB0, 38400 baud"));
        EXPECT_TRUE(says("Port open, waiting for the instrument, 4 of 9 s"));
        const auto* bar = card()->findChild<QProgressBar*>();
        EXPECT_EQ(bar->value(), 4);
        EXPECT_EQ(bar->maximum(), 9);
        EXPECT_EQ(key("Search Baud Rates"), nullptr);
        savePicture(*window, "connecting");
        looked = true;
    });
    EXPECT_FALSE(connect(38400));
    EXPECT_TRUE(looked);
    EXPECT_TRUE(card()->isVisible());
    EXPECT_TRUE(says("check that the instrument is on"));
}

TEST_F(Connecting, Cancel_LeavesAtOnceAndShowsTheWaysToBegin) {
    port.on = false;
    platform.events.schedule(3000, [&] {
        window->showNow();
        ASSERT_NE(key("Cancel"), nullptr);
        QTest::mouseClick(key("Cancel"), Qt::LeftButton);
    });
    const std::int64_t began = platform.clock.micros();
    EXPECT_FALSE(connect(38400));
    EXPECT_LT(platform.clock.micros() - began, 3'100'000);
    window->showNow();
    EXPECT_FALSE(card()->isVisible());
    EXPECT_TRUE(platform.boxes.boxes().empty());
    EXPECT_FALSE(port.isOpen());
}

TEST_F(Connecting, AfterAFailure_TheSearchConnectsAtTheRateThatAnswers) {
    EXPECT_FALSE(connect(57600));
    window->showNow();
    EXPECT_TRUE(says("No instrument was found"));
    ASSERT_NE(key("Search Baud Rates"), nullptr);
    savePicture(*window, "connect-failed");
    platform.events.schedule(1500, [&] {
        EXPECT_TRUE(says("Searching the baud rate"));
        EXPECT_NE(key("Cancel"), nullptr);
    });
    QTest::mouseClick(key("Search Baud Rates"), Qt::LeftButton);
    EXPECT_TRUE(program->forms().controller.isConnected);
    EXPECT_EQ(program->forms().main.BaudList.Text(), "38400");
    window->showNow();
    EXPECT_FALSE(card()->isVisible());
}

TEST_F(Connecting, AfterAFailure_TryAgainMakesTheSameAttempt) {
    port.on = false;
    EXPECT_FALSE(connect(38400));
    window->showNow();
    port.on = true;
    ASSERT_NE(key("Try Again"), nullptr);
    QTest::mouseClick(key("Try Again"), Qt::LeftButton);
    EXPECT_TRUE(program->forms().controller.isConnected);
}

TEST_F(Connecting, Close_PutsTheFailureAway) {
    port.on = false;
    EXPECT_FALSE(connect(38400));
    window->showNow();
    ASSERT_NE(key("Close"), nullptr);
    QTest::mouseClick(key("Close"), Qt::LeftButton);
    EXPECT_FALSE(card()->isVisible());
}

TEST_F(Connecting, EnterPressesTheKeyThatHasTheFocus) {
    port.on = false;
    EXPECT_FALSE(connect(57600));
    window->showNow();
    QPushButton* search = key("Search Baud Rates");
    ASSERT_NE(search, nullptr);
    search->setFocus();
    port.on = true;
    QTest::keyClick(search, Qt::Key_Return);
    EXPECT_TRUE(program->forms().controller.isConnected);
}

TEST_F(Connecting, EscLeavesTheSearchAndPutsTheFailureAway) {
    port.on = false;
    EXPECT_FALSE(connect(57600));
    window->showNow();
    int left = 0;
    platform.events.schedule(1000, [&] {
        window->showNow();
        QPushButton* cancel = key("Cancel");
        ASSERT_NE(cancel, nullptr);
        ++left;
        QTest::keyClick(cancel, Qt::Key_Escape);
    });
    const double begun = platform.clock.date();
    key("Search Baud Rates")->click();
    EXPECT_EQ(left, 1);
    EXPECT_LT((platform.clock.date() - begun) * 86400, 5) << "five silent rates take longer";
    EXPECT_FALSE(connect(57600));
    window->showNow();
    ASSERT_NE(key("Close"), nullptr);
    QTest::keyClick(key("Close"), Qt::Key_Escape);
    EXPECT_FALSE(card()->isVisible());
}

TEST_F(Connecting, FailedAttempt_LeavesNoTimeOfASession) {
    const auto shown = [this] {
        platform.events.runFor(2000);
        window->showNow();
        const Label& time = program->forms().controller.TimeLabel;
        return qobject_cast<QWidget*>(window->binder().widgetOf(time))->isVisible();
    };
    EXPECT_TRUE(shown()) << "the time of day";
    port.on = false;
    EXPECT_FALSE(connect(57600));
    EXPECT_FALSE(shown());
    port.on = true;
    ASSERT_TRUE(connect(38400));
    EXPECT_TRUE(shown());
}

TEST_F(Connecting, Dialog_OffersTheSearchToo) {
    port.on = false;
    MainForm& form = program->forms().main;
    QPushButton* search = nullptr;
    platform.events.schedule(0, [&] {
        form.COMList.setText(kPath);
        form.BaudList.setText("57600");
        form.ZELButton.Click();
        window->showNow();
        search = qobject_cast<QPushButton*>(window->binder().widgetOf(form.SearchRatesButton));
        ASSERT_NE(search, nullptr);
        EXPECT_TRUE(search->isVisible());
        EXPECT_FALSE(card()->isVisible()) << "the dialog says it";
        savePicture(*search->window(), "connect-dialog-failed");
        port.on = true;
        search->click();
    });
    program->forms().controller.Direct.Click();
    EXPECT_TRUE(program->forms().controller.isConnected);
    EXPECT_FALSE(form.Visible);
}

TEST_F(Connecting, DialogWithoutAConnection_HasNothingToDisconnect) {
    MainForm& form = program->forms().main;
    const auto usable = [&] {
        window->showNow();
        return qobject_cast<QWidget*>(window->binder().widgetOf(form.DisconnectButton))
            ->isEnabled();
    };
    bool meanwhile = false;
    platform.events.schedule(0, [&] {
        EXPECT_FALSE(usable());
        port.on = false;
        form.COMList.setText(kPath);
        form.BaudList.setText("57600");
        platform.events.schedule(500, [&] { meanwhile = usable(); });
        form.ZELButton.Click();
        EXPECT_TRUE(meanwhile) << "it ends an attempt";
        EXPECT_FALSE(usable());
        EXPECT_TRUE(form.DisconnectButton.Enabled) << "who clicks by name hears why";
        form.CancelConnButton1.Click();
    });
    program->forms().controller.Direct.Click();
}

TEST_F(Connecting, PortThatIsBack_IsOfferedOnALineOverTheGraph) {
    ControllerForm& panel = program->forms().controller;
    ASSERT_TRUE(connect(38400));
    auto* bar = qobject_cast<QWidget*>(window->binder().widgetOf(panel.ReconnectFrame));
    ASSERT_NE(bar, nullptr);
    EXPECT_FALSE(bar->isVisible());
    platform.portProbe.rights.clear();
    port.close();
    platform.events.runFor(1500);
    window->showNow();
    EXPECT_TRUE(panel.LinkLost);
    EXPECT_TRUE(panel.UpNow.Enabled);
    EXPECT_FALSE(port.isOpen());
    EXPECT_TRUE(bar->isVisible());
    platform.portProbe.rights[kPath] = {
        .exists = true, .terminal = true, .usable = true, .group = {}};
    platform.events.runFor(1500);
    window->showNow();
    QApplication::processEvents();
    savePicture(*window, "port-back");
    auto* again = qobject_cast<QPushButton*>(window->binder().widgetOf(panel.ReconnectButton));
    ASSERT_TRUE(again->isVisible());
    auto* always = bar->findChild<QCheckBox*>();
    always->click();
    EXPECT_TRUE(panel.ReconnectAlways.Checked);
    EXPECT_TRUE(always->isChecked());
    const std::vector<std::string> record = program->sessionLog().lastLines();
    EXPECT_TRUE(std::any_of(record.begin(), record.end(), [](const std::string& line) {
        return contains(line, " click ReconnectAlways");
    }));
    again->click();
    EXPECT_TRUE(panel.isConnected);
    window->showNow();
    QApplication::processEvents();
    EXPECT_FALSE(again->isVisible());
    // The keys of the units follow the boxes.
    const auto* units = window->findChild<QWidget*>("TerminatorRow");
    EXPECT_TRUE(QTest::qWaitFor(
        [units] { return units->findChildren<QPushButton*>().first()->text() == "GHz"; }));
    savePicture(*window, "port-reconnected");
}

}  // namespace
}  // namespace zel
