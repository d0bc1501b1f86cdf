// The trace tools in the window: the same figures as from the file, drawn on the graph, in words.

#include <qcustomplot.h>

#include <QApplication>
#include <QCheckBox>
#include <QClipboard>
#include <QFile>
#include <QLabel>
#include <QLineEdit>
#include <QMenuBar>
#include <QPushButton>
#include <QTableWidget>
#include <QTemporaryDir>
#include <QTest>

#include "analysis/SavedTraces.h"
#include "desktop/windows/TraceToolsDock.h"
#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

struct TraceToolsWindow : WindowTest {
    TraceToolsDock& dock() { return *window->findChild<TraceToolsDock*>("TraceTools"); }
    void sweep() {
        panel().PlaySingleButton.Click();
        settle();
    }
    void settle() {
        show();
        dock().showNow();
    }
    /// Opens a page, and gives it.
    QWidget* page(int index) {
        dock().show();
        dock().pages().setCurrentIndex(index);
        dock().showNow();
        return dock().pages().currentWidget();
    }
    void type(const char* name, const QString& text) {
        auto* box = dock().findChild<QLineEdit*>(name);
        ASSERT_NE(box, nullptr) << name;
        box->setText(text);
        emit box->editingFinished();
        dock().showNow();
    }
    enum Page { Traces, Peaks, Markers, Power, Limits, Watch, Statistics, Fault };
};

TEST_F(TraceToolsWindow, FiguresAreThoseOfTheSavedView) {
    connect();
    dock().tools().request.bandwidth = 3;
    dock().tools().request.occupied = 99;
    dock().tools().request.channels = {{1e9, 2e9}};
    dock().tools().setMask(readMask("x;upper;lower\n0;-30;\n3e9;-30;\n"));
    sweep();
    platform.fileDialogs.answer("/view.csv");
    panel().SaveCurrentView.Click();
    const std::string text = platform.files.bytes("/view.csv");
    ASSERT_NE(text, "");
    std::vector<SpectrumTrace> saved;
    readTraces(text, DateOrder::YearMonthDay, [&saved](const SpectrumTrace& trace) {
        saved.push_back(trace);
        return true;
    });
    ASSERT_EQ(saved.size(), 1U);
    const AnalysisResult file = analyseTrace(saved[0], dock().tools().request);
    const AnalysisResult& shown = dock().tools().result();
    ASSERT_GT(shown.peaks.size(), 2U);
    ASSERT_EQ(shown.peaks.size(), file.peaks.size());
    for (std::size_t i = 0; i < file.peaks.size(); ++i) {
        EXPECT_DOUBLE_EQ(shown.peaks[i].x, file.peaks[i].x);
        EXPECT_DOUBLE_EQ(shown.peaks[i].level, file.peaks[i].level);
    }
    // The strongest peak stands at the left border, where it has no edge.
    EXPECT_FALSE(shown.width.low);
    EXPECT_DOUBLE_EQ(shown.width.high.value(), file.width.high.value());
    EXPECT_DOUBLE_EQ(shown.occupied->low, file.occupied->low);
    EXPECT_DOUBLE_EQ(shown.channels[0].power.value(), file.channels[0].power.value());
    EXPECT_EQ(shown.mask->margin, file.mask->margin);
    EXPECT_EQ(shown.time, file.time);
}

TEST_F(TraceToolsWindow, LoadedView_GivesItsOwnFigures) {
    platform.files.put("/two.csv",
                       "Trace Name;Analyzer\r\nSpan;4\r\nResolution Bandwidth;1000\r\n"
                       "Reference Unit;dBm\r\nReference Range;10 dB/div\r\nReference Level;-20\r\n"
                       "Trace Write Pointer;5\r\n\r\n1.000;-90; \r\n2.000;-40; \r\n3.000;-10; \r\n"
                       "4.000;-40; \r\n5.000;-90; \r\n");
    panel().OpenFile("/two.csv");
    settle();
    ASSERT_EQ(dock().tools().result().peaks.size(), 1U);
    EXPECT_EQ(dock().tools().result().peaks[0].x, 3);
    EXPECT_EQ(dock().tools().result().peaks[0].level, -10) << "not the clipped level";
    EXPECT_EQ(dock().tools().trace()->rbw, 1000);
}

