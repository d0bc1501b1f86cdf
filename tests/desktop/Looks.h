#pragma once
// The themes and the sizes of window in which pictures are taken.

#include <gtest/gtest.h>

#include <QSize>
#include <QString>

#include "desktop/windows/Theme.h"

namespace zel {

struct Look {
    const char* name;
    ThemeChoice theme;
    QSize size;
};

inline const auto kLooks =
    testing::Values(Look{"dark-1024x600", ThemeChoice::Dark, {1024, 600}},
                    Look{"light-1024x600", ThemeChoice::Light, {1024, 600}},
                    Look{"dark-1280x760", ThemeChoice::Dark, {1280, 760}},
                    Look{"light-1280x760", ThemeChoice::Light, {1280, 760}},
                    Look{"dark-1920x1080", ThemeChoice::Dark, {1920, 1080}},
                    Look{"light-1920x1080", ThemeChoice::Light, {1920, 1080}});

inline const auto kNameOfLook = [](const auto& look) {
    return QString(look.param.name).replace('-', '_').toStdString();
};

}  // namespace zel
