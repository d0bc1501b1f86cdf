// The graph's widget: zoom rectangle, pointer readout, cursors; pictures in files.

#include <QContextMenuEvent>
#include <QCursor>
#include <QFile>
#include <QLineEdit>
#include <QTemporaryDir>
#include <QTest>
#include <QWheelEvent>
#include <QXmlStreamReader>

#include "desktop/graph/GraphImage.h"
#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

class GraphWidgetTest : public WindowTest {
  protected:
    void SetUp() override {
        connect();
        show();
    }
    QPoint at(double x, double y) {
        GraphWidget& graph = window->graph();
        return {static_cast<int>(graph.xAxis->coordToPixel(x)),
                static_cast<int>(graph.yAxis->coordToPixel(y))};
    }
    void turn(QPoint place, Qt::KeyboardModifiers keys) {
        GraphWidget& graph = window->graph();
        QWheelEvent wheel(place, graph.mapToGlobal(QPointF(place)), {}, {0, 120}, Qt::NoButton,
                          keys, Qt::NoScrollPhase, false);
        QApplication::sendEvent(&graph, &wheel);
        window->showNow();
    }
    void drag(QPoint from, QPoint to) {
        QTest::mousePress(&window->graph(), Qt::LeftButton, {}, from);
        QTest::mouseMove(&window->graph(), to);
        QTest::mouseRelease(&window->graph(), Qt::LeftButton, {}, to);
    }
};

TEST_F(GraphWidgetTest, ZoomRectangle_SetsBothAxesAndEndsTheMode) {
    panel().cmdZoom.Click();
    window->showNow();
    drag(at(1e9, -40), at(2e9, -90));
    const Graph& graph = panel().CWGraph1;
    EXPECT_NEAR(graph.xAxis().Minimum, 1e9, 2e7);
    EXPECT_NEAR(graph.xAxis().Maximum, 2e9, 2e7);
    EXPECT_NEAR(graph.yAxis().Maximum, -40, 1);
    EXPECT_NEAR(graph.yAxis().Minimum, -90, 1);
    EXPECT_EQ(graph.TrackMode, 1);
    EXPECT_TRUE(panel().GraphZoomed);
}

TEST_F(GraphWidgetTest, ZoomRectangle_OfAFewPixels_ChangesNothing) {
    panel().cmdZoom.Click();
    window->showNow();
    const QPoint start = at(1e9, -40);
    drag(start, start + QPoint(2, 2));
    EXPECT_EQ(panel().CWGraph1.xAxis().Maximum, 3e9);
}

TEST_F(GraphWidgetTest, CloserLevels_StayOverTheNextSweepAndGoWithTheWholeView) {
    turn(at(1.5e9, -70), Qt::ShiftModifier);
    const double top = panel().CWGraph1.yAxis().Maximum;
    ASSERT_LT(top, -20);
    panel().PlaySingleButton.Click();
    window->showNow();
    EXPECT_EQ(panel().CWGraph1.yAxis().Maximum, top);
    window->graph().wholeView();
    panel().PlaySingleButton.Click();
    window->showNow();
    EXPECT_EQ(panel().CWGraph1.yAxis().Maximum, -20);
}

TEST_F(GraphWidgetTest, OutKey_ShowsTheWholeLevelsToo) {
    panel().cmdZoom.Click();
    window->showNow();
    drag(at(1e9, -40), at(2e9, -90));
    panel().PlaySingleButton.Click();
    window->showNow();
    ASSERT_NEAR(panel().CWGraph1.yAxis().Maximum, -40, 1);
    panel().cmdZoom.Click();
    window->showNow();
    EXPECT_EQ(panel().CWGraph1.xAxis().Maximum, 3e9);
    EXPECT_EQ(panel().CWGraph1.yAxis().Maximum, -20);
}

TEST_F(GraphWidgetTest, ManualScaleOfTheWholeRange_EndsTheCloserLevels) {
    turn(at(1.5e9, -70), Qt::ShiftModifier);
    panel().CWGraph1.setYRange(-120, -20);
    window->showNow();
    EXPECT_EQ(panel().CWGraph1.yAxis().Maximum, -20);
    panel().PlaySingleButton.Click();
    window->showNow();
    EXPECT_EQ(panel().CWGraph1.yAxis().Maximum, -20);
}

TEST_F(GraphWidgetTest, AnotherReferenceLevel_EndsTheCloserLevels) {
    turn(at(1.5e9, -70), Qt::ShiftModifier);
    port.device().edit().referenceLevel = -10;
    panel().PlaySingleButton.Click();
    window->showNow();
    EXPECT_EQ(panel().CWGraph1.yAxis().Maximum, -10);
}

