// What the console writes as data and this program draws is what the desktop draws by itself.

#include <gtest/gtest.h>

#include <QApplication>
#include <QBuffer>
#include <algorithm>
#include <cmath>
#include <limits>
#include <utility>

#include "desktop/graph/GraphImage.h"
#include "desktop/graph/SpectrogramPicture.h"
#include "desktop/graph/WaterfallImage.h"
#include "drawing/Draw.h"
#include "drawing/PictureReader.h"
#include "picture/PictureJson.h"
#include "tests/files/DiskFolder.h"

namespace zel {
namespace {

/// Gives a few bytes at a time, as a pipe does.
class Pipe : public QIODevice {
  public:
    explicit Pipe(QByteArray bytes) : bytes_(std::move(bytes)) { open(ReadOnly | Unbuffered); }
    bool isSequential() const override { return true; }

  protected:
    qint64 readData(char* data, qint64 most) override {
        constexpr qint64 kAtOnce = 100;
        const qint64 count = std::min({most, kAtOnce, qint64{bytes_.size()}});
        std::copy_n(bytes_.begin(), count, data);
        bytes_.remove(0, count);
        return count;
    }
    qint64 writeData(const char*, qint64) override { return -1; }

  private:
    QByteArray bytes_;
};

struct Draw : ::testing::Test {
    static void SetUpTestSuite() {
        static int count = 1;
        static char name[] = "test_drawing";
        static char* arguments[] = {name, nullptr};
        static const auto* application = new QApplication(count, arguments);
        EXPECT_NE(application, nullptr);
    }
    std::string draw(const std::string& json, const std::string& name) {
        QBuffer buffer;
        buffer.setData(json.data(), static_cast<int>(json.size()));
        buffer.open(QIODevice::ReadOnly);
        return drawPicture(buffer, folder.file(name));
    }
    /// The file without the moment at which it was made.
    std::string file(const std::string& name) {
        std::string text = folder.read(name);
        const auto at = text.find("/CreationDate");
        if (at != std::string::npos) text.erase(at, 40);
        return text;
    }
    void expectSame(const std::string& one, const std::string& other) {
        EXPECT_GT(file(one).size(), 1000U) << one;
        EXPECT_TRUE(file(one) == file(other)) << one << " is not " << other;
    }

