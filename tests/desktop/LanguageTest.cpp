// The window in another language.

#include <QAction>
#include <QLabel>
#include <QMenuBar>
#include <QStatusBar>
#include <QTranslator>
#include <set>

#include "desktop/binders/OwnTexts.h"
#include "desktop/binders/ShortcutTable.h"
#include "desktop/binders/ToolTips.h"
#include "desktop/platform/Language.h"
#include "forms/MainForm.h"
#include "forms/SupportForms.h"
#include "forms/WaterfallForm.h"
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
    MainForm dialog;
    EXPECT_EQ(ownCaption(dialog.SearchRatesButton, dialog.SearchRatesButton.Caption),
              "Baudraten durchsuchen");
    DoctorForm doctor;
    EXPECT_EQ(ownCaption(doctor.cmdRunAgain, doctor.cmdRunAgain.Caption), "Noch einmal");
    EXPECT_EQ(labelText(doctor.AddressCaption, doctor.AddressCaption.Caption), "Verbindung");
    WaterfallForm waterfall;
    EXPECT_EQ(ownCaption(waterfall.DepthList, "As recorded"), "Wie aufgezeichnet");
    EXPECT_EQ(ownCaption(waterfall.VewClear, waterfall.VewClear.Caption), "Clear");
    EXPECT_EQ(ownCaption(dialog.ZELButton, dialog.ZELButton.Caption), "Connect") << "a panel text";
    EXPECT_EQ(QObject::tr("Port", "of TCP"), "Port");
}

TEST_F(LanguageTest, German_LeavesThePanelsTexts) {
    useLanguage("de", folder());
    EXPECT_EQ(ownCaption(panel.StopButton, "Stop"), "Stop");
    EXPECT_EQ(ownCaption(panel.PlaySingleButton, "Single"), "Single");
    EXPECT_EQ(ownCaption(panel.FileMenu, "File"), "File");
}

struct Sentence {
    const char* english;
    const char* german;
};

class OwnSentence : public LanguageTest, public testing::WithParamInterface<Sentence> {};

TEST_P(OwnSentence, HasItsWordsInEachLanguage) {
    useLanguage("en", folder());
    EXPECT_EQ(ownText(std::string(GetParam().english)).toStdString(), GetParam().english);
    useLanguage("de", folder());
    EXPECT_EQ(ownText(std::string(GetParam().english)).toStdString(), GetParam().german);
}

INSTANTIATE_TEST_SUITE_P(
    Sentences, OwnSentence,
    testing::Values(
        Sentence{"/dev/ttyUSB0 is back.", "/dev/ttyUSB0 ist wieder da."},
        Sentence{
            "No connection to lab:7000 yet: The server did not answer within 30 seconds. It is "
            "tried again each 5 s.",
            "Noch keine Verbindung zu lab:7000: Der Server hat 30 Sekunden nicht geantwortet. "
            "Es wird alle 5 s wieder versucht."},
        Sentence{"Port open, waiting for the instrument, 4 of 9 s",
                 "Anschluss offen, wartet auf das Gerät, 4 von 9 s"},
        Sentence{"a 1 old.csv: 12 traces, 2 incomplete, 1 failed, 93 kB, 00:00:05, next in 3 s",
                 "a 1 old.csv: 12 Kurven, 2 unvollständig, 1 fehlgeschlagen, 93 kB, 00:00:05, "
                 "nächste in 3 s"},
        Sentence{"0.5 s old   1.0 sweeps/s   the sweep sets the pace",
                 "0.5 s alt   1.0 Sweeps/s   der Sweep gibt den Takt"},
        Sentence{"Connected to lab:7000 again. Changed: Ref -20 dBm (before: -30 dBm); Sweep time "
                 "20 ms (before: 8 s).",
                 "Wieder mit lab:7000 verbunden. Geändert: Ref -20 dBm (vorher: -30 dBm); Sweep "
                 "time 20 ms (vorher: 8 s)."},
        Sentence{"10 of 40   11:50:20", "10 von 40   11:50:20"},
        Sentence{"\"dBm\" is no unit of a frequency, such as 2.4 GHz",
                 "\"dBm\" ist keine Einheit für eine Frequenz, etwa 2.4 GHz"},
        Sentence{"\"x\" is not a time, such as 5 s",
                 "\"x\" ist keine Angabe für eine Zeit, etwa 5 s"},
        Sentence{"1,500 can be 1.500 or 1500: write it without the comma",
                 "1,500 kann 1.500 oder 1500 sein: bitte ohne das Komma schreiben"},
        Sentence{"The instrument did not take this value. The next sweep asks it.",
                 "Das Gerät hat diesen Wert nicht angenommen. Der nächste Sweep fragt ihn ab."},
        Sentence{"Nobody knows this one", "Nobody knows this one"}));