TEST_F(GraphWidgetTest, PointerThatRests_ReadsTheAxisThatComesUnderIt) {
    QTest::mouseMove(&window->graph(), at(1.5e9, -70));
    panel().CWGraph1.setXRange(0, 300e6);
    window->showNow();
    EXPECT_EQ(panel().DeltaLabel.Caption.get().rfind("Cursor:150", 0), 0U)
        << panel().DeltaLabel.Caption.get();
}

TEST_F(GraphWidgetTest, MenuOfTheGraph_LeavesTheEventsToTheSweeps) {
    QContextMenuEvent ask(QContextMenuEvent::Mouse, at(1.5e9, -70),
                          window->graph().mapToGlobal(at(1.5e9, -70)));
    QApplication::sendEvent(&window->graph(), &ask);  // comes back while the menu is open
    QWidget* menu = QApplication::activePopupWidget();
    ASSERT_NE(menu, nullptr);
    delete menu;
    QCursor::setPos(0, 0);  // the pointer is that of the next test as well
}

TEST_F(GraphWidgetTest, PointerOverThePlot_ShowsItsPlace) {
    QTest::mouseMove(&window->graph(), at(1.5e9, -70));
    EXPECT_EQ(panel().DeltaLabel.Caption.get().rfind("Cursor:1.", 0), 0U)
        << panel().DeltaLabel.Caption.get();
}

TEST_F(GraphWidgetTest, ShownCursor_IsDraggedAndSnapsToTheTrace) {
    panel().MarkerCheckBox.Click();
    window->showNow();
    const GraphCursor before = panel().CWGraph1.cursor(1);
    ASSERT_TRUE(before.Visible);
    drag(at(before.X, -60), at(6e8, -60));
    const GraphCursor& after = panel().CWGraph1.cursor(1);
    EXPECT_NEAR(after.X, 6e8, 2e7);
    EXPECT_EQ(panel().MarkerValue, after.X);
    const Graph& graph = panel().CWGraph1;
    const double place = (after.X - graph.firstX()) / graph.increment();
    EXPECT_NEAR(place, std::round(place), 1e-6);
    EXPECT_EQ(after.Y, graph.values().at(static_cast<std::size_t>(std::lround(place))));
    EXPECT_EQ(panel().MarkerLabel.Caption.get().rfind("Marker:", 0), 0U);
}

TEST_F(GraphWidgetTest, LabelsOfADraggedMarker_FollowBeforeItIsLetGo) {
    panel().MarkerCheckBox.Click();
    window->showNow();
    GraphWidget& graph = window->graph();
    QTest::mousePress(&graph, Qt::LeftButton, {}, at(panel().CWGraph1.cursor(1).X, -60));
    std::vector<std::string> texts;
    for (const double x : {5e8, 1e9, 2e9}) {
        QTest::mouseMove(&graph, at(x, -60));
        texts.push_back(panel().MarkerLabel.Caption);
        EXPECT_NEAR(panel().MarkerValue, x, 2e7);
        EXPECT_EQ(widgetOf<QLabel>(panel().MarkerLabel)->text().toStdString(), texts.back());
    }
    EXPECT_NE(texts[0], texts[1]);
    EXPECT_NE(texts[1], texts[2]);
    QTest::mouseRelease(&graph, Qt::LeftButton, {}, at(2e9, -60));
    QTest::mouseMove(&graph, at(1e9, -60));
    EXPECT_EQ(panel().MarkerLabel.Caption.get(), texts[2]);
}

TEST_F(GraphWidgetTest, DeltaMarker_IsDraggedByItself) {
    panel().MarkerCheckBox.Click();
    panel().DeltaCheckBox.Click();
    window->showNow();
    const Graph& graph = panel().CWGraph1;
    drag(at(graph.cursor(1).X, -60), at(5e8, -60));
    window->showNow();
    const double marker = graph.cursor(1).X;
    drag(at(graph.cursor(2).X, -60), at(2.2e9, -60));
    EXPECT_EQ(graph.cursor(1).X, marker);
    EXPECT_NEAR(graph.cursor(2).X, 2.2e9, 2e7);
    EXPECT_EQ(panel().DeltaLabel.Caption.get().rfind("Delta:", 0), 0U)
        << panel().DeltaLabel.Caption.get();
}

TEST_F(GraphWidgetTest, PointerOverAMarker_ShowsThatItCanBeDragged) {
    panel().MarkerCheckBox.Click();
    window->showNow();
    GraphWidget& graph = window->graph();
    const double x = panel().CWGraph1.cursor(1).X;
    QTest::mouseMove(&graph, at(x, -60));
    EXPECT_EQ(graph.cursor().shape(), Qt::SplitHCursor);
    QTest::mouseMove(&graph, at(x, -60) + QPoint(x > 1.5e9 ? -60 : 60, 0));
    EXPECT_NE(graph.cursor().shape(), Qt::SplitHCursor);
}

