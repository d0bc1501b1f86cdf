#include "desktop/graph/GraphImage.h"

#include <QApplication>
#include <QBuffer>
#include <QFileInfo>
#include <QPageSize>
#include <QPdfWriter>
#include <QSvgGenerator>

#include "desktop/graph/GraphColors.h"
#include "desktop/graph/GraphPlot.h"
#include "desktop/graph/MetafileEngine.h"
#include "desktop/graph/PictureFile.h"
#include "desktop/graph/TraceOverlay.h"
#include "platform/Form.h"
#include "platform/Graph.h"
#include "trace/ViewAnnotations.h"

namespace zel {
namespace {

constexpr double kOversampling = 2;
constexpr double kPointsPerInch = 72;
constexpr const char* kTitle = "ZELRemote";

QByteArray pngOf(QCustomPlot& plot, QSize size) {
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    plot.toPixmap(size.width(), size.height(), kOversampling).save(&buffer, "PNG");
    return bytes;
}

bool draw(QCustomPlot& plot, QSize size, QPaintDevice& device) {
    QCPPainter painter;
    if (!painter.begin(&device)) return false;
    painter.setMode(QCPPainter::pmVectorized);
    plot.toPainter(&painter, size.width(), size.height());
    return painter.end();
}

QByteArray svgOf(QCustomPlot& plot, QSize size) {
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    QSvgGenerator generator;
    generator.setOutputDevice(&buffer);
    generator.setResolution(plot.logicalDpiX());
    generator.setSize(size);
    generator.setViewBox(QRect(QPoint(), size));
    generator.setTitle(kTitle);
    return draw(plot, size, generator) ? bytes : QByteArray();
}

QByteArray pdfOf(QCustomPlot& plot, QSize size) {
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    {
        QPdfWriter writer(&buffer);
        writer.setResolution(plot.logicalDpiX());
        const QSizeF points = QSizeF(size) * kPointsPerInch / plot.logicalDpiX();
        writer.setPageSize(QPageSize(points, QPageSize::Point, kTitle, QPageSize::ExactMatch));
        writer.setPageMargins({});
        writer.setTitle(kTitle);
        writer.setCreator(kTitle);
        if (!draw(plot, size, writer)) return {};
    }
    return bytes;
}

QByteArray wmfOf(QCustomPlot& plot, QSize size) {
    MetafileDevice device(size, plot.logicalDpiX());
    return draw(plot, size, device) ? device.finish() : QByteArray();
}

struct Kind {
    const char* ending;
    QByteArray (*write)(QCustomPlot& plot, QSize size);
    bool paper;      ///< has light colours always
    double pen;      ///< width of the trace, pixels
    bool keepsClip;  ///< what is drawn outside of a clip is not seen
};
constexpr Kind kKinds[] = {
    {"wmf", wmfOf, true, 1, true},
    {"svg", svgOf, false, 1, false},
    {"png", pngOf, false, 1 / kOversampling, true},
    {"pdf", pdfOf, true, 1, true},
};

const Kind* kindOf(const QString& path, QString& problem) {
    const QString ending = QFileInfo(path).suffix().toLower();
    for (const Kind& kind : kKinds)
        if (ending == kind.ending) return &kind;
    problem = ending.isEmpty() ? "A picture's name ends in its kind: wmf, svg, png or pdf"
                               : "Unknown kind of picture: ." + ending + " (wmf, svg, png or pdf)";
    return nullptr;
}

/// The graph as it stands, but for the mark of age: that is about the screen.
void copyGraph(const Graph& graph, Graph& shown) {
    shown.setXRange(graph.xAxis().Minimum, graph.xAxis().Maximum);
    shown.setYRange(graph.yAxis().Minimum, graph.yAxis().Maximum);
    shown.showYLabels(graph.yAxis().ShowLabels);
    shown.setTrigger(graph.trigger());
    for (int i = 1; i <= graph.cursorCount(); ++i) shown.addCursor(graph.cursor(i));
    shown.plotY(graph.values(), graph.firstX(), graph.increment());
    shown.Incomplete = graph.Incomplete.get();
    shown.Note = graph.Note.get();
}

QString save(const Graph& graph, const ViewAnnotations& view, const QString& path, QSize size,
             bool dark, const OverlayPicture& tools) {
    QString problem;
    const Kind* kind = kindOf(path, problem);
    if (kind == nullptr) return problem;
    if (qobject_cast<QApplication*>(QCoreApplication::instance()) == nullptr)
        return "Pictures cannot be drawn here";
    QCustomPlot plot;
    const bool paper = !dark || kind->paper;
    GraphPlot picture(plot, paper ? lightGraph() : darkGraph());
    Form form("picture");
    Graph shown(form, "graph");
    copyGraph(graph, shown);
    picture.setTraceWidth(kind->pen);
    picture.update(shown, view);
    if (!kind->keepsClip) picture.clipToView();
    if (!tools.empty()) {
        TraceOverlay overlay(plot, paper);
        overlay.show(tools);
        if (!kind->keepsClip) overlay.clipToView();
    }
    const QByteArray bytes = kind->write(plot, size);
    if (bytes.isEmpty()) return "Cannot draw " + path;
    return writePicture(path, bytes);
}

}  // namespace

bool saveGraphImage(const Graph& graph, const ViewAnnotations& view, const QString& path,
                    QString* error, QSize size, bool dark, const OverlayPicture& tools) {
    const QString problem = save(graph, view, path, size, dark, tools);
    if (error != nullptr) *error = problem;
    return problem.isEmpty();
}

}  // namespace zel
