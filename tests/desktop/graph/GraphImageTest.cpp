// Pictures of the graph in files: the four kinds, their clips and texts, what an older file has to
// fear, and what another program reads out of a metafile.

#include <sys/resource.h>

#include <QDirIterator>
#include <QFile>
#include <QProcess>
#include <QRegularExpression>
#include <QStandardPaths>
#include <QTemporaryDir>
#include <QXmlStreamReader>
#include <cmath>
#include <csignal>

#include "desktop/graph/GraphImage.h"
#include "tests/desktop/WindowTest.h"
#include "tests/desktop/graph/MetafilePlayer.h"

namespace zel {
namespace {

constexpr QSize kSize(1000, 620);
constexpr int kUnits = 20;  // in a pixel
const QColor kPaperTrace(0x0b, 0x4f, 0xa8);

QByteArray contents(const QString& path) {
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

class GraphImage : public testing::Test {
  protected:
    void SetUp() override {
        testApplication();
        std::vector<double> values;
        for (int i = 0; i <= 300; ++i) values.push_back(i % 2 == 0 ? -110.0 : -60 + i * 0.05);
        values[150] = -5;   // above the graticule
        values[50] = -400;  // far below it
        graph.plotY(values, 0, 1e7);
        graph.setXRange(0, 3e9);
        graph.addCursor({1e9, -60, 0xFFFF00, true});
        graph.addCursor({2e9, -200, 0x00FF00, true});
        view.ok = true;
        view.refLevel = "Ref -123.45 dB\u00B5V";
        view.range = "10dB/DIV";
        view.rbw = "RBW 100 kHz";
        view.vbw = "VBW Auto";
        view.sweepTime = "SWT 123.456 ms";
        view.detector = "Det Auto Peak";
        view.mode = "Distance To Fault";
        view.unit = "dBm";
        view.xUnit = "Hz";
        view.left = "Start 0 Hz";
        view.center = "Center 1.5 GHz";
        view.right = "Stop 3 GHz";
    }
    QString written(const QString& name, bool dark = true) {
        QString path = folder.filePath(name);
        QString error;
        EXPECT_TRUE(saveGraphImage(graph, view, path, &error, kSize, dark)) << error.toStdString();
        EXPECT_EQ(error, QString());
        return path;
    }
    PlayedMetafile metafile() {
        PlayedMetafile played = playMetafile(contents(written("graph.wmf")));
        EXPECT_EQ(played.faults, std::vector<std::string>());
        return played;
    }
    static std::vector<Drawn> traceOf(const PlayedMetafile& played) {
        std::vector<Drawn> lines;
        for (const Drawn& drawn : played.of(Drawn::Kind::Polyline))
            if (drawn.pen.color == kPaperTrace) lines.push_back(drawn);
        return lines;
    }

    const QTemporaryDir folder;
    Form form{"form"};
    Graph graph{form, "graph"};
    ViewAnnotations view;
};

TEST_F(GraphImage, Ending_ChoosesTheKindInEitherCase) {
    EXPECT_TRUE(contents(written("a.wmf")).startsWith("\xD7\xCD\xC6\x9A"));
    EXPECT_TRUE(contents(written("a.WMF")).startsWith("\xD7\xCD\xC6\x9A"));
    EXPECT_TRUE(contents(written("a.b.Svg")).contains("<svg"));
    EXPECT_TRUE(contents(written("a.PNG")).startsWith("\x89PNG"));
    EXPECT_TRUE(contents(written("a.pDf")).startsWith("%PDF"));
}

TEST_F(GraphImage, NameWithoutAnEnding_IsRefusedWithAHint) {
    QString error;
    EXPECT_FALSE(saveGraphImage(graph, view, folder.filePath("graph"), &error));
    EXPECT_EQ(error, "A picture's name ends in its kind: wmf, svg, png or pdf");
    EXPECT_FALSE(QFile::exists(folder.filePath("graph")));
}

TEST_F(GraphImage, Metafile_HasTheSizeOfThePicture) {
    const PlayedMetafile played = metafile();
    EXPECT_EQ(played.window, kSize * kUnits);
    EXPECT_EQ(played.box.bottomRight(), QPoint(1000 * kUnits, 620 * kUnits));
    EXPECT_EQ(played.unitsPerInch, 96 * kUnits);
    EXPECT_GT(played.handles, 3);
    EXPECT_LE(played.handles, 12);
}

TEST_F(GraphImage, Metafile_HasAllTextsInTheirPlaces) {
    const PlayedMetafile played = metafile();
    for (const char* text : {"Ref -123.45 dB\xB5V    10dB/DIV", "RBW 100 kHz    VBW Auto",
                             "Distance To Fault    Det Auto Peak", "SWT 123.456 ms", "Start 0 Hz",
                             "Center 1.5 GHz", "Stop 3 GHz", "dBm", "-20", "-120", "500 MHz"})
        EXPECT_NE(played.text(text), nullptr) << text;
    ASSERT_NE(played.text("dBm"), nullptr);
    EXPECT_EQ(played.text("dBm")->font.escapement, 900);
    const Drawn* center = played.text("Center 1.5 GHz");
    ASSERT_NE(center, nullptr);
    int width = 0;
    for (const int advance : center->advances) width += advance;
    EXPECT_NEAR(center->points.at(0).x() + width / 2.0, 490 * kUnits, 20 * kUnits);
}

TEST_F(GraphImage, LongLabelsOfTheXAxis_StandAtBothEnds) {
    graph.setXRange(1.2034e9, 1.2044e9);
    const PlayedMetafile played = metafile();
    EXPECT_NE(played.text("1.2034 GHz"), nullptr);
    EXPECT_NE(played.text("1.2044 GHz"), nullptr);
}

TEST_F(GraphImage, Metafile_KeepsTheTraceInsideOfItsClip) {
    graph.setXRange(1.001e9, 1.999e9);
    const PlayedMetafile played = metafile();
    const std::vector<Drawn> lines = traceOf(played);
    ASSERT_FALSE(lines.empty());
    int left = played.window.width();
    int right = 0;
    for (const Drawn& line : lines) {
        ASSERT_TRUE(line.clip);
        for (const QPoint& point : line.points) {
            EXPECT_TRUE(line.clip->contains(point)) << point.x() << ' ' << point.y();
            left = std::min(left, point.x());
            right = std::max(right, point.x());
        }
    }
    // From edge to edge, though no sample lies there.
    EXPECT_NEAR(left, lines[0].clip->left(), kUnits);
    EXPECT_NEAR(right, lines[0].clip->right(), 2 * kUnits);
}

TEST_F(GraphImage, Metafile_ShowsTheMarkersOnPaper) {
    const PlayedMetafile played = metafile();
    const std::vector<Drawn> circles = played.of(Drawn::Kind::Ellipse);
    ASSERT_EQ(circles.size(), 1U);  // the other one is off the graticule
    EXPECT_EQ(circles[0].pen.width, 2 * kUnits);
    EXPECT_FALSE(circles[0].brush);
    EXPECT_LT(circles[0].pen.color.lightness(), 100) << "a light colour is lost on paper";
    ASSERT_TRUE(circles[0].clip);
}

TEST_F(GraphImage, TriggerLevel_IsDashedWithItsCaption) {
    graph.setTrigger({"Trigger", -70, true});
    const PlayedMetafile played = metafile();
    const Drawn* caption = played.text("Trigger");
    ASSERT_NE(caption, nullptr);
    int dashes = 0;
    for (const Drawn& line : played.of(Drawn::Kind::Polyline))
        if (line.pen.color == caption->textColor) ++dashes;
    EXPECT_GT(dashes, 50);
}

TEST_F(GraphImage, GraphWithoutATrace_IsStillAPicture) {
    graph.clearPlot();
    for (const char* name : {"e.wmf", "e.svg", "e.png", "e.pdf"})
        EXPECT_GT(QFileInfo(written(name)).size(), 500) << name;
    EXPECT_TRUE(traceOf(metafile()).empty());
}

/// The points of all polylines of an SVG file in a colour, within the transformations around them.
QPolygonF svgPoints(const QByteArray& svg, const QString& color) {
    QXmlStreamReader reader(svg);
    QPolygonF points;
    QStringList strokes;
    while (!reader.atEnd()) {
        reader.readNext();
        if (reader.isEndElement() && !strokes.isEmpty()) strokes.removeLast();
        if (!reader.isStartElement()) continue;
        const QString own = reader.attributes().value("stroke").toString();
        strokes << (own.isEmpty() && !strokes.isEmpty() ? strokes.back() : own);
        if (reader.name() != u"polyline" || strokes.back() != color) continue;
        const QString list = reader.attributes().value("points").toString();
        for (const QString& pair : list.split(' ', Qt::SkipEmptyParts))
            points.append({pair.section(',', 0, 0).toDouble(), pair.section(',', 1, 1).toDouble()});
    }
    EXPECT_FALSE(reader.hasError()) << reader.errorString().toStdString();
    return points;
}

TEST_F(GraphImage, Svg_KeepsTheZoomedTraceInsideOfTheGraticule) {
    graph.setXRange(1.001e9, 1.999e9);
    const PlayedMetafile played = metafile();  // has the same layout, and says where the clip is
    const QRect clip = *traceOf(played).at(0).clip;
    const QPolygonF points = svgPoints(contents(written("z.svg", false)), kPaperTrace.name());
    ASSERT_GT(points.size(), 50);
    const QRectF seen = points.boundingRect();
    EXPECT_NEAR(seen.left() * kUnits, clip.left(), 2 * kUnits);
    EXPECT_NEAR(seen.right() * kUnits, clip.right(), 2 * kUnits);
    EXPECT_GE(seen.top() * kUnits, clip.top() - kUnits);
    EXPECT_LE(seen.bottom() * kUnits, clip.bottom() + kUnits);
}

TEST_F(GraphImage, Svg_HidesAMarkerThatIsOffTheGraticule) {
    const QByteArray both = contents(written("m.svg"));
    EXPECT_EQ(both.count("<circle") + both.count("<ellipse"), 1);
}

TEST_F(GraphImage, Svg_HasTextsOfTheScreensSize) {
    const QByteArray svg = contents(written("t.svg"));
    EXPECT_TRUE(svg.contains("RBW 100 kHz"));
    const QRegularExpression size("font-size=\"([0-9.]+)\"");
    EXPECT_NEAR(size.match(svg).captured(1).toDouble(), 12, 0.5);  // 9 points at 96 dots an inch
}

TEST_F(GraphImage, Pdf_IsOnePageOfThePicturesSizeAndADrawing) {
    const QByteArray pdf = contents(written("p.pdf"));
    EXPECT_EQ(pdf.count("/Type /Page\n"), 1);
    const QRegularExpression box("/MediaBox \\[0 0 ([0-9.]+) ([0-9.]+)\\]");
    const QRegularExpressionMatch match = box.match(QString::fromLatin1(pdf));
    EXPECT_NEAR(match.captured(1).toDouble(), 750, 0.1);
    EXPECT_NEAR(match.captured(2).toDouble(), 465, 0.1);
    EXPECT_FALSE(pdf.contains("/Subtype /Image"));
    EXPECT_TRUE(pdf.contains("/FontFile2"));
}

TEST_F(GraphImage, FailedWrite_LeavesTheOlderFileAsItWas) {
    for (const char* name : {"o.wmf", "o.svg", "o.png", "o.pdf"}) {
        const QString path = folder.filePath(name);
        QFile older(path);
        ASSERT_TRUE(older.open(QIODevice::WriteOnly));
        older.write("precious");
        older.close();
        // A file may not grow: as on a full disk.
        rlimit before{};
        getrlimit(RLIMIT_FSIZE, &before);
        rlimit small = before;
        small.rlim_cur = 100;
        std::signal(SIGXFSZ, SIG_IGN);
        setrlimit(RLIMIT_FSIZE, &small);
        QString error;
        const bool done = saveGraphImage(graph, view, path, &error);
        setrlimit(RLIMIT_FSIZE, &before);
        EXPECT_FALSE(done) << name;
        EXPECT_TRUE(error.startsWith("Cannot write " + path + ": ")) << error.toStdString();
        EXPECT_EQ(contents(path), "precious") << name;
    }
    EXPECT_EQ(QDir(folder.path()).entryList(QDir::Files).size(), 4) << "something was left behind";
}

TEST_F(GraphImage, IncompleteTrace_SaysSoInThePicture) {
    graph.Incomplete = "INCOMPLETE 150/301";
    EXPECT_TRUE(contents(written("incomplete.svg")).contains("INCOMPLETE 150/301"));
    graph.Incomplete = "";
    EXPECT_FALSE(contents(written("whole.svg")).contains("INCOMPLETE"));
}

TEST_F(GraphImage, Success_ReplacesTheOlderFile) {
    const QString path = written("r.wmf");
    const QByteArray first = contents(path);
    view.center = "Center 1 GHz";
    written("r.wmf");
    EXPECT_NE(contents(path), first);
    EXPECT_EQ(playMetafile(contents(path)).faults, std::vector<std::string>());
}

class PanelImage : public WindowTest {};

TEST_F(PanelImage, DrawImage_WritesTheWindowsGraph) {
    connect();
    show();
    const QTemporaryDir folder;
    std::string problem;
    panel().DrawImage(folder.filePath("panel.wmf").toStdString(), problem);
    EXPECT_EQ(problem, "");
    const PlayedMetafile played = playMetafile(contents(folder.filePath("panel.wmf")));
    EXPECT_EQ(played.faults, std::vector<std::string>());
    EXPECT_NE(played.text("Stop 3 GHz"), nullptr);
    EXPECT_GE(played.window.width(), 800 * kUnits);
    panel().DrawImage("/no/such/folder/panel.wmf", problem);
    EXPECT_EQ(problem.rfind("Cannot write /no/such/folder/panel.wmf: ", 0), 0U) << problem;
}

/// The cells of a grid of that size that the trace's ink falls into.
QImage traceCells(const QImage& image, QSize grid) {
    QImage cells(grid, QImage::Format_Grayscale8);
    cells.fill(0);
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            const QColor color = image.pixelColor(x, y);
            if (color.blue() < color.red() + 80) continue;
            cells.setPixel(x * grid.width() / image.width(), y * grid.height() / image.height(),
                           0xFFFFFFFF);
        }
    }
    return cells;
}

int inked(const QImage& cells) {
    int count = 0;
    for (int y = 0; y < cells.height(); ++y)
        count +=
            static_cast<int>(QByteArrayView(cells.constScanLine(y), cells.width()).count('\xFF'));
    return count;
}

/// The share of the inked cells that have ink of `other` at most so many cells away.
double foundIn(const QImage& cells, const QImage& other, int reach) {
    int found = 0;
    for (int y = 0; y < cells.height(); ++y) {
        for (int x = 0; x < cells.width(); ++x) {
            if (qGray(cells.pixel(x, y)) == 0) continue;
            const QRect around(x - reach, y - reach, 2 * reach + 1, 2 * reach + 1);
            found += inked(other.copy(around & other.rect())) > 0 ? 1 : 0;
        }
    }
    return static_cast<double>(found) / inked(cells);
}

TEST_F(GraphImage, AnotherProgram_DrawsTheMetafileAsWeDo) {
    const QString reader = QStandardPaths::findExecutable("wmf2gd");
    QDirIterator fonts("/usr/share/fonts", {"*.ttf"}, QDir::Files, QDirIterator::Subdirectories);
    if (reader.isEmpty() || !fonts.hasNext()) GTEST_SKIP() << "wmf2gd or a font is not installed";
    graph.removeCursors();
    graph.setXRange(1.001e9, 1.999e9);
    const QFileInfo font(fonts.next());
    QFile map(folder.filePath("Fontmap"));
    ASSERT_TRUE(map.open(QIODevice::WriteOnly));
    for (const char* name : {"Helvetica", "Times-Roman", "Courier"})
        map.write(QString("/%1 (%2) ;\n").arg(name, font.fileName()).toUtf8());
    map.close();
    const QString drawing = folder.filePath("other.png");
    QProcess process;
    process.start(reader,
                  {"--wmf-sys-fonts=no", "--wmf-xtra-fonts=no", "--wmf-fontdir=" + font.path(),
                   "--wmf-gs-fontmap=" + map.fileName(), "-o", drawing, written("graph.wmf")});
    ASSERT_TRUE(process.waitForFinished()) << process.errorString().toStdString();
    EXPECT_EQ(process.exitCode(), 0) << process.readAllStandardError().toStdString();
    const QImage other(drawing);
    ASSERT_FALSE(other.isNull());
    EXPECT_NEAR(double(other.width()) / other.height(), double(kSize.width()) / kSize.height(),
                0.02);
    const QSize grid = kSize / 2;
    const QImage theirs = traceCells(other, grid);
    const QImage ours = traceCells(QImage(written("own.png", false)), grid);
    ASSERT_GT(inked(theirs), 1000);
    ASSERT_GT(inked(ours), 1000);
    EXPECT_GT(foundIn(theirs, ours, 2), 0.99);
    EXPECT_GT(foundIn(ours, theirs, 2), 0.99);
}

}  // namespace
}  // namespace zel