    Forms forms;
    DiskFolder folder;
};

ViewAnnotations someTexts() {
    ViewAnnotations view;
    view.ok = true;
    view.refLevel = "Ref -20 dB\xC2\xB5V";
    view.range = "10dB/DIV";
    view.rbw = "RBW Auto";
    view.sweepTime = "SWT 20 ms";
    view.detector = "Det Auto Peak";
    view.unit = "dBm";
    view.xUnit = "Hz";
    view.left = "Start 1 GHz";
    view.right = "Stop 2 GHz";
    view.rangeUnsure = true;
    view.yUnsure = true;
    return view;
}

TEST_F(Draw, DataThatComesInPieces_IsReadWhole) {
    const std::string json = graphJson(forms.controller.CWGraph1, someTexts());
    Pipe pipe(QByteArray(json.data(), static_cast<int>(json.size())));
    EXPECT_EQ(drawPicture(pipe, folder.file("pieces.png")), "");
}

TEST_F(Draw, Graph_IsTheDesktopsInEachKind) {
    Graph& graph = forms.controller.CWGraph1;
    graph.setXRange(1e9, 2e9);
    graph.setYRange(-120, -20);
    std::vector<double> values;
    for (int i = 0; i <= 300; ++i) values.push_back(-100 + 60 * std::sin(i * 0.1));
    values[100] = std::numeric_limits<double>::quiet_NaN();
    values[200] = -std::numeric_limits<double>::infinity();
    graph.plotY(values, 1e9, 1e9 / 300);
    graph.addCursor({1.3e9, -60, 0xFFFF00, true});
    graph.addCursor({1.6e9, -70, 0x00FF00, false});
    graph.setTrigger({"Trigger", -50, true});
    graph.Note = "12:00:05";
    graph.Incomplete = "INCOMPLETE 150/301";
    const std::string json = graphJson(graph, someTexts());
    for (const std::string ending : {"png", "svg", "pdf", "wmf"}) {
        EXPECT_EQ(draw(json, "drawn." + ending), "");
        QString problem;
        ASSERT_TRUE(saveGraphImage(graph, someTexts(),
                                   QString::fromStdString(folder.file("own." + ending)), &problem))
            << problem.toStdString();
        expectSame("drawn." + ending, "own." + ending);
    }
}

void plotRows(Forms& forms) {
    Graph3D& graph = forms.waterfall.Graph3D;
    graph.setRange(1, 1e9, 2e9);
    graph.setRange(2, 0, 12);
    graph.setRange(3, -120, -20);
    graph.setFormat(1, "k\"Hz\"");
    graph.setFormat(3, "0\" dBm\"");
    forms.waterfall.lblMAX.Caption = "-20 dBm";
    forms.waterfall.lblMin.Caption = "-120 dBm";
    for (int row = 1; row <= 10; ++row) {
        std::vector<double> x;
        std::vector<double> level;
        std::vector<double> colour;
        for (int i = 0; i <= 300; ++i) {
            x.push_back(1e9 + i * 1e9 / 300);
            level.push_back(-110 + 40.0 / 3 * std::sin((i + row * 7) * 0.07) + row);
            colour.push_back(50 + level.back() / 3);
        }
        graph.stampNext(row, "12:00:0" + std::to_string(row % 10));
        graph.plotCurve(std::vector<double>(x.size(), row), x, level, colour);
        graph.setValuePair(2, row, {row % 3 == 0 ? "12:00" : "", static_cast<double>(row)});
    }
    graph.addCursor();
    graph.setCursor(0, {1.4e9, 4, -90, 4, true, "12:00:04", true});
}

TEST_F(Draw, Waterfall_IsTheDesktopsFromEachView) {
    plotRows(forms);
    PictureStyle style;
    style.levels = LevelSource::ByHand;
    style.low = -115;
    style.high = -80;
    style.depthRows = 6;
    style.colourMap = 3;
    for (const bool turned : {false, true}) {
        GraphView3D view;
        view.Latitude = 40;
        view.Distance = 3.5;
        if (turned) {
            forms.waterfall.Graph3D.setView(view);
            forms.waterfall.Graph3D.Projection = Projection3D::Orthographic;
            style = PictureStyle();
        } else {
            style.view = view;
        }
        EXPECT_EQ(draw(waterfallJson(forms.waterfall, style), "drawn.png"), "");
        QString problem;
        ASSERT_TRUE(saveWaterfallImage(forms.waterfall, style,
                                       QString::fromStdString(folder.file("own.png")), &problem));
        expectSame("drawn.png", "own.png");
    }
}

TEST_F(Draw, Spectrogram_IsTheDesktops) {
    SweepHistory history(forms);
    forms.controller.CWGraph1.plotY(std::vector<double>(301, -50), 1e9, 1e9 / 300);
    plotRows(forms);
    ASSERT_EQ(history.count(), 10);
    EXPECT_EQ(draw(spectrogramJson(forms.waterfall, history), "drawn.png"), "");
    QString problem;
    ASSERT_TRUE(saveSpectrogramImage(forms.waterfall, history,
                                     QString::fromStdString(folder.file("own.png")), &problem));
    expectSame("drawn.png", "own.png");
}

TEST_F(Draw, AFileThatCannotBeDrawn_IsReportedInTheDesktopsWords) {
    const std::string json = graphJson(forms.controller.CWGraph1, {});
    EXPECT_EQ(draw(json, "x.bmp"), "Unknown kind of picture: .bmp (wmf, svg, png or pdf)");
    EXPECT_NE(draw(json, "none/x.png").find("Cannot write"), std::string::npos);
}

struct BadPicture {
    const char* json;
    const char* problem;
};

class BadPictures : public ::testing::TestWithParam<BadPicture> {};

TEST_P(BadPictures, AreRefusedWithThePlaceOfTheFault) {
    DrawnPicture picture;
    EXPECT_EQ(readPicture(GetParam().json, picture).toStdString(), GetParam().problem);
}

INSTANTIATE_TEST_SUITE_P(
    ReadPicture, BadPictures,
    ::testing::Values(
        BadPicture{"", "the data is not the JSON of a picture: illegal value at byte 0"},
        BadPicture{"[]", "the data is not the JSON of a picture: it is no object"},
        BadPicture{
            R"({"zeldraw":1,"kind":"graph","values":[1)",
            "the data is not the JSON of a picture: invalid termination by number at byte 39"},
        BadPicture{R"({"kind":"graph"})", "the data is of version 0, this program knows version 1"},
        BadPicture{R"({"zeldraw":2,"kind":"graph"})",
                   "the data is of version 2, this program knows version 1"},
        BadPicture{R"({"zeldraw":1,"kind":"pie"})", "kind: is not graph, waterfall or spectrogram"},
        BadPicture{R"({"zeldraw":"1","kind":"graph"})", "zeldraw: is no whole number"},
        BadPicture{R"({"zeldraw":1,"kind":"graph","values":7})", "values: is no list"},
        BadPicture{R"({"zeldraw":1,"kind":"graph","values":[1,"x"]})",
                   "values: holds what is no number"},
        BadPicture{R"({"zeldraw":1,"kind":"graph","x":{"min":"low"}})", "x.min: is no number"},
        BadPicture{R"({"zeldraw":1,"kind":"graph","cursors":[{},{"visible":1}]})",
                   "cursors[1].visible: is neither true nor false"},
        BadPicture{R"({"zeldraw":1,"kind":"graph","cursors":[{"color":-1}]})",
                   "cursors[0].color: is no colour"},
        BadPicture{R"({"zeldraw":1,"kind":"waterfall","plots":[{"level":[1]}]})",
                   "plots[0].level: has another length than depth, x or colour"},
        BadPicture{R"({"zeldraw":1,"kind":"waterfall","row_labels":[{"row":0}]})",
                   "row_labels[0].row: is not 1 or more"},
        BadPicture{R"({"zeldraw":1,"kind":"waterfall","axes":[{},{},{},{}]})",
                   "axes: are more than three"},
        BadPicture{R"({"zeldraw":1,"kind":"waterfall","view":{"translation":[1,2]}})",
                   "view.translation: has not three numbers"},
        BadPicture{R"({"zeldraw":1,"kind":"waterfall","style":{"levels":9}})",
                   "style.levels: is not 0 to 2"},
        BadPicture{R"({"zeldraw":1,"kind":"spectrogram","rows":[{"codes":[70000]}]})",
                   "rows[0].codes: holds what is no whole number from 0 to 65535"}));

}  // namespace
}  // namespace zel
