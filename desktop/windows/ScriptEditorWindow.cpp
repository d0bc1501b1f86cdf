#include "desktop/windows/ScriptEditorWindow.h"

#include <Qsci/qsciabstractapis.h>

#include <QEvent>
#include <QFontDatabase>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QMessageBox>
#include <QShortcut>
#include <QSignalBlocker>
#include <QVBoxLayout>
#include <string_view>
#include <utility>

#include "desktop/binders/Binder.h"
#include "desktop/windows/FormWindow.h"
#include "desktop/windows/ScriptLexer.h"
#include "forms/ScriptForms.h"
#include "script/Language.h"
#include "script/LineCheck.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr int kMargin = 12;
constexpr int kNumbers = 0;  // margin of the line numbers
constexpr int kMarks = 1;
constexpr int kIgnoredMark = 1;
constexpr int kWrongMark = 2;
constexpr int kMarkMs = 200;
constexpr QSize kSize{720, 520};

/// The statement of a word of the completion.
const Statement* statementOf(std::string_view word) {
    for (const Statement& statement : statements())
        if (trimmed(statement.word) == word) return &statement;
    return nullptr;
}

/// What a statement is good for, after its shape.
QString helpOf(const Statement& statement) {
    return QString::fromUtf8(statement.shape.data(), static_cast<int>(statement.shape.size())) +
           " - " +
           QString::fromUtf8(statement.help.data(), static_cast<int>(statement.help.size()));
}

/// The words of statements that begin as what is typed. The editor's own list of words is got ready
/// by a thread, which a window that is closed at once does not survive.
class StatementWords : public QsciAbstractAPIs {
  public:
    using QsciAbstractAPIs::QsciAbstractAPIs;

    void updateAutoCompletionList(const QStringList& context, QStringList& list) override {
        if (context.isEmpty() || context.back().isEmpty()) return;
        for (const Statement& statement : statements()) {
            const QString word = QString::fromStdString(trimmed(statement.word));
            if (word.size() > 1 && word.startsWith(context.back(), Qt::CaseInsensitive) &&
                !list.contains(word))
                list.append(word);
        }
    }
    QStringList callTips(const QStringList&, int, QsciScintilla::CallTipsStyle,
                         QList<int>&) override {
        return {};
    }
};

}  // namespace

ScriptEditorWindow::ScriptEditorWindow(ScriptEditor& form, Binder& binder, QWidget* parent)
    : FormWindow(form, binder, parent),
      script_(form),
      text_(new QsciScintilla),
      lexer_(new ScriptLexer(text_)),
      sentence_(new QLabel) {
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(kMargin, kMargin, kMargin, kMargin);
    setUpEditor();
    layout->addWidget(text_, 1);
    sentence_->setWordWrap(true);
    sentence_->setMinimumHeight(2 * sentence_->fontMetrics().height());
    sentence_->setAlignment(Qt::AlignTop | Qt::AlignLeft);
    layout->addWidget(sentence_);
    layout->addWidget(findBar());
    layout->addWidget(keyRow());
    marking_.setSingleShot(true);
    connect(&marking_, &QTimer::timeout, this, [this] { markLines(); });
    binder.bindShow(form.txtNotepad, text_, [this] { showText(); });
    connect(text_, &QsciScintilla::textChanged, this, [this] {
        if (showing_) return;
        script_.txtNotepad.Text = text_->text().toStdString();
        changed_ = true;
        marking_.start(kMarkMs);
    });
    connect(text_, &QsciScintilla::cursorPositionChanged, this,
            [this](int line, int) { explainLine(line); });
    for (const auto& [keys, work] :
         {std::pair<QKeySequence, void (*)(ScriptEditorWindow&)>{QKeySequence::Find,
                                                                 [](ScriptEditorWindow& w) {
                                                                     w.findBar_->show();
                                                                     w.findText_->setFocus();
                                                                     w.findText_->selectAll();
                                                                 }},
          {QKeySequence::FindNext, [](ScriptEditorWindow& w) { w.findNext(true); }},
          {QKeySequence::Save, [](ScriptEditorWindow& w) { w.script_.cmdSave.Click(); }}}) {
        auto* shortcut = new QShortcut(keys, this);
        connect(shortcut, &QShortcut::activated, this, [this, run = work] { run(*this); });
    }
    resize(kSize);
    setMinimumSize(420, 300);
    setSizeGripEnabled(true);
    takeColors();
    followForm();
}

