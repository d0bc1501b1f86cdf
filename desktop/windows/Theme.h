#pragma once
// The light and the dark look of the windows.

#include <QString>

class QApplication;

namespace zel {

enum class ThemeChoice { System, Light, Dark };

ThemeChoice themeFromText(const QString& text);
QString themeText(ThemeChoice choice);
/// Style, palette and font of the whole program. True when the dark look came out.
bool applyTheme(QApplication& application, ThemeChoice choice);

}  // namespace zel
