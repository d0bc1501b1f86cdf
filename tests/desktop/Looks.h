#pragma once
// The themes, the sizes of window and the languages in which pictures are taken.

#include <gtest/gtest.h>

#include <QApplication>
#include <QSize>
#include <QString>
#include <QTranslator>
#include <memory>

#include "desktop/platform/Language.h"
#include "desktop/windows/MainWindow.h"
#include "desktop/windows/Theme.h"
#include "shell/Program.h"

namespace zel {

struct Look {
    const char* name;
    ThemeChoice theme;
    QSize size;
    const char* language = "en";

    bool english() const { return QString(language) == "en"; }
};

inline const auto kLooks =
    testing::Values(Look{"dark-1024x600", ThemeChoice::Dark, {1024, 600}},
                    Look{"light-1024x600", ThemeChoice::Light, {1024, 600}},
                    Look{"dark-1280x760", ThemeChoice::Dark, {1280, 760}},
                    Look{"light-1280x760", ThemeChoice::Light, {1280, 760}},
                    Look{"dark-1920x1080", ThemeChoice::Dark, {1920, 1080}},
                    Look{"light-1920x1080", ThemeChoice::Light, {1920, 1080}},
                    Look{"german-1024x600", ThemeChoice::Dark, {1024, 600}, "de"},
                    Look{"german-1280x760", ThemeChoice::Light, {1280, 760}, "de"});

inline const auto kNameOfLook = [](const auto& look) {
    return QString(look.param.name).replace('-', '_').toStdString();
};

/// Puts theme and language of a look on; the window is made again where its texts are others.
inline void putOn(const Look& look, Program& program, std::unique_ptr<MainWindow>& window) {
    applyTheme(*qApp, look.theme);
    if (look.english()) return;
    useLanguage(look.language, QCoreApplication::applicationDirPath() + "/..");
    window.reset();
    window = std::make_unique<MainWindow>(program);
    window->buildAll();
}

/// As it was before.
inline void takeOff() {
    applyTheme(*qApp, ThemeChoice::Dark);
    for (QTranslator* texts : qApp->findChildren<QTranslator*>()) {
        QCoreApplication::removeTranslator(texts);
        delete texts;
    }
}

}  // namespace zel
