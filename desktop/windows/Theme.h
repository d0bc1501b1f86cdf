#pragma once
// The light and the dark look of the windows.

#include <QString>

class QApplication;

namespace zel {

enum class ThemeChoice { System, Light, Dark };

ThemeChoice themeFromText(const QString& text);
QString themeText(ThemeChoice choice);
/// Palette and style sheet of the whole program. True when the dark look came out.
bool applyTheme(QApplication& application, ThemeChoice choice);
/// The same in two parts, for the start: a window is built before the style sheet comes, which
/// would be worked out again for each widget with each parent that it gets on the way.
bool prepareTheme(QApplication& application, ThemeChoice choice);
void dressTheme(QApplication& application, bool dark);

}  // namespace zel
