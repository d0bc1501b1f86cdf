#include "desktop/graph/TraceOverlay.h"

#include <array>
#include <cstddef>

#include "desktop/graph/PolylineClip.h"

namespace zel {
namespace {

constexpr const char* kLayer = "host";
constexpr int kFontPoints = 9;
const QColor kText(0xd8, 0xe0, 0xe8);

QCPItemText* addText(QCustomPlot& plot, double x, double y, Qt::Alignment alignment) {
    auto* text = new QCPItemText(&plot);
    text->position->setType(QCPItemPosition::ptAxisRectRatio);
    text->position->setCoords(x, y);
    text->setPositionAlignment(alignment);
    text->setTextAlignment(Qt::AlignLeft);
    QFont font;
    font.setPointSize(kFontPoints);
    text->setFont(font);
    text->setVisible(false);
    return text;
}

}  // namespace

QColor hostTraceColor(std::size_t place) {
    static const std::array<QColor, 8> kColors = {
        QColor(0x7f, 0xb8, 0xe8), QColor(0x5a, 0x8f, 0xc8), QColor(0xa9, 0xd0, 0xf0),
        QColor(0x8f, 0xa8, 0xd8), QColor(0x6f, 0xa8, 0xb8), QColor(0x9c, 0xb4, 0xc8),
        QColor(0xb8, 0xc4, 0xe4), QColor(0xcf, 0xe4, 0xf4)};
    return kColors.at(place % kColors.size());
}

QColor limitColor() { return {0xff, 0x6b, 0x6b}; }

// Pale on a dark ground, dark on paper.
QColor TraceOverlay::ink(const QColor& color) const {
    constexpr int kDarker = 190;  // percent
    return paper_ ? color.darker(kDarker) : color;
}

TraceOverlay::TraceOverlay(QCustomPlot& plot, bool paper) : plot_(plot), paper_(paper) {}

void TraceOverlay::build() {
    plot_.addLayer(kLayer, plot_.layer("main"), QCustomPlot::limBelow);
    foot_ = addText(plot_, 0.01, 0.985, Qt::AlignLeft | Qt::AlignBottom);
    notice_ = addText(plot_, 0.5, 0.16, Qt::AlignHCenter | Qt::AlignTop);
    const QColor words = paper_ ? QColor(Qt::black) : kText;
    notice_->setColor(words);
    // The trace runs under these words.
    for (QCPItemText* text : {foot_, notice_}) {
        text->setBrush(paper_ ? QColor(Qt::white) : QColor(0x06, 0x09, 0x0d, 0xd8));
        text->setPadding(QMargins(4, 2, 4, 2));
    }
}

void TraceOverlay::show(const OverlayPicture& picture) {
    if (foot_ == nullptr) {
        if (picture.empty()) return;
        build();
    }
    while (curves_.size() > picture.curves.size()) {
        plot_.removeGraph(curves_.back());
        curves_.pop_back();
    }
    while (curves_.size() < picture.curves.size()) {
        curves_.push_back(plot_.addGraph());
        curves_.back()->setLayer(kLayer);
        curves_.back()->setAdaptiveSampling(false);
    }
    for (std::size_t i = 0; i < curves_.size(); ++i) {
        const OverlayCurve& curve = picture.curves[i];
        curves_[i]->setData(curve.x, curve.y, true);
        curves_[i]->setPen(QPen(ink(curve.color), 1, curve.dashed ? Qt::DashLine : Qt::SolidLine));
    }
    while (points_.size() > picture.markers.size()) {
        plot_.removeItem(points_.back());
        plot_.removeItem(labels_.back());
        points_.pop_back();
        labels_.pop_back();
    }
    while (points_.size() < picture.markers.size()) {
        auto* point = new QCPItemTracer(&plot_);
        point->setStyle(QCPItemTracer::tsSquare);
        point->setSize(6);
        point->setPen(QPen(ink(hostTraceColor(7)), 1));
        auto* label = addText(plot_, 0, 0, Qt::AlignHCenter | Qt::AlignBottom);
        label->position->setType(QCPItemPosition::ptPlotCoords);
        label->setColor(ink(hostTraceColor(7)));
        label->setClipToAxisRect(false);  // a marker may stand at the edge
        label->setPadding(QMargins(0, 0, 0, 5));
        points_.push_back(point);
        labels_.push_back(label);
    }
    for (std::size_t i = 0; i < points_.size(); ++i) {
        const OverlayMarker& marker = picture.markers[i];
        const bool seen =
            plot_.xAxis->range().contains(marker.x) && plot_.yAxis->range().contains(marker.y);
        points_[i]->position->setCoords(marker.x, marker.y);
        points_[i]->setVisible(seen);
        labels_[i]->position->setCoords(marker.x, marker.y);
        labels_[i]->setText("M" + QString::number(marker.number));
        labels_[i]->setVisible(seen);
    }
    foot_->setText(picture.foot);
    foot_->setColor(picture.failed ? ink(limitColor()) : paper_ ? QColor(Qt::black) : kText);
    foot_->setVisible(!picture.foot.isEmpty());
    notice_->setText(picture.notice);
    notice_->setVisible(!picture.notice.isEmpty());
}

void TraceOverlay::clipToView() {
    const QCPRange x = plot_.xAxis->range();
    const QCPRange y = plot_.yAxis->range();
    for (QCPGraph* curve : curves_)
        clipLine(*curve, linePoints(*curve), {x.lower, y.lower, x.size(), y.size()});
}

}  // namespace zel
