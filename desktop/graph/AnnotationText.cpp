#include "desktop/graph/AnnotationText.h"

namespace zel {

void AnnotationText::draw(QCPPainter* painter) {
    QCPTextElement::draw(painter);
    // A line of its own and no property of the font: not every picture format keeps that.
    const QFontMetricsF metrics(font(), painter->device());
    const QRectF area = mTextBoundingRect;
    const double y = area.top() + metrics.ascent() - metrics.strikeOutPos();
    painter->setPen(QPen(textColor(), 1));
    for (const QString& part : struck_) {
        const auto at = text().indexOf(part);
        if (at < 0 || part.isEmpty()) continue;
        const double left = area.left() + metrics.horizontalAdvance(text().left(at));
        painter->drawLine(QLineF(left, y, left + metrics.horizontalAdvance(part), y));
    }
}

}  // namespace zel
