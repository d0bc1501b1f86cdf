#pragma once
// What the controls of the window look like, by the properties that the windows give them: room
// around the contents, colours of the faces, fonts.

#include <QFont>
#include <QVariant>
#include <QWidget>

#include "desktop/windows/ThemeColors.h"

namespace zel {

using Ink = const char* ThemeColors::*;

constexpr int kBaseFontPixels = 12;

/// Room around the contents of a control, in pixels.
struct ControlBox {
    int aside;   ///< left and right, without the edge
    int above;   ///< above and below, without the edge
    int least;   ///< height of the contents at least
    int radius;  ///< of the corners
    int edge = 1;

    QSize around(const QSize& contents) const {
        return {contents.width() + 2 * (aside + edge),
                std::max(contents.height(), least) + 2 * (above + edge)};
    }
    QRect inside(const QRect& whole) const {
        return whole.adjusted(aside + edge, above + edge, -aside - edge, -above - edge);
    }
};

ControlBox boxOfButton(const QWidget* button);
ControlBox boxOfTool(const QWidget* tool);
ControlBox boxOfEntry(const QWidget* entry);
/// A control without contents is this high, even where a layout is short of room; 0 for a text.
int leastHeightOf(const QWidget& widget);

/// The colours of a key. Without a colour under the pointer it keeps its own.
struct KeyFace {
    const char* name;
    Ink ground;
    Ink ink;
    Ink edge;
    Ink groundUnderPointer;
    Ink edgeUnderPointer;
    bool bold;
};

/// `preset`: the key that Enter presses in a dialog.
const KeyFace& faceOfKey(const QWidget* key, bool preset);

/// The font of a widget of ours; one without settings for all others.
QFont fontOf(const QWidget& widget);
/// The ink of a label or an entry; null where it has the common one.
Ink inkOfText(const QWidget& widget);

/// A property that a window gave the widget; invalid where it did not. The class has a long list of
/// its own ones, which would be searched first, many times for each control.
QVariant givenProperty(const QWidget& widget, const char* name);
bool isMarked(const QWidget* widget, const char* property);
bool hasFace(const QWidget* widget, const char* face);
/// A key of a toolbar.
bool isTool(const QWidget* widget);
/// The heading of a part that folds.
bool isHeading(const QWidget* widget);
/// A list, a table or a text of several lines.
bool isTextArea(const QWidget* widget);
/// A frame around things that belong together.
bool isCard(const QWidget* widget);
bool isInStatusBar(const QWidget* widget);
/// The line inside of a list or a number box, which has the frame.
bool isInnerLine(const QWidget* widget);

}  // namespace zel
