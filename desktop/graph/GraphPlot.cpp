#include "desktop/graph/GraphPlot.h"

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <limits>
#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "desktop/graph/AnnotationText.h"
#include "desktop/graph/BandGraph.h"
#include "desktop/graph/CursorMarks.h"
#include "desktop/graph/DivisionTicker.h"
#include "desktop/graph/GraphColors.h"
#include "desktop/graph/PolylineClip.h"
#include "platform/Graph.h"
#include "support/NumberText.h"
#include "trace/PointPairs.h"
#include "trace/ViewAnnotations.h"

namespace zel {
namespace {

/// Half of the last label of the x axis stands in it: one that does not fit is not drawn at all.
constexpr int kRightMargin = 42;
constexpr int kLeftMargin = 10;
constexpr double kNoStretch = 0.001;
constexpr std::size_t kPairedValues = 602;
constexpr double kBandShare = 0.35;  // of the line's ink in the band's

QString text(const std::string& utf8) { return QString::fromStdString(utf8); }

QString joined(const QStringList& parts) {
    QStringList kept;
    for (const QString& part : parts)
        if (!part.isEmpty()) kept << part;
    return kept.join("    ");
}

}  // namespace

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
    top->setMargins(QMargins(kLeftMargin, 8, kRightMargin, 0));
    top->setRowSpacing(1);
    top_ = {addText(*top, 0, 0, Qt::AlignLeft), addText(*top, 0, 1, Qt::AlignRight),
            addText(*top, 1, 0, Qt::AlignLeft), addText(*top, 1, 1, Qt::AlignRight)};
    auto* bottom = new QCPLayoutGrid;
    layout->addElement(2, 0, bottom);
    bottom->setMargins(QMargins(kLeftMargin, 0, kRightMargin, 6));
    bottom_ = {addText(*bottom, 0, 0, Qt::AlignLeft), addText(*bottom, 0, 1, Qt::AlignHCenter),
               addText(*bottom, 0, 2, Qt::AlignRight)};
    layout->setRowSpacing(2);
    layout->setRowStretchFactor(0, kNoStretch);
    layout->setRowStretchFactor(2, kNoStretch);

    styleAxes();
    channel_ = new QCPItemRect(&plot_);
    channel_->setLayer("background");
    channel_->setPen(QPen(colors_.frame, 1, Qt::DashLine));
    channel_->setBrush(colors_.shade);
    channel_->topLeft->setTypeX(QCPItemPosition::ptPlotCoords);
    channel_->topLeft->setTypeY(QCPItemPosition::ptAxisRectRatio);
    channel_->bottomRight->setTypeX(QCPItemPosition::ptPlotCoords);
    channel_->bottomRight->setTypeY(QCPItemPosition::ptAxisRectRatio);
    channel_->setVisible(false);
    low_ = plot_.addGraph();
    low_->setAdaptiveSampling(false);
    trace_ = new BandGraph(plot_.xAxis, plot_.yAxis);
    trace_->setPen(QPen(colors_.trace, 1));
    cursors_ = std::make_unique<CursorMarks>(plot_, colors_);  // over the trace
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
    source_ = new AnnotationText(&plot_, plotFont());
    source_->setTextColor(colors_.file);
    source_->setTextFlags(static_cast<int>((Qt::AlignLeft | Qt::AlignVCenter).toInt()));
    // In line with the texts above, whose margins add up.
    source_->setMargins(QMargins(kLeftMargin + 2, 1, kRightMargin, 1));
    source_->setVisible(false);
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
    const auto xOf = [&](std::size_t i) {
        return graph.firstX() + static_cast<double>(i) * graph.increment();
    };
    paired_ = values.size() == kPairedValues;
    resolution_ = std::fabs(graph.increment()) * (paired_ ? 2 : 1);
    points_.clear();
    points_.reserve(static_cast<qsizetype>(values.size()));
    bool gap = true;
    for (std::size_t i = 0; i < values.size(); ++i) {
        // Of a pair one value may be missing: the line goes on through the other. Two and more
        // make a gap, which is one point that is no number.
        const bool missing = std::isnan(values[i]);
        const bool alone = missing && i + 1 < values.size() && !std::isnan(values[i + 1]);
        if (missing && (alone || gap)) continue;
        gap = missing;
        points_ << QPointF(xOf(i), values[i]);
    }
    const bool band = paired_;
    low_->setVisible(band);
    trace_->setChannelFillGraph(band ? low_ : nullptr);
    QVector<double> keys;
    QVector<double> highs;
    QVector<double> lows;
    if (!band) {
        for (const QPointF& point : points_) {
            keys << point.x();
            highs << point.y();
        }
        low_->data()->clear();
        return trace_->setData(keys, highs, true);
    }
    for (std::size_t point = 0; 2 * point + 1 < values.size(); ++point) {
        const PointLevels levels = levelsOfPoint(values, point);
        keys << xOf(2 * point);
        lows << levels.low;
        highs << levels.high;
    }
    trace_->setData(keys, highs, true);
    low_->setData(keys, lows, true);
}

