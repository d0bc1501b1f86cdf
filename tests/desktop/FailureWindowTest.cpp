// What a handler throws in the window, and what an earlier run has left: the report on the screen.

#include <QLineEdit>
#include <QListWidget>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QTest>
#include <QTimer>
#include <stdexcept>

#include "desktop/windows/GuardedApplication.h"
#include "shell/Logs.h"
#include "support/ErrorReport.h"
#include "support/RunTimeError.h"
#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

struct FailureWindow : WindowTest {
    FailureWindow() {
        guarded().catchInto([this] { program->showFailure(); });
    }
    ~FailureWindow() override { guarded().catchInto({}); }
    static GuardedApplication& guarded() {
        return static_cast<GuardedApplication&>(testApplication());
    }
    /// Looks at the report while it stands, and closes it by its key.
    void whenShown(const std::function<void(QWidget&)>& look) {
        platform.events.schedule(50, [this, look] {
            ASSERT_TRUE(program->forms().error.Visible);
            window->binder().flush();
            QApplication::processEvents();
            auto* close = widgetOf<QPushButton>(program->forms().error.ButtonOK);
            ASSERT_TRUE(close->isVisible());
            look(*close->window());
            close->click();
        });
    }
};

TEST_F(FailureWindow, TimerThatThrows_OpensTheReportAndTheProgramEnds) {
    connect();
    show();
    int shown = 0;
    const auto look = [&](QWidget& report) {
        ++shown;
        const ErrorForm& form = program->forms().error;
        EXPECT_FALSE(program->ended()) << "not before the window is closed";
        bool described = false;
        for (auto* line : report.findChildren<QLineEdit*>())
            described = described || line->text().contains("type mismatch");
        EXPECT_TRUE(described);
        widgetOf<QPushButton>(form.CopyToClipboard)->click();
        EXPECT_NE(platform.clipboard.text().find("type mismatch"), std::string::npos);
        EXPECT_TRUE(savePicture(report, "failure"));
    };
    QTimer::singleShot(0, window.get(), [&] {
        whenShown(look);
        throw RunTimeError(13, "Panel", "type mismatch");
    });
    QApplication::processEvents();
    QApplication::processEvents();
    EXPECT_EQ(shown, 1);
    EXPECT_TRUE(program->ended());
    EXPECT_TRUE(program->failed());
    EXPECT_FALSE(panel().isConnected);
}

TEST_F(FailureWindow, KeyWhoseHandlerThrows_OpensTheReport) {
    connect();
    show();
    bool shown = false;
    panel().FrequencyButton.Clicked.connect([&] {
        whenShown([&](QWidget& report) {
            shown = true;
            for (auto* line : report.findChildren<QLineEdit*>())
                if (line->text().contains("lost")) return;
            ADD_FAILURE() << "the failure's words are not there";
        });
        throw std::runtime_error("lost");
    });
    QTest::mouseClick(widgetOf<QPushButton>(panel().FrequencyButton), Qt::LeftButton);
    EXPECT_TRUE(shown);
    EXPECT_TRUE(program->ended());
    EXPECT_TRUE(program->failed());
}

TEST_F(FailureWindow, TraceOfAnEarlierRun_IsOfferedAndTheProgramGoesOn) {
    show();
    bool shown = false;
    whenShown([&](QWidget& report) {
        shown = true;
        bool named = false;
        for (auto* list : report.findChildren<QListWidget*>())
            named = named || !list->findItems("SIGSEGV", Qt::MatchContains).isEmpty();
        EXPECT_TRUE(named);
        EXPECT_TRUE(savePicture(report, "crash"));
    });
    program->errorReport().displayCrash(
        "*******Fatal\r\n          SOURCE      : SIGSEGV\r\n"
        "          DESCRIPTION : the program was ended by a fault\r\n"
        "./zelremote(+0x1234)[0x5581]\n./zelremote(main+0x12)[0x5582]\n");
    EXPECT_TRUE(shown);
    EXPECT_FALSE(program->ended());
}

}  // namespace
}  // namespace zel
