#include "desktop/style/StyleTables.h"

#include <QAbstractScrollArea>
#include <QAbstractSpinBox>
#include <QComboBox>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QScrollArea>
#include <QStatusBar>
#include <QToolBar>
#include <QToolButton>

namespace zel {
namespace {

using C = ThemeColors;

struct ButtonShape {
    const char* property;
    ControlBox box;
    int fontPixels;
};
constexpr ControlBox kButton = {6, 2, 20, 6};
constexpr ButtonShape kButtonShapes[] = {
    {"soft", {6, 2, 28, 6}, kBaseFontPixels},
    {"way", {10, 4, 24, 6}, kBaseFontPixels},
    {"narrow", {0, 2, 20, 6}, 10},
    {"tool", {8, 2, 24, 6}, kBaseFontPixels},
};
constexpr const char* kTerminator = "terminator";
constexpr ControlBox kTerminatorBox = {2, 1, 20, 6};
constexpr ControlBox kTool = {6, 2, 22, 6};
constexpr ControlBox kHeading = {0, 1, 14, 3, 0};
constexpr ControlBox kEntry = {4, 1, 18, 4};
constexpr ControlBox kFlatEntry = {4, 1, 18, 0, 0};

constexpr KeyFace kPlain = {"plain",         &C::button, &C::text, &C::border,
                            &C::buttonHover, &C::border, false};
constexpr KeyFace kPreset = {"", &C::accent, &C::accentText, &C::accent, nullptr, &C::text, false};
constexpr KeyFace kFaces[] = {
    {"red", &C::red, &C::accentText, &C::border, nullptr, &C::border, true},
    {"green", &C::green, &C::accentText, &C::border, nullptr, &C::border, true},
    {"yellow", &C::yellow, &C::yellowText, &C::yellowEdge, nullptr, &C::yellowText, true},
    {"blue", &C::accent, &C::accentText, &C::border, nullptr, &C::border, true},
    {kTerminator, &C::base, &C::text, &C::border, &C::buttonHover, &C::border, false},
};

constexpr int kSmall = 11;
constexpr int kReadout = 13;

template <class Parent>
bool isIn(const QWidget* widget) {
    return widget != nullptr && qobject_cast<const Parent*>(widget->parentWidget()) != nullptr;
}

bool isCaption(const QWidget& widget) { return widget.objectName() == QLatin1String("caption"); }

/// A font that sets its size, and its weight where that is not the common one.
QFont sized(int pixels, bool bold = false, QFont::Weight weight = QFont::Bold) {
    QFont font;
    if (pixels != kBaseFontPixels) font.setPixelSize(pixels);
    if (bold) font.setWeight(weight);
    return font;
}

QFont fontOfKey(const QWidget& key) {
    int pixels = hasFace(&key, kTerminator) ? kSmall : kBaseFontPixels;
    for (const ButtonShape& shape : kButtonShapes)
        if (isMarked(&key, shape.property)) pixels = shape.fontPixels;
    return sized(pixels, faceOfKey(&key, false).bold);
}

}  // namespace

QVariant givenProperty(const QWidget& widget, const char* name) {
    return widget.dynamicPropertyNames().contains(name) ? widget.property(name) : QVariant();
}

bool isMarked(const QWidget* widget, const char* property) {
    return widget != nullptr && givenProperty(*widget, property).toBool();
}

bool hasFace(const QWidget* widget, const char* face) {
    return widget != nullptr && givenProperty(*widget, "face").toString() == QLatin1String(face);
}

bool isTool(const QWidget* widget) {
    return isIn<QToolBar>(widget) && qobject_cast<const QToolButton*>(widget) != nullptr;
}

bool isHeading(const QWidget* widget) {
    return widget != nullptr && widget->objectName() == QLatin1String("heading") &&
           qobject_cast<const QToolButton*>(widget) != nullptr;
}

bool isTextArea(const QWidget* widget) {
    return qobject_cast<const QAbstractScrollArea*>(widget) != nullptr &&
           qobject_cast<const QScrollArea*>(widget) == nullptr;
}

bool isCard(const QWidget* widget) {
    if (widget == nullptr) return false;
    const QString name = widget->objectName();
    return name == QLatin1String("group") || name == QLatin1String("card") ||
           name == QLatin1String("panel");
}

bool isInStatusBar(const QWidget* widget) {
    if (qobject_cast<const QLabel*>(widget) == nullptr) return false;
    for (const QWidget* at = widget->parentWidget(); at != nullptr && !at->isWindow();
         at = at->parentWidget())
        if (qobject_cast<const QStatusBar*>(at) != nullptr) return true;
    return false;
}

bool isInnerLine(const QWidget* widget) {
    return isIn<QComboBox>(widget) || isIn<QAbstractSpinBox>(widget);
}

ControlBox boxOfButton(const QWidget* button) {
    if (hasFace(button, kTerminator)) return kTerminatorBox;
    for (const ButtonShape& shape : kButtonShapes)
        if (isMarked(button, shape.property)) return shape.box;
    return kButton;
}

ControlBox boxOfTool(const QWidget* tool) { return isHeading(tool) ? kHeading : kTool; }

ControlBox boxOfEntry(const QWidget* entry) {
    return isMarked(entry, "flat") ? kFlatEntry : kEntry;
}

int leastHeightOf(const QWidget& widget) {
    if (qobject_cast<const QLabel*>(&widget) != nullptr || isInnerLine(&widget)) return 0;
    if (qobject_cast<const QPushButton*>(&widget) != nullptr)
        return boxOfButton(&widget).around({}).height();
    if (isTool(&widget) || isHeading(&widget)) return boxOfTool(&widget).around({}).height();
    return boxOfEntry(&widget).around({}).height();
}

const KeyFace& faceOfKey(const QWidget* key, bool preset) {
    const QString name = key == nullptr ? QString()
                         : key->objectName() == QLatin1String("StopButton")
                             ? QString("red")
                             : givenProperty(*key, "face").toString();
    for (const KeyFace& face : kFaces)
        if (name == QLatin1String(face.name)) return face;
    return preset ? kPreset : kPlain;
}

QFont fontOf(const QWidget& widget) {
    QFont font;
    if (qobject_cast<const QPushButton*>(&widget) != nullptr) return fontOfKey(widget);
    if (isHeading(&widget)) return sized(kSmall, true, QFont::DemiBold);
    if (qobject_cast<const QLabel*>(&widget) != nullptr) {
        if (isCaption(widget)) font = sized(kSmall);
        if (isMarked(&widget, "readout")) font = sized(kReadout, true, QFont::DemiBold);
    }
    if (isMarked(&widget, "struck")) font.setStrikeOut(true);
    return font;
}

Ink inkOfText(const QWidget& widget) {
    // A key with a picture draws its text itself, by its palette.
    if (qobject_cast<const QPushButton*>(&widget) != nullptr) {
        const Ink ink = faceOfKey(&widget, false).ink;
        return ink == &C::text ? nullptr : ink;
    }
    const bool label = qobject_cast<const QLabel*>(&widget) != nullptr;
    if (label && isMarked(&widget, "problem")) return &C::problem;
    if (label && isMarked(&widget, "file")) return &C::file;
    if (label) return isCaption(widget) ? &C::caption : nullptr;
    if (isHeading(&widget) || isMarked(&widget, "flat")) return &C::caption;
    if (isMarked(&widget, "refused")) return &C::problem;
    const bool line = qobject_cast<const QLineEdit*>(&widget) != nullptr;
    return line && isMarked(&widget, "struck") ? &C::problem : nullptr;
}

}  // namespace zel