QColor GraphPlot::bandInk(const QColor& line) const {
    const auto mix = [](int ink, int ground) {
        return static_cast<int>(ink * kBandShare + ground * (1 - kBandShare));
    };
    const QColor& ground = colors_.plotArea;
    return {mix(line.red(), ground.red()), mix(line.green(), ground.green()),
            mix(line.blue(), ground.blue())};
}

void GraphPlot::setSource(const QString& name) {
    sourceName_ = name;
    const bool shown = !name.isEmpty();
    if (shown == source_->visible()) return fitSource();
    source_->setVisible(shown);
    QCPLayoutGrid* layout = plot_.plotLayout();
    if (shown) {
        layout->insertRow(1);
        layout->addElement(1, 0, source_);
        layout->setRowStretchFactor(1, kNoStretch);
    } else {
        layout->take(source_);
        layout->simplify();
    }
    fitSource();
}

/// A long name keeps its beginning and its date.
void GraphPlot::fitSource() {
    if (!source_->visible()) return;
    const int room = plot_.width() - kLeftMargin - kRightMargin;
    source_->setText(QFontMetrics(source_->font()).elidedText(sourceName_, Qt::ElideMiddle, room));
}

void GraphPlot::setChannel(double left, double right) {
    channel_->setVisible(right > left);
    channel_->topLeft->setCoords(left, 0);
    channel_->bottomRight->setCoords(right, 1);
}

