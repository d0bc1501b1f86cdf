#include "desktop/style/PanelStyle.h"

#include <QComboBox>
#include <QFrame>
#include <QLabel>
#include <QLineEdit>
#include <QPainter>
#include <QPainterPath>
#include <QPushButton>
#include <QScrollArea>
#include <QStyleOptionFrame>
#include <QToolButton>
#include <algorithm>
#include <cmath>

#include "desktop/style/StyleTables.h"
#include "desktop/windows/ThemeIcons.h"

namespace zel {
namespace {

constexpr int kPanelRadius = 6;
constexpr int kPressedDarker = 115;  // percent, where a face has its own colour

bool has(const QStyleOption& option, QStyle::StateFlag flag) { return (option.state & flag) != 0; }

/// Rounded frames are the same but for their corners.
QPixmap cornersOf(const StyleFrame& frame, int side, qreal scale) {
    QPixmap picture(QSize(side, side) * scale);
    picture.setDevicePixelRatio(scale);
    picture.fill(Qt::transparent);
    QPainter painter(&picture);
    painter.setRenderHint(QPainter::Antialiasing);
    QPainterPath outer;
    outer.addRoundedRect(QRectF(0, 0, side, side), frame.radius, frame.radius);
    if (frame.width == 0) {
        painter.fillPath(outer, frame.ground);
        return picture;
    }
    const double half = frame.width / 2.0;
    QPainterPath middle;
    middle.addRoundedRect(QRectF(0, 0, side, side).adjusted(half, half, -half, -half),
                          frame.radius - half, frame.radius - half);
    painter.fillPath(middle, frame.ground);
    painter.strokePath(middle, QPen(frame.edge, frame.width));
    return picture;
}

}  // namespace

QIcon inkedIcon(const QIcon& icon, const QSize& size, qreal scale, const QColor& ink) {
    QPixmap picture = icon.pixmap(size, scale);
    if (picture.isNull()) return icon;
    QPainter painter(&picture);
    painter.setCompositionMode(QPainter::CompositionMode_SourceIn);
    painter.fillRect(QRect(QPoint(), size), ink);
    painter.end();
    return QIcon(picture);
}

PanelStyle::PanelStyle(const ThemeColors& colors)
    : QProxyStyle(QStringLiteral("Fusion")), colors_(colors) {}

void restyle(QWidget& widget) {
    // One that was not shown yet is asked for its properties when it is.
    if (!widget.testAttribute(Qt::WA_WState_Polished)) return;
    widget.style()->polish(&widget);
    widget.update();
}

void PanelStyle::polish(QWidget* widget) {
    QProxyStyle::polish(widget);
    const bool text = qobject_cast<QLabel*>(widget) != nullptr ||
                      qobject_cast<QLineEdit*>(widget) != nullptr ||
                      qobject_cast<QComboBox*>(widget) != nullptr || isHeading(widget);
    if (!text && qobject_cast<QPushButton*>(widget) == nullptr) {
        auto* area = qobject_cast<QScrollArea*>(widget);
        if (area == nullptr || !isCard(widget)) return;
        // The frame with its round corners shines through.
        area->viewport()->setAutoFillBackground(false);
        if (area->widget() != nullptr) area->widget()->setAutoFillBackground(false);
        return;
    }
    if (const int least = leastHeightOf(*widget); least > 0 && widget->minimumHeight() == 0)
        widget->setMinimumHeight(least);
    const QFont font = fontOf(*widget);
    if (const uint known = givenProperty(*widget, "styledFont").toUInt();
        font.resolveMask() != 0 || known != 0) {
        widget->setFont(font);
        widget->setProperty("styledFont", font.resolveMask());
    }
    const QColor own = givenProperty(*widget, "ink").value<QColor>();
    const Ink ink = inkOfText(*widget);
    const bool inked = own.isValid() || ink != nullptr;
    if (!inked && !givenProperty(*widget, "styledInk").toBool()) return;
    QPalette palette;
    if (inked) {
        const QColor shown = own.isValid() ? own : color(ink);
        for (const auto group : {QPalette::Active, QPalette::Inactive})
            for (const auto role : {QPalette::WindowText, QPalette::Text, QPalette::ButtonText})
                palette.setColor(group, role, shown);
    }
    widget->setPalette(palette);
    widget->setProperty("styledInk", inked);
}

void PanelStyle::drawFrame(QPainter& painter, const QRect& place, const StyleFrame& frame) const {
    const int reach = std::max(frame.radius, frame.width) + 1;
    const qreal scale = painter.device()->devicePixelRatio();
    const bool even =
        scale == std::floor(scale) && painter.worldTransform().type() <= QTransform::TxTranslate;
    const bool room = place.width() >= 2 * reach && place.height() >= 2 * reach;
    if (!even || !room || frame.line != Qt::SolidLine) {
        const double half = frame.width / 2.0;
        painter.save();
        painter.setRenderHint(QPainter::Antialiasing);
        QPen pen(frame.edge, frame.width, frame.line);
        painter.setPen(frame.width == 0 ? QPen(Qt::NoPen) : pen);
        painter.setBrush(frame.ground);
        painter.drawRoundedRect(QRectF(place).adjusted(half, half, -half, -half),
                                std::max(0.0, frame.radius - half),
                                std::max(0.0, frame.radius - half));
        painter.restore();
        return;
    }
    const int side = 2 * reach;
    const QString key = QString("%1 %2 %3 %4 %5")
                            .arg(frame.ground.rgba())
                            .arg(frame.edge.rgba())
                            .arg(frame.width)
                            .arg(frame.radius)
                            .arg(scale);
    auto found = corners_.find(key);
    if (found == corners_.end()) found = corners_.insert(key, cornersOf(frame, side, scale));
    const QPixmap& corners = found.value();
    const QRect inner = place.adjusted(reach, reach, -reach, -reach);
    const int right = inner.right() + 1;
    const int below = inner.bottom() + 1;
    const auto corner = [&](int x, int y, int fromX, int fromY) {
        painter.drawPixmap(QRect(x, y, reach, reach), corners,
                           QRect(QPoint(fromX, fromY) * scale, QSize(reach, reach) * scale));
    };
    corner(place.left(), place.top(), 0, 0);
    corner(right, place.top(), reach, 0);
    corner(place.left(), below, 0, reach);
    corner(right, below, reach, reach);
    const int width = frame.width;
    painter.fillRect(inner.left(), place.top() + width, inner.width(), place.height() - 2 * width,
                     frame.ground);
    painter.fillRect(place.left() + width, inner.top(), reach - width, inner.height(),
                     frame.ground);
    painter.fillRect(right, inner.top(), reach - width, inner.height(), frame.ground);
    if (width == 0) return;
    painter.fillRect(inner.left(), place.top(), inner.width(), width, frame.edge);
    painter.fillRect(inner.left(), place.bottom() + 1 - width, inner.width(), width, frame.edge);
    painter.fillRect(place.left(), inner.top(), width, inner.height(), frame.edge);
    painter.fillRect(place.right() + 1 - width, inner.top(), width, inner.height(), frame.edge);
}

void PanelStyle::drawKey(const QStyleOptionButton& option, QPainter& painter,
                         const QWidget* widget) const {
    const bool preset = (option.features & QStyleOptionButton::DefaultButton) != 0;
    const KeyFace& face = faceOfKey(widget, preset);
    StyleFrame frame;
    frame.radius = boxOfButton(widget).radius;
    frame.ground = color(face.ground);
    frame.edge = color(face.edge);
    if (!has(option, State_Enabled)) {
        frame.ground = color(&ThemeColors::window);
        frame.edge = color(preset ? &ThemeColors::accent : &ThemeColors::border);
    } else if (has(option, State_Sunken)) {
        const bool own = face.groundUnderPointer == nullptr && face.ground != &ThemeColors::yellow;
        frame.ground = own ? frame.ground.darker(kPressedDarker) : color(&ThemeColors::accent);
    } else if (has(option, State_MouseOver)) {
        if (face.groundUnderPointer != nullptr) frame.ground = color(face.groundUnderPointer);
        frame.edge = color(face.edgeUnderPointer);
    }
    if (has(option, State_HasFocus)) {
        const bool bound = widget != nullptr && givenProperty(*widget, "face").isValid();
        frame.width = kFocusEdge;
        frame.edge = color(bound || preset ? &ThemeColors::text : &ThemeColors::focus);
    }
    drawFrame(painter, option.rect, frame);
}

void PanelStyle::drawKeyLabel(const QStyleOptionButton& option, QPainter& painter,
                              const QWidget* widget) const {
    const bool preset = (option.features & QStyleOptionButton::DefaultButton) != 0;
    const KeyFace& face = faceOfKey(widget, preset);
    const bool enabled = has(option, State_Enabled);
    Ink ink = face.ink;
    if (has(option, State_Sunken) && face.groundUnderPointer != nullptr)
        ink = &ThemeColors::accentText;
    if (has(option, State_Sunken) && face.ground == &ThemeColors::yellow)
        ink = &ThemeColors::accentText;
    if (!enabled) ink = &ThemeColors::dim;
    QStyleOptionButton own = inked(option, color(ink));
    if (ink == &ThemeColors::accentText && !own.icon.isNull())
        own.icon =
            inkedIcon(own.icon, own.iconSize, painter.device()->devicePixelRatioF(), color(ink));
    painter.save();
    if (face.bold && !enabled) {
        QFont font = painter.font();
        font.setWeight(QFont::Normal);
        painter.setFont(font);
    }
    if (!isMarked(widget, "way")) {
        QProxyStyle::drawControl(CE_PushButtonLabel, &own, &painter, widget);
    } else {
        // A list of ways reads from the left.
        constexpr int kGap = 4;
        QRect text = own.rect;
        if (!own.icon.isNull()) {
            const QSize size = own.iconSize;
            const QRect place =
                alignedRect(own.direction, Qt::AlignLeft | Qt::AlignVCenter, size, own.rect);
            own.icon.paint(&painter, place, Qt::AlignCenter,
                           enabled ? QIcon::Normal : QIcon::Disabled);
            text.adjust(own.direction == Qt::LeftToRight ? size.width() + kGap : 0, 0,
                        own.direction == Qt::LeftToRight ? 0 : -size.width() - kGap, 0);
        }
        const Qt::Alignment side = visualAlignment(own.direction, Qt::AlignLeft);
        drawItemText(&painter, text,
                     static_cast<int>(side.toInt()) | Qt::AlignVCenter | Qt::TextShowMnemonic,
                     own.palette, enabled, own.text, QPalette::ButtonText);
    }
    painter.restore();
}

void PanelStyle::drawChoice(const QStyleOptionButton& option, QPainter& painter,
                            const QWidget* widget, bool exclusive) const {
    if (has(option, State_HasFocus))
        drawFrame(painter, option.rect,
                  {color(&ThemeColors::buttonHover), color(&ThemeColors::focus)});
    QStyleOptionButton part(option);
    part.rect = choicePart(option, true);
    drawIndicator(part, painter, exclusive);
    part.rect = choicePart(option, false);
    proxy()->drawControl(exclusive ? CE_RadioButtonLabel : CE_CheckBoxLabel, &part, &painter,
                         widget);
}

void PanelStyle::drawIndicator(const QStyleOption& option, QPainter& painter,
                               bool exclusive) const {
    const bool on = has(option, State_On);
    Ink edge = on ? &ThemeColors::text : &ThemeColors::dim;
    if (!has(option, State_Enabled)) edge = &ThemeColors::border;
    StyleFrame frame;
    frame.ground = color(on ? &ThemeColors::accent : &ThemeColors::base);
    frame.edge = color(edge);
    frame.radius = exclusive ? option.rect.width() / 2 : 3;
    drawFrame(painter, option.rect, frame);
    if (!on || exclusive) return;
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(
        QPen(color(&ThemeColors::accentText), 1.8, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    painter.translate(option.rect.topLeft() + QPoint(1, 1));
    const QPointF tick[] = {{2.5, 6.3}, {4.9, 8.7}, {9.5, 3.7}};
    painter.drawPolyline(tick, 3);
    painter.restore();
}

void PanelStyle::drawEntry(const QStyleOption& option, QPainter& painter,
                           const QWidget* widget) const {
    if (isInnerLine(widget) || isMarked(widget, "flat")) return;
    const bool locked = hasFace(widget, "locked");
    StyleFrame frame;
    frame.radius = boxOfEntry(widget).radius;
    frame.ground = locked ? QColor(Qt::transparent) : color(&ThemeColors::base);
    frame.edge = color(&ThemeColors::border);
    if (locked) frame.line = Qt::DashLine;
    if (!has(option, State_Enabled)) frame.ground = color(&ThemeColors::window);
    if (has(option, State_HasFocus)) {
        frame.width = kFocusEdge;
        frame.edge = color(&ThemeColors::focus);
    }
    if (isMarked(widget, "refused")) {
        frame.width = kFocusEdge;
        frame.edge = color(&ThemeColors::problem);
        frame.line = Qt::SolidLine;
    }
    if (isMarked(widget, "struck") && qobject_cast<const QLineEdit*>(widget) == nullptr)
        frame.edge = color(&ThemeColors::problem);
    drawFrame(painter, option.rect, frame);
}

void PanelStyle::drawMenuTitle(const QStyleOption& option, QPainter& painter,
                               const QWidget* widget) const {
    const auto* item = qstyleoption_cast<const QStyleOptionMenuItem*>(&option);
    const bool chosen = has(option, State_Selected) && has(option, State_Enabled);
    painter.fillRect(option.rect, color(chosen ? &ThemeColors::accent : &ThemeColors::window));
    if (item == nullptr) return;
    Ink ink = chosen ? &ThemeColors::accentText : &ThemeColors::text;
    if (!has(option, State_Enabled)) ink = &ThemeColors::dim;
    int alignment = Qt::AlignCenter | Qt::TextShowMnemonic | Qt::TextDontClip | Qt::TextSingleLine;
    if (styleHint(SH_UnderlineShortcut, &option, widget, nullptr) == 0)
        alignment |= Qt::TextHideMnemonic;
    painter.setPen(color(ink));
    painter.drawText(option.rect, alignment, item->text);
}

void PanelStyle::drawToolBar(const QStyleOption& option, QPainter& painter) const {
    painter.fillRect(option.rect, color(&ThemeColors::window));
    painter.fillRect(option.rect.left(), option.rect.bottom(), option.rect.width(), 1,
                     color(&ThemeColors::hairline));
}

void PanelStyle::drawPrimitive(PrimitiveElement element, const QStyleOption* option,
                               QPainter* painter, const QWidget* widget) const {
    switch (element) {
        case PE_PanelLineEdit:
            return drawEntry(*option, *painter, widget);
        case PE_FrameLineEdit:
        case PE_FrameStatusBarItem:
            return;
        case PE_PanelStatusBar:
            return painter->fillRect(option->rect, color(&ThemeColors::window));
        case PE_IndicatorCheckBox:
        case PE_IndicatorRadioButton:
            return drawIndicator(*option, *painter, element == PE_IndicatorRadioButton);
        case PE_FrameFocusRect:
            return drawFrame(*painter, option->rect, {Qt::transparent, color(&ThemeColors::focus)});
        case PE_PanelTipLabel:
            return drawFrame(*painter, option->rect,
                             {color(&ThemeColors::base), color(&ThemeColors::border)});
        case PE_PanelMenu:
        case PE_FrameMenu:
            return drawFrame(
                *painter, option->rect,
                {element == PE_PanelMenu ? color(&ThemeColors::panel) : QColor(Qt::transparent),
                 color(&ThemeColors::border)});
        case PE_Frame:
            // A list or a text shows that it has the focus, be it empty.
            if (!isTextArea(widget)) break;
            return drawFrame(
                *painter, option->rect,
                {Qt::transparent,
                 color(has(*option, State_HasFocus) ? &ThemeColors::focus : &ThemeColors::border)});
        case PE_FrameTabWidget:
            return drawFrame(*painter, option->rect,
                             {color(&ThemeColors::panel), color(&ThemeColors::hairline)});
        case PE_IndicatorToolBarSeparator:
            return;
        default:
            break;
    }
    QProxyStyle::drawPrimitive(element, option, painter, widget);
}

void PanelStyle::drawControl(ControlElement element, const QStyleOption* option, QPainter* painter,
                             const QWidget* widget) const {
    const auto* button = qstyleoption_cast<const QStyleOptionButton*>(option);
    switch (element) {
        case CE_PushButton:
            if (button == nullptr) break;
            drawKey(*button, *painter, widget);
            {
                QStyleOptionButton inside(*button);
                inside.rect = boxOfButton(widget).inside(option->rect);
                drawKeyLabel(inside, *painter, widget);
            }
            return;
        case CE_PushButtonBevel:
            if (button == nullptr) break;
            return drawKey(*button, *painter, widget);
        case CE_PushButtonLabel:
            if (button == nullptr) break;
            return drawKeyLabel(*button, *painter, widget);
        case CE_CheckBox:
        case CE_RadioButton:
            if (button == nullptr) break;
            return drawChoice(*button, *painter, widget, element == CE_RadioButton);
        case CE_ShapedFrame:
            if (!isCard(widget)) break;
            return drawFrame(
                *painter, option->rect,
                {color(&ThemeColors::panel),
                 color(widget->objectName() == QLatin1String("card") ? &ThemeColors::border
                                                                     : &ThemeColors::hairline),
                 1, kPanelRadius});
        case CE_ToolBar:
            return drawToolBar(*option, *painter);
        case CE_TabBarTab:
            return drawTab(*option, *painter, widget);
        case CE_MenuItem:
            if (qobject_cast<const QComboBox*>(widget) == nullptr) break;
            return drawListEntry(*option, *painter);
        case CE_MenuBarItem:
        case CE_MenuBarEmptyArea:
            return drawMenuTitle(*option, *painter, widget);
        default:
            break;
    }
    QProxyStyle::drawControl(element, option, painter, widget);
}

QIcon PanelStyle::standardIcon(StandardPixmap icon, const QStyleOption* option,
                               const QWidget* widget) const {
    // The toolkit's own comes from a file, for which it loads its readers of all kinds of pictures,
    // as soon as there is a menu bar.
    if (icon == SP_ToolBarHorizontalExtensionButton) return themeIcon("more");
    if (icon == SP_ToolBarVerticalExtensionButton) return themeIcon("moredown");
    return QProxyStyle::standardIcon(icon, option, widget);
}

}  // namespace zel