void ScriptEditorWindow::setUpEditor() {
    text_->setUtf8(true);
    text_->setLexer(lexer_);
    text_->setMarginType(kNumbers, QsciScintilla::NumberMargin);
    text_->setMarginWidth(kNumbers, "00000");
    text_->setMarginType(kMarks, QsciScintilla::SymbolMargin);
    text_->setMarginWidth(kMarks, 16);
    text_->setMarginMarkerMask(kMarks, 1 << kIgnoredMark | 1 << kWrongMark);
    text_->setMarginWidth(2, 0);
    text_->markerDefine(QsciScintilla::RightTriangle, kIgnoredMark);
    text_->markerDefine(QsciScintilla::Circle, kWrongMark);
    text_->setCaretLineVisible(true);
    text_->setTabIndents(false);
    text_->setWrapMode(QsciScintilla::WrapNone);
    text_->setScrollWidthTracking(true);
    text_->setScrollWidth(1);
    new StatementWords(lexer_);
    text_->setAutoCompletionSource(QsciScintilla::AcsAPIs);
    text_->setAutoCompletionThreshold(2);
    text_->setAutoCompletionCaseSensitivity(false);
    text_->setAutoCompletionReplaceWord(true);
    connect(text_, &QsciScintilla::SCN_AUTOCSELECTIONCHANGE, this,
            [this](const char* word, int, int) {
                if (const Statement* statement = statementOf(word))
                    sentence_->setText(helpOf(*statement));
            });
}

void ScriptEditorWindow::takeColors() {
    const QPalette& colors = palette();
    lexer_->takePalette(colors);
    const bool dark = colors.color(QPalette::Base).lightness() < 128;
    text_->setColor(colors.color(QPalette::Text));
    text_->setPaper(colors.color(QPalette::Base));
    text_->setCaretForegroundColor(colors.color(QPalette::Text));
    text_->setCaretLineBackgroundColor(dark ? QColor("#202832") : QColor("#eef4fb"));
    text_->setMarginsBackgroundColor(colors.color(QPalette::Window));
    text_->setMarginsForegroundColor(colors.color(QPalette::PlaceholderText));
    text_->setSelectionBackgroundColor(colors.color(QPalette::Highlight));
    text_->setSelectionForegroundColor(colors.color(QPalette::HighlightedText));
    text_->setMarkerBackgroundColor(QColor(dark ? "#f0b060" : "#c07000"), kIgnoredMark);
    text_->setMarkerForegroundColor(QColor(dark ? "#f0b060" : "#c07000"), kIgnoredMark);
    text_->setMarkerBackgroundColor(QColor(dark ? "#ff8078" : "#b02020"), kWrongMark);
    text_->setMarkerForegroundColor(QColor(dark ? "#ff8078" : "#b02020"), kWrongMark);
}

QWidget* ScriptEditorWindow::findBar() {
    findBar_ = new QWidget;
    auto* layout = new QHBoxLayout(findBar_);
    layout->setContentsMargins(0, 0, 0, 0);
    findText_ = new QLineEdit;
    findText_->setPlaceholderText(QObject::tr("Find"));
    findText_->setAccessibleName(QObject::tr("Find"));
    replaceText_ = new QLineEdit;
    replaceText_->setPlaceholderText(QObject::tr("Replace with"));
    replaceText_->setAccessibleName(QObject::tr("Replace with"));
    const auto button = [&](const QString& caption, auto work) {
        auto* key = new QPushButton(caption);
        key->setAutoDefault(false);
        connect(key, &QPushButton::clicked, this, work);
        return key;
    };
    layout->addWidget(findText_, 1);
    layout->addWidget(button(QObject::tr("Find Next"), [this] { findNext(true); }));
    layout->addWidget(replaceText_, 1);
    layout->addWidget(button(QObject::tr("Replace"), [this] { replaceOne(); }));
    layout->addWidget(button(QObject::tr("Replace All"), [this] { replaceAllMatches(); }));
    return findBar_;
}