std::pair<double, double> GraphPlot::levelsAt(double x) const {
    const double nothing = std::numeric_limits<double>::quiet_NaN();
    std::pair<double, double> levels(nothing, nothing);
    const bool band = low_->visible() && paired_;
    const auto at = trace_->data()->findBegin(x, true);
    double distance = resolution_ * (band ? 0.75 : 0.5001);
    qsizetype found = -1;
    const auto begin = trace_->data()->constBegin();
    for (auto it = at; it != trace_->data()->constEnd() && it - at < 3; ++it) {
        const double away = std::fabs(it->key - x);
        if (std::isnan(it->value) || away > distance) continue;
        distance = away;
        found = it - begin;
    }
    if (found < 0) return levels;
    levels.second = (begin + found)->value;
    levels.first = band && found < low_->dataCount() ? low_->dataMainValue(static_cast<int>(found))
                                                     : levels.second;
    return levels;
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
    view_ = view;
    fitSource();
    cursors_->place(graph, {markerTexts_, resolution_, view.xUnit, view.unit,
                            [this](double x) { return levelsAt(x).second; }});
    const std::string& note = graph.Note;
    old_->setText(note.empty() ? "OLD TRACE" : text(note));
    old_->setVisible(graph.Old || !note.empty());
    incomplete_->setText(text(graph.Incomplete.get()));
    incomplete_->setVisible(!graph.Incomplete.get().empty());
    QColor ink = colors_.trace;
    if (graph.Old) ink = ink.darker(200);
    if (trace_->pen().color() != ink || trace_->pen().widthF() != width_) {
        trace_->setPen(QPen(ink, width_));
    }
    low_->setPen(QPen(bandInk(ink), width_));
    trace_->setBrush(low_->visible() ? QBrush(bandInk(ink)) : QBrush(Qt::NoBrush));
    const GraphAnnotation& trigger = graph.trigger();
    trigger_->setVisible(trigger.Visible);
    triggerText_->setVisible(trigger.Visible);
    trigger_->point1->setCoords(plot_.xAxis->range().lower, trigger.Height);
    trigger_->point2->setCoords(plot_.xAxis->range().upper, trigger.Height);
    triggerText_->position->setCoords(plot_.xAxis->range().lower, trigger.Height);
    triggerText_->setText(text(trigger.Caption));
    // The scale as the axis is drawn, be it by hand or by a zoom.
    QString range = text(view.range);
    const GraphAxis& y = graph.yAxis();
    if (range.endsWith("dB/DIV"))
        range = text(generalNumber(divisionOf(y.Minimum, y.Maximum))) + "dB/DIV";
    top_[0]->setText(joined({text(view.refLevel), range}));
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
                       (view.rangeUnsure ? top_[0]->text().split("    ").mid(1) : QStringList()));
    top_[1]->setStruck(ifUnsure(view.rbwUnsure, view.rbw) + ifUnsure(view.vbwUnsure, view.vbw));
    top_[2]->setStruck(ifUnsure(view.detectorUnsure, view.detector));
    top_[3]->setStruck(ifUnsure(view.sweepTimeUnsure, view.sweepTime));
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

/// The fill of the band, by two lines that no pen draws and that stay in the view.
void GraphPlot::fillWithin(const QRectF& view) {
    const auto edge = [&](const QCPGraph& line) {
        QVector<double> keys;
        QVector<double> values;
        for (const QPointF& point : linePoints(line)) {
            if (point.x() < view.left() || point.x() > view.right()) continue;
            keys << point.x();
            values << std::clamp(point.y(), view.top(), view.bottom());
        }
        QCPGraph* added = plot_.addGraph(plot_.xAxis, plot_.yAxis);
        added->setPen(Qt::NoPen);
        added->setAdaptiveSampling(false);
        added->setData(keys, values, true);
        return added;
    };
    QCPGraph* high = edge(*trace_);
    high->setChannelFillGraph(edge(*low_));
    high->setBrush(trace_->brush());
    trace_->setBrush(Qt::NoBrush);
    trace_->setChannelFillGraph(nullptr);
}

void GraphPlot::clipToView() {
    const QCPRange x = plot_.xAxis->range();
    const QCPRange y = plot_.yAxis->range();
    const QRectF view(x.lower, y.lower, x.size(), y.size());
    if (low_->visible()) {
        fillWithin(view);
        clipLine(*low_, linePoints(*low_), view);
        clipLine(*trace_, linePoints(*trace_), view);
    } else {
        clipLine(*trace_, QPolygonF(points_), view);
    }
    drawn_ = false;
    cursors_->clipToView();
    if (!y.contains(triggerText_->position->coords().y())) triggerText_->setVisible(false);
}

QPointF GraphPlot::pointAt(double x) const {
    // The nearest point that is a number: a cursor never stands in a gap.
    QPointF nearest(x, 0);
    double distance = std::numeric_limits<double>::infinity();
    for (const QPointF& point : points_) {
        const double away = std::fabs(point.x() - x);
        if (std::isnan(point.y()) || away >= distance) continue;
        distance = away;
        nearest = point;
    }
    return nearest;
}

}  // namespace zel