TEST_F(TraceToolsWindow, MaxHold_CountsEachSweepOnce) {
    connect();
    page(Traces);
    dock().findChild<QCheckBox*>("Max hold")->setChecked(true);
    dock().tools().traces().clear(HoldKind::Max);
    sweep();
    sweep();
    EXPECT_EQ(dock().tools().traces().count(HoldKind::Max), 2U);
    panel().CWGraph1.Refresh();
    settle();
    EXPECT_EQ(dock().tools().traces().count(HoldKind::Max), 2U);
}

TEST_F(TraceToolsWindow, AnotherSpan_EndsTheHoldsWithAWord) {
    connect();
    dock().tools().traces().switchOn(HoldKind::Max, true);
    sweep();
    auto* box = widgetOf<QLineEdit>(panel().SoftTextBox(0));
    QTest::keyClicks(box, "900M");
    QTest::keyClick(box, Qt::Key_Return);
    sweep();
    // The instrument's range ends at 0 Hz, so the span is narrower now.
    EXPECT_EQ(dock().tools().traces().ended(), "Held traces ended: span changed");
}

TEST_F(TraceToolsWindow, PeaksTable_ShowsTheToolsFiguresAndAClickSetsAMarker) {
    connect();
    sweep();
    QWidget* peaks = page(Peaks);
    auto* table = peaks->findChild<QTableWidget*>("PeaksTable");
    const AnalysisResult& found = dock().tools().result();
    ASSERT_EQ(static_cast<std::size_t>(table->rowCount()), found.peaks.size());
    EXPECT_EQ(table->item(0, 1)->text(), placeText(found.peaks[0].x, dock().tools().trace()));
    EXPECT_EQ(table->item(0, 2)->text(), levelText(found.peaks[0].level, "dBm"));
    emit table->cellClicked(1, 0);
    EXPECT_TRUE(dock().tools().markers[0].on);
    EXPECT_EQ(dock().tools().readings()[0].level, found.peaks[1].level);
    for (auto* key : peaks->findChildren<QPushButton*>())
        if (key->text() == "Copy Table") key->click();
    EXPECT_TRUE(QApplication::clipboard()->text().startsWith("Peak\tx\tLevel\n1\t"));
}

TEST_F(TraceToolsWindow, Places_HaveTheDigitsOfTheSweepAndNoMore) {
    SpectrumTrace trace;
    trace.xUnit = "Hz";
    for (int i = 0; i < 301; ++i) trace.x.push_back(i * 1e7);
    EXPECT_EQ(placeText(946.706878e6, trace), "947 MHz");
    EXPECT_EQ(placeText(1.499995e9, trace), "1.500 GHz");
    for (double& x : trace.x) x = 1.5e9 + x / 1e3;
    EXPECT_EQ(placeText(1.500123456e9, trace), "1.500123 GHz");
    EXPECT_EQ(placeText(std::nullopt, trace), QString::fromUtf8("–"));
    EXPECT_EQ(placeText(1e9, std::nullopt), QString::fromUtf8("–"));
    trace.x = {1.2345678e9};
    EXPECT_EQ(placeText(1.2345678e9, trace), "1.234568 GHz") << "one sample has no step";
    EXPECT_EQ(levelText(-28.0, "dBm"), "-28.00 dBm");
}

TEST_F(TraceToolsWindow, PagesWithoutFigures_OfferNoTables) {
    const auto offered = [](QWidget* page) {
        int count = 0;
        for (const auto* key : page->findChildren<QPushButton*>())
            count += key->isEnabled() ? 1 : 0;
        return count;
    };
    EXPECT_EQ(offered(page(Peaks)), 0);
    EXPECT_EQ(offered(page(Statistics)), 0);
    EXPECT_FALSE(page(Statistics)->findChild<QCustomPlot*>()->xAxis->tickLabels());
    connect();
    dock().tools().countStatistics(-80);
    sweep();
    EXPECT_EQ(offered(page(Peaks)), 2);
    EXPECT_EQ(offered(page(Statistics)), 1);
    EXPECT_TRUE(page(Statistics)->findChild<QCustomPlot*>()->xAxis->tickLabels());
}

