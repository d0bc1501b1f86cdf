#pragma once
// The window of the help book: contents, index and search beside the page.

#include <QMainWindow>
#include <QTabWidget>
#include <QTemporaryDir>
#include <QTextBrowser>
#include <memory>

class QHelpEngine;
class QLineEdit;
class QListWidget;

namespace zel {

/// A page of the book; links to other places open in the system's browser.
class HelpPage : public QTextBrowser {
  public:
    HelpPage(QHelpEngine& engine, QWidget* parent);

  protected:
    QVariant loadResource(int type, const QUrl& url) override;
    void doSetSource(const QUrl& url, QTextDocument::ResourceType type) override;
    void resizeEvent(QResizeEvent* event) override;

  private:
    /// Pictures that are wider than the page are shown as wide as it is.
    void fitPictures();

    QHelpEngine& engine_;
};

class HelpWindow : public QMainWindow {
  public:
    HelpWindow(const QString& book, const QString& home, QWidget* parent);
    ~HelpWindow() override;

    /// The book could be opened.
    bool ready() const { return ready_; }
    /// The topic of that context number, else the contents page.
    void openContext(int context);
    /// Pages that hold all of the words, best first.
    void search(const QString& words);

    QTextBrowser& page() { return *page_; }
    QTabWidget& tabs() { return *tabs_; }
    QListWidget& results() { return *results_; }
    QHelpEngine& engine() { return *engine_; }

  protected:
    void keyPressEvent(QKeyEvent* event) override;
    void changeEvent(QEvent* event) override;

  private:
    bool openBook(const QString& book, const QString& home);
    void buildTools();
    QWidget* indexTab();
    QWidget* searchTab();

    std::unique_ptr<QTemporaryDir> scratch_;
    std::unique_ptr<QHelpEngine> engine_;
    bool ready_ = false;
    QTabWidget* tabs_ = nullptr;
    HelpPage* page_ = nullptr;
    QListWidget* results_ = nullptr;
    QLineEdit* words_ = nullptr;
};

}  // namespace zel
