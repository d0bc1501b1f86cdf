// The boxes and file dialogs as windows of the toolkit, answered while they stand.

#include <gtest/gtest.h>

#include <QDir>
#include <QFile>
#include <QFileDialog>
#include <QGuiApplication>
#include <QLineEdit>
#include <QMessageBox>
#include <QPushButton>
#include <QStandardPaths>
#include <QTemporaryDir>
#include <QTest>
#include <QTimer>
#include <functional>
#include <string>
#include <utility>
#include <vector>

#include "desktop/platform/QtDialogs.h"
#include "platform/virtual/MemoryServices.h"
#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

/// Looks at the window that is shown next, and answers it.
template <class Window>
void answerNext(std::function<void(Window&)> answer) {
    QTimer::singleShot(0, &testApplication(), [answer = std::move(answer)] {
        auto* window = qobject_cast<Window*>(QApplication::activeModalWidget());
        ASSERT_NE(window, nullptr);
        answer(*window);
        if (window->isVisible()) window->reject();
    });
}

struct ToolkitBoxes : testing::Test {
    QApplication& application = testApplication();
    QtMessageBoxes boxes;

    BoxAnswer answered(const Box& box, Qt::Key key) {
        answerNext<QMessageBox>([key](QMessageBox& window) { QTest::keyClick(&window, key); });
        return boxes.show(box);
    }
    BoxAnswer pressed(const Box& box, QMessageBox::StandardButton button) {
        answerNext<QMessageBox>([button](QMessageBox& window) {
            ASSERT_NE(window.button(button), nullptr);
            window.button(button)->click();
        });
        return boxes.show(box);
    }
};

TEST_F(ToolkitBoxes, EachSetOfKeys_AnswersWithTheKeyThatWasPressed) {
    const struct {
        BoxButtons set;
        std::vector<std::pair<QMessageBox::StandardButton, BoxAnswer>> keys;
        BoxAnswer enter;
        BoxAnswer escape;
    } rows[] = {
        {BoxButtons::Ok, {{QMessageBox::Ok, BoxAnswer::Ok}}, BoxAnswer::Ok, BoxAnswer::Ok},
        {BoxButtons::OkCancel,
         {{QMessageBox::Ok, BoxAnswer::Ok}, {QMessageBox::Cancel, BoxAnswer::Cancel}},
         BoxAnswer::Ok,
         BoxAnswer::Cancel},
        {BoxButtons::YesNo,
         {{QMessageBox::Yes, BoxAnswer::Yes}, {QMessageBox::No, BoxAnswer::No}},
         BoxAnswer::Yes,
         BoxAnswer::No},
        {BoxButtons::YesNoCancel,
         {{QMessageBox::Yes, BoxAnswer::Yes},
          {QMessageBox::No, BoxAnswer::No},
          {QMessageBox::Cancel, BoxAnswer::Cancel}},
         BoxAnswer::Yes,
         BoxAnswer::Cancel},
    };
    for (const auto& row : rows) {
        Box box;
        box.text = "Go on?";
        box.buttons = row.set;
        answerNext<QMessageBox>([&](QMessageBox& window) {
            EXPECT_EQ(static_cast<std::size_t>(window.buttons().size()), row.keys.size());
        });
        boxes.show(box);
        for (const auto& [key, answer] : row.keys) {
            EXPECT_EQ(pressed(box, key), answer);
        }
        EXPECT_EQ(answered(box, Qt::Key_Return), row.enter);
        EXPECT_EQ(answered(box, Qt::Key_Escape), row.escape);
    }
}

TEST_F(ToolkitBoxes, Box_ShowsItsTextAsItIs) {
    const std::pair<BoxIcon, QMessageBox::Icon> icons[] = {
        {BoxIcon::Plain, QMessageBox::NoIcon},
        {BoxIcon::Critical, QMessageBox::Critical},
        {BoxIcon::Question, QMessageBox::Question},
        {BoxIcon::Warning, QMessageBox::Warning},
        {BoxIcon::Exclamation, QMessageBox::Warning},
        {BoxIcon::Information, QMessageBox::Information},
    };
    for (const auto& [icon, drawn] : icons) {
        answerNext<QMessageBox>([expected = drawn](QMessageBox& window) {
            EXPECT_EQ(window.icon(), expected);
            EXPECT_EQ(window.text(), "<b>-30 dBm</b>\nis too low");
            EXPECT_EQ(window.textFormat(), Qt::PlainText);
            EXPECT_EQ(window.windowTitle(), "Level");
        });
        boxes.show({icon, "<b>-30 dBm</b>\r\nis too low", "Level", BoxButtons::Ok});
    }
}

TEST_F(ToolkitBoxes, PointerOfWork_IsNoPointerOfAQuestion) {
    QGuiApplication::setOverrideCursor(Qt::WaitCursor);
    answerNext<QMessageBox>([](QMessageBox&) {
        EXPECT_EQ(QGuiApplication::overrideCursor()->shape(), Qt::ArrowCursor);
    });
    boxes.show({});
    EXPECT_EQ(QGuiApplication::overrideCursor()->shape(), Qt::WaitCursor);
    QGuiApplication::restoreOverrideCursor();
}

TEST_F(ToolkitBoxes, Prompt_GivesTheLineOrNothing) {
    answerNext<QDialog>([](QDialog& window) {
        auto* line = window.findChild<QLineEdit*>();
        ASSERT_NE(line, nullptr);
        EXPECT_EQ(line->text(), "15");
        line->setText("20");
        window.accept();
    });
    EXPECT_EQ(boxes.prompt("Interval in seconds", "Record", "15"), "20");
    answerNext<QDialog>([](QDialog& window) { window.reject(); });
    EXPECT_EQ(boxes.prompt("Interval in seconds", "Record", "15"), std::nullopt);
}