TEST_F(TraceToolsWindow, WordsOfTheTraces_StandInOneLine) {
    page(Traces);
    dock().resize(530, 430);
    QApplication::processEvents();
    auto* box = dock().findChild<QCheckBox*>("Max hold");
    auto* label = dock().findChild<QLabel*>("CorrectedLabel");
    QStyleOptionButton option;
    option.initFrom(box);
    const QRect words = box->style()->subElementRect(QStyle::SE_CheckBoxContents, &option, box);
    EXPECT_EQ(label->mapTo(&dock(), QPoint(label->contentsRect().left() + label->indent(), 0)).x(),
              box->mapTo(&dock(), words.topLeft()).x());
}

TEST_F(TraceToolsWindow, BadMask_IsNamedAndTheOldOneStays) {
    connect();
    page(Limits);
    dock().limits().applyMask("x;upper;lower\n0;-150;\n3e9;-150;\n");
    sweep();
    EXPECT_TRUE(dock().findChild<QLabel*>("MaskVerdict")->text().startsWith("FAIL, margin -"));
    dock().limits().applyMask("x;upper;lower\n0;a;\n");
    EXPECT_TRUE(dock()
                    .findChild<QLabel*>("LimitsWord")
                    ->text()
                    .startsWith("The mask was not taken, line 2"));
    EXPECT_TRUE(dock().tools().request.mask);
}

TEST_F(TraceToolsWindow, TypedChannel_GivesItsPower) {
    connect();
    sweep();
    page(Power);
    type("Channel", "1G");
    type("Channel stop", "2 GHz");
    ASSERT_EQ(dock().tools().result().channels.size(), 1U);
    EXPECT_EQ(dock().findChild<QLabel*>("Channel result")->text(),
              levelText(dock().tools().result().channels[0].power, "dBm"));
    type("Channel stop", "much");
    EXPECT_TRUE(dock().tools().result().channels.empty());
    EXPECT_EQ(dock().findChild<QLabel*>("Channel result")->text(), "");
}

TEST_F(TraceToolsWindow, PeakOfPairs_StandsWhereTheInstrumentsMarkerStands) {
    connect();
    ASSERT_EQ(panel().CWGraph1.values().size(), 602U);
    panel().MarkerCheckBox.Click();
    panel().MarkPkButton.Click();
    sweep();
    const Peak& peak = dock().tools().result().peaks.at(0);
    EXPECT_NEAR(peak.x, panel().CWGraph1.cursor(1).X, dock().tools().trace()->step());
    EXPECT_NEAR(window->graph().picture().levelsAt(peak.x).second, peak.level, 3);
}

TEST_F(TraceToolsWindow, ReferenceFromAFile_FitsTheSweepItWasSavedFrom) {
    connect();
    sweep();
    platform.fileDialogs.answer("/view.csv");
    panel().SaveCurrentView.Click();
    QTemporaryDir folder;
    QFile file(folder.filePath("view.csv"));
    ASSERT_TRUE(file.open(QIODevice::WriteOnly));
    file.write(QByteArray::fromStdString(platform.files.bytes("/view.csv")));
    file.close();
    page(Traces);
    dock().traces().loadMemory(1, file.fileName());
    ASSERT_TRUE(dock().tools().traces().memory(1));
    dock().findChild<QCheckBox*>("Subtract Reference 2")->setChecked(true);
    const auto less = dock().tools().traces().normalised(*dock().tools().trace(), 1);
    ASSERT_TRUE(less);
    for (const double level : less->level) EXPECT_NEAR(level, 0, 1e-9);
    EXPECT_EQ(dock().picture().curves.size(), 2U);
    dock().traces().loadMemory(2, folder.filePath("none.csv"));
    EXPECT_FALSE(dock().tools().traces().memory(2));
}