TEST_F(GraphWidgetTest, ArrowKey_MovesTheCursorByOnePoint) {
    panel().MarkerCheckBox.Click();
    window->showNow();
    const Graph& graph = panel().CWGraph1;
    drag(at(graph.cursor(1).X, -60), at(6e8, -60));
    const double before = graph.cursor(1).X;
    QTest::keyClick(&window->graph(), Qt::Key_Right);
    EXPECT_NEAR(graph.cursor(1).X, before + graph.increment(), 1);
    QTest::keyClick(&window->graph(), Qt::Key_Left);
    EXPECT_NEAR(graph.cursor(1).X, before, 1);
}

TEST_F(GraphWidgetTest, F1_IsToldToTheGraph) {
    std::vector<int> codes;
    panel().CWGraph1.KeyDown.connect([&codes](int code, int) { codes.push_back(code); });
    QTest::keyClick(&window->graph(), Qt::Key_F1);
    EXPECT_EQ(codes, std::vector<int>{kKeyF1});
}

/// Every text of a layout, with those of the layouts inside it.
void collectTexts(QCPLayout& layout, QList<QCPTextElement*>& texts) {
    for (QCPLayoutElement* element : layout.elements(true))
        if (auto* text = qobject_cast<QCPTextElement*>(element)) texts << text;
}

TEST_F(GraphWidgetTest, LongTextsAroundTheGraph_AreNotCutInTheSmallestWindow) {
    ZEL3Variables& mirror = program->variables();
    mirror.ReferenceUnit = 3;
    mirror.ReferenceLevel = -123.45;
    mirror.ResolutionBandwidth = 2;
    mirror.VideoBandwidth = 3;
    mirror.SweepTime = 0.123;
    panel().InstrumentMode = ControllerForm::DISTTOFAULTMEASURE;
    window->resize(1024, 600);
    show();
    QList<QCPTextElement*> texts;
    collectTexts(*window->graph().plotLayout(), texts);
    ASSERT_EQ(texts.size(), 7);
    for (QCPTextElement* element : texts) {
        const int needed = QFontMetrics(element->font()).horizontalAdvance(element->text());
        EXPECT_GE(element->rect().width(), needed) << element->text().toStdString();
    }
}

TEST_F(GraphWidgetTest, SettingsSince_StrikeTheTextsOfTheTraceAndChangeNone) {
    const auto texts = [this] {
        platform.events.runFor(100);
        window->binder().flush();
        QList<QCPTextElement*> found;
        collectTexts(*window->graph().plotLayout(), found);
        QStringList parts;
        QStringList struck;
        for (QCPTextElement* element : found) {
            parts << element->text();
            struck += dynamic_cast<AnnotationText&>(*element).struck();
        }
        return (parts.join("|") + " struck: " + struck.join("|")).toStdString();
    };
    const auto entered = [this](const Button& menu, const char* entry) {
        const_cast<Button&>(menu).Click();
        auto* box = widgetOf<QLineEdit>(panel().SoftTextBox(0));
        QTest::keyClicks(box, entry);
        QTest::keyClick(box, Qt::Key_Return);
    };
    EXPECT_NE(texts().find("Ref -20 dBm"), std::string::npos) << texts();
    entered(panel().AmplitudeButton, "-30");
    EXPECT_NE(texts().find("Ref -20 dBm"), std::string::npos) << texts();
    EXPECT_NE(texts().find("struck: Ref -20 dBm"), std::string::npos) << texts();
    EXPECT_FALSE(window->graph().yAxis->tickLabelFont().strikeOut()) << "the trace's own";
    entered(panel().SweepButton, "2 s");
    EXPECT_NE(texts().find("struck: Ref -20 dBm|SWT 20 ms"), std::string::npos) << texts();
    panel().PlaySingleButton.Click();
    EXPECT_NE(texts().find("Ref -30 dBm"), std::string::npos) << texts();
    EXPECT_NE(texts().find("SWT 2 s"), std::string::npos) << texts();
    EXPECT_EQ(texts().substr(texts().size() - 8), "struck: ");
}

TEST_F(GraphWidgetTest, LevelOfAnotherMode_IsStruckUntilItIsAsked) {
    const auto struck = [this] {
        platform.events.runFor(100);
        window->binder().flush();
        QList<QCPTextElement*> found;
        collectTexts(*window->graph().plotLayout(), found);
        QStringList parts;
        for (QCPTextElement* element : found)
            parts += dynamic_cast<AnnotationText&>(*element).struck();
        return parts.join("|").toStdString();
    };
    panel().DistFaultButton.Click();
    panel().PlaySingleButton.Click();
    EXPECT_EQ(struck(), "");
    panel().AnalyzerButton.Click();
    panel().SpanButton.Click();
    panel().SoftKey(2).Click();  // reads a sweep, and no level
    EXPECT_EQ(struck(), "Ref 0 dB");
    EXPECT_TRUE(window->graph().yAxis->tickLabelFont().strikeOut());
    panel().PlaySingleButton.Click();
    EXPECT_EQ(struck(), "");
    EXPECT_FALSE(window->graph().yAxis->tickLabelFont().strikeOut());
}

