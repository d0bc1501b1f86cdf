// The help book: topics, links, what it describes, and its window.

#include <QHelpContentModel>
#include <QHelpEngine>
#include <QHelpLink>
#include <QListWidget>
#include <QRegularExpression>
#include <QScrollBar>
#include <QTemporaryDir>
#include <QTest>
#include <QTextBlock>
#include <cstdlib>
#include <set>

#include "desktop/help/HelpKeyFilter.h"
#include "desktop/help/HelpViewer.h"
#include "desktop/help/HelpWindow.h"
#include "script/Language.h"
#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

constexpr int kContexts[] = {1110, 1112, 1113, 1114, 2111, 2112, 3113, 4111, 5111};

struct Help : testing::Test {
    Help() : viewer(ZEL_PROGRAMS, home.path()) { testApplication(); }
    void SetUp() override {
        if (!QFileInfo::exists(viewer.book())) GTEST_SKIP() << "built without the help book";
    }
    HelpWindow& opened(int context = 1110) {
        EXPECT_TRUE(viewer.show(context));
        return *viewer.window();
    }
    QString file() { return opened().page().source().fileName(); }
    /// Every page by its name.
    std::map<QString, QString> pages() {
        std::map<QString, QString> all;
        QHelpEngine& engine = opened().engine();
        for (const QUrl& url : engine.files("example.zelremote.help", QString(), "html"))
            all[url.fileName()] = QString::fromUtf8(engine.fileData(url));
        return all;
    }
    QTemporaryDir home;
    HelpViewer viewer;
};

TEST_F(Help, EveryContext_OpensAPageOfItsOwn) {
    std::set<QString> seen;
    for (const int context : kContexts) {
        HelpWindow& window = opened(context);
        EXPECT_FALSE(window.page().toPlainText().trimmed().isEmpty()) << context;
        EXPECT_TRUE(seen.insert(window.page().source().fileName()).second)
            << context << " opens " << window.page().source().fileName().toStdString();
    }
    opened(5111);
    EXPECT_EQ(viewer.window()->page().source().fileName(), "waterfall.html");
    opened(77);
    EXPECT_EQ(viewer.window()->page().source().fileName(), "index.html");
}

TEST_F(Help, EveryLink_LeadsSomewhere) {
    const std::map<QString, QString> all = pages();
    EXPECT_GT(all.size(), 14U);
    const QRegularExpression link("(?:href|src)=\"([^\"#]*)(?:#([^\"]*))?\"");
    int count = 0;
    for (const auto& [name, text] : all) {
        for (auto match = link.globalMatch(text); match.hasNext();) {
            const auto found = match.next();
            const QString target = found.captured(1);
            if (target.startsWith("http") || target.startsWith("mailto:")) continue;
            ++count;
            const QString page = target.isEmpty() ? name : target;
            const QUrl url("qthelp://example.zelremote.help/book/" + page);
            EXPECT_FALSE(opened().engine().fileData(url).isEmpty())
                << name.toStdString() << " leads to " << target.toStdString();
            if (!found.captured(2).isEmpty() && all.count(page) != 0) {
                EXPECT_TRUE(all.at(page).contains("id=\"" + found.captured(2) + '"'))
                    << name.toStdString() << " leads to #" << found.captured(2).toStdString();
            }
        }
    }
    EXPECT_GT(count, 60);
}

TEST_F(Help, EveryControlThatTheFormsRegister_IsDescribed) {
    const QString text = pages()["controls.html"];
    Forms forms;
    std::string missing;
    int count = 0;
    for (Form* form : forms.all()) {
        const auto section = text.indexOf("(" + QString::fromStdString(form->name()) + ")");
        const auto end = text.indexOf("<h2>", section);
        const QString part = section < 0 ? QString() : text.mid(section, end - section);
        std::set<std::string> seen;
        for (const Control* control : form->controls()) {
            const std::string name = control->name().substr(0, control->name().find('('));
            if (!seen.insert(name).second) continue;
            ++count;
            if (!part.contains(">" + QString::fromStdString(name) + "</code>"))
                missing += form->name() + "." + name + "\n";
        }
    }
    EXPECT_EQ(missing, "") << "to be described in help/controls.md";
    EXPECT_GT(count, 200);
}

