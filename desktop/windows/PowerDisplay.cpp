#include "desktop/windows/PowerDisplay.h"

#include <QCoreApplication>
#include <QPainter>
#include <QPainterPath>
#include <algorithm>

#include "desktop/graph/AxisText.h"
#include "desktop/graph/GraphPlot.h"
#include "support/NumberText.h"

namespace zel {
namespace {

constexpr std::size_t kMostReadings = 300;
constexpr double kLowest = -80;  // dBm, ends of the bar and of the history
constexpr double kHighest = 30;
constexpr int kScaleStep = 10;

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
    const double bottom = *low - 1;
    const double top = *high + 1;
    const auto yOf = [&](double level) {
        return place.bottom() - (level - bottom) / (top - bottom) * place.height();
    };
    QPolygonF line;
    for (std::size_t i = 0; i < history_.size(); ++i) {
        const double age = static_cast<double>(history_.size() - 1 - i);
        line << QPointF(place.right() - age / (kMostReadings - 1) * place.width(),
                        yOf(history_[i]));
    }
    painter.setPen(QPen(colors.trace, 1.2));
    painter.drawPolyline(line);
    painter.setPen(colors.text);
    const QRectF texts = place.adjusted(6, 3, -6, -3);
    painter.drawText(
        texts, Qt::AlignLeft | Qt::AlignTop,
        QObject::tr("Highest %1").arg(QString::fromStdString(levelText(*high, "dBm"))));
    painter.drawText(texts, Qt::AlignLeft | Qt::AlignBottom,
                     QObject::tr("Lowest %1 of the last %2 readings")
                         .arg(QString::fromStdString(levelText(*low, "dBm")))
                         .arg(history_.size()));
}

void PowerDisplay::paintEvent(QPaintEvent*) {
    const GraphColors colors = darkGraph();
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.fillRect(rect(), colors.background);
    const QRectF area = QRectF(rect()).adjusted(40, 24, -40, -24);
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
    const QRectF history(area.left(), bar.bottom() + 40, area.width(),
                         area.bottom() - bar.bottom() - 40);
    if (history.height() > 40) drawHistory(painter, history);
}

}  // namespace zel