TEST_F(TraceToolsWindow, TypedPlace_PutsTheMarkerThere) {
    connect();
    sweep();
    auto* table = page(Markers)->findChild<QTableWidget*>("MarkersTable");
    table->item(2, 3)->setText("1.2 GHz");
    EXPECT_TRUE(dock().tools().markers[2].on);
    EXPECT_EQ(dock().tools().markers[2].x, 1.2e9);
    table->item(2, 3)->setText("much");
    EXPECT_EQ(dock().findChild<QLabel*>("MarkersWord")->text(),
              "This is no place: much; 935.2M is one");
    table->item(2, 3)->setText("90 GHz");
    EXPECT_EQ(dock().tools().markers[2].x, 1.2e9) << "outside of the sweep";
    dock().showNow();
    EXPECT_EQ(table->item(2, 3)->text(),
              placeText(dock().tools().readings()[2].x, dock().tools().trace()));
}

TEST_F(TraceToolsWindow, MouseDragsAMarker) {
    connect();
    sweep();
    dock().tools().markers[1] = {true, 0, 1, 0};
    dock().tools().refresh();
    settle();
    window->showNow();
    GraphWidget& graph = window->graph();
    const auto from = *dock().tools().readings()[1].x;
    const QPoint at(qRound(graph.xAxis->coordToPixel(from)),
                    qRound(graph.yAxis->coordToPixel(*dock().tools().readings()[1].level)));
    QTest::mousePress(&graph, Qt::LeftButton, {}, at);
    QTest::mouseMove(&graph, at + QPoint(60, 20));
    QTest::mouseRelease(&graph, Qt::LeftButton, {}, at + QPoint(60, 20));
    EXPECT_EQ(dock().tools().markers[1].peak, 0U) << "it follows the peak no more";
    EXPECT_NEAR(dock().tools().markers[1].x, graph.xAxis->pixelToCoord(at.x() + 60), 1e6);
    const double there = dock().tools().markers[1].x;
    QTest::mouseMove(&graph, at);
    EXPECT_EQ(dock().tools().markers[1].x, there);
}

TEST_F(TraceToolsWindow, Watch_SavesFailingSweepsAndRunsTheCommand) {
    connect();
    dock().tools().setMask(readMask("x;upper;lower\n0;-150;\n3e9;-150;\n"));
    QWidget* watch = page(Watch);
    QTemporaryDir folder;
    const QString mark = folder.filePath("mark with blank");
    dock().findChild<QLineEdit*>("WatchFile")->setText("/failed.csv");
    dock().findChild<QCheckBox*>("WatchSave")->click();
    dock().findChild<QLineEdit*>("WatchCommand")->setText("touch \"" + mark + "\"");
    dock().findChild<QCheckBox*>("WatchRun")->click();
    sweep();
    EXPECT_EQ(dock().watch().saved(), 1U);
    EXPECT_NE(platform.files.bytes("/failed.csv"), "");
    QTRY_VERIFY(QFile::exists(mark));
    // One that was loaded from a file is not saved once more.
    panel().OpenFile("/failed.csv");
    settle();
    EXPECT_EQ(dock().watch().saved(), 1U);
    EXPECT_TRUE(
        watch->findChild<QLabel*>("WatchCounts")->text().startsWith("Watching: 1 sweep saved"));
    dock().findChild<QLineEdit*>("WatchCommand")->setText("touch \"open");
    emit dock().findChild<QLineEdit*>("WatchCommand")->editingFinished();
    EXPECT_EQ(dock().findChild<QLabel*>("WatchWord")->text(),
              "The command has a quote without an end.");
    EXPECT_TRUE(dock().watch().settings().command.empty());
}

