// Files on the panel: the recent ones, a dropped one, the bar of a series that plays, the progress,
// and the recording's dialog.

#include <QDir>
#include <QDropEvent>
#include <QFile>
#include <QMenu>
#include <QMimeData>
#include <QTemporaryDir>
#include <QTest>
#include <QUrl>

#include "support/SessionLog.h"
#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

class FilesFrontTest : public WindowTest {
  protected:
    void SetUp() override {
        show();
        // The routine that loads is not asked here, only whether it is called.
        panel().OpenFile.connect([this](const std::string& path) { opened_.push_back(path); });
    }
    QString makeFile(const QString& name) {
        QFile file(folder_.filePath(name));
        EXPECT_TRUE(file.open(QIODevice::WriteOnly));
        file.write("nothing");
        return file.fileName();
    }
    /// True when the window takes what is dropped.
    bool drop(const QList<QUrl>& urls) {
        QMimeData data;
        data.setUrls(urls);
        QDragEnterEvent enter({10, 10}, Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
        QApplication::sendEvent(window.get(), &enter);
        QDropEvent event({10, 10}, Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
        QApplication::sendEvent(window.get(), &event);
        QApplication::processEvents();
        EXPECT_EQ(enter.isAccepted(), event.isAccepted());
        return event.isAccepted();
    }
    QAction* actionOf(const MenuItem& item) {
        window->binder().flush();
        return qobject_cast<QAction*>(window->binder().widgetOf(item));
    }

    /// The last two lines of the session's record without their times.
    std::string written() {
        std::vector<std::string> lines = program->sessionLog().lastLines();
        if (lines.size() < 2) return {};
        for (std::string& line : lines) line.erase(0, line.find(' ') + 1);
        return lines[lines.size() - 2] + ", " + lines.back();
    }

    QTemporaryDir folder_;
    std::vector<std::string> opened_;
};

TEST_F(FilesFrontTest, DroppedFile_IsOpened) {
    const QString path = makeFile("view.txt");
    EXPECT_TRUE(drop({QUrl::fromLocalFile(path)}));
    EXPECT_EQ(opened_, std::vector<std::string>{path.toStdString()});
    // As a choice in the dialog: the session can run again.
    EXPECT_EQ(written(), "click LoadData, input answer " + path.toStdString());
}

TEST_F(FilesFrontTest, FileOfTheCommandLine_IsOpenedAndWrittenDown) {
    const QString path = makeFile("view.txt");
    window->openFile(QDir::current().relativeFilePath(path));
    EXPECT_EQ(opened_, std::vector<std::string>{path.toStdString()});
    EXPECT_EQ(written(), "click LoadData, input answer " + path.toStdString());
}

TEST_F(FilesFrontTest, DropOfAnythingElse_IsRefused) {
    const QString path = makeFile("view.txt");
    EXPECT_FALSE(drop({}));
    EXPECT_FALSE(drop({QUrl("http://localhost/view.txt")}));
    EXPECT_FALSE(drop({QUrl::fromLocalFile(folder_.path())}));
    EXPECT_FALSE(drop({QUrl::fromLocalFile(folder_.filePath("missing.txt"))}));
    EXPECT_FALSE(drop({QUrl::fromLocalFile(path), QUrl::fromLocalFile(makeFile("other.txt"))}));
    EXPECT_TRUE(opened_.empty());
}

TEST_F(FilesFrontTest, DropWhileWorkIsUnderWay_IsRefused) {
    const QString path = makeFile("view.txt");
    panel().MousePointer = 11;
    EXPECT_FALSE(drop({QUrl::fromLocalFile(path)}));
    EXPECT_TRUE(opened_.empty());
    panel().MousePointer = 0;
    EXPECT_TRUE(drop({QUrl::fromLocalFile(path)}));
}

TEST_F(FilesFrontTest, EntryBoxes_LeaveDropsToTheWindow) {
    EXPECT_TRUE(window->acceptDrops());
    EXPECT_FALSE(widgetOf<QLineEdit>(panel().SoftTextBox(0))->acceptDrops());
    EXPECT_FALSE(widgetOf<QLineEdit>(panel().ManualCommandText)->acceptDrops());
}

TEST_F(FilesFrontTest, RecentMenu_WithoutFiles_IsDisabled) {
    const QAction* menu = actionOf(panel().RecentMenu);
    ASSERT_NE(menu->menu(), nullptr);
    EXPECT_FALSE(menu->isEnabled());
}

TEST_F(FilesFrontTest, RecentMenu_ShowsNamesWithTheirPathsAndRunsThem) {
    panel().RecentMenu.Enabled = true;
    for (int i = 0; i < panel().RecentFile.count(); ++i) panel().RecentFile(i).Visible = i < 2;
    panel().RecentFile(1).Caption = "R&D.txt";
    panel().RecentFile(1).ToolTip = "/data/R&D.txt";
    int clicks = 0;
    panel().RecentFile(1).Clicked.connect([&clicks] { ++clicks; });
    QAction* entry = actionOf(panel().RecentFile(1));
    const QMenu* menu = actionOf(panel().RecentMenu)->menu();
    EXPECT_TRUE(actionOf(panel().RecentMenu)->isEnabled());
    EXPECT_TRUE(menu->actions().contains(entry));
    EXPECT_TRUE(menu->toolTipsVisible());
    EXPECT_EQ(entry->text(), "R&&D.txt");
    EXPECT_EQ(entry->toolTip(), "/data/R&D.txt");
    EXPECT_TRUE(entry->isVisible());
    EXPECT_FALSE(actionOf(panel().RecentFile(2))->isVisible());
    entry->trigger();
    EXPECT_EQ(clicks, 1);
    EXPECT_EQ(written(), "click LoadData, input answer /data/R&D.txt");
}

TEST_F(FilesFrontTest, PlaybackBar_IsSeenWhileASeriesPlays) {
    const Slider& speed = program->forms().specialMeas.sldSpeed;
    const auto* bar = widgetOf<QWidget>(panel().PlaybackFrame);
    ASSERT_NE(bar, nullptr);
    EXPECT_FALSE(bar->isVisible());
    panel().PlaybackFrame.Visible = true;
    show();
    EXPECT_TRUE(bar->isVisible());
    EXPECT_TRUE(widgetOf<QSlider>(speed)->isVisible());
    EXPECT_EQ(widgetOf<QSlider>(speed)->toolTip(), "Set the speed for loading traces.");
    panel().PlaybackFrame.Visible = false;
    show();
    EXPECT_FALSE(bar->isVisible());
}

TEST_F(FilesFrontTest, SpeedSlider_WorksUnderTheHourglass) {
    Slider& speed = program->forms().specialMeas.sldSpeed;
    panel().PlaybackFrame.Visible = true;
    show();
    int scrolls = 0;
    speed.Scrolled.connect([&scrolls] { ++scrolls; });
    panel().MousePointer = 11;
    panel().AcquisitionRunning = true;
    auto* slider = widgetOf<QSlider>(speed);
    EXPECT_EQ(slider->minimum(), 0);
    EXPECT_EQ(slider->maximum(), 10);
    EXPECT_EQ(slider->value(), 10);
    QTest::keyClick(slider, Qt::Key_Left);
    EXPECT_EQ(speed.Value, 9);
    QTest::keyClick(slider, Qt::Key_Home);
    EXPECT_EQ(speed.Value, 0);
    EXPECT_EQ(scrolls, 2);
    panel().AcquisitionRunning = false;
    panel().MousePointer = 0;
}

TEST_F(FilesFrontTest, Progress_IsSeenAsLongAsThereIsAny) {
    auto* label = widgetOf<QLabel>(panel().FileLabel);
    EXPECT_TRUE(label->text().isEmpty());
    panel().FileLabel.Caption = "Trace 3 of 9";
    show();
    EXPECT_EQ(label->text(), "Trace 3 of 9");
    EXPECT_TRUE(label->isVisible());
    EXPECT_GE(label->width(), label->fontMetrics().horizontalAdvance(label->text()));
}

TEST_F(FilesFrontTest, RecordingDialog_HasItsControlsAndTheFocusInItsField) {
    TimeForm& form = program->forms().time;
    form.Show();
    show();
    for (const Control* control : form.controls()) {
        if (control->kind() == ControlKind::Timer) continue;
        auto* widget = widgetOf<QWidget>(*control);
        ASSERT_NE(widget, nullptr) << control->name();
        EXPECT_TRUE(widget->isVisible()) << control->name();
    }
    auto* dialog = window->findChild<QDialog*>("TimeForm");
    EXPECT_EQ(dialog->windowTitle(), "Record Data");
    EXPECT_EQ(dialog->focusWidget(), widgetOf<QWidget>(form.TimeIntervalBox));
    EXPECT_TRUE(widgetOf<QPushButton>(form.SubmitTimeButton)->isDefault());
    EXPECT_EQ(widgetOf<QLabel>(form.lblRecText)->text().toStdString(),
              form.lblRecText.Caption.get());
    EXPECT_TRUE(savePicture(*dialog, "record"));
    form.Hide();
    window->binder().flush();
}

TEST_F(FilesFrontTest, EnterInTheRecordingDialog_PressesOkAndEscCancel) {
    TimeForm& form = program->forms().time;
    form.Show();
    show();
    int accepted = 0;
    int cancelled = 0;
    auto* dialog = window->findChild<QDialog*>("TimeForm");
    form.CancelTimeButton.Clicked.connect([&cancelled] { ++cancelled; });
    QTest::keyClick(dialog, Qt::Key_Escape);
    EXPECT_EQ(cancelled, 1);
    form.Show();
    show();
    form.SubmitTimeButton.Clicked.connect([&accepted] { ++accepted; });
    platform.boxes.answer(BoxAnswer::No);
    QTest::keyClick(widgetOf<QWidget>(form.TimeIntervalBox), Qt::Key_Return);
    EXPECT_EQ(accepted, 1);
    form.Hide();
    window->binder().flush();
}

TEST_F(FilesFrontTest, EscInTheGraphSettings_LeavesTheScaleAlone) {
    panel().UtilityGraphSettings.Click();
    show();
    ManualScaleForm& form = program->forms().manualScale;
    ASSERT_TRUE(form.Visible);
    auto* dialog = window->findChild<QDialog*>("ManualScaleForm");
    EXPECT_EQ(dialog->focusWidget(), widgetOf<QWidget>(form.manualSizeMax));
    EXPECT_TRUE(savePicture(*dialog, "scale"));
    const GraphAxis before = panel().CWGraph1.yAxis();
    QTest::keyClicks(widgetOf<QLineEdit>(form.manualSizeMax), "77");
    QTest::keyClick(dialog, Qt::Key_Escape);
    EXPECT_FALSE(form.Visible);
    EXPECT_EQ(panel().CWGraph1.yAxis().Maximum, before.Maximum);
}

TEST_F(FilesFrontTest, PowerSensorDialog_OffersBothReadings) {
    PowerAndReflForm& form = program->forms().powerAndRefl;
    form.Show();
    show();
    auto* dialog = window->findChild<QDialog*>("PowerAndReflForm");
    EXPECT_TRUE(dialog->isVisible());
    EXPECT_TRUE(widgetOf<QRadioButton>(form.PowerOnlyOption)->isVisible());
    widgetOf<QRadioButton>(form.PowerAndLeflOption)->click();
    EXPECT_TRUE(form.PowerAndLeflOption.Value());
    EXPECT_TRUE(form.ReadPowerAndRefl);
    EXPECT_TRUE(widgetOf<QPushButton>(form.ClosePwrForm)->isDefault());
    EXPECT_TRUE(savePicture(*dialog, "power"));
    QTest::keyClick(dialog, Qt::Key_Escape);
    window->binder().flush();
    EXPECT_FALSE(dialog->isVisible());
}

}  // namespace
}  // namespace zel
