#include "desktop/windows/PowerDisplay.h"

#include <QCoreApplication>
#include <QPainter>
#include <QPainterPath>
#include <algorithm>
#include <cmath>
#include <cstddef>
#include <optional>
#include <string>

#include "desktop/graph/AxisText.h"
#include "desktop/graph/GraphColors.h"
#include "support/NumberText.h"

namespace zel {
namespace {

constexpr std::size_t kMostReadings = 300;
constexpr std::size_t kSpans[] = {10, 20, 50, 100, 200, kMostReadings};
constexpr std::size_t kDottedSpan = 50;  // single readings can be seen
constexpr int kSpanParts = 5;
constexpr double kLowest = -80;  // dBm, ends of the bar and of the history
constexpr double kHighest = 30;
constexpr int kScaleStep = 10;
constexpr double kFinestStep = 0.05;  // dB between two lines of the history
constexpr double kHistoryLines = 5;

/// The least of 1, 2, 5 and their decades that is no smaller; not below what a reading resolves.
double roundStep(double least) {
    double step = kFinestStep;
    // 0.05, 0.1, 0.2, 0.5, ...
    for (int i = 0; step < least; ++i) step *= i % 3 == 2 ? 2.5 : 2;
    return step;
}

double shareOf(double level) {
    return (std::clamp(level, kLowest, kHighest) - kLowest) / (kHighest - kLowest);
}

}  // namespace

PowerDisplay::PowerDisplay(QWidget* parent) : QWidget(parent) {
    setAccessibleName(QObject::tr("Power"));
    hide();
}

void PowerDisplay::clear() {
    history_.clear();
    setAccessibleDescription(QString());
    update();
}

void PowerDisplay::take(const std::string& answer) {
    const std::optional<double> level = parseNumber(answer);
    if (!level) return;
    history_.push_back(*level);
    if (history_.size() > kMostReadings) history_.pop_front();
    setAccessibleDescription(QString::fromStdString(levelText(history_.back(), "dBm")));
    update();
}

std::size_t PowerDisplay::span() const {
    return *std::find_if(std::begin(kSpans), std::end(kSpans) - 1,
                         [this](std::size_t span) { return history_.size() <= span; });
}

void PowerDisplay::drawBar(QPainter& painter, const QRectF& place) const {
    const GraphColors colors = darkGraph();
    painter.setPen(QPen(colors.grid, 1));
    painter.setBrush(colors.plotArea);
    painter.drawRoundedRect(place, 4, 4);
    if (!history_.empty()) {
        QRectF filled = place.adjusted(1, 1, -1, -1);
        filled.setWidth(filled.width() * shareOf(history_.back()));
        painter.setPen(Qt::NoPen);
        painter.setBrush(colors.trace);
        painter.drawRoundedRect(filled, 3, 3);
    }
    painter.setPen(colors.text);
    for (int level = static_cast<int>(kLowest); level <= kHighest; level += kScaleStep) {
        const double x = place.left() + place.width() * shareOf(level);
        painter.drawLine(QPointF(x, place.bottom() + 2), QPointF(x, place.bottom() + 6));
        painter.drawText(QRectF(x - 30, place.bottom() + 7, 60, 18), Qt::AlignHCenter,
                         QString::number(level));
    }
}

void PowerDisplay::drawHistory(QPainter& painter, const QRectF& place) const {
    const GraphColors colors = darkGraph();
    painter.setPen(QPen(colors.grid, 1));
    painter.setBrush(colors.plotArea);
    painter.drawRect(place);
    if (history_.size() < 2) {
        painter.setPen(colors.text);
        painter.drawText(place, Qt::AlignCenter,
                         QObject::tr("Single reads the power once, Continuous goes on"));
        return;
    }
    const auto [low, high] = std::minmax_element(history_.begin(), history_.end());
    const double step = roundStep((*high - *low) / kHistoryLines);
    const double bottom = (std::floor(*low / step) - 1) * step;
    const double top = (std::ceil(*high / step) + 1) * step;
    const auto yOf = [&](double level) {
        return place.bottom() - (level - bottom) / (top - bottom) * place.height();
    };
    const int lines = static_cast<int>(std::lround((top - bottom) / step));
    for (int i = 0; i <= lines; ++i) {
        const double level = bottom + i * step;
        const double y = yOf(level);
        painter.setPen(QPen(colors.grid, 1));
        painter.drawLine(QPointF(place.left(), y), QPointF(place.right(), y));
        painter.setPen(colors.text);
        painter.drawText(QRectF(0, y - 9, place.left() - 6, 18), Qt::AlignRight | Qt::AlignVCenter,
                         QString::fromStdString(generalNumber(roundHalfEven(level, 3))));
    }
    const auto xOf = [&](double age) {
        return place.right() - age / static_cast<double>(span()) * place.width();
    };
    for (int i = 0; i <= kSpanParts; ++i) {
        const int age = static_cast<int>(span()) / kSpanParts * i;
        const double x = xOf(age);
        painter.setPen(QPen(colors.grid, 1));
        painter.drawLine(QPointF(x, place.top()), QPointF(x, place.bottom()));
        painter.setPen(colors.text);
        const QRectF below(x - 60, place.bottom() + 4, 120, 18);
        if (i < kSpanParts) {
            painter.drawText(below, Qt::AlignHCenter, QString::number(-age));
        } else {
            painter.drawText(below.translated(60, 0), Qt::AlignLeft,
                             QObject::tr("%1 readings").arg(-age));
        }
    }
    QPolygonF line;
    for (std::size_t i = 0; i < history_.size(); ++i)
        line << QPointF(xOf(static_cast<double>(history_.size() - 1 - i)), yOf(history_[i]));
    painter.setPen(QPen(colors.trace, 1.2));
    painter.setBrush(Qt::NoBrush);
    painter.drawPolyline(line);
    if (span() <= kDottedSpan) {
        painter.setPen(Qt::NoPen);
        painter.setBrush(colors.trace);
        for (const QPointF& reading : line) painter.drawEllipse(reading, 2, 2);
    }
    painter.setPen(colors.text);
    const QRectF texts(place.left(), place.top() - 22, place.width(), 18);
    painter.drawText(texts, Qt::AlignLeft | Qt::AlignVCenter,
                     QObject::tr("The last %1 readings").arg(history_.size()));
    painter.drawText(texts, Qt::AlignRight | Qt::AlignVCenter,
                     QObject::tr("Lowest %1, highest %2")
                         .arg(QString::fromStdString(levelText(*low, "dBm")),
                              QString::fromStdString(levelText(*high, "dBm"))));
}

void PowerDisplay::paintEvent(QPaintEvent*) {
    const GraphColors colors = darkGraph();
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.fillRect(rect(), colors.background);
    const QRectF area = QRectF(rect()).adjusted(56, 24, -40, -32);
    QFont large = font();
    large.setPixelSize(std::clamp(height() / 6, 36, 96));
    large.setBold(true);
    painter.setFont(large);
    painter.setPen(colors.trace);
    const QString text = history_.empty()
                             ? QString::fromUtf8("– dBm")
                             : QString::fromStdString(levelText(history_.back(), "dBm"));
    const QRectF digits(area.left(), area.top(), area.width(), large.pixelSize() * 1.3);
    painter.drawText(digits, Qt::AlignCenter, text);
    painter.setFont(font());
    const QRectF bar(area.left(), digits.bottom() + 16, area.width(), 26);
    drawBar(painter, bar);
    const QRectF history(area.left(), bar.bottom() + 58, area.width(),
                         area.bottom() - bar.bottom() - 58);
    if (history.height() > 40) drawHistory(painter, history);
}

}  // namespace zel