TEST_F(ToolkitBoxes, Clipboard_GivesBackWhatItGot) {
    QtClipboard clipboard;
    clipboard.setText("2.4 GHz\n\xC2\xB5");
    EXPECT_EQ(clipboard.text(), "2.4 GHz\n\xC2\xB5");
}

struct ToolkitFileDialogs : testing::Test {
    QApplication& application = testApplication();
    QTemporaryDir folder;
    QTemporaryDir home;
    MemorySettings settings;
    FixedApplicationFolder own;
    QtFileDialogs dialogs{settings, own};
    FileDialogRequest request;

    ToolkitFileDialogs() {
        own.folder = home.path().toStdString();
        request.title = "Save View";
        request.filter = "Text (*.txt)|*.txt|Picture (*.*)|*.wmf|All (*.*)|*.*";
        request.filterIndex = 1;
        request.folder = folder.path().toStdString();
    }
    static void type(QFileDialog& dialog, const QString& name) {
        auto* line = dialog.findChild<QLineEdit*>("fileNameEdit");
        ASSERT_NE(line, nullptr);
        line->setText(name);
        QMetaObject::invokeMethod(&dialog, "accept");
    }
    std::string path(const char* name) const { return folder.filePath(name).toStdString(); }
};

TEST_F(ToolkitFileDialogs, NameWithoutAnEnding_GetsThatOfTheKindOfFile) {
    answerNext<QFileDialog>([](QFileDialog& dialog) {
        EXPECT_EQ(dialog.windowTitle(), "Save View");
        EXPECT_EQ(dialog.nameFilters(),
                  QStringList({"Text (*.txt)", "WMF Files (*.wmf)", "All (*)"}));
        EXPECT_EQ(dialog.selectedNameFilter(), "Text (*.txt)");
        type(dialog, "site");
    });
    EXPECT_EQ(dialogs.save(request), path("site.txt"));
    answerNext<QFileDialog>([](QFileDialog& dialog) {
        dialog.selectNameFilter("WMF Files (*.wmf)");
        emit dialog.filterSelected("WMF Files (*.wmf)");
        type(dialog, "site");
    });
    EXPECT_EQ(dialogs.save(request), path("site.wmf"));
    request.filterIndex = 3;
    answerNext<QFileDialog>([](QFileDialog& dialog) { type(dialog, "site"); });
    EXPECT_EQ(dialogs.save(request), path("site"));
}

TEST_F(ToolkitFileDialogs, NextOne_BeginsWhereTheLastOneEnded) {
    const QString first = QDir(folder.path()).canonicalPath();
    ASSERT_TRUE(QDir(first).mkdir("site"));
    QFile file(first + "/site/view.txt");
    ASSERT_TRUE(file.open(QIODevice::WriteOnly));
    file.close();
    answerNext<QFileDialog>([&](QFileDialog& dialog) {
        EXPECT_EQ(dialog.directory().canonicalPath(), first);
        type(dialog, file.fileName());
    });
    EXPECT_EQ(dialogs.open(request), file.fileName().toStdString());
    answerNext<QFileDialog>([&](QFileDialog& dialog) {
        EXPECT_EQ(dialog.directory().canonicalPath(), first + "/site");
    });
    EXPECT_EQ(dialogs.open(request), std::nullopt);
    // That was cancelled; and a folder that is gone is none to begin in.
    ASSERT_TRUE(QDir(first + "/site").removeRecursively());
    answerNext<QFileDialog>(
        [&](QFileDialog& dialog) { EXPECT_EQ(dialog.directory().canonicalPath(), first); });
    EXPECT_EQ(dialogs.open(request), std::nullopt);
}

TEST_F(ToolkitFileDialogs, FirstOne_NeverBeginsAmongTheProgramsOwnFilesOrInAHiddenFolder) {
    const QString documents = QStandardPaths::writableLocation(QStandardPaths::DocumentsLocation);
    const QString expected =
        QDir(QFileInfo(documents).isDir() ? documents : QDir::homePath()).canonicalPath();
    ASSERT_TRUE(QDir(home.path()).mkdir("specialMeas"));
    ASSERT_TRUE(QDir(folder.path()).mkdir(".hidden"));
    for (const QString& asked : {home.path(), home.filePath("specialMeas"),
                                 folder.filePath(".hidden"), folder.filePath("gone")}) {
        request.folder = asked.toStdString();
        answerNext<QFileDialog>([&](QFileDialog& dialog) {
            EXPECT_EQ(dialog.directory().canonicalPath(), expected) << asked.toStdString();
        });
        EXPECT_EQ(dialogs.save(request), std::nullopt);
    }
}

TEST_F(ToolkitFileDialogs, FileThatIsNotThere_IsNotOpened) {
    answerNext<QFileDialog>([](QFileDialog& dialog) {
        // The dialog says so in a box of its own.
        QTimer::singleShot(0, &dialog, [] {
            if (auto* box = qobject_cast<QMessageBox*>(QApplication::activeModalWidget()))
                box->reject();
        });
        type(dialog, "nothing.txt");
        EXPECT_TRUE(dialog.isVisible());
    });
    EXPECT_EQ(dialogs.open(request), std::nullopt);
}

}  // namespace
}  // namespace zel