TEST_F(Help, EveryEntryOfTheMenus_IsDescribed) {
    const QString text = pages()["menus.html"];
    const ControllerForm panel;
    int count = 0;
    for (const Control* control : panel.controls()) {
        if (control->kind() != ControlKind::MenuItem) continue;
        const auto& item = static_cast<const MenuItem&>(*control);
        QString caption = QString::fromStdString(item.Caption);
        if (item.parent() == nullptr || caption.isEmpty() || caption == "-") continue;
        ++count;
        caption.remove("...");
        const QString row = QString::fromStdString(item.parent()->Caption) + ", " + caption;
        EXPECT_TRUE(text.contains("<td>" + row + "</td>")) << row.toStdString();
    }
    EXPECT_GT(count, 25);
}

TEST_F(Help, EveryStatementOfTheScriptLanguage_IsDescribed) {
    const QString text = pages()["scripts.html"];
    int count = 0;
    for (const Statement& statement : statements()) {
        ++count;
        const auto size = static_cast<qsizetype>(statement.word.size());
        EXPECT_TRUE(text.contains(QString::fromUtf8(statement.word.data(), size)))
            << statement.word;
    }
    EXPECT_GT(count, 15);
}

TEST_F(Help, Search_FindsPagesThatHoldAllWords) {
    HelpWindow& window = opened();
    window.search("fingerprint certificate");
    ASSERT_GT(window.results().count(), 0);
    EXPECT_EQ(window.results().item(0)->text(), "Serving an instrument over the network");
    window.search("qqxyzzy");
    ASSERT_EQ(window.results().count(), 1);
    EXPECT_EQ(window.results().item(0)->flags(), Qt::NoItemFlags);
}

TEST_F(Help, Index_HoldsControlsAndStatements) {
    QHelpEngine& engine = opened().engine();
    EXPECT_FALSE(engine.documentsForKeyword("MarkPkButton").isEmpty());
    EXPECT_FALSE(engine.documentsForKeyword("SCANSTART").isEmpty());
}

TEST_F(Help, BackAfterALink_ShowsThePageBefore) {
    HelpWindow& window = opened(2111);
    window.page().setSource(QUrl("keyboard.html"));
    EXPECT_EQ(window.page().source().fileName(), "keyboard.html");
    window.page().backward();
    EXPECT_EQ(window.page().source().fileName(), "panel.html");
}

TEST_F(Help, AFolderThatCannotBeWritten_DoesNotKeepTheBookClosed) {
    HelpViewer other(ZEL_PROGRAMS, "/proc");
    EXPECT_TRUE(other.show(1110));
}

TEST(HelpViewerTest, WithoutTheBook_NothingOpens) {
    testApplication();
    QTemporaryDir empty;
    HelpViewer viewer(empty.path(), empty.path());
    EXPECT_FALSE(viewer.show(1110));
    QDir().mkpath(empty.path() + "/help");
    QFile damaged(viewer.book());
    ASSERT_TRUE(damaged.open(QIODevice::WriteOnly));
    damaged.write("no book");
    damaged.close();
    EXPECT_FALSE(viewer.show(1110));
    EXPECT_EQ(viewer.window(), nullptr);
}

