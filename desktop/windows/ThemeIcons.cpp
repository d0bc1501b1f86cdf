#include "desktop/windows/ThemeIcons.h"

#include <QGuiApplication>
#include <QIconEngine>
#include <QPainter>
#include <QPalette>
#include <QPixmap>
#include <QPixmapCache>
#include <utility>

#include "desktop/windows/KeyPictures.h"

namespace zel {
namespace {

class InkEngine : public QIconEngine {
  public:
    InkEngine(QString name, QColor ink) : name_(std::move(name)), ink_(std::move(ink)) {}

    void paint(QPainter* painter, const QRect& rect, QIcon::Mode mode, QIcon::State) override {
        painter->save();
        painter->setRenderHint(QPainter::Antialiasing);
        drawKeyPicture(*painter, name_, rect, inkOf(mode));
        painter->restore();
    }
    QPixmap pixmap(const QSize& size, QIcon::Mode mode, QIcon::State state) override {
        // Drawing takes long, and a key is drawn each time that the pointer crosses it.
        const QString key = QString("zel %1 %2 %3x%4")
                                .arg(name_, inkOf(mode).name(QColor::HexArgb))
                                .arg(size.width())
                                .arg(size.height());
        QPixmap picture;
        if (QPixmapCache::find(key, &picture)) return picture;
        picture = QPixmap(size);
        picture.fill(Qt::transparent);
        QPainter painter(&picture);
        paint(&painter, {QPoint(), size}, mode, state);
        painter.end();
        QPixmapCache::insert(key, picture);
        return picture;
    }
    QPixmap scaledPixmap(const QSize& size, QIcon::Mode mode, QIcon::State state,
                         qreal scale) override {
        QPixmap picture = pixmap(size, mode, state);
        picture.setDevicePixelRatio(scale);
        return picture;
    }
    QIconEngine* clone() const override { return new InkEngine(*this); }

  private:
    QColor inkOf(QIcon::Mode mode) const {
        if (ink_.isValid()) return ink_;
        return QGuiApplication::palette().color(
            mode == QIcon::Disabled ? QPalette::Disabled : QPalette::Active, QPalette::ButtonText);
    }

    QString name_;
    QColor ink_;
};

}  // namespace

QIcon themeIcon(const QString& name, const QColor& ink) { return QIcon(new InkEngine(name, ink)); }

QIcon applicationIcon() { return QIcon(":/pictures/application.svg"); }

}  // namespace zel
