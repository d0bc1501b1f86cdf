// Pictures of the states that are rarer than the panel's menus, in both themes and at three sizes.

#include <QAction>
#include <QDialog>
#include <QDockWidget>
#include <QProgressBar>
#include <QStatusBar>
#include <QTest>
#include <QToolBar>

#include "tests/desktop/Looks.h"
#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

/// A recording of that many traces, a minute apart.
std::string recordingOf(int count) {
    std::string text;
    for (int i = 0; i < count; ++i) {
        text += "Trace Name;Trace\r\nTime;10:" + std::to_string(10 + i) +
                ":00\r\nMeasurement Type;Analyzer\r\nReference Level;-20\r\n"
                "Reference Range;10 dB/DIV\r\nReference Unit;dBm\r\nTrace Detector;Sample\r\n"
                "Trace Write Pointer;0\r\nHz\r\n";
        for (int k = 0; k < 301; ++k) {
            const int carrier = std::max(0, 55 - std::abs(k - 60 - 4 * i) * 8);
            const int level = -95 + carrier + (k * k * 31 + k * 17 + i * 13) % 7;
            text +=
                std::to_string(2400000000LL + k * 100000LL) + ";" + std::to_string(level) + "\r\n";
        }
    }
    return text;
}

class LooksOfStates : public WindowTest, public testing::WithParamInterface<Look> {
  protected:
    void SetUp() override {
        putOn(GetParam(), *program, window);
        window->resize(GetParam().size);
        show();
    }
    ~LooksOfStates() override { takeOff(); }

    void picture(QWidget& widget, const char* state) {
        show();
        EXPECT_TRUE(savePicture(widget, QString(GetParam().name) + "-" + state));
    }
    QAction* tool(const char* text) {
        for (QAction* action : window->findChildren<QToolBar*>().first()->actions())
            if (action->text() == QObject::tr(text)) return action;
        return nullptr;
    }
    void sweeps(int count) {
        for (int i = 0; i < count; ++i) panel().PlaySingleButton.Click();
    }
    void load(int traces) {
        platform.files.put("/data/monitor.csv", recordingOf(traces));
        panel().OpenFile("/data/monitor.csv");
    }
};

TEST_P(LooksOfStates, SpectrogramAndTools_ArePictures) {
    connect();
    panel().SpectrogramShow.Click();
    sweeps(40);
    picture(*window, "spectrogram");
    auto* tools = window->findChild<QDockWidget*>("TraceTools");
    ASSERT_NE(tools, nullptr);
    tools->show();
    picture(*tools, "tools");
}

TEST_P(LooksOfStates, LoadedFile_BearsItsNameAndHasNoBar) {
    load(1);
    picture(*window, "file");
    EXPECT_FALSE(widgetOf<QWidget>(panel().PlaybackFrame)->isVisible());
    EXPECT_FALSE(widgetOf<QWidget>(panel().PaceLabel)->parentWidget()->isVisible()) << "empty";
}

TEST_P(LooksOfStates, LoadedRecording_HasTheBar) {
    load(40);
    panel().PlaybackBack.Click();
    picture(*window, "recording-loaded");
    for (const Label* label : {&panel().CFLabel, &panel().SpanLabel, &panel().PlaybackLabel}) {
        const auto* shown = widgetOf<QLabel>(*label);
        EXPECT_GE(shown->width(), shown->fontMetrics().horizontalAdvance(shown->text()));
    }
    EXPECT_TRUE(widgetOf<QWidget>(panel().PlaybackFrame)->isVisible());
    EXPECT_EQ(widgetOf<QSlider>(panel().PlaybackPosition)->value(), 39);
    EXPECT_EQ(widgetOf<QSlider>(panel().PlaybackPosition)->maximum(), 40);
}

TEST_P(LooksOfStates, PressOnTheGroove_ShowsTheTraceOfThatPlace) {
    load(40);
    show();
    auto* slider = widgetOf<QSlider>(panel().PlaybackPosition);
    const auto at = [slider](double share) {
        return QPoint(qRound(slider->width() * share), slider->height() / 2);
    };
    const auto shown = [this]() -> int { return panel().PlaybackPosition.Value; };
    ASSERT_EQ(shown(), 40);
    QTest::mousePress(slider, Qt::LeftButton, {}, at(0.25));
    EXPECT_NEAR(shown(), 10.5, 1);
    QTest::mouseMove(slider, at(0.5));
    EXPECT_NEAR(shown(), 20.5, 1);
    QTest::mouseMove(slider, at(0.75));
    QTest::mouseRelease(slider, Qt::LeftButton, {}, at(0.75));
    EXPECT_NEAR(shown(), 30.5, 1);
    EXPECT_FALSE(slider->isSliderDown());
    const int there = shown();
    QTest::mouseMove(slider, at(0.1));
    EXPECT_EQ(shown(), there) << "the button is up";
    QTest::mouseClick(slider, Qt::LeftButton, {}, at(1));
    EXPECT_EQ(shown(), 40);
}

