#include "desktop/windows/Theme.h"

#include <QApplication>
#include <QPalette>
#include <QToolTip>

#include "desktop/binders/ToolTips.h"
#include "desktop/style/PanelStyle.h"
#include "desktop/style/StyleTables.h"
#include "desktop/windows/ThemeColors.h"

namespace zel {
namespace {

QPalette paletteOf(const ThemeColors& c) {
    QPalette palette;
    palette.setColor(QPalette::Window, c.window);
    palette.setColor(QPalette::WindowText, c.text);
    palette.setColor(QPalette::Base, c.base);
    palette.setColor(QPalette::AlternateBase, c.window);
    palette.setColor(QPalette::Text, c.text);
    palette.setColor(QPalette::Button, c.button);
    palette.setColor(QPalette::ButtonText, c.text);
    palette.setColor(QPalette::ToolTipBase, c.base);
    palette.setColor(QPalette::ToolTipText, c.text);
    palette.setColor(QPalette::Highlight, c.accent);
    palette.setColor(QPalette::HighlightedText, c.accentText);
    palette.setColor(QPalette::PlaceholderText, c.caption);
    palette.setColor(QPalette::Link, c.focus);
    palette.setColor(QPalette::LinkVisited, c.focus);
    for (const auto role : {QPalette::WindowText, QPalette::Text, QPalette::ButtonText})
        palette.setColor(QPalette::Disabled, role, c.dim);
    return palette;
}

/// As the desktop's own settings have it, before any palette of ours.
bool systemIsDark() {
    static const bool dark = QApplication::palette().color(QPalette::Window).lightness() < 128;
    return dark;
}

}  // namespace

ThemeChoice themeFromText(const QString& text) {
    if (text == "light") return ThemeChoice::Light;
    return text == "dark" ? ThemeChoice::Dark : ThemeChoice::System;
}

QString themeText(ThemeChoice choice) {
    return choice == ThemeChoice::Light ? "light" : choice == ThemeChoice::Dark ? "dark" : "system";
}

bool applyTheme(QApplication& application, ThemeChoice choice) {
    const bool system = systemIsDark();
    const bool dark = choice == ThemeChoice::Dark || (choice == ThemeChoice::System && system);
    const ThemeColors& colors = dark ? kDark : kLight;
    if (QFont font = QApplication::font(); font.pixelSize() != kBaseFontPixels) {
        font.setPixelSize(kBaseFontPixels);
        application.setFont(font);
    }
    const QPalette palette = paletteOf(colors);
    application.setStyle(new PanelStyle(colors));
    application.setPalette(palette);
    QToolTip::setPalette(palette);
    useDarkInk(dark);
    return dark;
}

}  // namespace zel
