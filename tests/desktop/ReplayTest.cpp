// A session at the window, written down, runs again in the console and sends the same bytes.

#include <QClipboard>
#include <QFile>
#include <QLineEdit>
#include <QProcess>
#include <QPushButton>
#include <QTemporaryDir>
#include <QTest>

#include "support/LoggedDialogs.h"
#include "support/SessionLog.h"
#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

/// The same bundle with boxes and file dialogs whose answers are written down.
Platform withDialogs(const Platform& p, MessageBoxes& boxes, FileDialogs& dialogs) {
    return {p.clock,     p.events,     boxes,          p.serialPort, p.serialPorts,
            p.tcpSocket, p.serverPort, p.serverSocket, p.settings,   p.debug,
            p.clipboard, p.launcher,   p.startup,      p.folder,     dialogs,
            p.files,     p.endSignals, p.machine,      p.portProbe};
}

struct RecordedDesk : WindowTest {
    RecordedDesk() {
        window.reset();
        program = std::make_unique<Program>(withDialogs(platform.bundle(port), boxes, dialogs), "");
        boxes.log = dialogs.log = &program->sessionLog();
        program->start();
        window = std::make_unique<MainWindow>(*program);
        show();
    }
    ~RecordedDesk() override {
        window.reset();
        program.reset();
    }
    /// A session that is connected and written down from its beginning.
    void recordConnected() {
        ASSERT_TRUE(program->recordSession("/session.log", "zelremote"));
        program->sessionLog().input("connect");
        connect();
        window->showNow();
    }
    void press(const Control& control) {
        QTest::mouseClick(widgetOf<QPushButton>(control), Qt::LeftButton);
        window->showNow();
    }
    void trigger(const Control& control) {
        qobject_cast<QAction*>(window->binder().widgetOf(control))->trigger();
        window->showNow();
    }
    /// Ends the record, which the console then plays with the same bytes on the line.
    std::string expectSameBytesAgain() {
        program->sessionLog().end();
        const std::string log = platform.files.bytes("/session.log");
        EXPECT_EQ(parseSession(log).problem, "");
        QTemporaryDir folder;
        QFile file(folder.filePath("session.log"));
        EXPECT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(QByteArray::fromStdString(log));
        file.close();
        QProcess zelctl;
        zelctl.setProcessChannelMode(QProcess::MergedChannels);
        zelctl.setWorkingDirectory(folder.path());
        zelctl.start(ZEL_PROGRAMS "/zelctl", {"replay", file.fileName()});
        zelctl.waitForFinished();
        EXPECT_EQ(zelctl.exitCode(), 0) << zelctl.readAll().toStdString() << log;
        return log;
    }
    LoggedBoxes boxes{platform.boxes};
    LoggedFileDialogs dialogs{platform.fileDialogs};
};

TEST_F(RecordedDesk, ClicksAnswersAndDrags_SendTheSameBytesAgain) {
    recordConnected();
    auto* box = widgetOf<QLineEdit>(panel().SoftTextBox(0));
    QTest::keyClicks(box, "900M");
    QTest::keyClick(box, Qt::Key_Return);
    QTest::mouseClick(widgetOf<QWidget>(panel().MarkerCheckBox), Qt::LeftButton, {}, {8, 8});
    window->showNow();
    GraphWidget& graph = window->graph();
    const int from = qRound(graph.xAxis->coordToPixel(panel().CWGraph1.cursor(1).X));
    QTest::mousePress(&graph, Qt::LeftButton, {}, {from, graph.height() / 2});
    QTest::mouseMove(&graph, {from - 90, graph.height() / 2});
    QTest::mouseRelease(&graph, Qt::LeftButton, {}, {from - 90, graph.height() / 2});
    platform.fileDialogs.answer("view.csv");
    trigger(panel().SaveCurrentView);
    trigger(panel().SaveCurrentView);  // cancelled
    platform.boxes.answer(BoxAnswer::Ok);
    trigger(panel().Disconnect);
    const std::string log = expectSameBytesAgain();
    for (const char* line :
         {"input connect", "input answer view.csv", "input answer cancel", "input move2d 1 "})
        EXPECT_NE(log.find(line), std::string::npos) << line;
}