TEST_P(LooksOfStates, PlayingRecording_HasTheBarAtWork) {
    load(40);
    widgetOf<QSlider>(panel().PlaybackPosition)->setValue(12);
    program->forms().specialMeas.sldSpeed.Value = 5;
    const int pause = program->forms().specialMeas.seriesPauseMs();
    ASSERT_GT(pause, 0);
    platform.events.schedule(4 * pause + pause / 2, [this] {
        picture(*window, "playback");
        EXPECT_TRUE(panel().SeriesPlays);
        const bool english = GetParam().english();
        EXPECT_EQ(widgetOf<QPushButton>(panel().PlaybackPlay)->text(),
                  english ? "Pause" : "Anhalten");
        EXPECT_EQ(widgetOf<QLabel>(panel().PlaybackLabel)->text(),
                  english ? "16 of 40   10:25:00" : "16 von 40   10:25:00");
        EXPECT_EQ(widgetOf<QSlider>(panel().PlaybackPosition)->value(), 16);
        EXPECT_FALSE(tool("Connect")->isEnabled()) << "it does nothing now";
        EXPECT_FALSE(window->statusBar()->findChild<QProgressBar*>()->isVisible()) << "of nothing";
        panel().PlaybackPlay.Click();
    });
    panel().PlaybackPlay.Click();
    EXPECT_FALSE(panel().SeriesPlays);
    show();
    EXPECT_TRUE(tool("Connect")->isEnabled());
}

TEST_P(LooksOfStates, PlayingRecordingBesideAnInstrument_GreysWhatHasToWait) {
    connect();
    load(40);
    widgetOf<QSlider>(panel().PlaybackPosition)->setValue(12);
    program->forms().specialMeas.sldSpeed.Value = 5;
    const int pause = program->forms().specialMeas.seriesPauseMs();
    const auto enabled = [this](const Control& control) {
        return widgetOf<QWidget>(control)->isEnabled();
    };
    platform.events.schedule(2 * pause + pause / 2, [&, this] {
        show();
        EXPECT_FALSE(enabled(panel().PlaySingleButton) || enabled(panel().SoftKey(0)) ||
                     enabled(panel().AnalyzerButton) || enabled(panel().SpanButton));
        EXPECT_TRUE(enabled(panel().PlaybackPlay) && enabled(panel().PlaybackPosition) &&
                    enabled(panel().StopButton) && enabled(panel().cmdZoom));
        EXPECT_FALSE(tool("Open")->isEnabled());
        EXPECT_TRUE(tool("Stop")->isEnabled());
        panel().PlaybackPlay.Click();
    });
    panel().PlaybackPlay.Click();
    show();
    EXPECT_TRUE(enabled(panel().PlaySingleButton) && enabled(panel().SoftKey(0)) &&
                enabled(panel().AnalyzerButton) && enabled(panel().SpanButton));
    EXPECT_TRUE(tool("Open")->isEnabled());
}

TEST_P(LooksOfStates, PowerReading_IsLarge) {
    connect();
    panel().PwrButton.Click();
    sweeps(12);
    picture(*window, "power-reading");
}

TEST_P(LooksOfStates, LostLine_IsSaid) {
    connect();
    sweeps(1);
    panel().LinkLost = true;
    panel().CWGraph1.Old = true;
    panel().ConnectedPic.noteChange();
    picture(*window, "lost");
}

TEST_P(LooksOfStates, Recording_HasTheRedLamp) {
    connect();
    sweeps(1);
    panel().RecordData.Checked = true;
    panel().FileLabel.Caption = "trace.csv: 5 traces, 52 kB, 00:00:03, next in 0 s";
    picture(*window, "recording");
    const auto lamp = [this] {
        return tool("Record")->icon().pixmap(20, QIcon::Disabled).toImage().pixelColor(10, 10);
    };
    EXPECT_GT(lamp().red(), 2 * lamp().blue());
    panel().RecordData.Checked = false;
    show();
    EXPECT_LT(lamp().red(), 2 * lamp().blue());
}

TEST_P(LooksOfStates, Windows_ArePictures) {
    connect();
    sweeps(90);
    Forms& forms = program->forms();
    const std::pair<Form*, const char*> windows[] = {{&forms.waterfall, "waterfall-window"},
                                                     {&forms.specialMeas, "script-window"},
                                                     {&forms.time, "record-window"},
                                                     {&forms.doctor, "doctor-window"}};
    for (const auto& [form, name] : windows) {
        form->Show();
        show();
        QWidget* shown = nullptr;
        for (QWidget* top : QApplication::topLevelWidgets())
            if (top->objectName() == QString::fromStdString(form->name()) && top->isVisible())
                shown = top;
        ASSERT_NE(shown, nullptr) << name;
        picture(*shown, name);
        form->Hide();
        window->binder().flush();
    }
}

INSTANTIATE_TEST_SUITE_P(Sizes, LooksOfStates, kLooks, kNameOfLook);

}  // namespace
}  // namespace zel
