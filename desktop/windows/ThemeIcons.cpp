#include "desktop/windows/ThemeIcons.h"

#include <QGuiApplication>
#include <QIconEngine>
#include <QPainter>
#include <QPalette>
#include <QPixmap>
#include <utility>

#include "desktop/windows/KeyPictures.h"

namespace zel {
namespace {

class InkEngine : public QIconEngine {
  public:
    InkEngine(QString name, QColor ink) : name_(std::move(name)), ink_(std::move(ink)) {}

    void paint(QPainter* painter, const QRect& rect, QIcon::Mode mode, QIcon::State) override {
        const bool disabled = mode == QIcon::Disabled;
        const QColor own = QGuiApplication::palette().color(
            disabled ? QPalette::Disabled : QPalette::Active, QPalette::ButtonText);
        painter->save();
        painter->setRenderHint(QPainter::Antialiasing);
        drawKeyPicture(*painter, name_, rect, ink_.isValid() ? ink_ : own);
        painter->restore();
    }
    QPixmap pixmap(const QSize& size, QIcon::Mode mode, QIcon::State state) override {
        QPixmap picture(size);
        picture.fill(Qt::transparent);
        QPainter painter(&picture);
        paint(&painter, {QPoint(), size}, mode, state);
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
    QString name_;
    QColor ink_;
};

}  // namespace

QIcon themeIcon(const QString& name, const QColor& ink) { return QIcon(new InkEngine(name, ink)); }

QIcon applicationIcon() { return QIcon(":/pictures/application.svg"); }

}  // namespace zel
