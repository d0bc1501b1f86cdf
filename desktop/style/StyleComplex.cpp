// Lists, keys of toolbars and scroll bars: controls of more than one part.

#include <QComboBox>
#include <QPainter>
#include <QStyleOptionComboBox>
#include <QStyleOptionSlider>
#include <QStyleOptionToolButton>
#include <algorithm>

#include "desktop/style/PanelStyle.h"
#include "desktop/style/StyleTables.h"

namespace zel {
namespace {

constexpr int kMenuKey = 16;  // of the arrow beside a key that opens a menu
constexpr int kListEdge = 1;
constexpr int kEntryGap = 7;
constexpr QSize kListArrow(8, 5);
constexpr int kLeastHandle = 24;
constexpr int kHandleRadius = 4;

void drawArrow(QPainter& painter, const QRect& place, const QColor& ink) {
    const QRectF box(place.left() + (place.width() - kListArrow.width()) / 2,
                     place.top() + (place.height() - kListArrow.height()) / 2, kListArrow.width(),
                     kListArrow.height());
    const QPointF corners[] = {box.topLeft(), box.topRight(), {box.center().x(), box.bottom()}};
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    painter.setBrush(ink);
    painter.drawPolygon(corners, 3);
    painter.restore();
}

}  // namespace

void PanelStyle::drawList(const QStyleOptionComplex& option, QPainter& painter,
                          const QWidget* widget) const {
    drawEntry(option, painter, widget);
    if (hasFace(widget, "locked")) return;
    const bool enabled = (option.state & State_Enabled) != 0;
    drawArrow(painter, listPart(option.rect, option.direction, SC_ComboBoxArrow),
              color(enabled ? &ThemeColors::caption : &ThemeColors::dim));
}

/// The toolkit draws the entries of an open list as those of a menu.
void PanelStyle::drawListEntry(const QStyleOption& option, QPainter& painter) const {
    const auto* entry = qstyleoption_cast<const QStyleOptionMenuItem*>(&option);
    if (entry == nullptr) return;
    const bool chosen = (option.state & State_Selected) != 0;
    painter.fillRect(option.rect, color(chosen ? &ThemeColors::accent : &ThemeColors::base));
    painter.save();
    painter.setFont(entry->font);
    painter.setPen(color(chosen ? &ThemeColors::accentText : &ThemeColors::text));
    painter.drawText(option.rect.adjusted(kEntryGap, 0, -kEntryGap, 0),
                     static_cast<int>(visualAlignment(option.direction, Qt::AlignLeft)) |
                         Qt::AlignVCenter | Qt::TextSingleLine,
                     entry->text);
    painter.restore();
}

void PanelStyle::drawTab(const QStyleOption& option, QPainter& painter,
                         const QWidget* widget) const {
    const bool chosen = (option.state & State_Selected) != 0;
    const bool enabled = (option.state & State_Enabled) != 0;
    if (chosen) {
        drawFrame(painter, option.rect,
                  {color(&ThemeColors::panel), color(&ThemeColors::hairline)});
        painter.fillRect(option.rect.left(), option.rect.bottom() - 1, option.rect.width(), 2,
                         color(&ThemeColors::accent));
    }
    if ((option.state & State_HasFocus) != 0)
        drawFrame(painter, option.rect, {Qt::transparent, color(&ThemeColors::focus)});
    const auto* tab = qstyleoption_cast<const QStyleOptionTab*>(&option);
    if (tab == nullptr) return;
    QStyleOptionTab label(*tab);
    Ink ink =
        chosen || (option.state & State_MouseOver) ? &ThemeColors::text : &ThemeColors::caption;
    if (!enabled) ink = &ThemeColors::dim;
    label.palette.setColor(QPalette::WindowText, color(ink));
    label.state &= ~State_HasFocus;
    proxy()->drawControl(CE_TabBarTabLabel, &label, &painter, widget);
}

void PanelStyle::drawTool(const QStyleOptionComplex& option, QPainter& painter,
                          const QWidget* widget) const {
    const auto* tool = qstyleoption_cast<const QStyleOptionToolButton*>(&option);
    if (tool == nullptr) return;
    const auto is = [tool](StateFlag flag) { return (tool->state & flag) != 0; };
    const bool enabled = is(State_Enabled);
    Ink ink = isHeading(widget) ? &ThemeColors::caption : &ThemeColors::text;
    StyleFrame frame;
    frame.radius = boxOfTool(widget).radius;
    frame.edge = color(&ThemeColors::border);
    if (isHeading(widget)) {
        if (is(State_MouseOver)) ink = &ThemeColors::text;
        frame.ground = Qt::transparent;
        frame.edge = color(&ThemeColors::focus);
        if (is(State_HasFocus)) drawFrame(painter, option.rect, frame);
    } else {
        Ink ground = is(State_MouseOver) ? &ThemeColors::buttonHover : &ThemeColors::button;
        if (is(State_Sunken) || is(State_On)) {
            ground = &ThemeColors::accent;
            ink = &ThemeColors::accentText;
        }
        if (enabled && widget->objectName() == QLatin1String("StopTool")) {
            ground = &ThemeColors::red;
            ink = &ThemeColors::accentText;
        }
        frame.ground = color(enabled ? ground : &ThemeColors::window);
        if (is(State_HasFocus)) {
            frame.width = kFocusEdge;
            frame.edge = color(&ThemeColors::focus);
        }
        drawFrame(painter, option.rect, frame);
    }
    if (!enabled) ink = &ThemeColors::dim;
    QStyleOptionToolButton label = inked(*tool, color(ink));
    if (ink == &ThemeColors::accentText && !label.icon.isNull())
        label.icon = inkedIcon(label.icon, label.iconSize, painter.device()->devicePixelRatioF(),
                               color(ink));
    label.rect = toolPart(option, SC_ToolButton, widget);
    label.state &= ~State_HasFocus;
    proxy()->drawControl(CE_ToolButtonLabel, &label, &painter, widget);
    if ((tool->features & QStyleOptionToolButton::MenuButtonPopup) != 0)
        drawArrow(painter, toolPart(option, SC_ToolButtonMenu, widget), color(ink));
}

void PanelStyle::drawScrollBar(const QStyleOptionComplex& option, QPainter& painter) const {
    const QRect handle = scrollPart(option, SC_ScrollBarSlider);
    if (handle.isEmpty()) return;
    drawFrame(painter, handle, {color(&ThemeColors::border), {}, 0, kHandleRadius});
}

void PanelStyle::drawComplexControl(ComplexControl control, const QStyleOptionComplex* option,
                                    QPainter* painter, const QWidget* widget) const {
    switch (control) {
        case CC_ComboBox:
            return drawList(*option, *painter, widget);
        case CC_ToolButton:
            if (isTool(widget) || isHeading(widget)) return drawTool(*option, *painter, widget);
            break;
        case CC_ScrollBar:
            if ((option->state & State_Horizontal) == 0) return drawScrollBar(*option, *painter);
            break;
        default:
            break;
    }
    QProxyStyle::drawComplexControl(control, option, painter, widget);
}

QRect PanelStyle::listPart(const QRect& whole, Qt::LayoutDirection direction,
                           SubControl part) const {
    const ControlBox box = boxOfEntry(nullptr);
    const QRect arrow(whole.right() + 1 - kListEdge - kListKey, whole.top() + kListEdge, kListKey,
                      whole.height() - 2 * kListEdge);
    if (part == SC_ComboBoxArrow) return visualRect(direction, whole, arrow);
    return visualRect(direction, whole, box.inside(whole).adjusted(0, 0, -kListKey, 0));
}

QRect PanelStyle::toolPart(const QStyleOptionComplex& option, SubControl part,
                           const QWidget* widget) const {
    const auto* tool = qstyleoption_cast<const QStyleOptionToolButton*>(&option);
    const bool menu = tool != nullptr && (tool->features & QStyleOptionToolButton::MenuButtonPopup);
    QRect inside = boxOfTool(widget).inside(option.rect);
    if (menu) inside.setRight(option.rect.right() - 1 - kListKey);
    if (part == SC_ToolButtonMenu)
        inside = QRect(option.rect.right() - kMenuKey, option.rect.top() + 1, kMenuKey,
                       option.rect.height() - 2);
    return visualRect(option.direction, option.rect, inside);
}

QRect PanelStyle::scrollPart(const QStyleOptionComplex& option, SubControl part) const {
    const auto* bar = qstyleoption_cast<const QStyleOptionSlider*>(&option);
    if (bar == nullptr || part == SC_ScrollBarAddLine || part == SC_ScrollBarSubLine) return {};
    const int room = bar->rect.height();
    const qint64 range = static_cast<qint64>(bar->maximum) - bar->minimum;
    int length = room;
    if (range > 0) {
        const qint64 share =
            static_cast<qint64>(bar->pageStep) * room / std::max<qint64>(1, range + bar->pageStep);
        length = std::clamp(static_cast<int>(share), std::min(kLeastHandle, room), room);
    }
    const int start =
        bar->rect.top() + sliderPositionFromValue(bar->minimum, bar->maximum, bar->sliderPosition,
                                                  room - length, bar->upsideDown);
    const int left = bar->rect.left();
    const int width = bar->rect.width();
    switch (part) {
        case SC_ScrollBarSubPage:
            return {left, bar->rect.top(), width, start - bar->rect.top()};
        case SC_ScrollBarAddPage:
            return {left, start + length, width, bar->rect.bottom() + 1 - start - length};
        case SC_ScrollBarGroove:
            return bar->rect;
        case SC_ScrollBarSlider:
            return {left, start, width, length};
        default:
            return {};
    }
}

QRect PanelStyle::subControlRect(ComplexControl control, const QStyleOptionComplex* option,
                                 SubControl part, const QWidget* widget) const {
    switch (control) {
        case CC_ComboBox:
            if (part == SC_ComboBoxFrame) return option->rect;
            if (part == SC_ComboBoxArrow || part == SC_ComboBoxEditField)
                return listPart(option->rect, option->direction, part);
            break;
        case CC_ToolButton:
            if (isTool(widget) || isHeading(widget)) {
                const auto* tool = qstyleoption_cast<const QStyleOptionToolButton*>(option);
                if (part == SC_ToolButtonMenu && tool != nullptr)
                    return toolPart(*option, part, widget);
                return option->rect;
            }
            break;
        case CC_ScrollBar:
            if ((option->state & State_Horizontal) == 0) return scrollPart(*option, part);
            break;
        default:
            break;
    }
    return QProxyStyle::subControlRect(control, option, part, widget);
}

}  // namespace zel
