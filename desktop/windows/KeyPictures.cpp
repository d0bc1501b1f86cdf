#include "desktop/windows/KeyPictures.h"

#include <QDynamicPropertyChangeEvent>
#include <QFile>
#include <QPainter>
#include <QStyleOptionButton>
#include <QStylePainter>
#include <QSvgRenderer>
#include <algorithm>
#include <map>
#include <memory>

namespace zel {
namespace {

constexpr int kLargestSymbol = 48;
constexpr int kSmallestSymbol = 12;
constexpr int kPadding = 4;

/// "freq" of "freq_y".
QString symbolOf(const QString& picture) { return picture.section('_', 0, 0); }

QString fileOf(const QString& picture) { return ":/pictures/" + symbolOf(picture) + ".svg"; }

/// The renderer of a symbol in an ink. Symbols and inks are few, so each is read once.
QSvgRenderer* renderer(const QString& picture, const QColor& ink) {
    static std::map<QString, std::unique_ptr<QSvgRenderer>> known;
    const QString key = symbolOf(picture) + ink.name();
    auto found = known.find(key);
    if (found == known.end()) {
        QFile file(fileOf(picture));
        if (!file.open(QIODevice::ReadOnly)) return nullptr;
        const QByteArray drawing = file.readAll().replace("currentColor", ink.name().toLatin1());
        found = known.emplace(key, std::make_unique<QSvgRenderer>(drawing)).first;
    }
    return found->second.get();
}

}  // namespace

bool hasKeyPicture(const QString& picture) {
    return !picture.isEmpty() && QFile::exists(fileOf(picture));
}

void drawKeyPicture(QPainter& painter, const QString& picture, const QRectF& square,
                    const QColor& ink) {
    QSvgRenderer* symbol = renderer(picture, ink);
    if (symbol != nullptr) symbol->render(&painter, square);
}

PictureKey::PictureKey(QWidget* parent) : QPushButton(parent) {}

QSize PictureKey::sizeHint() const { return {64, 58}; }

QSize PictureKey::minimumSizeHint() const {
    return {fontMetrics().horizontalAdvance("MARKER") + 2 * kPadding,
            fontMetrics().height() + kSmallestSymbol + kPadding};
}

bool PictureKey::event(QEvent* event) {
    if (event->type() == QEvent::DynamicPropertyChange) update();
    return QPushButton::event(event);
}

void PictureKey::paintEvent(QPaintEvent* event) {
    const QString picture = property("picture").toString();
    const QRect inside = rect().adjusted(kPadding, kPadding - 1, -kPadding, -kPadding + 1);
    const int line = fontMetrics().height();
    const int side = std::min({inside.height() - line - std::max(0, (inside.height() - 40) / 6),
                               inside.width() * 4 / 5, kLargestSymbol});
    if (side < kSmallestSymbol || !hasKeyPicture(picture)) return QPushButton::paintEvent(event);
    QStylePainter painter(this);
    QStyleOptionButton option;
    initStyleOption(&option);
    option.text.clear();
    painter.drawControl(QStyle::CE_PushButton, option);
    const QPalette::ColorGroup group = isEnabled() ? QPalette::Active : QPalette::Disabled;
    const QColor ink =
        palette().color(group, isDown() ? QPalette::HighlightedText : QPalette::ButtonText);
    const int top = inside.top() + (inside.height() - line - side) / 2;
    const QRectF square(inside.center().x() - side / 2.0 + 0.5, top, side, side);
    painter.setRenderHint(QPainter::Antialiasing);
    drawKeyPicture(painter, picture, square, ink);
    painter.setPen(ink);
    painter.drawText(
        QRect(inside.left() - kPadding, top + side, inside.width() + 2 * kPadding, line),
        Qt::AlignCenter, text().replace("&&", "&"));
}

}  // namespace zel