QWidget* ScriptEditorWindow::keyRow() {
    auto* row = new QWidget;
    auto* layout = new QHBoxLayout(row);
    layout->setContentsMargins(0, 0, 0, 0);
    binder_.bind(script_.buttonsFrame, row, nullptr);
    const auto add = [&](Button& control) {
        auto* key = new QPushButton;
        key->setAutoDefault(false);
        key->setMinimumWidth(84);
        binder_.bind(control, key);
        layout->addWidget(key);
    };
    for (Button* control : {&script_.cmdNew, &script_.cmdSave, &script_.cmdSaveAs}) add(*control);
    layout->addStretch(1);
    for (Button* control : {&script_.cmdOpen, &script_.cmdClose, &script_.cmdCancel}) add(*control);
    return row;
}

void ScriptEditorWindow::showText() {
    const QString text = QString::fromStdString(script_.txtNotepad.Text);
    const QString file = QString::fromStdString(script_.FileName);
    if (text_->text() == text && file == file_) return;
    showing_ = true;
    if (text_->text() != text) {
        text_->setText(text);
        // The line ends that are there go on.
        text_->setEolMode(text.contains("\r\n") || !text.contains('\n') ? QsciScintilla::EolWindows
                                                                        : QsciScintilla::EolUnix);
    }
    showing_ = false;
    file_ = file;
    changed_ = false;
    markLines();
    explainLine(0);
}

void ScriptEditorWindow::markLines() {
    text_->markerDeleteAll(kIgnoredMark);
    text_->markerDeleteAll(kWrongMark);
    findings_ = checkScript(script_.txtNotepad.Text.get());
    for (const LineFinding& finding : findings_)
        text_->markerAdd(finding.line - 1, finding.ignored ? kIgnoredMark : kWrongMark);
    int line = 0;
    int column = 0;
    text_->getCursorPosition(&line, &column);
    explainLine(line);
}

/// One sentence on the statement in the line, or on what is wrong with it.
void ScriptEditorWindow::explainLine(int line) {
    for (const LineFinding& finding : findings_) {
        if (finding.line != line + 1) continue;
        sentence_->setText(QString::fromStdString(finding.text));
        return;
    }
    const Statement* statement = findStatement(statementText(text_->text(line).toStdString()));
    sentence_->setText(statement == nullptr ? QString() : helpOf(*statement));
}

bool ScriptEditorWindow::findNext(bool again) {
    const QString what = findText_->text();
    if (what.isEmpty()) return false;
    if (again && text_->findNext()) return true;
    return text_->findFirst(what, false, false, false, true);
}

void ScriptEditorWindow::replaceOne() {
    if (text_->selectedText().compare(findText_->text(), Qt::CaseInsensitive) == 0 &&
        !findText_->text().isEmpty())
        text_->replaceSelectedText(replaceText_->text());
    findNext(false);
}

void ScriptEditorWindow::replaceAllMatches() {
    if (findText_->text().isEmpty()) return;
    text_->beginUndoAction();
    bool found = text_->findFirst(findText_->text(), false, false, false, false, true, 0, 0);
    while (found) {
        text_->replace(replaceText_->text());
        found = text_->findNext();
    }
    text_->endUndoAction();
}

void ScriptEditorWindow::changeEvent(QEvent* event) {
    if (event->type() == QEvent::PaletteChange || event->type() == QEvent::StyleChange)
        takeColors();
    FormWindow::changeEvent(event);
}

void ScriptEditorWindow::keyPressEvent(QKeyEvent* event) {
    if (findText_->hasFocus() &&
        (event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter)) {
        findNext(false);
        return;
    }
    FormWindow::keyPressEvent(event);
}

/// Esc in a list of words closes the list, else it is the Cancel button.
void ScriptEditorWindow::reject() {
    if (text_->isListActive()) return text_->cancelList();
    const bool lost =
        changed_ &&
        QMessageBox::question(this, QObject::tr("Script Editor"),
                              QObject::tr("Close without saving the changes?")) != QMessageBox::Yes;
    if (!lost) script_.cmdCancel.Click();
}

}  // namespace zel
