#include "desktop/graph/GraphPlot.h"

#include <cmath>
#include <limits>

#include "desktop/graph/DivisionTicker.h"
#include "desktop/graph/PolylineClip.h"

namespace zel {
namespace {

constexpr double kCursorReach = 8;  // pixels
constexpr int kFontPoints = 9;
/// Half of the last label of the x axis stands in it: one that does not fit is not drawn at all.
constexpr int kRightMargin = 42;

QFont plotFont() {
    QFont font;
    font.setPointSize(kFontPoints);
    return font;
}

QString text(const std::string& utf8) { return QString::fromStdString(utf8); }

QString joined(const QStringList& parts) {
    QStringList kept;
    for (const QString& part : parts)
        if (!part.isEmpty()) kept << part;
    return kept.join("    ");
}

}  // namespace

GraphColors darkGraph() { return {}; }

GraphColors lightGraph() {
    GraphColors colors;
    colors.background = Qt::white;
    colors.plotArea = Qt::white;
    colors.grid = QColor(0xc8, 0xce, 0xd4);
    colors.frame = QColor(0x40, 0x48, 0x50);
    colors.text = QColor(0x10, 0x14, 0x18);
    colors.trace = QColor(0x0b, 0x4f, 0xa8);
    colors.trigger = QColor(0xb0, 0x20, 0x20);
    colors.cursorDarkness = 170;
    return colors;
}

QColor colorOf(Color color) {
    return {static_cast<int>(color & 0xFF), static_cast<int>(color >> 8 & 0xFF),
            static_cast<int>(color >> 16 & 0xFF)};
}

GraphPlot::GraphPlot(QCustomPlot& plot, const GraphColors& colors) : plot_(plot), colors_(colors) {
    plot_.setBackground(colors_.background);
    plot_.setPlottingHints(QCP::phFastPolylines | QCP::phCacheLabels);
    plot_.setNoAntialiasingOnDrag(true);
    axisRect_ = plot_.axisRect();
    axisRect_->setBackground(colors_.plotArea);
    axisRect_->setMinimumMargins(QMargins(8, 4, kRightMargin, 4));

    QCPLayoutGrid* layout = plot_.plotLayout();
    layout->insertRow(0);
    auto* top = new QCPLayoutGrid;
    layout->addElement(0, 0, top);
    top->setMargins(QMargins(10, 8, kRightMargin, 0));
    top->setRowSpacing(1);
    top_ = {addText(*top, 0, 0, Qt::AlignLeft), addText(*top, 0, 1, Qt::AlignRight),
            addText(*top, 1, 0, Qt::AlignLeft), addText(*top, 1, 1, Qt::AlignRight)};
    auto* bottom = new QCPLayoutGrid;
    layout->addElement(2, 0, bottom);
    bottom->setMargins(QMargins(10, 0, kRightMargin, 6));
    bottom_ = {addText(*bottom, 0, 0, Qt::AlignLeft), addText(*bottom, 0, 1, Qt::AlignHCenter),
               addText(*bottom, 0, 2, Qt::AlignRight)};
    layout->setRowSpacing(2);
    layout->setRowStretchFactor(0, 0.001);
    layout->setRowStretchFactor(2, 0.001);

    styleAxes();
    trace_ = plot_.addGraph();
    trace_->setPen(QPen(colors_.trace, 1));
    trace_->setAdaptiveSampling(false);
    for (CursorItems& cursor : cursors_) {
        cursor.line = new QCPItemStraightLine(&plot_);
        cursor.point = new QCPItemTracer(&plot_);
        cursor.point->setStyle(QCPItemTracer::tsCircle);
        cursor.point->setSize(9);
        cursor.line->setVisible(false);
        cursor.point->setVisible(false);
    }
    trigger_ = new QCPItemStraightLine(&plot_);
    trigger_->setPen(QPen(colors_.trigger, 1, Qt::DashLine));
    trigger_->setVisible(false);
    triggerText_ = new QCPItemText(&plot_);
    triggerText_->setColor(colors_.trigger);
    triggerText_->setFont(plotFont());
    triggerText_->setPositionAlignment(Qt::AlignLeft | Qt::AlignBottom);
    triggerText_->setVisible(false);
    old_ = addNote(0.04);
    old_->setText("OLD TRACE");
    incomplete_ = addNote(0.10);
}

QCPItemText* GraphPlot::addNote(double height) {
    auto* note = new QCPItemText(&plot_);
    note->position->setType(QCPItemPosition::ptAxisRectRatio);
    note->position->setCoords(0.5, height);
    note->setPositionAlignment(Qt::AlignHCenter | Qt::AlignTop);
    note->setColor(colors_.trigger);
    note->setFont(plotFont());
    note->setVisible(false);
    return note;
}

AnnotationText* GraphPlot::addText(QCPLayoutGrid& grid, int row, int column,
                                   Qt::Alignment alignment) {
    auto* element = new AnnotationText(&plot_, plotFont());
    element->setTextColor(colors_.text);
    element->setTextFlags(static_cast<int>((alignment | Qt::AlignVCenter).toInt()));
    grid.addElement(row, column, element);
    return element;
}

void GraphPlot::styleAxes() {
    plot_.xAxis->setTicker(QSharedPointer<DivisionTicker>(new DivisionTicker(2)));
    plot_.yAxis->setTicker(QSharedPointer<DivisionTicker>(new DivisionTicker(1)));
    axisRect_->setupFullAxesBox(false);
    for (QCPAxis* axis : axisRect_->axes()) {
        axis->setBasePen(QPen(colors_.frame, 1));
        axis->setTickPen(QPen(colors_.frame, 1));
        axis->setSubTicks(false);
        axis->setTickLength(0, 4);
        axis->setTickLabelColor(colors_.text);
        axis->setTickLabelFont(plotFont());
        axis->setLabelColor(colors_.text);
        axis->setLabelFont(plotFont());
        axis->grid()->setPen(QPen(colors_.grid, 1));
        axis->grid()->setZeroLinePen(Qt::NoPen);
    }
    plot_.xAxis2->setTicks(false);
    plot_.yAxis2->setTicks(false);
}

void GraphPlot::setRanges(const Graph& graph) {
    const auto set = [](QCPAxis* axis, const GraphAxis& range) {
        const bool usable = std::isfinite(range.Minimum) && std::isfinite(range.Maximum) &&
                            range.Maximum > range.Minimum;
        if (usable) axis->setRange(range.Minimum, range.Maximum);
    };
    set(plot_.xAxis, graph.xAxis());
    set(plot_.yAxis, graph.yAxis());
}

void GraphPlot::takeTrace(const Graph& graph) {
    const std::vector<double>& values = graph.values();
    QVector<double> keys;
    QVector<double> points;
    keys.reserve(static_cast<qsizetype>(values.size()));
    points.reserve(static_cast<qsizetype>(values.size()));
    bool gap = true;
    for (std::size_t i = 0; i < values.size(); ++i) {
        // Of a pair one value may be missing: the line goes on through the other. Two and more
        // make a gap, which is one point that is no number.
        const bool missing = std::isnan(values[i]);
        const bool alone = missing && i + 1 < values.size() && !std::isnan(values[i + 1]);
        if (missing && (alone || gap)) continue;
        gap = missing;
        keys << graph.firstX() + static_cast<double>(i) * graph.increment();
        points << values[i];
    }
    trace_->setData(keys, points, true);
}

void GraphPlot::update(const Graph& graph, const ViewAnnotations& view) {
    setRanges(graph);
    qSharedPointerCast<DivisionTicker>(plot_.xAxis->ticker())->setUnit(view.xUnit);
    // Without a trace the x axis has no meaning yet.
    plot_.xAxis->setTickLabels(view.ok || !graph.values().empty());
    plot_.yAxis->setTickLabels(graph.yAxis().ShowLabels);
    plot_.yAxis->setLabel(graph.yAxis().ShowLabels ? text(view.unit) : QString());
    if (!drawn_ || serial_ != graph.plotSerial()) {
        takeTrace(graph);
        serial_ = graph.plotSerial();
        drawn_ = true;
    }
    for (int i = 0; i < 2; ++i) {
        CursorItems& items = cursors_.at(static_cast<std::size_t>(i));
        const GraphCursor& cursor = graph.cursor(i + 1);
        items.visible = cursor.Visible;
        items.x = cursor.X;
        items.line->setVisible(cursor.Visible);
        items.point->setVisible(cursor.Visible);
        if (!cursor.Visible) continue;
        const QColor color = colorOf(cursor.color).darker(colors_.cursorDarkness);
        items.line->setPen(QPen(color, 1));
        items.line->point1->setCoords(cursor.X, 0);
        items.line->point2->setCoords(cursor.X, 1);
        items.point->setPen(QPen(color, 2));
        items.point->position->setCoords(cursor.X, cursor.Y);
    }
    const std::string& note = graph.Note;
    old_->setText(note.empty() ? "OLD TRACE" : text(note));
    old_->setVisible(graph.Old || !note.empty());
    incomplete_->setText(text(graph.Incomplete.get()));
    incomplete_->setVisible(!graph.Incomplete.get().empty());
    QColor ink = colors_.trace;
    if (graph.Old) ink = ink.darker(200);
    if (trace_->pen().color() != ink) trace_->setPen(QPen(ink, trace_->pen().widthF()));
    const GraphAnnotation& trigger = graph.trigger();
    trigger_->setVisible(trigger.Visible);
    triggerText_->setVisible(trigger.Visible);
    trigger_->point1->setCoords(plot_.xAxis->range().lower, trigger.Height);
    trigger_->point2->setCoords(plot_.xAxis->range().upper, trigger.Height);
    triggerText_->position->setCoords(plot_.xAxis->range().lower, trigger.Height);
    triggerText_->setText(text(trigger.Caption));
    top_[0]->setText(joined({text(view.refLevel), text(view.range)}));
    top_[1]->setText(joined({text(view.rbw), text(view.vbw)}));
    top_[2]->setText(joined({text(view.mode), text(view.detector)}));
    top_[3]->setText(text(view.sweepTime));
    bottom_[0]->setText(text(view.left));
    bottom_[1]->setText(text(view.center));
    bottom_[2]->setText(text(view.right));
    strike(view);
}

void GraphPlot::strike(const ViewAnnotations& view) {
    const auto ifUnsure = [](bool unsure, const std::string& part) {
        return unsure ? QStringList{text(part)} : QStringList{};
    };
    top_[0]->setStruck(ifUnsure(view.refLevelUnsure, view.refLevel) +
                       ifUnsure(view.rangeUnsure, view.range));
    top_[2]->setStruck(ifUnsure(view.detectorUnsure, view.detector));
    bottom_[0]->setStruck(ifUnsure(view.xUnsure, view.left));
    bottom_[1]->setStruck(ifUnsure(view.xUnsure, view.center));
    bottom_[2]->setStruck(ifUnsure(view.xUnsure, view.right));
    const auto strikeLabels = [](QCPAxis* axis, bool unsure) {
        QFont font = plotFont();
        font.setStrikeOut(unsure);
        axis->setTickLabelFont(font);
    };
    strikeLabels(plot_.xAxis, view.xUnsure);
    strikeLabels(plot_.yAxis, view.yUnsure);
}

void GraphPlot::clipToView() {
    const QCPRange x = plot_.xAxis->range();
    const QCPRange y = plot_.yAxis->range();
    QPolygonF line;
    for (const QCPGraphData& point : *trace_->data()) line.append({point.key, point.value});
    QVector<double> keys;
    QVector<double> values;
    for (const QPolygonF& part : clipPolyline(line, {x.lower, y.lower, x.size(), y.size()})) {
        for (const QPointF& point : part) {
            keys << point.x();
            values << point.y();
        }
        keys << part.back().x();
        values << qQNaN();  // the pen is lifted
    }
    trace_->setData(keys, values, true);
    drawn_ = false;
    for (const CursorItems& cursor : cursors_) {
        const QPointF at = cursor.point->position->coords();
        if (!x.contains(at.x()) || !y.contains(at.y())) cursor.point->setVisible(false);
    }
    if (!y.contains(triggerText_->position->coords().y())) triggerText_->setVisible(false);
}

int GraphPlot::cursorAt(const QPointF& pixel) const {
    for (int i = 1; i >= 0; --i) {
        const CursorItems& cursor = cursors_.at(static_cast<std::size_t>(i));
        if (!cursor.visible) continue;
        if (std::fabs(plot_.xAxis->coordToPixel(cursor.x) - pixel.x()) <= kCursorReach)
            return i + 1;
    }
    return 0;
}

QPointF GraphPlot::pointAt(double x) const {
    // The nearest point that is a number: a cursor never stands in a gap.
    QPointF nearest(x, 0);
    double distance = std::numeric_limits<double>::infinity();
    for (const QCPGraphData& point : *trace_->data()) {
        const double away = std::fabs(point.key - x);
        if (std::isnan(point.value) || away >= distance) continue;
        distance = away;
        nearest = {point.key, point.value};
    }
    return nearest;
}

}  // namespace zel