TEST_F(GraphWidgetTest, UnsureLevel_IsStruckWithTheLabelsOfItsAxis) {
    ZEL3Variables& mirror = program->variables();
    mirror.ReferenceLevel = -20;
    window->binder().flush();
    const auto struck = [this] {
        QList<QCPTextElement*> texts;
        collectTexts(*window->graph().plotLayout(), texts);
        QStringList parts;
        for (QCPTextElement* element : texts)
            parts += dynamic_cast<AnnotationText&>(*element).struck();
        return parts.join("|").toStdString();
    };
    EXPECT_EQ(struck(), "");
    mirror.Unsure.sent("REFLVL", false);
    window->binder().flush();
    EXPECT_EQ(struck(), "Ref -20 dBm");
    EXPECT_TRUE(window->graph().yAxis->tickLabelFont().strikeOut());
    EXPECT_FALSE(window->graph().xAxis->tickLabelFont().strikeOut());
    mirror.Unsure.sent("SPAN", false);
    window->binder().flush();
    EXPECT_TRUE(window->graph().xAxis->tickLabelFont().strikeOut());
    EXPECT_TRUE(widgetOf<QLabel>(panel().SpanLabel)->font().strikeOut());
    window->graph().drawNow();
    EXPECT_TRUE(savePicture(*window, "unsure"));
    mirror.Unsure.clear();
    window->binder().flush();
    EXPECT_EQ(struck(), "");
    EXPECT_FALSE(window->graph().yAxis->tickLabelFont().strikeOut());
    EXPECT_FALSE(widgetOf<QLabel>(panel().SpanLabel)->font().strikeOut());
}

TEST_F(GraphWidgetTest, HiddenCursor_IsNotDragged) {
    const double before = panel().CWGraph1.cursor(1).X;
    drag(at(before, -60), at(6e8, -60));
    EXPECT_EQ(panel().CWGraph1.cursor(1).X, before);
}

TEST_F(GraphWidgetTest, Png_IsWrittenWithThePlot) {
    const QTemporaryDir folder;
    const QString file = folder.filePath("graph.png");
    QString error;
    ASSERT_TRUE(
        saveGraphImage(panel().CWGraph1, annotateView(panel(), program->variables()), file, &error))
        << error.toStdString();
    const QImage image(file);
    EXPECT_EQ(image.size(), QSize(2000, 1240));
    int tracePixels = 0;
    for (int y = 0; y < image.height(); y += 2) {
        for (int x = 0; x < image.width(); x += 2) {
            const QColor c = image.pixelColor(x, y);
            if (c.red() > 200 && c.blue() < 120) ++tracePixels;
        }
    }
    EXPECT_GT(tracePixels, 1000);
}

TEST_F(GraphWidgetTest, Svg_IsWellFormedAndKeepsTheZoomedTraceInside) {
    panel().CWGraph1.setXRange(1e9, 1.1e9);
    const QTemporaryDir folder;
    const QString file = folder.filePath("graph.svg");
    ASSERT_TRUE(saveGraphImage(panel().CWGraph1, annotateView(panel(), program->variables()), file,
                               nullptr, {900, 500}));
    QFile svg(file);
    ASSERT_TRUE(svg.open(QIODevice::ReadOnly));
    QXmlStreamReader reader(&svg);
    int lines = 0;
    while (!reader.atEnd())
        if (reader.readNext() == QXmlStreamReader::StartElement && reader.name() == u"polyline")
            ++lines;
    EXPECT_FALSE(reader.hasError()) << reader.errorString().toStdString();
    EXPECT_GT(lines, 0);
}

TEST_F(GraphWidgetTest, PictureOfAnUnknownKind_IsRefusedInWords) {
    QString error;
    EXPECT_FALSE(saveGraphImage(panel().CWGraph1, {}, "graph.xyz", &error));
    EXPECT_EQ(error, "Unknown kind of picture: .xyz (wmf, svg, png or pdf)");
}

TEST_F(GraphWidgetTest, PictureThatCannotBeWritten_SaysWhichAndWhy) {
    QString error;
    EXPECT_FALSE(saveGraphImage(panel().CWGraph1, {}, "/no/such/folder/graph.png", &error));
    EXPECT_TRUE(error.startsWith("Cannot write /no/such/folder/graph.png: "))
        << error.toStdString();
}

}  // namespace
}  // namespace zel
