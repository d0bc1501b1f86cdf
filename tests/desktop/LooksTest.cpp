// The panel in every menu and mode, in both themes, from the smallest window to a large one:
// nothing is cut, nothing lies on anything else. The pictures are left beside the test's program.

#include <QAbstractItemView>
#include <QTest>
#include <QWheelEvent>

#include "tests/desktop/Looks.h"
#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

struct Scene {
    const char* name;
    Button ControllerForm::*key;  ///< null: as it stands after the connection
    std::int16_t state;
};

using CF = ControllerForm;
const Scene kScenes[] = {
    {"frequency", nullptr, CF::Freq},
    {"span", &CF::SpanButton, CF::SPAN},
    {"amplitude", &CF::AmplitudeButton, CF::AMPT},
    {"bandwidth", &CF::BWButton, CF::BW},
    {"sweep", &CF::SweepButton, CF::SWEEP},
    {"trace", &CF::TraceButton, CF::TRACE},
    {"measurement", &CF::MeasButton, CF::MEAS},
    {"marker", &CF::MarkerButton, CF::Marker},
    {"tracking", &CF::TrackButton1, CF::TRACKINGGEN},
    {"power", &CF::PwrButton, CF::POWER},
    {"channel", &CF::ChnPwrButton, CF::CHNPOWER},
    {"occupied", &CF::OccBWButton, CF::OCCBW},
    {"tdma", &CF::TDMAButton, CF::TDMA},
    {"fault", &CF::DistFaultButton, CF::DISTFAULT},
};

class Looks : public WindowTest, public testing::WithParamInterface<Look> {
  protected:
    void SetUp() override {
        putOn(GetParam(), *program, window);
        connect();
        window->resize(GetParam().size);
        show();
    }
    ~Looks() override { takeOff(); }

    /// The controls that can be seen, of the kinds that have a place of their own.
    std::vector<QWidget*> seen() {
        std::vector<QWidget*> widgets;
        for (const Control* control : panel().controls()) {
            if (control->kind() == ControlKind::Picture || control->kind() == ControlKind::Frame)
                continue;
            auto* widget = widgetOf<QWidget>(*control);
            if (widget != nullptr && widget->isVisible()) widgets.push_back(widget);
        }
        return widgets;
    }

    QRect placeOf(const QWidget& widget) {
        return {widget.mapTo(window.get(), QPoint()), widget.size()};
    }

    void expectSound(const char* scene) {
        EXPECT_EQ(window->size(), GetParam().size) << scene;
        const std::vector<QWidget*> widgets = seen();
        for (const QWidget* widget : widgets) {
            const std::string name = std::string(scene) + ": " + widget->objectName().toStdString();
            EXPECT_TRUE(window->rect().contains(placeOf(*widget))) << name;
            if (const auto* button = qobject_cast<const QPushButton*>(widget)) {
                QSize needed;
                for (const QString& line : button->text().split('\n'))
                    needed = needed.expandedTo(button->fontMetrics().size(0, line));
                EXPECT_LE(needed.width(), button->width()) << name;
                EXPECT_LE(needed.height() * (button->text().count('\n') + 1), button->height())
                    << name;
            }
            if (const auto* label = qobject_cast<const QLabel*>(widget)) {
                const QSize text = label->fontMetrics().size(0, label->text());
                EXPECT_LE(text.width(), label->width()) << name;
                EXPECT_LE(text.height(), label->height()) << name;
            }
            for (const QWidget* other : widgets) {
                const bool apart =
                    other == widget || other->isAncestorOf(widget) || widget->isAncestorOf(other);
                EXPECT_TRUE(apart || !placeOf(*widget).intersects(placeOf(*other)))
                    << name << " on " << other->objectName().toStdString();
            }
        }
    }
};

TEST_P(Looks, EveryMenu_FitsTheWindowWithNothingCut) {
    for (const Scene& scene : kScenes) {
        if (scene.key != nullptr) {
            if (panel().InstrumentMode != CF::ANALYZER) panel().AnalyzerButton.Click();
            (panel().*scene.key).Click();
        }
        ASSERT_EQ(panel().State, scene.state) << scene.name;
        show();
        expectSound(scene.name);
        EXPECT_TRUE(savePicture(*window, QString(GetParam().name) + "-" + scene.name));
    }
}

TEST_P(Looks, SubMenus_FitTheWindowWithNothingCut) {
    panel().MeasButton.Click();
    panel().SoftKey(1).Click();
    ASSERT_EQ(panel().State, CF::MEAS_TRD);
    show();
    expectSound("transducers");
    EXPECT_TRUE(savePicture(*window, QString(GetParam().name) + "-transducers"));
    panel().SoftKey(4).Click();
    panel().SoftKey(2).Click();
    ASSERT_EQ(panel().State, CF::MEAS_LLINES);
    show();
    expectSound("limits");
    EXPECT_TRUE(savePicture(*window, QString(GetParam().name) + "-limits"));
}

