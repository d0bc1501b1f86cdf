// Texts, marks and frames stand out from their grounds in both looks.

#include <gtest/gtest.h>

#include <QLineEdit>
#include <cmath>

#include "desktop/binders/ToolTips.h"
#include "desktop/graph/GraphPlot.h"
#include "desktop/windows/ThemeColors.h"
#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

constexpr double kText = 4.5;
constexpr double kLarge = 3;  // marks, frames, texts that cannot be used now

double luminance(const QColor& color) {
    const auto linear = [](double part) {
        return part <= 0.03928 ? part / 12.92 : std::pow((part + 0.055) / 1.055, 2.4);
    };
    return 0.2126 * linear(color.redF()) + 0.7152 * linear(color.greenF()) +
           0.0722 * linear(color.blueF());
}

double contrast(const QColor& one, const QColor& other) {
    const double a = luminance(one);
    const double b = luminance(other);
    return (std::max(a, b) + 0.05) / (std::min(a, b) + 0.05);
}

class Contrast : public testing::TestWithParam<bool> {
  protected:
    const ThemeColors& colors() const { return GetParam() ? kDark : kLight; }
    std::vector<const char*> grounds() const {
        const ThemeColors& c = colors();
        return {c.window, c.base, c.panel, c.button, c.buttonHover};
    }
};

TEST(ContrastOf, BlackOnWhite_IsTwentyOne) {
    EXPECT_NEAR(contrast(Qt::black, Qt::white), 21, 1e-6);
    EXPECT_NEAR(contrast("#777777", Qt::white), 4.48, 0.01);
}

TEST_P(Contrast, Texts_AreReadableOnEveryGround) {
    const ThemeColors& c = colors();
    for (const char* ink : {c.text, c.caption, c.problem})
        for (const char* ground : grounds())
            EXPECT_GE(contrast(ink, ground), kText) << ink << " on " << ground;
}

TEST_P(Contrast, TextsOnColours_AreReadable) {
    const ThemeColors& c = colors();
    EXPECT_GE(contrast(c.accentText, c.accent), kText);
    EXPECT_GE(contrast(c.yellowText, c.yellow), kText);
    EXPECT_GE(contrast(Qt::white, c.red), kText);
    EXPECT_GE(contrast(Qt::white, c.green), kText);
}

TEST_P(Contrast, DisabledTexts_CanBeSeen) {
    for (const char* ground : grounds())
        EXPECT_GE(contrast(colors().dim, ground), kLarge) << ground;
}

TEST_P(Contrast, Focus_StandsOutFromEveryGround) {
    for (const char* ground : grounds())
        EXPECT_GE(contrast(colors().focus, ground), kLarge) << ground;
    // Coloured keys have the frame of the texts.
    for (const char* key : {colors().accent, colors().red, colors().green, colors().yellow})
        EXPECT_GE(contrast(colors().text, key), kLarge) << key;
}

TEST_P(Contrast, ColouredTextsOfThePanel_AreReadable) {
    useDarkInk(GetParam());
    for (const Color color : {0x0000FFU, 0x00FF00U, 0xFF0000U, 0x00FFFFU, 0x808080U, 0x000080U})
        for (const char* ground : {colors().window, colors().base, colors().panel})
            EXPECT_GE(contrast(inkOf(static_cast<Color>(color)), ground), kText)
                << inkOf(static_cast<Color>(color)).name().toStdString() << " on " << ground;
    useDarkInk(true);
}

TEST_P(Contrast, Placeholders_AreReadable) {
    applyTheme(testApplication(), GetParam() ? ThemeChoice::Dark : ThemeChoice::Light);
    // A style sheet that gives boxes a colour makes their placeholders half transparent.
    QLineEdit box;
    box.ensurePolished();
    EXPECT_EQ(box.palette().color(QPalette::PlaceholderText).alpha(), 255);
    EXPECT_GE(contrast(box.palette().color(QPalette::PlaceholderText), colors().base), kText);
    EXPECT_GE(contrast(box.palette().color(QPalette::Text), colors().base), kText);
    const QPalette palette = QApplication::palette();
    EXPECT_GE(contrast(palette.color(QPalette::PlaceholderText), palette.color(QPalette::Base)),
              kText);
    EXPECT_GE(contrast(palette.color(QPalette::ToolTipText), palette.color(QPalette::ToolTipBase)),
              kText);
    EXPECT_GE(
        contrast(palette.color(QPalette::HighlightedText), palette.color(QPalette::Highlight)),
        kText);
    EXPECT_GE(
        contrast(palette.color(QPalette::Disabled, QPalette::Text), palette.color(QPalette::Base)),
        kLarge);
    applyTheme(testApplication(), ThemeChoice::Dark);
}

TEST_P(Contrast, TextsAndTraceOfTheGraph_AreReadable) {
    const GraphColors graph = GetParam() ? darkGraph() : lightGraph();
    for (const QColor& ground : {graph.background, graph.plotArea}) {
        EXPECT_GE(contrast(graph.text, ground), kText);
        EXPECT_GE(contrast(graph.file, ground), kText);
        EXPECT_GE(contrast(graph.trace, ground), kText);
        EXPECT_GE(contrast(graph.trigger, ground), kLarge);
    }
}

INSTANTIATE_TEST_SUITE_P(Themes, Contrast, testing::Bool(),
                         [](const auto& theme) { return theme.param ? "Dark" : "Light"; });

}  // namespace
}  // namespace zel
