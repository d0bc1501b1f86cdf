#include <QCheckBox>
#include <QLabel>
#include <QListWidget>
#include <QTest>
#include <QTextEdit>

#include "desktop/windows/ScriptEditorWindow.h"
#include "support/Text.h"
#include "tests/desktop/WindowTest.h"
#include "tests/files/FileSession.h"

namespace zel {
namespace {

struct ScriptWindowsTest : WindowTest {
    SpecialMeasForm& form = program->forms().specialMeas;
    ScriptEditor& editor = program->forms().scriptEditor;
    STDForm& statistics = program->forms().std;
    Folder folder{platform.files};

    void SetUp() override {
        connect();
        show();
        panel().cmdSpecial.Click();
        window->binder().flush();
    }
    void open(const Texts& lines) {
        std::string text;
        for (const std::string& line : lines) text += line + "\r\n";
        platform.fileDialogs.answer(folder.write("night.txt", text));
        form.cmdOpenCommandsFile.Click();
        window->binder().flush();
    }
    QWidget* windowOf(const Control& control) { return widgetOf<QWidget>(control)->window(); }
    void bothThemes(QWidget& widget, const QString& name) {
        for (const auto& [theme, word] :
             {std::pair{ThemeChoice::Light, "light"}, {ThemeChoice::Dark, "dark"}}) {
            applyTheme(testApplication(), theme);
            QApplication::processEvents();
            EXPECT_TRUE(savePicture(widget, name + "_" + word));
        }
    }
};

TEST_F(ScriptWindowsTest, EveryControl_HasAWidgetInItsWindow) {
    for (Form* shown :
         {static_cast<Form*>(&form), static_cast<Form*>(&editor), static_cast<Form*>(&statistics)})
        for (const Control* control : shown->controls()) {
            const bool onlyTwin = control->name() == "sldSpeed";  // in the playback bar
            const bool caption = control->kind() == ControlKind::Frame;
            if (onlyTwin || caption) continue;
            EXPECT_NE(widgetOf<QWidget>(*control), nullptr) << control->name();
        }
}

TEST_F(ScriptWindowsTest, List_ShowsTheScriptAndTheLineThatRuns) {
    open({"# A night", "SAVERESULTS out.txt", "DO", "GET LEVEL", "PAUSE 1", "LOOP 3"});
    auto* list = widgetOf<QListWidget>(form.lstCommands);
    ASSERT_EQ(list->count(), 6);
    EXPECT_EQ(list->item(3)->text(), "GET LEVEL");
    EXPECT_TRUE(list->isVisible());
    int row = -1;
    platform.events.schedule(1500, [&] {
        window->binder().flush();
        row = list->currentRow();
        bothThemes(*windowOf(form.cmdStop), "script_running");
        EXPECT_TRUE(widgetOf<QPushButton>(form.cmdStop)->isVisible());
        EXPECT_FALSE(widgetOf<QPushButton>(form.cmdExecute)->isEnabled());
        EXPECT_TRUE(widgetOf<QLabel>(form.lblProgress)->text().contains("pass 2"));
    });
    form.cmdExecute.Click();
    EXPECT_EQ(row, 4);
    window->binder().flush();
    EXPECT_FALSE(widgetOf<QPushButton>(form.cmdStop)->isVisible());
    EXPECT_TRUE(widgetOf<QPushButton>(form.cmdExecute)->isEnabled());
}

TEST_F(ScriptWindowsTest, EachBox_CanBeTickedBeforeARunAndInIt) {
    const auto tickEach = [&] {
        for (CheckBox* control : {&form.chkStep, &form.chkWaterfall, &form.chkGetSweep}) {
            const bool before = control->Value();
            widgetOf<QCheckBox>(*control)->click();
            EXPECT_NE(control->Value(), before) << control->name();
        }
    };
    open({"NOSAVE", "PAUSE 1"});
    tickEach();
    tickEach();
    bool ran = false;
    platform.events.schedule(500, [&] {
        tickEach();
        tickEach();
        ran = true;
    });
    form.cmdExecute.Click();
    EXPECT_TRUE(ran);
}

TEST_F(ScriptWindowsTest, StepMode_ShowsNextInPlaceOfExecute) {
    open({"NOSAVE", "PAUSE 1"});
    widgetOf<QCheckBox>(form.chkStep)->click();
    platform.events.schedule(10, [&] {
        window->binder().flush();
        EXPECT_TRUE(widgetOf<QPushButton>(form.cmdNext)->isVisible());
        EXPECT_FALSE(widgetOf<QPushButton>(form.cmdExecute)->isVisible());
        widgetOf<QCheckBox>(form.chkStep)->click();
        widgetOf<QPushButton>(form.cmdNext)->click();
    });
    widgetOf<QPushButton>(form.cmdExecute)->click();
    EXPECT_TRUE(form.ReachedEnd);
}

TEST_F(ScriptWindowsTest, StopKey_StopsARun) {
    open({"NOSAVE", "PAUSE 100"});
    platform.events.schedule(10, [&] {
        window->binder().flush();
        widgetOf<QPushButton>(form.cmdStop)->click();
    });
    widgetOf<QPushButton>(form.cmdExecute)->click();
    EXPECT_FALSE(form.ReachedEnd);
}

TEST_F(ScriptWindowsTest, Statistics_ShowTheRows) {
    open({"SAVERESULTS out.txt", "AVGCOUNT 1", "GET CTRACE", "GET CTRACE", "GET CTRACE"});
    form.cmdExecute.Click();
    window->binder().flush();
    auto* box = widgetOf<QTextEdit>(statistics.rtfReceive);
    EXPECT_EQ(box->toPlainText().toStdString(),
              replaceAll(statistics.rtfReceive.Text(), "\r\n", "\n"));
    EXPECT_TRUE(box->isVisible());
    bothThemes(*box->window(), "statistics");
}

TEST_F(ScriptWindowsTest, Editor_EditsMarksAndCompletes) {
    open({"# Level log", "SAVERESULTS out.txt", "SET FREQ,100000000", "PUASE 3", "LOOP 40000",
          "PAUSE 2.5", "GET LEVEL"});
    platform.events.schedule(10, [&] {
        window->binder().flush();
        auto* text = widgetOf<QsciScintilla>(editor.txtNotepad);
        ASSERT_TRUE(text->isVisible());
        EXPECT_EQ(text->lines(), 8);
        EXPECT_EQ(text->markersAtLine(3), 1U << 1);
        EXPECT_EQ(text->markersAtLine(4), 1U << 2);
        EXPECT_EQ(text->markersAtLine(5), 0U);
        text->setCursorPosition(3, 0);
        bothThemes(*text->window(), "editor");
        text->setCursorPosition(7, 0);
        text->insert("DO");
        EXPECT_EQ(linesOf(editor.txtNotepad.Text.get()).back(), "DO");
        EXPECT_TRUE(text->isUndoAvailable());
        text->undo();
        EXPECT_EQ(linesOf(editor.txtNotepad.Text.get()).size(), 7U);
        widgetOf<QPushButton>(editor.cmdClose)->click();
    });
    form.cmdEdit.Click();
    EXPECT_FALSE(editor.Visible);
    EXPECT_EQ(linesOf(folder.read("night.txt")).size(), 7U);
}

TEST_F(ScriptWindowsTest, Editor_OffersTheWordsThatBeginAsTyped) {
    platform.fileDialogs.answer(folder.write("s.txt", "# empty\r\n"));
    form.cmdOpenCommandsFile.Click();
    platform.events.schedule(10, [&] {
        window->binder().flush();
        auto* text = widgetOf<QsciScintilla>(editor.txtNotepad);
        text->setCursorPosition(1, 0);
        QTest::keyClicks(text, "sav");
        EXPECT_TRUE(text->isListActive());
        QTest::keyClick(text, Qt::Key_Return);
        EXPECT_EQ(text->text(1).trimmed(), "SAVERESULTS");
        while (text->isUndoAvailable()) text->undo();
        widgetOf<QPushButton>(editor.cmdClose)->click();
    });
    form.cmdEdit.Click();
}

TEST_F(ScriptWindowsTest, Editor_KeepsEveryByteOfATextWithMixedLineEnds) {
    const std::string bytes = "DO\nLOOP\r\n\rPAUSE \xE4";
    platform.fileDialogs.answer(folder.write("s.txt", bytes));
    form.cmdOpenCommandsFile.Click();
    platform.events.schedule(10, [&] {
        window->binder().flush();
        auto* text = widgetOf<QsciScintilla>(editor.txtNotepad);
        text->setCursorPosition(0, 0);
        text->insert("#");
        text->undo();
        widgetOf<QPushButton>(editor.cmdClose)->click();
    });
    form.cmdEdit.Click();
    EXPECT_EQ(folder.read("s.txt"), bytes);
}

TEST_F(ScriptWindowsTest, SmallScreen_HoldsTheWindows) {
    for (const Control* control : {static_cast<const Control*>(&form.cmdExecute),
                                   static_cast<const Control*>(&statistics.cmdClear),
                                   static_cast<const Control*>(&editor.cmdClose)}) {
        const QSize least = windowOf(*control)->minimumSizeHint();
        EXPECT_LE(least.width(), 1000) << control->name();
        EXPECT_LE(least.height(), 540) << control->name();
    }
}

}  // namespace
}  // namespace zel
