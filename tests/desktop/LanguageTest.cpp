// The window in another language.

#include <QAction>
#include <QStatusBar>
#include <QTranslator>

#include "desktop/binders/ToolTips.h"
#include "desktop/platform/Language.h"
#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

struct LanguageTest : testing::Test {
    LanguageTest() { testApplication(); }
    ~LanguageTest() override {
        for (QTranslator* texts : testApplication().findChildren<QTranslator*>()) {
            QCoreApplication::removeTranslator(texts);
            delete texts;
        }
    }
    /// The folder of the programs.
    QString folder() const { return QCoreApplication::applicationDirPath() + "/.."; }

    ControllerForm panel;
};

TEST_F(LanguageTest, German_TranslatesTheWindowsOwnTexts) {
    EXPECT_EQ(useLanguage("de", folder()), "de");
    EXPECT_EQ(toolTipOf(panel.PlaySingleButton), "Einen Sweep lesen");
    EXPECT_EQ(accessibleNameOf(panel.CWGraph1), "Diagramm");
    EXPECT_EQ(ownCaption(panel.PlaybackPlay, "Pause"), "Anhalten");
}

TEST_F(LanguageTest, German_LeavesThePanelsTexts) {
    useLanguage("de", folder());
    EXPECT_EQ(ownCaption(panel.StopButton, "Stop"), "Stop");
    EXPECT_EQ(ownCaption(panel.PlaySingleButton, "Single"), "Single");
    EXPECT_EQ(ownCaption(panel.FileMenu, "File"), "File");
}

TEST_F(LanguageTest, LanguageWithoutTexts_IsEnglish) {
    EXPECT_EQ(useLanguage("de", "/nowhere"), "en");
    EXPECT_EQ(useLanguage("en", folder()), "en");
    EXPECT_EQ(toolTipOf(panel.PlaySingleButton), "Read one sweep");
}

TEST_F(LanguageTest, EveryLanguage_NamesItself) {
    ASSERT_EQ(languages().size(), 3U);
    EXPECT_EQ(std::string(languages()[0].code), "");
    EXPECT_EQ(std::string(languages()[2].name), "Deutsch");
}

TEST_F(WindowTest, LanguageMenu_StoresTheChoiceAndSaysWhenItCounts) {
    QString chosen = "none";
    window->addLanguageMenu("", [&chosen](const QString& code) { chosen = code; });
    show();
    for (QAction* action : window->findChildren<QAction*>())
        if (action->text() == "Deutsch") action->trigger();
    EXPECT_EQ(chosen, "de");
    EXPECT_EQ(window->statusBar()->currentMessage(), "The language changes with the next start");
}

}  // namespace
}  // namespace zel
