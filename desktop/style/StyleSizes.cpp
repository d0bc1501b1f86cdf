// How much room the controls take, and where their parts lie.

#include <QStyleOptionButton>
#include <algorithm>

#include "desktop/style/PanelStyle.h"
#include "desktop/style/StyleTables.h"

namespace zel {
namespace {

constexpr int kIndicator = 14;
constexpr int kChoiceGap = 6;
constexpr int kChoiceEdge = 1;  // the frame of the focus
constexpr int kListGap = 2;     // the toolkit keeps it free beside a list's text
constexpr int kToolGap = 3;
constexpr int kToolMenu = 12;  // more than the room beside the words
constexpr int kStatusGap = 6;

struct Metric {
    QStyle::PixelMetric metric;
    int pixels;
};
constexpr Metric kMetrics[] = {
    {QStyle::PM_IndicatorWidth, kIndicator},
    {QStyle::PM_IndicatorHeight, kIndicator},
    {QStyle::PM_ExclusiveIndicatorWidth, kIndicator},
    {QStyle::PM_ExclusiveIndicatorHeight, kIndicator},
    {QStyle::PM_CheckBoxLabelSpacing, kChoiceGap},
    {QStyle::PM_RadioButtonLabelSpacing, kChoiceGap},
    {QStyle::PM_ToolBarItemSpacing, 4},
    {QStyle::PM_ToolBarFrameWidth, 6},
    {QStyle::PM_ToolBarItemMargin, 0},
    {QStyle::PM_ToolBarSeparatorExtent, 8},
    {QStyle::PM_ToolTipLabelFrameWidth, 1},
    {QStyle::PM_TabBarTabHSpace, 12},
    {QStyle::PM_TabBarTabVSpace, 10},
    {QStyle::PM_TabBarTabShiftVertical, 0},
    {QStyle::PM_TabBarTabShiftHorizontal, 0},
    {QStyle::PM_TabBarTabOverlap, 0},
};

}  // namespace

int PanelStyle::pixelMetric(PixelMetric metric, const QStyleOption* option,
                            const QWidget* widget) const {
    if (metric == PM_ScrollBarExtent &&
        (option == nullptr || (option->state & State_Horizontal) == 0))
        return 8;
    if (metric == PM_MenuButtonIndicator && isTool(widget)) return kToolMenu;
    for (const Metric& row : kMetrics)
        if (row.metric == metric) return row.pixels;
    return QProxyStyle::pixelMetric(metric, option, widget);
}

int PanelStyle::styleHint(StyleHint hint, const QStyleOption* option, const QWidget* widget,
                          QStyleHintReturn* more) const {
    // A second, lighter text under a disabled one blurs it on a dark menu.
    if (hint == SH_EtchDisabledText) return 0;
    // The toolkit's own pictures are of another set than the program's.
    if (hint == SH_DialogButtonBox_ButtonsHaveIcons) return 0;
    // A press beside the handle of a slider takes it to the pointer, from where it can be dragged.
    if (hint == SH_Slider_AbsoluteSetButtons) return Qt::LeftButton;
    return QProxyStyle::styleHint(hint, option, widget, more);
}

QSize PanelStyle::sizeFromContents(ContentsType type, const QStyleOption* option,
                                   const QSize& contents, const QWidget* widget) const {
    switch (type) {
        case CT_PushButton:
            return boxOfButton(widget).around(contents);
        case CT_LineEdit:
            if (isInnerLine(widget)) break;
            return boxOfEntry(widget).around(contents);
        case CT_ComboBox:
            return boxOfEntry(nullptr).around(contents + QSize(kListKey + kListGap, 0));
        case CT_CheckBox:
        case CT_RadioButton:
            return {kIndicator + kChoiceGap + contents.width() + 2 * kChoiceEdge,
                    std::max(contents.height(), kIndicator) + 2 * kChoiceEdge};
        case CT_ToolButton: {
            if (!isTool(widget) && !isHeading(widget)) break;
            const ControlBox box = boxOfTool(widget);
            return box.around(contents.expandedTo({0, box.least}) + QSize(kToolGap, kToolGap));
        }
        case CT_TabBarTab:
            return contents;
        case CT_Slider:
            return QProxyStyle::sizeFromContents(type, option, contents, widget) +
                   QSize(2 * kChoiceEdge, 2 * kChoiceEdge);
        default:
            break;
    }
    return QProxyStyle::sizeFromContents(type, option, contents, widget);
}

QRect PanelStyle::choicePart(const QStyleOption& option, bool indicator) const {
    const QRect inside = option.rect.adjusted(kChoiceEdge, kChoiceEdge, -kChoiceEdge, -kChoiceEdge);
    const QRect box(inside.left(), inside.top() + (inside.height() - kIndicator) / 2, kIndicator,
                    kIndicator);
    const QRect words = inside.adjusted(kIndicator + kChoiceGap, 0, 0, 0);
    return visualRect(option.direction, option.rect, indicator ? box : words);
}

QRect PanelStyle::subElementRect(SubElement element, const QStyleOption* option,
                                 const QWidget* widget) const {
    switch (element) {
        case SE_PushButtonContents:
            return boxOfButton(widget).inside(option->rect);
        case SE_LineEditContents:
            if (isInnerLine(widget)) break;
            return boxOfEntry(widget).inside(option->rect);
        case SE_CheckBoxIndicator:
        case SE_RadioButtonIndicator:
            return choicePart(*option, true);
        case SE_CheckBoxContents:
        case SE_RadioButtonContents:
            return choicePart(*option, false);
        case SE_CheckBoxClickRect:
        case SE_RadioButtonClickRect:
            return option->rect;
        case SE_ShapedFrameContents:
            if (isInStatusBar(widget)) return option->rect.adjusted(kStatusGap, 0, -kStatusGap, 0);
            if (isCard(widget)) return option->rect.adjusted(1, 1, -1, -1);
            break;
        default:
            break;
    }
    return QProxyStyle::subElementRect(element, option, widget);
}

}  // namespace zel