TEST_F(Help, PictureOfAPage_IsAsWideAsThePageAtMost) {
    HelpWindow& window = opened();
    for (const int width : {960, 700, 2200}) {
        window.resize(width, 640);
        QApplication::processEvents();
        EXPECT_FALSE(window.page().horizontalScrollBar()->isVisible()) << width;
        QTextImageFormat picture;
        for (QTextBlock block = window.page().document()->begin(); block.isValid();
             block = block.next())
            for (auto part = block.begin(); !part.atEnd(); ++part)
                if (part.fragment().charFormat().isImageFormat())
                    picture = part.fragment().charFormat().toImageFormat();
        EXPECT_GT(picture.width(), std::min(width / 2.5, 1000.0)) << width;
        EXPECT_LE(picture.width(), 1280) << "larger than it is";
        EXPECT_NEAR(picture.width() / picture.height(), 1280.0 / 760, 0.01);
    }
}

TEST_F(Help, LinksAndTexts_CanBeReadInEachTheme) {
    for (const ThemeChoice theme : {ThemeChoice::Light, ThemeChoice::Dark}) {
        applyTheme(testApplication(), theme);
        HelpWindow& window = opened();
        // The contents are read beside the page.
        EXPECT_TRUE(QTest::qWaitFor([&] {
            const QHelpContentModel* contents = window.engine().contentModel();
            return !contents->isCreatingContents() && contents->rowCount() > 0;
        }));
        QApplication::processEvents();
        const QPalette palette = window.page().palette();
        const int ground = palette.color(QPalette::Base).lightness();
        EXPECT_GT(std::abs(palette.color(QPalette::Text).lightness() - ground), 120);
        int links = 0;
        for (QTextBlock block = window.page().document()->begin(); block.isValid();
             block = block.next())
            for (auto part = block.begin(); !part.atEnd(); ++part) {
                const QTextCharFormat format = part.fragment().charFormat();
                if (!format.isAnchor() || format.anchorHref().isEmpty()) continue;
                ++links;
                EXPECT_GT(std::abs(format.foreground().color().lightness() - ground), 90)
                    << part.fragment().text().toStdString();
            }
        EXPECT_GT(links, 10);
        savePicture(window, theme == ThemeChoice::Dark ? "help-dark" : "help-light");
        // The words of the instrument, as the console prints them.
        window.page().setSource(QUrl("qthelp://example.zelremote.help/book/words.html"));
        EXPECT_TRUE(window.page().toPlainText().contains("REFLVLOFFS"));
        savePicture(window, theme == ThemeChoice::Dark ? "help-words-dark" : "help-words-light");
    }
}

TEST(HelpKey, F1_OpensTheTopicOfTheWindowsForm) {
    testApplication();
    int context = 0;
    HelpKeyFilter filter([&](int number) { context = number; });
    QWidget window;
    QWidget field(&window);
    QKeyEvent key(QEvent::KeyPress, Qt::Key_F1, Qt::NoModifier);
    EXPECT_FALSE(filter.eventFilter(&field, &key));  // a box of the system
    for (const auto& [form, wanted] : {std::pair<const char*, int>{"WaterfallForm", 5111},
                                       {"MainForm", 1113},
                                       {"TCPConnectionForm", 1113},
                                       {"DevicesChoiceForm", 1112},
                                       {"TimeForm", 1114},
                                       {"ServerForm", 3113},
                                       {"SpecialMeasForm", 4111},
                                       {"STDForm", 1110},
                                       {"ScriptEditor", 1110},
                                       {"AboutForm", 1110}}) {
        window.setProperty("form", form);
        EXPECT_TRUE(filter.eventFilter(&field, &key));
        EXPECT_EQ(context, wanted) << form;
    }
    QKeyEvent other(QEvent::KeyPress, Qt::Key_F2, Qt::NoModifier);
    EXPECT_FALSE(filter.eventFilter(&field, &other));
    // A tool window has its own, also where it is no window.
    QWidget tool;
    tool.setProperty("topic", 2112);
    QWidget inTool(&tool);
    EXPECT_TRUE(filter.eventFilter(&inTool, &key));
    EXPECT_EQ(context, 2112);
    QMainWindow panel;
    EXPECT_TRUE(filter.eventFilter(&panel, &key));
    EXPECT_EQ(context, 2111);
}

}  // namespace
}  // namespace zel