TEST_F(RecordedDesk, RecordBegunInsideTheSession_RunsAgainFromItsStart) {
    program->sessionLog().input("connect");
    connect();
    window->showNow();
    auto* box = widgetOf<QLineEdit>(panel().SoftTextBox(0));
    QTest::keyClicks(box, "900M");
    QTest::keyClick(box, Qt::Key_Return);
    platform.fileDialogs.answer("/session.log");
    trigger(panel().UtilityRecord);
    EXPECT_TRUE(panel().UtilityRecord.Checked);
    QTest::keyClicks(box, "800M");
    QTest::keyClick(box, Qt::Key_Return);
    trigger(panel().UtilityRecord);
    EXPECT_FALSE(panel().UtilityRecord.Checked);
    QTest::keyClicks(box, "700M");
    QTest::keyClick(box, Qt::Key_Return);
    const std::string log = expectSameBytesAgain();
    EXPECT_NE(log.find("|FREQ,900000000.|"), std::string::npos);
    EXPECT_NE(log.find("|FREQ,800000000.|"), std::string::npos);
    EXPECT_EQ(log.find("|FREQ,700000000.|"), std::string::npos) << "after the record";
    program->disconnect();
}

TEST_F(RecordedDesk, KeysInABox_LeaveTheSameTextAgain) {
    recordConnected();
    auto* box = widgetOf<QLineEdit>(panel().SoftTextBox(0));
    QTest::keyClicks(box, "95");
    QTest::keyClick(box, Qt::Key_Backspace);
    QTest::keyClicks(box, "00M");
    QTest::keyClick(box, Qt::Key_Return);
    // The cursor first, so that the text stays; then within it.
    QTest::keyClick(box, Qt::Key_Home);
    QTest::keyClick(box, Qt::Key_Right);
    QTest::keyClick(box, Qt::Key_Left);
    QTest::keyClick(box, Qt::Key_Delete);
    QTest::keyClicks(box, "8");
    QTest::keyClick(box, Qt::Key_Return);
    QApplication::clipboard()->setText("700M");
    box->selectAll();
    box->paste();
    QTest::keyClick(box, Qt::Key_Return);
    // Nothing was typed since: this Enter sends nothing.
    QTest::keyClick(box, Qt::Key_Return);
    program->disconnect();
    const std::string log = expectSameBytesAgain();
    for (const char* sent : {"|FREQ,900000000.|", "|FREQ,800000000.|", "|FREQ,700000000.|"}) {
        EXPECT_NE(log.find(sent), std::string::npos) << sent;
        EXPECT_EQ(log.find(sent), log.rfind(sent)) << sent;
    }
}

TEST_F(RecordedDesk, StopWhileASweepIsDrawn_EndsTheViewAtTheSamePass) {
    recordConnected();
    // On a desk drawing takes its time, in the console it takes none.
    constexpr double kDrawing = 17;  // ms
    std::size_t drawn = 0;
    const auto sweeps = panel().CWGraph1.Changed.connect([&] {
        if (panel().ContinuosLoopActive && ++drawn % 4 == 0) platform.clock.advance(kDrawing);
    });
    platform.events.schedule(300, [&] { press(panel().StopButton); });
    press(panel().PlayContinuousButton);
    EXPECT_FALSE(panel().ContinuosLoopActive);
    platform.events.runFor(1700);
    press(panel().FrequencyButton);
    QTest::keyClicks(widgetOf<QLineEdit>(panel().SoftTextBox(0)), "900M");
    QTest::keyClick(widgetOf<QLineEdit>(panel().SoftTextBox(0)), Qt::Key_Return);
    platform.events.runFor(200);
    program->disconnect();
    expectSameBytesAgain();
}

TEST_F(RecordedDesk, QuestionThatStandsOpen_LetsARecordingGoOnAgain) {
    recordConnected();
    platform.fileDialogs.answer("rec.csv");
    TimeForm& time = program->forms().time;
    platform.events.schedule(50, [&] {
        window->showNow();
        QTest::keyClicks(widgetOf<QLineEdit>(time.TimeIntervalBox), "1");
        press(time.SubmitTimeButton);
    });
    trigger(panel().RecordData);
    platform.events.runFor(2500);
    platform.boxes.whileShown = [&](const Box& box) {
        if (box.buttons != BoxButtons::Ok) platform.events.runFor(2500);
    };
    platform.boxes.answer(BoxAnswer::Ok);
    trigger(panel().Disconnect);
    const std::string log = expectSameBytesAgain();
    const auto asked = log.find("click Disconnect");
    EXPECT_NE(log.find("|TRACEBIN.|", asked), std::string::npos) << "while the box stands open";
}

}  // namespace
}  // namespace zel
