#include "desktop/style/StyleIcons.h"

#include <QGuiApplication>
#include <QIconEngine>
#include <QPainter>
#include <QPalette>
#include <QPen>
#include <QPixmap>
#include <QPolygonF>

namespace zel {
namespace {

class MoreEntriesEngine : public QIconEngine {
  public:
    explicit MoreEntriesEngine(Qt::Orientation orientation) : orientation_(orientation) {}

    void paint(QPainter* painter, const QRect& rect, QIcon::Mode mode, QIcon::State) override {
        const auto group = mode == QIcon::Disabled ? QPalette::Disabled : QPalette::Active;
        const qreal unit = qMin(rect.width(), rect.height()) / 12.0;
        painter->save();
        painter->setRenderHint(QPainter::Antialiasing);
        painter->setPen(QPen(QGuiApplication::palette().color(group, QPalette::ButtonText),
                             1.5 * unit, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
        painter->translate(QRectF(rect).center());
        if (orientation_ == Qt::Vertical) painter->rotate(90);
        for (const qreal left : {-4.0, 1.0})
            painter->drawPolyline(QPolygonF{QPointF(left, -3) * unit, QPointF(left + 3, 0) * unit,
                                            QPointF(left, 3) * unit});
        painter->restore();
    }
    QPixmap pixmap(const QSize& size, QIcon::Mode mode, QIcon::State state) override {
        QPixmap picture(size);
        picture.fill(Qt::transparent);
        QPainter painter(&picture);
        paint(&painter, {QPoint(), size}, mode, state);
        return picture;
    }
    QIconEngine* clone() const override { return new MoreEntriesEngine(*this); }

  private:
    Qt::Orientation orientation_;
};

}  // namespace

QIcon moreEntriesIcon(Qt::Orientation orientation) {
    return QIcon(new MoreEntriesEngine(orientation));
}

}  // namespace zel
