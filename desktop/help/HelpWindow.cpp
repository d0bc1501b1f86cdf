#include "desktop/help/HelpWindow.h"

#include <QAction>
#include <QApplication>
#include <QDesktopServices>
#include <QDir>
#include <QFileInfo>
#include <QHelpContentWidget>
#include <QHelpEngine>
#include <QHelpIndexWidget>
#include <QHelpLink>
#include <QImage>
#include <QKeyEvent>
#include <QLineEdit>
#include <QListWidget>
#include <QSplitter>
#include <QTextBlock>
#include <QTextCursor>
#include <QTextDocument>
#include <QTextFragment>
#include <QTextImageFormat>
#include <QToolBar>
#include <QVBoxLayout>
#include <algorithm>
#include <memory>
#include <utility>
#include <vector>

#include "desktop/windows/ThemeIcons.h"

namespace zel {
namespace {

constexpr const char* kNamespace = "example.zelremote.help";
constexpr const char* kFirstPage = "qthelp://example.zelremote.help/book/index.html";

}  // namespace

HelpPage::HelpPage(QHelpEngine& engine, QWidget* parent) : QTextBrowser(parent), engine_(engine) {
    setOpenExternalLinks(false);
    document()->setDocumentMargin(16);
}

QVariant HelpPage::loadResource(int type, const QUrl& url) {
    if (url.scheme() == "qthelp") return engine_.fileData(url);
    return QTextBrowser::loadResource(type, url);
}

void HelpPage::doSetSource(const QUrl& url, QTextDocument::ResourceType type) {
    if (url.scheme() == "http" || url.scheme() == "https" || url.scheme() == "mailto")
        QDesktopServices::openUrl(url);
    else
        QTextBrowser::doSetSource(url, type);
    fitPictures();
}

void HelpPage::resizeEvent(QResizeEvent* event) {
    QTextBrowser::resizeEvent(event);
    fitPictures();
}

void HelpPage::fitPictures() {
    const double room = viewport()->width() - 2 * document()->documentMargin();
    if (room <= 0) return;
    std::vector<std::pair<int, QTextImageFormat>> pictures;
    for (QTextBlock block = document()->begin(); block.isValid(); block = block.next())
        for (auto part = block.begin(); !part.atEnd(); ++part) {
            const QTextFragment fragment = part.fragment();
            if (fragment.charFormat().isImageFormat())
                pictures.emplace_back(fragment.position(), fragment.charFormat().toImageFormat());
        }
    for (auto& [place, format] : pictures) {
        const QUrl url = source().resolved(QUrl(format.name()));
        const QImage image =
            QImage::fromData(loadResource(QTextDocument::ImageResource, url).toByteArray());
        if (image.isNull()) continue;
        const double width = std::min<double>(image.width(), room);
        if (width == format.width()) continue;
        format.setWidth(width);
        format.setHeight(width * image.height() / image.width());
        // The page itself would leave pixels out.
        const QSizeF dots = QSizeF(format.width(), format.height()) * devicePixelRatioF();
        document()->addResource(QTextDocument::ImageResource, url,
                                image.scaled(dots.toSize().boundedTo(image.size()),
                                             Qt::IgnoreAspectRatio, Qt::SmoothTransformation));
        QTextCursor cursor(document());
        cursor.setPosition(place);
        cursor.movePosition(QTextCursor::NextCharacter, QTextCursor::KeepAnchor);
        cursor.setCharFormat(format);
    }
}

HelpWindow::HelpWindow(const QString& book, const QString& home, QWidget* parent)
    : QMainWindow(parent, Qt::Window) {
    setWindowTitle(QObject::tr("ZELRemote Help"));
    setProperty("help", true);
    setWindowIcon(QApplication::windowIcon());
    ready_ = openBook(book, home);
    if (!ready_) return;
    resize(960, 640);

    page_ = new HelpPage(*engine_, this);
    tabs_ = new QTabWidget(this);
    QHelpContentWidget* contents = engine_->contentWidget();
    tabs_->addTab(contents, QObject::tr("Contents"));
    tabs_->addTab(indexTab(), QObject::tr("Index"));
    tabs_->addTab(searchTab(), QObject::tr("Search"));
    connect(contents, &QHelpContentWidget::linkActivated, this,
            [this](const QUrl& url) { page_->setSource(url); });
    connect(contents, &QHelpContentWidget::clicked, this, [this](const QModelIndex& at) {
        if (const auto* item = engine_->contentModel()->contentItemAt(at); item != nullptr)
            page_->setSource(item->url());
    });
    connect(engine_->contentModel(), &QHelpContentModel::contentsCreated, contents,
            [contents] { contents->expandToDepth(0); });
    engine_->contentModel()->createContents(QString());
    engine_->indexModel()->createIndex(QString());

    auto* splitter = new QSplitter(this);
    splitter->addWidget(tabs_);
    splitter->addWidget(page_);
    splitter->setStretchFactor(1, 1);
    splitter->setSizes({260, 700});
    setCentralWidget(splitter);
    buildTools();
}

HelpWindow::~HelpWindow() {
    // Its widgets belong to the engine.
    delete centralWidget();
}

bool HelpWindow::openBook(const QString& book, const QString& home) {
    engine_ = std::make_unique<QHelpEngine>(home + "/help.qhc");
    engine_->setReadOnly(false);
    if (!QFileInfo(home).isWritable() || !engine_->setupData()) {
        scratch_ = std::make_unique<QTemporaryDir>();
        engine_ = std::make_unique<QHelpEngine>(scratch_->path() + "/help.qhc");
        engine_->setReadOnly(false);
        if (!engine_->setupData()) return false;
    }
    // The collection holds a copy of the contents, so it follows a newer book.
    const QFileInfo file(book);
    const QString stamp = file.absoluteFilePath() + " " + QString::number(file.size()) + " " +
                          QString::number(file.lastModified().toSecsSinceEpoch());
    if (engine_->customValue("book").toString() != stamp ||
        !engine_->registeredDocumentations().contains(kNamespace)) {
        engine_->unregisterDocumentation(kNamespace);
        if (!engine_->registerDocumentation(book)) return false;
        engine_->setCustomValue("book", stamp);
    }
    return !engine_->fileData(QUrl(kFirstPage)).isEmpty();
}

void HelpWindow::buildTools() {
    QToolBar* bar = addToolBar(QObject::tr("Pages"));
    bar->setMovable(false);
    const auto add = [&](const char* icon, const QString& text, const QKeySequence& key) {
        QAction* action = bar->addAction(themeIcon(icon), text);
        action->setShortcut(key);
        action->setToolTip(text + " (" + key.toString(QKeySequence::NativeText) + ")");
        return action;
    };
    QAction* back = add("back", QObject::tr("Back"), QKeySequence(Qt::ALT | Qt::Key_Left));
    QAction* forward =
        add("forward", QObject::tr("Forward"), QKeySequence(Qt::ALT | Qt::Key_Right));
    QAction* home = add("home", QObject::tr("First page"), QKeySequence(Qt::ALT | Qt::Key_Home));
    back->setEnabled(false);
    forward->setEnabled(false);
    connect(back, &QAction::triggered, page_, &QTextBrowser::backward);
    connect(forward, &QAction::triggered, page_, &QTextBrowser::forward);
    connect(home, &QAction::triggered, this, [this] { page_->setSource(QUrl(kFirstPage)); });
    connect(page_, &QTextBrowser::backwardAvailable, back, &QAction::setEnabled);
    connect(page_, &QTextBrowser::forwardAvailable, forward, &QAction::setEnabled);
    auto* find = new QAction(this);
    find->setShortcut(QKeySequence::Find);
    connect(find, &QAction::triggered, this, [this] {
        tabs_->setCurrentIndex(2);
        words_->setFocus();
    });
    addAction(find);
}

QWidget* HelpWindow::indexTab() {
    auto* tab = new QWidget(this);
    auto* layout = new QVBoxLayout(tab);
    auto* filter = new QLineEdit(tab);
    filter->setPlaceholderText(QObject::tr("Key, statement, control"));
    QHelpIndexWidget* index = engine_->indexWidget();
    layout->addWidget(filter);
    layout->addWidget(index);
    connect(filter, &QLineEdit::textChanged, index,
            [index](const QString& text) { index->filterIndices(text); });
    connect(filter, &QLineEdit::returnPressed, index, &QHelpIndexWidget::activateCurrentItem);
    connect(index, &QHelpIndexWidget::documentActivated, this,
            [this](const QHelpLink& link) { page_->setSource(link.url); });
    connect(index, &QHelpIndexWidget::documentsActivated, this,
            [this](const QList<QHelpLink>& links) { page_->setSource(links.first().url); });
    return tab;
}

QWidget* HelpWindow::searchTab() {
    auto* tab = new QWidget(this);
    auto* layout = new QVBoxLayout(tab);
    words_ = new QLineEdit(tab);
    words_->setPlaceholderText(QObject::tr("Words, then Enter"));
    words_->setClearButtonEnabled(true);
    results_ = new QListWidget(tab);
    layout->addWidget(words_);
    layout->addWidget(results_);
    connect(words_, &QLineEdit::returnPressed, this, [this] { search(words_->text()); });
    connect(results_, &QListWidget::itemActivated, this, [this](const QListWidgetItem* item) {
        page_->setSource(item->data(Qt::UserRole).toUrl());
    });
    connect(results_, &QListWidget::itemClicked, this, [this](const QListWidgetItem* item) {
        page_->setSource(item->data(Qt::UserRole).toUrl());
    });
    return tab;
}

void HelpWindow::search(const QString& text) {
    results_->clear();
    const QStringList words = text.simplified().split(' ', Qt::SkipEmptyParts);
    if (words.isEmpty()) return;
    // The book has some twenty pages: reading them takes less than keeping an index of them.
    QList<std::pair<qsizetype, QListWidgetItem*>> found;
    for (const QUrl& url : engine_->files(kNamespace, QString(), "html")) {
        QTextDocument document;
        document.setHtml(QString::fromUtf8(engine_->fileData(url)));
        const QString plain = document.toPlainText();
        qsizetype hits = 0;
        bool all = true;
        for (const QString& word : words) {
            const qsizetype count = plain.count(word, Qt::CaseInsensitive);
            all = all && count > 0;
            hits += count;
        }
        if (!all) continue;
        auto* item = new QListWidgetItem(document.metaInformation(QTextDocument::DocumentTitle));
        item->setData(Qt::UserRole, url);
        found.append({hits, item});
    }
    std::stable_sort(found.begin(), found.end(),
                     [](const auto& one, const auto& other) { return one.first > other.first; });
    for (const auto& [hits, item] : found) results_->addItem(item);
    if (found.isEmpty()) {
        auto* none = new QListWidgetItem(QObject::tr("No page holds all of these words."));
        none->setFlags(Qt::NoItemFlags);
        results_->addItem(none);
    }
}

void HelpWindow::openContext(int context) {
    const QList<QHelpLink> links =
        engine_->documentsForIdentifier("context_" + QString::number(context));
    page_->setSource(links.isEmpty() ? QUrl(kFirstPage) : links.first().url);
}

void HelpWindow::changeEvent(QEvent* event) {
    QMainWindow::changeEvent(event);
    // The colours of the links were taken when the page was read.
    if (event->type() == QEvent::PaletteChange && page_ != nullptr) page_->reload();
}

void HelpWindow::keyPressEvent(QKeyEvent* event) {
    if (event->key() == Qt::Key_Escape)
        close();
    else
        QMainWindow::keyPressEvent(event);
}

}  // namespace zel