TEST_P(Looks, MarkersAndTheirKeys_FitTheWindowWithNothingCut) {
    panel().MarkerCheckBox.Click();
    panel().DeltaCheckBox.Click();
    panel().MarkPkButton.Click();
    show();
    ASSERT_FALSE(panel().DeltaLabel.Caption.get().empty());
    expectSound("markers");
    EXPECT_TRUE(savePicture(*window, QString(GetParam().name) + "-markers"));
}

TEST_P(Looks, OpenList_ShowsEveryEntryWhole) {
    panel().BWButton.Click();
    show();
    auto* list = widgetOf<QComboBox>(panel().ChoiceBox(2));
    list->showPopup();
    QApplication::processEvents();
    const QAbstractItemView& view = *list->view();
    ASSERT_EQ(list->count(), 13);
    for (int i = 0; i < list->count(); ++i) {
        const QRect place = view.visualRect(list->model()->index(i, 0));
        EXPECT_GE(place.top(), 0) << i;
        EXPECT_LE(place.bottom(), view.viewport()->height()) << i;
        EXPECT_LE(view.fontMetrics().horizontalAdvance(list->itemText(i)), view.viewport()->width())
            << i;
    }
    EXPECT_TRUE(savePicture(*view.window(), QString(GetParam().name) + "-list"));
    list->hidePopup();
}

TEST_P(Looks, ContinuousView_FitsTheWindowWithNothingCut) {
    platform.events.schedule(900, [this] {
        show();
        ASSERT_TRUE(panel().ContinuosLoopActive);
        expectSound("continuous");
        EXPECT_TRUE(savePicture(*window, QString(GetParam().name) + "-continuous"));
        panel().StopButton.Click();
    });
    panel().PlayContinuousButton.Click();
    EXPECT_FALSE(panel().ContinuosLoopActive);
}

TEST_P(Looks, CloserViewWithMarkers_FitsTheWindowWithNothingCut) {
    panel().MarkerCheckBox.Click();
    panel().DeltaCheckBox.Click();
    panel().MarkPkButton.Click();
    show();
    GraphWidget& graph = window->graph();
    const QPointF place(graph.xAxis->coordToPixel(1.6e9), graph.plotArea().center().y());
    QWheelEvent wheel(place, graph.mapToGlobal(place), {}, {0, 600}, Qt::NoButton, Qt::NoModifier,
                      Qt::NoScrollPhase, false);
    QApplication::sendEvent(&graph, &wheel);
    QTest::mouseMove(&graph, place.toPoint());
    show();
    ASSERT_TRUE(panel().GraphZoomed);
    expectSound("closer");
    EXPECT_TRUE(savePicture(*window, QString(GetParam().name) + "-closer"));
}

TEST_P(Looks, Dialogs_ArePictures) {
    panel().UtilityGraphSettings.Click();
    show();
    auto* scale = window->findChild<QDialog*>("ManualScaleForm");
    ASSERT_TRUE(scale->isVisible());
    widgetOf<QLineEdit>(program->forms().manualScale.manualSizeMin)->setText("-80x");
    window->binder().flush();
    EXPECT_TRUE(savePicture(*scale, QString(GetParam().name) + "-scale"));
    scale->close();
    auto* box = widgetOf<QLineEdit>(panel().SoftTextBox(0));
    QTest::keyClicks(box, "5 dBm");
    QTest::keyClick(box, Qt::Key_Return);
    show();
    EXPECT_TRUE(savePicture(*window, QString(GetParam().name) + "-refused"));
}

class BareLooks : public Looks {
  protected:
    void SetUp() override {
        putOn(GetParam(), *program, window);
        window->resize(GetParam().size);
        show();
    }
};

TEST_P(BareLooks, WindowWithoutAnInstrument_ShowsTheWaysToBegin) {
    expectSound("empty");
    EXPECT_TRUE(savePicture(*window, QString(GetParam().name) + "-empty"));
    const auto* readout = widgetOf<QWidget>(panel().CFLabel);
    EXPECT_FALSE(readout->isVisible()) << "of nothing";
    connect();
    show();
    EXPECT_TRUE(readout->isVisible());
}

INSTANTIATE_TEST_SUITE_P(Sizes, BareLooks, kLooks, kNameOfLook);

INSTANTIATE_TEST_SUITE_P(Sizes, Looks, kLooks, kNameOfLook);

}  // namespace
}  // namespace zel