TEST_F(LanguageTest, LabelsOfTheInstrumentsPanel_KeepTheirTexts) {
    useLanguage("de", folder());
    EXPECT_EQ(labelText(panel.CFLabel, "5 s old").toStdString(), "5 s old");
    EXPECT_EQ(labelText(panel.PaceLabel, "5 s old").toStdString(), "5 s alt");
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

class WindowIn : public WindowTest, public testing::WithParamInterface<const char*> {
  protected:
    void SetUp() override {
        useLanguage(GetParam(), QCoreApplication::applicationDirPath() + "/..");
        window = std::make_unique<MainWindow>(*program);
        connect();
        window->resize(1024, 600);
    }
    ~WindowIn() override {
        for (QTranslator* texts : testApplication().findChildren<QTranslator*>()) {
            QCoreApplication::removeTranslator(texts);
            delete texts;
        }
    }
};

TEST_P(WindowIn, ReadoutsOfTheSmallestWindow_AreWhole) {
    panel().MarkerLabel.Caption = "Marker: 2.41 GHz; -101.25 dBm";
    panel().DeltaLabel.Caption = "Delta: -222.22 MHz; -53.22 dBm";
    panel().CFLabel.Caption = "Center: 2.415 GHz";
    panel().PaceLabel.Visible = true;
    panel().PaceLabel.Caption = "0.5 s old   49.9 sweeps/s   the line sets the pace";
    show();
    const int right = window->graph().mapTo(window.get(), QPoint(window->graph().width(), 0)).x();
    for (const Label* control :
         {&panel().MarkerLabel, &panel().DeltaLabel, &panel().CFLabel, &panel().PaceLabel}) {
        const auto* label = widgetOf<QLabel>(*control);
        ASSERT_TRUE(label->isVisible());
        EXPECT_GE(label->width(), label->fontMetrics().size(0, label->text()).width())
            << label->text().toStdString();
        EXPECT_LE(label->mapTo(window.get(), QPoint(label->width(), 0)).x(), right)
            << label->text().toStdString();
    }
    EXPECT_TRUE(savePicture(*window, QString("readouts-") + GetParam()));
}

TEST_P(WindowIn, LettersOfTheMenus_AreTheirsAlone) {
    // Those of the keys of the units.
    std::set<QString> taken;
    for (const char* letter = kTerminatorLetters; *letter != 0; ++letter)
        taken.insert(QKeySequence(QString("Alt+") + QLatin1Char(*letter)).toString());
    int count = 0;
    for (const QAction* menu : window->menuBar()->actions()) {
        const QString letter = QKeySequence::mnemonic(menu->text()).toString();
        EXPECT_FALSE(letter.isEmpty()) << menu->text().toStdString();
        EXPECT_TRUE(taken.insert(letter).second) << menu->text().toStdString();
        ++count;
    }
    EXPECT_GE(count, 5);
}

INSTANTIATE_TEST_SUITE_P(Languages, WindowIn, testing::Values("en", "de"));

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
