#pragma once
// How the controls of the windows are drawn, and how much room they take. Drawn by the program
// itself: a style sheet would be worked out for each widget at the start.

#include <QHash>
#include <QIcon>
#include <QPixmap>
#include <QProxyStyle>
#include <QStyleOptionButton>

#include "desktop/style/StyleTables.h"

namespace zel {

constexpr int kFocusEdge = 2;  // pixels
constexpr int kListKey = 18;   // the place of a list's arrow

/// The option of the toolkit's own drawing with another colour for its text.
template <class Option>
Option inked(const Option& option, const QColor& ink) {
    Option own(option);
    for (const auto role : {QPalette::ButtonText, QPalette::WindowText, QPalette::Text})
        own.palette.setColor(role, ink);
    return own;
}

/// The same drawing in another ink, for a face of which the common one does not stand out.
QIcon inkedIcon(const QIcon& icon, const QSize& size, qreal scale, const QColor& ink);

/// A frame with its ground. One without a width has no edge.
struct StyleFrame {
    QColor ground;
    QColor edge;
    int width = 1;
    int radius = 0;
    Qt::PenStyle line = Qt::SolidLine;
};

class PanelStyle : public QProxyStyle {
  public:
    explicit PanelStyle(const ThemeColors& colors);

    using QProxyStyle::polish;
    using QProxyStyle::unpolish;
    /// Fonts and inks by the widget's properties; asked again when one of them has changed.
    void polish(QWidget* widget) override;

    void drawPrimitive(PrimitiveElement element, const QStyleOption* option, QPainter* painter,
                       const QWidget* widget) const override;
    void drawControl(ControlElement element, const QStyleOption* option, QPainter* painter,
                     const QWidget* widget) const override;
    void drawComplexControl(ComplexControl control, const QStyleOptionComplex* option,
                            QPainter* painter, const QWidget* widget) const override;

    QSize sizeFromContents(ContentsType type, const QStyleOption* option, const QSize& contents,
                           const QWidget* widget) const override;
    QRect subElementRect(SubElement element, const QStyleOption* option,
                         const QWidget* widget) const override;
    QRect subControlRect(ComplexControl control, const QStyleOptionComplex* option, SubControl part,
                         const QWidget* widget) const override;
    int pixelMetric(PixelMetric metric, const QStyleOption* option,
                    const QWidget* widget) const override;
    int styleHint(StyleHint hint, const QStyleOption* option, const QWidget* widget,
                  QStyleHintReturn* more) const override;
    QIcon standardIcon(StandardPixmap icon, const QStyleOption* option,
                       const QWidget* widget) const override;

  private:
    QColor color(Ink ink) const { return QColor(QLatin1String(colors_.*ink)); }
    void drawFrame(QPainter& painter, const QRect& place, const StyleFrame& frame) const;
    void drawKey(const QStyleOptionButton& option, QPainter& painter, const QWidget* widget) const;
    void drawKeyLabel(const QStyleOptionButton& option, QPainter& painter,
                      const QWidget* widget) const;
    void drawChoice(const QStyleOptionButton& option, QPainter& painter, const QWidget* widget,
                    bool exclusive) const;
    void drawIndicator(const QStyleOption& option, QPainter& painter, bool exclusive) const;
    void drawEntry(const QStyleOption& option, QPainter& painter, const QWidget* widget) const;
    void drawList(const QStyleOptionComplex& option, QPainter& painter,
                  const QWidget* widget) const;
    void drawTool(const QStyleOptionComplex& option, QPainter& painter,
                  const QWidget* widget) const;
    void drawScrollBar(const QStyleOptionComplex& option, QPainter& painter) const;
    void drawMenuTitle(const QStyleOption& option, QPainter& painter, const QWidget* widget) const;
    void drawListEntry(const QStyleOption& option, QPainter& painter) const;
    void drawTab(const QStyleOption& option, QPainter& painter, const QWidget* widget) const;
    void drawToolBar(const QStyleOption& option, QPainter& painter) const;
    QRect listPart(const QRect& whole, Qt::LayoutDirection direction, SubControl part) const;
    QRect choicePart(const QStyleOption& option, bool indicator) const;
    QRect scrollPart(const QStyleOptionComplex& option, SubControl part) const;
    QRect toolPart(const QStyleOptionComplex& option, SubControl part, const QWidget* widget) const;

    ThemeColors colors_;
    /// Corners of frames, which take longer to draw than to copy.
    mutable QHash<QString, QPixmap> corners_;
};

/// Draws a widget again after one of the properties that the style reads has changed.
void restyle(QWidget& widget);

}  // namespace zel
