#pragma once
// The editor of the scripts: colours, line numbers, completion, marks, find and replace.

#include <Qsci/qsciscintilla.h>

#include <QLabel>
#include <QLineEdit>
#include <QTimer>
#include <vector>

#include "desktop/binders/Binder.h"
#include "desktop/platform/KeyCodes.h"
#include "desktop/windows/FormWindow.h"
#include "desktop/windows/ScriptLexer.h"
#include "forms/ScriptForms.h"
#include "script/LineCheck.h"

namespace zel {

class ScriptEditorWindow : public FormWindow {
  public:
    ScriptEditorWindow(ScriptEditor& form, Binder& binder, QWidget* parent);
    QsciScintilla& editor() { return *text_; }

  protected:
    void changeEvent(QEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void reject() override;

  private:
    QWidget* findBar();
    QWidget* keyRow();
    void setUpEditor();
    void takeColors();
    void showText();
    void markLines();
    void explainLine(int line);
    bool findNext(bool again);
    void replaceOne();
    void replaceAllMatches();

    ScriptEditor& script_;
    QsciScintilla* text_;
    ScriptLexer* lexer_;
    QLabel* sentence_;
    QWidget* findBar_ = nullptr;
    QLineEdit* findText_ = nullptr;
    QLineEdit* replaceText_ = nullptr;
    QTimer marking_;
    std::vector<LineFinding> findings_;  ///< as they were marked last
    QString file_;
    bool showing_ = false;
    bool changed_ = false;
};

}  // namespace zel