TEST_F(TraceToolsWindow, Fault_IsWhereTheWaveOfThisCableSaysItIs) {
    connect();
    QWidget* fault = page(Fault);
    auto* table = fault->findChild<QTableWidget*>("FaultTable");
    EXPECT_EQ(table->rowCount(), 0) << "no distances in hertz";
    Sweep sweep = program->sweep();
    sweep.axis = {0, 100, 0, 0.5, 300, "m"};
    dock().tools().take(sweep, {});
    dock().showNow();
    ASSERT_GT(table->rowCount(), 0);
    fault->findChild<QLineEdit*>("CableFactor")->setText("0.33");
    emit fault->findChild<QLineEdit*>("CableFactor")->textEdited("0.33");
    const double shown = dock().tools().result().peaks[0].x;
    EXPECT_NEAR(table->item(0, 2)->text().section(' ', 0, 0).toDouble(), shown / 2, 1e-3);
    fault->findChild<QLineEdit*>("CableFactor")->setText("0");
    emit fault->findChild<QLineEdit*>("CableFactor")->textEdited("0");
    EXPECT_EQ(table->rowCount(), 0);
}

TEST_F(TraceToolsWindow, SavedPicture_HoldsTheTools) {
    connect();
    sweep();
    QTemporaryDir folder;
    const auto draw = [&](const QString& name) {
        const QString path = folder.filePath(name);
        std::string problem;
        panel().DrawImage(path.toStdString(), problem);
        EXPECT_EQ(problem, "");
        QFile file(path);
        EXPECT_TRUE(file.open(QIODevice::ReadOnly));
        return file.readAll();
    };
    const QByteArray plain = draw("plain.svg");
    dock().tools().traces().switchOn(HoldKind::Max, true);
    dock().tools().setMask(readMask("x;upper;lower\n0;-15;\n3e9;-15;\n"));
    dock().tools().markers[0] = {true, 0, 1, 0};
    dock().tools().refresh();
    const QByteArray drawn = draw("tools.svg");
    EXPECT_FALSE(plain.contains("Mask: "));
    EXPECT_TRUE(drawn.contains("Mask: pass"));
    EXPECT_FALSE(drawn.contains("0/0"));  // no sweep has been counted yet
    EXPECT_TRUE(drawn.contains(">M1<"));
    EXPECT_TRUE(drawn.contains(hostTraceColor(0).name().toUtf8()));
    for (const char* name : {"tools.png", "tools.pdf", "tools.wmf"})
        EXPECT_GT(draw(name).size(), 1000);
    for (const char* name : {"tools.png", "tools.svg", "tools.pdf", "tools.wmf"})
        QFile::copy(folder.filePath(name),
                    QCoreApplication::applicationDirPath() + "/pictures/" + name);
}

TEST_F(TraceToolsWindow, Pictures_OfAllPages) {
    for (const bool dark : {true, false}) {
        applyTheme(testApplication(), dark ? ThemeChoice::Dark : ThemeChoice::Light);
        if (!panel().isConnected) connect();
        window->resize(dark ? QSize(1920, 1080) : QSize(1024, 600));
        for (std::size_t i = 0; i < kHolds; ++i)
            dock().tools().traces().switchOn(static_cast<HoldKind>(i), true);
        dock().tools().setMask(
            readMask("x;upper;lower\n0;-15;\n1e9;-15;\n1.2e9;-60;\n1.8e9;-60;\n"
                     "2e9;-40;\n3e9;-40;\n"));
        dock().tools().markers[0] = {true, 0, 1, 0};
        dock().tools().markers[1] = {true, 0, 2, 1};
        dock().tools().countStatistics(-80);
        for (int i = 0; i < 10; ++i) sweep();
        const QString look = dark ? "dark" : "light";
        type("Channel", "1G");
        type("Channel stop", "2G");
        type("Bandwidth", "3");
        type("Occupied", "99");
        type("Adjacent", "50M");
        type("Channel spacing", "50M");
        for (int i = 0; i <= Fault; ++i) {
            page(i);
            dock().resize(460, 430);
            QApplication::processEvents();
            EXPECT_TRUE(savePicture(dock(), "trace-tools-" + QString::number(i) + "-" + look));
        }
        EXPECT_TRUE(savePicture(*window, "trace-tools-graph-" + look));
    }
    applyTheme(testApplication(), ThemeChoice::Dark);
}

}  // namespace
}  // namespace zel
