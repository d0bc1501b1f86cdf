#include "desktop/graph/GraphImage.h"

#include <QBuffer>
#include <QFileInfo>
#include <QSaveFile>
#include <QSvgGenerator>

#include "desktop/graph/GraphPlot.h"

namespace zel {
namespace {

constexpr double kOversampling = 2;

QByteArray pngOf(QCustomPlot& plot, QSize size) {
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    plot.toPixmap(size.width(), size.height(), kOversampling).save(&buffer, "PNG");
    return bytes;
}

QByteArray svgOf(QCustomPlot& plot, QSize size) {
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    QSvgGenerator generator;
    generator.setOutputDevice(&buffer);
    generator.setSize(size);
    generator.setViewBox(QRect(QPoint(), size));
    generator.setTitle("ZELRemote");
    QCPPainter painter;
    if (painter.begin(&generator)) {
        painter.setMode(QCPPainter::pmVectorized);
        plot.toPainter(&painter, size.width(), size.height());
        painter.end();
    }
    return bytes;
}

/// What a zoomed view shows: the clip of the plot area is lost in an SVG file, so the trace ends
/// at the edge by itself.
void clipToView(Graph& graph, const Graph& original) {
    std::vector<double> values = original.values();
    const GraphAxis& y = original.yAxis();
    const GraphAxis& x = original.xAxis();
    std::size_t first = values.size();
    std::size_t last = 0;
    for (std::size_t i = 0; i < values.size(); ++i) {
        values[i] = std::min(std::max(values[i], y.Minimum), y.Maximum);
        const double at = original.firstX() + static_cast<double>(i) * original.increment();
        if (at < x.Minimum || at > x.Maximum) continue;
        first = std::min(first, i);
        last = std::max(last, i);
    }
    if (first > last) return graph.plotY({}, 0, 0);
    const auto begin = values.begin();
    graph.plotY(
        {begin + static_cast<std::ptrdiff_t>(first), begin + static_cast<std::ptrdiff_t>(last) + 1},
        original.firstX() + static_cast<double>(first) * original.increment(),
        original.increment());
}

}  // namespace

bool saveGraphImage(const Graph& graph, const ViewAnnotations& view, const QString& path,
                    QString* error, QSize size, bool dark) {
    const QString kind = QFileInfo(path).suffix().toLower();
    const bool svg = kind == "svg";
    if (!svg && kind != "png") {
        if (error != nullptr) *error = "Unknown kind of picture: ." + kind + " (png or svg)";
        return false;
    }
    QCustomPlot plot;
    GraphPlot picture(plot, dark ? darkGraph() : lightGraph());
    Form form("picture");
    Graph shown(form, "graph");
    shown.setXRange(graph.xAxis().Minimum, graph.xAxis().Maximum);
    shown.setYRange(graph.yAxis().Minimum, graph.yAxis().Maximum);
    shown.showYLabels(graph.yAxis().ShowLabels);
    shown.setTrigger(graph.trigger());
    for (int i = 1; i <= graph.cursorCount(); ++i) shown.addCursor(graph.cursor(i));
    clipToView(shown, graph);
    if (!svg) picture.setTraceWidth(1 / kOversampling);
    picture.update(shown, view);
    const QByteArray bytes = svg ? svgOf(plot, size) : pngOf(plot, size);
    QSaveFile file(path);
    if (!bytes.isEmpty() && file.open(QIODevice::WriteOnly) && file.write(bytes) == bytes.size() &&
        file.commit())
        return true;
    if (error != nullptr) *error = "Cannot write " + path + ": " + file.errorString();
    return false;
}

}  // namespace zel
